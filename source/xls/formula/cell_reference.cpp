#include "xls/formula/cell_reference.h"

#include "api/qrerror.h"

namespace quire::xls {

namespace {

bool isAsciiLetter(wchar_t c) { return (c >= L'A' && c <= L'Z') || (c >= L'a' && c <= L'z'); }
bool isDigit(wchar_t c) { return c >= L'0' && c <= L'9'; }
int letterValue(wchar_t c) { return (c >= L'a' ? c - L'a' : c - L'A') + 1; }

} // namespace

bool isReference(const std::wstring& text, CellRef& ref)
{
    size_t i = 0;
    const size_t n = text.size();
    const bool colAbs = i < n && text[i] == L'$';
    if (colAbs)
        ++i;
    const size_t letters = i;
    while (i < n && isAsciiLetter(text[i]))
        ++i;
    const size_t letterCount = i - letters;
    if (letterCount == 0 || letterCount > 3)
        return false;
    const bool rowAbs = i < n && text[i] == L'$';
    if (rowAbs)
        ++i;
    const size_t digits = i;
    while (i < n && isDigit(text[i]))
        ++i;
    if (i == digits || i != n)
        return false;

    int col = 0;
    for (size_t k = letters; k < letters + letterCount; ++k)
        col = col * 26 + letterValue(text[k]);
    if (col - 1 > MaxColumn)
        throw qrerror("Column is out of range");

    // More digits than any row number can have: not a number we can hold.
    if (i - digits > 9)
        throw qrerror("MakeFormula::isReference: can't convert string to number");
    long row = 0;
    for (size_t k = digits; k < i; ++k)
        row = row * 10 + (text[k] - L'0');
    if (row < 1 || row - 1 > MaxRow)
        throw qrerror("Row is out of range");

    ref.col = col - 1;
    ref.row = static_cast<int>(row - 1);
    ref.colRelative = !colAbs;
    ref.rowRelative = !rowAbs;
    return true;
}

bool isColumnOnly(const std::wstring& text, int& col, bool& relative)
{
    size_t i = 0;
    relative = !(i < text.size() && text[i] == L'$');
    if (!relative)
        ++i;
    const size_t n = text.size() - i;
    if (n == 0 || n > 2)
        return false;
    int value = 0;
    for (; i < text.size(); ++i) {
        if (!isAsciiLetter(text[i]))
            return false;
        value = value * 26 + letterValue(text[i]);
    }
    if (value - 1 > MaxColumn)
        return false;
    col = value - 1;
    return true;
}

bool isRowOnly(const std::wstring& text, int& row, bool& relative)
{
    size_t i = 0;
    relative = !(i < text.size() && text[i] == L'$');
    if (!relative)
        ++i;
    const size_t n = text.size() - i;
    if (n == 0 || n > 5)
        return false;
    long value = 0;
    for (; i < text.size(); ++i) {
        if (!isDigit(text[i]))
            return false;
        value = value * 10 + (text[i] - L'0');
    }
    if (value < 1 || value - 1 > MaxRow)
        return false;
    row = static_cast<int>(value - 1);
    return true;
}

std::wstring columnName(int col)
{
    std::wstring name;
    int n = col + 1;
    while (n > 0 && name.size() < 3) {
        const int r = (n - 1) % 26;
        name.insert(name.begin(), static_cast<wchar_t>(L'A' + r));
        n = (n - 1) / 26;
    }
    return name;
}

std::wstring referenceText(const CellRef& ref)
{
    std::wstring text;
    if (!ref.colRelative)
        text += L'$';
    text += columnName(ref.col);
    if (!ref.rowRelative)
        text += L'$';
    text += std::to_wstring(ref.row + 1);
    return text;
}

} // namespace quire::xls
