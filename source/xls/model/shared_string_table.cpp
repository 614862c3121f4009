#include "shared_string_table.h"

#include <utility>

namespace quire {

uint32_t SharedStringTable::add(const std::wstring& text) {
    auto found = index_.find(text);
    if (found != index_.end()) return found->second;
    auto index = static_cast<uint32_t>(entries_.size());
    SharedStringEntry entry;
    entry.text = text;
    entries_.push_back(std::move(entry));
    index_.emplace(text, index);
    return index;
}

void SharedStringTable::append(SharedStringEntry entry) {
    auto index = static_cast<uint32_t>(entries_.size());
    // Only plain strings are found again by text; the first of equal texts stays the one found.
    if (entry.plain()) index_.emplace(entry.text, index);
    entries_.push_back(std::move(entry));
}

void SharedStringTable::clear() {
    entries_.clear();
    index_.clear();
}

}  // namespace quire
