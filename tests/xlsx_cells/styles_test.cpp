// Formats and fonts over the styles part, checked through openpyxl after a save.
#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "api/enums.h"
#include "corpus.h"
#include "external_tools.h"
#include "xlsx/xml_book_impl.h"
#include "xlsx/xml_font_impl.h"

namespace quire {
namespace {

using Book = XMLBookImplT<wchar_t, excelNormal_tag>;
struct BookDeleter {
    void operator()(Book* book) const { book->release(); }
};
using BookPtr = std::unique_ptr<Book, BookDeleter>;

TEST(Styles, NewBookHasTheDefaultStylesheet) {
    BookPtr book(new Book());
    EXPECT_EQ(book->fontSize(), 1);
    EXPECT_EQ(book->formatSize(), 1);
    int size = 0;
    EXPECT_STREQ(book->defaultFont(&size), L"Calibri");
    EXPECT_EQ(size, 11);
    auto& sheet = book->styles().document();
    EXPECT_EQ(sheet.get_fills().size_fill(), 2u);
    EXPECT_EQ(sheet.get_borders().size_border(), 1u);
}

TEST(Styles, FillOfFormatZeroGetsItsOwnElement) {
    BookPtr book(new Book());
    IFormatT<wchar_t>* format = book->format(0);
    format->setFillPattern(FillPatternSolid);
    auto& fills = book->styles().document().get_fills();
    EXPECT_EQ(fills.size_fill(), 3u);
    EXPECT_EQ(fills.get_fill(0).get_patternFill().get_patternType(), 0);
    EXPECT_EQ(fills.get_fill(1).get_patternFill().get_patternType(), 17);
    format->setFillPattern(FillPatternNone);
    EXPECT_EQ(fills.size_fill(), 3u);
    EXPECT_EQ(format->fillPattern(), FillPatternNone);
}

TEST(Styles, ColoursInPaletteAndRgbMode) {
    BookPtr book(new Book());
    book->setRgbMode(true);
    IFormatT<wchar_t>* format = book->addFormat(nullptr);
    format->setFillPattern(FillPatternSolid);
    format->setPatternForegroundColor(book->colorPack(255, 0, 0));
    EXPECT_EQ(format->patternForegroundColor(), 0xFF0000);
    book->setRgbMode(false);
    EXPECT_EQ(format->patternForegroundColor(), 10);
}

TEST(Styles, CustomNumberFormatsStartAt166) {
    BookPtr book(new Book());
    EXPECT_EQ(book->addCustomNumFormat(L"0.000"), 166);
    EXPECT_EQ(book->addCustomNumFormat(L"0.000"), 166);
    int last = 0;
    for (int i = 0; i < 226; ++i) last = book->addCustomNumFormat((L"0." + std::wstring(static_cast<std::size_t>(i + 4), L'0')).c_str());
    EXPECT_EQ(last, 392);
    EXPECT_EQ(book->addCustomNumFormat(L"#"), 0);
    EXPECT_STREQ(book->errorMessage(), "maximum number of custom formats is exceeded");
    EXPECT_STREQ(book->customNumFormat(166), L"0.000");
}

TEST(Styles, AddFontCopiesOnlySetProperties) {
    BookPtr book(new Book());
    IFontT<wchar_t>* plain = book->addFont(nullptr);
    plain->setSize(14);
    IFontT<wchar_t>* copy = book->addFont(plain);
    auto* element = &dynamic_cast<XMLFontImplT<wchar_t, excelNormal_tag>*>(copy)->element();
    EXPECT_EQ(element->size_b(), 0u);
    EXPECT_EQ(copy->size(), 14);
}

TEST(Styles, OpenpyxlSeesFontsFillsBordersAlignmentAndNumberFormats) {
    BookPtr book(new Book());
    book->setRgbMode(true);
    auto* sheet = book->addSheet(L"Styled", nullptr);
    IFontT<wchar_t>* font = book->addFont(nullptr);
    font->setName(L"Arial");
    font->setSize(14);
    font->setBold(true);
    font->setItalic(true);
    font->setUnderline(UnderlineSingle);
    font->setColor(book->colorPack(0, 0, 255));
    IFormatT<wchar_t>* format = book->addFormat(nullptr);
    format->setFont(font);
    format->setNumFormat(book->addCustomNumFormat(L"0.000"));
    format->setAlignH(AlignHCenter);
    format->setAlignV(AlignVTop);
    format->setWrap(true);
    format->setBorder(BorderStyleThin);
    format->setBorderBottom(BorderStyleDouble);
    format->setFillPattern(FillPatternSolid);
    format->setPatternForegroundColor(book->colorPack(255, 255, 0));
    ASSERT_TRUE(sheet->writeNum(1, 1, 3.5, format));
    ASSERT_TRUE(sheet->setRow(1, 30, nullptr, false));
    ASSERT_TRUE(sheet->setCol(1, 1, 20, nullptr, false));
    ASSERT_TRUE(sheet->setMerge(3, 4, 0, 2));
    const std::string dir = test::makeTempDir("xlsx_styles");
    const std::string path = dir + "/styled.xlsx";
    ASSERT_TRUE(book->save(std::wstring(path.begin(), path.end()).c_str(), false)) << book->errorMessage();
    if (!test::havePythonModule("openpyxl")) GTEST_SKIP() << "openpyxl is not installed";
    const std::string script =
        "import openpyxl,sys\n"
        "wb=openpyxl.load_workbook(sys.argv[1]);ws=wb['Styled'];c=ws['B2']\n"
        "print(c.value,c.number_format,c.font.name,c.font.sz,c.font.b,c.font.i,c.font.u,c.font.color.rgb)\n"
        "print(c.fill.fill_type,c.fill.fgColor.rgb,c.border.left.style,c.border.bottom.style)\n"
        "print(c.alignment.horizontal,c.alignment.vertical,c.alignment.wrap_text)\n"
        "print(ws.row_dimensions[2].height,ws.column_dimensions['B'].width,[str(r) for r in ws.merged_cells.ranges])\n";
    test::writeFile(dir + "/read.py", script);
    std::string out;
    ASSERT_EQ(test::runCommand(test::systemPython() + " " + dir + "/read.py " + path, &out), 0) << out;
    EXPECT_EQ(out,
              "3.5 0.000 Arial 14.0 True True single FF0000FF\n"
              "solid FFFFFF00 thin double\n"
              "center top True\n"
              "30.0 20.0 ['A4:C5']\n");
}

}  // namespace
}  // namespace quire
