#include <gtest/gtest.h>

#include <sstream>

#include "lmx/text_escaping.h"
#include "lmx/xml_writer.h"
#include "scan_support.h"

namespace {

std::string escaped(std::string_view text, lmx::c_escape_context context = lmx::c_escape_context::content)
{
    std::string out;
    lmx::append_escaped(out, text, context);
    return out;
}

std::string escaped_wide(std::wstring_view text)
{
    std::string out;
    lmx::append_escaped(out, text, lmx::c_escape_context::content);
    return out;
}

TEST(WriterDeclaration, FlagsChooseTheDeclaration)
{
    std::string out;
    { lmx::c_xml_writer writer(out, 0); }
    EXPECT_EQ(out, "");
    { lmx::c_xml_writer writer(out, 1); }
    EXPECT_EQ(out, "<?xml version=\"1.0\" encoding=\"UTF-8\"?>");
    out.clear();
    { lmx::c_xml_writer writer(out, 3, "", "\r\n"); }
    EXPECT_EQ(out, "<?xml version=\"1.0\" encoding=\"UTF-8\" standalone=\"yes\"?>\r\n");
}

TEST(WriterLayout, NoTextsGivesOneLine)
{
    std::string out;
    lmx::c_xml_writer writer(out, 1);
    writer.start_element("worksheet");
    writer.declare_namespace("", "urn:main");
    writer.declare_namespace("r", "urn:r");
    writer.start_element("sheetData");
    writer.end_element();
    writer.start_element("v");
    writer.attribute("r", std::string_view("A1"));
    writer.text(std::string_view("42"));
    writer.end_element();
    writer.end_element();
    EXPECT_EQ(out, "<?xml version=\"1.0\" encoding=\"UTF-8\"?><worksheet xmlns=\"urn:main\" xmlns:r=\"urn:r\">"
                   "<sheetData/><v r=\"A1\">42</v></worksheet>");
    ASSERT_EQ(writer.declared_namespaces().size(), 2u);
    EXPECT_EQ(*writer.declared_prefix("urn:r"), "r");
}

TEST(WriterLayout, IndentAndLineEndPerLevel)
{
    std::string out;
    lmx::c_xml_writer writer(out, 0, "  ", "\n");
    writer.start_element("a");
    writer.start_element("b");
    writer.start_element("c");
    writer.end_element();
    writer.end_element();
    writer.start_element("d");
    writer.text(std::string_view("x"));
    writer.end_element();
    writer.end_element();
    EXPECT_EQ(out, "<a>\n  <b>\n    <c/>\n  </b>\n  <d>x</d>\n</a>\n");
    EXPECT_EQ(writer.depth(), 0u);
}

TEST(WriterLayout, StreamsToAnOutputStream)
{
    std::ostringstream stream;
    {
        lmx::c_xml_writer writer(stream, 1);
        writer.start_element("a");
        for (int i = 0; i < 20000; ++i) {
            writer.start_element("b");
            writer.text(std::string_view("some text"));
            writer.end_element();
        }
        writer.end_element();
    }
    const std::string text = stream.str();
    EXPECT_EQ(text.size(), 38u + 3 + 20000 * 16 + 4);
    EXPECT_EQ(xml_test::error_of(text).code, lmx::ELMX_OK);
}

TEST(WriterLayout, SchemaLocationOnTheRoot)
{
    std::string out;
    lmx::c_xml_writer writer(out);
    writer.set_schema_location("urn:a a.xsd");
    writer.start_element("a");
    writer.end_element();
    EXPECT_EQ(out, "<a xmlns:xsi=\"http://www.w3.org/2001/XMLSchema-instance\" xsi:schemaLocation=\"urn:a a.xsd\"/>");
}

TEST(WriterLayout, NamespaceTableIsSetOnce)
{
    static const lmx::c_namespace_entry first[] = {{1, "", "urn:main"}, {2, "r", "urn:r"}, {0, nullptr, nullptr}};
    static const lmx::c_namespace_entry second[] = {{1, "x", "urn:x"}, {0, nullptr, nullptr}};
    std::string out;
    lmx::c_xml_writer writer(out);
    writer.set_namespace_table(first);
    writer.set_namespace_table(second);
    EXPECT_EQ(writer.namespace_prefix(2), "r");
    EXPECT_EQ(writer.namespace_uri(1), "urn:main");
    EXPECT_EQ(writer.namespace_uri(3), "");
}

TEST(Escaping, MarkupCharacters)
{
    EXPECT_EQ(escaped("a\"b'c&d<e>f"), "a&quot;b&apos;c&amp;d&lt;e>f");
    EXPECT_EQ(escaped("x]]>y"), "x]]&gt;y");
    EXPECT_EQ(escaped("]>"), "]>");
    EXPECT_EQ(escaped("a]>"), "a]&gt;");
    EXPECT_EQ(escaped("a>"), "a>");
}

TEST(Escaping, Utf8PassesAndBrokenBytesAreReplaced)
{
    EXPECT_EQ(escaped("\xC3\xA9\xE2\x82\xAC\xF0\x9F\x98\x80"), "\xC3\xA9\xE2\x82\xAC\xF0\x9F\x98\x80");
    EXPECT_EQ(escaped("a\xC3z"), "a\xEF\xBF\xBDz");
    EXPECT_EQ(escaped("\xFF\xFE"), "\xEF\xBF\xBD\xEF\xBF\xBD");
    EXPECT_EQ(escaped("\xED\xA0\x80"), "\xEF\xBF\xBD");
}

// Without references a reader would turn these into spaces or LF, or refuse them.
TEST(Escaping, LineEndsAndControlCharactersSurviveAReadBack)
{
    EXPECT_EQ(escaped("a\r\nb\tc"), "a&#13;\nb\tc");
    EXPECT_EQ(escaped("a\r\nb\tc", lmx::c_escape_context::attribute), "a&#13;&#10;b&#9;c");
    EXPECT_EQ(escaped("a\x01" "b\x1f"), "ab");
}

TEST(Escaping, WideTextWithSurrogatePairs)
{
    EXPECT_EQ(escaped_wide(L"\u00e9<"), "\xC3\xA9&lt;");
    EXPECT_EQ(escaped_wide(std::wstring{wchar_t(0xD83D), wchar_t(0xDE00)}), "\xF0\x9F\x98\x80");
    EXPECT_EQ(escaped_wide(std::wstring{wchar_t(0x1F600)}), "\xF0\x9F\x98\x80");
    EXPECT_EQ(escaped_wide(std::wstring{wchar_t(0xD83D), L'x'}), "\xEF\xBF\xBDx");
    EXPECT_EQ(escaped_wide(std::wstring{L'a', wchar_t(0xDE00)}), "a\xEF\xBF\xBD");
    EXPECT_EQ(escaped_wide(L"x]]>"), "x]]&gt;");
}

TEST(WriterRoundTrip, WhatIsWrittenReadsBackTheSame)
{
    const std::string value = "  <tricky> & \"quoted\" 'single' ]]> \r\n\t\xC3\xA9 ";
    std::string out;
    {
        lmx::c_xml_writer writer(out, 1);
        writer.start_element("a");
        writer.attribute("v", std::string_view(value));
        writer.text(std::string_view(value));
        writer.end_element();
    }
    EXPECT_EQ(xml_test::events_of(out), "S{}a|A{}v=" + value + "|T " + value + "|E");
}

}  // namespace
