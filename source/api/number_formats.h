#pragma once
#include <map>
#include <string>

namespace quire {

constexpr int kLastCustomNumFormat = 392;
constexpr int kFirstBinaryCustomNumFormat = 164;
constexpr int kFirstXmlCustomNumFormat = 166;

// A book's number formats by id: custom ones it added and every one a loaded file held.
class NumFormatRegistry {
public:
    // The id of an existing format with exactly this text, else the lowest free id from
    // firstCustomId to 392; 0 when every id is taken.
    int add(const std::wstring& text, int firstCustomId);
    // Stores a format under its own id (loading); replaces any text the id had.
    void put(int id, const std::wstring& text) { formats_[id] = text; }
    const std::wstring* find(int id) const;
    const std::map<int, std::wstring>& all() const { return formats_; }
    void clear() { formats_.clear(); }

private:
    std::map<int, std::wstring> formats_;
};

// Tri-state answer for a number format id: known date, known non-date, or decided by its text.
enum class DateIdKind { Date, NotDate, ByText };
DateIdKind classifyNumFormatId(int id);

// True as soon as d, m, y, h or s stands outside quoted text and outside square brackets.
bool isDateFormatText(const wchar_t* text);

}  // namespace quire
