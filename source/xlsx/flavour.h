#pragma once
// The two flavours of an Open XML book: the same engine bound to the transitional or to the
// Strict namespaces. Content types, part names and relationship types are shared.
#include "ooxml/generated/dml-spreadsheetDrawing.h"
#include "ooxml/generated/sml-comments.h"
#include "ooxml/generated/sml-sharedStringTable.h"
#include "ooxml/generated/sml-sheet.h"
#include "ooxml/generated/sml-styles.h"
#include "ooxml/generated/sml-table.h"
#include "ooxml/generated/sml-workbook.h"
#include "ooxml/generated/sml.h"
#include "ooxml/generated/strictDrawing.h"

namespace quire {

struct excelNormal_tag {};
struct excelStrict_tag {};

template <class Tag>
struct XmlFlavour;

template <>
struct XmlFlavour<excelNormal_tag> {
    using Workbook = workbook::c_CT_Workbook;
    using Worksheet = sheet::c_CT_Worksheet;
    using RowHandler = sheet::c_row_handler;
    using Stylesheet = styles::c_CT_Stylesheet;
    using Sst = sharedStringTable::c_CT_Sst;
    using Comments = comments::c_CT_Comments;
    using Table = table::c_CT_Table;
    using Drawing = drawing::c_CT_Drawing;
    static constexpr bool strict = false;
};

template <>
struct XmlFlavour<excelStrict_tag> {
    using Workbook = strict::c_CT_Workbook;
    using Worksheet = strict::c_CT_Worksheet;
    using RowHandler = strict::c_row_handler;
    using Stylesheet = strict::c_CT_Stylesheet;
    using Sst = strict::c_CT_Sst;
    using Comments = strict::c_CT_Comments;
    using Table = strict::c_CT_Table;
    using Drawing = strictdrawing::c_CT_Drawing;
    static constexpr bool strict = true;
};

}  // namespace quire
