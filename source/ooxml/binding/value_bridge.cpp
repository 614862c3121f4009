#include "ooxml/binding/value_bridge.h"

#include <charconv>
#include <cmath>
#include <cstring>
#include <iterator>

#include <utf8.h>

namespace quire::ooxml {

lmx::elmx_error read_value(std::string_view text, std::wstring& value) {
    // The scanner has checked the UTF-8 already; this only decodes it.
    // Never more characters than bytes: written in place, then cut to the count.
    value.resize(text.size());
    wchar_t* out = value.data();
    const auto* p = reinterpret_cast<const unsigned char*>(text.data());
    const auto* end = p + text.size();
    while (p < end) {
        unsigned c = *p++;
        if (c < 0x80) {
            *out++ = static_cast<wchar_t>(c);
            continue;
        }
        int more = 0;
        if (c >= 0xF0) {
            c &= 0x07;
            more = 3;
        } else if (c >= 0xE0) {
            c &= 0x0F;
            more = 2;
        } else if (c >= 0xC0) {
            c &= 0x1F;
            more = 1;
        } else {
            value.clear();
            return lmx::ELMX_BAD_CHAR_ENCODING;
        }
        for (; more > 0; --more) {
            if (p >= end || (*p & 0xC0) != 0x80) {
                value.clear();
                return lmx::ELMX_BAD_CHAR_ENCODING;
            }
            c = (c << 6) | (*p++ & 0x3F);
        }
        *out++ = static_cast<wchar_t>(c);
    }
    value.resize(static_cast<std::size_t>(out - value.data()));
    return lmx::ELMX_OK;
}

std::string write_utf8(std::wstring_view text) {
    std::string out;
    out.reserve(text.size());
    for (std::size_t i = 0; i < text.size(); ++i) {
        auto code = static_cast<std::uint32_t>(text[i]);
        // UTF-16 pairs, where wchar_t is 16 bits wide.
        if (code >= 0xD800 && code <= 0xDBFF && i + 1 < text.size()) {
            const auto low = static_cast<std::uint32_t>(text[i + 1]);
            if (low >= 0xDC00 && low <= 0xDFFF) {
                code = 0x10000 + ((code - 0xD800) << 10) + (low - 0xDC00);
                ++i;
            }
        }
        if (code > 0x10FFFF) code = 0xFFFD;
        utf8::unchecked::append(code, std::back_inserter(out));
    }
    return out;
}

lmx::elmx_error read_value(std::string_view text, bool& value) { return lmx::read_boolean(text, value); }

lmx::elmx_error read_value(std::string_view text, double& value) { return lmx::read_double(text, value); }

lmx::elmx_error read_hex(std::string_view text, lmx::c_binary& value) { return lmx::c_binary::from_hex(text, value); }

lmx::elmx_error read_base64(std::string_view text, lmx::c_binary& value) {
    return lmx::c_binary::from_base64(text, value);
}

lmx::elmx_error read_enum(std::string_view text, const char* const* names, int count, int& value) {
    for (int i = 0; i < count; ++i) {
        if (std::strlen(names[i]) == text.size() && text.compare(names[i]) == 0) {
            value = i;
            return lmx::ELMX_OK;
        }
    }
    // Enumerations are tokens: surrounding white space does not count.
    const std::string_view trimmed = lmx::trim_xml_space(text);
    if (trimmed.size() != text.size()) return read_enum(trimmed, names, count, value);
    return lmx::ELMX_VALUE_NOT_ENUMERATED;
}

std::string write_double(double value) {
    if (std::isnan(value)) return "NaN";
    if (std::isinf(value)) return value > 0 ? "INF" : "-INF";
    char buffer[64];
    const auto result = std::to_chars(buffer, buffer + sizeof buffer, value);
    return std::string(buffer, result.ptr);
}

}  // namespace quire::ooxml
