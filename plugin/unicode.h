#pragma once
// Conversions between the units of host text (UTF-16, UTF-32) and library text (wchar_t).
#include <cstddef>
#include <string>

namespace quire_plugin {

// Code points 0x10000-0x10FFFF become surrogate pairs, surrogate code points are dropped and
// values beyond 0x10FFFF become U+FFFD.
std::u16string utf32ToUtf16(const char32_t* units, size_t count);

// Surrogate pairs are joined; a lone surrogate becomes U+FFFD.
std::wstring utf16ToWide(const char16_t* units, size_t count);

std::string wideToUtf8(const wchar_t* text);

// Units up to the terminator.
size_t wideLength(const wchar_t* text);

}  // namespace quire_plugin
