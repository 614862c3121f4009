// XLUnicodeString, ShortXLUnicodeString and XLUnicodeStringNoCch, read and written.

#include <gtest/gtest.h>

#include "test_support.h"
#include "xls/little_endian.h"
#include "xls/strings.h"
#include "xls/text_conversion.h"

using namespace quire::xls;
using namespace quire::xls::test;

namespace {

void appendRecord(std::vector<uint8_t>& stream, uint16_t type, const std::vector<uint8_t>& data)
{
    appendU16(stream, type);
    appendU16(stream, static_cast<uint16_t>(data.size()));
    stream.insert(stream.end(), data.begin(), data.end());
}

// Reads one string from the first record of 'stream'.
template <typename Read>
XLString readFirst(const std::vector<uint8_t>& stream, Read read, size_t* left = nullptr)
{
    RecordReader reader(stream);
    RecordHeader h;
    reader.readHeader(h);
    size_t remaining = h.length;
    XLString s = read(reader, remaining);
    if (left)
        *left = remaining;
    return s;
}

XLString readLong(const std::vector<uint8_t>& stream)
{
    return readFirst(stream, [](RecordReader& r, size_t& n) { return readXLUnicodeString(r, n); });
}

} // namespace

TEST(XLUnicodeString, OneByteAndUtf16CharactersAreRead)
{
    std::vector<uint8_t> data = {3, 0, 0, 'a', 0xE9, 'c'};
    std::vector<uint8_t> stream;
    appendRecord(stream, 0x0204, data);
    XLString s = readLong(stream);
    EXPECT_FALSE(s.highByte());
    EXPECT_EQ(s.chars, u"a\u00e9c");

    stream.clear();
    appendRecord(stream, 0x0204, {2, 0, 1, 0x2D, 0x4E, 0x87, 0x65});
    s = readLong(stream);
    EXPECT_TRUE(s.highByte());
    EXPECT_EQ(s.chars, u"\u4e2d\u6587");
}

TEST(XLUnicodeString, EmptyStringAtTheRecordEndHasNoFlagsByte)
{
    std::vector<uint8_t> stream;
    appendRecord(stream, 0x0204, {0, 0});
    appendRecord(stream, 0x000A, {});
    size_t left = 99;
    const XLString s =
        readFirst(stream, [](RecordReader& r, size_t& n) { return readXLUnicodeString(r, n); }, &left);
    EXPECT_TRUE(s.chars.empty());
    EXPECT_EQ(left, 0u);

    stream.clear();
    appendRecord(stream, 0x0204, {0, 0, 1, 9});
    readFirst(stream, [](RecordReader& r, size_t& n) { return readXLUnicodeString(r, n); }, &left);
    EXPECT_EQ(left, 1u);  // the flags byte was read
}

TEST(XLUnicodeString, CharactersGoOnInContinueRecordsWithTheSameWidth)
{
    std::vector<uint8_t> stream;
    appendRecord(stream, 0x0204, {4, 0, 1, 'a', 0});
    appendRecord(stream, 0x003C, {'b', 0, 'c', 0});
    appendRecord(stream, 0x003C, {'d', 0});
    EXPECT_EQ(readLong(stream).chars, u"abcd");
}

TEST(XLUnicodeString, BrokenContinuationsAreRefused)
{
    std::vector<uint8_t> stream;
    appendRecord(stream, 0x0204, {4, 0, 0, 'a', 'b'});
    appendRecord(stream, 0x000A, {});
    EXPECT_EQ(failureOf([&] { readLong(stream); }), "error in XLUnicodeString record #1");

    stream.clear();
    appendRecord(stream, 0x0204, {4, 0, 1, 'a', 0, 'b'});
    appendRecord(stream, 0x003C, {0, 'c', 0, 'd', 0});
    EXPECT_EQ(failureOf([&] { readLong(stream); }), "error in XLUnicodeString record #2");

    stream.clear();
    appendRecord(stream, 0x0204, {4, 0, 0, 'a', 'b'});
    appendRecord(stream, 0x003C, {});
    EXPECT_EQ(failureOf([&] { readLong(stream); }), "XLUnicodeString::read(): data is empty");
}

TEST(ShortXLUnicodeString, CountIsOneByteAndFlagsMayBeAbsent)
{
    std::vector<uint8_t> stream;
    appendRecord(stream, 0x0085, {5, 0, 'S', 'h', 'e', 'e', 't'});
    EXPECT_EQ(readFirst(stream, [](RecordReader& r, size_t& n) { return readShortXLUnicodeString(r, n); }).chars,
              u"Sheet");
    stream.clear();
    appendRecord(stream, 0x0085, {3, 'B', '5', '!'});  // BIFF5: no flags byte
    EXPECT_EQ(
        readFirst(stream, [](RecordReader& r, size_t& n) { return readShortXLUnicodeString(r, n, false); }).chars,
        u"B5!");
    stream.clear();
    appendRecord(stream, 0x0018, {0, 'x', 0});
    EXPECT_EQ(readFirst(stream, [](RecordReader& r, size_t& n) { return readXLUnicodeStringNoCch(r, n, 2); }).chars,
              std::u16string(u"x\0", 2));
}

TEST(StringWriting, LimitsCountUtf16Units)
{
    std::vector<uint8_t> out;
    const std::wstring name255(255, L'n');
    writeShortXLUnicodeString(out, name255.c_str());
    ASSERT_EQ(out.size(), 2u + 255 * 2);
    EXPECT_EQ(out[0], 255);
    EXPECT_EQ(out[1], 1);  // fHighByte
    const std::wstring name256(256, L'n');
    EXPECT_EQ(failureOf([&] { writeShortXLUnicodeString(out, name256.c_str()); }),
              "ShortXLUnicodeString: string is too long");
    const std::wstring emoji128(128, static_cast<wchar_t>(0x1F600));  // 256 UTF-16 units
    EXPECT_EQ(failureOf([&] { writeShortXLUnicodeString(out, emoji128.c_str()); }),
              "ShortXLUnicodeString: string is too long");
    EXPECT_EQ(failureOf([&] { writeShortXLUnicodeString(out, static_cast<const wchar_t*>(nullptr)); }),
              "ShortXLUnicodeString: incorrect string");

    out.clear();
    writeXLUnicodeString(out, static_cast<const wchar_t*>(nullptr));
    EXPECT_TRUE(out.empty());
    const std::wstring long65535(65535, L'x');
    writeXLUnicodeString(out, long65535.c_str());
    EXPECT_EQ(out.size(), 3u + 65535 * 2);
    const std::wstring long65536(65536, L'x');
    EXPECT_EQ(failureOf([&] { writeXLUnicodeString(out, long65536.c_str()); }), "string is too long");
}

TEST(StringWriting, WrittenStringsReadBack)
{
    const std::wstring text = L"Gr\u00fc\u00dfe \u4e16\u754c \U0001F600";
    std::vector<uint8_t> data;
    writeXLUnicodeString(data, text.c_str());
    std::vector<uint8_t> stream;
    appendRecord(stream, 0x0204, data);
    EXPECT_EQ(toWide(readLong(stream).chars), text);

    XLString narrow;
    narrow.chars = u"plain";
    data.clear();
    writeXLUnicodeString(data, narrow);
    EXPECT_EQ(data.size(), 3u + 5);  // one byte per character kept
    narrow.chars = u"wide \u0100";
    data.clear();
    writeXLUnicodeString(data, narrow);
    EXPECT_EQ(data[2], 1);  // switched to UTF-16
}

TEST(TextConversion, SurrogatesAndInvalidCodePoints)
{
    EXPECT_EQ(toUtf16(L"\U0001F600"), std::u16string(u"\xD83D\xDE00"));
    EXPECT_EQ(toWide(std::u16string(u"a\xD800z")), L"a\uFFFDz");
    const wchar_t bad[] = {static_cast<wchar_t>(0x110000), 0};
    EXPECT_EQ(failureOf([&] { toUtf16(bad); }), "Invalid code point");
}
