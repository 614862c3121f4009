// QrSheetKit's class definition, its property accessors and its destructor.
#include <cstddef>

#include "accessor_macros.h"
#include "class_constants.h"
#include "copy_methods.h"
#include "sheet_methods.h"

namespace quire_plugin {

namespace {

SheetHandle sh(REALobject self) { return sheetOf(self); }

QR_GET_INTEGER(pictureCount, sh, qrSheetPictureSizeW)
QR_GET_INTEGER(tableSize, sh, qrSheetTableSizeW)
QR_GET_INTEGER(firstRow, sh, qrSheetFirstRowW)
QR_GET_INTEGER(lastRow, sh, qrSheetLastRowW)
QR_GET_INTEGER(firstCol, sh, qrSheetFirstColW)
QR_GET_INTEGER(lastCol, sh, qrSheetLastColW)
QR_GET_BOOLEAN(groupSummaryRight, sh, qrSheetGroupSummaryRightW)
QR_SET_BOOLEAN(setGroupSummaryRight, sh, qrSheetSetGroupSummaryRightW)
QR_GET_BOOLEAN(groupSummaryBelow, sh, qrSheetGroupSummaryBelowW)
QR_SET_BOOLEAN(setGroupSummaryBelow, sh, qrSheetSetGroupSummaryBelowW)
QR_GET_BOOLEAN(rightToLeft, sh, qrSheetRightToLeftW)
QR_SET_BOOLEAN(setRightToLeft, sh, qrSheetSetRightToLeftW)
QR_GET_BOOLEAN(printRowCol, sh, qrSheetPrintRowColW)
QR_SET_BOOLEAN(setPrintRowCol, sh, qrSheetSetPrintRowColW)
QR_GET_BOOLEAN(vCenter, sh, qrSheetVCenterW)
QR_SET_BOOLEAN(setVCenter, sh, qrSheetSetVCenterW)
QR_GET_BOOLEAN(hCenter, sh, qrSheetHCenterW)
QR_SET_BOOLEAN(setHCenter, sh, qrSheetSetHCenterW)
QR_GET_BOOLEAN(displayGridlines, sh, qrSheetDisplayGridlinesW)
QR_SET_BOOLEAN(setDisplayGridlines, sh, qrSheetSetDisplayGridlinesW)
QR_GET_BOOLEAN(printGridlines, sh, qrSheetPrintGridlinesW)
QR_SET_BOOLEAN(setPrintGridlines, sh, qrSheetSetPrintGridlinesW)
QR_GET_DOUBLE(marginLeft, sh, qrSheetMarginLeftW)
QR_SET_DOUBLE(setMarginLeft, sh, qrSheetSetMarginLeftW)
QR_GET_DOUBLE(marginRight, sh, qrSheetMarginRightW)
QR_SET_DOUBLE(setMarginRight, sh, qrSheetSetMarginRightW)
QR_GET_DOUBLE(marginTop, sh, qrSheetMarginTopW)
QR_SET_DOUBLE(setMarginTop, sh, qrSheetSetMarginTopW)
QR_GET_DOUBLE(marginBottom, sh, qrSheetMarginBottomW)
QR_SET_DOUBLE(setMarginBottom, sh, qrSheetSetMarginBottomW)
QR_GET_INTEGER(paper, sh, qrSheetPaperW)
QR_SET_INTEGER(setPaper, sh, qrSheetSetPaperW)
QR_GET_BOOLEAN(landscape, sh, qrSheetLandscapeW)
QR_SET_BOOLEAN(setLandscape, sh, qrSheetSetLandscapeW)
QR_GET_INTEGER(printZoom, sh, qrSheetPrintZoomW)
QR_SET_INTEGER(setPrintZoom, sh, qrSheetSetPrintZoomW)
QR_GET_INTEGER(zoom, sh, qrSheetZoomW)
QR_SET_INTEGER(setZoom, sh, qrSheetSetZoomW)
QR_GET_STRING(name, sh, qrSheetNameW)
QR_SET_STRING(setName, sh, qrSheetSetNameW)
QR_GET_BOOLEAN(protect, sh, qrSheetProtectW)
QR_SET_BOOLEAN(setProtect, sh, qrSheetSetProtectW)
QR_GET_INTEGER(hidden, sh, qrSheetHiddenW)
QR_SET_INTEGER(setHidden, sh, qrSheetSetHiddenW)
QR_GET_INTEGER(hyperlinkSize, sh, qrSheetHyperlinkSizeW)
QR_GET_INTEGER(mergeSize, sh, qrSheetMergeSizeW)
QR_GET_STRING(footer, sh, qrSheetFooterW)
QR_GET_STRING(header, sh, qrSheetHeaderW)
QR_GET_DOUBLE(footerMargin, sh, qrSheetFooterMarginW)
QR_GET_DOUBLE(headerMargin, sh, qrSheetHeaderMarginW)
QR_GET_INTEGER(verPageBreakCount, sh, qrSheetGetVerPageBreakSizeW)
QR_GET_INTEGER(horPageBreakCount, sh, qrSheetGetHorPageBreakSizeW)
QR_GET_INTEGER(namedRangeCount, sh, qrSheetNamedRangeSizeW)

REALobject autoFilter(REALobject self, RBInteger) {
    if (!QR_NEED(qrSheetAutoFilterW) || !requireHandle(sh(self))) return nullptr;
    return wrapHandle(autoFilterClass(), QR_CALL(qrSheetAutoFilterW)(sh(self)), self);
}

void destructor(REALobject self) { releaseWrapper(self, sheetClass()); }

REALproperty properties[] = {
    QR_FIELD_PROPERTY("Handle", "Integer", handle, true),
    QR_FIELD_PROPERTY("Book", "QrBookKit", owner, false),
    QR_PROPERTY("PictureCount", "Integer", &pictureCount, nullptr),
    QR_PROPERTY("TableSize", "Integer", &tableSize, nullptr),
    QR_PROPERTY("FirstRow", "Integer", &firstRow, nullptr),
    QR_PROPERTY("LastRow", "Integer", &lastRow, nullptr),
    QR_PROPERTY("FirstCol", "Integer", &firstCol, nullptr),
    QR_PROPERTY("LastCol", "Integer", &lastCol, nullptr),
    QR_PROPERTY("GroupSummaryRight", "Boolean", &groupSummaryRight, &setGroupSummaryRight),
    QR_PROPERTY("GroupSummaryBelow", "Boolean", &groupSummaryBelow, &setGroupSummaryBelow),
    QR_PROPERTY("RightToLeft", "Boolean", &rightToLeft, &setRightToLeft),
    QR_PROPERTY("PrintRowCol", "Boolean", &printRowCol, &setPrintRowCol),
    QR_PROPERTY("VCenter", "Boolean", &vCenter, &setVCenter),
    QR_PROPERTY("HCenter", "Boolean", &hCenter, &setHCenter),
    QR_PROPERTY("DisplayGridlines", "Boolean", &displayGridlines, &setDisplayGridlines),
    QR_PROPERTY("PrintGridlines", "Boolean", &printGridlines, &setPrintGridlines),
    QR_PROPERTY("MarginLeft", "Double", &marginLeft, &setMarginLeft),
    QR_PROPERTY("MarginRight", "Double", &marginRight, &setMarginRight),
    QR_PROPERTY("MarginTop", "Double", &marginTop, &setMarginTop),
    QR_PROPERTY("MarginBottom", "Double", &marginBottom, &setMarginBottom),
    QR_PROPERTY("Paper", "Integer", &paper, &setPaper),
    QR_PROPERTY("Landscape", "Boolean", &landscape, &setLandscape),
    QR_PROPERTY("PrintZoom", "Integer", &printZoom, &setPrintZoom),
    QR_PROPERTY("Zoom", "Integer", &zoom, &setZoom),
    QR_PROPERTY("Name", "String", &name, &setName),
    QR_PROPERTY("Protect", "Boolean", &protect, &setProtect),
    QR_PROPERTY("Hidden", "Integer", &hidden, &setHidden),
    QR_PROPERTY("AutoFilter", "QrAutoFilterKit", &autoFilter, nullptr),
    QR_PROPERTY("HyperlinkSize", "Integer", &hyperlinkSize, nullptr),
    QR_PROPERTY("MergeSize", "Integer", &mergeSize, nullptr),
    QR_PROPERTY("Footer", "String", &footer, nullptr),
    QR_PROPERTY("Header", "String", &header, nullptr),
    QR_PROPERTY("FooterMargin", "Double", &footerMargin, nullptr),
    QR_PROPERTY("HeaderMargin", "Double", &headerMargin, nullptr),
    QR_PROPERTY("GetVerPageBreakCount", "integer", &verPageBreakCount, nullptr),
    QR_PROPERTY("GetHorPageBreakCount", "integer", &horPageBreakCount, nullptr),
    QR_PROPERTY("NamedRangeCount", "integer", &namedRangeCount, nullptr),
};

REALmethodDefinition methods[] = {
    {reinterpret_cast<REALproc>(&sheetColWidthPx), nullptr,
     "ColWidthPx(col as integer) as Integer",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetRowHeightPx), nullptr,
     "RowHeightPx(row as integer) as Integer",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetAddDataValidationDoubleEx), nullptr,
     "AddDataValidationDouble(type as Integer, op as integer, rowFirst as integer, colFirst as integer, rowLast as integer, colLast as integer, value1 as Double, value2 as Double, allowBlank as Boolean, hideDropDown as Boolean = false, showInputMessage as Boolean = true, showErrorMessage as Boolean = true, promptTitle as String = \"\", prompt as String = \"\", errorTitle as string = \"\", error as string = \"\", errorStyle as integer = 0)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetAddDataValidationDouble), nullptr,
     "AddDataValidationDouble(type as Integer, op as integer, rowFirst as integer, colFirst as integer, rowLast as integer, colLast as integer, value1 as Double, value2 as Double)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetAddDataValidationEx), nullptr,
     "AddDataValidation(type as Integer, op as integer, rowFirst as integer, colFirst as integer, rowLast as integer, colLast as integer, value1 as String, value2 as String, allowBlank as Boolean, hideDropDown as Boolean = false, showInputMessage as Boolean = true, showErrorMessage as Boolean = true, promptTitle as String = \"\", prompt as String = \"\", errorTitle as string = \"\", error as string = \"\", errorStyle as integer = 0)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetAddDataValidation), nullptr,
     "AddDataValidation(type as Integer, op as integer, rowFirst as integer, colFirst as integer, rowLast as integer, colLast as integer, value1 as String, value2 as String)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetRemoveDataValidations), nullptr,
     "RemoveDataValidations",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetCopySheetToBook), nullptr,
     "CopySheet(dest as QrBookKit, Options as QrCopyOptionsKit = nil)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetCopySheetToSheet), nullptr,
     "CopySheet(dest as QrSheetKit, Options as QrCopyOptionsKit = nil)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetCopyRow), nullptr,
     "CopyRow(dest as QrSheetKit, SourceRow as Integer, DestRow as Integer, Options as QrCopyOptionsKit = nil)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetApplyFilter), nullptr,
     "ApplyFilter",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetRemoveFilter), nullptr,
     "RemoveFilter",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetAddIgnoredError), nullptr,
     "AddIgnoredError(rowFirst as integer, colFirst as integer, rowLast as integer, colLast as integer, iError as Integer)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetProtectEx), nullptr,
     "SetProtectEx(protect as boolean = true, password as string = \"\", enhancedProtection as integer = -1)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetTabRgbColor), nullptr,
     "SetTabRgbColor(red as Integer, green as Integer, blue as Integer)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetTabColor), nullptr,
     "SetTabColor(colorValue as Integer)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetTable), nullptr,
     "Table(index as integer, byref rowFirst as integer, byref rowLast as integer, byref ColFirst as integer, byref ColLast as integer, byref headerRowCount as integer, byref totalsRowCount as integer) as string",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetWriteError), nullptr,
     "WriteError(row as integer, col as integer, Error as Integer, format as QrFormatKit = nil)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetRemoveComment), nullptr,
     "RemoveComment(row as integer, col as integer)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetWriteFormulaString), nullptr,
     "WriteFormulaString(row as integer, col as integer, Expression as string, value as String, format as QrFormatKit = nil) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetWriteFormulaBool), nullptr,
     "WriteFormulaBool(row as integer, col as integer, Expression as string, value as Boolean, format as QrFormatKit = nil) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetWriteFormulaNum), nullptr,
     "WriteFormulaNum(row as integer, col as integer, Expression as string, value as double, format as QrFormatKit = nil) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetGetPrintRepeatRows), nullptr,
     "GetPrintRepeatRows(byref rowFirst as integer, byref rowLast as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetGetPrintRepeatCols), nullptr,
     "GetPrintRepeatCols(byref colFirst as integer, byref colLast as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetGetPrintArea), nullptr,
     "GetPrintArea(byref rowFirst as integer, byref colFirst as integer, byref rowLast as integer, byref colLast as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetAutoFitArea), nullptr,
     "SetAutoFitArea(rowFirst as integer = 0, colFirst as integer = 0, rowLast as integer = -1, colLast as integer = -1)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetReadDateFormat), nullptr,
     "ReadDate(row as integer, col as integer, byref format as QrFormatKit) as date",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetReadDate), nullptr,
     "ReadDate(row as integer, col as integer) as date",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetWriteDate), nullptr,
     "WriteDate(row as integer, col as integer, value as date, format as QrFormatKit = nil) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetAddHyperlink), nullptr,
     "AddHyperlink(hyperlink as string, rowFirst as integer, rowLast as integer, colFirst as integer, colLast as integer)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetHyperlink), nullptr,
     "Hyperlink(index as Integer, byref rowFirst as integer, byref rowLast as integer, byref colFirst as integer, byref colLast as integer) as String",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetDelHyperlink), nullptr,
     "DelHyperlink(index as integer) as Boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetMerge), nullptr,
     "Merge(index as Integer, byref rowFirst as integer, byref rowLast as integer, byref colFirst as integer, byref colLast as integer) as Boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSplitInfo), nullptr,
     "SplitInfo(byref row as integer, byref col as integer) as Boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetDelMergeByIndex), nullptr,
     "DelMergeByIndex(index as integer) as Boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetAddrToRowCol), nullptr,
     "AddrToRowCol(addr as string, byref row as integer, byref col as integer, byref rowRelative as boolean, byref colRelative as boolean)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetRowColToAddr), nullptr,
     "RowColToAddr(row as integer, col as integer, rowRelative as boolean = true, colRelative as boolean = true) as string",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetGetTopLeftView), nullptr,
     "GetTopLeftView(byref row as integer, byref col as integer)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetTopLeftView), nullptr,
     "SetTopLeftView(row as integer, col as integer)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetGetPicture), nullptr,
     "GetPicture(index as integer, byref rowTop as integer, byref colLeft as integer, byref rowBottom as integer, byref colRight as integer, byref width as integer, byref height as integer, byref offsetX as integer, byref offsetY as integer) as integer",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetGetMerge), nullptr,
     "GetMerge(row as integer, col as integer, byref rowFirst as integer, byref rowLast as integer, byref colFirst as integer, byref colLast as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetMerge), nullptr,
     "SetMerge(rowFirst as integer, rowLast as integer, colFirst as integer, colLast as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetDelMerge), nullptr,
     "DelMerge(row as integer, col as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetPicture), nullptr,
     "SetPicture(row as integer, col as integer, PictureID as integer, scale as double = 1.0, OffsetX as integer = 0, OffsetY as integer = 0, pos as Integer = 0)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetPicture2), nullptr,
     "SetPicture(row as integer, col as integer, PictureID as integer, width as integer, height as integer, OffsetX as integer = 0, OffsetY as integer = 0, pos as Integer = 0)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetRow), nullptr,
     "SetRow(row as integer, height as double, format as QrFormatKit = nil, hidden as boolean = false) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetCol), nullptr,
     "SetCol(colFirst as integer, colLast as integer, width as double, format as QrFormatKit = nil, hidden as boolean = false) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetGroupCols), nullptr,
     "GroupCols(colFirst as integer, colLast as integer, collapsed as boolean = true) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetGroupRows), nullptr,
     "GroupRows(rowFirst as integer, rowLast as integer, collapsed as boolean = true) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetGetNamedRangeScoped), nullptr,
     "GetNamedRange(name as string, byref rowFirst as integer, byref rowLast as integer, byref colFirst as integer, byref colLast as integer, ScopeID as integer, byref Hidden as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetGetNamedRange), nullptr,
     "GetNamedRange(name as string, byref rowFirst as integer, byref rowLast as integer, byref colFirst as integer, byref colLast as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetNamedRange), nullptr,
     "SetNamedRange(name as string, rowFirst as integer, rowLast as integer, colFirst as integer, colLast as integer, scopeId as integer = -2) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetDelNamedRange), nullptr,
     "DelNamedRange(name as string, scopeId as integer = -2) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetNamedRange), nullptr,
     "NamedRange(index as integer, byref rowFirst as integer, byref rowLast as integer, byref ColFirst as integer, byref ColLast as integer) as string",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetNamedRangeScoped), nullptr,
     "NamedRange(index as integer, byref rowFirst as integer, byref rowLast as integer, byref ColFirst as integer, byref ColLast as integer, byref scopeId as integer, byref Hidden as Boolean) as string",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetPrintRepeatRows), nullptr,
     "SetPrintRepeatRows(rowFirst as integer, rowLast as integer)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetPrintRepeatCols), nullptr,
     "SetPrintRepeatCols(colFirst as integer, colLast as integer)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetPrintArea), nullptr,
     "SetPrintArea(rowFirst as integer, rowLast as integer, colFirst as integer, colLast as integer)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetPrintFit), nullptr,
     "SetPrintFit(wPages as integer, hPages as integer)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetGetPrintFit), nullptr,
     "GetPrintFit(byref wPages as integer, byref hPages as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetRemoveRow), nullptr,
     "RemoveRow(rowFirst as integer, rowLast as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetRemoveCol), nullptr,
     "RemoveCol(colFirst as integer, colLast as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetInsertRow), nullptr,
     "InsertRow(rowFirst as integer, rowLast as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetInsertCol), nullptr,
     "InsertCol(colFirst as integer, colLast as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetCopyCell), nullptr,
     "CopyCell(rowSrc as integer, colSrc as integer, rowDst as integer, colDst as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetWriteComment), nullptr,
     "WriteComment(row as integer, col as integer, value as string, author as string, width as integer, height as integer)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetReadComment), nullptr,
     "ReadComment(row as integer, col as integer) as string",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetReadFormulaFormat), nullptr,
     "ReadFormula(row as integer, col as integer, byref format as QrFormatKit) as string",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetReadFormula), nullptr,
     "ReadFormula(row as integer, col as integer) as string",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetWriteFormula), nullptr,
     "WriteFormula(row as integer, col as integer, value as string, format as QrFormatKit = nil) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetReadBlankFormat), nullptr,
     "ReadBlank(row as integer, col as integer, byref format as QrFormatKit) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetReadBlank), nullptr,
     "ReadBlank(row as integer, col as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetWriteBlank), nullptr,
     "WriteBlank(row as integer, col as integer, format as QrFormatKit = nil) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetReadBooleanFormat), nullptr,
     "ReadBoolean(row as integer, col as integer, byref format as QrFormatKit) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetReadBoolean), nullptr,
     "ReadBoolean(row as integer, col as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetWriteBoolean), nullptr,
     "WriteBoolean(row as integer, col as integer, value as boolean, format as QrFormatKit = nil) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetReadNumberFormat), nullptr,
     "ReadNumber(row as integer, col as integer, byref format as QrFormatKit) as double",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetReadNumber), nullptr,
     "ReadNumber(row as integer, col as integer) as double",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetWriteNumber), nullptr,
     "WriteNumber(row as integer, col as integer, value as double, format as QrFormatKit = nil) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetReadStringFormat), nullptr,
     "ReadString(row as integer, col as integer, byref format as QrFormatKit) as string",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetReadString), nullptr,
     "ReadString(row as integer, col as integer) as string",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetWriteString), nullptr,
     "WriteString(row as integer, col as integer, value as string, format as QrFormatKit = nil) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetRowHidden), reinterpret_cast<REALproc>(&sheetSetRowHidden),
     "RowHidden(row as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetColHidden), reinterpret_cast<REALproc>(&sheetSetColHidden),
     "ColHidden(col as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetRowHeight), nullptr,
     "RowHeight(row as integer) as double",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetColWidth), nullptr,
     "ColWidth(col as integer) as double",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetFooter), nullptr,
     "SetFooter(footer as string, margin as double) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetHeader), nullptr,
     "SetHeader(header as string, margin as double) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSplit), nullptr,
     "Split(row as integer, col as integer)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetVerPageBreak), nullptr,
     "SetVerPageBreak(row as integer, pageBreak as boolean = true) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetSetHorPageBreak), nullptr,
     "SetHorPageBreak(row as integer, pageBreak as boolean = true) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetGetVerPageBreak), nullptr,
     "GetVerPageBreak(index as integer) as integer",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetGetHorPageBreak), nullptr,
     "GetHorPageBreak(index as integer) as integer",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetClearPrintRepeats), nullptr,
     "ClearPrintRepeats",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetClearPrintArea), nullptr,
     "ClearPrintArea",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetClear), nullptr,
     "Clear(rowFirst as integer = 0, rowLast as integer = 1048575, colFirst as integer = 0, colLast as integer = 16383)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetReadError), nullptr,
     "ReadError(row as integer, col as integer) as integer",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetIsDate), nullptr,
     "IsDate(row as integer, col as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetIsFormula), nullptr,
     "IsFormula(row as integer, col as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetCellType), nullptr,
     "CellType(row as integer, col as integer) as integer",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetConstructor), nullptr,
     "Constructor",
     kConstructorFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&sheetCellFormat), reinterpret_cast<REALproc>(&sheetSetCellFormat),
     "CellFormat(row as integer, col as integer) as QrFormatKit",
     kMethodFlags, 0, nullptr},
};

}  // namespace

REALclassDefinition& sheetClass() {
    static REALclassDefinition definition = {
        kCurrentREALControlVersion, "QrSheetKit", nullptr, sizeof(ObjectData), 0, nullptr,
        reinterpret_cast<REALproc>(&destructor), properties, sizeof properties / sizeof properties[0], methods,
        sizeof methods / sizeof methods[0], nullptr, 0, nullptr, 0, nullptr, nullptr, 0, sheetConstants().list,
        sheetConstants().count, kClassFlags, nullptr, 0, nullptr, 0, nullptr, 0, nullptr, 0};
    return definition;
}

}  // namespace quire_plugin
