#pragma once
#include <cstdint>
#include <string>
#include <vector>

namespace quire {

// Kinds of stored cells, each backed by a list of records in its binary layout.
enum class CellKind : uint8_t {
    None = 0, Rk = 1, Number = 2, LabelSst = 3, Blank = 4, BoolErr = 5, Formula = 6, Label = 7
};

// A record kept verbatim (id and payload) to be written back where it was read.
struct KeptRecord {
    uint16_t id = 0;
    std::vector<uint8_t> data;
};

struct CellPosition {
    uint16_t rw = 0;
    uint16_t col = 0;
    uint16_t ixfe = 0;
};

struct RkCell : CellPosition { uint32_t rk = 0; };
struct NumberCell : CellPosition { double num = 0; };
struct LabelSstCell : CellPosition { uint32_t isst = 0; };
struct BlankCell : CellPosition {};
struct BoolErrCell : CellPosition { uint8_t bBoolErr = 0; uint8_t fError = 0; };
struct LabelCell : CellPosition { std::wstring text; };

// Cached result of a formula, as the FormulaValue of the record says.
enum class FormulaResult : uint8_t { Number, String, Boolean, Error, Blank, None };

struct FormulaCell : CellPosition {
    FormulaResult result = FormulaResult::None;
    double num = 0;
    uint8_t boolOrError = 0;
    std::wstring text;                 // a string result
    uint16_t grbit = 0;
    uint32_t chn = 0;
    std::vector<uint8_t> formula;      // the parsed formula as stored in the record (cce, rgce, rgcb)
    std::vector<KeptRecord> before;    // records kept in front of it
    std::vector<KeptRecord> shared;    // a shared-formula or array record kept with it
    std::vector<KeptRecord> after;     // records kept behind it
};

// Cells of one sheet: per row a vector of 32-bit words (bit 0 present, bits 1-3 kind,
// bits 4-31 index into the kind's list). Freed list slots are reused.
class CellStore {
public:
    static uint32_t makeWord(CellKind kind, uint32_t index) {
        return 1u | (static_cast<uint32_t>(kind) << 1) | (index << 4);
    }
    static CellKind kindOf(uint32_t word) {
        return (word & 1u) ? static_cast<CellKind>((word >> 1) & 7u) : CellKind::None;
    }
    static uint32_t indexOf(uint32_t word) { return word >> 4; }

    uint32_t word(int row, int col) const {
        if (row < 0 || static_cast<size_t>(row) >= rows_.size()) return 0;
        const auto& cells = rows_[row];
        return (col >= 0 && static_cast<size_t>(col) < cells.size()) ? cells[col] : 0;
    }
    CellKind kind(int row, int col) const { return kindOf(word(row, col)); }
    bool exists(int row, int col) const { return kind(row, col) != CellKind::None; }

    // The position fields (row, column, XF) of a present cell; null when there is none.
    CellPosition* position(int row, int col);

    // Removes the cell (no-op when absent).
    void erase(int row, int col);

    // Stores a new cell of a kind, replacing whatever was there; returns its record.
    RkCell& putRk(int row, int col, uint16_t ixfe, uint32_t rk);
    NumberCell& putNumber(int row, int col, uint16_t ixfe, double num);
    LabelSstCell& putLabelSst(int row, int col, uint16_t ixfe, uint32_t isst);
    BlankCell& putBlank(int row, int col, uint16_t ixfe);
    BoolErrCell& putBoolErr(int row, int col, uint16_t ixfe, uint8_t value, uint8_t isError);
    LabelCell& putLabel(int row, int col, uint16_t ixfe, std::wstring text);
    FormulaCell& putFormula(int row, int col, FormulaCell cell);

    RkCell& rk(uint32_t word) { return rks_[indexOf(word)]; }
    NumberCell& number(uint32_t word) { return numbers_[indexOf(word)]; }
    LabelSstCell& labelSst(uint32_t word) { return labelSsts_[indexOf(word)]; }
    BlankCell& blank(uint32_t word) { return blanks_[indexOf(word)]; }
    BoolErrCell& boolErr(uint32_t word) { return boolErrs_[indexOf(word)]; }
    LabelCell& label(uint32_t word) { return labels_[indexOf(word)]; }
    FormulaCell& formula(uint32_t word) { return formulas_[indexOf(word)]; }

    // Rows 0..rowCount()-1 may hold cells; each row's words run to its last used column.
    size_t rowCount() const { return rows_.size(); }
    const std::vector<uint32_t>& rowWords(size_t row) const { return rows_[row]; }

    // Moves a present cell to another place (overwriting the target), keeping its record.
    void move(int fromRow, int fromCol, int toRow, int toCol);

    void clear();
    size_t cellCount() const { return count_; }

    // Room for this many records of each kind, so that loading does not grow the lists step by step.
    struct Counts {
        size_t rk = 0, number = 0, labelSst = 0, blank = 0, boolErr = 0, label = 0, formula = 0;
    };
    void reserve(const Counts& counts);

private:
    uint32_t& slot(int row, int col);
    template <class Record>
    uint32_t allocate(std::vector<Record>& list, std::vector<uint32_t>& freeSlots, Record record);
    void release(uint32_t word);

    std::vector<std::vector<uint32_t>> rows_;
    std::vector<RkCell> rks_;
    std::vector<NumberCell> numbers_;
    std::vector<LabelSstCell> labelSsts_;
    std::vector<BlankCell> blanks_;
    std::vector<BoolErrCell> boolErrs_;
    std::vector<LabelCell> labels_;
    std::vector<FormulaCell> formulas_;
    std::vector<uint32_t> free_[8];
    size_t count_ = 0;
};

}  // namespace quire
