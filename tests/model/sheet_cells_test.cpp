#include <string>

#include "book_fixture.h"
#include "xls/model/book_impl.h"
#include "xls/model/sheet_impl.h"

namespace quire {
namespace {

class SheetCells : public BinaryBookTest {
protected:
    void SetUp() override {
        BinaryBookTest::SetUp();
        sheet = addSheet(L"Cells");
    }
    CellKind kindAt(int row, int col) { return static_cast<SheetImplT*>(sheet)->cells().kind(row, col); }
    ISheet* sheet = nullptr;
};

TEST_F(SheetCells, EveryCellTypeReadsBack) {
    IFormat* format = book->addFormat(nullptr);
    EXPECT_TRUE(sheet->writeNum(0, 0, 3.5, format));
    EXPECT_TRUE(sheet->writeStr(0, 1, L"h\u00E9llo \U0001F600", nullptr, 2));
    EXPECT_TRUE(sheet->writeBool(0, 2, true, nullptr, ErrorTypeNoError));
    sheet->writeError(0, 3, ErrorTypeDiv0, nullptr);
    EXPECT_TRUE(sheet->writeBlank(0, 4, format));
    EXPECT_EQ(sheet->cellType(0, 0), CellTypeNumber);
    EXPECT_EQ(sheet->cellType(0, 1), CellTypeString);
    EXPECT_EQ(sheet->cellType(0, 2), CellTypeBoolean);
    EXPECT_EQ(sheet->cellType(0, 3), CellTypeError);
    EXPECT_EQ(sheet->cellType(0, 4), CellTypeBlank);
    EXPECT_EQ(sheet->cellType(0, 5), CellTypeEmpty);
    EXPECT_EQ(message(), "ok");
    IFormat* read = nullptr;
    EXPECT_EQ(sheet->readNum(0, 0, &read), 3.5);
    EXPECT_EQ(read, format);
    EXPECT_EQ(std::wstring(sheet->readStr(0, 1, nullptr)), L"h\u00E9llo \U0001F600");
    EXPECT_TRUE(sheet->readBool(0, 2, nullptr));
    EXPECT_EQ(sheet->readError(0, 3), ErrorTypeDiv0);
    EXPECT_TRUE(sheet->readBlank(0, 4, &read));
    EXPECT_EQ(read, format);
}

TEST_F(SheetCells, ReadsOfTheWrongKindFail) {
    sheet->writeNum(1, 1, 1, nullptr);
    sheet->writeError(2, 2, ErrorTypeDiv0, nullptr);
    IFormat* read = reinterpret_cast<IFormat*>(0x1);
    EXPECT_EQ(sheet->readStr(1, 1, &read), nullptr);
    EXPECT_EQ(read, nullptr);
    EXPECT_EQ(message(), "this cell doesn't contain a string");
    EXPECT_FALSE(sheet->readBool(2, 2, nullptr));
    EXPECT_EQ(message(), "this cell doesn't contain a bool");
    EXPECT_EQ(sheet->readNum(2, 2, nullptr), 0);
    EXPECT_EQ(message(), "this cell doesn't contain a number");
    EXPECT_EQ(sheet->readError(1, 1), ErrorTypeNoError);
    EXPECT_EQ(message(), "this cell doesn't contain an error");
    EXPECT_FALSE(sheet->readBlank(1, 1, nullptr));
    EXPECT_EQ(message(), "format mustn't be NULL");
    EXPECT_FALSE(sheet->readBlank(1, 1, &read));
    EXPECT_EQ(message(), "this cell doesn't contain a blank");
    EXPECT_EQ(sheet->readFormula(1, 1, nullptr), nullptr);
    EXPECT_EQ(message(), "cell doesn't contain a formula");
}

TEST_F(SheetCells, BoundsAreCheckedRowFirst) {
    EXPECT_FALSE(sheet->writeNum(65536, 0, 1, nullptr));
    EXPECT_EQ(message(), "row must be in range 0-65535");
    EXPECT_FALSE(sheet->writeNum(-1, 300, 1, nullptr));
    EXPECT_EQ(message(), "row must be in range 0-65535");
    EXPECT_FALSE(sheet->writeNum(0, 256, 1, nullptr));
    EXPECT_EQ(message(), "col must be in range 0-255");
    EXPECT_TRUE(sheet->writeNum(65535, 255, 1, nullptr));
    EXPECT_EQ(sheet->cellType(65536, 0), CellTypeEmpty);
    EXPECT_EQ(message(), "row must be in range 0-65535");
}

TEST_F(SheetCells, NumbersChooseBetweenRkAndNumberRecords) {
    sheet->writeNum(0, 0, 1.5, nullptr);
    sheet->writeNum(0, 1, 0.1, nullptr);
    sheet->writeNum(0, 2, -1e300, nullptr);
    sheet->writeNum(0, 3, 1.0, nullptr);
    EXPECT_EQ(kindAt(0, 0), CellKind::Rk);
    EXPECT_EQ(kindAt(0, 1), CellKind::Number);
    EXPECT_EQ(kindAt(0, 3), CellKind::Rk);
    EXPECT_EQ(sheet->readNum(0, 0, nullptr), 1.5);
    EXPECT_EQ(sheet->readNum(0, 1, nullptr), 0.1);
    EXPECT_EQ(sheet->readNum(0, 2, nullptr), -1e300);
    sheet->writeNum(0, 0, 0.1, nullptr);  // a kind change in place
    EXPECT_EQ(kindAt(0, 0), CellKind::Number);
    EXPECT_EQ(sheet->readNum(0, 0, nullptr), 0.1);
}

TEST_F(SheetCells, StringsUpTo32767UnitsAndSharedByText) {
    std::wstring longest(32767, L'x');
    EXPECT_TRUE(sheet->writeStr(0, 0, longest.c_str(), nullptr, 2));
    std::wstring tooLong(32768, L'x');
    EXPECT_FALSE(sheet->writeStr(0, 1, tooLong.c_str(), nullptr, 2));
    EXPECT_EQ(message(), "string is too long");
    EXPECT_EQ(sheet->cellType(0, 1), CellTypeEmpty);
    std::wstring astral(16384, L'\U0001F600');  // 32768 UTF-16 units
    EXPECT_FALSE(sheet->writeStr(0, 1, astral.c_str(), nullptr, 2));
    sheet->writeStr(1, 0, L"same", nullptr, 2);
    sheet->writeStr(1, 1, L"same", nullptr, 2);
    EXPECT_EQ(static_cast<BookImplT*>(book)->sharedStrings().size(), 2u);
}

TEST_F(SheetCells, WritesWithoutFormatKeepTheCellsOrTheColumnsFormat) {
    IFormat* bold = book->addFormat(nullptr);
    IFormat* column = book->addFormat(nullptr);
    sheet->writeNum(0, 0, 1, bold);
    sheet->writeStr(0, 0, L"now text", nullptr, 2);
    EXPECT_EQ(sheet->cellFormat(0, 0), bold);
    EXPECT_TRUE(sheet->setCol(3, 4, 12, column, false));
    sheet->writeNum(5, 4, 2, nullptr);
    EXPECT_EQ(sheet->cellFormat(5, 4), column);
    sheet->writeNum(5, 6, 2, nullptr);
    EXPECT_EQ(sheet->cellFormat(5, 6), book->format(15));
    EXPECT_EQ(sheet->cellFormat(9, 9), book->format(0));  // no cell, row or column: the first format
    IBook* other = createBinaryBook();
    EXPECT_FALSE(sheet->writeNum(0, 0, 1, other->addFormat(nullptr)));
    EXPECT_EQ(message(), "specified format not found");
    sheet->setCellFormat(0, 0, other->format(0));
    EXPECT_EQ(message(), "specified format is not found");
    other->release();
}

TEST_F(SheetCells, BooleansAndErrorsShareOneKind) {
    sheet->writeBool(0, 0, true, nullptr, ErrorTypeNoError);
    sheet->writeBool(0, 1, false, nullptr, ErrorTypeNA);
    EXPECT_EQ(sheet->cellType(0, 1), CellTypeError);
    EXPECT_EQ(sheet->readError(0, 1), ErrorTypeNA);
    EXPECT_FALSE(sheet->readBool(0, 1, nullptr));
    EXPECT_EQ(message(), "this cell doesn't contain a bool");
}

TEST_F(SheetCells, FormulaCellsReportTheirCachedResult) {
    EXPECT_TRUE(sheet->writeFormulaNum(0, 0, L"1+2", 3, nullptr));
    EXPECT_TRUE(sheet->writeFormulaStr(0, 1, L"\"a\"&\"b\"", L"ab", nullptr));
    EXPECT_TRUE(sheet->writeFormulaBool(0, 2, L"1<2", true, nullptr));
    EXPECT_TRUE(sheet->isFormula(0, 0));
    EXPECT_FALSE(sheet->isFormula(1, 0));
    EXPECT_EQ(sheet->cellType(0, 0), CellTypeNumber);
    EXPECT_EQ(sheet->readNum(0, 0, nullptr), 3);
    EXPECT_EQ(sheet->cellType(0, 1), CellTypeString);
    EXPECT_EQ(std::wstring(sheet->readStr(0, 1, nullptr)), L"ab");
    EXPECT_TRUE(sheet->readBool(0, 2, nullptr));
    EXPECT_EQ(std::wstring(sheet->readFormula(0, 0, nullptr)), L"1+2");
}

TEST_F(SheetCells, DatesAreDecidedByTheNumberFormat) {
    IFormat* date = book->addFormat(nullptr);
    date->setNumFormat(NumformatDate);
    IFormat* quoted = book->addFormat(nullptr);
    quoted->setNumFormat(book->addCustomNumFormat(L"0\" days\""));
    IFormat* iso = book->addFormat(nullptr);
    iso->setNumFormat(book->addCustomNumFormat(L"yyyy-mm-dd"));
    sheet->writeNum(0, 0, 40000, date);
    sheet->writeNum(0, 1, 40000, quoted);
    sheet->writeNum(0, 2, 40000, iso);
    sheet->writeStr(0, 3, L"2020-01-01", date, 2);
    sheet->writeNum(0, 4, 40000, nullptr);
    EXPECT_TRUE(sheet->isDate(0, 0));
    EXPECT_FALSE(sheet->isDate(0, 1));
    EXPECT_TRUE(sheet->isDate(0, 2));
    EXPECT_FALSE(sheet->isDate(0, 3));
    EXPECT_FALSE(sheet->isDate(0, 4));
    EXPECT_EQ(message(), "ok");
}

TEST_F(SheetCells, UsedRangeFollowsTheCells) {
    EXPECT_EQ(sheet->lastRow(), 0);
    sheet->writeNum(2, 1, 1, nullptr);
    EXPECT_EQ(sheet->firstRow(), 2);
    EXPECT_EQ(sheet->lastRow(), 3);
    EXPECT_EQ(sheet->firstCol(), 1);
    EXPECT_EQ(sheet->lastCol(), 2);
    sheet->writeNum(9, 0, 1, nullptr);
    EXPECT_EQ(sheet->lastRow(), 10);
    EXPECT_EQ(sheet->firstCol(), 0);
    sheet->clear(9, 9, 0, 0);
    EXPECT_EQ(sheet->lastRow(), 3);
}

TEST_F(SheetCells, CopyCellCopiesKindValueAndFormat) {
    IFormat* format = book->addFormat(nullptr);
    sheet->writeStr(0, 0, L"copied", format, 2);
    EXPECT_TRUE(sheet->copyCell(0, 0, 4, 4));
    EXPECT_EQ(std::wstring(sheet->readStr(4, 4, nullptr)), L"copied");
    EXPECT_EQ(sheet->cellFormat(4, 4), format);
    EXPECT_FALSE(sheet->copyCell(1, 1, 2, 2));
    EXPECT_EQ(message(), "empty cell");
}

TEST_F(SheetCells, CommentsAreKeptPerCell) {
    sheet->writeComment(1, 1, L"note", nullptr, 100, 50);
    EXPECT_EQ(std::wstring(sheet->readComment(1, 1)), L"note");
    EXPECT_EQ(static_cast<SheetImplT*>(sheet)->comments().begin()->second.author, L"quire");
    sheet->removeComment(1, 1);
    EXPECT_EQ(sheet->readComment(1, 1), nullptr);
}

TEST_F(SheetCells, AddressesRespectTheBinaryBounds) {
    EXPECT_EQ(std::wstring(sheet->rowColToAddr(0, 0, true, true)), L"A1");
    EXPECT_EQ(std::wstring(sheet->rowColToAddr(9, 27, false, false)), L"$AB$10");
    EXPECT_EQ(sheet->rowColToAddr(-1, 0, true, true), nullptr);
    EXPECT_EQ(message(), "row must be in range 0-65535");
    int row = 0, col = 0;
    sheet->addrToRowCol(L"IV65536", &row, &col, nullptr, nullptr);
    EXPECT_EQ(row, 65535);
    EXPECT_EQ(col, 255);
}

}  // namespace
}  // namespace quire
