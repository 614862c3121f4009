#include "xls/strings.h"

#include "api/qrerror.h"
#include "xls/text_conversion.h"

namespace quire::xls {

namespace {

constexpr size_t ShortStringLimit = 256;   // characters allowed: fewer than this
constexpr size_t LongStringLimit = 65536;

uint8_t readFlags(RecordReader& reader, size_t& remaining)
{
    uint8_t flags;
    reader.readWithContinueRecords(&flags, 1, remaining);
    return flags;
}

XLString readCountedString(RecordReader& reader, size_t& remaining, size_t cch, bool hasFlags)
{
    XLString result;
    if (cch == 0 && remaining == 0)
        return result;
    if (hasFlags)
        result.flags = readFlags(reader, remaining);
    readStringCharacters(reader, remaining, cch, result.highByte(), false, result.chars);
    return result;
}

} // namespace

void readStringCharacters(RecordReader& reader, size_t& remaining, size_t cch, bool highByte,
                          bool flagsOnContinue, std::u16string& out)
{
    const size_t start = out.size();
    out.reserve(start + cch);
    size_t read = 0;
    while (read < cch) {
        if (remaining == 0) {
            if (!reader.enterContinue(remaining))
                throw qrerror("error in XLUnicodeString record #1");
            if (flagsOnContinue) {
                if (remaining == 0)
                    throw qrerror("XLUnicodeString::read(): data is empty");
                highByte = (reader.readUInt8(remaining) & StringFlags::HighByte) != 0;
            }
        }
        const size_t needed = highByte ? (cch - read) * 2 : cch - read;
        const size_t piece = needed < remaining ? needed : remaining;
        if (piece == 0)
            throw qrerror("XLUnicodeString::read(): data is empty");
        if (highByte && piece % 2 != 0)
            throw qrerror("error in XLUnicodeString record #2");
        const uint8_t* p = reader.readBytes(piece, remaining);
        if (highByte) {
            if (read + piece / 2 > cch)
                throw qrerror("error in XLUnicodeString record #3");
            for (size_t i = 0; i < piece; i += 2)
                out.push_back(static_cast<char16_t>(loadU16(p + i)));
            read += piece / 2;
        } else {
            if (read + piece > cch)
                throw qrerror("error in XLUnicodeString record #4");
            out.append(p, p + piece);
            read += piece;
        }
    }
}

XLString readXLUnicodeString(RecordReader& reader, size_t& remaining, bool hasFlags)
{
    const size_t cch = reader.readInt16(remaining);
    return readCountedString(reader, remaining, cch, hasFlags);
}

XLString readShortXLUnicodeString(RecordReader& reader, size_t& remaining, bool hasFlags)
{
    uint8_t cch;
    reader.readWithContinueRecords(&cch, 1, remaining);
    return readCountedString(reader, remaining, cch, hasFlags);
}

XLString readXLUnicodeStringNoCch(RecordReader& reader, size_t& remaining, size_t cch)
{
    XLString result;
    result.flags = readFlags(reader, remaining);
    readStringCharacters(reader, remaining, cch, result.highByte(), false, result.chars);
    return result;
}

bool fitsOneByte(const std::u16string& chars)
{
    for (char16_t c : chars)
        if (c > 0xFF)
            return false;
    return true;
}

void appendStringCharacters(std::vector<uint8_t>& out, const std::u16string& chars, bool highByte)
{
    if (highByte) {
        for (char16_t c : chars)
            appendU16(out, static_cast<uint16_t>(c));
    } else {
        for (char16_t c : chars)
            out.push_back(static_cast<uint8_t>(c));
    }
}

void writeShortXLUnicodeString(std::vector<uint8_t>& out, const std::u16string& text)
{
    if (text.size() >= ShortStringLimit)
        throw qrerror("ShortXLUnicodeString: string is too long");
    out.push_back(static_cast<uint8_t>(text.size()));
    out.push_back(StringFlags::HighByte);
    appendStringCharacters(out, text, true);
}

void writeXLUnicodeString(std::vector<uint8_t>& out, const std::u16string& text)
{
    if (text.size() >= LongStringLimit)
        throw qrerror("string is too long");
    appendU16(out, static_cast<uint16_t>(text.size()));
    out.push_back(StringFlags::HighByte);
    appendStringCharacters(out, text, true);
}

void writeXLUnicodeString(std::vector<uint8_t>& out, const XLString& text)
{
    if (text.chars.size() >= LongStringLimit)
        throw qrerror("string is too long");
    // A one-byte string that gained wider characters must switch to UTF-16.
    const bool highByte = text.highByte() || !fitsOneByte(text.chars);
    appendU16(out, static_cast<uint16_t>(text.chars.size()));
    out.push_back(highByte ? StringFlags::HighByte : 0);
    appendStringCharacters(out, text.chars, highByte);
}

void writeShortXLUnicodeString(std::vector<uint8_t>& out, const wchar_t* text)
{
    if (!text)
        throw qrerror("ShortXLUnicodeString: incorrect string");
    writeShortXLUnicodeString(out, toUtf16(text));
}

void writeXLUnicodeString(std::vector<uint8_t>& out, const wchar_t* text)
{
    if (!text)
        return;
    writeXLUnicodeString(out, toUtf16(text));
}

} // namespace quire::xls
