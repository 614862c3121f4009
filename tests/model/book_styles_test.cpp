#include <string>

#include "book_fixture.h"
#include "xls/model/book_impl.h"

namespace quire {
namespace {

using BookStyles = BinaryBookTest;

TEST_F(BookStyles, NewBookHoldsTheDefaultStyleSet) {
    EXPECT_EQ(book->fontSize(), 5);
    EXPECT_EQ(book->formatSize(), 21);
    IFormat* added = book->addFormat(nullptr);
    EXPECT_EQ(book->format(21), added);
    auto* impl = static_cast<BookImplT*>(book);
    EXPECT_EQ(impl->styles().size(), 6u);
    EXPECT_EQ(impl->formats()[15]->protection, 1);
    EXPECT_EQ(impl->formats()[16]->ifmt, 44);
    EXPECT_EQ(impl->formats()[20]->alignment, 0u);
    EXPECT_EQ(impl->formats()[0]->protection, 0xFFF5);
    EXPECT_FALSE(impl->paletteChanged());
    int size = 0;
    EXPECT_EQ(std::wstring(book->defaultFont(&size)), L"Arial");
    EXPECT_EQ(size, 10);
}

TEST_F(BookStyles, NewFormatAndFontDefaults) {
    IFormat* format = book->addFormat(nullptr);
    EXPECT_EQ(format->font(), book->font(0));
    EXPECT_EQ(format->numFormat(), NumformatGeneral);
    EXPECT_EQ(format->alignH(), AlignHGeneral);
    EXPECT_EQ(format->alignV(), AlignVBottom);
    EXPECT_EQ(format->borderLeft(), BorderStyleNone);
    EXPECT_EQ(format->borderLeftColor(), ColorDefaultForeground);
    EXPECT_EQ(format->patternForegroundColor(), ColorDefaultForeground);
    EXPECT_EQ(format->patternBackgroundColor(), ColorDefaultBackground);
    EXPECT_TRUE(format->locked());
    EXPECT_FALSE(format->hidden());
    IFont* font = book->addFont(nullptr);
    EXPECT_EQ(std::wstring(font->name()), L"Arial");
    EXPECT_EQ(font->size(), 10);
    EXPECT_EQ(font->color(), ColorAuto);
    EXPECT_FALSE(font->bold());
}

TEST_F(BookStyles, RotationAcceptsDegreesAndStackedOnly) {
    IFormat* format = book->addFormat(nullptr);
    EXPECT_TRUE(format->setRotation(180));
    EXPECT_TRUE(format->setRotation(255));
    EXPECT_FALSE(format->setRotation(181));
    EXPECT_EQ(message(), "rotation must be in range 0-180 or 255");
    EXPECT_FALSE(format->setRotation(-1));
    EXPECT_EQ(format->rotation(), 255);
}

TEST_F(BookStyles, SettersKeepValuesInsideTheirFields) {
    IFormat* format = book->addFormat(nullptr);
    format->setBorderLeft(BorderStyleThin);
    format->setIndent(16);  // wider than its 4 bits: must not reach shrink-to-fit
    EXPECT_FALSE(format->shrinkToFit());
    format->setBorderLeftColor(0x7FFF);  // a colour too wide for 7 bits must not change the right border
    EXPECT_EQ(format->borderRightColor(), ColorDefaultForeground);
    EXPECT_EQ(format->borderLeft(), BorderStyleThin);
    format->setAlignH(9);
    EXPECT_FALSE(format->wrap());
    format->setFillPattern(FillPatternSolid);
    format->setPatternForegroundColor(ColorRed);
    EXPECT_EQ(format->fillPattern(), FillPatternSolid);
    EXPECT_EQ(format->patternForegroundColor(), ColorRed);
    EXPECT_EQ(format->patternBackgroundColor(), ColorDefaultBackground);
}

TEST_F(BookStyles, SetBorderTouchesTheFourSidesOnly) {
    IFormat* format = book->addFormat(nullptr);
    format->setBorderDiagonal(BorderDiagonalBoth);
    format->setBorderDiagonalStyle(BorderStyleDouble);
    format->setBorder(BorderStyleThin);
    format->setBorderColor(ColorBlue);
    EXPECT_EQ(format->borderTop(), BorderStyleThin);
    EXPECT_EQ(format->borderBottom(), BorderStyleThin);
    EXPECT_EQ(format->borderRightColor(), ColorBlue);
    EXPECT_EQ(format->borderDiagonal(), BorderDiagonalBoth);
    EXPECT_EQ(format->borderDiagonalStyle(), BorderStyleDouble);
}

TEST_F(BookStyles, FontSizeIsKeptInTwentiethsUpTo409Points) {
    IFont* font = book->addFont(nullptr);
    font->setSize(409);
    EXPECT_EQ(font->size(), 409);
    font->setSize(410);
    EXPECT_EQ(font->size(), 409);
    EXPECT_EQ(static_cast<FontImplT*>(font)->dyHeight, 8191);
    font->setSize(100000);
    EXPECT_EQ(font->size(), 409);
}

TEST_F(BookStyles, BoldIsAWeight) {
    auto* font = static_cast<FontImplT*>(book->addFont(nullptr));
    font->setBold(true);
    EXPECT_TRUE(font->bold());
    EXPECT_EQ(font->bls, 700);
    font->bls = 600;
    EXPECT_FALSE(font->bold());
    font->bls = 800;
    EXPECT_TRUE(font->bold());
}

TEST_F(BookStyles, FontsAreNumberedWithoutIndexFour) {
    IFont* sixth = book->addFont(nullptr);  // list position 5
    auto* impl = static_cast<BookImplT*>(book);
    EXPECT_EQ(impl->fileIndexOfFont(sixth), 6);
    IFormat* format = book->addFormat(nullptr);
    EXPECT_TRUE(format->setFont(sixth));
    EXPECT_EQ(format->font(), sixth);
    static_cast<FormatImplT*>(format)->ifnt = 4;
    EXPECT_EQ(format->font(), nullptr);
    EXPECT_EQ(message(), "incorrect font");
}

TEST_F(BookStyles, FontsOfAnotherBookAreRefused) {
    IBook* other = createBinaryBook();
    IFormat* format = book->addFormat(nullptr);
    EXPECT_FALSE(format->setFont(other->font(0)));
    EXPECT_EQ(message(), "specified font not found");
    other->release();
}

TEST_F(BookStyles, CustomNumberFormatsFrom164To392) {
    EXPECT_EQ(book->addCustomNumFormat(L"0.000"), 164);
    EXPECT_EQ(book->addCustomNumFormat(L"0.000"), 164);
    EXPECT_EQ(std::wstring(book->customNumFormat(164)), L"0.000");
    EXPECT_EQ(book->customNumFormat(200), nullptr);
    EXPECT_EQ(message(), "custom number format not found");
    for (int i = 1; i < 229; ++i) EXPECT_NE(book->addCustomNumFormat(std::to_wstring(i).c_str()), 0);
    EXPECT_EQ(book->addCustomNumFormat(L"one too many"), 0);
    EXPECT_EQ(message(), "maximum number of custom formats is exceeded");
}

TEST_F(BookStyles, CopiedFormatsBringTheirFontAndNumberFormat) {
    IBook* other = createBinaryBook();
    other->addCustomNumFormat(L"first");
    IFormat* source = other->addFormat(nullptr);
    source->setNumFormat(other->addCustomNumFormat(L"0.00%"));
    source->setBorderTopColor(ColorRed);
    source->setWrap(true);
    int fontsBefore = book->fontSize();
    IFormat* copy = book->addFormat(source);
    ASSERT_NE(copy, nullptr);
    EXPECT_EQ(book->fontSize(), fontsBefore + 1);
    EXPECT_EQ(copy->numFormat(), 164);
    EXPECT_EQ(std::wstring(book->customNumFormat(164)), L"0.00%");
    EXPECT_EQ(copy->borderTopColor(), ColorRed);
    EXPECT_TRUE(copy->wrap());
    book->addFormat(source);
    EXPECT_EQ(book->fontSize(), fontsBefore + 2);
    other->release();
}

TEST_F(BookStyles, ColourPackingUsesThePalette) {
    EXPECT_EQ(book->colorPack(255, 0, 0), ColorRed);
    int red = -1, green = -1, blue = -1;
    book->colorUnpack(ColorSkyblue, &red, &green, &blue);
    EXPECT_EQ(red, 0x00);
    EXPECT_EQ(green, 0xCC);
    EXPECT_EQ(blue, 0xFF);
    book->colorUnpack(7, &red, nullptr, nullptr);
    EXPECT_EQ(message(), "invalid vector<T> subscript");
    EXPECT_TRUE(static_cast<BookImplT*>(book)->paletteChanged());
}

TEST_F(BookStyles, PaletteFillsUpAfter56NewColours) {
    int first = book->colorPack(1, 2, 3);
    EXPECT_EQ(first, 8);
    for (int i = 1; i < 56; ++i) EXPECT_EQ(book->colorPack(1, 2, 3 + i), 8 + i);
    EXPECT_EQ(book->colorPack(200, 201, 202), ColorAuto);
    EXPECT_EQ(message(), "no free color index, limit is reached for xls format");
    EXPECT_EQ(book->colorPack(1, 2, 3), 8);  // an existing match still answers
}

}  // namespace
}  // namespace quire
