#include "shared_string_table.h"

#include <utility>

namespace quire {

uint32_t SharedStringTable::add(const std::wstring& text) {
    auto found = index_.find(text);
    if (found != index_.end()) return found->second;
    auto index = static_cast<uint32_t>(strings_.size());
    strings_.push_back(text);
    index_.emplace(text, index);
    return index;
}

void SharedStringTable::append(std::wstring text) {
    auto index = static_cast<uint32_t>(strings_.size());
    index_.emplace(text, index);  // the first of equal texts stays the one found by add
    strings_.push_back(std::move(text));
}

void SharedStringTable::clear() {
    strings_.clear();
    index_.clear();
}

}  // namespace quire
