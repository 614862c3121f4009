// The contract of the generated element classes: errors with their item, schema defaults,
// and content outside the schema kept in place.
#include <gtest/gtest.h>

#include "ooxml/generated/sml-sheet.h"
#include "ooxml/generated/sml-workbook.h"

namespace {

template <class T>
lmx::elmx_error parse(const std::string& xml, T& root, const char* name, lmx::c_error* error = nullptr) {
    lmx::c_xml_reader_memory reader(xml.data(), xml.size());
    lmx::elmx_error result = reader.read_root();
    if (result == lmx::ELMX_OK) result = root.unmarshal(reader, name);
    if (error) *error = reader.error();
    return result;
}

template <class T>
std::string write(const T& root, const char* name) {
    std::string text;
    lmx::c_xml_writer writer(text);
    EXPECT_EQ(root.marshal(writer, name), lmx::ELMX_OK);
    return text;
}

const std::string kMain = "http://schemas.openxmlformats.org/spreadsheetml/2006/main";

TEST(BindingContract, MissingRequiredCellAttributeIsCode25WithItsName) {
    sheet::c_CT_Worksheet ws;
    lmx::c_error error;
    const std::string xml = "<worksheet xmlns=\"" + kMain + "\"><sheetData><row r=\"1\"><c r=\"A1\"/></row>"
                            "<row r=\"2\"><c><v>1</v></c></row><mergeCells><mergeCell/></mergeCells></sheetData></worksheet>";
    // mergeCell needs ref: the first required attribute missing is reported.
    const std::string bad = "<worksheet xmlns=\"" + kMain +
                            "\"><sheetData/><mergeCells><mergeCell/></mergeCells></worksheet>";
    EXPECT_EQ(parse(bad, ws, "worksheet", &error), lmx::ELMX_REQUIRED_ATTRIBUTES_MISSING);
    EXPECT_EQ(error.item_name, "ref");
    EXPECT_EQ(error.program_file, "source/ooxml/sml-sheet" + error.program_file.substr(22));
}

TEST(BindingContract, BooleanYesIsCode35WithTheAttributeName) {
    workbook::c_CT_Workbook wb;
    lmx::c_error error;
    const std::string xml = "<workbook xmlns=\"" + kMain + "\"><workbookPr date1904=\"yes\"/><sheets/></workbook>";
    EXPECT_EQ(parse(xml, wb, "workbook", &error), lmx::ELMX_VALUE_BAD_FORMAT);
    EXPECT_EQ(error.item_name, "date1904");
}

TEST(BindingContract, AbsentOptionalBooleanReadsItsDefaultAndIsNotWritten) {
    workbook::c_CT_Workbook wb;
    const std::string xml = "<workbook xmlns=\"" + kMain + "\"><sheets><sheet name=\"A\" sheetId=\"1\" "
                            "xmlns:r=\"http://schemas.openxmlformats.org/officeDocument/2006/relationships\" "
                            "r:id=\"rId1\"/></sheets><calcPr/></workbook>";
    ASSERT_EQ(parse(xml, wb, "workbook"), lmx::ELMX_OK);
    EXPECT_FALSE(wb.get_calcPr().isset_fullCalcOnLoad());
    EXPECT_FALSE(wb.get_calcPr().get_fullCalcOnLoad());
    EXPECT_TRUE(wb.get_calcPr().get_calcCompleted());  // schema default true
    EXPECT_EQ(write(wb.get_calcPr(), "calcPr").find("fullCalcOnLoad"), std::string::npos);
    EXPECT_EQ(write(wb.get_calcPr(), "calcPr").find("calcCompleted"), std::string::npos);
}

TEST(BindingContract, WrongRootNamespaceIsRefused) {
    workbook::c_CT_Workbook wb;
    const std::string xml = "<workbook xmlns=\"http://purl.oclc.org/ooxml/spreadsheetml/main\"><sheets/></workbook>";
    EXPECT_EQ(parse(xml, wb, "workbook"), lmx::ELMX_ELEMENT_NOT_FOUND);
}

TEST(BindingContract, UnknownContentIsWrittenBackInPlace) {
    sheet::c_CT_Worksheet ws;
    const std::string xml =
        "<worksheet xmlns=\"" + kMain + "\" xmlns:x14ac=\"urn:x14ac\" xmlns:mc=\"urn:mc\" mc:Ignorable=\"x14ac\">"
        "<sheetPr/><x14ac:later a=\"1\">text<b/></x14ac:later><sheetData><row r=\"1\" x14ac:dyDescent=\"0.25\">"
        "<c r=\"A1\" t=\"s\"><v>0</v></c></row></sheetData><extLst><ext uri=\"{X}\"><x14ac:y/></ext></extLst>"
        "</worksheet>";
    ASSERT_EQ(parse(xml, ws, "worksheet"), lmx::ELMX_OK);
    const std::string out = write(ws, "worksheet");
    EXPECT_NE(out.find("<sheetPr/><x14ac:later a=\"1\">text<b/></x14ac:later><sheetData>"), std::string::npos) << out;
    EXPECT_NE(out.find("x14ac:dyDescent=\"0.25\""), std::string::npos) << out;
    EXPECT_NE(out.find("mc:Ignorable=\"x14ac\""), std::string::npos) << out;
    EXPECT_NE(out.find("<extLst><ext uri=\"{X}\"><x14ac:y/></ext></extLst>"), std::string::npos) << out;
}

TEST(BindingContract, RowLimitsKeepOnlyTheAskedRows) {
    sheet::c_CT_Worksheet ws;
    const std::string xml = "<worksheet xmlns=\"" + kMain + "\"><sheetData><row r=\"1\"/><row r=\"2\"/><row/>"
                            "<row r=\"7\"/></sheetData></worksheet>";
    lmx::c_xml_reader_memory reader(xml.data(), xml.size());
    ASSERT_EQ(reader.read_root(), lmx::ELMX_OK);
    ASSERT_EQ(ws.unmarshal(reader, "worksheet", 1, 2), lmx::ELMX_OK);
    EXPECT_EQ(ws.get_sheetData().size_row(), 2u);
}

TEST(BindingContract, RowHandlerReceivesRowsWithoutKeepingThem) {
    struct Counter : sheet::c_row_handler {
        int rows = 0, cells = 0;
        lmx::elmx_error row(sheet::c_CT_Row& row) override {
            ++rows;
            cells += static_cast<int>(row.size_c());
            return lmx::ELMX_OK;
        }
    } counter;
    sheet::c_CT_Worksheet ws;
    const std::string xml = "<worksheet xmlns=\"" + kMain + "\"><sheetData><row r=\"1\"><c r=\"A1\"/><c r=\"B1\"/>"
                            "</row><row r=\"2\"><c r=\"A2\"/></row></sheetData></worksheet>";
    lmx::c_xml_reader_memory reader(xml.data(), xml.size());
    ASSERT_EQ(reader.read_root(), lmx::ELMX_OK);
    ASSERT_EQ(ws.unmarshal(reader, "worksheet", -1, -1, &counter), lmx::ELMX_OK);
    EXPECT_EQ(counter.rows, 2);
    EXPECT_EQ(counter.cells, 3);
    EXPECT_EQ(ws.get_sheetData().size_row(), 0u);
}

}  // namespace
