// Every formula of the BIFF8 files of the shared corpus: how many print,
// and how many print the same again after being compiled from their text.
// Skipped when the corpus folder is absent.

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <iostream>
#include <map>
#include <sstream>

#include "api/wide_text.h"
#include "test_helpers.h"
#include "xls/compound_file.h"
#include "xls/formula/ptg_reader.h"
#include "xls/little_endian.h"
#include "xls/record_reader.h"

using namespace quire::xls;
using namespace quire::xls::test;

namespace {

namespace rt {
constexpr uint16_t Formula = 0x0006;
constexpr uint16_t Eof = 0x000A;
constexpr uint16_t ExternSheet = 0x0017;
constexpr uint16_t Lbl = 0x0018;
constexpr uint16_t ExternName = 0x0023;
constexpr uint16_t BoundSheet = 0x0085;
constexpr uint16_t SupBook = 0x01AE;
constexpr uint16_t Array = 0x0221;
constexpr uint16_t ShrFmla = 0x04BC;
constexpr uint16_t Bof = 0x0809;
} // namespace rt

const wchar_t* const BuiltinNames[] = {
    L"Consolidate_Area", L"Auto_Open", L"Auto_Close", L"Extract", L"Database", L"Criteria", L"Print_Area",
    L"Print_Titles", L"Recorder", L"Data_Form", L"Auto_Activate", L"Auto_Deactivate", L"Sheet_Title",
    L"_FilterDatabase"};

// Characters of an XLUnicodeStringNoCch at p (flags byte first); false when short.
bool readChars(const uint8_t* p, size_t size, size_t cch, std::wstring& out, size_t& used)
{
    if (size < 1)
        return false;
    const bool high = p[0] & 1;
    const size_t bytes = cch * (high ? 2 : 1);
    if (size - 1 < bytes)
        return false;
    std::u16string u;
    for (size_t i = 0; i < cch; ++i)
        u += static_cast<char16_t>(high ? loadU16(p + 1 + 2 * i) : p[1 + i]);
    out = quire::fromUtf16(u.data(), u.size());
    used = 1 + bytes;
    return true;
}

// The book as the file describes it: sheets, SupBooks, XTIs and names.
class CorpusBook : public FormulaContext {
public:
    struct Sup {
        bool self = false;
        bool addin = false;
        std::wstring name;
        std::vector<std::wstring> sheets;
        std::vector<std::wstring> externNames;
    };
    struct Xti {
        unsigned supbook;
        int first;
        int last;
    };
    std::vector<std::wstring> sheets;
    std::vector<Sup> supbooks;
    std::vector<Xti> xtis;
    std::vector<std::pair<std::wstring, int>> names;

    wchar_t listSeparator() const override { return L','; }
    int sheetIndex(const std::wstring& name) const override
    {
        for (size_t i = 0; i < sheets.size(); ++i)
            if (same(sheets[i], name))
                return static_cast<int>(i);
        return -1;
    }
    bool sheetName(int index, std::wstring& name) const override
    {
        if (index < 0 || static_cast<size_t>(index) >= sheets.size())
            return false;
        name = sheets[index];
        return true;
    }
    int externSheetIndex(int first, int last) override
    {
        for (size_t i = 0; i < xtis.size(); ++i)
            if (xtis[i].supbook < supbooks.size() && supbooks[xtis[i].supbook].self && xtis[i].first == first &&
                xtis[i].last == last)
                return static_cast<int>(i);
        return -1;  // a reading book does not grow
    }
    bool externSheet(unsigned index, ExternSheetTarget& target) const override
    {
        if (index >= xtis.size() || xtis[index].supbook >= supbooks.size())
            return false;
        const Xti& x = xtis[index];
        const Sup& s = supbooks[x.supbook];
        if (x.first < 0 || x.first == 0xFFFF || x.first == 0xFFFE) {
            target.kind = x.first == 0xFFFE ? ExternSheetTarget::Workbook : ExternSheetTarget::Deleted;
            return true;
        }
        if (s.self) {
            if (static_cast<size_t>(x.first) >= sheets.size() || static_cast<size_t>(x.last) >= sheets.size())
                return false;
            target.kind = ExternSheetTarget::Sheets;
            target.firstSheet = sheets[x.first];
            target.lastSheet = sheets[x.last];
            return true;
        }
        if (static_cast<size_t>(x.first) >= s.sheets.size() || static_cast<size_t>(x.last) >= s.sheets.size())
            return false;
        target.kind = ExternSheetTarget::External;
        target.book = s.name;
        target.firstSheet = s.sheets[x.first];
        target.lastSheet = s.sheets[x.last];
        return true;
    }
    unsigned nameIndex(const std::wstring& name, int scope) const override
    {
        for (size_t i = 0; i < names.size(); ++i)
            if (names[i].second == scope && same(names[i].first, name))
                return static_cast<unsigned>(i + 1);
        return 0;
    }
    bool nameText(unsigned index, std::wstring& name, int& scope) const override
    {
        if (index == 0 || index > names.size())
            return false;
        name = names[index - 1].first;
        scope = names[index - 1].second;
        return true;
    }
    bool externNameText(unsigned xti, unsigned index, std::wstring& name) const override
    {
        if (xti >= xtis.size() || xtis[xti].supbook >= supbooks.size())
            return false;
        const Sup& s = supbooks[xtis[xti].supbook];
        if (s.self || index == 0 || index > s.externNames.size())
            return false;
        name = s.addin ? s.externNames[index - 1] : L"[" + s.name + L"]!" + s.externNames[index - 1];
        return true;
    }
    unsigned userFunctionIndex(const std::wstring& name) override { return nameIndex(name, WorkbookScope); }

private:
    static bool same(const std::wstring& a, const std::wstring& b)
    {
        if (a.size() != b.size())
            return false;
        for (size_t i = 0; i < a.size(); ++i)
            if (std::towupper(a[i]) != std::towupper(b[i]))
                return false;
        return true;
    }
};

struct FormulaCell {
    int sheet;
    int row;
    int col;
    std::vector<uint8_t> rgce;
    std::vector<uint8_t> rgcb;
};

struct Counts {
    size_t files = 0;
    size_t formulas = 0;
    size_t printed = 0;
    size_t recompiled = 0;
    size_t samePrint = 0;
    std::map<std::string, size_t> printFailures;
    std::map<std::string, size_t> compileFailures;
    std::vector<std::string> differences;
};

void readGlobals(const Record& r, CorpusBook& book)
{
    const uint8_t* p = r.data;
    const size_t n = r.size;
    switch (r.type) {
    case rt::BoundSheet: {
        std::wstring name;
        size_t used = 0;
        if (n >= 8 && readChars(p + 7, n - 7, p[6], name, used))
            book.sheets.push_back(name);
        else
            book.sheets.push_back(L"?");
        break;
    }
    case rt::SupBook: {
        CorpusBook::Sup s;
        if (n >= 4) {
            const uint16_t ctab = loadU16(p);
            const uint16_t cch = loadU16(p + 2);
            s.self = cch == 0x0401;
            s.addin = cch == 0x3A01;
            if (!s.self && !s.addin && cch >= 1 && cch < 0x0100) {
                size_t used = 0, pos = 4;
                if (readChars(p + pos, n - pos, cch, s.name, used)) {
                    pos += used;
                    for (unsigned i = 0; i < ctab && pos + 2 <= n; ++i) {
                        std::wstring sheet;
                        const uint16_t len = loadU16(p + pos);
                        if (!readChars(p + pos + 2, n - pos - 2, len, sheet, used))
                            break;
                        s.sheets.push_back(sheet);
                        pos += 2 + used;
                    }
                }
            }
        }
        book.supbooks.push_back(s);
        break;
    }
    case rt::ExternName:
        if (!book.supbooks.empty() && n >= 7) {
            std::wstring name;
            size_t used = 0;
            readChars(p + 7, n - 7, p[6], name, used);
            book.supbooks.back().externNames.push_back(name);
        }
        break;
    case rt::ExternSheet:
        if (n >= 2) {
            const size_t count = loadU16(p);
            for (size_t i = 0; i < count && 2 + 6 * i + 6 <= n; ++i)
                book.xtis.push_back({loadU16(p + 2 + 6 * i), loadU16(p + 4 + 6 * i), loadU16(p + 6 + 6 * i)});
        }
        break;
    case rt::Lbl:
        if (n >= 15) {
            const uint16_t flags = loadU16(p);
            const uint8_t cch = p[3];
            const int itab = loadU16(p + 8);
            std::wstring name;
            size_t used = 0;
            readChars(p + 14, n - 14, cch, name, used);
            if ((flags & 0x0020) && name.size() == 1 && name[0] < 14)
                name = BuiltinNames[name[0]];
            book.names.push_back({name, itab == 0 ? WorkbookScope : itab - 1});
        }
        break;
    default:
        break;
    }
}

void checkFile(const std::filesystem::path& path, Counts& counts)
{
    Xls file;
    try {
        file.open(path.string());
    } catch (const std::exception&) {
        return;
    }
    if (file.encrypted())
        return;
    const std::vector<uint8_t>& stream = file.workbookStream();
    RecordReader reader(stream);
    CorpusBook book;
    std::vector<FormulaCell> cells;
    std::map<std::tuple<int, int, int>, std::pair<std::vector<uint8_t>, std::vector<uint8_t>>> shared;
    std::vector<uint8_t> scratch;
    Record r;
    int depth = 0, sheet = -1;
    bool biff8 = false;
    std::tuple<int, int, int> lastFormula{-1, -1, -1};
    try {
        while (reader.nextWithContinues(r, scratch)) {
            if (r.type == rt::Bof) {
                if (depth == 0 && r.size >= 2) {
                    if (sheet == -1 && loadU16(r.data) != 0x0600)
                        return;  // not BIFF8
                    biff8 = true;
                }
                if (depth == 0)
                    ++sheet;
                ++depth;
                continue;
            }
            if (r.type == rt::Eof) {
                depth = std::max(0, depth - 1);
                continue;
            }
            if (sheet == 0 && depth == 1) {
                readGlobals(r, book);
                continue;
            }
            if (r.type == rt::Formula && r.size >= 22) {
                const size_t cce = loadU16(r.data + 20);
                if (22 + cce > r.size)
                    continue;
                FormulaCell c{sheet - 1, loadU16(r.data), loadU16(r.data + 2),
                              std::vector<uint8_t>(r.data + 22, r.data + 22 + cce),
                              std::vector<uint8_t>(r.data + 22 + cce, r.data + r.size)};
                lastFormula = {c.sheet, c.row, c.col};
                cells.push_back(std::move(c));
            } else if ((r.type == rt::ShrFmla && r.size >= 10) || (r.type == rt::Array && r.size >= 14)) {
                const size_t at = r.type == rt::ShrFmla ? 8 : 12;
                const size_t cce = loadU16(r.data + at);
                if (at + 2 + cce <= r.size)
                    shared[lastFormula] = {std::vector<uint8_t>(r.data + at + 2, r.data + at + 2 + cce),
                                           std::vector<uint8_t>(r.data + at + 2 + cce, r.data + r.size)};
            }
        }
    } catch (const std::exception&) {
        // A damaged stream: check what was read before the damage.
    }
    if (!biff8)
        return;
    ++counts.files;
    for (const FormulaCell& c : cells) {
        ++counts.formulas;
        const std::vector<uint8_t>* rgce = &c.rgce;
        const std::vector<uint8_t>* rgcb = &c.rgcb;
        uint16_t anchorRow = 0, anchorCol = 0;
        if (sharedFormulaAnchor(c.rgce.data(), c.rgce.size(), anchorRow, anchorCol)) {
            const auto it = shared.find({c.sheet, anchorRow, anchorCol});
            if (it != shared.end()) {
                rgce = &it->second.first;
                rgcb = &it->second.second;
            }
        }
        FormulaOrigin origin;
        origin.sheet = c.sheet;
        origin.row = c.row;
        origin.col = c.col;
        std::wstring text;
        try {
            text = toInfix(rgce->data(), rgce->size(), rgcb->data(), rgcb->size(), book, origin);
            ++counts.printed;
        } catch (const std::exception& e) {
            ++counts.printFailures[e.what()];
            if (counts.differences.size() < 40)
                counts.differences.push_back(hex(*rgce) + "  ??  " + e.what());
            continue;
        }
        try {
            const ParsedFormula again = MakeFormula(text, book, c.sheet);
            ++counts.recompiled;
            const std::wstring second = toInfix(again, book, origin);
            if (second == text)
                ++counts.samePrint;
            else if (counts.differences.size() < 20)
                counts.differences.push_back(quire::toUtf8(text) + "  =>  " + quire::toUtf8(second));
        } catch (const std::exception& e) {
            ++counts.compileFailures[e.what()];
            if (counts.differences.size() < 20 && text.find(L'[') == std::wstring::npos)
                counts.differences.push_back(quire::toUtf8(text) + "  !!  " + e.what());
        }
    }
}

} // namespace

TEST(Corpus, FormulasPrintAndCompileBack)
{
    const std::filesystem::path corpus = std::filesystem::path(QUIRE_SHARED_DIR) / "corpus";
    std::ifstream manifest(corpus / "MANIFEST.tsv");
    if (!manifest)
        GTEST_SKIP() << "no corpus at " << corpus;
    Counts counts;
    std::string line;
    while (std::getline(manifest, line)) {
        const size_t tab = line.find('\t');
        if (tab == std::string::npos || line.substr(0, tab) != "ok")
            continue;
        const std::string file = line.substr(tab + 1);
        if (file.size() < 4 || file.substr(file.size() - 4) != ".xls")
            continue;
        checkFile(corpus / file, counts);
    }
    std::cout << "BIFF8 files: " << counts.files << ", formulas: " << counts.formulas
              << ", printed: " << counts.printed << ", compiled back: " << counts.recompiled
              << ", printed the same again: " << counts.samePrint << "\n";
    for (const auto& [message, n] : counts.printFailures)
        std::cout << "  print failure x" << n << ": " << message << "\n";
    for (const auto& [message, n] : counts.compileFailures)
        std::cout << "  compile failure x" << n << ": " << message << "\n";
    for (const auto& d : counts.differences)
        std::cout << "  " << d << "\n";
    RecordProperty("formulas", static_cast<int>(counts.formulas));
    RecordProperty("printed", static_cast<int>(counts.printed));
    RecordProperty("samePrint", static_cast<int>(counts.samePrint));
    EXPECT_GT(counts.formulas, 0u);
}
