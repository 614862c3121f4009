#include "book_formula_context.h"

#include "book_impl.h"
#include "record_text.h"

namespace quire {
namespace {

bool sameIgnoringAsciiCase(const std::wstring& a, const std::wstring& b) {
    if (a.size() != b.size()) return false;
    for (size_t i = 0; i < a.size(); ++i) {
        wchar_t x = a[i], y = b[i];
        if (x >= L'a' && x <= L'z') x = static_cast<wchar_t>(x - 32);
        if (y >= L'a' && y <= L'z') y = static_cast<wchar_t>(y - 32);
        if (x != y) return false;
    }
    return true;
}

std::wstring nameTextOf(const DefinedName& name) {
    if (name.builtIn() && name.text.size() == 1) {
        if (const wchar_t* text = builtInNameText(name.text[0])) return text;
    }
    return name.text;
}

// Sheet names of an external SupBook: ctab u16, the book name, then ctab sheet names.
bool externalBookNames(const KeptRecord& supBook, std::wstring& book, std::vector<std::wstring>& sheets) {
    const auto& d = supBook.data;
    if (d.size() < 4) return false;
    size_t count = d[0] | (d[1] << 8);
    size_t pos = 2;
    try {
        book = readUnicodeString(d.data(), d.size(), pos, false, "SupBookBlock: file is corrupt");
        for (size_t i = 0; i < count; ++i)
            sheets.push_back(readUnicodeString(d.data(), d.size(), pos, false, "SupBookBlock: file is corrupt"));
    } catch (...) {
        return false;
    }
    return true;
}

}  // namespace

wchar_t BookFormulaContext::listSeparator() const { return book_.listSeparator(); }

int BookFormulaContext::sheetIndex(const std::wstring& name) const {
    auto& sheets = book_.boundSheets();
    for (size_t i = 0; i < sheets.size(); ++i)
        if (sameIgnoringAsciiCase(sheets[i].stName, name)) return static_cast<int>(i);
    return -1;
}

bool BookFormulaContext::sheetName(int index, std::wstring& name) const {
    auto& sheets = book_.boundSheets();
    if (index < 0 || index >= static_cast<int>(sheets.size())) return false;
    name = sheets[index].stName;
    return true;
}

int BookFormulaContext::externSheetIndex(int firstSheet, int lastSheet) {
    return book_.externSheetIndex(firstSheet, lastSheet, true);
}

bool BookFormulaContext::externSheet(unsigned xti, xls::ExternSheetTarget& target) const {
    auto& entries = book_.externSheets();
    if (xti >= entries.size()) return false;
    const XtiEntry& e = entries[xti];
    auto& books = book_.supBooks();
    if (e.iSupBook >= books.size()) {
        target.kind = xls::ExternSheetTarget::Deleted;
        return true;
    }
    const SupBookBlock& block = books[e.iSupBook];
    if (block.selfReference()) {
        if (e.itabFirst == 0xFFFE) {
            target.kind = xls::ExternSheetTarget::Workbook;
            return true;
        }
        if (!sheetName(e.itabFirst, target.firstSheet) || !sheetName(e.itabLast, target.lastSheet)) {
            target.kind = xls::ExternSheetTarget::Deleted;
            return true;
        }
        target.kind = xls::ExternSheetTarget::Sheets;
        return true;
    }
    std::vector<std::wstring> sheets;
    if (block.addIn() || !externalBookNames(block.records[0], target.book, sheets)) {
        target.kind = xls::ExternSheetTarget::Workbook;
        return true;
    }
    target.kind = xls::ExternSheetTarget::External;
    if (e.itabFirst < sheets.size()) target.firstSheet = sheets[e.itabFirst];
    target.lastSheet = e.itabLast < sheets.size() ? sheets[e.itabLast] : target.firstSheet;
    if (e.itabFirst >= sheets.size()) target.kind = xls::ExternSheetTarget::Workbook;
    return true;
}

unsigned BookFormulaContext::nameIndex(const std::wstring& name, int scope) const {
    auto& names = book_.names();
    uint16_t itab = static_cast<uint16_t>(scope < 0 ? 0 : scope + 1);
    for (size_t i = 0; i < names.size(); ++i) {
        if (names[i].itab == itab && sameIgnoringAsciiCase(nameTextOf(names[i]), name))
            return static_cast<unsigned>(i + 1);
    }
    return 0;
}

bool BookFormulaContext::nameText(unsigned index, std::wstring& name, int& scope) const {
    auto& names = book_.names();
    if (index == 0 || index > names.size()) return false;
    const DefinedName& defined = names[index - 1];
    name = nameTextOf(defined);
    scope = defined.itab == 0 ? xls::WorkbookScope : defined.itab - 1;
    return true;
}

bool BookFormulaContext::externNameText(unsigned xti, unsigned nameIndex, std::wstring& name) const {
    auto& entries = book_.externSheets();
    if (xti >= entries.size() || nameIndex == 0) return false;
    auto& books = book_.supBooks();
    if (entries[xti].iSupBook >= books.size()) return false;
    const SupBookBlock& block = books[entries[xti].iSupBook];
    if (block.selfReference()) return false;
    unsigned seen = 0;
    for (const auto& record : block.records) {
        if (record.id != GlobalsRecord::ExternName || ++seen != nameIndex) continue;
        // grbit, then four bytes (an add-in's reserved word or a name's sheet index), then the name.
        size_t pos = 6;
        if (record.data.size() < pos) return false;
        try {
            name = readUnicodeString(record.data.data(), record.data.size(), pos, true, "ExternName: file is corrupt");
        } catch (...) {
            return false;
        }
        return true;
    }
    return false;
}

}  // namespace quire
