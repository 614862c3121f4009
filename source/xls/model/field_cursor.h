#pragma once
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <vector>

#include "api/qrerror.h"

namespace quire {

// Reads little-endian fields from one record's data; running past the end throws the
// record's own message.
class FieldCursor {
public:
    FieldCursor(const uint8_t* data, size_t size, const char* message)
        : data_(data), size_(size), message_(message) {}

    uint8_t u8() { need(1); return data_[pos_++]; }
    uint16_t u16() {
        need(2);
        uint16_t v = static_cast<uint16_t>(data_[pos_] | (data_[pos_ + 1] << 8));
        pos_ += 2;
        return v;
    }
    uint32_t u32() {
        need(4);
        uint32_t v = static_cast<uint32_t>(data_[pos_]) | (static_cast<uint32_t>(data_[pos_ + 1]) << 8) |
                     (static_cast<uint32_t>(data_[pos_ + 2]) << 16) |
                     (static_cast<uint32_t>(data_[pos_ + 3]) << 24);
        pos_ += 4;
        return v;
    }
    double f64() {
        need(8);
        double v;
        std::memcpy(&v, data_ + pos_, 8);
        pos_ += 8;
        return v;
    }
    void skip(size_t n) { need(n); pos_ += n; }

    size_t pos() const { return pos_; }
    void setPos(size_t pos) { pos_ = pos; }
    size_t left() const { return size_ - pos_; }
    const uint8_t* data() const { return data_; }
    size_t size() const { return size_; }

private:
    void need(size_t n) const {
        if (size_ - pos_ < n) throw qrerror(message_);
    }

    const uint8_t* data_;
    size_t size_;
    size_t pos_ = 0;
    const char* message_;
};

// Little-endian appends for building record data.
inline void putU8(std::vector<uint8_t>& out, uint8_t v) { out.push_back(v); }
inline void putU16(std::vector<uint8_t>& out, uint16_t v) {
    out.push_back(static_cast<uint8_t>(v));
    out.push_back(static_cast<uint8_t>(v >> 8));
}
inline void putU32(std::vector<uint8_t>& out, uint32_t v) {
    for (int i = 0; i < 4; ++i) out.push_back(static_cast<uint8_t>(v >> (8 * i)));
}
inline void putF64(std::vector<uint8_t>& out, double v) {
    uint8_t bytes[8];
    std::memcpy(bytes, &v, 8);
    out.insert(out.end(), bytes, bytes + 8);
}

}  // namespace quire
