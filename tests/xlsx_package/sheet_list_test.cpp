// Inserting, moving and deleting sheets of a loaded package: the sheet list, the sheet ids, the
// scopes of defined names, the relationships and the content types stay consistent, as openpyxl
// and LibreOffice read the saved packages.
#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <map>
#include <sstream>

#include "corpus.h"
#include "external_tools.h"
#include "package_support.h"

namespace quire::test {
namespace {

std::string narrow(const std::wstring& text) { return std::string(text.begin(), text.end()); }

// What the saved package should hold: sheets in order, the sheet of the original whose cells each
// one holds, and the print areas by sheet.
struct Expected {
    std::vector<std::wstring> sheets;
    std::map<std::wstring, std::string> content;
    std::map<std::wstring, std::string> areas;

    void insert(int index, const std::wstring& name, const std::string& source) {
        sheets.insert(sheets.begin() + index, name);
        content[name] = source;
    }
    void move(int src, int dst) {
        const std::wstring name = sheets[static_cast<std::size_t>(src)];
        sheets.erase(sheets.begin() + src);
        sheets.insert(sheets.begin() + (dst > src ? dst - 1 : dst), name);
    }
    void remove(int index) {
        const std::wstring name = sheets[static_cast<std::size_t>(index)];
        sheets.erase(sheets.begin() + index);
        content.erase(name);
        areas.erase(name);
    }
    // The block the description script prints for a package, less its first line.
    std::string describe() const {
        std::ostringstream out;
        out << "sheets ";
        for (std::size_t i = 0; i < sheets.size(); ++i) out << (i ? "|" : "") << narrow(sheets[i]);
        out << "\n";
        for (const auto& sheet : sheets) out << "content " << narrow(sheet) << "=" << content.at(sheet) << "\n";
        for (const auto& sheet : sheets)
            if (areas.count(sheet)) out << "area " << narrow(sheet) << "=" << areas.at(sheet) << "\n";
        out << "name csDesignMode@book=1\n";
        return out.str();
    }
};

std::vector<std::wstring> sheetNames(IBook* book) {
    std::vector<std::wstring> names;
    for (int i = 0; i < book->sheetCount(); ++i) names.emplace_back(book->getSheetName(i));
    return names;
}

int indexOf(IBook* book, const std::wstring& name) {
    const auto names = sheetNames(book);
    return static_cast<int>(std::find(names.begin(), names.end(), name) - names.begin());
}

std::string savedPart(const std::string& path, const std::string& name) {
    const auto parts = readPackage(path);
    const auto found = parts.find(name);
    return found == parts.end() ? std::string() : found->second;
}

// A package of twelve sheets with sparse sheet ids (up to 20), a book-wide name and print areas
// scoped to seven of the sheets.
TEST(SheetList, InsertMoveAndDeleteKeepThePackageConsistent) {
    const std::string dir = corpusDir();
    if (dir.empty()) GTEST_SKIP() << "corpus not present";
    const std::string original = dir + "/poi/Tables.xlsx";
    if (!std::ifstream(original).good()) GTEST_SKIP() << "poi/Tables.xlsx not in the corpus";

    IBook* book = newXmlBook();
    ASSERT_NE(book, nullptr);
    ASSERT_TRUE(book->load(widen(original).c_str(), nullptr)) << book->errorMessage();

    Expected expected;
    expected.sheets = sheetNames(book);
    ASSERT_EQ(expected.sheets.size(), 12u);
    for (const auto& sheet : expected.sheets) expected.content[sheet] = narrow(sheet);
    expected.areas = {{L"Exp1", "$A$1:$J$26"},      {L"Exp2 (2)", "$A$4:$M$33"}, {L"Exp3 (2)", "$A$1:$M$29"},
                      {L"Exp4", "$A$1:$J$24"},      {L"Exp6 (2)", "$A$1:$M$29"}, {L"Exp11 (2)", "$A$1:$K$26"},
                      {L"Exp12", "$A$1:$J$23"}};

    const std::string out = makeTempDir("quire-sheet-list");
    std::vector<std::string> saved;
    std::vector<std::string> descriptions;
    auto save = [&](const std::string& stem) {
        const std::string path = out + "/" + stem + ".xlsx";
        EXPECT_TRUE(book->save(widen(path).c_str(), false)) << stem << ": " << book->errorMessage();
        saved.push_back(path);
        descriptions.push_back(expected.describe());
    };

    // Insert: later sheets and the scopes of their names move up by one.
    ASSERT_NE(book->insertSheet(2, L"Inserted", nullptr), nullptr) << book->errorMessage();
    expected.insert(2, L"Inserted", "new");
    EXPECT_EQ(sheetNames(book), expected.sheets);
    save("inserted");

    // Move forward and backward: the sheets in between shift toward the old place.
    ASSERT_TRUE(book->moveSheet(0, 5)) << book->errorMessage();
    expected.move(0, 5);
    ASSERT_TRUE(book->moveSheet(11, 1)) << book->errorMessage();
    expected.move(11, 1);
    ASSERT_TRUE(book->moveSheet(3, 13)) << book->errorMessage();  // to the end
    expected.move(3, 13);
    EXPECT_EQ(sheetNames(book), expected.sheets);
    save("moved");

    // Delete a sheet with a print area and one without; copy a sheet with a print area.
    int index = indexOf(book, L"Exp3 (2)");
    ASSERT_TRUE(book->delSheet(index)) << book->errorMessage();
    expected.remove(index);
    index = indexOf(book, L"Exp5");
    ASSERT_TRUE(book->delSheet(index)) << book->errorMessage();
    expected.remove(index);
    ISheet* source = book->getSheet(indexOf(book, L"Exp12"));
    ASSERT_NE(source, nullptr) << book->errorMessage();
    ASSERT_NE(book->insertSheet(0, L"Copy", source), nullptr) << book->errorMessage();
    expected.insert(0, L"Copy", "Exp12");
    expected.areas[L"Copy"] = "$A$1:$J$23";
    EXPECT_EQ(sheetNames(book), expected.sheets);
    save("deleted");
    book->release();

    // Sheet ids stay unique: a new sheet takes one above the highest, deleted ones are not reused.
    const std::string workbook = savedPart(saved.back(), "xl/workbook.xml");
    EXPECT_NE(workbook.find("<sheet name=\"Inserted\" sheetId=\"21\""), std::string::npos) << workbook;
    EXPECT_NE(workbook.find("<sheet name=\"Copy\" sheetId=\"22\""), std::string::npos) << workbook;

    if (havePythonModule("openpyxl")) {
        std::string command = systemPython() + " " +
                              shellQuote(std::string(XLSX_TEST_SCRIPTS_DIR) + "/describe_sheet_list.py") + " " +
                              shellQuote(original);
        for (const auto& path : saved) command += " " + shellQuote(path);
        std::string output;
        const int status = runCommand(command + " 2>&1", &output);
        ASSERT_EQ(status, 0) << output;
        std::string expectedOutput;
        for (std::size_t i = 0; i < saved.size(); ++i)
            expectedOutput += "== SAVED " + saved[i] + "\n" + descriptions[i];
        EXPECT_EQ(output, expectedOutput);
    }

    if (haveProgram("soffice")) {
        std::string list;
        for (const auto& path : saved) list += " " + shellQuote(path);
        std::string output;
        const int status = runCommand("cd " + shellQuote(out) + " && HOME=" + shellQuote(out) +
                                          " timeout 300 soffice --headless --convert-to csv --outdir csv" + list +
                                          " 2>&1",
                                      &output);
        EXPECT_EQ(status, 0) << output;
        for (const char* stem : {"inserted", "moved", "deleted"})
            EXPECT_TRUE(std::ifstream(out + "/csv/" + stem + ".csv").good()) << stem << ": " << output;
        EXPECT_EQ(output.find("Error"), std::string::npos) << output;
    }
    runCommand("rm -rf " + shellQuote(out));
}

}  // namespace
}  // namespace quire::test
