#pragma once
// Cell and range references as the worksheet part writes them ("B7", "A1:C3"), without
// absolute markers. Rows and columns are 0-based here.
#include <string>

namespace quire {

// False when the text is not a plain reference.
bool parseCellRef(const std::wstring& text, int& row, int& col);
std::wstring cellRef(int row, int col);
// "A1:B2" or a single cell "A1" (first = last).
bool parseRangeRef(const std::wstring& text, int& rowFirst, int& rowLast, int& colFirst, int& colLast);
std::wstring rangeRef(int rowFirst, int rowLast, int colFirst, int colLast);

}  // namespace quire
