// Cell reads and writes of a binary sheet.
#include <cstring>
#include <cwchar>

#include "api/number_formats.h"
#include "api/wide_text.h"
#include "book_formula_context.h"
#include "book_impl.h"
#include "sheet_impl.h"
#include "xls/formula/formula_compiler.h"
#include "xls/formula/formula_printer.h"
#include "xls/formula/ptg_reader.h"

namespace quire {
namespace {

constexpr size_t kMaxStringUnits = 32767;
constexpr uint16_t kDefaultCellXf = 15;

// Numbers whose low 32 bits are zero (and the two lowest of the high word) fit an RK exactly.
bool fitsRk(double value, uint32_t& rk) {
    uint64_t bits;
    std::memcpy(&bits, &value, sizeof bits);
    if ((bits & 0xFFFFFFFFu) != 0 || ((bits >> 32) & 3u) != 0) return false;
    rk = static_cast<uint32_t>(bits >> 32);
    return true;
}

double decodeRk(uint32_t rk) {
    double value;
    if (rk & 2u) {
        value = static_cast<double>(static_cast<int32_t>(rk) >> 2);
    } else {
        uint64_t bits = static_cast<uint64_t>(rk & 0xFFFFFFFCu) << 32;
        std::memcpy(&value, &bits, sizeof value);
    }
    return (rk & 1u) ? value / 100 : value;
}

}  // namespace

SheetImplT::SheetImplT(BookImplT* book) : book_(book) {}

BookMessage& SheetImplT::message() { return book_->message(); }

void SheetImplT::checkCell(int row, int col) const {
    if (static_cast<unsigned>(row) > kMaxRow) throw qrerror("row must be in range 0-65535");
    if (static_cast<unsigned>(col) > kMaxCol) throw qrerror("col must be in range 0-255");
}

uint16_t SheetImplT::xfForWrite(int row, int col, IFormatT<wchar_t>* format) {
    if (format) {
        int xf = book_->xfIndexOf(format);
        if (xf < 0) throw qrerror("specified format not found");
        return static_cast<uint16_t>(xf);
    }
    if (const CellPosition* existing = cells_.position(row, col)) return existing->ixfe;
    if (const ColInfo* info = columnInfo(col)) return info->ixfe;
    return kDefaultCellXf;
}

IFormatT<wchar_t>* SheetImplT::formatOfXf(int xf) { return book_->formatAt(xf); }

void SheetImplT::setFormatOut(IFormatT<wchar_t>** out, int row, int col) {
    if (!out) return;
    const CellPosition* p = cells_.position(row, col);
    *out = p ? formatOfXf(p->ixfe) : nullptr;
}

const wchar_t* SheetImplT::returnString(const std::wstring& text) {
    stringResult_ = text;
    return stringResult_.c_str();
}

FormulaCell* SheetImplT::formulaAt(int row, int col) {
    uint32_t w = cells_.word(row, col);
    return CellStore::kindOf(w) == CellKind::Formula ? &cells_.formula(w) : nullptr;
}

int SheetImplT::cellType(int row, int col) {
    return message().guard(static_cast<int>(CellTypeEmpty), [&] {
        checkCell(row, col);
        uint32_t w = cells_.word(row, col);
        switch (CellStore::kindOf(w)) {
            case CellKind::None: return static_cast<int>(CellTypeEmpty);
            case CellKind::Rk:
            case CellKind::Number: return static_cast<int>(CellTypeNumber);
            case CellKind::LabelSst:
            case CellKind::Label: return static_cast<int>(CellTypeString);
            case CellKind::Blank: return static_cast<int>(CellTypeBlank);
            case CellKind::BoolErr:
                return static_cast<int>(cells_.boolErr(w).fError ? CellTypeError : CellTypeBoolean);
            case CellKind::Formula:
                switch (cells_.formula(w).result) {
                    case FormulaResult::String: return static_cast<int>(CellTypeString);
                    case FormulaResult::Boolean: return static_cast<int>(CellTypeBoolean);
                    case FormulaResult::Error: return static_cast<int>(CellTypeError);
                    case FormulaResult::Blank: return static_cast<int>(CellTypeBlank);
                    default: return static_cast<int>(CellTypeNumber);
                }
        }
        throw qrerror("unknown type of cell");
    });
}

bool SheetImplT::isFormula(int row, int col) {
    return message().guard(false, [&] {
        checkCell(row, col);
        return cells_.kind(row, col) == CellKind::Formula;
    });
}

IFormatT<wchar_t>* SheetImplT::cellFormat(int row, int col) {
    return message().guard<IFormatT<wchar_t>*>(nullptr, [&]() -> IFormatT<wchar_t>* {
        checkCell(row, col);
        int xf = -1;
        if (const CellPosition* p = cells_.position(row, col)) {
            xf = p->ixfe;
        } else {
            auto rowIt = rows_.find(row);
            if (rowIt != rows_.end() && (rowIt->second.grbit & RowInfo::kHasFormat)) {
                xf = rowIt->second.xf();
            } else if (const ColInfo* info = columnInfo(col)) {
                xf = info->ixfe;
            } else {
                if (book_->formatSize() == 0) throw qrerror("formats are not found");
                xf = 0;
            }
        }
        IFormatT<wchar_t>* format = formatOfXf(xf);
        if (!format) throw qrerror("format not found");
        return format;
    });
}

void SheetImplT::setCellFormat(int row, int col, IFormatT<wchar_t>* format) {
    message().guardVoid([&] {
        checkCell(row, col);
        int xf = book_->xfIndexOf(format);
        if (xf < 0) throw qrerror("specified format is not found");
        if (CellPosition* p = cells_.position(row, col)) {
            p->ixfe = static_cast<uint16_t>(xf);
        } else {
            cells_.putBlank(row, col, static_cast<uint16_t>(xf));
            invalidateUsedRange();
        }
    });
}

const wchar_t* SheetImplT::readStr(int row, int col, IFormatT<wchar_t>** format) {
    if (format) *format = nullptr;
    return message().guard<const wchar_t*>(nullptr, [&]() -> const wchar_t* {
        checkCell(row, col);
        uint32_t w = cells_.word(row, col);
        const std::wstring* text = nullptr;
        switch (CellStore::kindOf(w)) {
            case CellKind::LabelSst: {
                uint32_t isst = cells_.labelSst(w).isst;
                if (!book_->sharedStrings().contains(isst)) throw qrerror("string not found");
                text = &book_->sharedStrings().at(isst);
                break;
            }
            case CellKind::Label: text = &cells_.label(w).text; break;
            case CellKind::Formula:
                if (cells_.formula(w).result == FormulaResult::String) text = &cells_.formula(w).text;
                break;
            default: break;
        }
        if (!text) throw qrerror("this cell doesn't contain a string");
        setFormatOut(format, row, col);
        return returnString(*text);
    });
}

bool SheetImplT::writeStr(int row, int col, const wchar_t* value, IFormatT<wchar_t>* format, int) {
    return message().guard(false, [&] {
        checkCell(row, col);
        if (!value) throw qrerror("string can't be 0");
        size_t length = std::wcslen(value);
        if (length > kMaxStringUnits / 2 && utf16Length(value) > kMaxStringUnits)
            throw qrerror("string is too long");
        uint16_t xf = xfForWrite(row, col, format);
        releaseSharedFormula(row, col);
        uint32_t isst = book_->sharedStrings().add(value, length);
        uint32_t w = cells_.word(row, col);
        if (CellStore::kindOf(w) == CellKind::LabelSst) {
            LabelSstCell& cell = cells_.labelSst(w);
            cell.isst = isst;
            cell.ixfe = xf;
        } else {
            cells_.putLabelSst(row, col, xf, isst);
            invalidateUsedRange();
        }
        return true;
    });
}

double SheetImplT::readNum(int row, int col, IFormatT<wchar_t>** format) {
    if (format) *format = nullptr;
    return message().guard(0.0, [&] {
        checkCell(row, col);
        uint32_t w = cells_.word(row, col);
        double value;
        switch (CellStore::kindOf(w)) {
            case CellKind::Rk: value = decodeRk(cells_.rk(w).rk); break;
            case CellKind::Number: value = cells_.number(w).num; break;
            case CellKind::Formula: {
                const FormulaCell& cell = cells_.formula(w);
                if (cell.result != FormulaResult::Number && cell.result != FormulaResult::None)
                    throw qrerror("this cell doesn't contain a number");
                value = cell.num;
                break;
            }
            default: throw qrerror("this cell doesn't contain a number");
        }
        setFormatOut(format, row, col);
        return value;
    });
}

void SheetImplT::storeNumber(int row, int col, uint16_t xf, double value) {
    uint32_t rk;
    uint32_t w = cells_.word(row, col);
    CellKind kind = CellStore::kindOf(w);
    if (fitsRk(value, rk)) {
        if (kind == CellKind::Rk) {
            cells_.rk(w).rk = rk;
            cells_.rk(w).ixfe = xf;
            return;
        }
        cells_.putRk(row, col, xf, rk);
    } else {
        if (kind == CellKind::Number) {
            cells_.number(w).num = value;
            cells_.number(w).ixfe = xf;
            return;
        }
        cells_.putNumber(row, col, xf, value);
    }
    if (kind == CellKind::None) invalidateUsedRange();
}

bool SheetImplT::writeNum(int row, int col, double value, IFormatT<wchar_t>* format) {
    return message().guard(false, [&] {
        checkCell(row, col);
        uint16_t xf = xfForWrite(row, col, format);
        releaseSharedFormula(row, col);
        storeNumber(row, col, xf, value);
        return true;
    });
}

bool SheetImplT::readBool(int row, int col, IFormatT<wchar_t>** format) {
    if (format) *format = nullptr;
    return message().guard(false, [&] {
        checkCell(row, col);
        uint32_t w = cells_.word(row, col);
        bool value;
        if (CellStore::kindOf(w) == CellKind::BoolErr && !cells_.boolErr(w).fError) {
            value = cells_.boolErr(w).bBoolErr != 0;
        } else if (CellStore::kindOf(w) == CellKind::Formula &&
                   cells_.formula(w).result == FormulaResult::Boolean) {
            value = cells_.formula(w).boolOrError != 0;
        } else {
            throw qrerror("this cell doesn't contain a bool");
        }
        setFormatOut(format, row, col);
        return value;
    });
}

bool SheetImplT::writeBool(int row, int col, bool value, IFormatT<wchar_t>* format,
                           int errorCode) {
    return message().guard(false, [&] {
        checkCell(row, col);
        uint16_t xf = xfForWrite(row, col, format);
        releaseSharedFormula(row, col);
        bool isError = errorCode != ErrorTypeNoError;
        auto stored = static_cast<uint8_t>(isError ? errorCode : (value ? 1 : 0));
        bool existed = cells_.exists(row, col);
        cells_.putBoolErr(row, col, xf, stored, isError ? 1 : 0);
        if (!existed) invalidateUsedRange();
        return true;
    });
}

bool SheetImplT::readBlank(int row, int col, IFormatT<wchar_t>** format) {
    if (format) *format = nullptr;
    return message().guard(false, [&] {
        checkCell(row, col);
        if (!format) throw qrerror("format mustn't be NULL");
        uint32_t w = cells_.word(row, col);
        bool blank = CellStore::kindOf(w) == CellKind::Blank ||
                     (CellStore::kindOf(w) == CellKind::Formula &&
                      cells_.formula(w).result == FormulaResult::Blank);
        if (!blank) throw qrerror("this cell doesn't contain a blank");
        setFormatOut(format, row, col);
        return true;
    });
}

bool SheetImplT::writeBlank(int row, int col, IFormatT<wchar_t>* format) {
    return message().guard(false, [&] {
        checkCell(row, col);
        uint16_t xf = xfForWrite(row, col, format);
        releaseSharedFormula(row, col);
        bool existed = cells_.exists(row, col);
        cells_.putBlank(row, col, xf);
        if (!existed) invalidateUsedRange();
        return true;
    });
}

// The tokens a formula cell stands for: its own, or those of the shared or array formula
// its single ptgExp token points at.
std::wstring SheetImplT::formulaText(const FormulaCell& cell, int row, int col) {
    BookFormulaContext context(*book_);
    xls::FormulaOrigin origin;
    origin.sheet = ownIndex();
    origin.row = row;
    origin.col = col;
    xls::ParsedFormula parsed = xls::ParsedFormula::fromCellParsedFormula(cell.formula.data(), cell.formula.size());
    uint16_t anchorRow = 0, anchorCol = 0;
    if (!xls::sharedFormulaAnchor(parsed.rgce.data(), parsed.rgce.size(), anchorRow, anchorCol))
        return xls::toInfix(parsed, context, origin);
    const FormulaCell* anchor = formulaAt(anchorRow, anchorCol);
    if (anchor) {
        for (const auto& record : anchor->shared) {
            // SharedFmla: RefU (6 bytes), reserved, cUse; Array: RefU, grbit u16, chn u32.
            size_t skip = record.id == 0x04BC ? 8 : record.id == 0x0221 ? 12 : 0;
            if (skip == 0 || record.data.size() < skip + 2) continue;
            const uint8_t* d = record.data.data();
            int firstRow = d[0] | (d[1] << 8), lastRow = d[2] | (d[3] << 8);
            int firstCol = d[4], lastCol = d[5];
            if (row < firstRow || row > lastRow || col < firstCol || col > lastCol) continue;
            xls::ParsedFormula body = xls::ParsedFormula::fromCellParsedFormula(d + skip, record.data.size() - skip);
            return xls::toInfix(body, context, origin);
        }
    }
    throw qrerror("toInfix error: formula refers to a shared or array formula");
}

const wchar_t* SheetImplT::readFormula(int row, int col, IFormatT<wchar_t>** format) {
    if (format) *format = nullptr;
    return message().guard<const wchar_t*>(nullptr, [&]() -> const wchar_t* {
        checkCell(row, col);
        FormulaCell* cell = formulaAt(row, col);
        if (!cell) throw qrerror("cell doesn't contain a formula");
        std::wstring text = formulaText(*cell, row, col);
        setFormatOut(format, row, col);
        return returnString(text);
    });
}

// Before the first cell of a shared formula changes, the other cells that use the shared
// tokens get tokens of their own, so that none is left pointing at a formula that is gone.
void SheetImplT::releaseSharedFormula(int row, int col) {
    FormulaCell* anchor = formulaAt(row, col);
    if (!anchor || anchor->shared.empty()) return;
    std::vector<uint8_t> range;
    bool shared = false;
    for (const auto& record : anchor->shared) {
        if ((record.id == 0x04BC || record.id == 0x0221 || record.id == 0x0236) && record.data.size() >= 6) {
            range = record.data;
            shared = record.id == 0x04BC;
        }
    }
    if (range.empty()) return;
    int firstRow = range[0] | (range[1] << 8), lastRow = range[2] | (range[3] << 8);
    int firstCol = range[4], lastCol = range[5];
    BookFormulaContext context(*book_);
    int sheet = ownIndex();
    for (int r = firstRow; r <= lastRow; ++r) {
        for (int c = firstCol; c <= lastCol; ++c) {
            if (r == row && c == col) continue;
            FormulaCell* user = formulaAt(r, c);
            if (!user) continue;
            xls::ParsedFormula parsed = xls::ParsedFormula::fromCellParsedFormula(user->formula.data(), user->formula.size());
            uint16_t anchorRow = 0, anchorCol = 0;
            if (!xls::sharedFormulaAnchor(parsed.rgce.data(), parsed.rgce.size(), anchorRow, anchorCol) ||
                anchorRow != row || anchorCol != col)
                continue;
            if (shared) {
                std::wstring text = formulaText(*user, r, c);
                user->formula = xls::MakeFormula(text, context, sheet).cellParsedFormula();
                continue;
            }
            // A cell of an array formula or data table cannot stand alone: its result stays.
            FormulaCell value = *user;
            switch (value.result) {
                case FormulaResult::String: cells_.putLabel(r, c, value.ixfe, value.text); break;
                case FormulaResult::Boolean: cells_.putBoolErr(r, c, value.ixfe, value.boolOrError, 0); break;
                case FormulaResult::Error: cells_.putBoolErr(r, c, value.ixfe, value.boolOrError, 1); break;
                case FormulaResult::Blank: cells_.putBlank(r, c, value.ixfe); break;
                default: storeNumber(r, c, value.ixfe, value.num); break;
            }
        }
    }
    if (FormulaCell* cell = formulaAt(row, col)) cell->shared.clear();
}

void SheetImplT::storeFormula(int row, int col, const wchar_t* expr, IFormatT<wchar_t>* format,
                              FormulaResult result, double num, bool flag, const wchar_t* text) {
    checkCell(row, col);
    if (!expr) throw qrerror("formula can't be 0");
    uint16_t xf = xfForWrite(row, col, format);
    BookFormulaContext context(*book_);
    xls::ParsedFormula parsed = xls::MakeFormula(expr, context, ownIndex());
    releaseSharedFormula(row, col);
    FormulaCell cell;
    cell.formula = parsed.cellParsedFormula();
    cell.ixfe = xf;
    cell.result = result;
    cell.num = num;
    cell.boolOrError = flag ? 1 : 0;
    if (text) cell.text = text;
    bool existed = cells_.exists(row, col);
    cells_.putFormula(row, col, std::move(cell));
    if (!existed) invalidateUsedRange();
}

bool SheetImplT::writeFormula(int row, int col, const wchar_t* expr, IFormatT<wchar_t>* format) {
    return message().guard(false, [&] {
        storeFormula(row, col, expr, format, FormulaResult::None, 0, false, nullptr);
        return true;
    });
}

bool SheetImplT::writeFormulaNum(int row, int col, const wchar_t* expr, double value,
                                 IFormatT<wchar_t>* format) {
    return message().guard(false, [&] {
        storeFormula(row, col, expr, format, FormulaResult::Number, value, false, nullptr);
        return true;
    });
}

bool SheetImplT::writeFormulaStr(int row, int col, const wchar_t* expr, const wchar_t* value,
                                 IFormatT<wchar_t>* format) {
    return message().guard(false, [&] {
        if (value && utf16Length(value) > kMaxStringUnits) throw qrerror("string is too long");
        storeFormula(row, col, expr, format, FormulaResult::String, 0, false, value ? value : L"");
        return true;
    });
}

bool SheetImplT::writeFormulaBool(int row, int col, const wchar_t* expr, bool value,
                                  IFormatT<wchar_t>* format) {
    return message().guard(false, [&] {
        storeFormula(row, col, expr, format, FormulaResult::Boolean, 0, value, nullptr);
        return true;
    });
}

const wchar_t* SheetImplT::readComment(int row, int col) {
    return message().guard<const wchar_t*>(nullptr, [&]() -> const wchar_t* {
        checkCell(row, col);
        auto found = comments_.find({row, col});
        if (found == comments_.end()) return nullptr;
        return returnString(found->second.text);
    });
}

void SheetImplT::writeComment(int row, int col, const wchar_t* value, const wchar_t* author,
                              int width, int height) {
    message().guardVoid([&] {
        checkCell(row, col);
        CellComment comment;
        comment.text = value ? value : L"";
        comment.author = author ? author : L"quire";
        comment.width = width;
        comment.height = height;
        comments_[{row, col}] = std::move(comment);
    });
}

void SheetImplT::removeComment(int row, int col) {
    message().guardVoid([&] {
        checkCell(row, col);
        comments_.erase({row, col});
    });
}

bool SheetImplT::isDate(int row, int col) {
    return message().guard(false, [&] {
        if (cellType(row, col) != CellTypeNumber) return false;
        IFormatT<wchar_t>* format = nullptr;
        readNum(row, col, &format);
        message().ok();
        if (!format) return false;
        int id = format->numFormat();
        switch (classifyNumFormatId(id)) {
            case DateIdKind::Date: return true;
            case DateIdKind::NotDate: return false;
            case DateIdKind::ByText: break;
        }
        const std::wstring* text = book_->numFormats().find(id);
        return text && isDateFormatText(text->c_str());
    });
}

int SheetImplT::readError(int row, int col) {
    return message().guard(static_cast<int>(ErrorTypeNoError), [&] {
        checkCell(row, col);
        uint32_t w = cells_.word(row, col);
        if (CellStore::kindOf(w) == CellKind::BoolErr && cells_.boolErr(w).fError)
            return static_cast<int>(cells_.boolErr(w).bBoolErr);
        if (CellStore::kindOf(w) == CellKind::Formula &&
            cells_.formula(w).result == FormulaResult::Error)
            return static_cast<int>(cells_.formula(w).boolOrError);
        throw qrerror("this cell doesn't contain an error");
    });
}

void SheetImplT::writeError(int row, int col, int error, IFormatT<wchar_t>* format) {
    writeBool(row, col, false, format, error);
}

bool SheetImplT::copyCell(int rowSrc, int colSrc, int rowDst, int colDst) {
    return message().guard(false, [&] {
        checkCell(rowSrc, colSrc);
        checkCell(rowDst, colDst);
        uint32_t w = cells_.word(rowSrc, colSrc);
        if (rowSrc == rowDst && colSrc == colDst) {
            if (CellStore::kindOf(w) == CellKind::None) throw qrerror("empty cell");
            return true;
        }
        bool existed = cells_.exists(rowDst, colDst);
        switch (CellStore::kindOf(w)) {
            case CellKind::None: throw qrerror("empty cell");
            case CellKind::Rk: {
                RkCell c = cells_.rk(w);
                cells_.putRk(rowDst, colDst, c.ixfe, c.rk);
                break;
            }
            case CellKind::Number: {
                NumberCell c = cells_.number(w);
                cells_.putNumber(rowDst, colDst, c.ixfe, c.num);
                break;
            }
            case CellKind::LabelSst: {
                LabelSstCell c = cells_.labelSst(w);
                cells_.putLabelSst(rowDst, colDst, c.ixfe, c.isst);
                break;
            }
            case CellKind::Blank: {
                BlankCell c = cells_.blank(w);
                cells_.putBlank(rowDst, colDst, c.ixfe);
                break;
            }
            case CellKind::BoolErr: {
                BoolErrCell c = cells_.boolErr(w);
                cells_.putBoolErr(rowDst, colDst, c.ixfe, c.bBoolErr, c.fError);
                break;
            }
            case CellKind::Label: {
                LabelCell c = cells_.label(w);
                cells_.putLabel(rowDst, colDst, c.ixfe, c.text);
                break;
            }
            case CellKind::Formula: {
                FormulaCell c = cells_.formula(w);
                cells_.putFormula(rowDst, colDst, std::move(c));
                break;
            }
        }
        if (!existed) invalidateUsedRange();
        return true;
    });
}

void SheetImplT::computeUsedRange() {
    if (usedRangeValid_) return;
    int first = -1, last = -1, firstColumn = -1, lastColumn = -1;
    for (size_t r = 0; r < cells_.rowCount(); ++r) {
        const auto& words = cells_.rowWords(r);
        for (size_t c = 0; c < words.size(); ++c) {
            if (!(words[c] & 1u)) continue;
            if (first < 0) first = static_cast<int>(r);
            last = static_cast<int>(r);
            if (firstColumn < 0 || static_cast<int>(c) < firstColumn) firstColumn = static_cast<int>(c);
            if (static_cast<int>(c) > lastColumn) lastColumn = static_cast<int>(c);
        }
    }
    if (first < 0) {
        firstRow_ = lastRow_ = firstCol_ = lastCol_ = 0;
    } else {
        firstRow_ = first;
        lastRow_ = last + 1;
        firstCol_ = firstColumn;
        lastCol_ = lastColumn + 1;
    }
    usedRangeValid_ = true;
}

int SheetImplT::firstRow() {
    message().ok();
    computeUsedRange();
    return firstRow_;
}

int SheetImplT::lastRow() {
    message().ok();
    computeUsedRange();
    return lastRow_;
}

int SheetImplT::firstCol() {
    message().ok();
    computeUsedRange();
    return firstCol_;
}

int SheetImplT::lastCol() {
    message().ok();
    computeUsedRange();
    return lastCol_;
}

}  // namespace quire
