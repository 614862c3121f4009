#pragma once

// The formula printer: a parsed formula back to formula text, with the
// book's list separator between arguments.

#include <cstddef>
#include <cstdint>
#include <string>

#include "xls/formula/formula_context.h"
#include "xls/formula/parsed_formula.h"

namespace quire::xls {

// Prints tokens (rgce, cce bytes) with their extra data (rgcb, may be
// empty when the formula has no arrays). 'origin' gives the cell for
// relative tokens (shared formulas, validations) and the sheet for names
// local to it. Every read is bounded by the buffers; malformed tokens fail
// with a qrerror ("can't recognize formula block: unknown ptg", "unknown
// Ptg 0x18", "toInfix error: ...", "can't build infix formula string",
// "ByteStream::pop...() error", ...).
std::wstring toInfix(const uint8_t* rgce, size_t cce, const uint8_t* rgcb, size_t cbSize,
                     const FormulaContext& book, const FormulaOrigin& origin = {});
std::wstring toInfix(const ParsedFormula& formula, const FormulaContext& book,
                     const FormulaOrigin& origin = {});

} // namespace quire::xls
