// Every formula of the real .xls files prints as text, and the text compiles back to tokens
// that print the same.
#include <gtest/gtest.h>

#include <map>
#include <set>

#include "api/enums.h"
#include "book_ptr.h"
#include "cell_dump.h"
#include "corpus.h"

namespace quire::test {
namespace {

TEST(XlsCorpusFormulas, PrintAndCompileBackToTheSameText) {
    auto files = corpusFiles({".xls"});
    if (files.empty()) GTEST_SKIP() << "the corpus is not present";
    size_t formulas = 0, printed = 0, recompiled = 0;
    std::map<std::string, size_t> printFailures, compileFailures;
    std::map<std::string, std::string> examples;
    for (const auto& file : files) {
        if (!file.ok) continue;
        BookPtr book = newBinaryBook();
        if (!book->load(std::wstring(file.path.begin(), file.path.end()).c_str(), nullptr)) continue;
        for (int s = 0; s < book->sheetCount(); ++s) {
            ISheet* sheet = book->getSheet(s);
            if (!sheet || book->sheetType(s) != SheetTypeSheet) continue;
            for (int row = sheet->firstRow(); row < sheet->lastRow(); ++row) {
                for (int col = sheet->firstCol(); col < sheet->lastCol(); ++col) {
                    if (!sheet->isFormula(row, col)) continue;
                    ++formulas;
                    const wchar_t* text = sheet->readFormula(row, col, nullptr);
                    if (!text) {
                        ++printFailures[book->errorMessage()];
                        continue;
                    }
                    ++printed;
                    std::wstring first = text;
                    if (!sheet->writeFormula(row, col, first.c_str(), nullptr)) {
                        std::string message = book->errorMessage();
                        ++compileFailures[message];
                        examples.emplace(message, file.name + ": " + utf8(first.c_str()));
                        continue;
                    }
                    const wchar_t* again = sheet->readFormula(row, col, nullptr);
                    EXPECT_EQ(std::wstring(again ? again : L"(null)"), first) << file.name;
                    ++recompiled;
                }
            }
        }
    }
    std::cout << formulas << " formulas, " << printed << " printed, " << recompiled << " compiled back\n";
    for (const auto& f : printFailures) std::cout << "  print failure x" << f.second << ": " << f.first << "\n";
    for (const auto& f : compileFailures)
        std::cout << "  compile failure x" << f.second << ": " << f.first << " (e.g. " << examples[f.first] << ")\n";
    EXPECT_GT(formulas, 30000u);
    // What may fail: tokens that have no text form, and references into other workbooks or
    // add-in functions, which the compiler does not write.
    const std::set<std::string> allowedPrint = {"unknown Ptg 0x18"};
    for (const auto& f : printFailures) EXPECT_TRUE(allowedPrint.count(f.first)) << f.first;
    for (const auto& f : compileFailures) EXPECT_EQ(f.first, "incorrect token in formula");
    EXPECT_LT(formulas - recompiled, formulas / 100);
}

TEST(XlsCorpusFormulas, MalformedTokensFailTheReadWithAMessage) {
    BookPtr book = newBinaryBook();
    ISheet* sheet = book->addSheet(L"S", nullptr);
    ASSERT_TRUE(sheet->writeFormula(0, 0, L"SUM(A2:A9)*2", nullptr));
    const char* data = nullptr;
    unsigned size = 0;
    ASSERT_TRUE(book->saveRaw(&data, &size));
    std::string bytes(data, size);
    // The token array follows the Formula record's 20 fixed bytes: make its length lie.
    const std::string header("\x06\x00", 2);
    size_t at = bytes.find(header);
    while (at != std::string::npos && !(static_cast<uint8_t>(bytes[at + 4]) == 0 && bytes[at + 5] == 0 &&
                                         static_cast<uint8_t>(bytes[at + 6]) == 0 && bytes[at + 7] == 0))
        at = bytes.find(header, at + 1);
    ASSERT_NE(at, std::string::npos);
    for (uint8_t cce : {0x02, 0x30, 0xFF}) {
        std::string bad = bytes;
        bad[at + 4 + 20] = static_cast<char>(cce);
        bad[at + 4 + 21] = 0;
        BookPtr loaded = newBinaryBook();
        if (!loaded->loadRaw(bad.data(), static_cast<unsigned>(bad.size()), -1, -1, -1)) continue;
        const wchar_t* text = loaded->getSheet(0)->readFormula(0, 0, nullptr);
        if (!text) {
            EXPECT_STRNE(loaded->errorMessage(), "ok");
        }
    }
}

}  // namespace
}  // namespace quire::test
