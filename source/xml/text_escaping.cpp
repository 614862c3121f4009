#include "lmx/text_escaping.h"

#include <array>
#include <cstdint>
#include <iterator>

#include <utf8.h>

namespace lmx {

namespace {

constexpr std::string_view replacement_character = "\xEF\xBF\xBD";

enum : std::uint8_t { plain = 0, special = 1, high = 2 };

constexpr std::array<std::uint8_t, 256> make_escape_classes()
{
    std::array<std::uint8_t, 256> classes{};
    for (int c = 0; c < 256; ++c) {
        std::uint8_t kind = plain;
        if (c < 0x20 || c == '"' || c == '\'' || c == '&' || c == '<' || c == '>')
            kind = special;
        else if (c >= 0x80)
            kind = high;
        classes[static_cast<std::size_t>(c)] = kind;
    }
    return classes;
}

constexpr std::array<std::uint8_t, 256> escape_classes = make_escape_classes();

// Writes one ASCII character that needs attention; previous is the character
// before it in the text, position its index.
void append_special(std::string& out, char c, char previous, std::size_t position, c_escape_context context)
{
    switch (c) {
    case '"': out += "&quot;"; return;
    case '\'': out += "&apos;"; return;
    case '&': out += "&amp;"; return;
    case '<': out += "&lt;"; return;
    case '>':
        out += (position >= 2 && previous == ']') ? "&gt;" : ">";
        return;
    case '\r': out += "&#13;"; return;
    case '\n': out += context == c_escape_context::attribute ? "&#10;" : "\n"; return;
    case '\t': out += context == c_escape_context::attribute ? "&#9;" : "\t"; return;
    default:
        return;  // other control characters have no XML 1.0 form
    }
}

bool is_xml_code_point(std::uint32_t c)
{
    return (c >= 0x20 && c <= 0xD7FF) || (c >= 0xE000 && c <= 0xFFFD) || (c >= 0x10000 && c <= 0x10FFFF);
}

}  // namespace

void append_escaped(std::string& out, std::string_view text, c_escape_context context)
{
    const char* const begin = text.data();
    const char* const end = begin + text.size();
    const char* p = begin;
    while (p < end) {
        const char* run = p;
        while (p < end && escape_classes[static_cast<unsigned char>(*p)] == plain)
            ++p;
        out.append(run, p);
        if (p >= end)
            break;
        if (escape_classes[static_cast<unsigned char>(*p)] == special) {
            append_special(out, *p, p > begin ? p[-1] : '\0', static_cast<std::size_t>(p - begin), context);
            ++p;
            continue;
        }
        // A run of high bytes: copy when it is valid UTF-8 of XML characters.
        const char* high_end = p;
        while (high_end < end && static_cast<unsigned char>(*high_end) >= 0x80)
            ++high_end;
        while (p < high_end) {
            const char* sequence = p;
            std::uint32_t code_point = 0;
            if (utf8::internal::validate_next(p, high_end, code_point) == utf8::internal::UTF8_OK &&
                is_xml_code_point(code_point)) {
                out.append(sequence, p);
            } else {
                out += replacement_character;
                p = sequence + 1;
                while (p < high_end && (static_cast<unsigned char>(*p) & 0xC0) == 0x80)
                    ++p;
            }
        }
    }
}

void append_escaped(std::string& out, std::wstring_view text, c_escape_context context)
{
    const std::size_t size = text.size();
    for (std::size_t i = 0; i < size; ++i) {
        std::uint32_t c = static_cast<std::uint32_t>(text[i]);
        if (c < 0x80) {
            if (escape_classes[c] == plain)
                out += static_cast<char>(c);
            else
                append_special(out, static_cast<char>(c), (i > 0 && text[i - 1] == L']') ? ']' : '\0', i, context);
            continue;
        }
        if (c >= 0xD800 && c <= 0xDBFF && i + 1 < size) {
            const auto low = static_cast<std::uint32_t>(text[i + 1]);
            if (low >= 0xDC00 && low <= 0xDFFF) {
                c = 0x10000 + ((c - 0xD800) << 10) + (low - 0xDC00);
                ++i;
            }
        }
        if (!is_xml_code_point(c)) {
            out += replacement_character;
            continue;
        }
        utf8::unchecked::append(c, std::back_inserter(out));
    }
}

}  // namespace lmx
