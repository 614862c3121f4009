#include <string>

#include "book_fixture.h"

namespace quire {
namespace {

class SheetLayout : public BinaryBookTest {
protected:
    void SetUp() override {
        BinaryBookTest::SetUp();
        sheet = addSheet(L"Layout");
    }
    ISheet* sheet = nullptr;
};

TEST_F(SheetLayout, RowHeightsAreKeptInTwentiethsUpTo410Points) {
    EXPECT_DOUBLE_EQ(sheet->rowHeight(3), 12.75);
    EXPECT_TRUE(sheet->setRow(3, 410, nullptr, false));
    EXPECT_DOUBLE_EQ(sheet->rowHeight(3), 410);
    EXPECT_FALSE(sheet->setRow(3, 410.05, nullptr, false));
    EXPECT_EQ(message(), "height is too big");
    EXPECT_FALSE(sheet->setRow(65536, 10, nullptr, false));
    EXPECT_EQ(message(), "row must be in range 0-65535");
    EXPECT_TRUE(sheet->setRow(4, 20, nullptr, true));
    EXPECT_TRUE(sheet->rowHidden(4));
    EXPECT_TRUE(sheet->setRowHidden(4, false));
    EXPECT_FALSE(sheet->rowHidden(4));
    EXPECT_EQ(sheet->rowHeightPx(4), 27);
}

TEST_F(SheetLayout, ColumnRangesSplitWhereTheyAreChanged) {
    EXPECT_TRUE(sheet->setCol(0, 9, 20, nullptr, false));
    EXPECT_TRUE(sheet->setCol(3, 4, 5, nullptr, true));
    EXPECT_DOUBLE_EQ(sheet->colWidth(2), 20);
    EXPECT_DOUBLE_EQ(sheet->colWidth(3), 5);
    EXPECT_DOUBLE_EQ(sheet->colWidth(5), 20);
    EXPECT_TRUE(sheet->colHidden(4));
    EXPECT_FALSE(sheet->colHidden(5));
    EXPECT_DOUBLE_EQ(sheet->colWidth(20), 8.43);
    EXPECT_FALSE(sheet->setCol(5, 4, 10, nullptr, false));
    EXPECT_EQ(message(), "colLast must be greater than or equal to colFirst");
    EXPECT_FALSE(sheet->setCol(0, 256, 10, nullptr, false));
    EXPECT_EQ(message(), "colLast must be in range 0-255");
    EXPECT_TRUE(sheet->setColHidden(30, true));
    EXPECT_TRUE(sheet->colHidden(30));
    EXPECT_GT(sheet->colWidthPx(0), sheet->colWidthPx(3));
}

TEST_F(SheetLayout, MergesAreCheckedAndFoundByCell) {
    EXPECT_FALSE(sheet->setMerge(2, 1, 0, 0));
    EXPECT_EQ(message(), "rowLast must be greater than or equal to rowFirst");
    EXPECT_EQ(sheet->mergeSize(), 0);
    EXPECT_FALSE(sheet->setMerge(0, 1, 0, 256));
    EXPECT_EQ(message(), "col must be in range 0-255");
    EXPECT_TRUE(sheet->setMerge(1, 2, 1, 3));
    int rf, rl, cf, cl;
    EXPECT_TRUE(sheet->getMerge(2, 3, &rf, &rl, &cf, &cl));
    EXPECT_EQ(rf, 1);
    EXPECT_EQ(cl, 3);
    EXPECT_FALSE(sheet->getMerge(0, 0, &rf, &rl, &cf, &cl));
    EXPECT_EQ(message(), "this cell isn't in merging block");
    EXPECT_FALSE(sheet->merge(1, &rf, &rl, &cf, &cl));
    EXPECT_EQ(message(), "index is out of range");
    EXPECT_TRUE(sheet->delMerge(1, 1));
    EXPECT_EQ(sheet->mergeSize(), 0);
}

TEST_F(SheetLayout, PageBreaksAreUniqueAndLimited) {
    EXPECT_TRUE(sheet->setHorPageBreak(10, true));
    EXPECT_FALSE(sheet->setHorPageBreak(10, true));
    EXPECT_EQ(message(), "pagebreak already exists");
    EXPECT_FALSE(sheet->setHorPageBreak(11, false));
    EXPECT_EQ(message(), "pagebreak not found");
    EXPECT_FALSE(sheet->setHorPageBreak(65536, true));
    EXPECT_EQ(message(), "row must be in range 0-65535");
    EXPECT_TRUE(sheet->setHorPageBreak(10, false));
    for (int row = 0; row < 1026; ++row) ASSERT_TRUE(sheet->setHorPageBreak(row, true));
    EXPECT_FALSE(sheet->setHorPageBreak(2000, true));
    EXPECT_EQ(message(), "number of pagebreaks is exceed limit");
    EXPECT_EQ(sheet->getHorPageBreakSize(), 1026);
    EXPECT_TRUE(sheet->setVerPageBreak(5, true));
    EXPECT_EQ(sheet->getVerPageBreak(0), 5);
    EXPECT_EQ(sheet->getVerPageBreak(1), -1);
    EXPECT_EQ(message(), "index is out of range");
}

TEST_F(SheetLayout, SplitPanes) {
    int row = -1, col = -1;
    EXPECT_FALSE(sheet->splitInfo(&row, &col));
    EXPECT_EQ(message(), "worksheet is not splitted");
    sheet->split(2, 1);
    EXPECT_TRUE(sheet->splitInfo(&row, &col));
    EXPECT_EQ(row, 2);
    EXPECT_EQ(col, 1);
}

TEST_F(SheetLayout, OutlineGroupsNestButDoNotCross) {
    EXPECT_TRUE(sheet->groupRows(2, 10, false));
    EXPECT_TRUE(sheet->groupRows(3, 5, false));
    EXPECT_FALSE(sheet->groupRows(8, 12, false));
    EXPECT_EQ(message(), "detect overlap");
    EXPECT_FALSE(sheet->groupRows(5, 4, false));
    EXPECT_EQ(message(), "must be rowFirst <= rowLast");
    EXPECT_TRUE(sheet->groupRows(20, 22, true));
    EXPECT_TRUE(sheet->rowHidden(21));
    EXPECT_TRUE(sheet->groupCols(1, 3, false));
    EXPECT_FALSE(sheet->groupCols(2, 256, false));
    EXPECT_EQ(message(), "colLast must be in range 0-255");
    EXPECT_TRUE(sheet->groupSummaryBelow());
    sheet->setGroupSummaryBelow(false);
    EXPECT_FALSE(sheet->groupSummaryBelow());
}

TEST_F(SheetLayout, InsertingAndRemovingRowsShiftsCellsAndMerges) {
    sheet->writeNum(0, 0, 1, nullptr);
    sheet->writeNum(5, 0, 6, nullptr);
    sheet->setMerge(5, 6, 0, 1);
    EXPECT_TRUE(sheet->insertRow(2, 3, true));
    EXPECT_EQ(sheet->readNum(0, 0, nullptr), 1);
    EXPECT_EQ(sheet->readNum(7, 0, nullptr), 6);
    EXPECT_EQ(sheet->cellType(5, 0), CellTypeEmpty);
    int rf, rl, cf, cl;
    EXPECT_TRUE(sheet->merge(0, &rf, &rl, &cf, &cl));
    EXPECT_EQ(rf, 7);
    EXPECT_EQ(rl, 8);
    EXPECT_TRUE(sheet->removeRow(0, 1, true));
    EXPECT_EQ(sheet->readNum(5, 0, nullptr), 6);
    EXPECT_EQ(sheet->cellType(0, 0), CellTypeEmpty);
    EXPECT_TRUE(sheet->removeRow(5, 6, true));
    EXPECT_EQ(sheet->mergeSize(), 0);
    EXPECT_FALSE(sheet->insertRow(3, 2, true));
    EXPECT_EQ(message(), "rowLast must be greater than or equal to rowFirst");
    EXPECT_FALSE(sheet->insertRow(0, 65536, true));
    EXPECT_EQ(message(), "rowLast must be in range 0-65535");
}

TEST_F(SheetLayout, RowsPushedPastTheEndAreDropped) {
    sheet->writeNum(65535, 0, 1, nullptr);
    sheet->writeNum(65534, 0, 2, nullptr);
    EXPECT_TRUE(sheet->insertRow(0, 0, true));
    EXPECT_EQ(sheet->readNum(65535, 0, nullptr), 2);
    EXPECT_EQ(sheet->lastRow(), 65536);
}

TEST_F(SheetLayout, InsertingAndRemovingColumnsShiftsCells) {
    sheet->writeStr(0, 2, L"c", nullptr, 2);
    sheet->writeStr(0, 5, L"f", nullptr, 2);
    sheet->setCol(5, 5, 30, nullptr, false);
    EXPECT_TRUE(sheet->insertCol(0, 1, true));
    EXPECT_EQ(std::wstring(sheet->readStr(0, 4, nullptr)), L"c");
    EXPECT_EQ(std::wstring(sheet->readStr(0, 7, nullptr)), L"f");
    EXPECT_DOUBLE_EQ(sheet->colWidth(7), 30);
    EXPECT_TRUE(sheet->removeCol(4, 4, true));
    EXPECT_EQ(std::wstring(sheet->readStr(0, 6, nullptr)), L"f");
    EXPECT_DOUBLE_EQ(sheet->colWidth(6), 30);
    EXPECT_FALSE(sheet->removeCol(-1, 2, true));
    EXPECT_EQ(message(), "colFirst must be in range 0-255");
}

TEST_F(SheetLayout, ClearRemovesTheRectangleOnly) {
    for (int r = 0; r < 4; ++r)
        for (int c = 0; c < 4; ++c) sheet->writeNum(r, c, r * 10 + c, nullptr);
    sheet->clear(1, 2, 1, 2);
    EXPECT_EQ(sheet->cellType(1, 1), CellTypeEmpty);
    EXPECT_EQ(sheet->cellType(2, 2), CellTypeEmpty);
    EXPECT_EQ(sheet->readNum(1, 3, nullptr), 13);
    EXPECT_EQ(sheet->readNum(3, 1, nullptr), 31);
    sheet->clear(2, 1, 0, 0);
    EXPECT_EQ(message(), "rowLast must be greater than or equal to rowFirst");
}

}  // namespace
}  // namespace quire
