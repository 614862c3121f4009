#pragma once
#include <cstdint>
#include <string>
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
    uint32_t add(const wchar_t* text, size_t length);
    uint32_t add(const std::wstring& text) { return add(text.data(), text.size()); }
    // Appends as loaded, keeping duplicates so that loaded indexes stay valid.
    void append(SharedStringEntry entry);
    const std::wstring& at(uint32_t index) const { return entries_.at(index).text; }
    const SharedStringEntry& entry(uint32_t index) const { return entries_.at(index); }
    bool contains(uint32_t index) const { return index < entries_.size(); }
    size_t size() const { return entries_.size(); }
    void clear();

private:
    // Open addressing over entry numbers (plus one; 0 is a free slot), found by the text's hash.
    static size_t hashOf(const wchar_t* text, size_t length);
    size_t findSlot(const wchar_t* text, size_t length, size_t hash) const;
    void insertIndex(uint32_t entry);
    void growIndex();

    std::vector<SharedStringEntry> entries_;
    std::vector<uint32_t> slots_;
    size_t indexed_ = 0;
};

}  // namespace quire
