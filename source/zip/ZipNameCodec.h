// Conversions between entry names as stored in an archive (bytes) and wide
// text. Names flagged as UTF-8, or that are valid UTF-8, decode as UTF-8; any
// other bytes decode as code page 437, the format's original character set.
#pragma once

#include <string>

namespace quire::zip {

std::wstring decodeEntryName(const std::string& raw, bool flaggedUtf8);
std::wstring utf8ToWide(const std::string& text);
std::string wideToUtf8(const std::wstring& text);
bool isValidUtf8(const std::string& text);
bool isAscii(const std::string& text);

} // namespace quire::zip
