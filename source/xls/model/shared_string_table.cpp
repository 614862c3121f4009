#include "shared_string_table.h"

#include <cwchar>
#include <utility>

namespace quire {

size_t SharedStringTable::hashOf(const wchar_t* text, size_t length) {
    uint64_t hash = 1469598103934665603ull;  // FNV-1a over the characters
    for (size_t i = 0; i < length; ++i) {
        hash ^= static_cast<uint32_t>(text[i]);
        hash *= 1099511628211ull;
    }
    return static_cast<size_t>(hash ^ (hash >> 29));
}

size_t SharedStringTable::findSlot(const wchar_t* text, size_t length, size_t hash) const {
    size_t mask = slots_.size() - 1;
    for (size_t slot = hash & mask;; slot = (slot + 1) & mask) {
        uint32_t entry = slots_[slot];
        if (entry == 0) return slot;
        const std::wstring& candidate = entries_[entry - 1].text;
        if (candidate.size() == length && std::wmemcmp(candidate.data(), text, length) == 0) return slot;
    }
}

void SharedStringTable::growIndex() {
    std::vector<uint32_t> old = std::move(slots_);
    slots_.assign(old.empty() ? 1024 : old.size() * 2, 0);
    for (uint32_t entry : old) {
        if (entry == 0) continue;
        const std::wstring& text = entries_[entry - 1].text;
        slots_[findSlot(text.data(), text.size(), hashOf(text.data(), text.size()))] = entry;
    }
}

void SharedStringTable::insertIndex(uint32_t entry) {
    if ((indexed_ + 1) * 2 > slots_.size()) growIndex();
    const std::wstring& text = entries_[entry].text;
    size_t slot = findSlot(text.data(), text.size(), hashOf(text.data(), text.size()));
    if (slots_[slot] != 0) return;  // an equal text is indexed already: the first one stays
    slots_[slot] = entry + 1;
    ++indexed_;
}

uint32_t SharedStringTable::add(const wchar_t* text, size_t length) {
    if (!slots_.empty()) {
        uint32_t found = slots_[findSlot(text, length, hashOf(text, length))];
        if (found != 0) return found - 1;
    }
    auto index = static_cast<uint32_t>(entries_.size());
    SharedStringEntry entry;
    entry.text.assign(text, length);
    entries_.push_back(std::move(entry));
    insertIndex(index);
    return index;
}

void SharedStringTable::append(SharedStringEntry entry) {
    auto index = static_cast<uint32_t>(entries_.size());
    bool plain = entry.plain();
    entries_.push_back(std::move(entry));
    if (plain) insertIndex(index);
}

void SharedStringTable::clear() {
    entries_.clear();
    slots_.clear();
    indexed_ = 0;
}

}  // namespace quire
