// Little-endian field access for ZIP records: a bounds-checked reader over a
// record already in memory, and a writer that appends to a byte string.
#pragma once

#include "ZipException.h"

#include <cstddef>
#include <cstdint>
#include <string>

namespace quire::zip {

class ZipFieldReader {
public:
    ZipFieldReader(const unsigned char* data, std::size_t size) : m_data(data), m_size(size) {}

    std::uint16_t u16() { return static_cast<std::uint16_t>(take(2)); }
    std::uint32_t u32() { return static_cast<std::uint32_t>(take(4)); }
    std::uint64_t u64() { return take(8); }
    const unsigned char* bytes(std::size_t count)
    {
        require(count);
        const unsigned char* start = m_data + m_offset;
        m_offset += count;
        return start;
    }
    void skip(std::size_t count) { bytes(count); }
    std::size_t offset() const { return m_offset; }
    std::size_t remaining() const { return m_size - m_offset; }

private:
    void require(std::size_t count) const
    {
        if (count > m_size - m_offset)
            throw CZipException(CZipException::badZipFile);
    }
    std::uint64_t take(std::size_t count)
    {
        require(count);
        std::uint64_t value = 0;
        for (std::size_t i = count; i-- > 0;)
            value = (value << 8) | m_data[m_offset + i];
        m_offset += count;
        return value;
    }

    const unsigned char* m_data;
    std::size_t m_size;
    std::size_t m_offset = 0;
};

class ZipFieldWriter {
public:
    void u16(std::uint16_t value) { put(value, 2); }
    void u32(std::uint32_t value) { put(value, 4); }
    void u64(std::uint64_t value) { put(value, 8); }
    void bytes(const std::string& data) { m_out += data; }
    const std::string& data() const { return m_out; }
    std::size_t size() const { return m_out.size(); }

private:
    void put(std::uint64_t value, std::size_t count)
    {
        for (std::size_t i = 0; i < count; ++i)
            m_out.push_back(static_cast<char>((value >> (8 * i)) & 0xFF));
    }

    std::string m_out;
};

} // namespace quire::zip
