#include <string>

#include "book_fixture.h"
#include "xls/model/sheet_impl.h"

namespace quire {
namespace {

class SheetOptions : public BinaryBookTest {
protected:
    void SetUp() override {
        BinaryBookTest::SetUp();
        sheet = addSheet(L"Options");
    }
    ISheet* sheet = nullptr;
};

TEST_F(SheetOptions, ViewSettings) {
    EXPECT_TRUE(sheet->displayGridlines());
    sheet->setDisplayGridlines(false);
    EXPECT_FALSE(sheet->displayGridlines());
    EXPECT_EQ(sheet->zoom(), 100);
    sheet->setZoom(150);
    EXPECT_EQ(sheet->zoom(), 150);
    auto& view = static_cast<SheetImplT*>(sheet)->view();
    EXPECT_EQ(view.sclNumerator, 150);
    EXPECT_EQ(view.sclDenominator, 100);
    sheet->setTopLeftView(10, 3);
    int row = 0, col = 0;
    sheet->getTopLeftView(&row, &col);
    EXPECT_EQ(row, 10);
    EXPECT_EQ(col, 3);
    sheet->setRightToLeft(true);
    EXPECT_TRUE(sheet->rightToLeft());
}

TEST_F(SheetOptions, PrintSettings) {
    EXPECT_FALSE(sheet->landscape());
    sheet->setLandscape(true);
    EXPECT_TRUE(sheet->landscape());
    sheet->setPaper(PaperA4);
    EXPECT_EQ(sheet->paper(), PaperA4);
    sheet->setPrintZoom(80);
    EXPECT_EQ(sheet->printZoom(), 80);
    int w = 0, h = 0;
    EXPECT_FALSE(sheet->getPrintFit(&w, &h));
    sheet->setPrintFit(1, 2);
    EXPECT_TRUE(sheet->getPrintFit(&w, &h));
    EXPECT_EQ(h, 2);
    EXPECT_TRUE(sheet->setHeader(L"&CPage &P", 0.4));
    EXPECT_EQ(std::wstring(sheet->header()), L"&CPage &P");
    EXPECT_DOUBLE_EQ(sheet->headerMargin(), 0.4);
    std::wstring tooLong(256, L'h');
    EXPECT_FALSE(sheet->setFooter(tooLong.c_str(), 0.3));
    sheet->setMarginLeft(1.25);
    EXPECT_DOUBLE_EQ(sheet->marginLeft(), 1.25);
    sheet->setHCenter(true);
    EXPECT_TRUE(sheet->hCenter());
    sheet->setPrintGridlines(true);
    EXPECT_TRUE(sheet->printGridlines());
    sheet->setPrintRowCol(true);
    EXPECT_TRUE(sheet->printRowCol());
}

TEST_F(SheetOptions, NamesAndVisibility) {
    sheet->setName(L"Renamed");
    EXPECT_EQ(std::wstring(sheet->name()), L"Renamed");
    sheet->setName(nullptr);
    EXPECT_EQ(message(), "incorrect sheet name");
    sheet->setName(L"0123456789012345678901234567890123");
    EXPECT_EQ(message(), "warning: sheet's name is cut to 31 characters");
    ISheet* second = addSheet(L"Second");
    second->setName(L"renamed");  // only differs from nothing now: the first sheet was renamed again
    EXPECT_EQ(message(), "ok");
    second->setName(L"0123456789012345678901234567890");
    EXPECT_EQ(message(), "book already contains such sheet name");
    EXPECT_FALSE(sheet->setHidden(SheetStateHidden) && second->setHidden(SheetStateHidden));
    EXPECT_EQ(message(), "a workbook must contain at least one visible worksheet");
    EXPECT_TRUE(second->setHidden(SheetStateVisible));
    EXPECT_EQ(sheet->hidden(), SheetStateHidden);
    EXPECT_FALSE(second->setHidden(3));
    EXPECT_EQ(message(), "hidden is out of range");
}

TEST_F(SheetOptions, ProtectionStoresThePasswordVerifier) {
    EXPECT_FALSE(sheet->protect());
    sheet->setProtectEx(true, L"secret", ProtectDefault);
    EXPECT_TRUE(sheet->protect());
    EXPECT_EQ(static_cast<SheetImplT*>(sheet)->protection().password, 0xDAA7);
}

TEST_F(SheetOptions, HyperlinksIgnoredErrorsAndTabColour) {
    sheet->addHyperlink(L"https://example.com/", 0, 0, 0, 1);
    EXPECT_EQ(sheet->hyperlinkSize(), 1);
    int rf, rl, cf, cl;
    EXPECT_EQ(std::wstring(sheet->hyperlink(0, &rf, &rl, &cf, &cl)), L"https://example.com/");
    EXPECT_EQ(cl, 1);
    EXPECT_TRUE(sheet->delHyperlink(0));
    EXPECT_FALSE(sheet->delHyperlink(0));
    EXPECT_EQ(message(), "index is out of range");
    EXPECT_TRUE(sheet->addIgnoredError(0, 0, 5, 5, IgnoreErrorNumberStoredAsText));
    EXPECT_FALSE(sheet->addIgnoredError(0, 0, 5, 5, IgnoreErrorNumberStoredAsText));
    EXPECT_EQ(message(), "ignored error already exists");
    sheet->setTabColor(ColorRed);
    EXPECT_EQ(static_cast<SheetImplT*>(sheet)->tabColor(), ColorRed);
    sheet->setTabRgbColor(0, 0, 255);
    EXPECT_EQ(static_cast<SheetImplT*>(sheet)->tabColor(), ColorBlue);
}

TEST_F(SheetOptions, OpenXmlOnlyFeaturesAnswerPlainly) {
    EXPECT_EQ(sheet->autoFilter(), nullptr);
    EXPECT_EQ(sheet->tableSize(), 0);
    sheet->addDataValidation(ValidationTypeWhole, ValidationOpBetween, 0, 1, 0, 1, L"1", L"2", true,
                             false, true, true, nullptr, nullptr, nullptr, nullptr, 0);
    EXPECT_EQ(message(), "function is not supported for xls files");
    sheet->removeDataValidations();
    EXPECT_EQ(message(), "function is not supported for xls files");
}

}  // namespace
}  // namespace quire
