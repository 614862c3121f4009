#pragma once
#include <string>

namespace quire {

// A1 references. The converter accepts rows -1..1048575 and columns -1..16383 (-1 leaves the
// part out) and throws qrerror with the row or column range message otherwise.
std::wstring rowColToAddr(int row, int col, bool rowRelative, bool colRelative);

// Parses an A1 reference; null out-parameters are skipped. Both flags start true.
void addrToRowCol(const wchar_t* addr, int* row, int* col, bool* rowRelative, bool* colRelative);

// Column letters: 0 is A, 25 is Z, 26 is AA.
std::wstring columnLetters(int col);

}  // namespace quire
