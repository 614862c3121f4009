// Formulas we write are calculated by LibreOffice and Gnumeric to the results those programs
// give the same formulas typed in.
#include <gtest/gtest.h>

#include <sstream>
#include <vector>

#include "api/enums.h"
#include "book_ptr.h"
#include "cell_dump.h"
#include "corpus.h"
#include "external_tools.h"

namespace quire::test {
namespace {

struct FormulaCase {
    const wchar_t* text;
    const char* result;  // as both programs print it in a CSV export
};

// A1:A3 hold 2, 3 and 4; 'Other Sheet'!A1 holds 10; the name Third is A3.
const FormulaCase kCases[] = {
    {L"1+2*3-4/2", "5"},
    {L"(1+2)*3", "9"},
    {L"-A1^2", "4"},
    {L"-(A1^2)", "-4"},
    {L"50%", "0.5"},
    {L"2^3^2", "64"},
    {L"A1&\"x\"&A2", "2x3"},
    {L"A1<A2", "TRUE"},
    {L"A1>=A2", "FALSE"},
    {L"A1<>A2", "TRUE"},
    {L"SUM(A1:A3)", "9"},
    {L"SUM(A1)", "2"},
    {L"MAX(A1:A3,7,1)", "7"},
    {L"IF(A1>1,\"big\",\"small\")", "big"},
    {L"ROUND(PI(),3)", "3.142"},
    {L"ABS(-3)+LEN(\"four\")", "7"},
    {L"'Other Sheet'!A1*2", "20"},
    {L"SUM('Other Sheet'!A1:B2)", "15"},
    {L"SUMPRODUCT(A1:A3,A1:A3)", "29"},
    {L"Third*2", "8"},
    {L"TODAY()>40000", "TRUE"},
    {L"IF(ISERROR(1/0),\"err\",\"ok\")", "err"},
    {L"COUNT(A1:A3)+AVERAGE(A1:A3)", "6"},
    {L"CONCATENATE(\"a\",\"b\",\"c\")", "abc"},
};

std::string saveFormulaBook(const std::string& dir) {
    BookPtr book = newBinaryBook();
    EXPECT_TRUE(book->setLocale("UTF-8.comma"));
    ISheet* data = book->addSheet(L"Data", nullptr);
    ISheet* other = book->addSheet(L"Other Sheet", nullptr);
    data->writeNum(0, 0, 2, nullptr);
    data->writeNum(1, 0, 3, nullptr);
    data->writeNum(2, 0, 4, nullptr);
    other->writeNum(0, 0, 10, nullptr);
    other->writeNum(0, 1, 5, nullptr);
    EXPECT_TRUE(data->setNamedRange(L"Third", 2, 2, 0, 0, ScopeWorkbook)) << book->errorMessage();
    int row = 0;
    for (const auto& c : kCases) {
        EXPECT_TRUE(data->writeFormula(row, 2, c.text, nullptr)) << book->errorMessage();
        const wchar_t* back = data->readFormula(row, 2, nullptr);
        EXPECT_EQ(std::wstring(back ? back : L"(null)"), c.text);
        ++row;
    }
    std::string path = dir + "/formulas.xls";
    EXPECT_TRUE(book->save(std::wstring(path.begin(), path.end()).c_str(), false)) << book->errorMessage();
    return path;
}

std::vector<std::string> columnC(const std::string& csv) {
    std::vector<std::string> values;
    std::istringstream lines(csv);
    std::string line;
    while (std::getline(lines, line)) {
        std::vector<std::string> fields;
        std::string field;
        std::istringstream parts(line);
        while (std::getline(parts, field, ',')) fields.push_back(field);
        values.push_back(fields.size() > 2 ? fields[2] : "");
    }
    return values;
}

void expectResults(const std::vector<std::string>& values, const char* program) {
    ASSERT_GE(values.size(), sizeof kCases / sizeof kCases[0]) << program;
    for (size_t i = 0; i < sizeof kCases / sizeof kCases[0]; ++i) {
        std::string want = kCases[i].result;
        std::string got = values[i];
        if (want == "TRUE" && got == "1") got = "TRUE";  // raw exports print booleans as numbers
        if (want == "FALSE" && got == "0") got = "FALSE";
        EXPECT_EQ(got, want) << program << " computed " << utf8(kCases[i].text);
    }
}

TEST(XlsFormulaResults, GnumericRecalculatesThemToTheTypedResults) {
    if (!haveProgram("ssconvert")) GTEST_SKIP() << "Gnumeric is not installed";
    std::string dir = makeTempDir("quire-formulas-");
    std::string path = saveFormulaBook(dir);
    std::string output;
    ASSERT_EQ(runCommand("timeout 120 ssconvert --recalc " + shellQuote(path) + " " + shellQuote(dir + "/g.csv"), &output), 0)
        << output;
    expectResults(columnC(readFile(dir + "/g.csv")), "Gnumeric");
}

TEST(XlsFormulaResults, LibreOfficeCalculatesThemToTheTypedResults) {
    if (!haveProgram("soffice")) GTEST_SKIP() << "LibreOffice is not installed";
    std::string dir = makeTempDir("quire-formulas-lo-");
    std::string path = saveFormulaBook(dir);
    std::string output;
    ASSERT_EQ(runCommand("cd " + shellQuote(dir) + " && HOME=" + shellQuote(dir) +
                             " timeout 300 soffice --headless --norestore --convert-to csv --outdir " +
                             shellQuote(dir) + " " + shellQuote(path),
                         &output),
              0)
        << output;
    expectResults(columnC(readFile(dir + "/formulas.csv")), "LibreOffice");
}

TEST(XlsFormulaResults, CachedResultsTravelWithTheFormula) {
    BookPtr book = newBinaryBook();
    ISheet* sheet = book->addSheet(L"S", nullptr);
    ASSERT_TRUE(sheet->writeFormulaNum(0, 0, L"1+1", 2, nullptr));
    ASSERT_TRUE(sheet->writeFormulaStr(1, 0, L"\"a\"&\"b\"", L"ab", nullptr));
    ASSERT_TRUE(sheet->writeFormulaBool(2, 0, L"1<2", true, nullptr));
    const char* data = nullptr;
    unsigned size = 0;
    ASSERT_TRUE(book->saveRaw(&data, &size));
    BookPtr loaded = newBinaryBook();
    ASSERT_TRUE(loaded->loadRaw(data, size, -1, -1, -1));
    ISheet* back = loaded->getSheet(0);
    EXPECT_EQ(back->readNum(0, 0, nullptr), 2);
    EXPECT_EQ(std::wstring(back->readStr(1, 0, nullptr)), L"ab");
    EXPECT_TRUE(back->readBool(2, 0, nullptr));
    EXPECT_EQ(std::wstring(back->readFormula(1, 0, nullptr)), L"\"a\"&\"b\"");
}

TEST(XlsFormulaResults, BadFormulaTextFailsWithAMessage) {
    BookPtr book = newBinaryBook();
    ISheet* sheet = book->addSheet(L"S", nullptr);
    EXPECT_FALSE(sheet->writeFormula(0, 0, L"SUM(1,", nullptr));
    EXPECT_STRNE(book->errorMessage(), "ok");
    EXPECT_FALSE(sheet->writeFormula(0, 0, L"NoSuchSheet!A1", nullptr));
    EXPECT_STRNE(book->errorMessage(), "ok");
    EXPECT_EQ(sheet->cellType(0, 0), CellTypeEmpty);
}

TEST(XlsFormulaResults, TheListSeparatorFollowsTheLocale) {
    BookPtr book = newBinaryBook();
    ISheet* sheet = book->addSheet(L"S", nullptr);
    ASSERT_TRUE(sheet->writeFormula(0, 0, L"MAX(1;2)", nullptr));
    ASSERT_TRUE(book->setLocale("UTF-8.comma"));
    EXPECT_EQ(std::wstring(sheet->readFormula(0, 0, nullptr)), L"MAX(1,2)");
}

}  // namespace
}  // namespace quire::test
