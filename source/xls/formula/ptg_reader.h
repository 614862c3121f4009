#pragma once

// Walks the tokens of a parsed formula without printing it: the size of
// each Ptg, and the questions the cell layer asks of a token array.

#include <cstddef>
#include <cstdint>

namespace quire::xls {

// Size in bytes of the Ptg at data[0], payload included; 0 when the id is
// unknown or the Ptg runs past 'size'.
size_t ptgSize(const uint8_t* data, size_t size);

// True when the formula must be recalculated whenever the book is: it has
// the volatile attribute or calls a volatile function (NOW, TODAY, RAND,
// OFFSET, INDIRECT, CELL, INFO). Malformed token arrays count as volatile.
bool isVolatile(const uint8_t* rgce, size_t cce);

// True when the token array is a single ptgExp: the formula is the shared
// or array formula anchored at (row, col).
bool sharedFormulaAnchor(const uint8_t* rgce, size_t cce, uint16_t& row, uint16_t& col);

} // namespace quire::xls
