#pragma once
// Part names, content types and relationship types of an Open XML package.
#include <string>

namespace quire::package {

inline const char* const kContentTypesPart = "/[Content_Types].xml";
inline const char* const kWorkbookPart = "/xl/workbook.xml";
inline const char* const kCalcChainPart = "/xl/calcChain.xml";
inline const char* const kStylesPart = "/xl/styles.xml";
inline const char* const kSharedStringsPart = "/xl/sharedStrings.xml";

inline const char* const kXlsxMain = "application/vnd.openxmlformats-officedocument.spreadsheetml.sheet.main+xml";
inline const char* const kXlsmMain = "application/vnd.ms-excel.sheet.macroEnabled.main+xml";
inline const char* const kXltxMain = "application/vnd.openxmlformats-officedocument.spreadsheetml.template.main+xml";
inline const char* const kXltmMain = "application/vnd.ms-excel.template.macroEnabled.main+xml";
inline const char* const kRelationshipsType = "application/vnd.openxmlformats-package.relationships+xml";
inline const char* const kXmlType = "application/xml";
inline const char* const kStylesType = "application/vnd.openxmlformats-officedocument.spreadsheetml.styles+xml";
inline const char* const kWorksheetType = "application/vnd.openxmlformats-officedocument.spreadsheetml.worksheet+xml";
inline const char* const kChartsheetType = "application/vnd.openxmlformats-officedocument.spreadsheetml.chartsheet+xml";
inline const char* const kDrawingType = "application/vnd.openxmlformats-officedocument.drawing+xml";
inline const char* const kSharedStringsType =
    "application/vnd.openxmlformats-officedocument.spreadsheetml.sharedStrings+xml";
inline const char* const kTableType = "application/vnd.openxmlformats-officedocument.spreadsheetml.table+xml";
inline const char* const kCommentsType = "application/vnd.openxmlformats-officedocument.spreadsheetml.comments+xml";

inline const char* const kRelOfficeDocument =
    "http://schemas.openxmlformats.org/officeDocument/2006/relationships/officeDocument";
inline const char* const kRelWorksheet = "http://schemas.openxmlformats.org/officeDocument/2006/relationships/worksheet";
inline const char* const kRelSharedStrings =
    "http://schemas.openxmlformats.org/officeDocument/2006/relationships/sharedStrings";
inline const char* const kRelStyles = "http://schemas.openxmlformats.org/officeDocument/2006/relationships/styles";
inline const char* const kRelHyperlink = "http://schemas.openxmlformats.org/officeDocument/2006/relationships/hyperlink";
inline const char* const kRelStrictSharedStrings = "http://purl.oclc.org/ooxml/officeDocument/relationships/sharedStrings";
inline const char* const kRelStrictStyles = "http://purl.oclc.org/ooxml/officeDocument/relationships/styles";

// "\" becomes "/" and a leading "/" is added.
std::string normalisePartName(const std::string& name);
// /dir/name -> /dir/_rels/name.rels
std::string relationshipsPartName(const std::string& partName);
// A workbook relationship target as a part name: "/xl/" in front unless it has it.
std::string resolveWorkbookTarget(const std::string& target);
// The folder of a part ("/xl/worksheets" for "/xl/worksheets/sheet1.xml").
std::string partFolder(const std::string& partName);
// A relative target resolved against a folder, with "." and ".." segments applied.
std::string resolveRelative(const std::string& folder, const std::string& target);
// The workbook content type for a file name ending, or null.
const char* workbookTypeForFileName(const std::wstring& fileName);

}  // namespace quire::package
