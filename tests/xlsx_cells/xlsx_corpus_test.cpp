// Every Open XML package of the shared corpus loads, and its cells are the ones openpyxl reads.
#include <gtest/gtest.h>

#include <cctype>
#include <cmath>
#include <cstdlib>
#include <memory>
#include <set>
#include <string>

#include "api/enums.h"
#include "cell_dump.h"
#include "corpus.h"
#include "xlsx/xml_book_proxy.h"

namespace quire::test {
namespace {

struct BookDeleter {
    void operator()(IBook* book) const { book->release(); }
};
using BookPtr = std::unique_ptr<IBook, BookDeleter>;

std::vector<CorpusFile> xlsxFiles() { return corpusFiles({".xlsx", ".xlsm"}); }

std::string testName(const ::testing::TestParamInfo<CorpusFile>& info) {
    std::string name = info.param.name;
    for (char& c : name)
        if (!isalnum(static_cast<unsigned char>(c))) c = '_';
    return name + "_" + std::to_string(info.index);
}

// Packages openpyxl does not read as they are.
const std::set<std::string>& openpyxlDiffers() {
    static const std::set<std::string> files = {
        // No reader for the Strict namespaces: no sheets, no cells.
        "poi/SampleSS.strict.xlsx",
        "poi/SimpleStrict.xlsx",
        // Escaped escapes: "_x005F_x005F_" is the text "_x005F_", openpyxl makes it "_".
        "xw/shared_strings02.xlsx",
    };
    return files;
}

// openpyxl leaves _xHHHH_ escapes in the text; we decode them, and a text ends at a decoded NUL.
std::string decodeEscapes(const std::string& text) {
    std::string out;
    for (size_t i = 0; i < text.size(); ++i) {
        if (text[i] == '_' && i + 6 < text.size() && text[i + 1] == 'x' && text[i + 6] == '_' &&
            std::isxdigit(static_cast<unsigned char>(text[i + 2])) && std::isxdigit(static_cast<unsigned char>(text[i + 3])) &&
            std::isxdigit(static_cast<unsigned char>(text[i + 4])) && std::isxdigit(static_cast<unsigned char>(text[i + 5]))) {
            unsigned code = static_cast<unsigned>(std::strtoul(text.substr(i + 2, 4).c_str(), nullptr, 16));
            if (code == 0) return out;
            if (code < 0x80) {
                out += static_cast<char>(code);
            } else if (code < 0x800) {
                out += static_cast<char>(0xC0 | (code >> 6));
                out += static_cast<char>(0x80 | (code & 0x3F));
            } else {
                out += static_cast<char>(0xE0 | (code >> 12));
                out += static_cast<char>(0x80 | ((code >> 6) & 0x3F));
                out += static_cast<char>(0x80 | (code & 0x3F));
            }
            i += 6;
        } else {
            out += text[i];
        }
    }
    return out;
}

// Brings openpyxl's dump and ours to the same terms where the two readers report the same
// package differently:
// - openpyxl leaves out cells whose cached result is missing or empty (a formula not yet
//   calculated, `<v/>` of any type); ours report those as a number they cannot read, or as an
//   empty string;
// - openpyxl turns date-formatted numbers into times of a millisecond's precision and back;
// - openpyxl does not decode _xHHHH_ escapes.
void reconcile(IBook& book, CellDump& expected, CellDump& ours) {
    std::vector<ISheet*> worksheets;
    for (int i = 0; i < book.sheetCount(); ++i)
        if (book.sheetType(i) == SheetTypeSheet && book.getSheet(i)) worksheets.push_back(book.getSheet(i));
    for (auto it = ours.cells.begin(); it != ours.cells.end();) {
        int sheetIndex, row, col;
        std::tie(sheetIndex, row, col) = it->first;
        ISheet* sheet = worksheets.at(static_cast<size_t>(sheetIndex));
        bool unread = false;
        if (!expected.cells.count(it->first)) {
            if (it->second.kind == 'N') {
                sheet->readNum(row, col, nullptr);
                unread = std::string(book.errorMessage()) != "ok";
            } else if (it->second.kind == 'S') {
                unread = it->second.value.empty();
            }
        }
        if (unread) {
            it = ours.cells.erase(it);
            continue;
        }
        auto want = expected.cells.find(it->first);
        if (want != expected.cells.end()) {
            if (want->second.kind == 'N' && it->second.kind == 'N' && sheet->isDate(row, col)) {
                double a = std::strtod(want->second.value.c_str(), nullptr);
                double b = std::strtod(it->second.value.c_str(), nullptr);
                if (std::fabs(a - b) <= 1.0 / 86400000) want->second.value = it->second.value;
            } else if (want->second.kind == 'S') {
                want->second.value = decodeEscapes(want->second.value);
            }
        }
        ++it;
    }
}

class XlsxCorpus : public ::testing::TestWithParam<CorpusFile> {};

TEST_P(XlsxCorpus, LoadsWithTheCellsOpenpyxlReads) {
    const CorpusFile& file = GetParam();
    BookPtr book(createXmlBook());
    ASSERT_NE(book, nullptr);
    std::wstring path(file.path.begin(), file.path.end());
    const bool loaded = book->load(path.c_str(), nullptr);
    const std::string message = book->errorMessage();
    if (!file.ok) {
        // Refused with a message, or loaded as far as it goes; never a crash.
        if (!loaded) {
            EXPECT_FALSE(message.empty());
        }
        return;
    }
    ASSERT_TRUE(loaded) << message;

    std::string expectedText;
    try {
        expectedText = readFile(file.path + ".cells");
    } catch (...) {
        GTEST_SKIP() << "no cell dump for this package";
    }
    if (openpyxlDiffers().count(file.name)) return;
    CellDump expected = parseCellDump(expectedText);
    CellDump ours = dumpBook(*book);
    reconcile(*book, expected, ours);
    auto differences = compareDumps(expected, ours);
    for (const auto& d : differences) ADD_FAILURE() << d;
}

INSTANTIATE_TEST_SUITE_P(Files, XlsxCorpus, ::testing::ValuesIn(xlsxFiles()), testName);
GTEST_ALLOW_UNINSTANTIATED_PARAMETERIZED_TEST(XlsxCorpus);

}  // namespace
}  // namespace quire::test
