// Files we write, read back by other programs: python3-xlrd, LibreOffice and Gnumeric.
#include <gtest/gtest.h>

#include <fstream>
#include <map>
#include <memory>
#include <sstream>
#include <vector>

#include "api/book_factory.h"
#include "api/enums.h"
#include "cell_dump.h"
#include "corpus.h"
#include "external_tools.h"

namespace quire::test {
namespace {

struct BookDeleter {
    void operator()(IBook* book) const { book->release(); }
};
using BookPtr = std::unique_ptr<IBook, BookDeleter>;

// A workbook with every kind of value, styles and three sheets, saved once for all tests.
class XlsWrittenFile : public ::testing::Test {
protected:
    static void SetUpTestSuite() {
        dir_ = makeTempDir("quire-xls-");
        path_ = dir_ + "/written.xls";
        BookPtr book(createBinaryBook());
        ISheet* data = book->addSheet(L"Data", nullptr);
        ISheet* text = book->addSheet(L"Text \u00E9\u00E8 \u4E2D\u6587", nullptr);
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
        data->writeNum(200, 100, 7, nullptr);
        data->setMerge(4, 5, 0, 2);
        data->setCol(0, 0, 20, nullptr, false);
        data->setRow(2, 30, nullptr, false);

        text->writeStr(0, 0, L"plain", nullptr, 2);
        text->writeStr(1, 0, L"caf\u00E9 \u00FCber \u4E2D\u6587 \U0001F600", nullptr, 2);
        text->writeStr(2, 0, L"line one\nline two", nullptr, 2);
        text->writeStr(3, 0, L"plain", nullptr, 2);
        text->writeStr(4, 0, L"", nullptr, 2);
        for (int i = 0; i < 3000; ++i)  // enough text to need CONTINUE records in the string table
            text->writeStr(10 + i, 1, (L"string number " + std::to_wstring(i)).c_str(), nullptr, 2);
        ok_ = book->save(std::wstring(path_.begin(), path_.end()).c_str(), false);
        message_ = book->errorMessage();
    }

    void SetUp() override { ASSERT_TRUE(ok_) << message_; }

    static std::string dir_, path_, message_;
    static bool ok_;
};

std::string XlsWrittenFile::dir_, XlsWrittenFile::path_, XlsWrittenFile::message_;
bool XlsWrittenFile::ok_ = false;

const char* kXlrdScript = R"PY(
import sys, xlrd
book = xlrd.open_workbook(sys.argv[1], formatting_info=True)
print("sheets", "|".join(book.sheet_names()))
data = book.sheet_by_index(0)
for r, c in [(0, 0), (0, 1), (0, 2), (0, 3), (1, 0), (1, 1), (1, 2), (1, 3), (1, 4), (2, 0), (200, 100)]:
    cell = data.cell(r, c)
    xf = book.xf_list[cell.xf_index]
    print("cell", r, c, cell.ctype, repr(cell.value), book.format_map[xf.format_key].format_str)
xf = book.xf_list[data.cell_xf_index(2, 0)]
font = book.font_list[xf.font_index]
print("font", font.name, font.weight, font.italic, font.height)
print("fill", xf.background.fill_pattern, xf.background.pattern_colour_index)
print("border", xf.border.left_line_style, xf.border.top_line_style, xf.border.left_colour_index)
print("align", xf.alignment.hor_align, xf.alignment.text_wrapped)
print("merged", data.merged_cells)
print("colwidth", data.colinfo_map[0].width)
print("rowheight", data.rowinfo_map[2].height)
text = book.sheet_by_index(1)
for r in range(5):
    print("text", r, repr(text.cell_value(r, 0)))
print("count", text.nrows, text.cell_value(3009, 1))
)PY";

TEST_F(XlsWrittenFile, XlrdReadsTheValuesFormatsAndStyles) {
    if (!havePythonModule("xlrd")) GTEST_SKIP() << "python3-xlrd is not installed";
    std::string script = dir_ + "/read.py";
    writeFile(script, kXlrdScript);
    std::string output;
    ASSERT_EQ(runCommand(systemPython() + " " + shellQuote(script) + " " + shellQuote(path_), &output), 0) << output;
    const char* expected[] = {
        "sheets Data|Text \xC3\xA9\xC3\xA8 \xE4\xB8\xAD\xE6\x96\x87|Empty",
        "cell 0 0 2 42.0 General",
        "cell 0 1 2 -0.1 General",
        "cell 0 2 2 1e+300 General",
        "cell 0 3 2 123456789.125 0.000",
        "cell 1 0 3 45351.0 m/d/yy",
        "cell 1 1 4 1 General",
        "cell 1 2 4 0 General",
        "cell 1 3 5 7 General",
        "cell 1 4 5 42 General",
        "cell 2 0 1 'styled' General",
        "cell 200 100 2 7.0 General",
        "font Liberation Serif 700 1 280",
        "fill 1 13",
        "border 1 1 10",
        "align 2 1",
        "merged [(4, 6, 0, 3)]",
        "colwidth 5120",
        "rowheight 600",
        "text 0 'plain'",
        "text 1 'caf\xC3\xA9 \xC3\xBC" "ber \xE4\xB8\xAD\xE6\x96\x87 \xF0\x9F\x98\x80'",
        "text 2 'line one\\nline two'",
        "text 3 'plain'",
        "text 4 ''",
        "count 3010 string number 2999",
    };
    for (const char* line : expected) EXPECT_NE(output.find(line), std::string::npos) << "missing: " << line << "\n" << output;
}

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

// The first line's fields as numbers: programs print the same double in different ways.
std::vector<double> firstLineNumbers(const std::string& csv) {
    std::vector<double> numbers;
    std::istringstream fields(csv.substr(0, csv.find('\n')));
    std::string field;
    while (std::getline(fields, field, ',')) numbers.push_back(std::strtod(field.c_str(), nullptr));
    return numbers;
}

const std::vector<double> kFirstLine = {42, -0.1, 1e300, 123456789.125};

TEST_F(XlsWrittenFile, LibreOfficeReadsEverySheet) {
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
    EXPECT_EQ(firstLineNumbers(data), kFirstLine) << data;
    // Raw export prints booleans as numbers.
    EXPECT_NE(data.find("02/29/2024,1,0,#DIV/0!,#N/A"), std::string::npos) << data;
    EXPECT_NE(data.find("styled"), std::string::npos);
    const std::string& text = sheets["Text \xC3\xA9\xC3\xA8 \xE4\xB8\xAD\xE6\x96\x87"];
    EXPECT_NE(text.find("caf\xC3\xA9 \xC3\xBC" "ber \xE4\xB8\xAD\xE6\x96\x87 \xF0\x9F\x98\x80"), std::string::npos) << text;
    EXPECT_NE(text.find("\"line one\nline two\""), std::string::npos);
    EXPECT_NE(text.find(",string number 2999"), std::string::npos);
    EXPECT_TRUE(sheets.count("Empty"));
}

TEST_F(XlsWrittenFile, GnumericReadsEverySheet) {
    if (!haveProgram("ssconvert")) GTEST_SKIP() << "Gnumeric is not installed";
    std::string out = makeTempDir("quire-gnumeric-");
    std::string output;
    ASSERT_EQ(runCommand("timeout 120 ssconvert -S " + shellQuote(path_) + " " + shellQuote(out + "/g-%s.csv"), &output), 0)
        << output;
    auto sheets = csvFiles(out, "g-");
    ASSERT_EQ(sheets.size(), 3u) << output;
    const std::string& data = sheets["Data"];
    EXPECT_EQ(firstLineNumbers(data), kFirstLine) << data;
    EXPECT_NE(data.find("2024/02/29,TRUE,FALSE,#DIV/0!,#N/A"), std::string::npos) << data;
    const std::string& text = sheets["Text \xC3\xA9\xC3\xA8 \xE4\xB8\xAD\xE6\x96\x87"];
    EXPECT_NE(text.find("caf\xC3\xA9 \xC3\xBC" "ber \xE4\xB8\xAD\xE6\x96\x87 \xF0\x9F\x98\x80"), std::string::npos) << text;
}

TEST_F(XlsWrittenFile, LoadsBackWithTheSameCells) {
    BookPtr written(createBinaryBook());
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
    EXPECT_EQ(std::wstring(format->font()->name()), L"Liberation Serif");
    EXPECT_EQ(format->patternForegroundColor(), ColorYellow);
    EXPECT_EQ(format->borderLeftColor(), ColorRed);
    EXPECT_EQ(data->mergeSize(), 1);
    EXPECT_DOUBLE_EQ(data->colWidth(0), 20);
    EXPECT_DOUBLE_EQ(data->rowHeight(2), 30);
    ISheet* text = written->getSheet(1);
    EXPECT_EQ(std::wstring(text->readStr(1, 0, nullptr)), L"caf\u00E9 \u00FCber \u4E2D\u6587 \U0001F600");
    EXPECT_EQ(text->lastRow(), 3010);
}

TEST(XlsLoadModes, PartialLoadsKeepOneSheetAndItsRows) {
    BookPtr book(createBinaryBook());
    for (int s = 0; s < 3; ++s) {
        ISheet* sheet = book->addSheet((L"S" + std::to_wstring(s)).c_str(), nullptr);
        for (int r = 0; r < 30; ++r) sheet->writeNum(r, 0, s * 100 + r, nullptr);
        sheet->writeBlank(40, 0, book->format(15));
    }
    const char* data = nullptr;
    unsigned size = 0;
    ASSERT_TRUE(book->saveRaw(&data, &size));
    std::string bytes(data, size);
    std::string dir = makeTempDir("quire-modes-");
    std::string path = dir + "/three.xls";
    writeFile(path, bytes);
    std::wstring widePath(path.begin(), path.end());

    BookPtr partial(createBinaryBook());
    ASSERT_TRUE(partial->loadPartially(widePath.c_str(), 1, 10, 20, nullptr)) << partial->errorMessage();
    ASSERT_EQ(partial->sheetCount(), 1);
    ISheet* only = partial->getSheet(0);
    EXPECT_EQ(std::wstring(only->name()), L"S1");
    EXPECT_EQ(only->firstRow(), 10);
    EXPECT_EQ(only->lastRow(), 21);
    EXPECT_EQ(only->readNum(10, 0, nullptr), 110);

    BookPtr third(createBinaryBook());
    ASSERT_TRUE(third->loadSheet(widePath.c_str(), 2, nullptr));
    EXPECT_EQ(std::wstring(third->getSheet(0)->name()), L"S2");
    EXPECT_FALSE(third->loadSheet(widePath.c_str(), 3, nullptr));
    EXPECT_STREQ(third->errorMessage(), "sheetIndex is out of range");
    EXPECT_EQ(third->sheetCount(), 0);

    BookPtr info(createBinaryBook());
    ASSERT_TRUE(info->loadInfo(widePath.c_str()));
    EXPECT_EQ(info->sheetCount(), 3);
    EXPECT_EQ(std::wstring(info->getSheetName(2)), L"S2");
    EXPECT_EQ(info->getSheet(0), nullptr);

    // Blank cells are dropped when loading a file and kept when loading from memory.
    BookPtr fromFile(createBinaryBook());
    ASSERT_TRUE(fromFile->load(widePath.c_str(), nullptr));
    EXPECT_EQ(fromFile->getSheet(0)->cellType(40, 0), CellTypeEmpty);
    BookPtr fromMemory(createBinaryBook());
    ASSERT_TRUE(fromMemory->loadRaw(bytes.data(), static_cast<unsigned>(bytes.size()), 1, 10, 20));
    EXPECT_EQ(fromMemory->sheetCount(), 3);  // raw loads read the whole book
    EXPECT_EQ(fromMemory->getSheet(0)->cellType(40, 0), CellTypeBlank);
}

TEST(XlsLoadModes, ANewBookSavesTheDefaultStyleSet) {
    BookPtr book(createBinaryBook());
    book->addSheet(L"Sheet1", nullptr);
    const char* data = nullptr;
    unsigned size = 0;
    ASSERT_TRUE(book->saveRaw(&data, &size));
    BookPtr loaded(createBinaryBook());
    ASSERT_TRUE(loaded->loadRaw(data, size, -1, -1, -1));
    EXPECT_EQ(loaded->fontSize(), 5);
    EXPECT_EQ(loaded->formatSize(), 21);
    EXPECT_EQ(loaded->biffVersion(), 0x0600);
}

}  // namespace
}  // namespace quire::test
