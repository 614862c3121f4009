#include "xls/byte_stream.h"

#include <cstring>

#include "api/qrerror.h"
#include "xls/little_endian.h"

namespace quire::xls {

void ByteStream::clear()
{
    bytes_.clear();
    head_ = 0;
}

void ByteStream::pushInt8(uint8_t v) { appendU8(bytes_, v); }
void ByteStream::pushInt16(uint16_t v) { appendU16(bytes_, v); }
void ByteStream::pushInt32(uint32_t v) { appendU32(bytes_, v); }
void ByteStream::pushDouble(double v) { appendDouble(bytes_, v); }

void ByteStream::pushBytes(const uint8_t* data, size_t size)
{
    if (size == 0)
        return;
    if (data >= bytes_.data() && data < bytes_.data() + bytes_.size()) {
        // Appending our own bytes: copy first, the vector may move.
        const std::vector<uint8_t> copy(data, data + size);
        bytes_.insert(bytes_.end(), copy.begin(), copy.end());
        return;
    }
    bytes_.insert(bytes_.end(), data, data + size);
}

const uint8_t* ByteStream::take(size_t n, const char* message)
{
    if (size() < n)
        throw qrerror(message);
    const uint8_t* p = bytes_.data() + head_;
    head_ += n;
    return p;
}

uint8_t ByteStream::popInt8() { return *take(1, "ByteStream::popInt8() error"); }
uint16_t ByteStream::popInt16() { return loadU16(take(2, "ByteStream::popInt16() error")); }
uint32_t ByteStream::popInt32() { return loadU32(take(4, "ByteStream::popInt32() error")); }
double ByteStream::popDouble() { return loadDouble(take(8, "ByteStream::popDouble() error")); }

void ByteStream::popBytes(uint8_t* out, size_t size)
{
    const uint8_t* p = take(size, "ByteStream::popBytes() error");
    if (size > 0)
        std::memcpy(out, p, size);
}

} // namespace quire::xls
