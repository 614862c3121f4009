#pragma once

// A parsed formula as MS-XLS stores it: the tokens in reverse Polish order
// (rgce) and the extra data of array constants and memory areas (rgcb).

#include <cstddef>
#include <cstdint>
#include <vector>

namespace quire::xls {

struct ParsedFormula {
    std::vector<uint8_t> rgce;
    std::vector<uint8_t> rgcb;

    // CellParsedFormula layout: cce (u16), rgce, rgcb.
    std::vector<uint8_t> cellParsedFormula() const;
    // Reads the CellParsedFormula layout; everything after the cce bytes of
    // tokens is rgcb. Fails with "error in formula" when cce exceeds the data.
    static ParsedFormula fromCellParsedFormula(const uint8_t* data, size_t size);
};

// The cell position a formula belongs to; relative tokens (ptgRefN, ptgAreaN
// of shared formulas, validations) are resolved against it.
struct FormulaOrigin {
    int sheet = -1;   // sheet that holds the formula, -1 for none (workbook names)
    int row = -1;     // -1: no cell; relative tokens then fail to print
    int col = -1;
};

} // namespace quire::xls
