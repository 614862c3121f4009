#include "sheet_names.h"

#include "wide_text.h"

namespace quire {

bool sameSheetName(const std::wstring& a, const std::wstring& b) {
    if (a.size() != b.size()) return false;
    for (size_t i = 0; i < a.size(); ++i) {
        wchar_t x = a[i], y = b[i];
        if (x >= L'a' && x <= L'z') x = static_cast<wchar_t>(x - 32);
        if (y >= L'a' && y <= L'z') y = static_cast<wchar_t>(y - 32);
        if (x != y) return false;
    }
    return true;
}

std::wstring fitSheetName(const std::wstring& name, bool& cut) {
    cut = utf16Length(name) > kMaxSheetNameUnits;
    return cut ? cutToUtf16Units(name, kMaxSheetNameUnits) : name;
}

}  // namespace quire
