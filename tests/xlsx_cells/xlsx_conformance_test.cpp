// Open XML workbooks we write, read back by LibreOffice and Gnumeric.
#include <gtest/gtest.h>

#include <cstdlib>
#include <map>
#include <memory>
#include <sstream>
#include <string>
#include <vector>

#include "api/enums.h"
#include "corpus.h"
#include "external_tools.h"
#include "xlsx/xml_book_proxy.h"

namespace quire::test {
namespace {

struct BookDeleter {
    void operator()(IBook* book) const { book->release(); }
};
using BookPtr = std::unique_ptr<IBook, BookDeleter>;

const wchar_t* const kTextSheet = L"Text \u00E9\u00E8 \u4E2D\u6587";
const char* const kTextSheetUtf8 = "Text \xC3\xA9\xC3\xA8 \xE4\xB8\xAD\xE6\x96\x87";
const char* const kUnicodeUtf8 = "caf\xC3\xA9 \xC3\xBC" "ber \xE4\xB8\xAD\xE6\x96\x87 \xF0\x9F\x98\x80";

// A workbook with every kind of value, formulas, layout, styles and three sheets, saved once.
class XlsxWrittenFile : public ::testing::Test {
protected:
    static void SetUpTestSuite() {
        dir_ = makeTempDir("quire-xlsx-");
        path_ = dir_ + "/written.xlsx";
        BookPtr book(createXmlBook());
        ISheet* data = book->addSheet(L"Data", nullptr);
        ISheet* text = book->addSheet(kTextSheet, nullptr);
        book->addSheet(L"Empty", nullptr);

        IFormat* date = book->addFormat(nullptr);
        date->setNumFormat(NumformatDate);
        IFormat* custom = book->addFormat(nullptr);
        custom->setNumFormat(book->addCustomNumFormat(L"0.000"));
        IFont* boldFont = book->addFont(nullptr);
        boldFont->setBold(true);
        boldFont->setItalic(true);
        boldFont->setSize(14);
        boldFont->setName(L"Liberation Serif");
        IFormat* styled = book->addFormat(nullptr);
        styled->setFont(boldFont);
        styled->setFillPattern(FillPatternSolid);
        styled->setPatternForegroundColor(ColorYellow);
        styled->setBorder(BorderStyleThin);
        styled->setBorderColor(ColorRed);
        styled->setAlignH(AlignHCenter);
        styled->setWrap(true);

        data->writeNum(0, 0, 42, nullptr);
        data->writeNum(0, 1, -0.1, nullptr);
        data->writeNum(0, 2, 1e300, nullptr);
        data->writeNum(0, 3, 123456789.125, custom);
        data->writeNum(1, 0, book->datePack(2024, 2, 29, 0, 0, 0, 0), date);
        data->writeBool(1, 1, true, nullptr, ErrorTypeNoError);
        data->writeBool(1, 2, false, nullptr, ErrorTypeNoError);
        data->writeError(1, 3, ErrorTypeDiv0, nullptr);
        data->writeError(1, 4, ErrorTypeNA, nullptr);
        data->writeStr(2, 0, L"styled", styled, 2);
        data->writeFormulaNum(3, 0, L"A1*2", 84, nullptr);
        data->writeFormulaStr(3, 1, L"\"ab\"&\"cd\"", L"abcd", nullptr);
        data->writeFormulaBool(3, 2, L"A1>40", true, nullptr);
        data->writeNum(200, 100, 7, nullptr);
        data->setMerge(4, 5, 0, 2);
        data->setCol(0, 0, 20, nullptr, false);
        data->setRow(2, 30, nullptr, false);

        text->writeStr(0, 0, L"plain", nullptr, 2);
        text->writeStr(1, 0, L"caf\u00E9 \u00FCber \u4E2D\u6587 \U0001F600", nullptr, 2);
        text->writeStr(2, 0, L"line one\nline two", nullptr, 2);
        text->writeStr(3, 0, L"plain", nullptr, 2);
        text->writeStr(4, 0, L"", nullptr, 2);
        text->writeStr(5, 0, L"<&> \"quoted\" 'single'", nullptr, 2);
        for (int i = 0; i < 3000; ++i)
            text->writeStr(10 + i, 1, (L"string number " + std::to_wstring(i)).c_str(), nullptr, 2);
        ok_ = book->save(std::wstring(path_.begin(), path_.end()).c_str(), false);
        message_ = book->errorMessage();
    }

    void SetUp() override { ASSERT_TRUE(ok_) << message_; }

    static std::string dir_, path_, message_;
    static bool ok_;
};

std::string XlsxWrittenFile::dir_, XlsxWrittenFile::path_, XlsxWrittenFile::message_;
bool XlsxWrittenFile::ok_ = false;

// Exported sheets by name, each with the empty cells at the ends of its lines cut off.
std::map<std::string, std::string> csvFiles(const std::string& dir, const std::string& prefix) {
    std::map<std::string, std::string> files;
    std::string listing;
    runCommand("ls " + shellQuote(dir), &listing);
    std::istringstream lines(listing);
    std::string name;
    while (std::getline(lines, name)) {
        if (name.rfind(prefix, 0) != 0 || name.size() < 4 || name.substr(name.size() - 4) != ".csv") continue;
        std::istringstream content(readFile(dir + "/" + name));
        std::string line, trimmed;
        while (std::getline(content, line)) {
            while (!line.empty() && line.back() == ',') line.pop_back();
            trimmed += line + "\n";
        }
        files[name.substr(prefix.size(), name.size() - prefix.size() - 4)] = trimmed;
    }
    return files;
}

// The fields of one line as numbers: programs print the same double in different ways.
std::vector<double> lineNumbers(const std::string& csv, int index) {
    std::istringstream lines(csv);
    std::string line;
    for (int i = 0; i <= index; ++i) std::getline(lines, line);
    std::vector<double> numbers;
    std::istringstream fields(line);
    std::string field;
    while (std::getline(fields, field, ',')) numbers.push_back(std::strtod(field.c_str(), nullptr));
    return numbers;
}

const std::vector<double> kFirstLine = {42, -0.1, 1e300, 123456789.125};

TEST_F(XlsxWrittenFile, LibreOfficeReadsEverySheet) {
#ifdef QUIRE_SANITIZED_BUILD
    GTEST_SKIP() << "checked in the plain build; the sanitizers watch our own code";
#endif
    if (!haveProgram("soffice")) GTEST_SKIP() << "LibreOffice is not installed";
    std::string out = makeTempDir("quire-lo-");
    std::string command = "cd " + shellQuote(out) + " && HOME=" + shellQuote(out) +
                          " timeout 300 soffice --headless --norestore --convert-to "
                          "'csv:Text - txt - csv (StarCalc):44,34,76,1,,0,false,true,false,false,false,-1' "
                          "--outdir " + shellQuote(out) + " " + shellQuote(path_);
    std::string output;
    ASSERT_EQ(runCommand(command, &output), 0) << output;
    auto sheets = csvFiles(out, "written-");
    ASSERT_EQ(sheets.size(), 3u) << output;
    const std::string& data = sheets["Data"];
    EXPECT_EQ(lineNumbers(data, 0), kFirstLine) << data;
    // Booleans of an Open XML sheet are their own type, exported as words.
    EXPECT_NE(data.find("02/29/2024,TRUE,FALSE,#DIV/0!,#N/A"), std::string::npos) << data;
    EXPECT_NE(data.find("styled"), std::string::npos);
    EXPECT_NE(data.find("\n84,abcd,TRUE\n"), std::string::npos) << data;
    const std::string& text = sheets[kTextSheetUtf8];
    EXPECT_NE(text.find(kUnicodeUtf8), std::string::npos) << text;
    EXPECT_NE(text.find("\"line one\nline two\""), std::string::npos);
    EXPECT_NE(text.find("\"<&> \"\"quoted\"\" 'single'\""), std::string::npos) << text;
    EXPECT_NE(text.find(",string number 2999"), std::string::npos);
    EXPECT_TRUE(sheets.count("Empty"));
}

TEST_F(XlsxWrittenFile, GnumericReadsEverySheet) {
#ifdef QUIRE_SANITIZED_BUILD
    GTEST_SKIP() << "checked in the plain build; the sanitizers watch our own code";
#endif
    if (!haveProgram("ssconvert")) GTEST_SKIP() << "Gnumeric is not installed";
    std::string out = makeTempDir("quire-gnumeric-");
    std::string output;
    ASSERT_EQ(runCommand("timeout 120 ssconvert -S " + shellQuote(path_) + " " + shellQuote(out + "/g-%s.csv"), &output), 0)
        << output;
    auto sheets = csvFiles(out, "g-");
    ASSERT_EQ(sheets.size(), 3u) << output;
    const std::string& data = sheets["Data"];
    EXPECT_EQ(lineNumbers(data, 0), kFirstLine) << data;
    EXPECT_NE(data.find("2024/02/29,TRUE,FALSE,#DIV/0!,#N/A"), std::string::npos) << data;
    EXPECT_NE(data.find("\n84,abcd,TRUE\n"), std::string::npos) << data;
    const std::string& text = sheets[kTextSheetUtf8];
    EXPECT_NE(text.find(kUnicodeUtf8), std::string::npos) << text;
    // Gnumeric quotes every text with a space.
    EXPECT_NE(text.find(",\"string number 2999\""), std::string::npos);
}

TEST_F(XlsxWrittenFile, LoadsBackWithTheSameCellsAndLayout) {
    BookPtr written(createXmlBook());
    ASSERT_TRUE(written->load(std::wstring(path_.begin(), path_.end()).c_str(), nullptr)) << written->errorMessage();
    EXPECT_EQ(written->sheetCount(), 3);
    ISheet* data = written->getSheet(0);
    IFormat* format = nullptr;
    EXPECT_EQ(data->readNum(0, 3, &format), 123456789.125);
    ASSERT_NE(format, nullptr);
    EXPECT_EQ(std::wstring(written->customNumFormat(format->numFormat())), L"0.000");
    EXPECT_TRUE(data->isDate(1, 0));
    EXPECT_EQ(data->readError(1, 3), ErrorTypeDiv0);
    data->readStr(2, 0, &format);
    ASSERT_NE(format, nullptr);
    EXPECT_TRUE(format->font()->bold());
    EXPECT_TRUE(format->font()->italic());
    EXPECT_EQ(format->font()->size(), 14);
    EXPECT_EQ(std::wstring(format->font()->name()), L"Liberation Serif");
    EXPECT_EQ(format->fillPattern(), FillPatternSolid);
    EXPECT_EQ(format->patternForegroundColor(), ColorYellow);
    EXPECT_EQ(format->borderLeft(), BorderStyleThin);
    EXPECT_EQ(format->borderLeftColor(), ColorRed);
    EXPECT_EQ(format->alignH(), AlignHCenter);
    EXPECT_TRUE(format->wrap());
    EXPECT_TRUE(data->isFormula(3, 0));
    EXPECT_EQ(std::wstring(data->readFormula(3, 0, nullptr)), L"A1*2");
    EXPECT_EQ(data->readNum(3, 0, nullptr), 84);
    EXPECT_EQ(data->mergeSize(), 1);
    // Widths are kept in whole pixels of the default font's digit: close to what was set.
    EXPECT_NEAR(data->colWidth(0), 20, 1);
    EXPECT_DOUBLE_EQ(data->rowHeight(2), 30);
    ISheet* text = written->getSheet(1);
    EXPECT_EQ(std::wstring(text->name()), kTextSheet);
    EXPECT_EQ(std::wstring(text->readStr(1, 0, nullptr)), L"caf\u00E9 \u00FCber \u4E2D\u6587 \U0001F600");
    EXPECT_EQ(std::wstring(text->readStr(5, 0, nullptr)), L"<&> \"quoted\" 'single'");
    EXPECT_EQ(text->lastRow(), 3010);
}

}  // namespace
}  // namespace quire::test
