#include <gtest/gtest.h>

#include "lmx/error.h"
#include "lmx/xml_reader.h"

namespace {

TEST(ErrorTexts, CodesHaveTheirFixedMessages)
{
    EXPECT_EQ(lmx::error_message(lmx::ELMX_OK), "No Error");
    EXPECT_EQ(lmx::error_message(lmx::ELMX_NO_FILE), "Unable to open file");
    EXPECT_EQ(lmx::error_message(lmx::ELMX_ENCODING_MISMATCH),
              "Mis-match between specified char encoding and read bytes");
    EXPECT_EQ(lmx::error_message(lmx::ELMX_VALUE_BAD_FORMAT), "Invalid value format for this type");
    EXPECT_EQ(lmx::error_message(lmx::ELMX_REQUIRED_ATTRIBUTES_MISSING), "Required attribute(s) missing");
    EXPECT_EQ(lmx::error_message(lmx::ELMX_OCCURRENCES_ON_MARSHALING), "min/max occurs error on marshaling");
    EXPECT_EQ(lmx::error_message(static_cast<lmx::elmx_error>(1000)), "User defined error 1");
    EXPECT_EQ(lmx::error_message(static_cast<lmx::elmx_error>(1008)), "User defined error 9");
}

TEST(ErrorTexts, EveryTableCodeHasAText)
{
    for (int code = 0; code <= 46; ++code)
        EXPECT_FALSE(lmx::error_message(static_cast<lmx::elmx_error>(code)).empty()) << code;
}

TEST(ErrorTexts, CodesOutsideTheTableHaveNoText)
{
    EXPECT_TRUE(lmx::error_message(static_cast<lmx::elmx_error>(47)).empty());
    EXPECT_TRUE(lmx::error_message(static_cast<lmx::elmx_error>(999)).empty());
    EXPECT_TRUE(lmx::error_message(static_cast<lmx::elmx_error>(1009)).empty());
    EXPECT_TRUE(lmx::error_message(static_cast<lmx::elmx_error>(-1)).empty());
}

TEST(ErrorReport, SuccessWithoutLineIsOneLine)
{
    lmx::c_error error;
    EXPECT_EQ(error.report(), "Error: No Error\n");
}

TEST(ErrorReport, FailureListsItemPlaceAndLine)
{
    lmx::c_error error;
    error.code = lmx::ELMX_REQUIRED_ATTRIBUTES_MISSING;
    error.item_name = "r";
    error.program_file = "source/ooxml/sml-sheet";
    error.program_line = 1234;
    error.xml_line = 7;
    EXPECT_EQ(error.report(),
              "Error: Required attribute(s) missing\nItem: r\nProgram file: source/ooxml/sml-sheet\n"
              "Program line: 1234\nXML line: 7\n");
}

TEST(ErrorReport, OnlyTheFirstErrorIsKept)
{
    const std::string document = "<a>\n<b x='yes'/>\n</a>";
    lmx::c_xml_reader_memory reader(document.data(), document.size());
    reader.set_program_file("source/ooxml/sml-sheet");
    ASSERT_EQ(reader.read_root(), lmx::ELMX_OK);
    bool found = false;
    ASSERT_EQ(reader.next_child(found), lmx::ELMX_OK);
    ASSERT_TRUE(found);
    EXPECT_EQ(reader.capture_error(lmx::ELMX_VALUE_BAD_FORMAT, "x", 10), lmx::ELMX_VALUE_BAD_FORMAT);
    EXPECT_EQ(reader.capture_error(lmx::ELMX_MANDATORY_ELEMENT_MISSING, "c", 20),
              lmx::ELMX_MANDATORY_ELEMENT_MISSING);
    EXPECT_EQ(reader.error().code, lmx::ELMX_VALUE_BAD_FORMAT);
    EXPECT_EQ(reader.error().item_name, "x");
    EXPECT_EQ(reader.error().program_line, 10);
    EXPECT_EQ(reader.error().xml_line, 2);
    EXPECT_EQ(reader.scanner().error_count(), 2);
}

TEST(ErrorReport, MissingFileIsUnableToOpen)
{
    lmx::c_xml_reader_file reader("/nonexistent/dir/part.xml");
    EXPECT_EQ(reader.read_root(), lmx::ELMX_NO_FILE);
    EXPECT_EQ(reader.error().code, lmx::ELMX_NO_FILE);
}

}  // namespace
