#pragma once
#include <cstdint>
#include <string>
#include <unordered_map>
#include <vector>

namespace quire {

// One shared string: its text and, for strings read from a file, the flags and the formatting
// runs and phonetic data that are written back as they came.
struct SharedStringEntry {
    std::wstring text;
    uint8_t flags = 0x01;            // fHighByte; strings added through the interface are UTF-16
    std::vector<uint8_t> runs;       // formatting runs, 4 bytes each
    std::vector<uint8_t> extRst;     // phonetic data

    bool plain() const { return runs.empty() && extRst.empty(); }
};

// The book's shared strings: each distinct plain text once, found again by its text.
class SharedStringTable {
public:
    uint32_t add(const std::wstring& text);
    // Appends as loaded, keeping duplicates so that loaded indexes stay valid.
    void append(SharedStringEntry entry);
    const std::wstring& at(uint32_t index) const { return entries_.at(index).text; }
    const SharedStringEntry& entry(uint32_t index) const { return entries_.at(index); }
    bool contains(uint32_t index) const { return index < entries_.size(); }
    size_t size() const { return entries_.size(); }
    void clear();

private:
    std::vector<SharedStringEntry> entries_;
    std::unordered_map<std::wstring, uint32_t> index_;
};

}  // namespace quire
