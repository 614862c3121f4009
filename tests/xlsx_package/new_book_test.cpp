// A new Open XML book: its package layout, and what other programs make of it.
#include <gtest/gtest.h>

#include <fstream>

#include "corpus.h"
#include "external_tools.h"
#include "package_support.h"

namespace quire::test {
namespace {

const char* const kXlsxMain = "application/vnd.openxmlformats-officedocument.spreadsheetml.sheet.main+xml";

std::string workbookOverride(const std::map<std::string, std::string>& parts) {
    const std::string& types = parts.at("[Content_Types].xml");
    const std::size_t at = types.find("PartName=\"/xl/workbook.xml\"");
    if (at == std::string::npos) return {};
    const std::size_t begin = types.rfind('<', at);
    const std::size_t end = types.find('>', at);
    const std::string element = types.substr(begin, end - begin);
    const std::size_t type = element.find("ContentType=\"");
    return element.substr(type + 13, element.find('"', type + 13) - type - 13);
}

IBook* threeSheetBook() {
    IBook* book = newXmlBook();
    for (const wchar_t* name : {L"First", L"Second", L"Third"}) EXPECT_NE(book->addSheet(name, nullptr), nullptr);
    return book;
}

TEST(NewBook, HasTheFivePartsAndStylesFirst) {
    IBook* book = newXmlBook();
    const char* data = nullptr;
    unsigned size = 0;
    ASSERT_TRUE(book->saveRaw(&data, &size)) << book->errorMessage();
    const auto parts = readPackageFromMemory(data, size);
    std::vector<std::string> names;
    for (const auto& part : parts) names.push_back(part.first);
    EXPECT_EQ(names, (std::vector<std::string>{"[Content_Types].xml", "_rels/.rels", "xl/_rels/workbook.xml.rels",
                                               "xl/styles.xml", "xl/workbook.xml"}));
    EXPECT_NE(parts.at("xl/_rels/workbook.xml.rels").find("Id=\"rId1\""), std::string::npos);
    EXPECT_NE(parts.at("xl/workbook.xml").find("fullCalcOnLoad=\"1\""), std::string::npos);
    EXPECT_EQ(workbookOverride(parts), kXlsxMain);
    EXPECT_EQ(book->sheetCount(), 0);
    book->release();
}

TEST(NewBook, FirstSheetGetsRid2AndSheetId1) {
    IBook* book = newXmlBook();
    ASSERT_NE(book->addSheet(L"Data", nullptr), nullptr);
    const char* data = nullptr;
    unsigned size = 0;
    ASSERT_TRUE(book->saveRaw(&data, &size));
    const auto parts = readPackageFromMemory(data, size);
    ASSERT_TRUE(parts.count("xl/worksheets/sheet1.xml"));
    EXPECT_NE(parts.at("xl/workbook.xml").find("<sheet name=\"Data\" sheetId=\"1\" r:id=\"rId2\"/>"), std::string::npos)
        << parts.at("xl/workbook.xml");
    book->release();
}

TEST(NewBook, SheetNameRules) {
    IBook* book = newXmlBook();
    ASSERT_NE(book->addSheet(L"Data", nullptr), nullptr);
    EXPECT_EQ(book->addSheet(L"DATA", nullptr), nullptr);
    EXPECT_STREQ(book->errorMessage(), "book already contains such sheet name");
    EXPECT_EQ(book->insertSheet(3, L"x", nullptr), nullptr);
    EXPECT_STREQ(book->errorMessage(), "index is out of range");
    ISheet* longName = book->addSheet(L"abcdefghijklmnopqrstuvwxyz0123456789", nullptr);
    ASSERT_NE(longName, nullptr);
    EXPECT_STREQ(book->errorMessage(), "warning: sheet's name is cut to 31 characters");
    EXPECT_EQ(std::wstring(longName->name()), L"abcdefghijklmnopqrstuvwxyz01234");
    EXPECT_FALSE(book->moveSheet(0, 1));
    EXPECT_STREQ(book->errorMessage(), "there is no sense: srcIndex is equal to dstIndex - 1");
    // The cut name does not hinder cells.
    EXPECT_TRUE(longName->writeNum(0, 0, 1.0, nullptr));
    EXPECT_EQ(longName->readNum(0, 0, nullptr), 1.0);
    book->release();
}

TEST(NewBook, ContentTypeFollowsTheFileEnding) {
    const std::string dir = makeTempDir("quire-endings");
    const std::vector<std::pair<std::string, std::string>> endings = {
        {"Book.XLSM", "application/vnd.ms-excel.sheet.macroEnabled.main+xml"},
        {"book.xltx", "application/vnd.openxmlformats-officedocument.spreadsheetml.template.main+xml"},
        {"book.xltm", "application/vnd.ms-excel.template.macroEnabled.main+xml"},
        {"book.xlsx", kXlsxMain},
        {"book.bin", kXlsxMain},
    };
    for (const auto& [name, type] : endings) {
        IBook* book = threeSheetBook();
        ASSERT_TRUE(book->save(widen(dir + "/" + name).c_str(), false)) << book->errorMessage();
        EXPECT_EQ(workbookOverride(readPackage(dir + "/" + name)), type) << name;
        book->release();
    }
    IBook* book = threeSheetBook();
    book->setTemplate(true);
    ASSERT_TRUE(book->save(widen(dir + "/t.xltx").c_str(), true)) << book->errorMessage();
    book->release();
    book = newXmlBook();
    ASSERT_TRUE(book->load(widen(dir + "/t.xltx").c_str(), nullptr)) << book->errorMessage();
    EXPECT_TRUE(book->isTemplate());
    ASSERT_TRUE(book->load(widen(dir + "/book.xltm").c_str(), nullptr)) << book->errorMessage();
    EXPECT_FALSE(book->isTemplate());
    book->release();
    runCommand("rm -rf " + shellQuote(dir));
}

// The sheet names in order, as openpyxl, LibreOffice and Gnumeric read them.
TEST(NewBook, OtherProgramsOpenAllFourKinds) {
    const std::string dir = makeTempDir("quire-others");
    std::vector<std::string> files;
    for (const char* ending : {".xlsx", ".xlsm", ".xltx", ".xltm"}) {
        IBook* book = threeSheetBook();
        const std::string path = dir + "/book" + ending;
        ASSERT_TRUE(book->save(widen(path).c_str(), false)) << book->errorMessage();
        book->release();
        files.push_back(path);
    }
    if (havePythonModule("openpyxl")) {
        for (const auto& path : files) {
            std::string output;
            const int status = runCommand(systemPython() + " -c " +
                                              shellQuote("import sys, openpyxl; print(','.join(openpyxl.load_workbook("
                                                         "sys.argv[1]).sheetnames))") +
                                              " " + shellQuote(path),
                                          &output);
            EXPECT_EQ(status, 0) << output;
            EXPECT_EQ(output, "First,Second,Third\n") << path;
        }
    }
    if (haveProgram("ssconvert")) {
        for (const auto& path : files) {
            std::string output;
            // Gnumeric names the output file of each sheet after the sheet.
            const std::string pattern = path + ".%s.csv";
            const int status = runCommand("ssconvert -S " + shellQuote(path) + " " + shellQuote(pattern) + " 2>&1",
                                          &output);
            EXPECT_EQ(status, 0) << output;
            for (const char* name : {"First", "Second", "Third"}) {
                std::ifstream probe(path + "." + name + ".csv");
                EXPECT_TRUE(probe.good()) << path << " " << name << ": " << output;
            }
        }
    }
    if (haveProgram("soffice")) {
        std::string list;
        for (const auto& path : files) list += " " + shellQuote(path);
        std::string output;
        const int status = runCommand("cd " + shellQuote(dir) + " && HOME=" + shellQuote(dir) +
                                          " timeout 300 soffice --headless --convert-to csv --outdir out" + list +
                                          " 2>&1",
                                      &output);
        EXPECT_EQ(status, 0) << output;
        for (const char* stem : {"book"}) {
            std::ifstream probe(dir + "/out/" + stem + ".csv");
            EXPECT_TRUE(probe.good()) << output;
        }
        EXPECT_EQ(output.find("Error"), std::string::npos) << output;
    }
    runCommand("rm -rf " + shellQuote(dir));
}

}  // namespace
}  // namespace quire::test
