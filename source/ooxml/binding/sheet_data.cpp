#include "ooxml/binding/sheet_data.h"

#include <cstring>

namespace quire::ooxml {

const char* const k_cell_type_names[7] = {"b", "n", "e", "s", "str", "inlineStr", "d"};
const char* const k_formula_type_names[4] = {"normal", "array", "dataTable", "shared"};

bool parse_cell_column(std::string_view reference, std::uint32_t& column) {
    std::size_t i = 0;
    std::uint32_t value = 0;
    while (i < reference.size() && i < 3) {
        char ch = reference[i];
        if (ch >= 'a' && ch <= 'z') ch = static_cast<char>(ch - 'a' + 'A');
        if (ch < 'A' || ch > 'Z') break;
        value = value * 26 + static_cast<std::uint32_t>(ch - 'A' + 1);
        ++i;
    }
    if (i == 0 || value > 16384) return false;
    const std::size_t digits = i;
    std::uint32_t row = 0;
    while (i < reference.size() && reference[i] >= '0' && reference[i] <= '9' && i - digits < 8)
        row = row * 10 + static_cast<std::uint32_t>(reference[i++] - '0');
    if (i == digits || i != reference.size() || row == 0 || row > 1048576) return false;
    column = value - 1;
    return true;
}

std::size_t format_cell_reference(char* out, std::uint32_t column, std::uint32_t row_number) {
    char letters[4];
    std::size_t count = 0;
    std::uint32_t value = column + 1;
    while (value > 0 && count < sizeof letters) {
        const std::uint32_t digit = (value - 1) % 26;
        letters[count++] = static_cast<char>('A' + digit);
        value = (value - 1) / 26;
    }
    std::size_t size = 0;
    while (count > 0) out[size++] = letters[--count];
    char digits[10];
    std::size_t n = 0;
    do {
        digits[n++] = static_cast<char>('0' + row_number % 10);
        row_number /= 10;
    } while (row_number > 0 && n < sizeof digits);
    while (n > 0) out[size++] = digits[--n];
    return size;
}

void append_decimal(std::string& out, std::uint64_t value) {
    char digits[20];
    std::size_t n = 0;
    do {
        digits[n++] = static_cast<char>('0' + value % 10);
        value /= 10;
    } while (value > 0);
    while (n > 0) out += digits[--n];
}

lmx::elmx_error sheet_data_failure(lmx::c_xml_reader& reader, lmx::elmx_error code, std::string_view item) {
    reader.set_program_file("source/ooxml/binding/sheet_data.h");
    return reader.capture_error(code, std::string(item), 0);
}

bool is_main_namespace(std::string_view uri, const char* main_namespace) { return uri == main_namespace; }

void raw_attribute_sink::text(const char* name, std::string_view value) {
    out += ' ';
    out += name;
    out += "=\"";
    lmx::append_escaped(out, value, lmx::c_escape_context::attribute);
    out += '"';
}

}  // namespace quire::ooxml
