#pragma once
#include <cstdint>
#include <cstring>
#include <string_view>

namespace quire::ooxml {

// UTF-8 text in 16 bytes: up to 15 bytes inside the object (numbers, shared-string indexes),
// longer texts on the heap. Cells hold their values in these, so a million cells stay small.
class compact_text {
public:
    compact_text() { clear_inline(); }
    compact_text(const compact_text& other) { clear_inline(); assign(other.view()); }
    compact_text(compact_text&& other) noexcept {
        std::memcpy(bytes_, other.bytes_, sizeof bytes_);
        other.clear_inline();
    }
    compact_text& operator=(const compact_text& other) {
        if (this != &other) assign(other.view());
        return *this;
    }
    compact_text& operator=(compact_text&& other) noexcept {
        if (this != &other) {
            release();
            std::memcpy(bytes_, other.bytes_, sizeof bytes_);
            other.clear_inline();
        }
        return *this;
    }
    ~compact_text() { release(); }

    std::string_view view() const {
        if (on_heap()) {
            const char* data;
            std::uint32_t size;
            std::memcpy(&data, bytes_, sizeof data);
            std::memcpy(&size, bytes_ + sizeof data, sizeof size);
            return {data, size};
        }
        return {reinterpret_cast<const char*>(bytes_), bytes_[kTag]};
    }
    bool empty() const { return view().empty(); }
    void assign(std::string_view text);
    void clear() {
        release();
        clear_inline();
    }

private:
    static constexpr std::size_t kTag = 15;
    static constexpr unsigned char kHeap = 0xFF;
    bool on_heap() const { return bytes_[kTag] == kHeap; }
    void clear_inline() {
        bytes_[0] = 0;
        bytes_[kTag] = 0;
    }
    void release();

    unsigned char bytes_[16];
};

}  // namespace quire::ooxml
