#pragma once
// Byte-format detection and conversion of the input to UTF-8 (internal).
#include <cstddef>
#include <string>

namespace lmx {

enum class c_byte_format {
    undecided,
    single_byte,
    utf8,
    utf16_big_endian,
    utf16_little_endian,
    ucs2_big_endian,
    ucs2_little_endian,
};

struct c_detected_format {
    c_byte_format format = c_byte_format::undecided;  // undecided: not recognised
    std::size_t mark_length = 0;                       // byte-order mark to skip
};

// Decides the byte format from the first bytes of a document.
c_detected_format detect_byte_format(const char* data, std::size_t size);

bool is_utf16(c_byte_format format);
bool is_big_endian(c_byte_format format);

// Converts UTF-16 (or UCS-2, which admits no surrogates) to UTF-8. Returns
// false on an odd length or a broken surrogate.
bool utf16_to_utf8(const char* data, std::size_t size, c_byte_format format, std::string& out);

// Converts ISO-8859-1 bytes, or Windows-1252 bytes when asked, to UTF-8.
void single_byte_to_utf8(const char* data, std::size_t size, bool windows_1252, std::string& out);

// First byte that is not part of a valid UTF-8 encoding of an XML character,
// or end when there is none.
const char* find_invalid_xml_utf8(const char* begin, const char* end);

// XML 1.1 line ends: NEL (U+0085) and LS (U+2028) become LF. Returns true
// when anything changed.
bool fold_xml11_line_ends(std::string& text);

}  // namespace lmx
