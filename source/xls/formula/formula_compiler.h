#pragma once

// The formula compiler: formula text to a parsed formula (Ptgs in reverse
// Polish order) as MS-XLS stores it in Formula, Lbl and validation records.

#include <string>

#include "xls/formula/formula_context.h"
#include "xls/formula/parsed_formula.h"

namespace quire::xls {

// Compiles formula text (no leading "=") for a formula on sheet 'sheet'
// (-1 for workbook-level names). Sheet names, XTI entries and defined names
// resolve through 'book', which may gain XTI entries. Failures are qrerror:
// "incorrect token in formula", "error in formula", "incorrect number of
// function parameters", "error: function name without open parenthesis",
// "error: function parentheses not found", "Column is out of range",
// "Row is out of range", "ShortXLUnicodeString: string is too long", ...
ParsedFormula MakeFormula(const std::wstring& text, FormulaContext& book, int sheet);

// True when the formula is a single error constant; 'code' is its ErrorType
// code (a formula cell's cached value is then that error).
bool isSingleError(const ParsedFormula& formula, uint8_t& code);

} // namespace quire::xls
