#include "number_formats.h"

namespace quire {

int NumFormatRegistry::add(const std::wstring& text, int firstCustomId) {
    for (const auto& entry : formats_) {
        if (entry.second == text) return entry.first;
    }
    for (int id = firstCustomId; id <= kLastCustomNumFormat; ++id) {
        if (formats_.find(id) == formats_.end()) {
            formats_.emplace(id, text);
            return id;
        }
    }
    return 0;
}

const std::wstring* NumFormatRegistry::find(int id) const {
    auto it = formats_.find(id);
    return it == formats_.end() ? nullptr : &it->second;
}

DateIdKind classifyNumFormatId(int id) {
    if ((id >= 14 && id <= 22) || (id >= 45 && id <= 47)) return DateIdKind::Date;
    if ((id >= 0 && id <= 13) || (id >= 37 && id <= 44) || id == 48 || id == 49)
        return DateIdKind::NotDate;
    return DateIdKind::ByText;
}

bool isDateFormatText(const wchar_t* text) {
    if (!text) return false;
    bool inQuotes = false;
    bool inBrackets = false;
    for (; *text; ++text) {
        wchar_t c = *text;
        if (c == L'"') {
            inQuotes = !inQuotes;
            continue;
        }
        if (inQuotes) continue;
        if (c == L'[') { inBrackets = true; continue; }
        if (c == L']') { inBrackets = false; continue; }
        if (inBrackets) continue;
        switch (c) {
            case L'd': case L'D': case L'm': case L'M': case L'y': case L'Y':
            case L'h': case L'H': case L's': case L'S':
                return true;
            default:
                break;
        }
    }
    return false;
}

}  // namespace quire
