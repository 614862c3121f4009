#include "xlsx/cell_ref.h"

namespace quire {

namespace {
constexpr int kMaxRow = 1048575;
constexpr int kMaxCol = 16383;
}  // namespace

bool parseCellRef(const std::wstring& text, int& row, int& col) {
    std::size_t i = 0;
    const std::size_t n = text.size();
    if (i < n && text[i] == L'$') ++i;
    long c = 0;
    const std::size_t letters = i;
    while (i < n) {
        wchar_t ch = text[i];
        if (ch >= L'a' && ch <= L'z') ch = static_cast<wchar_t>(ch - L'a' + L'A');
        if (ch < L'A' || ch > L'Z') break;
        c = c * 26 + (ch - L'A' + 1);
        if (c > kMaxCol + 1) return false;
        ++i;
    }
    if (i == letters) return false;
    if (i < n && text[i] == L'$') ++i;
    long r = 0;
    const std::size_t digits = i;
    while (i < n && text[i] >= L'0' && text[i] <= L'9') {
        r = r * 10 + (text[i] - L'0');
        if (r > kMaxRow + 1) return false;
        ++i;
    }
    if (i == digits || i != n || r < 1) return false;
    row = static_cast<int>(r - 1);
    col = static_cast<int>(c - 1);
    return true;
}

std::wstring cellRef(int row, int col) {
    wchar_t buffer[16];
    int pos = 15;
    buffer[pos] = 0;
    unsigned r = static_cast<unsigned>(row) + 1;
    do {
        buffer[--pos] = static_cast<wchar_t>(L'0' + r % 10);
        r /= 10;
    } while (r);
    unsigned c = static_cast<unsigned>(col) + 1;
    while (c) {
        const unsigned digit = (c - 1) % 26;
        buffer[--pos] = static_cast<wchar_t>(L'A' + digit);
        c = (c - 1) / 26;
    }
    return std::wstring(buffer + pos, static_cast<std::size_t>(15 - pos));
}

bool parseRangeRef(const std::wstring& text, int& rowFirst, int& rowLast, int& colFirst, int& colLast) {
    const std::size_t colon = text.find(L':');
    if (colon == std::wstring::npos) {
        if (!parseCellRef(text, rowFirst, colFirst)) return false;
        rowLast = rowFirst;
        colLast = colFirst;
        return true;
    }
    return parseCellRef(text.substr(0, colon), rowFirst, colFirst) &&
           parseCellRef(text.substr(colon + 1), rowLast, colLast);
}

std::wstring rangeRef(int rowFirst, int rowLast, int colFirst, int colLast) {
    if (rowFirst == rowLast && colFirst == colLast) return cellRef(rowFirst, colFirst);
    return cellRef(rowFirst, colFirst) + L":" + cellRef(rowLast, colLast);
}

}  // namespace quire
