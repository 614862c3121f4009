// Named ranges, print areas and print titles of a sheet: defined names of the book.
#include <cwchar>

#include "book_impl.h"
#include "sheet_impl.h"

namespace quire {
namespace {

constexpr uint8_t kPtgArea3d = 0x3B;
constexpr uint8_t kPtgMemFunc = 0x29;
constexpr uint8_t kPtgUnion = 0x10;

bool scopeMatches(const DefinedName& name, int scopeId) {
    if (scopeId == ScopeUndefined) return true;
    if (scopeId == ScopeWorkbook) return name.itab == 0;
    return scopeId >= 0 && name.itab == scopeId + 1;
}

std::wstring listedText(const DefinedName& name) {
    if (name.builtIn() && name.text.size() == 1)
        if (const wchar_t* text = builtInNameText(name.text[0])) return text;
    return name.text;
}

void writeBounds(int rf, int rl, int cf, int cl, int* rowFirst, int* rowLast, int* colFirst, int* colLast) {
    if (rowFirst) *rowFirst = rf;
    if (rowLast) *rowLast = rl;
    if (colFirst) *colFirst = cf;
    if (colLast) *colLast = cl;
}

struct Area {
    uint16_t xti = 0;
    int rowFirst = 0, rowLast = 0, colFirst = 0, colLast = 0;
};

// The areas of a print-titles formula: one 3-D area, or two joined by a union.
std::vector<Area> titleAreas(const DefinedName& name) {
    std::vector<Area> areas;
    Area a;
    if (name.area(a.xti, a.rowFirst, a.rowLast, a.colFirst, a.colLast)) {
        areas.push_back(a);
        return areas;
    }
    const auto& t = name.rgce;
    if (t.size() == 3 + 11 + 11 + 1 && t[0] == kPtgMemFunc && (t[3] & 0x1F) == (kPtgArea3d & 0x1F) &&
        (t[14] & 0x1F) == (kPtgArea3d & 0x1F) && t[25] == kPtgUnion) {
        for (size_t at : {size_t{3}, size_t{14}}) {
            DefinedName single;
            single.rgce.assign(t.begin() + static_cast<long>(at), t.begin() + static_cast<long>(at) + 11);
            single.area(a.xti, a.rowFirst, a.rowLast, a.colFirst, a.colLast);
            areas.push_back(a);
        }
    }
    return areas;
}

void setTitleAreas(DefinedName& name, const std::vector<Area>& areas) {
    if (areas.size() == 1) {
        name.setArea(areas[0].xti, areas[0].rowFirst, areas[0].rowLast, areas[0].colFirst, areas[0].colLast);
        return;
    }
    std::vector<uint8_t> tokens = {kPtgMemFunc, 22, 0};
    for (const Area& a : areas) {
        DefinedName single;
        single.setArea(a.xti, a.rowFirst, a.rowLast, a.colFirst, a.colLast);
        tokens.insert(tokens.end(), single.rgce.begin(), single.rgce.end());
    }
    tokens.push_back(kPtgUnion);
    name.rgce = tokens;
    name.rgcb.clear();
}

bool isRowTitle(const Area& a) { return a.colFirst == 0 && a.colLast == SheetImplT::kMaxCol; }
bool isColumnTitle(const Area& a) { return a.rowFirst == 0 && a.rowLast == SheetImplT::kMaxRow && !isRowTitle(a); }

}  // namespace

int SheetImplT::ownIndex() const {
    int index = book_->sheetIndexOf(this);
    if (index < 0) throw qrerror("sheet not found");
    return index;
}

DefinedName* SheetImplT::builtInName(wchar_t code) {
    uint16_t itab = static_cast<uint16_t>(ownIndex() + 1);
    for (auto& name : book_->names())
        if (name.itab == itab && name.isBuiltIn(code)) return &name;
    return nullptr;
}

DefinedName& SheetImplT::addBuiltInName(wchar_t code) {
    DefinedName name;
    name.flags = DefinedName::kBuiltin;
    name.text.assign(1, code);
    name.itab = static_cast<uint16_t>(ownIndex() + 1);
    book_->names().push_back(name);
    return book_->names().back();
}

uint16_t SheetImplT::ownExternSheet() {
    int index = ownIndex();
    int xti = book_->externSheetIndex(index, index, true);
    if (xti < 0) throw qrerror("error in record ExternSheet");
    return static_cast<uint16_t>(xti);
}

bool SheetImplT::isNamedRangeOfThisSheet(const DefinedName& name, Area3d& area) const {
    if (!name.area(area.xti, area.rowFirst, area.rowLast, area.colFirst, area.colLast)) return false;
    return book_->sheetOfExternSheet(area.xti) == book_->sheetIndexOf(this);
}

void SheetImplT::setPrintArea(int rowFirst, int rowLast, int colFirst, int colLast) {
    message().guardVoid([&] {
        if (static_cast<unsigned>(rowFirst) > kMaxRow) throw qrerror("firstRow must be in range 0-65535");
        if (static_cast<unsigned>(rowLast) > kMaxRow) throw qrerror("lastRow must be in range 0-65535");
        if (static_cast<unsigned>(colFirst) > kMaxCol) throw qrerror("firstCol must be in range 0-255");
        if (static_cast<unsigned>(colLast) > kMaxCol) throw qrerror("lastCol must be in range 0-255");
        uint16_t xti = ownExternSheet();
        DefinedName* name = builtInName(kPrintArea);
        if (!name) name = &addBuiltInName(kPrintArea);
        name->setArea(xti, rowFirst, rowLast, colFirst, colLast);
    });
}

bool SheetImplT::printArea(int* rowFirst, int* rowLast, int* colFirst, int* colLast) {
    return message().guard(false, [&] {
        DefinedName* name = builtInName(kPrintArea);
        Area3d area;
        if (!name || !name->area(area.xti, area.rowFirst, area.rowLast, area.colFirst, area.colLast))
            throw qrerror("not found");
        writeBounds(area.rowFirst, area.rowLast, area.colFirst, area.colLast, rowFirst, rowLast, colFirst, colLast);
        return true;
    });
}

void SheetImplT::clearPrintArea() {
    message().guardVoid([&] {
        uint16_t itab = static_cast<uint16_t>(ownIndex() + 1);
        auto& names = book_->names();
        for (size_t i = 0; i < names.size();) {
            if (names[i].itab == itab && names[i].isBuiltIn(kPrintArea)) names.erase(names.begin() + static_cast<long>(i));
            else ++i;
        }
    });
}

void SheetImplT::setPrintTitle(bool rows, int first, int last) {
    if (rows) {
        if (static_cast<unsigned>(first) > kMaxRow) throw qrerror("firstRow must be in range 0-65535");
        if (static_cast<unsigned>(last) > kMaxRow) throw qrerror("lastRow must be in range 0-65535");
    } else {
        if (static_cast<unsigned>(first) > kMaxCol) throw qrerror("firstCol must be in range 0-255");
        if (static_cast<unsigned>(last) > kMaxCol) throw qrerror("lastCol must be in range 0-255");
    }
    Area area;
    area.xti = ownExternSheet();
    if (rows) {
        area.rowFirst = first;
        area.rowLast = last;
        area.colFirst = 0;
        area.colLast = kMaxCol;
    } else {
        area.rowFirst = 0;
        area.rowLast = kMaxRow;
        area.colFirst = first;
        area.colLast = last;
    }
    // Rows and columns share the one print-titles name: the other kind is kept beside.
    DefinedName* name = builtInName(kPrintTitles);
    std::vector<Area> areas;
    if (name) {
        for (const Area& existing : titleAreas(*name))
            if (rows ? isColumnTitle(existing) : isRowTitle(existing)) areas.push_back(existing);
    } else {
        name = &addBuiltInName(kPrintTitles);
    }
    // Columns come first, as spreadsheet programs write them.
    if (rows) areas.push_back(area);
    else areas.insert(areas.begin(), area);
    setTitleAreas(*name, areas);
}

bool SheetImplT::printTitle(bool rows, int* first, int* last) {
    DefinedName* name = builtInName(kPrintTitles);
    if (name) {
        for (const Area& a : titleAreas(*name)) {
            if (rows && isRowTitle(a)) {
                if (first) *first = a.rowFirst;
                if (last) *last = a.rowLast;
                return true;
            }
            if (!rows && isColumnTitle(a)) {
                if (first) *first = a.colFirst;
                if (last) *last = a.colLast;
                return true;
            }
        }
    }
    throw qrerror("not found");
}

void SheetImplT::setPrintRepeatRows(int rowFirst, int rowLast) {
    message().guardVoid([&] { setPrintTitle(true, rowFirst, rowLast); });
}

void SheetImplT::setPrintRepeatCols(int colFirst, int colLast) {
    message().guardVoid([&] { setPrintTitle(false, colFirst, colLast); });
}

bool SheetImplT::printRepeatRows(int* rowFirst, int* rowLast) {
    return message().guard(false, [&] { return printTitle(true, rowFirst, rowLast); });
}

bool SheetImplT::printRepeatCols(int* colFirst, int* colLast) {
    return message().guard(false, [&] { return printTitle(false, colFirst, colLast); });
}

void SheetImplT::clearPrintRepeats() {
    message().guardVoid([&] {
        uint16_t itab = static_cast<uint16_t>(ownIndex() + 1);
        auto& names = book_->names();
        for (size_t i = 0; i < names.size();) {
            if (names[i].itab == itab && names[i].isBuiltIn(kPrintTitles)) names.erase(names.begin() + static_cast<long>(i));
            else ++i;
        }
    });
}

bool SheetImplT::getNamedRange(const wchar_t* name, int* rowFirst, int* rowLast, int* colFirst,
                               int* colLast, int scopeId, bool* hidden) {
    return message().guard(false, [&] {
        if (!name) throw qrerror("named range is not found");
        for (const auto& defined : book_->names()) {
            Area3d area;
            if (listedText(defined) != name || !scopeMatches(defined, scopeId) ||
                !isNamedRangeOfThisSheet(defined, area))
                continue;
            writeBounds(area.rowFirst, area.rowLast, area.colFirst, area.colLast, rowFirst, rowLast, colFirst, colLast);
            if (hidden) *hidden = (defined.flags & DefinedName::kHidden) != 0;
            return true;
        }
        throw qrerror("named range is not found");
    });
}

bool SheetImplT::setNamedRange(const wchar_t* name, int rowFirst, int rowLast, int colFirst,
                               int colLast, int scopeId) {
    return message().guard(false, [&] {
        if (!name || !*name) throw qrerror("incorrect name");
        if (std::wcschr(name, L' ')) throw qrerror("space symbol isn't allowed");
        if (static_cast<unsigned>(rowFirst) > kMaxRow || static_cast<unsigned>(rowLast) > kMaxRow)
            throw qrerror("row must be in range 0-65535");
        if (static_cast<unsigned>(colFirst) > kMaxCol || static_cast<unsigned>(colLast) > kMaxCol)
            throw qrerror("col must be in range 0-255");
        if (scopeId >= static_cast<int>(book_->sheets().size())) throw qrerror("scope is out of range");
        for (auto& defined : book_->names()) {
            if (defined.builtIn() || defined.text != name || !scopeMatches(defined, scopeId)) continue;
            Area3d area;
            uint16_t xti = defined.area(area.xti, area.rowFirst, area.rowLast, area.colFirst, area.colLast) &&
                                   defined.rgce.size() == 11
                               ? area.xti
                               : ownExternSheet();
            defined.setArea(xti, rowFirst, rowLast, colFirst, colLast);
            return true;
        }
        DefinedName defined;
        defined.text = name;
        defined.itab = static_cast<uint16_t>(scopeId >= 0 ? scopeId + 1 : 0);
        defined.setArea(ownExternSheet(), rowFirst, rowLast, colFirst, colLast);
        book_->names().push_back(std::move(defined));
        return true;
    });
}

bool SheetImplT::delNamedRange(const wchar_t* name, int scopeId) {
    return message().guard(false, [&] {
        auto& names = book_->names();
        for (size_t i = 0; name && i < names.size(); ++i) {
            if (listedText(names[i]) == name && scopeMatches(names[i], scopeId)) {
                names.erase(names.begin() + static_cast<long>(i));
                return true;
            }
        }
        throw qrerror("named range is not found");
    });
}

int SheetImplT::namedRangeSize() {
    return message().guard(0, [&] {
        int count = 0;
        Area3d area;
        for (const auto& defined : book_->names())
            if (isNamedRangeOfThisSheet(defined, area)) ++count;
        return count;
    });
}

const wchar_t* SheetImplT::namedRange(int index, int* rowFirst, int* rowLast, int* colFirst,
                                      int* colLast, int* scopeId, bool* hidden) {
    return message().guard<const wchar_t*>(nullptr, [&]() -> const wchar_t* {
        int seen = 0;
        for (const auto& defined : book_->names()) {
            Area3d area;
            if (!isNamedRangeOfThisSheet(defined, area) || seen++ != index) continue;
            writeBounds(area.rowFirst, area.rowLast, area.colFirst, area.colLast, rowFirst, rowLast, colFirst, colLast);
            if (scopeId) *scopeId = defined.itab == 0 ? ScopeWorkbook : defined.itab - 1;
            if (hidden) *hidden = (defined.flags & DefinedName::kHidden) != 0;
            return returnString(listedText(defined));
        }
        throw qrerror("index is out of range");
    });
}

void SheetImplT::shiftNamedRanges(bool rows, int from, int count) {
    int own = book_->sheetIndexOf(this);
    for (auto& defined : book_->names()) {
        Area3d area;
        if (!defined.area(area.xti, area.rowFirst, area.rowLast, area.colFirst, area.colLast) ||
            book_->sheetOfExternSheet(area.xti) != own || defined.rgce.size() != 11)
            continue;
        int& first = rows ? area.rowFirst : area.colFirst;
        int& last = rows ? area.rowLast : area.colLast;
        int limit = rows ? kMaxRow : kMaxCol;
        if (count > 0) {
            if (first >= from) first = std::min(first + count, limit);
            if (last >= from) last = std::min(last + count, limit);
        } else {
            int removedLast = from - count - 1;
            if (first > removedLast) first += count;
            else if (first >= from) first = from;
            if (last > removedLast) last += count;
            else if (last >= from) last = from - 1;
            if (last < first) continue;  // the whole range went: it keeps its old place
        }
        defined.setArea(area.xti, area.rowFirst, area.rowLast, area.colFirst, area.colLast);
    }
}

}  // namespace quire
