#pragma once
#include <string>

namespace quire {

// Conversions between wide text (UTF-32 wchar_t here) and UTF-8 / UTF-16.
std::string toUtf8(const std::wstring& text);
std::string toUtf8(const wchar_t* text);
std::wstring fromUtf8(const std::string& text);
std::u16string toUtf16(const std::wstring& text);
std::wstring fromUtf16(const char16_t* text, size_t length);

// Length in UTF-16 code units, the unit in which the file formats count text.
size_t utf16Length(const wchar_t* text);
size_t utf16Length(const std::wstring& text);

// A wide string cut to at most `units` UTF-16 code units without splitting a surrogate pair.
std::wstring cutToUtf16Units(const std::wstring& text, size_t units);

}  // namespace quire
