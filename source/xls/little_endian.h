#pragma once

// Little-endian access to the fixed-width fields of the binary format.

#include <cstdint>
#include <cstring>
#include <vector>

namespace quire::xls {

inline uint16_t loadU16(const uint8_t* p)
{
    return static_cast<uint16_t>(p[0] | (p[1] << 8));
}

inline uint32_t loadU32(const uint8_t* p)
{
    return static_cast<uint32_t>(p[0]) | (static_cast<uint32_t>(p[1]) << 8) |
           (static_cast<uint32_t>(p[2]) << 16) | (static_cast<uint32_t>(p[3]) << 24);
}

inline uint64_t loadU64(const uint8_t* p)
{
    return static_cast<uint64_t>(loadU32(p)) | (static_cast<uint64_t>(loadU32(p + 4)) << 32);
}

inline double loadDouble(const uint8_t* p)
{
    const uint64_t bits = loadU64(p);
    double value;
    std::memcpy(&value, &bits, sizeof value);
    return value;
}

inline void storeU16(uint8_t* p, uint16_t v)
{
    p[0] = static_cast<uint8_t>(v);
    p[1] = static_cast<uint8_t>(v >> 8);
}

inline void storeU32(uint8_t* p, uint32_t v)
{
    for (int i = 0; i < 4; ++i)
        p[i] = static_cast<uint8_t>(v >> (8 * i));
}

inline void storeU64(uint8_t* p, uint64_t v)
{
    storeU32(p, static_cast<uint32_t>(v));
    storeU32(p + 4, static_cast<uint32_t>(v >> 32));
}

inline void appendU8(std::vector<uint8_t>& out, uint8_t v) { out.push_back(v); }

inline void appendU16(std::vector<uint8_t>& out, uint16_t v)
{
    out.push_back(static_cast<uint8_t>(v));
    out.push_back(static_cast<uint8_t>(v >> 8));
}

inline void appendU32(std::vector<uint8_t>& out, uint32_t v)
{
    for (int i = 0; i < 4; ++i)
        out.push_back(static_cast<uint8_t>(v >> (8 * i)));
}

inline void appendDouble(std::vector<uint8_t>& out, double value)
{
    uint64_t bits;
    std::memcpy(&bits, &value, sizeof bits);
    appendU32(out, static_cast<uint32_t>(bits));
    appendU32(out, static_cast<uint32_t>(bits >> 32));
}

} // namespace quire::xls
