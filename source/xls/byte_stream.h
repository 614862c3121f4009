#pragma once

// A first-in first-out byte queue with little-endian values, on which formula
// tokens are built and read.

#include <cstddef>
#include <cstdint>
#include <vector>

namespace quire::xls {

class ByteStream {
public:
    ByteStream() = default;
    ByteStream(const uint8_t* data, size_t size) : bytes_(data, data + size) {}
    explicit ByteStream(std::vector<uint8_t> bytes) : bytes_(std::move(bytes)) {}

    size_t size() const { return bytes_.size() - head_; }
    bool empty() const { return size() == 0; }
    // The bytes not yet removed.
    const uint8_t* data() const { return bytes_.data() + head_; }
    void clear();

    void pushInt8(uint8_t v);
    void pushInt16(uint16_t v);
    void pushInt32(uint32_t v);
    void pushDouble(double v);
    void pushBytes(const uint8_t* data, size_t size);
    void pushBytes(const ByteStream& other) { pushBytes(other.data(), other.size()); }

    // Each fails with "ByteStream::pop<Type>() error" when too few bytes remain.
    uint8_t popInt8();
    uint16_t popInt16();
    uint32_t popInt32();
    double popDouble();
    void popBytes(uint8_t* out, size_t size);

private:
    const uint8_t* take(size_t n, const char* message);

    std::vector<uint8_t> bytes_;
    size_t head_ = 0;  // bytes already removed from the front
};

} // namespace quire::xls
