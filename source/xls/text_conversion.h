#pragma once

// Wide text (UTF-32 wchar_t) to and from the UTF-16 units of the file format.

#include <string>

namespace quire::xls {

// Fails with "Invalid code point" for values beyond U+10FFFF or surrogates.
std::u16string toUtf16(const std::wstring& text);
std::u16string toUtf16(const wchar_t* text);
// Unpaired surrogates, which files do contain, become U+FFFD.
std::wstring toWide(const std::u16string& text);

} // namespace quire::xls
