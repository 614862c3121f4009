// Named ranges, print areas and print titles: seen by other programs and kept through saves
// and sheet insertions, moves and deletions.
#include <gtest/gtest.h>

#include "api/enums.h"
#include "book_ptr.h"
#include "corpus.h"
#include "external_tools.h"

namespace quire::test {
namespace {

BookPtr reload(IBook& book) {
    const char* data = nullptr;
    unsigned size = 0;
    EXPECT_TRUE(book.saveRaw(&data, &size)) << book.errorMessage();
    BookPtr loaded = newBinaryBook();
    EXPECT_TRUE(loaded->loadRaw(data, size, -1, -1, -1)) << loaded->errorMessage();
    return loaded;
}

struct Bounds {
    int rowFirst = -1, rowLast = -1, colFirst = -1, colLast = -1;
};

Bounds printAreaOf(ISheet* sheet) {
    Bounds b;
    EXPECT_TRUE(sheet->printArea(&b.rowFirst, &b.rowLast, &b.colFirst, &b.colLast));
    return b;
}

TEST(XlsNames, NamedRangesAreFoundUpdatedAndDeleted) {
    BookPtr book = newBinaryBook();
    ISheet* sheet = book->addSheet(L"S", nullptr);
    EXPECT_FALSE(sheet->setNamedRange(L"has space", 0, 0, 0, 0, ScopeWorkbook));
    EXPECT_STREQ(book->errorMessage(), "space symbol isn't allowed");
    ASSERT_TRUE(sheet->setNamedRange(L"Totals", 1, 5, 2, 3, ScopeWorkbook));
    ASSERT_TRUE(sheet->setNamedRange(L"Totals", 2, 6, 2, 3, ScopeWorkbook));
    EXPECT_EQ(sheet->namedRangeSize(), 1);
    int rf, rl, cf, cl, scope;
    bool hidden = true;
    ASSERT_TRUE(sheet->getNamedRange(L"Totals", &rf, &rl, &cf, &cl, ScopeUndefined, &hidden));
    EXPECT_EQ(rf, 2);
    EXPECT_EQ(rl, 6);
    EXPECT_FALSE(hidden);
    ASSERT_TRUE(sheet->setNamedRange(L"Local", 0, 0, 0, 0, 0));
    EXPECT_FALSE(sheet->getNamedRange(L"Local", &rf, &rl, &cf, &cl, ScopeWorkbook, nullptr));
    EXPECT_STREQ(book->errorMessage(), "named range is not found");
    EXPECT_EQ(std::wstring(sheet->namedRange(1, &rf, &rl, &cf, &cl, &scope, &hidden)), L"Local");
    EXPECT_EQ(scope, 0);
    EXPECT_EQ(sheet->namedRange(2, &rf, &rl, &cf, &cl, &scope, &hidden), nullptr);
    EXPECT_STREQ(book->errorMessage(), "index is out of range");
    ASSERT_TRUE(sheet->delNamedRange(L"Totals", ScopeWorkbook));
    EXPECT_FALSE(sheet->delNamedRange(L"Totals", ScopeWorkbook));
    EXPECT_STREQ(book->errorMessage(), "named range is not found");
}

TEST(XlsNames, PrintAreasAndTitlesReadBackAndShareTheTable) {
    BookPtr book = newBinaryBook();
    ISheet* first = book->addSheet(L"First", nullptr);
    ISheet* second = book->addSheet(L"Second", nullptr);
    int a = -1, b = -1;
    EXPECT_FALSE(first->printArea(&a, &b, nullptr, nullptr));
    EXPECT_STREQ(book->errorMessage(), "not found");
    first->setPrintArea(0, 9, 0, 3);
    second->setPrintArea(5, 6, 1, 1);
    first->setPrintRepeatRows(0, 1);
    first->setPrintRepeatCols(0, 0);
    first->setPrintRepeatRows(0, 2);
    second->setPrintRepeatRows(0, 65536);
    EXPECT_STREQ(book->errorMessage(), "lastRow must be in range 0-65535");
    BookPtr loaded = reload(*book);
    Bounds area = printAreaOf(loaded->getSheet(0));
    EXPECT_EQ(area.rowLast, 9);
    EXPECT_EQ(area.colLast, 3);
    EXPECT_EQ(printAreaOf(loaded->getSheet(1)).rowFirst, 5);
    ASSERT_TRUE(loaded->getSheet(0)->printRepeatRows(&a, &b));
    EXPECT_EQ(b, 2);
    ASSERT_TRUE(loaded->getSheet(0)->printRepeatCols(&a, &b));
    EXPECT_EQ(b, 0);
    loaded->getSheet(0)->clearPrintRepeats();
    EXPECT_FALSE(loaded->getSheet(0)->printRepeatRows(&a, &b));
    loaded->getSheet(0)->clearPrintArea();
    EXPECT_FALSE(loaded->getSheet(0)->printArea(&a, &b, nullptr, nullptr));
    EXPECT_EQ(printAreaOf(loaded->getSheet(1)).rowLast, 6);
}

TEST(XlsNames, NamesFollowTheirSheetsThroughInsertMoveAndDelete) {
    BookPtr book = newBinaryBook();
    ISheet* a = book->addSheet(L"A", nullptr);
    book->addSheet(L"B", nullptr)->setNamedRange(L"OnB", 3, 4, 0, 1, ScopeWorkbook);
    ISheet* c = book->addSheet(L"C", nullptr);
    c->setPrintArea(1, 2, 1, 2);
    a->writeFormula(0, 0, L"SUM(B!A1:A3)+C!B2", nullptr);
    book->insertSheet(0, L"New", nullptr);   // New A B C
    ASSERT_TRUE(book->moveSheet(3, 1));      // New C A B
    ASSERT_TRUE(book->delSheet(0));          // C A B
    BookPtr loaded = reload(*book);
    ISheet* onB = loaded->getSheet(2);
    EXPECT_EQ(std::wstring(onB->name()), L"B");
    int rf, rl, cf, cl;
    ASSERT_TRUE(onB->getNamedRange(L"OnB", &rf, &rl, &cf, &cl, ScopeUndefined, nullptr));
    EXPECT_EQ(rf, 3);
    EXPECT_EQ(onB->namedRangeSize(), 1);
    EXPECT_EQ(loaded->getSheet(1)->namedRangeSize(), 0);
    EXPECT_EQ(printAreaOf(loaded->getSheet(0)).rowFirst, 1);
    EXPECT_EQ(std::wstring(loaded->getSheet(1)->readFormula(0, 0, nullptr)), L"SUM(B!A1:A3)+'C'!B2");  // a name that reads as a column is quoted
    // Deleting a sheet turns references to it into #REF!.
    ASSERT_TRUE(loaded->delSheet(0));
    EXPECT_EQ(std::wstring(loaded->getSheet(0)->readFormula(0, 0, nullptr)), L"SUM(B!A1:A3)+#REF!");
}

TEST(XlsNames, InsertingRowsMovesTheNamedRange) {
    BookPtr book = newBinaryBook();
    ISheet* sheet = book->addSheet(L"S", nullptr);
    sheet->setNamedRange(L"Block", 4, 6, 0, 0, ScopeWorkbook);
    sheet->insertRow(0, 1, true);
    int rf, rl;
    ASSERT_TRUE(sheet->getNamedRange(L"Block", &rf, &rl, nullptr, nullptr, ScopeWorkbook, nullptr));
    EXPECT_EQ(rf, 6);
    EXPECT_EQ(rl, 8);
}

const char* kXlrdNames = R"PY(
import sys, xlrd
book = xlrd.open_workbook(sys.argv[1])
for name in book.name_obj_list:
    for ref in name.result.value if name.result and name.result.value else []:
        print(name.name, name.scope, ref.shtxlo, ref.rowxlo, ref.rowxhi, ref.colxlo, ref.colxhi)
)PY";

TEST(XlsNames, OtherProgramsSeeTheNamesAndPrintAreas) {
    BookPtr book = newBinaryBook();
    ISheet* first = book->addSheet(L"First", nullptr);
    ISheet* second = book->addSheet(L"Second", nullptr);
    for (int r = 0; r < 4; ++r) second->writeNum(r, 1, r + 1, nullptr);
    second->setNamedRange(L"Values", 0, 3, 1, 1, ScopeWorkbook);
    second->setPrintArea(0, 3, 0, 1);
    first->writeFormula(0, 0, L"SUM(Values)", nullptr);
    std::string dir = makeTempDir("quire-names-");
    std::string path = dir + "/names.xls";
    ASSERT_TRUE(book->save(std::wstring(path.begin(), path.end()).c_str(), false));

    if (havePythonModule("xlrd")) {
        writeFile(dir + "/names.py", kXlrdNames);
        std::string output;
        ASSERT_EQ(runCommand(systemPython() + " " + shellQuote(dir + "/names.py") + " " + shellQuote(path), &output), 0) << output;
        EXPECT_NE(output.find("Values -1 1 0 4 1 2"), std::string::npos) << output;
        EXPECT_NE(output.find("Print_Area 1 1 0 4 0 2"), std::string::npos) << output;
    }
    if (haveProgram("soffice")) {
        std::string output;
        ASSERT_EQ(runCommand("cd " + shellQuote(dir) + " && HOME=" + shellQuote(dir) +
                                 " timeout 300 soffice --headless --norestore --convert-to csv --outdir " +
                                 shellQuote(dir + "/lo") + " " + shellQuote(path),
                             &output),
                  0)
            << output;
        EXPECT_EQ(readFile(dir + "/lo/names.csv").substr(0, 2), "10") << "LibreOffice computes SUM(Values)";
    }
    if (haveProgram("ssconvert")) {
        std::string output;
        ASSERT_EQ(runCommand("timeout 120 ssconvert --recalc " + shellQuote(path) + " " + shellQuote(dir + "/g.csv"), &output), 0);
        EXPECT_EQ(readFile(dir + "/g.csv").substr(0, 2), "10");
    }
}

}  // namespace
}  // namespace quire::test
