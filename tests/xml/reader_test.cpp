#include <gtest/gtest.h>

#include <cstdio>
#include <filesystem>
#include <fstream>

#include "lmx/value_conversion.h"
#include "lmx/xml_reader.h"

namespace {

const std::string worksheet =
    "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
    "<worksheet xmlns=\"urn:main\" xmlns:r=\"urn:rel\" xmlns:xsi=\"http://www.w3.org/2001/XMLSchema-instance\" "
    "xsi:schemaLocation=\"urn:main x.xsd\">\n"
    "  <sheetData>\n"
    "    <row r=\"1\"><c r=\"A1\"><v>1.5</v></c><extLst><ext><deep/></ext></extLst></row>\n"
    "  </sheetData>\n"
    "  <drawing r:id=\"rId1\"/>\n"
    "</worksheet>\n";

enum : int { token_worksheet = 20, token_sheet_data, token_row, token_c, token_v, token_r, token_id, token_drawing };

const lmx::c_namespace_entry namespaces[] = {{1, "", "urn:main"}, {2, "r", "urn:rel"}, {0, nullptr, nullptr}};
const lmx::c_token_entry tokens[] = {
    {1, "worksheet", 9, token_worksheet}, {1, "sheetData", 9, token_sheet_data}, {1, "row", 3, token_row},
    {1, "c", 1, token_c},                 {1, "v", 1, token_v},                   {0, "r", 1, token_r},
    {2, "id", 2, token_id},               {1, "drawing", 7, token_drawing},       {0, nullptr, 0, 0},
};

TEST(XmlReader, WalksAWorksheetLikeGeneratedCode)
{
    lmx::c_xml_reader_memory reader(worksheet.data(), worksheet.size());
    reader.set_namespace_table(namespaces);
    ASSERT_EQ(reader.read_root(), lmx::ELMX_OK);
    EXPECT_EQ(reader.tokenise(tokens, reader.namespace_uri(), reader.local_name()), token_worksheet);
    ASSERT_EQ(reader.attributes().size(), 1u);
    EXPECT_TRUE(lmx::c_xml_reader::is_runtime_attribute(reader.attributes()[0]));
    EXPECT_EQ(reader.tokenise(tokens, reader.attributes()[0].namespace_uri, reader.attributes()[0].local_name),
              lmx::token_xsi_schema_location);

    bool found = false;
    ASSERT_EQ(reader.next_child(found), lmx::ELMX_OK);
    ASSERT_TRUE(found);
    EXPECT_EQ(reader.tokenise(tokens, reader.namespace_uri(), reader.local_name()), token_sheet_data);
    ASSERT_EQ(reader.next_child(found), lmx::ELMX_OK);
    ASSERT_TRUE(found);
    EXPECT_EQ(reader.tokenise(tokens, reader.namespace_uri(), reader.local_name()), token_row);
    EXPECT_EQ(reader.tokenise(tokens, reader.attributes()[0].namespace_uri, reader.attributes()[0].local_name),
              token_r);
    ASSERT_EQ(reader.next_child(found), lmx::ELMX_OK);  // c
    ASSERT_EQ(reader.next_child(found), lmx::ELMX_OK);  // v
    ASSERT_TRUE(found);
    EXPECT_EQ(reader.tokenise(tokens, reader.namespace_uri(), reader.local_name()), token_v);
    std::string content;
    ASSERT_EQ(reader.get_simple_content(content), lmx::ELMX_OK);
    double number = 0;
    ASSERT_EQ(lmx::read_double(content, number), lmx::ELMX_OK);
    EXPECT_EQ(number, 1.5);
    ASSERT_EQ(reader.next_child(found), lmx::ELMX_OK);  // end of c
    EXPECT_FALSE(found);
    ASSERT_EQ(reader.next_child(found), lmx::ELMX_OK);  // extLst: not known, skipped
    ASSERT_TRUE(found);
    EXPECT_EQ(reader.tokenise(tokens, reader.namespace_uri(), reader.local_name()), lmx::token_unrecognised);
    ASSERT_EQ(reader.skip_element(), lmx::ELMX_OK);
    ASSERT_EQ(reader.next_child(found), lmx::ELMX_OK);  // end of row
    EXPECT_FALSE(found);
    ASSERT_EQ(reader.next_child(found), lmx::ELMX_OK);  // end of sheetData
    EXPECT_FALSE(found);
    ASSERT_EQ(reader.next_child(found), lmx::ELMX_OK);  // drawing
    ASSERT_TRUE(found);
    EXPECT_EQ(reader.tokenise(tokens, reader.attributes()[0].namespace_uri, reader.attributes()[0].local_name),
              token_id);
    ASSERT_EQ(reader.next_child(found), lmx::ELMX_OK);  // end of drawing
    EXPECT_FALSE(found);
    ASSERT_EQ(reader.next_child(found), lmx::ELMX_OK);  // end of worksheet
    EXPECT_FALSE(found);
    EXPECT_EQ(reader.error().code, lmx::ELMX_OK);
}

TEST(XmlReader, ChildInSimpleContentIsAnError)
{
    const std::string document = "<a><v>1<b/></v></a>";
    lmx::c_xml_reader_memory reader(document.data(), document.size());
    reader.set_program_file("source/ooxml/sml-sheet");
    ASSERT_EQ(reader.read_root(), lmx::ELMX_OK);
    bool found = false;
    ASSERT_EQ(reader.next_child(found), lmx::ELMX_OK);
    std::string content;
    EXPECT_EQ(reader.get_simple_content(content), lmx::ELMX_UNABLE_TO_READ_ELEMENT_VALUE);
    EXPECT_EQ(reader.error_report(), "Error: Unable to read element value\nItem: v\n"
                                     "Program file: source/ooxml/sml-sheet\nProgram line: 0\nXML line: 1\n");
}

TEST(XmlReader, ScannerErrorsReachTheCaller)
{
    const std::string document = "<a><b></a>";
    lmx::c_xml_reader_memory reader(document.data(), document.size());
    ASSERT_EQ(reader.read_root(), lmx::ELMX_OK);
    EXPECT_EQ(reader.skip_element(), lmx::ELMX_NOT_WELL_FORMED);
    EXPECT_EQ(reader.error().xml_line, 1);
}

TEST(XmlReader, ReadsFromAFile)
{
    const std::filesystem::path path = std::filesystem::path(XML_TEST_WORK_DIR) / "reader_test_part.xml";
    {
        std::ofstream file(path, std::ios::binary);
        file << worksheet;
    }
    lmx::c_xml_reader_file reader(path.string());
    ASSERT_EQ(reader.read_root(), lmx::ELMX_OK);
    EXPECT_EQ(reader.local_name(), "worksheet");
    EXPECT_EQ(reader.skip_element(), lmx::ELMX_OK);
    std::filesystem::remove(path);
}

}  // namespace
