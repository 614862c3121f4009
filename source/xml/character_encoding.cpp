#include "character_encoding.h"

#include <array>
#include <cstdint>
#include <cstring>
#include <vector>

#include <utf8.h>

namespace lmx {

namespace {

bool is_ascii_space(unsigned char c) { return c == ' ' || c == '\t' || c == '\n' || c == '\r'; }

bool is_ascii_name_start(unsigned char c)
{
    return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || c == '_' || c == ':';
}

// Code points of Windows-1252 bytes 0x80-0x9F; unassigned bytes keep their value.
constexpr std::array<char16_t, 32> windows_1252_high{
    0x20AC, 0x0081, 0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021,
    0x02C6, 0x2030, 0x0160, 0x2039, 0x0152, 0x008D, 0x017D, 0x008F,
    0x0090, 0x2018, 0x2019, 0x201C, 0x201D, 0x2022, 0x2013, 0x2014,
    0x02DC, 0x2122, 0x0161, 0x203A, 0x0153, 0x009D, 0x017E, 0x0178,
};

void append_utf8(std::string& out, std::uint32_t code_point)
{
    char buffer[4];
    char* end = utf8::unchecked::append(code_point, buffer);
    out.append(buffer, end);
}

// ASCII bytes that XML 1.0 admits as characters: TAB, LF, CR and 0x20-0x7F.
constexpr bool ascii_allowed(unsigned char c) { return c >= 0x20 || c == 0x09 || c == 0x0A || c == 0x0D; }

}  // namespace

c_detected_format detect_byte_format(const char* data, std::size_t size)
{
    const auto* p = reinterpret_cast<const unsigned char*>(data);
    auto byte = [&](std::size_t i) -> int { return i < size ? p[i] : -1; };
    if (byte(0) == 0xFF && byte(1) == 0xFE && byte(2) > 0 && byte(2) < 0x80 && byte(3) == 0)
        return {c_byte_format::utf16_little_endian, 2};
    if (byte(0) == 0xFE && byte(1) == 0xFF && byte(2) == 0 && byte(3) > 0 && byte(3) < 0x80)
        return {c_byte_format::utf16_big_endian, 2};
    if (byte(0) == 0xEF && byte(1) == 0xBB && byte(2) == 0xBF)
        return {c_byte_format::utf8, 3};
    if (size > 0 && (is_ascii_space(p[0]) || p[0] == '<'))
        return {byte(1) == 0 ? c_byte_format::utf16_little_endian : c_byte_format::utf8, 0};
    if (byte(0) == 0 && byte(1) > 0 &&
        (is_ascii_name_start(p[1]) || p[1] == '<' || is_ascii_space(p[1])))
        return {c_byte_format::utf16_big_endian, 0};
    return {};
}

bool is_utf16(c_byte_format format)
{
    return format == c_byte_format::utf16_big_endian || format == c_byte_format::utf16_little_endian ||
           format == c_byte_format::ucs2_big_endian || format == c_byte_format::ucs2_little_endian;
}

bool is_big_endian(c_byte_format format)
{
    return format == c_byte_format::utf16_big_endian || format == c_byte_format::ucs2_big_endian;
}

bool utf16_to_utf8(const char* data, std::size_t size, c_byte_format format, std::string& out)
{
    if (size % 2 != 0)
        return false;
    const bool big = is_big_endian(format);
    const bool surrogates_allowed =
        format == c_byte_format::utf16_big_endian || format == c_byte_format::utf16_little_endian;
    const auto* p = reinterpret_cast<const unsigned char*>(data);
    out.clear();
    out.reserve(size / 2 + size / 8);
    const std::size_t units = size / 2;
    for (std::size_t i = 0; i < units; ++i) {
        auto unit_at = [&](std::size_t k) -> std::uint32_t {
            return big ? (p[2 * k] << 8 | p[2 * k + 1]) : (p[2 * k + 1] << 8 | p[2 * k]);
        };
        std::uint32_t unit = unit_at(i);
        if (unit < 0x80) {
            out += static_cast<char>(unit);
            continue;
        }
        if (unit >= 0xD800 && unit <= 0xDFFF) {
            if (!surrogates_allowed || unit >= 0xDC00 || i + 1 >= units)
                return false;
            const std::uint32_t low = unit_at(i + 1);
            if (low < 0xDC00 || low > 0xDFFF)
                return false;
            unit = 0x10000 + ((unit - 0xD800) << 10) + (low - 0xDC00);
            ++i;
        }
        append_utf8(out, unit);
    }
    return true;
}

void single_byte_to_utf8(const char* data, std::size_t size, bool windows_1252, std::string& out)
{
    out.clear();
    out.reserve(size + size / 8);
    for (std::size_t i = 0; i < size; ++i) {
        const auto c = static_cast<unsigned char>(data[i]);
        if (c < 0x80)
            out += static_cast<char>(c);
        else if (windows_1252 && c < 0xA0)
            append_utf8(out, windows_1252_high[c - 0x80]);
        else
            append_utf8(out, c);
    }
}

const char* find_invalid_xml_utf8(const char* begin, const char* end)
{
    const char* p = begin;
    while (p < end) {
        // Eight plain printable ASCII bytes at a time: no high bit set and
        // no byte below 0x20.
        while (end - p >= 8) {
            std::uint64_t word;
            std::memcpy(&word, p, 8);
            constexpr std::uint64_t high_bits = 0x8080808080808080ull;
            constexpr std::uint64_t below_space = 0x2020202020202020ull;
            if (((word | ((word - below_space) & ~word)) & high_bits) != 0)
                break;
            p += 8;
        }
        if (p >= end)
            break;
        const auto c = static_cast<unsigned char>(*p);
        if (c < 0x80) {
            if (!ascii_allowed(c))
                return p;
            ++p;
            continue;
        }
        // A run of high bytes holds whole multi-byte sequences when valid.
        const char* run_end = p;
        while (run_end < end && static_cast<unsigned char>(*run_end) >= 0x80)
            ++run_end;
        const char* bad = utf8::find_invalid(p, run_end);
        if (bad != run_end)
            return bad;
        // U+FFFE and U+FFFF are not XML characters.
        for (const char* q = p; q + 2 < run_end; ++q)
            if (static_cast<unsigned char>(q[0]) == 0xEF && static_cast<unsigned char>(q[1]) == 0xBF &&
                static_cast<unsigned char>(q[2]) >= 0xBE)
                return q;
        p = run_end;
    }
    return end;
}

bool fold_xml11_line_ends(std::string& text)
{
    bool changed = false;
    std::size_t out = 0;
    for (std::size_t in = 0; in < text.size();) {
        const auto c = static_cast<unsigned char>(text[in]);
        if (c == 0xC2 && in + 1 < text.size() && static_cast<unsigned char>(text[in + 1]) == 0x85) {
            text[out++] = '\n';
            in += 2;
            changed = true;
        } else if (c == 0xE2 && in + 2 < text.size() && static_cast<unsigned char>(text[in + 1]) == 0x80 &&
                   static_cast<unsigned char>(text[in + 2]) == 0xA8) {
            text[out++] = '\n';
            in += 3;
            changed = true;
        } else {
            text[out++] = text[in++];
        }
    }
    text.resize(out);
    return changed;
}

}  // namespace lmx
