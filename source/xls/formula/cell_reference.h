#pragma once

// A1-style cell references of the binary engine: columns A to IV (0-255),
// rows 1 to 65536 in text (0-65535 stored).

#include <string>

namespace quire::xls {

constexpr int MaxColumn = 255;
constexpr int MaxRow = 65535;

struct CellRef {
    int row = 0;
    int col = 0;
    bool rowRelative = true;  // no '$' before the row
    bool colRelative = true;  // no '$' before the column
};

// Scans "A1", "$A1", "A$1", "$A$1". False when the text does not have that
// shape (one to three letters and digits); throws "Column is out of range",
// "Row is out of range" or "MakeFormula::isReference: can't convert string
// to number" when it has the shape but names no cell of the sheet.
bool isReference(const std::wstring& text, CellRef& ref);

// Whole columns ("A", "$A") and whole rows ("1", "$1") as the ends of
// ranges like A:C and 1:3. False when the text is not one, or out of range.
bool isColumnOnly(const std::wstring& text, int& col, bool& relative);
bool isRowOnly(const std::wstring& text, int& row, bool& relative);

// "A".."IV" (and further, for damaged tokens, up to three letters).
std::wstring columnName(int col);
// A1 text with '$' before absolute parts.
std::wstring referenceText(const CellRef& ref);

} // namespace quire::xls
