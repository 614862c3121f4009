#pragma once
#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace quire {

// Strings inside one record's data, as MS-XLS lays them out. Each reader advances `pos` and
// throws qrerror(message) when the string runs past the data.
std::wstring readUnicodeString(const uint8_t* data, size_t size, size_t& pos, bool shortCount,
                               const char* message);
// BIFF5 strings: a count and bytes in the file's code page (read as Latin-1).
std::wstring readByteString(const uint8_t* data, size_t size, size_t& pos, bool shortCount,
                            const char* message);

// Appends an XLUnicodeString (or the short form) with UTF-16 characters.
void appendUnicodeString(std::vector<uint8_t>& out, const std::wstring& text, bool shortCount);

}  // namespace quire
