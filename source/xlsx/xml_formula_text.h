#pragma once
// Formula text between the interface and the worksheet part: the part writes A1 references,
// commas between arguments and newer functions with the "_xlfn." prefix.
#include <string>

namespace quire {

struct FileFormula {
    std::wstring text;
    bool array = false;
};

// The text a caller gave, as the part stores it; row and col are the cell's (0-based).
FileFormula formulaToFile(const std::wstring& expression, bool r1c1, wchar_t listSeparator, int row, int col);
// The stored text as callers read it.
std::wstring formulaFromFile(const std::wstring& text, bool r1c1, wchar_t listSeparator, int row, int col);
// Relative references moved by whole rows and columns (a shared formula seen from another cell).
std::wstring shiftFormula(const std::wstring& text, int rowOffset, int colOffset);

}  // namespace quire
