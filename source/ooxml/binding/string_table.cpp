#include "ooxml/binding/string_table.h"

namespace quire::ooxml {

bool text_needs_preserve(std::string_view utf8) {
    if (utf8.empty()) return false;
    const auto blank = [](char ch) { return ch == ' ' || ch == '\t' || ch == '\n' || ch == '\r'; };
    return blank(utf8.front()) || blank(utf8.back());
}

void append_plain_string_item(std::string& out, std::string_view utf8) {
    out += text_needs_preserve(utf8) ? "<si><t xml:space=\"preserve\">" : "<si><t>";
    lmx::append_escaped(out, utf8, lmx::c_escape_context::content);
    out += "</t></si>";
}

}  // namespace quire::ooxml
