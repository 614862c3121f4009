#pragma once
#include <string>
#include <string_view>

namespace lmx {

enum class c_escape_context {
    content,    // element text
    attribute,  // attribute value in double quotes
};

// Appends UTF-8 text escaped for XML: quotes, apostrophes, ampersands and
// less-than signs become references, a greater-than sign only where it
// follows ']' (so that "]]>" cannot appear). Characters that XML 1.0 cannot
// carry are dropped and broken UTF-8 becomes U+FFFD; carriage returns, and in
// attribute values tabs and line feeds too, are written as character
// references so that a reader gets them back unchanged.
void append_escaped(std::string& out, std::string_view utf8_text, c_escape_context context);

// The same from wide text (UTF-32, or UTF-16 with surrogate pairs); an
// unpaired surrogate becomes U+FFFD.
void append_escaped(std::string& out, std::wstring_view wide_text, c_escape_context context);

}  // namespace lmx
