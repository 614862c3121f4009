// The direct reader of rows and cells gives the same document as the general XML reader, and
// hands anything beyond plain rows and cells to it.
#include <gtest/gtest.h>

#include <cstring>
#include <memory>
#include <string>

#include "xlsx/xml_sheet_impl.h"

namespace quire {
namespace {

using Sheet = XMLSheetImplT<wchar_t, excelNormal_tag>;

const std::string kHead =
    "<?xml version=\"1.0\" encoding=\"UTF-8\" standalone=\"yes\"?>\n"
    "<worksheet xmlns=\"http://schemas.openxmlformats.org/spreadsheetml/2006/main\" "
    "xmlns:x14ac=\"http://schemas.microsoft.com/office/spreadsheetml/2009/9/ac\"><dimension ref=\"A1\"/>";
const std::string kTail = "<pageMargins left=\"0.7\" right=\"0.7\" top=\"0.75\" bottom=\"0.75\" header=\"0.3\" "
                          "footer=\"0.3\"/></worksheet>";

std::string written(Sheet& sheet) {
    std::string text;
    sheet.write(std::string(), text);
    return text;
}

// Reads the part both ways and compares what is written back.
void expectSameAsGeneralReader(const std::string& sheetData, bool direct) {
    const std::string part = kHead + sheetData + kTail;
    Sheet viaRows, viaReader;
    viaRows.readRows("/xl/worksheets/sheet1.xml", part.data(), part.size(), -1, -1);
    viaReader.read("/xl/worksheets/sheet1.xml", part.data(), part.size());
    EXPECT_EQ(written(viaRows), written(viaReader)) << sheetData;
    EXPECT_EQ(viaRows.readCellsDirectly("/xl/worksheets/sheet1.xml", part.data(), part.size()), direct) << sheetData;
}

TEST(DirectReader, PlainRowsAndCellsReadAsTheGeneralReaderReadsThem) {
    expectSameAsGeneralReader(
        "<sheetData><row r=\"1\" spans=\"1:3\" x14ac:dyDescent=\"0.25\"><c r=\"A1\" t=\"s\"><v>0</v></c>"
        "<c r=\"B1\" s=\"2\"><v>1.5</v></c><c r=\"C1\" t=\"str\"><f>A1&amp;\"&lt;x&gt;\"</f><v>a&#10;b</v></c></row>"
        "<row r=\"3\" ht=\"20.25\" customHeight=\"1\" hidden=\"true\"><c r=\"B3\" t=\"e\"><v>#N/A</v></c>"
        "<c r=\"C3\"><f t=\"shared\" ref=\"C3:C4\" si=\"0\">B3*2</f><v>4</v></c></row>"
        "<row r=\"4\"><c r=\"C4\"><f t=\"shared\" si=\"0\"/><v>8</v></c></row></sheetData>",
        true);
}

TEST(DirectReader, RowsAndCellsWithoutReferencesKeepTheirPlaces) {
    expectSameAsGeneralReader("<sheetData><row><c><v>1</v></c><c><v>2</v></c></row><row r=\"5\"><c r=\"C5\"><v>3</v>"
                              "</c><c><v>4</v></c></row><row/></sheetData>",
                              true);
    const std::string part = kHead + "<sheetData><row><c><v>1</v></c><c><v>2</v></c></row><row><c><v>3</v></c></row>"
                                     "</sheetData>" + kTail;
    Sheet sheet;
    sheet.readRows("/xl/worksheets/sheet1.xml", part.data(), part.size(), -1, -1);
    EXPECT_EQ(sheet.readNum(0, 1, nullptr), 2);
    EXPECT_EQ(sheet.readNum(1, 0, nullptr), 3);
    EXPECT_EQ(written(sheet).find(" r=\""), std::string::npos) << written(sheet);
}

TEST(DirectReader, ValuesWithSpacesKeepXmlSpace) {
    expectSameAsGeneralReader("<sheetData><row r=\"1\"><c r=\"A1\" t=\"str\"><f>\" x \"</f>"
                              "<v xml:space=\"preserve\"> x </v></c></row></sheetData>",
                              true);
}

TEST(DirectReader, AnythingElseGoesToTheGeneralReader) {
    for (const char* sheetData : {
             "<sheetData><row r=\"1\"><!-- note --><c r=\"A1\"><v>1</v></c></row></sheetData>",
             "<sheetData><row r=\"1\"><c r=\"A1\" t=\"inlineStr\"><is><t>x</t></is></c></row></sheetData>",
             "<sheetData><row r=\"1\"><c r=\"A1\"><v><![CDATA[1]]></v></c></row></sheetData>",
             "<sheetData><row r=\"1\" xmlns:y=\"urn:y\" y:a=\"1\"><c r=\"A1\"><v>1</v></c></row></sheetData>",
             "<sheetData><row r=\"1\"><c r=\"A1\"><extLst/></c><later/></row></sheetData>",
         })
        expectSameAsGeneralReader(sheetData, false);
}

TEST(DirectReader, MalformedPartsFailWithTheGeneralReadersMessage) {
    for (const char* sheetData : {
             "<sheetData><row r=\"1\"><c r=\"A1\"><v>1</c></row></sheetData>",
             "<sheetData><row r=\"x\"><c r=\"A1\"><v>1</v></c></row></sheetData>",
             "<sheetData><row r=\"1\"><c r=\"A1\" t=\"q\"><v>1</v></c></row></sheetData>",
             "<sheetData><row r=\"1\"><c r=\"A1\"><v>\xC3</v></c></row></sheetData>",
             "<sheetData><row r=\"1\"><c r=\"A1\"><v>&unknown;</v></c></row></sheetData>",
             "<sheetData><row r=\"1\"><c r=\"A1\"><v>1</v></c></row>",
         }) {
        const std::string part = kHead + sheetData + kTail;
        Sheet sheet;
        std::string message;
        try {
            sheet.readRows("/xl/worksheets/sheet1.xml", part.data(), part.size(), -1, -1);
        } catch (const qrerror& error) {
            message = error.what();
        }
        EXPECT_NE(message.find("/xl/worksheets/sheet1.xml"), std::string::npos) << sheetData << ": " << message;
    }
}

TEST(DirectReader, AFaultAfterTheCellsIsReportedAtItsOwnLine) {
    std::string rows;
    for (int r = 1; r <= 40; ++r) rows += "<row r=\"" + std::to_string(r) + "\">\n<c><v>1</v></c></row>\n";
    const std::string part = kHead + "<sheetData>" + rows + "</sheetData><mergeCells><mergeCell/></mergeCells>" + kTail;
    Sheet sheet;
    std::string message;
    try {
        sheet.readRows("/xl/worksheets/sheet1.xml", part.data(), part.size(), -1, -1);
    } catch (const qrerror& error) {
        message = error.what();
    }
    EXPECT_NE(message.find("at line 82"), std::string::npos) << message;
}

TEST(DirectReader, RowLimitsKeepOnlyTheAskedRows) {
    const std::string part = kHead + "<sheetData><row r=\"1\"><c r=\"A1\"><v>1</v></c></row><row><c><v>2</v></c></row>"
                                     "<row r=\"7\"><c r=\"A7\"><v>7</v></c></row></sheetData>" + kTail;
    Sheet sheet;
    sheet.readRows("/xl/worksheets/sheet1.xml", part.data(), part.size(), 1, 5);
    ASSERT_EQ(sheet.document().get_sheetData().size_row(), 1u);
    EXPECT_EQ(sheet.document().get_sheetData().get_row(0).get_r(), 2u);
}

}  // namespace
}  // namespace quire

namespace quire {
namespace {

// Damaged parts either read or fail with a message; the direct reader never reads past them.
TEST(DirectReader, DamagedPartsReadOrFailWithAMessage) {
    const std::string good = kHead +
                             "<sheetData><row r=\"1\" spans=\"1:3\"><c r=\"A1\" t=\"s\"><v>0</v></c><c r=\"B1\" s=\"1\">"
                             "<f>SUM(A1:A9)&amp;\"x\"</f><v>1.5</v></c><c r=\"C1\" t=\"str\"><v xml:space=\"preserve\"> a </v>"
                             "</c></row><row><c><v>&#x41;</v></c></row></sheetData>" + kTail;
    unsigned seed = 12345;
    const auto next = [&seed] {
        seed = seed * 1103515245u + 12345u;
        return (seed >> 16) & 0x7FFF;
    };
    int failures = 0;
    for (int round = 0; round < 3000; ++round) {
        std::string part = good;
        if (round % 3 == 0) {
            part.resize(next() % part.size());
        } else {
            for (int flips = 1 + static_cast<int>(next() % 4); flips > 0; --flips)
                part[next() % part.size()] = static_cast<char>(next() % 256);
        }
        // An exact-size copy, so that the sanitizers see any read past the end.
        std::unique_ptr<char[]> bytes(new char[part.size()]);
        std::memcpy(bytes.get(), part.data(), part.size());
        Sheet sheet;
        try {
            sheet.readRows("/xl/worksheets/sheet1.xml", bytes.get(), part.size(), -1, -1);
        } catch (const qrerror& error) {
            EXPECT_NE(std::string(error.what()), "");
            ++failures;
        }
    }
    EXPECT_GT(failures, 0);
}

}  // namespace
}  // namespace quire
