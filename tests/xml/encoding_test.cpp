#include <gtest/gtest.h>

#include <string>

#include "scan_support.h"

namespace {

using xml_test::error_of;
using xml_test::events_of;

std::string utf16(std::u16string_view text, bool big_endian, bool with_mark)
{
    std::string bytes;
    auto put = [&](char16_t unit) {
        const char high = static_cast<char>(unit >> 8), low = static_cast<char>(unit & 0xFF);
        bytes += big_endian ? high : low;
        bytes += big_endian ? low : high;
    };
    if (with_mark)
        put(0xFEFF);
    for (const char16_t unit : text)
        put(unit);
    return bytes;
}

TEST(EncodingDetection, Utf8MarkWithUtf8DeclarationReads)
{
    EXPECT_EQ(events_of("\xEF\xBB\xBF<?xml version=\"1.0\" encoding=\"UTF-8\"?><a>\xC3\xA9</a>"),
              "S{}a|T \xC3\xA9|E");
}

TEST(EncodingDetection, Utf8BytesDeclaringUtf16AreAMismatch)
{
    const lmx::c_error error = error_of("\xEF\xBB\xBF<?xml version=\"1.0\" encoding=\"UTF-16\"?><a/>");
    EXPECT_EQ(error.code, lmx::ELMX_ENCODING_MISMATCH);
    EXPECT_EQ(error.detail, "Mis-match between specfied encoding and byte format");
}

TEST(EncodingDetection, Utf16LittleEndianWithoutMark)
{
    EXPECT_EQ(events_of(utf16(u"<a b=\"\u00e9\">x\U0001F600</a>", false, false)),
              "S{}a|A{}b=\xC3\xA9|T x\xF0\x9F\x98\x80|E");
}

TEST(EncodingDetection, Utf16LittleEndianWithMarkAndDeclaration)
{
    EXPECT_EQ(events_of(utf16(u"<?xml version=\"1.0\" encoding=\"UTF-16\"?><a>z</a>", false, true)),
              "S{}a|T z|E");
}

TEST(EncodingDetection, Utf16BigEndianWithAndWithoutMark)
{
    EXPECT_EQ(events_of(utf16(u"<a>\u20ac</a>", true, true)), "S{}a|T \xE2\x82\xAC|E");
    EXPECT_EQ(events_of(utf16(u"<a>\u20ac</a>", true, false)), "S{}a|T \xE2\x82\xAC|E");
}

TEST(EncodingDetection, Utf16DeclaringUtf8IsAMismatch)
{
    EXPECT_EQ(error_of(utf16(u"<?xml version=\"1.0\" encoding=\"UTF-8\"?><a/>", false, true)).code,
              lmx::ELMX_ENCODING_MISMATCH);
}

TEST(EncodingDetection, BrokenSurrogateInUtf16IsRefused)
{
    std::u16string text = u"<a>x</a>";
    text[3] = 0xD800;
    EXPECT_EQ(error_of(utf16(text, false, false)).code, lmx::ELMX_ENCODING_MISMATCH);
}

TEST(EncodingDetection, Ucs2DeclarationRefusesSurrogatePairs)
{
    EXPECT_EQ(events_of(utf16(u"<?xml version=\"1.0\" encoding=\"ISO-10646-UCS-2\"?><a>b</a>", false, true)),
              "S{}a|T b|E");
    EXPECT_EQ(error_of(utf16(u"<?xml version=\"1.0\" encoding=\"ISO-10646-UCS-2\"?><a>\U0001F600</a>", false,
                             true))
                  .code,
              lmx::ELMX_ENCODING_MISMATCH);
}

TEST(EncodingDetection, UnrecognisedFirstBytes)
{
    const lmx::c_error error = error_of("\x01\x02<a/>");
    EXPECT_EQ(error.code, lmx::ELMX_BAD_CHAR_ENCODING);
    EXPECT_EQ(error.detail, "Unrecognised character encoding");
}

TEST(EncodingDetection, EmptyDocumentIsPrematureEnd)
{
    EXPECT_EQ(error_of("").code, lmx::ELMX_UNEXPECTED_EOM);
}

TEST(DeclaredEncoding, UnknownNameIsRefused)
{
    const lmx::c_error error = error_of("<?xml version=\"1.0\" encoding=\"EBCDIC-US\"?><a/>");
    EXPECT_EQ(error.code, lmx::ELMX_BAD_CHAR_ENCODING);
    EXPECT_EQ(error.detail, "Unknown character encoding specified");
}

// Real workbooks declare "utf-8"; XML matches encoding names without case.
TEST(DeclaredEncoding, NamesMatchWithoutRegardToCase)
{
    EXPECT_EQ(events_of("<?xml version=\"1.0\" encoding=\"utf-8\"?><a/>"), "S{}a|E");
    EXPECT_EQ(events_of("<?xml version=\"1.0\" encoding=\"iso-8859-1\"?><a>\xE9</a>"), "S{}a|T \xC3\xA9|E");
}

TEST(DeclaredEncoding, Latin1BytesBecomeUtf8)
{
    EXPECT_EQ(events_of("<?xml version=\"1.0\" encoding=\"ISO-8859-1\"?><a b=\"\xFC\">\xE9\x80</a>"),
              "S{}a|A{}b=\xC3\xBC|T \xC3\xA9\xC2\x80|E");
}

TEST(DeclaredEncoding, Windows1252UsesItsOwnCharactersAbove0x7F)
{
    EXPECT_EQ(events_of("<?xml version=\"1.0\" encoding=\"Windows-1252\"?><a>\x80\x93\xE9</a>"),
              "S{}a|T \xE2\x82\xAC\xE2\x80\x9C\xC3\xA9|E");
    EXPECT_EQ(events_of("<?xml version=\"1.0\" encoding=\"cp-1252\"?><a>\x85</a>"), "S{}a|T \xE2\x80\xA6|E");
}

TEST(DeclaredEncoding, InvalidUtf8IsAMismatch)
{
    EXPECT_EQ(error_of("<a>\xC3\x28</a>").code, lmx::ELMX_ENCODING_MISMATCH);
    EXPECT_EQ(error_of("<a>\xED\xA0\x80</a>").code, lmx::ELMX_ENCODING_MISMATCH);  // surrogate
    EXPECT_EQ(error_of("<a>\xF4\x90\x80\x80</a>").code, lmx::ELMX_ENCODING_MISMATCH);  // above U+10FFFF
}

TEST(DeclaredEncoding, ControlCharactersAreNotXml)
{
    EXPECT_EQ(error_of("<a>\x01</a>").code, lmx::ELMX_NOT_WELL_FORMED);
    EXPECT_EQ(error_of(std::string("<a>\0</a>", 8)).code, lmx::ELMX_NOT_WELL_FORMED);
    EXPECT_EQ(error_of("<a>\xEF\xBF\xBF</a>").code, lmx::ELMX_NOT_WELL_FORMED);
}

TEST(LineEnds, CrLfAndLoneCrReadAsLf)
{
    EXPECT_EQ(events_of("<a>1\r\n2\r3\n4</a>"), "S{}a|T 1\n2\n3\n4|E");
    EXPECT_EQ(events_of("<a><![CDATA[x\r\ny]]></a>"), "S{}a|T x\ny|E");
}

TEST(LineEnds, Xml11FoldsNelAndLineSeparator)
{
    EXPECT_EQ(events_of("<?xml version=\"1.1\"?><a>1\xC2\x85" "2\xE2\x80\xA8" "3</a>"), "S{}a|T 1\n2\n3|E");
}

// In XML 1.0 NEL and LS are ordinary characters and must survive.
TEST(LineEnds, Xml10KeepsNelAndLineSeparator)
{
    EXPECT_EQ(events_of("<a>1\xC2\x85" "2\xE2\x80\xA8" "3</a>"), "S{}a|T 1\xC2\x85" "2\xE2\x80\xA8" "3|E");
}

TEST(LineEnds, ErrorLineCountsEveryKindOfLineEnd)
{
    EXPECT_EQ(error_of("<a>\n\r\n\r<b></a>").xml_line, 4);
    EXPECT_EQ(error_of("<a>\n\n<b x='1' x='2'/></a>").xml_line, 3);
}

}  // namespace
