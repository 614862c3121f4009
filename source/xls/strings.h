#pragma once

// The string structures of BIFF8 records: ShortXLUnicodeString,
// XLUnicodeString and XLUnicodeStringNoCch, read across CONTINUE records and
// written from wide text.

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "xls/record_reader.h"

namespace quire::xls {

namespace StringFlags {
constexpr uint8_t HighByte = 0x01;  // characters stored as UTF-16LE, else one byte each
constexpr uint8_t ExtSt = 0x04;     // phonetic data follows (shared strings)
constexpr uint8_t RichSt = 0x08;    // formatting runs follow (shared strings)
} // namespace StringFlags

struct XLString {
    uint8_t flags = 0;
    std::u16string chars;

    bool highByte() const { return (flags & StringFlags::HighByte) != 0; }
};

// With hasFlags false the structure has no flags byte (BIFF5 byte strings).
XLString readXLUnicodeString(RecordReader& reader, size_t& remaining, bool hasFlags = true);
XLString readShortXLUnicodeString(RecordReader& reader, size_t& remaining, bool hasFlags = true);
// The character count comes from elsewhere.
XLString readXLUnicodeStringNoCch(RecordReader& reader, size_t& remaining, size_t cch);

// Appends cch characters to out, continuing into CONTINUE records. With
// flagsOnContinue each CONTINUE record that interrupts the characters starts
// with a flags byte giving fHighByte for the rest (shared string table);
// otherwise the characters go on with the same fHighByte.
void readStringCharacters(RecordReader& reader, size_t& remaining, size_t cch, bool highByte,
                          bool flagsOnContinue, std::u16string& out);

// Writers append the structure to a record's data, always with fHighByte 1.
// A null string fails with "ShortXLUnicodeString: incorrect string".
void writeShortXLUnicodeString(std::vector<uint8_t>& out, const wchar_t* text);
// A null string writes nothing.
void writeXLUnicodeString(std::vector<uint8_t>& out, const wchar_t* text);
// Already converted text; fails on the same limits.
void writeShortXLUnicodeString(std::vector<uint8_t>& out, const std::u16string& text);
void writeXLUnicodeString(std::vector<uint8_t>& out, const std::u16string& text);
// Keeps the string's own fHighByte (as read from a file).
void writeXLUnicodeString(std::vector<uint8_t>& out, const XLString& text);
// Characters of a string with the given fHighByte, without count or flags.
void appendStringCharacters(std::vector<uint8_t>& out, const std::u16string& chars, bool highByte);
// True when every character fits one byte, so fHighByte may be 0.
bool fitsOneByte(const std::u16string& chars);

} // namespace quire::xls
