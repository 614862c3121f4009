// Values written into cells read back as written, in memory and after a save and load.
#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "api/enums.h"
#include "corpus.h"
#include "external_tools.h"
#include "xlsx/xml_book_impl.h"

namespace quire {
namespace {

using Book = XMLBookImplT<wchar_t, excelNormal_tag>;

struct BookDeleter {
    void operator()(Book* book) const { book->release(); }
};
using BookPtr = std::unique_ptr<Book, BookDeleter>;

BookPtr newBook() { return BookPtr(new Book()); }

BookPtr reload(Book& book, const std::string& path) {
    EXPECT_TRUE(book.save(std::wstring(path.begin(), path.end()).c_str(), false)) << book.errorMessage();
    BookPtr loaded = newBook();
    EXPECT_TRUE(loaded->load(std::wstring(path.begin(), path.end()).c_str(), nullptr)) << loaded->errorMessage();
    return loaded;
}

TEST(CellValues, NumbersStringsBooleansErrorsAndBlanks) {
    auto book = newBook();
    auto* sheet = book->addSheet(L"Data", nullptr);
    ASSERT_NE(sheet, nullptr);
    EXPECT_TRUE(sheet->writeNum(0, 0, 0.1, nullptr));
    EXPECT_TRUE(sheet->writeStr(0, 1, L"text", nullptr, 2));
    EXPECT_TRUE(sheet->writeBool(0, 2, true, nullptr, ErrorTypeNoError));
    sheet->writeError(0, 3, ErrorTypeNA, nullptr);
    EXPECT_TRUE(sheet->writeBlank(0, 4, book->format(0)));
    EXPECT_TRUE(sheet->writeNum(5, 2, -3.25, nullptr));
    EXPECT_TRUE(sheet->writeNum(2, 1, 7, nullptr));  // a row between two others

    const std::string dir = test::makeTempDir("xlsx_cells");
    auto loaded = reload(*book, dir + "/values.xlsx");
    auto* again = loaded->getSheet(0);
    ASSERT_NE(again, nullptr);
    EXPECT_EQ(again->readNum(0, 0, nullptr), 0.1);
    EXPECT_STREQ(again->readStr(0, 1, nullptr), L"text");
    EXPECT_TRUE(again->readBool(0, 2, nullptr));
    EXPECT_EQ(again->readError(0, 3), ErrorTypeNA);
    EXPECT_TRUE(again->readBlank(0, 4, nullptr));
    EXPECT_EQ(again->cellType(0, 4), CellTypeBlank);
    EXPECT_EQ(again->readNum(2, 1, nullptr), 7);
    EXPECT_EQ(again->readNum(5, 2, nullptr), -3.25);
    EXPECT_EQ(again->cellType(9, 9), CellTypeEmpty);
    again->readNum(9, 9, nullptr);
    EXPECT_STREQ(loaded->errorMessage(), "cell is not found");
    again->readNum(0, 1, nullptr);
    EXPECT_STREQ(loaded->errorMessage(), "this cell doesn't contain a number");
    EXPECT_EQ(again->firstRow(), 0);
    EXPECT_EQ(again->lastRow(), 6);
    EXPECT_EQ(again->lastCol(), 5);
}

TEST(CellValues, OutOfRangeColumnLeavesSheetUnchanged) {
    auto book = newBook();
    auto* sheet = book->addSheet(L"S", nullptr);
    EXPECT_FALSE(sheet->writeNum(0, 16384, 1, nullptr));
    EXPECT_STREQ(book->errorMessage(), "col must be in range 0-16383");
    EXPECT_FALSE(sheet->writeNum(1048576, 0, 1, nullptr));
    EXPECT_STREQ(book->errorMessage(), "row must be in range 0-1048575");
    EXPECT_EQ(sheet->lastRow(), 0);
}

TEST(SharedStrings, OnlyTheLastTextIsReused) {
    auto book = newBook();
    auto* sheet = book->addSheet(L"S", nullptr);
    for (int i = 0; i < 4; ++i) sheet->writeStr(i, 0, i == 2 ? L"b" : L"a", nullptr, 2);
    auto& table = book->sharedStrings().document();
    EXPECT_EQ(table.size_si(), 3u);
    EXPECT_EQ(table.get_count(), 4u);
    EXPECT_EQ(table.get_uniqueCount(), 3u);
}

TEST(SharedStrings, EscapesControlCharactersAndKeepsEscapeLikeText) {
    auto book = newBook();
    auto* sheet = book->addSheet(L"S", nullptr);
    const std::wstring control = std::wstring(L"a") + wchar_t(1) + L"b";
    sheet->writeStr(0, 0, control.c_str(), nullptr, 2);
    sheet->writeStr(1, 0, L"_x0041_", nullptr, 2);
    sheet->writeStr(2, 0, L" padded ", nullptr, 2);
    const std::string dir = test::makeTempDir("xlsx_cells");
    auto loaded = reload(*book, dir + "/escapes.xlsx");
    auto* again = loaded->getSheet(0);
    EXPECT_EQ(std::wstring(again->readStr(0, 0, nullptr)), control);
    EXPECT_STREQ(again->readStr(1, 0, nullptr), L"_x0041_");
    EXPECT_STREQ(again->readStr(2, 0, nullptr), L" padded ");
}

TEST(SharedStrings, LengthLimit) {
    auto book = newBook();
    auto* sheet = book->addSheet(L"S", nullptr);
    EXPECT_TRUE(sheet->writeStr(0, 0, std::wstring(32767, L'x').c_str(), nullptr, 2));
    EXPECT_FALSE(sheet->writeStr(1, 0, std::wstring(32768, L'x').c_str(), nullptr, 2));
    EXPECT_STREQ(book->errorMessage(), "string is too long");
    EXPECT_EQ(sheet->cellType(1, 0), CellTypeEmpty);
}

TEST(Formulas, SeparatorsPrefixesAndArrays) {
    auto book = newBook();
    ASSERT_TRUE(book->setLocale("C"));
    auto* sheet = book->addSheet(L"S", nullptr);
    EXPECT_TRUE(sheet->writeFormula(0, 0, L"=SUM(A2,A3)", nullptr));
    EXPECT_TRUE(sheet->writeFormula(0, 1, L"=CONCAT(A1,\"x;y\")", nullptr));
    EXPECT_TRUE(sheet->writeFormula(0, 2, L"{=A1:A3*2}", nullptr));
    EXPECT_TRUE(sheet->writeFormulaNum(0, 3, L"1+1", 2, nullptr));
    const std::string dir = test::makeTempDir("xlsx_cells");
    auto loaded = reload(*book, dir + "/formulas.xlsx");
    ASSERT_TRUE(loaded->setLocale("C"));
    auto* again = loaded->getSheet(0);
    EXPECT_STREQ(again->readFormula(0, 0, nullptr), L"SUM(A2,A3)");
    EXPECT_STREQ(again->readFormula(0, 1, nullptr), L"CONCAT(A1,\"x;y\")");
    EXPECT_STREQ(again->readFormula(0, 2, nullptr), L"A1:A3*2");
    EXPECT_EQ(again->readNum(0, 3, nullptr), 2);
    EXPECT_TRUE(again->isFormula(0, 3));

    if (!test::havePythonModule("openpyxl")) GTEST_SKIP() << "openpyxl is not installed";
    std::string out;
    const std::string script =
        "import openpyxl,sys\n"
        "ws=openpyxl.load_workbook(sys.argv[1]).active\n"
        "print(ws['A1'].value);print(ws['B1'].value);print(ws['C1'].value, ws.formula_attributes['C1']['ref'])\n";
    test::writeFile(dir + "/read.py", script);
    ASSERT_EQ(test::runCommand(test::systemPython() + " " + dir + "/read.py " + dir + "/formulas.xlsx", &out), 0) << out;
    EXPECT_EQ(out, "=SUM(A2,A3)\n=_xlfn.CONCAT(A1,\"x;y\")\n=A1:A3*2 C1\n");
}

TEST(Formulas, SharedFormulasReadFromTheMaster) {
    auto book = newBook();
    auto* sheet = dynamic_cast<XMLSheetImplT<wchar_t, excelNormal_tag>*>(book->addSheet(L"S", nullptr));
    ASSERT_TRUE(book->setLocale("C"));
    sheet->writeNum(0, 0, 1, nullptr);
    auto& data = sheet->document().get_sheetData();
    for (int r = 0; r < 3; ++r) {
        auto& row = r < static_cast<int>(data.size_row()) ? data.get_row(static_cast<std::size_t>(r)) : data.append_row();
        row.set_r(static_cast<std::uint32_t>(r + 1));
        auto& cell = row.append_c();
        cell.set_ref(static_cast<std::uint32_t>(r), 1);
        auto& f = cell.get_f();
        f.set_t(3);
        f.set_si(0);
        if (r == 0) {
            f.set_ref(L"B1:B3");
            f.set_value(L"A1*2+$A$1");
        }
    }
    EXPECT_STREQ(sheet->readFormula(2, 1, nullptr), L"A3*2+$A$1");
    // Rewriting the master gives the other cells their own formulas.
    EXPECT_TRUE(sheet->writeFormula(0, 1, L"7", nullptr));
    EXPECT_STREQ(sheet->readFormula(1, 1, nullptr), L"A2*2+$A$1");
}

TEST(RowsAndColumns, HeightsWidthsAndSplits) {
    auto book = newBook();
    auto* sheet = book->addSheet(L"S", nullptr);
    EXPECT_EQ(sheet->rowHeightPx(3), 20);
    EXPECT_TRUE(sheet->setRow(3, 15, nullptr, false));
    EXPECT_EQ(sheet->rowHeightPx(3), 20);
    EXPECT_TRUE(sheet->setCol(0, 5, 8.43, nullptr, false));
    EXPECT_EQ(sheet->colWidthPx(2), 64 - 5);
    EXPECT_TRUE(sheet->setCol(2, 3, 9.140625, nullptr, true));
    EXPECT_EQ(sheet->colWidthPx(2), 64);
    EXPECT_EQ(sheet->colWidthPx(1), 59);
    EXPECT_EQ(sheet->colWidthPx(4), 59);
    EXPECT_TRUE(sheet->colHidden(3));
    EXPECT_FALSE(sheet->colHidden(4));
    EXPECT_FALSE(sheet->setCol(3, 2, 1, nullptr, false));
    EXPECT_STREQ(book->errorMessage(), "colLast must be greater than or equal to colFirst");
}

TEST(Merges, SetFindClearAndMoveWithRows) {
    auto book = newBook();
    auto* sheet = book->addSheet(L"S", nullptr);
    EXPECT_TRUE(sheet->setMerge(1, 2, 1, 3));
    int r1 = 0, r2 = 0, c1 = 0, c2 = 0;
    EXPECT_TRUE(sheet->getMerge(2, 2, &r1, &r2, &c1, &c2));
    EXPECT_EQ(r1, 1);
    EXPECT_EQ(c2, 3);
    EXPECT_TRUE(sheet->insertRow(0, 1, false));
    EXPECT_TRUE(sheet->merge(0, &r1, &r2, &c1, &c2));
    EXPECT_EQ(r1, 3);
    EXPECT_EQ(r2, 4);
    sheet->clear(4, 4, 0, 0);
    EXPECT_EQ(sheet->mergeSize(), 1);
    sheet->clear(4, 4, 2, 2);
    EXPECT_EQ(sheet->mergeSize(), 0);
    EXPECT_FALSE(sheet->getMerge(3, 2, nullptr, nullptr, nullptr, nullptr));
    EXPECT_STREQ(book->errorMessage(), "this cell isn't in merging block");
}

TEST(RowsAndColumns, RemoveRowsMovesCells) {
    auto book = newBook();
    auto* sheet = book->addSheet(L"S", nullptr);
    for (int r = 0; r < 5; ++r) sheet->writeNum(r, 0, r, nullptr);
    EXPECT_TRUE(sheet->removeRow(1, 2, false));
    EXPECT_EQ(sheet->readNum(1, 0, nullptr), 3);
    EXPECT_EQ(sheet->lastRow(), 3);
    EXPECT_TRUE(sheet->insertCol(0, 0, false));
    EXPECT_EQ(sheet->readNum(2, 1, nullptr), 4);
    EXPECT_EQ(sheet->cellType(2, 0), CellTypeEmpty);
}

}  // namespace
}  // namespace quire

namespace quire {
namespace {

TEST(CellCopies, ValueKindAndFormatTravelAndSharedFormulasStandAlone) {
    const std::string dir = test::makeTempDir("quire-xlsx-copy");
    auto book = newBook();
    auto* sheet = book->addSheet(L"S", nullptr);
    auto* format = book->addFormat(nullptr);
    format->setNumFormat(NumformatPercent);
    ASSERT_TRUE(sheet->writeStr(0, 0, L"text", format, 2));
    ASSERT_TRUE(sheet->writeFormula(0, 1, L"A1&\"!\"", nullptr));
    EXPECT_TRUE(sheet->copyCell(0, 0, 3, 2));
    EXPECT_TRUE(sheet->copyCell(0, 1, 0, 0));  // onto a cell of the same row, left of the source
    EXPECT_STREQ(sheet->readStr(3, 2, nullptr), L"text");
    EXPECT_EQ(sheet->cellFormat(3, 2)->numFormat(), NumformatPercent);
    EXPECT_STREQ(sheet->readFormula(0, 0, nullptr), L"A1&\"!\"");
    EXPECT_FALSE(sheet->copyCell(7, 7, 0, 0));
    EXPECT_STREQ(book->errorMessage(), "empty cell");
    EXPECT_FALSE(sheet->copyCell(0, 0, 0, 16384));
    EXPECT_STREQ(book->errorMessage(), "col must be in range 0-16383");

    auto loaded = reload(*book, dir + "/copy.xlsx");
    auto* again = loaded->getSheet(0);
    EXPECT_STREQ(again->readStr(3, 2, nullptr), L"text");
    EXPECT_STREQ(again->readFormula(0, 0, nullptr), L"A1&\"!\"");
}

TEST(CellCopies, AddressesUseTheOpenXmlLimits) {
    auto book = newBook();
    auto* sheet = book->addSheet(L"S", nullptr);
    EXPECT_STREQ(sheet->rowColToAddr(1048575, 16383, true, false), L"$XFD1048576");
    EXPECT_EQ(sheet->rowColToAddr(1048576, 0, true, true), nullptr);
    int row = 0, col = 0;
    bool rowRelative = false, colRelative = false;
    sheet->addrToRowCol(L"XFD1048576", &row, &col, &rowRelative, &colRelative);
    EXPECT_EQ(row, 1048575);
    EXPECT_EQ(col, 16383);
    EXPECT_TRUE(rowRelative);
}

}  // namespace
}  // namespace quire

#include "api/digit_width.h"

namespace quire {
namespace {

TEST(DigitWidth, MeasuredOnTheFontOrAStandInOfTheSameMetrics) {
    if (!test::haveProgram("fc-list") ||
        test::runCommand("fc-list | grep -q LiberationSans-Regular", nullptr) != 0)
        GTEST_SKIP() << "Liberation Sans is not installed";
    EXPECT_EQ(measureMaxDigitWidth(L"Arial", 10 * 96.0 / 72), 7);
    EXPECT_EQ(measureMaxDigitWidth(L"Arial", 20 * 96.0 / 72), 15);
    // Some other family that fontconfig would offer instead does not count.
    EXPECT_EQ(measureMaxDigitWidth(L"No Such Family At All", 14.0), 0);

    auto book = newBook();
    auto* sheet = book->addSheet(L"S", nullptr);
    ASSERT_TRUE(sheet->setCol(0, 0, 8.43, nullptr, false));
    book->setDefaultFont(L"Arial", 20);
    // With a maximum digit width of 15: floor((8.43 * 256 + floor(128 / 15)) / 256 * 15).
    EXPECT_EQ(sheet->colWidthPx(0), 126);
    // Back from pixels with the padding of that width: (126 - 16 + 3) / 15.
    EXPECT_DOUBLE_EQ(sheet->colWidth(0), 7.53);
}

}  // namespace
}  // namespace quire
