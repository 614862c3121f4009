#include "cell_address.h"

#include "qrerror.h"

namespace quire {

std::wstring columnLetters(int col) {
    std::wstring letters;
    for (int n = col + 1; n > 0; n = (n - 1) / 26) {
        letters.insert(letters.begin(), static_cast<wchar_t>(L'A' + (n - 1) % 26));
    }
    return letters;
}

std::wstring rowColToAddr(int row, int col, bool rowRelative, bool colRelative) {
    if (row < -1 || row > 1048575) throw qrerror("row must be in range 0-1048575");
    if (col < -1 || col > 16383) throw qrerror("col must be in range 0-16383");
    std::wstring addr;
    if (col != -1) {
        if (!colRelative) addr += L'$';
        addr += columnLetters(col);
    }
    if (!rowRelative) addr += L'$';
    if (row != -1) addr += std::to_wstring(row + 1);
    return addr;
}

void addrToRowCol(const wchar_t* addr, int* row, int* col, bool* rowRelative, bool* colRelative) {
    bool rowRel = true;
    bool colRel = true;
    long column = 0;
    long rowNumber = 0;
    if (addr) {
        size_t split = 0;
        while (addr[split] && !(addr[split] >= L'1' && addr[split] <= L'9')) ++split;
        if (addr[0] == L'$') colRel = false;
        if (split > 0 && addr[split - 1] == L'$') rowRel = false;
        long weight = 1;
        for (size_t i = split; i-- > 0;) {
            wchar_t c = addr[i];
            if (c == L'$') continue;
            if (weight > 26L * 26 * 26 * 26) break;  // more letters than any column has
            column += (static_cast<long>(c) - 64) * weight;
            weight *= 26;
        }
        for (size_t i = split; addr[i] >= L'0' && addr[i] <= L'9'; ++i) {
            if (rowNumber > 100000000) break;  // keeps absurd input from overflowing
            rowNumber = rowNumber * 10 + (addr[i] - L'0');
        }
    }
    if (row) *row = static_cast<int>(rowNumber - 1);
    if (col) *col = static_cast<int>(column - 1);
    if (rowRelative) *rowRelative = rowRel;
    if (colRelative) *colRelative = colRel;
}

}  // namespace quire
