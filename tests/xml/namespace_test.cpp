#include <gtest/gtest.h>

#include "scan_support.h"

namespace {

using xml_test::error_of;
using xml_test::events_of;

TEST(Namespaces, DefaultAndPrefixedNamesResolve)
{
    EXPECT_EQ(events_of("<a xmlns='urn:d' xmlns:p='urn:p'><p:b p:x='1' y='2'/><c/></a>"),
              "S{urn:d}a|S{urn:p}b|A{urn:p}x=1|A{}y=2|E|S{urn:d}c|E|E");
}

TEST(Namespaces, DeclarationsAreScopedToTheirElement)
{
    EXPECT_EQ(events_of("<a xmlns:p='urn:1'><b xmlns:p='urn:2' xmlns='urn:d'><p:c/></b><p:d/><e/></a>"),
              "S{}a|S{urn:d}b|S{urn:2}c|E|E|S{urn:1}d|E|S{}e|E|E");
}

TEST(Namespaces, DefaultNamespaceCanBeUndeclared)
{
    EXPECT_EQ(events_of("<a xmlns='urn:d'><b xmlns=''><c/></b></a>"), "S{urn:d}a|S{}b|S{}c|E|E|E");
}

TEST(Namespaces, XmlPrefixIsBuiltIn)
{
    EXPECT_EQ(events_of("<t xml:space='preserve'> x </t>"),
              "S{}t|A{http://www.w3.org/XML/1998/namespace}space=preserve|T  x |E");
}

TEST(Namespaces, DeclarationsAreNotAttributesButAreListed)
{
    const std::string document = "<a xmlns='urn:d' xmlns:r='urn:r' r:id='x'/>";
    lmx::c_xml scanner(document.data(), document.size());
    ASSERT_EQ(scanner.next(), lmx::xml_event::start_element);
    ASSERT_EQ(scanner.attributes().size(), 1u);
    ASSERT_EQ(scanner.namespace_declarations().size(), 2u);
    EXPECT_EQ(scanner.namespace_declarations()[1].prefix, "r");
    EXPECT_EQ(scanner.namespace_declarations()[1].namespace_uri, "urn:r");
    EXPECT_EQ(scanner.lookup_namespace("r"), "urn:r");
    ASSERT_NE(scanner.find_attribute("id", "urn:r"), nullptr);
    EXPECT_EQ(scanner.find_attribute("id", "urn:r")->value, "x");
}

TEST(Namespaces, UrisAreInternedAndOutliveTheirScope)
{
    const std::string document = "<a><b xmlns='urn:same'/><c xmlns='urn:same'/></a>";
    lmx::c_xml scanner(document.data(), document.size());
    scanner.next();
    scanner.next();
    const std::string_view first = scanner.namespace_uri();
    scanner.next();
    scanner.next();
    EXPECT_EQ(scanner.namespace_uri().data(), first.data());
    scanner.next();
    EXPECT_EQ(first, "urn:same");
}

TEST(Namespaces, UndeclaredPrefixIsRefused)
{
    EXPECT_EQ(error_of("<p:a/>").detail, "Namespace prefix p on a is not defined");
    EXPECT_EQ(error_of("<a p:x='1'/>").code, lmx::ELMX_NOT_WELL_FORMED);
    EXPECT_EQ(error_of("<a><b xmlns:p='u'/><p:c/></a>").code, lmx::ELMX_NOT_WELL_FORMED);
}

TEST(Namespaces, ReservedAndMalformedDeclarations)
{
    for (const char* document : {"<a xmlns:p=''/>", "<a xmlns:xmlns='u'/>", "<a xmlns:xml='urn:x'/>",
                                 "<a xmlns:p='http://www.w3.org/XML/1998/namespace'/>", "<a:b:c xmlns:a='u'/>",
                                 "<a xmlns:='u'/>", "<:a/>"})
        EXPECT_EQ(error_of(document).code, lmx::ELMX_NOT_WELL_FORMED) << document;
    EXPECT_EQ(events_of("<a xmlns:xml='http://www.w3.org/XML/1998/namespace'/>"), "S{}a|E");
}

}  // namespace
