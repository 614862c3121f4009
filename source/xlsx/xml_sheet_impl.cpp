#include "xlsx/xml_sheet_impl.h"

#include <algorithm>
#include <cctype>
#include <charconv>
#include <cmath>

#include "api/cell_address.h"
#include "api/digit_width.h"
#include "api/enums.h"
#include "api/number_formats.h"
#include "api/wide_text.h"
#include "ooxml/binding/sheet_data_scan.h"
#include "xlsx/cell_ref.h"
#include "xlsx/xml_font_impl.h"
#include "xlsx/xml_format_impl.h"
#include "xlsx/xml_formula_text.h"
#include "xlsx/xstring_escape.h"
#include "api/sheet_names.h"
#include "xlsx/xml_book_impl.h"

namespace quire {

template <class TCHAR, class Tag>
XMLSheetImplT<TCHAR, Tag>::XMLSheetImplT() : XmlFile<Worksheet>("worksheet") {}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::makeEmpty() {
    this->document().reset();
    this->document().get_sheetData();
    colStyles_.clear();
    usedStale_ = true;
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::readRows(const std::string& partName, const char* data, std::size_t size,
                                         int firstRow, int lastRow) {
    firstRowLimit_ = firstRow;
    lastRowLimit_ = lastRow;
    if (!readCellsDirectly(partName, data, size)) this->read(partName, data, size);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::readCellsDirectly(const std::string& partName, const char* data, std::size_t size) {
    // The cells are read straight from the bytes; the rest of the part, with sheetData left
    // empty, goes through the general reader.
    ooxml::sheet_data_span span;
    if (!ooxml::find_sheet_data(data, size, span)) return false;
    std::vector<Row> rows;
    ooxml::sheet_data_scanner<typename SheetData::types> scanner(span.prefix, firstRowLimit_, lastRowLimit_);
    const char* endTag = scanner.scan(span.content, data + size, rows);
    if (!endTag) return false;
    std::string rest(data, static_cast<std::size_t>(span.content - data));
    rest.append(endTag, static_cast<std::size_t>(data + size - endTag));
    try {
        this->read(partName, rest.data(), rest.size());
    } catch (const qrerror&) {
        // Read again whole, so that the message gives the line of the part itself.
        this->read(partName, data, size);
        return true;
    }
    SheetData* sheetData = this->document().find_sheetData();
    // A sheetData the general reader did not take as the worksheet's (another namespace).
    if (!sheetData || sheetData->size_row() != 0) {
        this->read(partName, data, size);
        return true;
    }
    sheetData->rows() = std::move(rows);
    usedStale_ = true;
    return true;
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::readRowsFromFile(const std::string& partName, const std::string& path, int firstRow,
                                                 int lastRow) {
    firstRowLimit_ = firstRow;
    lastRowLimit_ = lastRow;
    this->readFile(partName, path);
}

template <class TCHAR, class Tag>
lmx::elmx_error XMLSheetImplT<TCHAR, Tag>::unmarshalRoot(lmx::c_xml_reader& reader) {
    static const std::string name = "worksheet";
    const lmx::elmx_error result = this->document().unmarshal(reader, name, firstRowLimit_, lastRowLimit_);
    if (result == lmx::ELMX_OK) {
        readColumnStyles();
        usedStale_ = true;
    }
    return result;
}

template <class TCHAR, class Tag>
BookMessage& XMLSheetImplT<TCHAR, Tag>::message() {
    return book_ ? book_->message() : unboundMessage_;
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::indexInBook() {
    const int index = book_ ? book_->sheetIndexOf(this) : -1;
    if (index < 0) throw qrerror("sheet not found");
    return index;
}

template <class TCHAR, class Tag>
template <class Result>
Result XMLSheetImplT<TCHAR, Tag>::unsupported(Result failure) {
    // Cell, layout and settings operations of Open XML sheets are not built yet.
    return message().guard(failure, [&]() -> Result { throw qrerror("not supported yet"); });
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::unsupported() {
    message().guardVoid([] { throw qrerror("not supported yet"); });
}

// ---- Name and visibility: kept in the workbook's sheet element ----

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::name() {
    return message().guard(static_cast<const TCHAR*>(nullptr), [&]() -> const TCHAR* {
        stringResult_ = book_->sheetElement(indexInBook()).get_name();
        return stringResult_.c_str();
    });
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setName(const TCHAR* name) {
    message().guardVoid([&] {
        if (!name) throw qrerror("incorrect sheet name");
        const int index = indexInBook();
        bool cut = false;
        const std::wstring sheetName = fitSheetName(name, cut);
        if (!book_->sheetNameIsFree(sheetName, index)) throw qrerror("book already contains such sheet name");
        book_->sheetElement(index).set_name(sheetName);
        if (cut) message().set("warning: sheet's name is cut to 31 characters");
    });
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::hidden() {
    return message().guard(static_cast<int>(SheetStateVisible), [&]() -> int {
        const auto& sheet = book_->sheetElement(indexInBook());
        return sheet.isset_state() ? sheet.get_state() : SheetStateVisible;
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setHidden(int state) {
    return message().guard(false, [&]() -> bool {
        if (state < SheetStateVisible || state > SheetStateVeryHidden) throw qrerror("hidden is out of range");
        if (!book_) throw qrerror("sheet not found");
        const int index = book_->sheetIndexOf(this);
        if (index < 0) throw qrerror("index is out of range");
        auto& sheet = book_->sheetElement(index);
        const bool visible = !sheet.isset_state() || sheet.get_state() == SheetStateVisible;
        if (state != SheetStateVisible && visible && book_->visibleSheetCount() < 2)
            throw qrerror("a workbook must contain at least one visible worksheet");
        sheet.set_state(state);
        return true;
    });
}

// ---- The cell store: rows and cells in ascending order inside sheetData ----

namespace {

constexpr int kMaxRow = 1048575;
constexpr int kMaxCol = 16383;
// Cell types of the part, in the order of the element classes.
enum FileCellType { kTypeBool = 0, kTypeNumber = 1, kTypeError = 2, kTypeShared = 3, kTypeStr = 4, kTypeInline = 5 };
enum FileFormulaType { kFormulaNormal = 0, kFormulaArray = 1, kFormulaShared = 3 };

std::string_view numberText(double value, char (&buffer)[32]) {
    const auto result = std::to_chars(buffer, buffer + sizeof buffer, value, std::chars_format::general, 17);
    return std::string_view(buffer, static_cast<std::size_t>(result.ptr - buffer));
}

bool parseNumber(std::string_view narrow, double& value) {
    std::size_t begin = 0, end = narrow.size();
    while (begin < end && std::isspace(static_cast<unsigned char>(narrow[begin]))) ++begin;
    while (end > begin && std::isspace(static_cast<unsigned char>(narrow[end - 1]))) --end;
    if (begin < end && narrow[begin] == '+') ++begin;
    if (begin == end) return false;
    const auto result = std::from_chars(narrow.data() + begin, narrow.data() + end, value);
    return result.ec == std::errc() && result.ptr == narrow.data() + end;
}

const char* errorText(int code) {
    switch (code) {
    case ErrorTypeNull: return "#NULL!";
    case ErrorTypeDiv0: return "#DIV/0!";
    case ErrorTypeValue: return "#VALUE!";
    case ErrorTypeRef: return "#REF!";
    case ErrorTypeName: return "#NAME?";
    case ErrorTypeNum: return "#NUM!";
    case ErrorTypeNA: return "#N/A";
    default: return nullptr;
    }
}

int errorCode(std::string_view text) {
    for (int code : {ErrorTypeNull, ErrorTypeDiv0, ErrorTypeValue, ErrorTypeRef, ErrorTypeName, ErrorTypeNum, ErrorTypeNA})
        if (text == errorText(code)) return code;
    return ErrorTypeNoError;
}

void checkCell(int row, int col) {
    if (col < 0 || col > kMaxCol) throw qrerror("col must be in range 0-16383");
    if (row < 0 || row > kMaxRow) throw qrerror("row must be in range 0-1048575");
}

template <class Cell>
bool hasContent(const Cell& cell) {
    return cell.isset_v() || cell.isset_is() || cell.isset_f();
}

template <class Cell>
std::wstring inlineText(const Cell& cell) {
    const auto* is = cell.find_is();
    if (!is) return std::wstring();
    if (const auto* t = is->find_t()) return t->get_value();
    std::wstring text;
    for (std::size_t i = 0; i < is->size_r(); ++i)
        if (const auto* t = is->get_r(i).find_t()) text += t->get_value();
    return text;
}

}  // namespace

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::readColumnStyles() {
    colStyles_.assign(kMaxCol + 2, -1);
    auto& sheet = this->document();
    for (std::size_t i = 0; i < sheet.size_cols(); ++i) {
        const auto& cols = sheet.get_cols(i);
        for (std::size_t j = 0; j < cols.size_col(); ++j) {
            const auto& col = cols.get_col(j);
            if (!col.isset_style()) continue;
            const std::uint32_t last = std::min<std::uint32_t>(col.get_max(), kMaxCol + 1);
            for (std::uint32_t c = std::max<std::uint32_t>(col.get_min(), 1); c <= last; ++c)
                colStyles_[c - 1] = static_cast<int>(col.get_style());
        }
    }
}

template <class TCHAR, class Tag>
auto XMLSheetImplT<TCHAR, Tag>::findRow(int row) const -> Row* {
    // Lookups hand out cells the caller may change; the search itself changes nothing.
    auto* data = const_cast<Worksheet&>(this->document()).find_sheetData();
    if (!data || data->size_row() == 0) return nullptr;
    const auto wanted = static_cast<std::uint32_t>(row + 1);
    std::size_t low = 0, high = data->size_row();
    // Writers append: the last row answers most lookups at once. Readers go row after row:
    // the row found last, or the one after it, answers most of theirs.
    if (data->get_row(high - 1).get_r() == wanted) return &data->get_row(high - 1);
    for (std::size_t near = lastFoundRow_; near < lastFoundRow_ + 2 && near < high; ++near)
        if (data->get_row(near).get_r() == wanted) {
            lastFoundRow_ = near;
            return &data->get_row(near);
        }
    while (low < high) {
        const std::size_t mid = low + (high - low) / 2;
        if (data->get_row(mid).get_r() < wanted) low = mid + 1;
        else high = mid;
    }
    if (low >= data->size_row() || data->get_row(low).get_r() != wanted) return nullptr;
    lastFoundRow_ = low;
    return &data->get_row(low);
}

template <class TCHAR, class Tag>
auto XMLSheetImplT<TCHAR, Tag>::rowAt(int row) -> Row& {
    auto& data = this->document().get_sheetData();
    const auto wanted = static_cast<std::uint32_t>(row + 1);
    const std::size_t count = data.size_row();
    if (count == 0 || data.get_row(count - 1).get_r() < wanted) {
        // Rows written one after another tend to be as wide as the one before.
        const std::size_t width = count ? data.get_row(count - 1).size_c() : 0;
        Row& created = data.append_row();
        created.set_r(wanted);
        created.cells().reserve(width);
        return created;
    }
    // Writers fill a row cell by cell: its row is the last one.
    if (data.get_row(count - 1).get_r() == wanted) return data.get_row(count - 1);
    std::size_t low = 0, high = count;
    while (low < high) {
        const std::size_t mid = low + (high - low) / 2;
        if (data.get_row(mid).get_r() < wanted) low = mid + 1;
        else high = mid;
    }
    if (data.get_row(low).get_r() == wanted) return data.get_row(low);
    Row& created = data.insert_row(low);
    created.set_r(wanted);
    return created;
}

template <class TCHAR, class Tag>
auto XMLSheetImplT<TCHAR, Tag>::findCell(int row, int col) const -> Cell* {
    Row* found = findRow(row);
    if (!found || found->size_c() == 0) return nullptr;
    std::size_t low = 0, high = found->size_c();
    // A row without gaps holds column n at position n: one reference parsed instead of a search.
    if (static_cast<std::size_t>(col) < high && static_cast<int>(found->get_c(static_cast<std::size_t>(col)).col()) == col)
        return &found->get_c(static_cast<std::size_t>(col));
    if (static_cast<int>(found->get_c(high - 1).col()) == col) return &found->get_c(high - 1);
    while (low < high) {
        const std::size_t mid = low + (high - low) / 2;
        if (static_cast<int>(found->get_c(mid).col()) < col) low = mid + 1;
        else high = mid;
    }
    return low < found->size_c() && static_cast<int>(found->get_c(low).col()) == col ? &found->get_c(low) : nullptr;
}

template <class TCHAR, class Tag>
auto XMLSheetImplT<TCHAR, Tag>::cellAt(int row, int col, IFormatT<TCHAR>* format, bool reset) -> Cell& {
    checkCell(row, col);
    // The format is checked before anything changes.
    const int style = format ? book_->styles().formatIndex(format) : -1;
    Row& target = rowAt(row);
    Cell* cell = nullptr;
    bool created = false;
    const std::size_t count = target.size_c();
    const int lastCol = count ? static_cast<int>(target.get_c(count - 1).col()) : -1;
    if (count == 0 || lastCol < col) {
        cell = &target.append_c();
        created = true;
    } else if (lastCol == col) {
        cell = &target.get_c(count - 1);
    } else {
        std::size_t low = 0, high = count;
        while (low < high) {
            const std::size_t mid = low + (high - low) / 2;
            if (static_cast<int>(target.get_c(mid).col()) < col) low = mid + 1;
            else high = mid;
        }
        if (static_cast<int>(target.get_c(low).col()) == col) {
            cell = &target.get_c(low);
        } else {
            cell = &target.insert_c(low);
            created = true;
        }
    }
    if (created) cell->set_ref(static_cast<std::uint32_t>(row), static_cast<std::uint32_t>(col));
    if (style >= 0) {
        cell->set_s(static_cast<std::uint32_t>(style));
    } else if (created) {
        if (target.isset_s() && target.get_customFormat()) cell->set_s(target.get_s());
        else if (!colStyles_.empty() && colStyles_[static_cast<std::size_t>(col)] >= 0)
            cell->set_s(static_cast<std::uint32_t>(colStyles_[static_cast<std::size_t>(col)]));
    }
    if (reset) {
        cell->unset_t();
        cell->unset_v();
        cell->unset_f();
        cell->unset_is();
    }
    if (!usedStale_) {
        if (usedLastRow_ == 0) {
            usedFirstRow_ = row;
            usedFirstCol_ = col;
            usedLastRow_ = row + 1;
            usedLastCol_ = col + 1;
        } else {
            usedFirstRow_ = std::min(usedFirstRow_, row);
            usedFirstCol_ = std::min(usedFirstCol_, col);
            usedLastRow_ = std::max(usedLastRow_, row + 1);
            usedLastCol_ = std::max(usedLastCol_, col + 1);
        }
    }
    return *cell;
}

template <class TCHAR, class Tag>
auto XMLSheetImplT<TCHAR, Tag>::existingCell(int row, int col) const -> Cell& {
    Cell* cell = findCell(row, col);
    if (!cell) throw qrerror("cell is not found");
    return *cell;
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::returnFormat(const Cell& cell, IFormatT<TCHAR>** format) {
    if (!format) return;
    *format = nullptr;
    auto* styles = book_ ? book_->findStyles() : nullptr;
    if (!styles) return;
    const int index = static_cast<int>(cell.get_s());
    if (index < styles->formatCount()) {
        styles->setRgbMode(book_->rgbMode());
        book_->message().ok();
        *format = styles->format(index);
    }
}

// ---- Reading ----

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::cellType(int row, int col) {
    return message().guard(static_cast<int>(CellTypeEmpty), [&]() -> int {
        const Cell* cell = findCell(row, col);
        if (!cell) return CellTypeEmpty;
        if (!hasContent(*cell)) return cell->isset_s() ? CellTypeBlank : CellTypeEmpty;
        if (cell->isset_f() && !cell->isset_v() && !cell->isset_t()) return CellTypeNumber;
        switch (cell->get_t()) {
        case kTypeNumber: return CellTypeNumber;
        case kTypeShared:
        case kTypeStr:
        case kTypeInline: return CellTypeString;
        case kTypeBool: return CellTypeBoolean;
        case kTypeError: return CellTypeError;
        default: return CellTypeEmpty;
        }
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::isFormula(int row, int col) {
    return message().guard(false, [&]() -> bool {
        const Cell* cell = findCell(row, col);
        return cell && cell->isset_f();
    });
}

template <class TCHAR, class Tag>
IFormatT<TCHAR>* XMLSheetImplT<TCHAR, Tag>::cellFormat(int row, int col) {
    return message().guard(static_cast<IFormatT<TCHAR>*>(nullptr), [&]() -> IFormatT<TCHAR>* {
        const Cell& cell = existingCell(row, col);
        auto* styles = book_ ? book_->findStyles() : nullptr;
        if (!styles) throw qrerror("formats are not found");
        styles->setRgbMode(book_->rgbMode());
        return styles->format(static_cast<int>(cell.get_s()));
    });
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setCellFormat(int row, int col, IFormatT<TCHAR>* format) {
    message().guardVoid([&] {
        if (format) {
            cellAt(row, col, format, false);
        } else if (Cell* cell = findCell(row, col)) {
            cell->unset_s();
            usedStale_ = true;
        }
    });
}

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::readStr(int row, int col, IFormatT<TCHAR>** format) {
    return message().guard(static_cast<const TCHAR*>(nullptr), [&]() -> const TCHAR* {
        const Cell& cell = existingCell(row, col);
        const int type = cell.get_t();
        if (type == kTypeShared && cell.isset_v()) {
            auto* strings = book_ ? book_->findSharedStrings() : nullptr;
            if (!strings) throw qrerror("sharedStrings not found");
            if (cell.get_v().empty()) {
                stringResult_.clear();
            } else {
                double index = 0;
                if (!parseNumber(cell.get_v(), index) || !(index >= 0 && index < 2147483647.0))
                    throw qrerror("index is out of range or no value");
                strings->getInto(static_cast<int>(index), stringResult_);
                if (stringResult_.find(L"_x") != std::wstring::npos) stringResult_ = decodeXstring(stringResult_);
            }
        } else if (type == kTypeStr && cell.isset_v()) {
            stringResult_ = decodeXstring(fromUtf8(std::string(cell.get_v())));
        } else if (type == kTypeInline) {
            stringResult_ = decodeXstring(inlineText(cell));
        } else if (type == kTypeNumber && cell.isset_v()) {
            stringResult_ = fromUtf8(std::string(cell.get_v()));
        } else {
            throw qrerror("this cell doesn't contain a string");
        }
        returnFormat(cell, format);
        return stringResult_.c_str();
    });
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::readNum(int row, int col, IFormatT<TCHAR>** format) {
    return message().guard(0.0, [&]() -> double {
        const Cell& cell = existingCell(row, col);
        double value = 0;
        const int type = cell.get_t();
        if (!cell.isset_v() || (type != kTypeNumber && type != kTypeStr) || !parseNumber(cell.get_v(), value))
            throw qrerror("this cell doesn't contain a number");
        returnFormat(cell, format);
        return value;
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::readBool(int row, int col, IFormatT<TCHAR>** format) {
    return message().guard(false, [&]() -> bool {
        const Cell& cell = existingCell(row, col);
        if (cell.get_t() != kTypeBool || !cell.isset_v()) throw qrerror("this cell doesn't contain a bool");
        returnFormat(cell, format);
        const std::string_view v = cell.get_v();
        return v == "1" || v == "true";
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::readBlank(int row, int col, IFormatT<TCHAR>** format) {
    return message().guard(false, [&]() -> bool {
        const Cell& cell = existingCell(row, col);
        if (hasContent(cell)) throw qrerror("cell is not blank");
        returnFormat(cell, format);
        return true;
    });
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::readError(int row, int col) {
    return message().guard(static_cast<int>(ErrorTypeNoError), [&]() -> int {
        const Cell& cell = existingCell(row, col);
        if (cell.get_t() != kTypeError) throw qrerror("this cell doesn't contain an error");
        const int code = errorCode(cell.get_v());
        if (code == ErrorTypeNoError) message().set("unknown error value");
        return code;
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::isDate(int row, int col) {
    return message().guard(false, [&]() -> bool {
        const Cell* cell = findCell(row, col);
        if (!cell || !cell->isset_v() || cell->get_t() != kTypeNumber) return false;
        auto* styles = book_ ? book_->findStyles() : nullptr;
        if (!styles || static_cast<int>(cell->get_s()) >= styles->formatCount()) return false;
        const int id = styles->format(static_cast<int>(cell->get_s()))->numFormat();
        if (const std::wstring* text = styles->customNumFormat(id)) return isDateFormatText(text->c_str());
        return classifyNumFormatId(id) == DateIdKind::Date;
    });
}

// ---- Writing ----

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::writeNum(int row, int col, double value, IFormatT<TCHAR>* format) {
    return message().guard(false, [&]() -> bool {
        Cell& cell = cellAt(row, col, format, true);
        char buffer[32];
        cell.set_v(numberText(value, buffer));
        return true;
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::writeStr(int row, int col, const TCHAR* value, IFormatT<TCHAR>* format, int stringKind) {
    return message().guard(false, [&]() -> bool {
        if (!value) throw qrerror("value can't be 0");
        checkCell(row, col);
        if (stringKind == 2) {
            // The entry is made first: a refused text leaves the cell as it was.
            if (!book_) {
                cellAt(row, col, format, true);
                return true;
            }
            const int index = book_->sharedStrings().add(value);
            Cell& cell = cellAt(row, col, format, true);
            cell.set_t(kTypeShared);
            cell.set_v(std::to_string(index));
        } else if (stringKind == 1) {
            cellAt(row, col, format, true).set_v(toUtf8(std::wstring(value)));
        } else {
            cellAt(row, col, format, true);
        }
        return true;
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::writeBool(int row, int col, bool value, IFormatT<TCHAR>* format, int errorCode) {
    return message().guard(false, [&]() -> bool {
        const char* error = errorCode == ErrorTypeNoError ? nullptr : errorText(errorCode);
        if (errorCode != ErrorTypeNoError && !error) throw qrerror("unknown error value");
        Cell& cell = cellAt(row, col, format, true);
        if (error) {
            cell.set_t(kTypeError);
            cell.set_v(error);
        } else {
            cell.set_t(kTypeBool);
            cell.set_v(value ? "1" : "0");
        }
        return true;
    });
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::writeError(int row, int col, int error, IFormatT<TCHAR>* format) {
    writeBool(row, col, false, format, error);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::writeBlank(int row, int col, IFormatT<TCHAR>* format) {
    return message().guard(false, [&]() -> bool {
        cellAt(row, col, format, true);
        return true;
    });
}

// ---- Formulas ----

template <class TCHAR, class Tag>
auto XMLSheetImplT<TCHAR, Tag>::sharedMaster(const Cell& cell, int& masterRow, int& masterCol) const -> const Cell* {
    const auto* f = cell.find_f();
    if (!f || f->get_t() != kFormulaShared || !f->isset_si()) return nullptr;
    const auto* data = this->document().find_sheetData();
    if (!data) return nullptr;
    for (std::size_t i = 0; i < data->size_row(); ++i) {
        const Row& row = data->get_row(i);
        for (std::size_t j = 0; j < row.size_c(); ++j) {
            const Cell& candidate = row.get_c(j);
            const auto* cf = candidate.find_f();
            if (cf && cf->get_t() == kFormulaShared && cf->isset_si() && cf->get_si() == f->get_si() && cf->isset_ref()) {
                masterRow = static_cast<int>(candidate.row());
                masterCol = static_cast<int>(candidate.col());
                return &candidate;
            }
        }
    }
    return nullptr;
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::expandSharedFormula(Cell& master, int row, int col) {
    auto* f = master.find_f();
    if (!f || f->get_t() != kFormulaShared || !f->isset_ref() || !f->isset_si()) return;
    const std::uint32_t si = f->get_si();
    const std::wstring text = f->get_value();
    int rowFirst = 0, rowLast = 0, colFirst = 0, colLast = 0;
    if (!parseRangeRef(f->get_ref(), rowFirst, rowLast, colFirst, colLast)) return;
    for (int r = rowFirst; r <= rowLast; ++r) {
        for (int c = colFirst; c <= colLast; ++c) {
            Cell* cell = findCell(r, c);
            if (!cell) continue;
            auto* cf = cell->find_f();
            if (!cf || cf->get_t() != kFormulaShared || !cf->isset_si() || cf->get_si() != si) continue;
            const std::wstring moved = shiftFormula(text, r - row, c - col);
            cf->reset();
            cf->set_value(moved);
        }
    }
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::writeFormulaValue(int row, int col, const TCHAR* expr, IFormatT<TCHAR>* format,
                                                  int kind, double number, const TCHAR* text, bool flag) {
    return message().guard(false, [&]() -> bool {
        if (!expr) throw qrerror("formula can't be 0");
        checkCell(row, col);
        if (kind == 2 && !text) throw qrerror("value can't be 0");
        if (Cell* existing = findCell(row, col)) expandSharedFormula(*existing, row, col);
        const wchar_t separator = book_ ? book_->listSeparator() : L',';
        const FileFormula formula = formulaToFile(expr, book_ && book_->usesR1C1(), separator, row, col);
        Cell& cell = cellAt(row, col, format, true);
        auto& f = cell.get_f();
        if (formula.array) {
            f.set_t(kFormulaArray);
            f.set_ref(cellRef(row, col));
        }
        f.set_value(formula.text);
        switch (kind) {
        case 1: {
            char buffer[32];
            cell.set_v(numberText(number, buffer));
            break;
        }
        case 2:
            cell.set_t(kTypeStr);
            cell.set_v(toUtf8(encodeXstring(text)));
            break;
        case 3:
            cell.set_t(kTypeBool);
            cell.set_v(flag ? "1" : "0");
            break;
        default: break;
        }
        return true;
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::writeFormula(int row, int col, const TCHAR* expr, IFormatT<TCHAR>* format) {
    return writeFormulaValue(row, col, expr, format, 0, 0, nullptr, false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::writeFormulaNum(int row, int col, const TCHAR* expr, double value, IFormatT<TCHAR>* format) {
    return writeFormulaValue(row, col, expr, format, 1, value, nullptr, false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::writeFormulaStr(int row, int col, const TCHAR* expr, const TCHAR* value, IFormatT<TCHAR>* format) {
    return writeFormulaValue(row, col, expr, format, 2, 0, value, false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::writeFormulaBool(int row, int col, const TCHAR* expr, bool value, IFormatT<TCHAR>* format) {
    return writeFormulaValue(row, col, expr, format, 3, 0, nullptr, value);
}

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::readFormula(int row, int col, IFormatT<TCHAR>** format) {
    return message().guard(static_cast<const TCHAR*>(nullptr), [&]() -> const TCHAR* {
        const Cell& cell = existingCell(row, col);
        const auto* f = cell.find_f();
        if (!f) throw qrerror("this cell doesn't contain a formula");
        std::wstring text = f->get_value();
        int masterRow = 0, masterCol = 0;
        if (text.empty()) {
            if (const Cell* master = sharedMaster(cell, masterRow, masterCol))
                text = shiftFormula(master->find_f()->get_value(), row - masterRow, col - masterCol);
        }
        const wchar_t separator = book_ ? book_->listSeparator() : L',';
        stringResult_ = formulaFromFile(text, book_ && book_->usesR1C1(), separator, row, col);
        returnFormat(cell, format);
        return stringResult_.c_str();
    });
}

// ---- Used range ----

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::refreshUsedRange() {
    if (!usedStale_) return;
    usedFirstRow_ = usedLastRow_ = usedFirstCol_ = usedLastCol_ = 0;
    bool any = false;
    if (const auto* data = this->document().find_sheetData()) {
        for (std::size_t i = 0; i < data->size_row(); ++i) {
            const Row& row = data->get_row(i);
            const int r = static_cast<int>(row.get_r()) - 1;
            for (std::size_t j = 0; j < row.size_c(); ++j) {
                const Cell& cell = row.get_c(j);
                if (!hasContent(cell) && !cell.isset_s()) continue;
                const int c = static_cast<int>(cell.col());
                if (c < 0) continue;
                if (!any) {
                    usedFirstRow_ = r;
                    usedFirstCol_ = c;
                    usedLastRow_ = r + 1;
                    usedLastCol_ = c + 1;
                    any = true;
                } else {
                    usedFirstRow_ = std::min(usedFirstRow_, r);
                    usedFirstCol_ = std::min(usedFirstCol_, c);
                    usedLastRow_ = std::max(usedLastRow_, r + 1);
                    usedLastCol_ = std::max(usedLastCol_, c + 1);
                }
            }
        }
    }
    usedStale_ = false;
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::firstRow() {
    message().ok();
    refreshUsedRange();
    return usedFirstRow_;
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::lastRow() {
    message().ok();
    refreshUsedRange();
    return usedLastRow_;
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::firstCol() {
    message().ok();
    refreshUsedRange();
    return usedFirstCol_;
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::lastCol() {
    message().ok();
    refreshUsedRange();
    return usedLastCol_;
}

// ---- Rows ----

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setRow(int row, double height, IFormatT<TCHAR>* format, bool hidden) {
    return message().guard(false, [&]() -> bool {
        if (row < 0 || row > kMaxRow) throw qrerror("row must be in range 0-1048575");
        const int style = format ? book_->styles().formatIndex(format) : -1;
        Row& target = rowAt(row);
        if (height > 0) {
            target.set_ht(height);
            target.set_customHeight(true);
        }
        if (style >= 0) {
            target.set_s(static_cast<std::uint32_t>(style));
            target.set_customFormat(true);
        }
        if (hidden) target.set_hidden(true);
        else target.unset_hidden();
        return true;
    });
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::rowHeight(int row) {
    return message().guard(0.0, [&]() -> double {
        if (const Row* found = findRow(row))
            if (found->isset_ht()) return found->get_ht();
        const auto* format = this->document().find_sheetFormatPr();
        return format ? format->get_defaultRowHeight() : 15.0;
    });
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::rowHeightPx(int row) {
    return message().guard(0, [&]() -> int {
        const Row* found = findRow(row);
        const auto* format = this->document().find_sheetFormatPr();
        double points = 0;
        if (found && found->isset_ht()) points = found->get_ht();
        else if (format) points = format->get_defaultRowHeight();
        else return 20;
        return static_cast<int>(points * 96.0 / 72.0);
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::rowHidden(int row) {
    return message().guard(false, [&]() -> bool {
        const Row* found = findRow(row);
        return found && found->get_hidden();
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setRowHidden(int row, bool hidden) {
    return message().guard(false, [&]() -> bool {
        if (row < 0 || row > kMaxRow) throw qrerror("row must be in range 0-1048575");
        Row& target = rowAt(row);
        if (hidden) target.set_hidden(true);
        else target.unset_hidden();
        return true;
    });
}

// ---- Columns ----

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::maxDigitWidth() const {
    constexpr int kWithoutFont = 7;
    auto* styles = book_ ? book_->findStyles() : nullptr;
    if (!styles || styles->fontCount() == 0) return kWithoutFont;
    auto* font = styles->font(0);
    const TCHAR* name = font->name();
    const int measured = name ? measureMaxDigitWidth(name, font->size() * 96.0 / 72.0) : 0;
    return measured > 0 ? measured : kWithoutFont;
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::columnPadding() const {
    const int mdw = maxDigitWidth();
    return mdw < 13 ? 8 : ((mdw - 13) / 16) * 8 + 16;
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::colWidthPx(int col) {
    return message().guard(0, [&]() -> int {
        const int mdw = maxDigitWidth();
        auto pixels = [&](double width) {
            return static_cast<int>(std::floor((width * 256 + std::floor(128.0 / mdw)) / 256 * mdw));
        };
        auto& sheet = this->document();
        for (std::size_t i = 0; i < sheet.size_cols(); ++i) {
            const auto& cols = sheet.get_cols(i);
            for (std::size_t j = 0; j < cols.size_col(); ++j) {
                const auto& element = cols.get_col(j);
                if (static_cast<int>(element.get_min()) <= col + 1 && col + 1 <= static_cast<int>(element.get_max()) &&
                    element.isset_width())
                    return pixels(element.get_width());
            }
        }
        const auto* format = sheet.find_sheetFormatPr();
        if (format && format->isset_defaultColWidth()) return pixels(format->get_defaultColWidth());
        const int base = format && format->isset_baseColWidth() ? static_cast<int>(format->get_baseColWidth()) : 8;
        return base * mdw + columnPadding();
    });
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::colWidth(int col) {
    const int px = colWidthPx(col);
    if (message().text() != "ok") return 0.0;
    const int mdw = maxDigitWidth();
    const int padding = columnPadding();
    const double width = px >= padding + mdw - 3 ? static_cast<double>(px - padding + 3) / mdw
                                                 : static_cast<double>(px) / (padding + mdw - 3);
    return std::floor(width * 100 + 0.5) / 100;
}

template <class TCHAR, class Tag>
template <class Cols>
void XMLSheetImplT<TCHAR, Tag>::setColRange(Cols& cols, int first, int last, double width, int style, bool hidden) {
    const auto min = static_cast<std::uint32_t>(first + 1), max = static_cast<std::uint32_t>(last + 1);
    // Cut every overlapping element so that the new range stands alone.
    for (std::size_t i = 0; i < cols.size_col();) {
        auto& element = cols.get_col(i);
        if (element.get_max() < min || element.get_min() > max) {
            ++i;
            continue;
        }
        const auto copy = element;
        cols.delete_col(i);
        if (copy.get_max() > max) {
            auto& right = cols.insert_col(i);
            right = copy;
            right.set_min(max + 1);
        }
        if (copy.get_min() < min) {
            auto& left = cols.insert_col(i);
            left = copy;
            left.set_max(min - 1);
            ++i;
        }
        if (copy.get_max() > max) ++i;
    }
    std::size_t at = 0;
    while (at < cols.size_col() && cols.get_col(at).get_min() < min) ++at;
    auto& created = cols.insert_col(at);
    created.set_min(min);
    created.set_max(max);
    // A column element without a width is read as width 0 by some programs.
    created.set_width(width >= 0 ? width : 8.43);
    if (width >= 0) created.set_customWidth(true);
    if (style >= 0) created.set_style(static_cast<std::uint32_t>(style));
    if (hidden) created.set_hidden(true);
    if (colStyles_.empty()) colStyles_.assign(kMaxCol + 2, -1);
    for (int c = first; c <= last; ++c) colStyles_[static_cast<std::size_t>(c)] = style;
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setCol(int colFirst, int colLast, double width, IFormatT<TCHAR>* format, bool hidden) {
    return message().guard(false, [&]() -> bool {
        if (colFirst < 0 || colFirst > kMaxCol || colLast < 0 || colLast > kMaxCol)
            throw qrerror("col must be in range 0-16383");
        if (colLast < colFirst) throw qrerror("colLast must be greater than or equal to colFirst");
        const int style = format ? book_->styles().formatIndex(format) : -1;
        auto& sheet = this->document();
        auto& cols = sheet.size_cols() ? sheet.get_cols(0) : sheet.append_cols();
        setColRange(cols, colFirst, colLast, width, style, hidden);
        return true;
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::colHidden(int col) {
    return message().guard(false, [&]() -> bool {
        auto& sheet = this->document();
        for (std::size_t i = 0; i < sheet.size_cols(); ++i) {
            const auto& cols = sheet.get_cols(i);
            for (std::size_t j = 0; j < cols.size_col(); ++j) {
                const auto& element = cols.get_col(j);
                if (static_cast<int>(element.get_min()) <= col + 1 && col + 1 <= static_cast<int>(element.get_max()))
                    return element.get_hidden();
            }
        }
        return false;
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setColHidden(int col, bool hidden) {
    return message().guard(false, [&]() -> bool {
        if (col < 0 || col > kMaxCol) throw qrerror("col must be in range 0-16383");
        auto& sheet = this->document();
        auto& cols = sheet.size_cols() ? sheet.get_cols(0) : sheet.append_cols();
        for (std::size_t j = 0; j < cols.size_col(); ++j) {
            auto& element = cols.get_col(j);
            if (static_cast<int>(element.get_min()) <= col + 1 && col + 1 <= static_cast<int>(element.get_max())) {
                const double width = element.isset_width() && element.get_customWidth() ? element.get_width() : -1;
                const int style = element.isset_style() ? static_cast<int>(element.get_style()) : -1;
                setColRange(cols, col, col, width, style, hidden);
                return true;
            }
        }
        setColRange(cols, col, col, -1, -1, hidden);
        return true;
    });
}

// ---- Merged cells ----

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setMerge(int rowFirst, int rowLast, int colFirst, int colLast) {
    return message().guard(false, [&]() -> bool {
        if (colFirst > kMaxCol || colLast > kMaxCol) throw qrerror("col must be less than 16384");
        if (rowFirst < 0 || colFirst < 0 || rowLast > kMaxRow) throw qrerror("row must be in range 0-1048575");
        if (rowLast < rowFirst) throw qrerror("rowLast must be greater than or equal to rowFirst");
        if (colLast < colFirst) throw qrerror("colLast must be greater than or equal to colFirst");
        auto& merges = this->document().get_mergeCells();
        merges.append_mergeCell().set_ref(rangeRef(rowFirst, rowLast, colFirst, colLast));
        merges.set_count(static_cast<std::uint32_t>(merges.size_mergeCell()));
        if (const Cell* topLeft = findCell(rowFirst, colFirst)) {
            if (topLeft->isset_s()) {
                const std::uint32_t style = topLeft->get_s();
                for (int r = rowFirst; r <= rowLast; ++r)
                    for (int c = colFirst; c <= colLast; ++c)
                        if (r != rowFirst || c != colFirst) cellAt(r, c, nullptr, false).set_s(style);
            }
        }
        return true;
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::getMerge(int row, int col, int* rowFirst, int* rowLast, int* colFirst, int* colLast) {
    return message().guard(false, [&]() -> bool {
        if (const auto* merges = this->document().find_mergeCells()) {
            for (std::size_t i = 0; i < merges->size_mergeCell(); ++i) {
                int r1 = 0, r2 = 0, c1 = 0, c2 = 0;
                if (!parseRangeRef(merges->get_mergeCell(i).get_ref(), r1, r2, c1, c2)) continue;
                if (r1 <= row && row <= r2 && c1 <= col && col <= c2) {
                    if (rowFirst) *rowFirst = r1;
                    if (rowLast) *rowLast = r2;
                    if (colFirst) *colFirst = c1;
                    if (colLast) *colLast = c2;
                    return true;
                }
            }
        }
        throw qrerror("this cell isn't in merging block");
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::delMerge(int row, int col) {
    return message().guard(false, [&]() -> bool {
        if (auto* merges = this->document().find_mergeCells()) {
            for (std::size_t i = 0; i < merges->size_mergeCell(); ++i) {
                int r1 = 0, r2 = 0, c1 = 0, c2 = 0;
                if (!parseRangeRef(merges->get_mergeCell(i).get_ref(), r1, r2, c1, c2)) continue;
                if (r1 <= row && row <= r2 && c1 <= col && col <= c2) {
                    merges->delete_mergeCell(i);
                    merges->set_count(static_cast<std::uint32_t>(merges->size_mergeCell()));
                    if (merges->size_mergeCell() == 0) this->document().unset_mergeCells();
                    return true;
                }
            }
        }
        throw qrerror("this cell isn't in merging block");
    });
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::mergeSize() {
    message().ok();
    const auto* merges = this->document().find_mergeCells();
    return merges ? static_cast<int>(merges->size_mergeCell()) : 0;
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::merge(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast) {
    return message().guard(false, [&]() -> bool {
        const auto* merges = this->document().find_mergeCells();
        if (!merges || index < 0 || static_cast<std::size_t>(index) >= merges->size_mergeCell())
            throw qrerror("index is out of range");
        int r1 = 0, r2 = 0, c1 = 0, c2 = 0;
        if (!parseRangeRef(merges->get_mergeCell(static_cast<std::size_t>(index)).get_ref(), r1, r2, c1, c2))
            throw qrerror("index is out of range");
        if (rowFirst) *rowFirst = r1;
        if (rowLast) *rowLast = r2;
        if (colFirst) *colFirst = c1;
        if (colLast) *colLast = c2;
        return true;
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::delMergeByIndex(int index) {
    return message().guard(false, [&]() -> bool {
        auto* merges = this->document().find_mergeCells();
        if (!merges || index < 0 || static_cast<std::size_t>(index) >= merges->size_mergeCell())
            throw qrerror("index is out of range");
        merges->delete_mergeCell(static_cast<std::size_t>(index));
        merges->set_count(static_cast<std::uint32_t>(merges->size_mergeCell()));
        if (merges->size_mergeCell() == 0) this->document().unset_mergeCells();
        return true;
    });
}

// ---- Clearing, inserting and removing ----

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::clear(int rowFirst, int rowLast, int colFirst, int colLast) {
    message().guardVoid([&] {
        if (colFirst > kMaxCol || colLast > kMaxCol) throw qrerror("col must be less than 16384");
        if (rowLast < rowFirst) throw qrerror("rowLast must be greater than or equal to rowFirst");
        if (colLast < colFirst) throw qrerror("colLast must be greater than or equal to colFirst");
        auto& data = this->document().get_sheetData();
        if (rowFirst <= 0 && rowLast >= kMaxRow && colFirst <= 0 && colLast >= kMaxCol) {
            data.clear_row();
        } else {
            for (std::size_t i = 0; i < data.size_row(); ++i) {
                Row& row = data.get_row(i);
                const int r = static_cast<int>(row.get_r()) - 1;
                if (r < rowFirst || r > rowLast) continue;
                for (std::size_t j = row.size_c(); j-- > 0;) {
                    const int c = static_cast<int>(row.get_c(j).col());
                    if (c >= colFirst && c <= colLast) row.delete_c(j);
                }
            }
        }
        if (auto* merges = this->document().find_mergeCells()) {
            for (std::size_t i = merges->size_mergeCell(); i-- > 0;) {
                int r1 = 0, r2 = 0, c1 = 0, c2 = 0;
                if (!parseRangeRef(merges->get_mergeCell(i).get_ref(), r1, r2, c1, c2)) continue;
                if (r1 <= rowLast && r2 >= rowFirst && c1 <= colLast && c2 >= colFirst) merges->delete_mergeCell(i);
            }
            merges->set_count(static_cast<std::uint32_t>(merges->size_mergeCell()));
            if (merges->size_mergeCell() == 0) this->document().unset_mergeCells();
        }
        usedStale_ = true;
    });
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::moveRows(int rowFirst, int count) {
    // count > 0 inserts `count` rows before rowFirst; count < 0 removes -count rows from rowFirst.
    auto& data = this->document().get_sheetData();
    const int removedLast = count < 0 ? rowFirst - count - 1 : -1;
    for (std::size_t i = data.size_row(); i-- > 0;) {
        Row& row = data.get_row(i);
        const int r = static_cast<int>(row.get_r()) - 1;
        if (count < 0 && r >= rowFirst && r <= removedLast) {
            data.delete_row(i);
            continue;
        }
        if (r < rowFirst) continue;
        const int moved = r + count;
        if (moved > kMaxRow) {
            data.delete_row(i);
            continue;
        }
        row.set_r(static_cast<std::uint32_t>(moved + 1));
        for (std::size_t j = 0; j < row.size_c(); ++j) {
            Cell& cell = row.get_c(j);
            cell.move_to_row(static_cast<std::uint32_t>(moved));
        }
    }
    if (auto* merges = this->document().find_mergeCells()) {
        for (std::size_t i = merges->size_mergeCell(); i-- > 0;) {
            int r1 = 0, r2 = 0, c1 = 0, c2 = 0;
            auto& merge = merges->get_mergeCell(i);
            if (!parseRangeRef(merge.get_ref(), r1, r2, c1, c2)) continue;
            if (count > 0) {
                if (r1 >= rowFirst) r1 += count;
                if (r2 >= rowFirst) r2 += count;
            } else {
                const int removed = -count;
                auto shift = [&](int r) { return r > removedLast ? r - removed : (r >= rowFirst ? rowFirst : r); };
                if (r1 >= rowFirst && r2 <= removedLast) {
                    merges->delete_mergeCell(i);
                    continue;
                }
                r1 = shift(r1);
                r2 = r2 > removedLast ? r2 - removed : (r2 >= rowFirst ? rowFirst - 1 : r2);
                if (r2 < r1) {
                    merges->delete_mergeCell(i);
                    continue;
                }
            }
            if (r2 > kMaxRow) r2 = kMaxRow;
            if (r1 > kMaxRow) {
                merges->delete_mergeCell(i);
                continue;
            }
            merge.set_ref(rangeRef(r1, r2, c1, c2));
        }
        merges->set_count(static_cast<std::uint32_t>(merges->size_mergeCell()));
        if (merges->size_mergeCell() == 0) this->document().unset_mergeCells();
    }
    usedStale_ = true;
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::moveCols(int colFirst, int count) {
    auto& data = this->document().get_sheetData();
    const int removedLast = count < 0 ? colFirst - count - 1 : -1;
    for (std::size_t i = 0; i < data.size_row(); ++i) {
        Row& row = data.get_row(i);
        const int r = static_cast<int>(row.get_r()) - 1;
        for (std::size_t j = row.size_c(); j-- > 0;) {
            Cell& cell = row.get_c(j);
            const int c = static_cast<int>(cell.col());
            if (count < 0 && c >= colFirst && c <= removedLast) {
                row.delete_c(j);
                continue;
            }
            if (c < colFirst) continue;
            const int moved = c + count;
            if (moved > kMaxCol) {
                row.delete_c(j);
                continue;
            }
            cell.set_ref(static_cast<std::uint32_t>(r), static_cast<std::uint32_t>(moved));
        }
    }
    if (auto* merges = this->document().find_mergeCells()) {
        for (std::size_t i = merges->size_mergeCell(); i-- > 0;) {
            int r1 = 0, r2 = 0, c1 = 0, c2 = 0;
            auto& merge = merges->get_mergeCell(i);
            if (!parseRangeRef(merge.get_ref(), r1, r2, c1, c2)) continue;
            if (count > 0) {
                if (c1 >= colFirst) c1 += count;
                if (c2 >= colFirst) c2 += count;
            } else {
                const int removed = -count;
                if (c1 >= colFirst && c2 <= removedLast) {
                    merges->delete_mergeCell(i);
                    continue;
                }
                c1 = c1 > removedLast ? c1 - removed : (c1 >= colFirst ? colFirst : c1);
                c2 = c2 > removedLast ? c2 - removed : (c2 >= colFirst ? colFirst - 1 : c2);
                if (c2 < c1) {
                    merges->delete_mergeCell(i);
                    continue;
                }
            }
            if (c1 > kMaxCol) {
                merges->delete_mergeCell(i);
                continue;
            }
            merge.set_ref(rangeRef(r1, r2, c1, std::min(c2, kMaxCol)));
        }
        merges->set_count(static_cast<std::uint32_t>(merges->size_mergeCell()));
        if (merges->size_mergeCell() == 0) this->document().unset_mergeCells();
    }
    usedStale_ = true;
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::insertRow(int rowFirst, int rowLast, bool) {
    return message().guard(false, [&]() -> bool {
        if (rowLast - rowFirst + 1 < 1) throw qrerror("rowLast must be greater than or equal to rowFirst");
        if (rowFirst < 0 || rowLast > kMaxRow) throw qrerror("row must be in range 0-1048575");
        moveRows(rowFirst, rowLast - rowFirst + 1);
        return true;
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::removeRow(int rowFirst, int rowLast, bool) {
    return message().guard(false, [&]() -> bool {
        if (rowLast - rowFirst + 1 < 1) throw qrerror("rowLast must be greater than or equal to rowFirst");
        if (rowFirst < 0 || rowLast > kMaxRow) throw qrerror("row must be in range 0-1048575");
        moveRows(rowFirst, -(rowLast - rowFirst + 1));
        return true;
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::insertCol(int colFirst, int colLast, bool) {
    return message().guard(false, [&]() -> bool {
        if (colLast - colFirst + 1 < 1) throw qrerror("colLast must be greater than or equal to colFirst");
        if (colFirst < 0 || colLast > kMaxCol) throw qrerror("col must be in range 0-16383");
        moveCols(colFirst, colLast - colFirst + 1);
        return true;
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::removeCol(int colFirst, int colLast, bool) {
    return message().guard(false, [&]() -> bool {
        if (colLast - colFirst + 1 < 1) throw qrerror("colLast must be greater than or equal to colFirst");
        if (colFirst < 0 || colLast > kMaxCol) throw qrerror("col must be in range 0-16383");
        moveCols(colFirst, -(colLast - colFirst + 1));
        return true;
    });
}

// ---- Everything else waits for its engine ----

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::readComment(int row, int col) {
    return unsupported<const TCHAR*>(nullptr);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::writeComment(int row, int col, const TCHAR* value, const TCHAR* author, int width, int height) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::removeComment(int row, int col) {
    unsupported();
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::pictureSize() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::getPicture(int index, int* rowTop, int* colLeft, int* rowBottom, int* colRight, int* width, int* height, int* offset_x, int* offset_y, int reserved) {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPicture(int row, int col, int pictureId, double scale, int offset_x, int offset_y, int position) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPicture2(int row, int col, int pictureId, int width, int height, int offset_x, int offset_y, int position) {
    unsupported();
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::getHorPageBreak(int index) {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::getHorPageBreakSize() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::getVerPageBreak(int index) {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::getVerPageBreakSize() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setHorPageBreak(int row, bool pageBreak) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setVerPageBreak(int col, bool pageBreak) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::split(int row, int col) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::splitInfo(int* row, int* col) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::groupRows(int rowFirst, int rowLast, bool collapsed) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::groupCols(int colFirst, int colLast, bool collapsed) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::groupSummaryBelow() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setGroupSummaryBelow(bool below) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::groupSummaryRight() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setGroupSummaryRight(bool right) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::copyCell(int rowSrc, int colSrc, int rowDst, int colDst) {
    return message().guard(false, [&]() -> bool {
        checkCell(rowSrc, colSrc);
        checkCell(rowDst, colDst);
        const Cell* source = findCell(rowSrc, colSrc);
        if (!source) throw qrerror("empty cell");
        if (rowSrc == rowDst && colSrc == colDst) return true;
        // A copy first: making the destination may move the source within its row.
        Cell copy = *source;
        if (auto* f = copy.find_f()) {
            // The copy of a shared formula's cell stands on its own: its text as the source reads
            // it; an array formula covers the copy alone.
            std::wstring text = f->get_value();
            int masterRow = 0, masterCol = 0;
            if (f->get_t() == kFormulaShared) {
                if (text.empty())
                    if (const Cell* master = sharedMaster(*source, masterRow, masterCol))
                        text = shiftFormula(master->find_f()->get_value(), rowSrc - masterRow, colSrc - masterCol);
                f->reset();
                f->set_value(text);
            } else if (f->get_t() == kFormulaArray) {
                f->set_ref(cellRef(rowDst, colDst));
            }
        }
        if (Cell* existing = findCell(rowDst, colDst)) expandSharedFormula(*existing, rowDst, colDst);
        Cell& target = cellAt(rowDst, colDst, nullptr, true);
        target = std::move(copy);
        target.set_ref(static_cast<std::uint32_t>(rowDst), static_cast<std::uint32_t>(colDst));
        return true;
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::displayGridlines() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setDisplayGridlines(bool show) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::printGridlines() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPrintGridlines(bool print) {
    unsupported();
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::zoom() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setZoom(int zoom) {
    unsupported();
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::printZoom() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPrintZoom(int zoom) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::getPrintFit(int* wPages, int* hPages) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPrintFit(int wPages, int hPages) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::landscape() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setLandscape(bool landscape) {
    unsupported();
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::paper() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPaper(int paper) {
    unsupported();
}

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::header() {
    return unsupported<const TCHAR*>(nullptr);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setHeader(const TCHAR* header, double margin) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::headerMargin() {
    return unsupported<double>(0.0);
}

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::footer() {
    return unsupported<const TCHAR*>(nullptr);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setFooter(const TCHAR* footer, double margin) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::footerMargin() {
    return unsupported<double>(0.0);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::hCenter() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setHCenter(bool hCenter) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::vCenter() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setVCenter(bool vCenter) {
    unsupported();
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::marginLeft() {
    return unsupported<double>(0.0);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setMarginLeft(double margin) {
    unsupported();
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::marginRight() {
    return unsupported<double>(0.0);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setMarginRight(double margin) {
    unsupported();
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::marginTop() {
    return unsupported<double>(0.0);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setMarginTop(double margin) {
    unsupported();
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::marginBottom() {
    return unsupported<double>(0.0);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setMarginBottom(double margin) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::printRowCol() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPrintRowCol(bool print) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::printRepeatRows(int* rowFirst, int* rowLast) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPrintRepeatRows(int rowFirst, int rowLast) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::printRepeatCols(int* colFirst, int* colLast) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPrintRepeatCols(int colFirst, int colLast) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::printArea(int* rowFirst, int* rowLast, int* colFirst, int* colLast) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPrintArea(int rowFirst, int rowLast, int colFirst, int colLast) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::clearPrintRepeats() {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::clearPrintArea() {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::getNamedRange(const TCHAR* name, int* rowFirst, int* rowLast, int* colFirst, int* colLast, int scopeId, bool* hidden) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setNamedRange(const TCHAR* name, int rowFirst, int rowLast, int colFirst, int colLast, int scopeId) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::delNamedRange(const TCHAR* name, int scopeId) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::namedRangeSize() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::namedRange(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast, int* scopeId, bool* hidden) {
    return unsupported<const TCHAR*>(nullptr);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::tableSize() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::table(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast, int* headerRowCount, int* totalsRowCount) {
    return unsupported<const TCHAR*>(nullptr);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::hyperlinkSize() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::hyperlink(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast) {
    return unsupported<const TCHAR*>(nullptr);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::delHyperlink(int index) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::addHyperlink(const TCHAR* hyperlink, int rowFirst, int rowLast, int colFirst, int colLast) {
    unsupported();
}

template <class TCHAR, class Tag>
IAutoFilterT<TCHAR>* XMLSheetImplT<TCHAR, Tag>::autoFilter() {
    return unsupported<IAutoFilterT<TCHAR>*>(nullptr);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::applyFilter() {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::removeFilter() {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::protect() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setProtectEx(bool protect, const TCHAR* password, int enhancedProtection) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::getTopLeftView(int* row, int* col) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setTopLeftView(int row, int col) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::rightToLeft() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setRightToLeft(bool rightToLeft) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setAutoFitArea(int rowFirst, int colFirst, int rowLast, int colLast) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::addrToRowCol(const TCHAR* addr, int* row, int* col, bool* rowRelative, bool* colRelative) {
    message().ok();
    quire::addrToRowCol(addr, row, col, rowRelative, colRelative);
}

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::rowColToAddr(int row, int col, bool rowRelative, bool colRelative) {
    return message().guard(static_cast<const TCHAR*>(nullptr), [&]() -> const TCHAR* {
        checkCell(row, col);
        stringResult_ = quire::rowColToAddr(row, col, rowRelative, colRelative);
        return stringResult_.c_str();
    });
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setTabRgbColor(int red, int green, int blue) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setTabColor(int color) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::addIgnoredError(int rowFirst, int colFirst, int rowLast, int colLast, int iError) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::addDataValidation(int type, int op, int rowFirst, int rowLast, int colFirst, int colLast, const TCHAR* value1, const TCHAR* value2, bool allowBlank, bool hideDropDown, bool showInputMessage, bool showErrorMessage, const TCHAR* promptTitle, const TCHAR* prompt, const TCHAR* errorTitle, const TCHAR* error, int errorStyle) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::addDataValidationDouble(int type, int op, int rowFirst, int rowLast, int colFirst, int colLast, double value1, double value2, bool allowBlank, bool hideDropDown, bool showInputMessage, bool showErrorMessage, const TCHAR* promptTitle, const TCHAR* prompt, const TCHAR* errorTitle, const TCHAR* error, int errorStyle) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::removeDataValidations() {
    unsupported();
}

template class XMLSheetImplT<wchar_t, excelNormal_tag>;
template class XMLSheetImplT<wchar_t, excelStrict_tag>;

}  // namespace quire
