#include <gtest/gtest.h>

#include <chrono>
#include <cstdlib>
#include <filesystem>
#include <fstream>

#include "lmx/xml_reader.h"
#include "scan_support.h"

namespace {

using xml_test::error_of;
using xml_test::events_of;

std::string billion_laughs(const std::string& leaf)
{
    std::string document = "<?xml version=\"1.0\"?>\n<!DOCTYPE lolz [\n <!ENTITY lol \"" + leaf + "\">\n";
    for (int level = 1; level <= 9; ++level) {
        const std::string previous = level == 1 ? "lol" : "lol" + std::to_string(level - 1);
        document += " <!ENTITY lol" + std::to_string(level) + " \"";
        for (int i = 0; i < 10; ++i)
            document += "&" + previous + ";";
        document += "\">\n";
    }
    return document + "]>\n<lolz>&lol9;</lolz>";
}

TEST(Doctype, InternalEntitiesExpandInTextAndAttributes)
{
    EXPECT_EQ(events_of("<!DOCTYPE a [<!ENTITY e \"x&amp;y\"><!ENTITY f 'a&e;b'>]><a t='&f;'>&f;</a>"),
              "S{}a|A{}t=ax&yb|T ax&yb|E");
}

TEST(Doctype, CharacterReferencesInEntityValuesAreReplacedAtDeclaration)
{
    EXPECT_EQ(events_of("<!DOCTYPE a [<!ENTITY e \"&#38;#60;\">]><a>&e;</a>"), "S{}a|T <|E");
}

TEST(Doctype, OtherDeclarationsCommentsAndExternalSubsetAreSkipped)
{
    EXPECT_EQ(events_of("<!DOCTYPE a SYSTEM \"a.dtd\" [<!ELEMENT a (#PCDATA)><!ATTLIST a x CDATA \"d>\">"
                        "<!-- c --><?p?><!NOTATION n SYSTEM 'n'>]>\n<a/>"),
              "S{}a|E");
}

TEST(Doctype, FirstDeclarationOfANameBinds)
{
    EXPECT_EQ(events_of("<!DOCTYPE a [<!ENTITY e '1'><!ENTITY e '2'>]><a>&e;</a>"), "S{}a|T 1|E");
}

TEST(Doctype, OnlyOnceAndBeforeTheRoot)
{
    EXPECT_EQ(error_of("<!DOCTYPE a><!DOCTYPE a><a/>").detail, "Document Type Declaration already read");
    EXPECT_EQ(error_of("<a/><!DOCTYPE a>").detail, "Document Type Declaration not at start of document");
}

TEST(Doctype, ExternalEntitiesAreRefused)
{
    const lmx::c_error error = error_of("<!DOCTYPE a [<!ENTITY e SYSTEM \"file:///etc/passwd\">]><a>&e;</a>");
    EXPECT_EQ(error.code, lmx::ELMX_EXTERNAL_ENTITY);
    EXPECT_EQ(error.detail, "External Entity definitions not supported");
    EXPECT_EQ(error_of("<!DOCTYPE a [<!ENTITY e PUBLIC 'p' 's'>]><a/>").code, lmx::ELMX_EXTERNAL_ENTITY);
}

TEST(Doctype, BadlyFormedSubset)
{
    EXPECT_EQ(error_of("<!DOCTYPE a [<!ENTITY e 'x' junk>]><a/>").detail,
              "DTD not Well Formed (expected '>', got j)");
    EXPECT_EQ(error_of("<!DOCTYPE a [<!ENTITY e junk>]><a/>").detail,
              "Unexpected value in Entity definition:junk>]><a/>");
    EXPECT_EQ(error_of("<!DOCTYPE a [junk]><a/>").code, lmx::ELMX_BAD_DTD);
    EXPECT_EQ(error_of("<!DOCTYPE a [%pe;]><a/>").code, lmx::ELMX_BAD_DTD);
}

TEST(Entities, UndeclaredEntityIsNotFound)
{
    const lmx::c_error error = error_of("<a>&nope;</a>");
    EXPECT_EQ(error.code, lmx::ELMX_ENTITY_NOT_FOUND);
    EXPECT_EQ(error.detail, "Entity 'nope' not found");
}

TEST(Entities, SelfReferenceIsRecursive)
{
    const lmx::c_error error = error_of("<!DOCTYPE a [<!ENTITY e 'x&e;'>]><a>&e;</a>");
    EXPECT_EQ(error.code, lmx::ELMX_BAD_DTD);
    EXPECT_EQ(error.detail, "Recursive entity definition for: e");
}

TEST(Entities, IndirectReferenceIsRecursive)
{
    const lmx::c_error error = error_of("<!DOCTYPE a [<!ENTITY e '&f;'><!ENTITY f '&g;'><!ENTITY g '&e;'>]><a>&e;</a>");
    EXPECT_EQ(error.code, lmx::ELMX_BAD_DTD);
    EXPECT_EQ(error.detail, "Recursive entity definition for: e");
}

TEST(Entities, MarkupInsideAnEntityIsRefused)
{
    EXPECT_EQ(error_of("<!DOCTYPE a [<!ENTITY e '<b/>'>]><a>&e;</a>").code, lmx::ELMX_UNEXPECTED_ENTITY);
    EXPECT_EQ(error_of("<!DOCTYPE a [<!ENTITY e '<b/>'>]><a x='&e;'/>").code, lmx::ELMX_NOT_WELL_FORMED);
}

TEST(EntityLimits, BillionLaughsIsRefusedQuickly)
{
    const auto start = std::chrono::steady_clock::now();
    const lmx::c_error error = error_of(billion_laughs("lol"));
    EXPECT_EQ(error.code, lmx::ELMX_RECURSIVE_ENTITY);
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(10));
}

TEST(EntityLimits, EmptyLeafStillCountsReferences)
{
    EXPECT_EQ(error_of(billion_laughs("")).code, lmx::ELMX_RECURSIVE_ENTITY);
    EXPECT_EQ(error_of(billion_laughs("&amp;")).code, lmx::ELMX_RECURSIVE_ENTITY);
}

TEST(EntityLimits, ModestNestingIsAllowed)
{
    std::string document = "<!DOCTYPE a [<!ENTITY e0 'x'>";
    for (int level = 1; level < 10; ++level)
        document += "<!ENTITY e" + std::to_string(level) + " '&e" + std::to_string(level - 1) + ";'>";
    EXPECT_EQ(events_of(document + "]><a>&e9;</a>"), "S{}a|T x|E");
}

TEST(EntityLimits, DepthAndSizeFollowTheLimits)
{
    lmx::c_xml_limits limits;
    limits.max_entity_depth = 2;
    EXPECT_EQ(error_of("<!DOCTYPE a [<!ENTITY a 'x'><!ENTITY b '&a;'><!ENTITY c '&b;'>]><a>&c;</a>", limits).code,
              lmx::ELMX_RECURSIVE_ENTITY);
    limits = {};
    limits.max_entity_expansion = 10;
    EXPECT_EQ(error_of("<!DOCTYPE a [<!ENTITY a '123456'>]><a>&a;</a>", limits).code, lmx::ELMX_OK);
    EXPECT_EQ(error_of("<!DOCTYPE a [<!ENTITY a '123456'>]><a>&a;&a;</a>", limits).code,
              lmx::ELMX_RECURSIVE_ENTITY);
}

// Workbooks from the corpus whose parts carry a billion-laughs DTD.
TEST(EntityLimits, CorpusBillionLaughsPartsAreRefused)
{
    const std::filesystem::path archive = std::filesystem::path(QUIRE_SHARED_DIR) / "corpus/poi/54764.xlsx";
    if (!std::filesystem::exists(archive))
        GTEST_SKIP() << "corpus not available";
    const std::filesystem::path folder = std::filesystem::path(XML_TEST_WORK_DIR) / "entity_parts";
    std::filesystem::remove_all(folder);
    std::filesystem::create_directories(folder);
    const std::string command = "/usr/bin/python3 -c \"import sys, zipfile; zipfile.ZipFile(sys.argv[1]).extractall(sys.argv[2])\" '" +
                                archive.string() + "' '" + folder.string() + "'";
    ASSERT_EQ(std::system(command.c_str()), 0);
    int refused = 0;
    for (const auto& entry : std::filesystem::recursive_directory_iterator(folder)) {
        if (!entry.is_regular_file() || entry.path().extension() != ".xml")
            continue;
        std::ifstream file(entry.path(), std::ios::binary);
        const std::string text((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
        if (text.find("<!DOCTYPE") == std::string::npos)
            continue;
        lmx::c_xml_reader_file reader(entry.path().string());
        const auto start = std::chrono::steady_clock::now();
        lmx::elmx_error code = reader.read_root();
        if (code == lmx::ELMX_OK)
            code = reader.skip_element();
        EXPECT_EQ(code, lmx::ELMX_RECURSIVE_ENTITY) << entry.path();
        EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(10));
        ++refused;
    }
    EXPECT_GE(refused, 2);
}

}  // namespace
