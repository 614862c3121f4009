// A package that fails to load in both flavours reports why it failed in its own flavour, not
// that the other flavour's workbook element is missing.
#include <gtest/gtest.h>

#include "corpus.h"
#include "external_tools.h"
#include "package_support.h"
#include "zip/ZipWriter.h"

namespace quire::test {
namespace {

// A saved one-sheet book whose worksheet has `find` replaced before it is zipped again.
std::string bookWithEditedSheet(const std::string& dir, const std::string& find, const std::string& replace) {
    IBook* book = newXmlBook();
    EXPECT_NE(book->addSheet(L"Data", nullptr), nullptr);
    const char* data = nullptr;
    unsigned size = 0;
    EXPECT_TRUE(book->saveRaw(&data, &size)) << book->errorMessage();
    auto parts = readPackageFromMemory(data, size);
    book->release();
    std::string& sheet = parts["xl/worksheets/sheet1.xml"];
    const std::size_t at = sheet.find(find);
    EXPECT_NE(at, std::string::npos) << sheet;
    if (at != std::string::npos) sheet.replace(at, find.size(), replace);
    const std::string path = dir + "/edited.xlsx";
    zip::ZipWriter writer;
    writer.create(path);
    for (const auto& [name, bytes] : parts) writer.add(name, bytes.data(), bytes.size());
    writer.close();
    return path;
}

TEST(FlavourRetry, BrokenWorksheetOfATransitionalBookIsReported) {
    const std::string dir = makeTempDir("quire-retry");
    // A cell type outside the schema's list.
    const std::string path = bookWithEditedSheet(
        dir, "<sheetData/>", "<sheetData><row r=\"1\"><c r=\"A1\" t=\"bogus\"><v>1</v></c></row></sheetData>");
    IBook* book = newXmlBook();
    EXPECT_FALSE(book->load(widen(path).c_str(), nullptr));
    const std::string message = book->errorMessage();
    EXPECT_NE(message.find("/xl/worksheets/sheet1.xml"), std::string::npos) << message;
    EXPECT_EQ(message.find("/xl/workbook.xml"), std::string::npos) << message;
    // The book stays usable as a transitional book.
    ASSERT_NE(book->addSheet(L"Next", nullptr), nullptr) << book->errorMessage();
    const char* data = nullptr;
    unsigned size = 0;
    ASSERT_TRUE(book->saveRaw(&data, &size)) << book->errorMessage();
    const auto parts = readPackageFromMemory(data, size);
    EXPECT_NE(parts.at("xl/workbook.xml").find("http://schemas.openxmlformats.org/spreadsheetml/2006/main"),
              std::string::npos);
    book->release();
    runCommand("rm -rf " + shellQuote(dir));
}

TEST(FlavourRetry, SoundBookStillLoads) {
    const std::string dir = makeTempDir("quire-retry");
    const std::string path = bookWithEditedSheet(dir, "<sheetData/>", "<sheetData><row r=\"1\"/></sheetData>");
    IBook* book = newXmlBook();
    EXPECT_TRUE(book->load(widen(path).c_str(), nullptr)) << book->errorMessage();
    EXPECT_EQ(book->sheetCount(), 1);
    book->release();
    runCommand("rm -rf " + shellQuote(dir));
}

}  // namespace
}  // namespace quire::test
