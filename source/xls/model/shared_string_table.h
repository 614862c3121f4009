#pragma once
#include <cstdint>
#include <string>
#include <unordered_map>
#include <vector>

namespace quire {

// The book's shared strings: each distinct text once, found again by its text.
class SharedStringTable {
public:
    uint32_t add(const std::wstring& text);
    // Appends as loaded, keeping duplicates so that loaded indexes stay valid.
    void append(std::wstring text);
    const std::wstring& at(uint32_t index) const { return strings_.at(index); }
    bool contains(uint32_t index) const { return index < strings_.size(); }
    size_t size() const { return strings_.size(); }
    const std::vector<std::wstring>& strings() const { return strings_; }
    void clear();

private:
    std::vector<std::wstring> strings_;
    std::unordered_map<std::wstring, uint32_t> index_;
};

}  // namespace quire
