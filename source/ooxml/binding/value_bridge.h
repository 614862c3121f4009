#pragma once
#include <cstdint>
#include <string>
#include <string_view>

#include "lmx/binary.h"
#include "lmx/error.h"
#include "lmx/value_conversion.h"
#include "lmx/xml_writer.h"

namespace quire::ooxml {

// Conversions between the text of attributes and simple elements and the values held by
// the bound classes. Reading returns an lmx error code; writing never fails.

lmx::elmx_error read_value(std::string_view text, std::wstring& value);
lmx::elmx_error read_value(std::string_view text, bool& value);
lmx::elmx_error read_value(std::string_view text, double& value);
lmx::elmx_error read_hex(std::string_view text, lmx::c_binary& value);
lmx::elmx_error read_base64(std::string_view text, lmx::c_binary& value);

// Integers of the schema's width, stored in the class's wider field type.
template <class Narrow, class Field>
lmx::elmx_error read_integer_as(std::string_view text, Field& value) {
    Narrow narrow{};
    const lmx::elmx_error result = lmx::read_integer(text, narrow);
    if (result == lmx::ELMX_OK) value = static_cast<Field>(narrow);
    return result;
}

// An enumeration value as its index in `names` (count entries).
lmx::elmx_error read_enum(std::string_view text, const char* const* names, int count, int& value);

// Wide text as UTF-8 (characters outside Unicode become U+FFFD).
std::string write_utf8(std::wstring_view text);
// Shortest text that reads back as the same double.
std::string write_double(double value);
inline std::string_view write_bool(bool value) { return value ? "1" : "0"; }

inline void put_attribute(lmx::c_xml_writer& writer, const char* name, const std::wstring& value) {
    writer.attribute(name, std::wstring_view(value));
}
inline void put_attribute(lmx::c_xml_writer& writer, const char* name, bool value) {
    writer.attribute(name, write_bool(value));
}
inline void put_attribute(lmx::c_xml_writer& writer, const char* name, double value) {
    writer.attribute(name, std::string_view(write_double(value)));
}
template <class Integer>
void put_integer_attribute(lmx::c_xml_writer& writer, const char* name, Integer value) {
    writer.attribute(name, std::string_view(lmx::write_integer(value)));
}

inline void put_text(lmx::c_xml_writer& writer, const std::wstring& value) { writer.text(std::wstring_view(value)); }
inline void put_text(lmx::c_xml_writer& writer, bool value) { writer.text(write_bool(value)); }
inline void put_text(lmx::c_xml_writer& writer, double value) { writer.text(std::string_view(write_double(value))); }
template <class Integer>
void put_integer_text(lmx::c_xml_writer& writer, Integer value) {
    writer.text(std::string_view(lmx::write_integer(value)));
}

}  // namespace quire::ooxml
