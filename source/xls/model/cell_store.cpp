#include "cell_store.h"

#include <utility>

namespace quire {

uint32_t& CellStore::slot(int row, int col) {
    if (static_cast<size_t>(row) >= rows_.size()) rows_.resize(static_cast<size_t>(row) + 1);
    auto& cells = rows_[row];
    if (static_cast<size_t>(col) >= cells.size()) {
        // Rows usually fill left to right: start with room for a few columns at once.
        if (cells.capacity() == 0) cells.reserve(16);
        if (static_cast<size_t>(col) == cells.size()) cells.push_back(0);
        else cells.resize(static_cast<size_t>(col) + 1, 0);
    }
    return cells[col];
}

template <class Record>
uint32_t CellStore::allocate(std::vector<Record>& list, std::vector<uint32_t>& freeSlots,
                             Record record) {
    if (!freeSlots.empty()) {
        uint32_t index = freeSlots.back();
        freeSlots.pop_back();
        list[index] = std::move(record);
        return index;
    }
    list.push_back(std::move(record));
    return static_cast<uint32_t>(list.size() - 1);
}

void CellStore::release(uint32_t word) {
    CellKind kind = kindOf(word);
    if (kind == CellKind::None) return;
    uint32_t index = indexOf(word);
    // Drop what a freed record holds on the heap now rather than when its slot is reused.
    if (kind == CellKind::Label) labels_[index].text = std::wstring();
    if (kind == CellKind::Formula) formulas_[index] = FormulaCell();
    free_[static_cast<int>(kind)].push_back(index);
    --count_;
}

CellPosition* CellStore::position(int row, int col) {
    uint32_t w = word(row, col);
    switch (kindOf(w)) {
        case CellKind::Rk: return &rk(w);
        case CellKind::Number: return &number(w);
        case CellKind::LabelSst: return &labelSst(w);
        case CellKind::Blank: return &blank(w);
        case CellKind::BoolErr: return &boolErr(w);
        case CellKind::Label: return &label(w);
        case CellKind::Formula: return &formula(w);
        case CellKind::None: break;
    }
    return nullptr;
}

void CellStore::erase(int row, int col) {
    uint32_t w = word(row, col);
    if (kindOf(w) == CellKind::None) return;
    release(w);
    rows_[row][col] = 0;
}

namespace {
template <class Record>
Record at(int row, int col, uint16_t ixfe) {
    Record record;
    record.rw = static_cast<uint16_t>(row);
    record.col = static_cast<uint16_t>(col);
    record.ixfe = ixfe;
    return record;
}
}  // namespace

RkCell& CellStore::putRk(int row, int col, uint16_t ixfe, uint32_t value) {
    erase(row, col);
    auto record = at<RkCell>(row, col, ixfe);
    record.rk = value;
    uint32_t index = allocate(rks_, free_[1], record);
    slot(row, col) = makeWord(CellKind::Rk, index);
    ++count_;
    return rks_[index];
}

NumberCell& CellStore::putNumber(int row, int col, uint16_t ixfe, double num) {
    erase(row, col);
    auto record = at<NumberCell>(row, col, ixfe);
    record.num = num;
    uint32_t index = allocate(numbers_, free_[2], record);
    slot(row, col) = makeWord(CellKind::Number, index);
    ++count_;
    return numbers_[index];
}

LabelSstCell& CellStore::putLabelSst(int row, int col, uint16_t ixfe, uint32_t isst) {
    erase(row, col);
    auto record = at<LabelSstCell>(row, col, ixfe);
    record.isst = isst;
    uint32_t index = allocate(labelSsts_, free_[3], record);
    slot(row, col) = makeWord(CellKind::LabelSst, index);
    ++count_;
    return labelSsts_[index];
}

BlankCell& CellStore::putBlank(int row, int col, uint16_t ixfe) {
    erase(row, col);
    uint32_t index = allocate(blanks_, free_[4], at<BlankCell>(row, col, ixfe));
    slot(row, col) = makeWord(CellKind::Blank, index);
    ++count_;
    return blanks_[index];
}

BoolErrCell& CellStore::putBoolErr(int row, int col, uint16_t ixfe, uint8_t value,
                                   uint8_t isError) {
    erase(row, col);
    auto record = at<BoolErrCell>(row, col, ixfe);
    record.bBoolErr = value;
    record.fError = isError;
    uint32_t index = allocate(boolErrs_, free_[5], record);
    slot(row, col) = makeWord(CellKind::BoolErr, index);
    ++count_;
    return boolErrs_[index];
}

LabelCell& CellStore::putLabel(int row, int col, uint16_t ixfe, std::wstring text) {
    erase(row, col);
    auto record = at<LabelCell>(row, col, ixfe);
    record.text = std::move(text);
    uint32_t index = allocate(labels_, free_[7], std::move(record));
    slot(row, col) = makeWord(CellKind::Label, index);
    ++count_;
    return labels_[index];
}

FormulaCell& CellStore::putFormula(int row, int col, FormulaCell cell) {
    erase(row, col);
    cell.rw = static_cast<uint16_t>(row);
    cell.col = static_cast<uint16_t>(col);
    uint32_t index = allocate(formulas_, free_[6], std::move(cell));
    slot(row, col) = makeWord(CellKind::Formula, index);
    ++count_;
    return formulas_[index];
}

void CellStore::move(int fromRow, int fromCol, int toRow, int toCol) {
    uint32_t w = word(fromRow, fromCol);
    if (kindOf(w) == CellKind::None) return;
    rows_[fromRow][fromCol] = 0;
    erase(toRow, toCol);
    slot(toRow, toCol) = w;
    CellPosition* p = position(toRow, toCol);
    p->rw = static_cast<uint16_t>(toRow);
    p->col = static_cast<uint16_t>(toCol);
}

void CellStore::clear() { *this = CellStore(); }

void CellStore::reserve(const Counts& counts) {
    rks_.reserve(rks_.size() + counts.rk);
    numbers_.reserve(numbers_.size() + counts.number);
    labelSsts_.reserve(labelSsts_.size() + counts.labelSst);
    blanks_.reserve(blanks_.size() + counts.blank);
    boolErrs_.reserve(boolErrs_.size() + counts.boolErr);
    labels_.reserve(labels_.size() + counts.label);
    formulas_.reserve(formulas_.size() + counts.formula);
}

}  // namespace quire
