#include "ooxml/binding/compact_text.h"

#include <limits>
#include <new>

namespace quire::ooxml {

void compact_text::assign(std::string_view text) {
    if (text.size() < kTag) {
        // The text may be our own (assigning a view of ourselves): copy before releasing.
        unsigned char copy[kTag];
        if (!text.empty()) std::memcpy(copy, text.data(), text.size());
        release();
        if (!text.empty()) std::memcpy(bytes_, copy, text.size());
        bytes_[kTag] = static_cast<unsigned char>(text.size());
        return;
    }
    if (text.size() > std::numeric_limits<std::uint32_t>::max()) throw std::bad_alloc();
    char* data = new char[text.size()];
    std::memcpy(data, text.data(), text.size());
    release();
    const auto size = static_cast<std::uint32_t>(text.size());
    std::memcpy(bytes_, &data, sizeof data);
    std::memcpy(bytes_ + sizeof data, &size, sizeof size);
    bytes_[kTag] = kHeap;
}

void compact_text::release() {
    if (!on_heap()) return;
    char* data;
    std::memcpy(&data, bytes_, sizeof data);
    delete[] data;
    clear_inline();
}

}  // namespace quire::ooxml
