#include <gtest/gtest.h>

#include <random>

#include "lmx/xml_reader.h"
#include "scan_support.h"

namespace {

using xml_test::error_of;

const std::string sample =
    "<?xml version=\"1.0\" encoding=\"UTF-8\" standalone=\"yes\"?>\r\n"
    "<!DOCTYPE w [<!ENTITY e \"v&amp;&#x41;\">]>"
    "<worksheet xmlns=\"http://schemas.openxmlformats.org/spreadsheetml/2006/main\" "
    "xmlns:r=\"urn:r\"><sheetData><row r=\"1\"><c r=\"A1\" t=\"s\"><v>0</v></c>"
    "<c r=\"B1\" t=\"inlineStr\"><is><t xml:space=\"preserve\"> a &lt; b &e; \xC3\xA9</t></is></c></row>"
    "<!-- note --><row r=\"2\" r:id=\"x\"><c><f><![CDATA[SUM(A1)]]></f></c></row></sheetData></worksheet>";

// Scanning must end, with a result or an error, whatever the bytes.
void scan_to_the_end(const std::string& document)
{
    lmx::c_xml scanner(document.data(), document.size());
    std::size_t events = 0;
    lmx::xml_event event;
    do {
        event = scanner.next();
        ASSERT_LT(++events, document.size() + 10) << "no progress";
    } while (event != lmx::xml_event::end_document && event != lmx::xml_event::error);
}

TEST(HostileInput, SampleReads)
{
    EXPECT_EQ(error_of(sample).code, lmx::ELMX_OK);
}

TEST(HostileInput, EveryTruncationFailsCleanly)
{
    for (std::size_t size = 0; size < sample.size(); ++size) {
        const std::string part = sample.substr(0, size);
        scan_to_the_end(part);
        EXPECT_NE(error_of(part).code, lmx::ELMX_OK) << size;
    }
}

TEST(HostileInput, RandomByteChangesNeverCrashOrHang)
{
    std::mt19937 random(12345);
    const std::string specials = "<>&;\"'=/!?[]-:x \r\n\0\xC3\xFF";
    for (int round = 0; round < 3000; ++round) {
        std::string document = sample;
        const int changes = 1 + static_cast<int>(random() % 4);
        for (int i = 0; i < changes; ++i) {
            const std::size_t at = random() % document.size();
            switch (random() % 3) {
            case 0: document[at] = specials[random() % specials.size()]; break;
            case 1: document.erase(at, 1 + random() % 8); break;
            default: document.insert(at, 1, specials[random() % specials.size()]); break;
            }
        }
        scan_to_the_end(document);
    }
}

TEST(HostileInput, DeepNestingIsBounded)
{
    std::string deep;
    for (int i = 0; i < 100000; ++i)
        deep += "<a>";
    EXPECT_EQ(error_of(deep).detail, "Elements nested too deeply");
    lmx::c_xml_limits limits;
    limits.max_element_depth = 200000;
    EXPECT_EQ(error_of(deep, limits).code, lmx::ELMX_UNEXPECTED_EOM);
}

TEST(HostileInput, ManyAttributesAndHugeNamesStayCheap)
{
    std::string document = "<a";
    for (int i = 0; i < 50000; ++i)
        document += " n" + std::to_string(i) + "='1'";
    document += "/>";
    EXPECT_EQ(error_of(document).code, lmx::ELMX_OK);
    EXPECT_EQ(error_of("<" + std::string(1 << 20, 'n') + "/>").code, lmx::ELMX_OK);
}

TEST(HostileInput, NullBufferIsAnEmptyDocument)
{
    lmx::c_xml scanner(nullptr, 100);
    EXPECT_EQ(scanner.next(), lmx::xml_event::error);
    EXPECT_EQ(scanner.error_code(), lmx::ELMX_UNEXPECTED_EOM);
}

TEST(HostileInput, ReaderSkipsAndStopsAtErrors)
{
    const std::string document = "<a><b><c/></b><d>";
    lmx::c_xml_reader_memory reader(document.data(), document.size());
    ASSERT_EQ(reader.read_root(), lmx::ELMX_OK);
    bool found = false;
    ASSERT_EQ(reader.next_child(found), lmx::ELMX_OK);
    ASSERT_EQ(reader.skip_element(), lmx::ELMX_OK);
    ASSERT_EQ(reader.next_child(found), lmx::ELMX_OK);
    EXPECT_EQ(reader.local_name(), "d");
    EXPECT_EQ(reader.skip_element(), lmx::ELMX_UNEXPECTED_EOM);
    EXPECT_EQ(reader.next_child(found), lmx::ELMX_UNEXPECTED_EOM);
}

}  // namespace
