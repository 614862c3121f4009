#include <gtest/gtest.h>

#include "scan_support.h"

namespace {

using xml_test::error_of;
using xml_test::events_of;

TEST(XmlDeclaration, VersionEncodingAndStandaloneAreRead)
{
    const std::string document = "<?xml version=\"1.0\" encoding=\"UTF-8\" standalone=\"yes\"?>\r\n<a/>";
    lmx::c_xml scanner(document.data(), document.size());
    EXPECT_EQ(scanner.next(), lmx::xml_event::start_element);
    EXPECT_EQ(scanner.version(), "1.0");
    EXPECT_EQ(scanner.declared_encoding(), "UTF-8");
}

TEST(XmlDeclaration, VersionMustComeFirst)
{
    const lmx::c_error error = error_of("<?xml encoding=\"UTF-8\"?><a/>");
    EXPECT_EQ(error.code, lmx::ELMX_BAD_XML_DECL);
    EXPECT_EQ(error.detail, "Version not present in XML Decl");
}

TEST(XmlDeclaration, UnknownVersionIsNotUnderstood)
{
    const lmx::c_error error = error_of("<?xml version=\"2.0\"?><a/>");
    EXPECT_EQ(error.code, lmx::ELMX_BAD_XML_VERSION);
    EXPECT_EQ(error.detail, "XML version 2.0 not understood");
}

TEST(XmlDeclaration, OnlyAtTheVeryStart)
{
    EXPECT_EQ(error_of(" <?xml version=\"1.0\"?><a/>").detail, "XML declaration not at start of document");
    EXPECT_EQ(error_of("<a><?xml version=\"1.0\"?></a>").code, lmx::ELMX_BAD_XML_DECL);
    EXPECT_EQ(events_of("<?xml-stylesheet href=\"s\"?><a/>"), "S{}a|E");
}

TEST(XmlDeclaration, BadStandaloneAndMissingEnd)
{
    EXPECT_EQ(error_of("<?xml version=\"1.0\" standalone=\"maybe\"?><a/>").code, lmx::ELMX_BAD_XML_DECL);
    EXPECT_EQ(error_of("<?xml version=\"1.0\" <a/>").code, lmx::ELMX_BAD_XML_DECL);
}

TEST(Comments, AreSkippedAndJoinTheTextAroundThem)
{
    EXPECT_EQ(events_of("<!-- c --><a>x<!-- - y -->z</a><!--e-->"), "S{}a|T xz|E");
}

TEST(Comments, TwoHyphensMustEndTheComment)
{
    const lmx::c_error error = error_of("<a><!-- a -- b --></a>");
    EXPECT_EQ(error.code, lmx::ELMX_BAD_COMMENT);
    EXPECT_EQ(error.detail, "End of comment not Well-Formed");
}

TEST(Cdata, TextIsTakenUnchanged)
{
    EXPECT_EQ(events_of("<a>1<![CDATA[<b>&amp;]]]]>2</a>"), "S{}a|T 1<b>&amp;]]2|E");
}

TEST(Cdata, UnterminatedIsPrematureEnd)
{
    EXPECT_EQ(error_of("<a><![CDATA[x</a>").code, lmx::ELMX_UNEXPECTED_EOM);
}

TEST(ProcessingInstructions, AreSkipped)
{
    EXPECT_EQ(events_of("<?pi x?><a>1<?pi y?>2</a><?pi z?>"), "S{}a|T 12|E");
}

TEST(Tags, EmptyElementGivesStartAndEnd)
{
    const std::string document = "<a><b x=\"1\"/></a>";
    lmx::c_xml scanner(document.data(), document.size());
    ASSERT_EQ(scanner.next(), lmx::xml_event::start_element);
    ASSERT_EQ(scanner.next(), lmx::xml_event::start_element);
    EXPECT_TRUE(scanner.is_empty_element());
    EXPECT_EQ(scanner.depth(), 2u);
    ASSERT_EQ(scanner.next(), lmx::xml_event::end_element);
    EXPECT_EQ(scanner.local_name(), "b");
    ASSERT_EQ(scanner.next(), lmx::xml_event::end_element);
    EXPECT_EQ(scanner.local_name(), "a");
    EXPECT_EQ(scanner.next(), lmx::xml_event::end_document);
    EXPECT_EQ(scanner.next(), lmx::xml_event::end_document);
}

TEST(Tags, MismatchedEndTagNamesBoth)
{
    const lmx::c_error error = error_of("<a><b></c></a>");
    EXPECT_EQ(error.code, lmx::ELMX_NOT_WELL_FORMED);
    EXPECT_EQ(error.detail, "Element start tag (b) and end tag (c) do not match");
}

TEST(Tags, CharactersAfterSlash)
{
    const lmx::c_error error = error_of("<a/ >");
    EXPECT_EQ(error.code, lmx::ELMX_BAD_END_TAG);
    EXPECT_EQ(error.detail, "Illegal character(s) after / at end of tag -a");
}

TEST(Tags, EarlyEndOfInput)
{
    for (const char* document : {"<a>", "<a", "<a b", "<a b=", "<a b='1", "<a><b/>", "<a>text", "<a></a",
                                 "<a><!--", "<a><?p", "<?xml version=\"1.0\"?>"})
        EXPECT_EQ(error_of(document).code, lmx::ELMX_UNEXPECTED_EOM) << document;
}

TEST(Tags, MalformedMarkup)
{
    for (const char* document : {"<a><1/></a>", "<a x='1'y='2'/>", "<a>&</a>", "<a>]]></a>", "<a/><b/>",
                                 " text<a/>", "<a/>text", "<a x='<'/>", "<a><!x></a>"})
        EXPECT_EQ(error_of(document).code, lmx::ELMX_NOT_WELL_FORMED) << document;
}

TEST(Attributes, MissingEqualsAndQuote)
{
    EXPECT_EQ(error_of("<a x '1'/>").detail, "Schema is not Well Formed (expected '=', got ''')");
    EXPECT_EQ(error_of("<a x=1/>").detail, "Schema is not Well Formed (expected '\"' or ''', got '1')");
}

TEST(Attributes, DuplicatesAreRefused)
{
    EXPECT_EQ(error_of("<a x='1' x='2'/>").detail, "Attribute x redefined");
    EXPECT_EQ(error_of("<a xmlns:p='u' xmlns:q='u' p:x='1' q:x='2'/>").code, lmx::ELMX_NOT_WELL_FORMED);
    std::string many = "<a";
    for (int i = 0; i < 40; ++i)
        many += " a" + std::to_string(i) + "='v'";
    EXPECT_EQ(events_of(many + "/>").substr(0, 14), "S{}a|A{}a0=v|A");
    EXPECT_EQ(error_of(many + " a7='w'/>").detail, "Attribute a7 redefined");
}

TEST(Attributes, WhiteSpaceIsNormalisedButReferencesKept)
{
    EXPECT_EQ(events_of("<a x=\"1\t2\r\n3\n4&#10;5&#9;\"/>"), "S{}a|A{}x=1 2 3 4\n5\t|E");
    EXPECT_EQ(events_of("<a x='say \"hi\"' y=\"it's\"/>"), "S{}a|A{}x=say \"hi\"|A{}y=it's|E");
}

TEST(References, PredefinedAndCharacterReferences)
{
    EXPECT_EQ(events_of("<a>&lt;&gt;&amp;&apos;&quot;&#65;&#x42;&#xe9;&#128512;</a>"),
              "S{}a|T <>&'\"AB\xC3\xA9\xF0\x9F\x98\x80|E");
}

// The whole Unicode range is valid; the last plane must not be refused.
TEST(References, CharacterReferencesUpToTheLastPlane)
{
    EXPECT_EQ(events_of("<a>&#x10FFFF;&#x100001;</a>"), "S{}a|T \xF4\x8F\xBF\xBF\xF4\x80\x80\x81|E");
    for (const char* document : {"<a>&#x110000;</a>", "<a>&#xD800;</a>", "<a>&#0;</a>", "<a>&#1;</a>",
                                 "<a>&#99999999999999999999;</a>", "<a>&#;</a>", "<a>&#x;</a>", "<a>&#12</a>"})
        EXPECT_NE(error_of(document).code, lmx::ELMX_OK) << document;
}

TEST(Text, WhiteSpaceBetweenElementsIsReported)
{
    EXPECT_EQ(events_of("<a>\n <b/>\n</a>"), "S{}a|T \n |S{}b|E|T \n|E");
}

TEST(Text, PlainTextIsAViewIntoTheInput)
{
    const std::string document = "<a>plain text</a>";
    lmx::c_xml scanner(document.data(), document.size());
    scanner.next();
    ASSERT_EQ(scanner.next(), lmx::xml_event::text);
    EXPECT_EQ(scanner.text().data(), document.data() + 3);
}

TEST(Text, GreaterThanAndSingleBracketsAreText)
{
    EXPECT_EQ(events_of("<a>a>b]c]]d</a>"), "S{}a|T a>b]c]]d|E");
}

}  // namespace
