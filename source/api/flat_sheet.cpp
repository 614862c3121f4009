// Sheet entry points of the C interface: each forwards to one ISheet operation.
#include "handles.h"

using namespace quire::flat;

namespace {

// writeStr's storage kind: through the shared string table.
constexpr int kSharedStringKind = 2;
// writeBool's error code that marks the value as a boolean rather than an error.
constexpr int kNoErrorCode = 0xFF;

}  // namespace

extern "C" {

// Cells

int qrSheetCellTypeW(SheetHandle sheet, int row, int col) {
    return asSheet(sheet)->cellType(row, col);
}

int qrSheetIsFormulaW(SheetHandle sheet, int row, int col) {
    return asSheet(sheet)->isFormula(row, col);
}

FormatHandle qrSheetCellFormatW(SheetHandle sheet, int row, int col) {
    return toHandle(asSheet(sheet)->cellFormat(row, col));
}

void qrSheetSetCellFormatW(SheetHandle sheet, int row, int col, FormatHandle format) {
    asSheet(sheet)->setCellFormat(row, col, asFormat(format));
}

const wchar_t* qrSheetReadStrW(SheetHandle sheet, int row, int col, FormatHandle* format) {
    FormatOut out(format);
    return asSheet(sheet)->readStr(row, col, out.get());
}

int qrSheetWriteStrW(SheetHandle sheet, int row, int col, const wchar_t* value,
                     FormatHandle format) {
    return asSheet(sheet)->writeStr(row, col, value, asFormat(format), kSharedStringKind);
}

double qrSheetReadNumW(SheetHandle sheet, int row, int col, FormatHandle* format) {
    FormatOut out(format);
    return asSheet(sheet)->readNum(row, col, out.get());
}

int qrSheetWriteNumW(SheetHandle sheet, int row, int col, double value, FormatHandle format) {
    return asSheet(sheet)->writeNum(row, col, value, asFormat(format));
}

int qrSheetReadBoolW(SheetHandle sheet, int row, int col, FormatHandle* format) {
    FormatOut out(format);
    return asSheet(sheet)->readBool(row, col, out.get());
}

int qrSheetWriteBoolW(SheetHandle sheet, int row, int col, int value, FormatHandle format) {
    return asSheet(sheet)->writeBool(row, col, isTrue(value), asFormat(format), kNoErrorCode);
}

int qrSheetReadBlankW(SheetHandle sheet, int row, int col, FormatHandle* format) {
    FormatOut out(format);
    return asSheet(sheet)->readBlank(row, col, out.get());
}

int qrSheetWriteBlankW(SheetHandle sheet, int row, int col, FormatHandle format) {
    return asSheet(sheet)->writeBlank(row, col, asFormat(format));
}

const wchar_t* qrSheetReadFormulaW(SheetHandle sheet, int row, int col, FormatHandle* format) {
    FormatOut out(format);
    return asSheet(sheet)->readFormula(row, col, out.get());
}

int qrSheetWriteFormulaW(SheetHandle sheet, int row, int col, const wchar_t* expr,
                         FormatHandle format) {
    return asSheet(sheet)->writeFormula(row, col, expr, asFormat(format));
}

int qrSheetWriteFormulaNumW(SheetHandle sheet, int row, int col, const wchar_t* expr, double value,
                            FormatHandle format) {
    return asSheet(sheet)->writeFormulaNum(row, col, expr, value, asFormat(format));
}

int qrSheetWriteFormulaStrW(SheetHandle sheet, int row, int col, const wchar_t* expr,
                            const wchar_t* value, FormatHandle format) {
    return asSheet(sheet)->writeFormulaStr(row, col, expr, value, asFormat(format));
}

int qrSheetWriteFormulaBoolW(SheetHandle sheet, int row, int col, const wchar_t* expr, int value,
                             FormatHandle format) {
    return asSheet(sheet)->writeFormulaBool(row, col, expr, isTrue(value), asFormat(format));
}

const wchar_t* qrSheetReadCommentW(SheetHandle sheet, int row, int col) {
    return asSheet(sheet)->readComment(row, col);
}

void qrSheetWriteCommentW(SheetHandle sheet, int row, int col, const wchar_t* value,
                          const wchar_t* author, int width, int height) {
    asSheet(sheet)->writeComment(row, col, value, author, width, height);
}

void qrSheetRemoveCommentW(SheetHandle sheet, int row, int col) {
    asSheet(sheet)->removeComment(row, col);
}

int qrSheetIsDateW(SheetHandle sheet, int row, int col) { return asSheet(sheet)->isDate(row, col); }

int qrSheetReadErrorW(SheetHandle sheet, int row, int col) {
    return asSheet(sheet)->readError(row, col);
}

void qrSheetWriteErrorW(SheetHandle sheet, int row, int col, int error, FormatHandle format) {
    asSheet(sheet)->writeError(row, col, error, asFormat(format));
}

// Rows and columns

double qrSheetColWidthW(SheetHandle sheet, int col) { return asSheet(sheet)->colWidth(col); }

double qrSheetRowHeightW(SheetHandle sheet, int row) { return asSheet(sheet)->rowHeight(row); }

int qrSheetColWidthPxW(SheetHandle sheet, int col) { return asSheet(sheet)->colWidthPx(col); }

int qrSheetRowHeightPxW(SheetHandle sheet, int row) { return asSheet(sheet)->rowHeightPx(row); }

int qrSheetSetColW(SheetHandle sheet, int colFirst, int colLast, double width, FormatHandle format,
                   int hidden) {
    return asSheet(sheet)->setCol(colFirst, colLast, width, asFormat(format), isTrue(hidden));
}

int qrSheetSetRowW(SheetHandle sheet, int row, double height, FormatHandle format, int hidden) {
    return asSheet(sheet)->setRow(row, height, asFormat(format), isTrue(hidden));
}

int qrSheetRowHiddenW(SheetHandle sheet, int row) { return asSheet(sheet)->rowHidden(row); }

int qrSheetSetRowHiddenW(SheetHandle sheet, int row, int hidden) {
    return asSheet(sheet)->setRowHidden(row, isTrue(hidden));
}

int qrSheetColHiddenW(SheetHandle sheet, int col) { return asSheet(sheet)->colHidden(col); }

int qrSheetSetColHiddenW(SheetHandle sheet, int col, int hidden) {
    return asSheet(sheet)->setColHidden(col, isTrue(hidden));
}

// Merged ranges

int qrSheetGetMergeW(SheetHandle sheet, int row, int col, int* rowFirst, int* rowLast,
                     int* colFirst, int* colLast) {
    return asSheet(sheet)->getMerge(row, col, rowFirst, rowLast, colFirst, colLast);
}

int qrSheetSetMergeW(SheetHandle sheet, int rowFirst, int rowLast, int colFirst, int colLast) {
    return asSheet(sheet)->setMerge(rowFirst, rowLast, colFirst, colLast);
}

int qrSheetDelMergeW(SheetHandle sheet, int row, int col) {
    return asSheet(sheet)->delMerge(row, col);
}

int qrSheetMergeSizeW(SheetHandle sheet) { return asSheet(sheet)->mergeSize(); }

int qrSheetMergeW(SheetHandle sheet, int index, int* rowFirst, int* rowLast, int* colFirst,
                  int* colLast) {
    return asSheet(sheet)->merge(index, rowFirst, rowLast, colFirst, colLast);
}

int qrSheetDelMergeByIndexW(SheetHandle sheet, int index) {
    return asSheet(sheet)->delMergeByIndex(index);
}

// Pictures

int qrSheetPictureSizeW(SheetHandle sheet) { return asSheet(sheet)->pictureSize(); }

int qrSheetGetPictureW(SheetHandle sheet, int index, int* rowTop, int* colLeft, int* rowBottom,
                       int* colRight, int* width, int* height, int* offset_x, int* offset_y) {
    return asSheet(sheet)->getPicture(index, rowTop, colLeft, rowBottom, colRight, width, height,
                                      offset_x, offset_y, 0);
}

void qrSheetSetPictureW(SheetHandle sheet, int row, int col, int pictureId, double scale,
                        int offset_x, int offset_y, int position) {
    asSheet(sheet)->setPicture(row, col, pictureId, scale, offset_x, offset_y, position);
}

void qrSheetSetPicture2W(SheetHandle sheet, int row, int col, int pictureId, int width, int height,
                         int offset_x, int offset_y, int position) {
    asSheet(sheet)->setPicture2(row, col, pictureId, width, height, offset_x, offset_y, position);
}

// Page breaks, panes, outline

int qrSheetGetHorPageBreakW(SheetHandle sheet, int index) {
    return asSheet(sheet)->getHorPageBreak(index);
}

int qrSheetGetHorPageBreakSizeW(SheetHandle sheet) {
    return asSheet(sheet)->getHorPageBreakSize();
}

int qrSheetGetVerPageBreakW(SheetHandle sheet, int index) {
    return asSheet(sheet)->getVerPageBreak(index);
}

int qrSheetGetVerPageBreakSizeW(SheetHandle sheet) {
    return asSheet(sheet)->getVerPageBreakSize();
}

int qrSheetSetHorPageBreakW(SheetHandle sheet, int row, int pageBreak) {
    return asSheet(sheet)->setHorPageBreak(row, isTrue(pageBreak));
}

int qrSheetSetVerPageBreakW(SheetHandle sheet, int col, int pageBreak) {
    return asSheet(sheet)->setVerPageBreak(col, isTrue(pageBreak));
}

void qrSheetSplitW(SheetHandle sheet, int row, int col) { asSheet(sheet)->split(row, col); }

int qrSheetSplitInfoW(SheetHandle sheet, int* row, int* col) {
    return asSheet(sheet)->splitInfo(row, col);
}

int qrSheetGroupRowsW(SheetHandle sheet, int rowFirst, int rowLast, int collapsed) {
    return asSheet(sheet)->groupRows(rowFirst, rowLast, isTrue(collapsed));
}

int qrSheetGroupColsW(SheetHandle sheet, int colFirst, int colLast, int collapsed) {
    return asSheet(sheet)->groupCols(colFirst, colLast, isTrue(collapsed));
}

int qrSheetGroupSummaryBelowW(SheetHandle sheet) { return asSheet(sheet)->groupSummaryBelow(); }

void qrSheetSetGroupSummaryBelowW(SheetHandle sheet, int below) {
    asSheet(sheet)->setGroupSummaryBelow(isTrue(below));
}

int qrSheetGroupSummaryRightW(SheetHandle sheet) { return asSheet(sheet)->groupSummaryRight(); }

void qrSheetSetGroupSummaryRightW(SheetHandle sheet, int right) {
    asSheet(sheet)->setGroupSummaryRight(isTrue(right));
}

// Editing the grid. The C interface always moves merges, names and hyperlinks with the cells.

void qrSheetClearW(SheetHandle sheet, int rowFirst, int rowLast, int colFirst, int colLast) {
    asSheet(sheet)->clear(rowFirst, rowLast, colFirst, colLast);
}

int qrSheetInsertColW(SheetHandle sheet, int colFirst, int colLast) {
    return asSheet(sheet)->insertCol(colFirst, colLast, true);
}

int qrSheetInsertRowW(SheetHandle sheet, int rowFirst, int rowLast) {
    return asSheet(sheet)->insertRow(rowFirst, rowLast, true);
}

int qrSheetRemoveColW(SheetHandle sheet, int colFirst, int colLast) {
    return asSheet(sheet)->removeCol(colFirst, colLast, true);
}

int qrSheetRemoveRowW(SheetHandle sheet, int rowFirst, int rowLast) {
    return asSheet(sheet)->removeRow(rowFirst, rowLast, true);
}

int qrSheetCopyCellW(SheetHandle sheet, int rowSrc, int colSrc, int rowDst, int colDst) {
    return asSheet(sheet)->copyCell(rowSrc, colSrc, rowDst, colDst);
}

int qrSheetFirstRowW(SheetHandle sheet) { return asSheet(sheet)->firstRow(); }

int qrSheetLastRowW(SheetHandle sheet) { return asSheet(sheet)->lastRow(); }

int qrSheetFirstColW(SheetHandle sheet) { return asSheet(sheet)->firstCol(); }

int qrSheetLastColW(SheetHandle sheet) { return asSheet(sheet)->lastCol(); }

// View and print settings

int qrSheetDisplayGridlinesW(SheetHandle sheet) { return asSheet(sheet)->displayGridlines(); }

void qrSheetSetDisplayGridlinesW(SheetHandle sheet, int show) {
    asSheet(sheet)->setDisplayGridlines(isTrue(show));
}

int qrSheetPrintGridlinesW(SheetHandle sheet) { return asSheet(sheet)->printGridlines(); }

void qrSheetSetPrintGridlinesW(SheetHandle sheet, int print) {
    asSheet(sheet)->setPrintGridlines(isTrue(print));
}

int qrSheetZoomW(SheetHandle sheet) { return asSheet(sheet)->zoom(); }

void qrSheetSetZoomW(SheetHandle sheet, int zoom) { asSheet(sheet)->setZoom(zoom); }

int qrSheetPrintZoomW(SheetHandle sheet) { return asSheet(sheet)->printZoom(); }

void qrSheetSetPrintZoomW(SheetHandle sheet, int zoom) { asSheet(sheet)->setPrintZoom(zoom); }

int qrSheetGetPrintFitW(SheetHandle sheet, int* wPages, int* hPages) {
    return asSheet(sheet)->getPrintFit(wPages, hPages);
}

void qrSheetSetPrintFitW(SheetHandle sheet, int wPages, int hPages) {
    asSheet(sheet)->setPrintFit(wPages, hPages);
}

int qrSheetLandscapeW(SheetHandle sheet) { return asSheet(sheet)->landscape(); }

void qrSheetSetLandscapeW(SheetHandle sheet, int landscape) {
    asSheet(sheet)->setLandscape(isTrue(landscape));
}

int qrSheetPaperW(SheetHandle sheet) { return asSheet(sheet)->paper(); }

void qrSheetSetPaperW(SheetHandle sheet, int paper) { asSheet(sheet)->setPaper(paper); }

const wchar_t* qrSheetHeaderW(SheetHandle sheet) { return asSheet(sheet)->header(); }

int qrSheetSetHeaderW(SheetHandle sheet, const wchar_t* header, double margin) {
    return asSheet(sheet)->setHeader(header, margin);
}

double qrSheetHeaderMarginW(SheetHandle sheet) { return asSheet(sheet)->headerMargin(); }

const wchar_t* qrSheetFooterW(SheetHandle sheet) { return asSheet(sheet)->footer(); }

int qrSheetSetFooterW(SheetHandle sheet, const wchar_t* footer, double margin) {
    return asSheet(sheet)->setFooter(footer, margin);
}

double qrSheetFooterMarginW(SheetHandle sheet) { return asSheet(sheet)->footerMargin(); }

int qrSheetHCenterW(SheetHandle sheet) { return asSheet(sheet)->hCenter(); }

void qrSheetSetHCenterW(SheetHandle sheet, int hCenter) {
    asSheet(sheet)->setHCenter(isTrue(hCenter));
}

int qrSheetVCenterW(SheetHandle sheet) { return asSheet(sheet)->vCenter(); }

void qrSheetSetVCenterW(SheetHandle sheet, int vCenter) {
    asSheet(sheet)->setVCenter(isTrue(vCenter));
}

double qrSheetMarginLeftW(SheetHandle sheet) { return asSheet(sheet)->marginLeft(); }

void qrSheetSetMarginLeftW(SheetHandle sheet, double margin) {
    asSheet(sheet)->setMarginLeft(margin);
}

double qrSheetMarginRightW(SheetHandle sheet) { return asSheet(sheet)->marginRight(); }

void qrSheetSetMarginRightW(SheetHandle sheet, double margin) {
    asSheet(sheet)->setMarginRight(margin);
}

double qrSheetMarginTopW(SheetHandle sheet) { return asSheet(sheet)->marginTop(); }

void qrSheetSetMarginTopW(SheetHandle sheet, double margin) { asSheet(sheet)->setMarginTop(margin); }

double qrSheetMarginBottomW(SheetHandle sheet) { return asSheet(sheet)->marginBottom(); }

void qrSheetSetMarginBottomW(SheetHandle sheet, double margin) {
    asSheet(sheet)->setMarginBottom(margin);
}

int qrSheetPrintRowColW(SheetHandle sheet) { return asSheet(sheet)->printRowCol(); }

void qrSheetSetPrintRowColW(SheetHandle sheet, int print) {
    asSheet(sheet)->setPrintRowCol(isTrue(print));
}

int qrSheetPrintRepeatRowsW(SheetHandle sheet, int* rowFirst, int* rowLast) {
    return asSheet(sheet)->printRepeatRows(rowFirst, rowLast);
}

void qrSheetSetPrintRepeatRowsW(SheetHandle sheet, int rowFirst, int rowLast) {
    asSheet(sheet)->setPrintRepeatRows(rowFirst, rowLast);
}

int qrSheetPrintRepeatColsW(SheetHandle sheet, int* colFirst, int* colLast) {
    return asSheet(sheet)->printRepeatCols(colFirst, colLast);
}

void qrSheetSetPrintRepeatColsW(SheetHandle sheet, int colFirst, int colLast) {
    asSheet(sheet)->setPrintRepeatCols(colFirst, colLast);
}

int qrSheetPrintAreaW(SheetHandle sheet, int* rowFirst, int* rowLast, int* colFirst,
                      int* colLast) {
    return asSheet(sheet)->printArea(rowFirst, rowLast, colFirst, colLast);
}

void qrSheetSetPrintAreaW(SheetHandle sheet, int rowFirst, int rowLast, int colFirst,
                          int colLast) {
    asSheet(sheet)->setPrintArea(rowFirst, rowLast, colFirst, colLast);
}

void qrSheetClearPrintRepeatsW(SheetHandle sheet) { asSheet(sheet)->clearPrintRepeats(); }

void qrSheetClearPrintAreaW(SheetHandle sheet) { asSheet(sheet)->clearPrintArea(); }

// Defined names, tables, hyperlinks, autofilter

int qrSheetGetNamedRangeW(SheetHandle sheet, const wchar_t* name, int* rowFirst, int* rowLast,
                          int* colFirst, int* colLast, int scopeId, int* hidden) {
    BoolOut hiddenOut(hidden);
    return asSheet(sheet)->getNamedRange(name, rowFirst, rowLast, colFirst, colLast, scopeId,
                                         hiddenOut.get());
}

int qrSheetSetNamedRangeW(SheetHandle sheet, const wchar_t* name, int rowFirst, int rowLast,
                          int colFirst, int colLast) {
    return asSheet(sheet)->setNamedRange(name, rowFirst, rowLast, colFirst, colLast, 0);
}

int qrSheetDelNamedRangeW(SheetHandle sheet, const wchar_t* name, int scopeId) {
    return asSheet(sheet)->delNamedRange(name, scopeId);
}

int qrSheetNamedRangeSizeW(SheetHandle sheet) { return asSheet(sheet)->namedRangeSize(); }

const wchar_t* qrSheetNamedRangeW(SheetHandle sheet, int index, int* rowFirst, int* rowLast,
                                  int* colFirst, int* colLast, int* scopeId, int* hidden) {
    BoolOut hiddenOut(hidden);
    return asSheet(sheet)->namedRange(index, rowFirst, rowLast, colFirst, colLast, scopeId,
                                      hiddenOut.get());
}

int qrSheetTableSizeW(SheetHandle sheet) { return asSheet(sheet)->tableSize(); }

const wchar_t* qrSheetTableW(SheetHandle sheet, int index, int* rowFirst, int* rowLast,
                             int* colFirst, int* colLast, int* headerRowCount,
                             int* totalsRowCount) {
    return asSheet(sheet)->table(index, rowFirst, rowLast, colFirst, colLast, headerRowCount,
                                 totalsRowCount);
}

int qrSheetHyperlinkSizeW(SheetHandle sheet) { return asSheet(sheet)->hyperlinkSize(); }

const wchar_t* qrSheetHyperlinkW(SheetHandle sheet, int index, int* rowFirst, int* rowLast,
                                 int* colFirst, int* colLast) {
    return asSheet(sheet)->hyperlink(index, rowFirst, rowLast, colFirst, colLast);
}

int qrSheetDelHyperlinkW(SheetHandle sheet, int index) {
    return asSheet(sheet)->delHyperlink(index);
}

void qrSheetAddHyperlinkW(SheetHandle sheet, const wchar_t* hyperlink, int rowFirst, int rowLast,
                          int colFirst, int colLast) {
    asSheet(sheet)->addHyperlink(hyperlink, rowFirst, rowLast, colFirst, colLast);
}

AutoFilterHandle qrSheetAutoFilterW(SheetHandle sheet) {
    return toHandle(asSheet(sheet)->autoFilter());
}

void qrSheetApplyFilterW(SheetHandle sheet) { asSheet(sheet)->applyFilter(); }

void qrSheetRemoveFilterW(SheetHandle sheet) { asSheet(sheet)->removeFilter(); }

// Name, protection, visibility, view

const wchar_t* qrSheetNameW(SheetHandle sheet) { return asSheet(sheet)->name(); }

void qrSheetSetNameW(SheetHandle sheet, const wchar_t* name) { asSheet(sheet)->setName(name); }

int qrSheetProtectW(SheetHandle sheet) { return asSheet(sheet)->protect(); }

void qrSheetSetProtectExW(SheetHandle sheet, int protect, const wchar_t* password,
                          int enhancedProtection) {
    asSheet(sheet)->setProtectEx(isTrue(protect), password, enhancedProtection);
}

void qrSheetSetProtectW(SheetHandle sheet, int protect) {
    // No password; -1 protects everything.
    asSheet(sheet)->setProtectEx(isTrue(protect), nullptr, -1);
}

int qrSheetHiddenW(SheetHandle sheet) { return asSheet(sheet)->hidden(); }

int qrSheetSetHiddenW(SheetHandle sheet, int state) { return asSheet(sheet)->setHidden(state); }

void qrSheetGetTopLeftViewW(SheetHandle sheet, int* row, int* col) {
    asSheet(sheet)->getTopLeftView(row, col);
}

void qrSheetSetTopLeftViewW(SheetHandle sheet, int row, int col) {
    asSheet(sheet)->setTopLeftView(row, col);
}

int qrSheetRightToLeftW(SheetHandle sheet) { return asSheet(sheet)->rightToLeft(); }

void qrSheetSetRightToLeftW(SheetHandle sheet, int rightToLeft) {
    asSheet(sheet)->setRightToLeft(isTrue(rightToLeft));
}

void qrSheetSetAutoFitAreaW(SheetHandle sheet, int rowFirst, int colFirst, int rowLast,
                            int colLast) {
    asSheet(sheet)->setAutoFitArea(rowFirst, colFirst, rowLast, colLast);
}

void qrSheetAddrToRowColW(SheetHandle sheet, const wchar_t* addr, int* row, int* col,
                          int* rowRelative, int* colRelative) {
    BoolOut rowRelativeOut(rowRelative);
    BoolOut colRelativeOut(colRelative);
    asSheet(sheet)->addrToRowCol(addr, row, col, rowRelativeOut.get(), colRelativeOut.get());
}

const wchar_t* qrSheetRowColToAddrW(SheetHandle sheet, int row, int col, int rowRelative,
                                    int colRelative) {
    // Callers pass -1 for an absolute reference.
    return asSheet(sheet)->rowColToAddr(row, col, isPositive(rowRelative),
                                        isPositive(colRelative));
}

void qrSheetSetTabRgbColorW(SheetHandle sheet, int red, int green, int blue) {
    asSheet(sheet)->setTabRgbColor(red, green, blue);
}

void qrSheetSetTabColorW(SheetHandle sheet, int color) { asSheet(sheet)->setTabColor(color); }

int qrSheetAddIgnoredErrorW(SheetHandle sheet, int rowFirst, int colFirst, int rowLast,
                            int colLast, int iError) {
    return asSheet(sheet)->addIgnoredError(rowFirst, colFirst, rowLast, colLast, iError);
}

// Data validation. The Ex variants count only positive flags as true (callers pass -1 for
// false); the short variants allow blanks, show the drop-down and both messages, and stop.

void qrSheetAddDataValidationExW(SheetHandle sheet, int type, int op, int rowFirst, int rowLast,
                                 int colFirst, int colLast, const wchar_t* value1,
                                 const wchar_t* value2, int allowBlank, int hideDropDown,
                                 int showInputMessage, int showErrorMessage,
                                 const wchar_t* promptTitle, const wchar_t* prompt,
                                 const wchar_t* errorTitle, const wchar_t* error,
                                 int errorStyle) {
    asSheet(sheet)->addDataValidation(type, op, rowFirst, rowLast, colFirst, colLast, value1,
                                      value2, isPositive(allowBlank), isPositive(hideDropDown),
                                      isPositive(showInputMessage),
                                      isPositive(showErrorMessage), promptTitle, prompt,
                                      errorTitle, error, errorStyle);
}

void qrSheetAddDataValidationW(SheetHandle sheet, int type, int op, int rowFirst, int rowLast,
                               int colFirst, int colLast, const wchar_t* value1,
                               const wchar_t* value2) {
    asSheet(sheet)->addDataValidation(type, op, rowFirst, rowLast, colFirst, colLast, value1,
                                      value2, true, false, true, true, nullptr, nullptr, nullptr,
                                      nullptr, 0);
}

void qrSheetAddDataValidationDoubleExW(SheetHandle sheet, int type, int op, int rowFirst,
                                       int rowLast, int colFirst, int colLast, double value1,
                                       double value2, int allowBlank, int hideDropDown,
                                       int showInputMessage, int showErrorMessage,
                                       const wchar_t* promptTitle, const wchar_t* prompt,
                                       const wchar_t* errorTitle, const wchar_t* error,
                                       int errorStyle) {
    asSheet(sheet)->addDataValidationDouble(
        type, op, rowFirst, rowLast, colFirst, colLast, value1, value2, isPositive(allowBlank),
        isPositive(hideDropDown), isPositive(showInputMessage), isPositive(showErrorMessage),
        promptTitle, prompt, errorTitle, error, errorStyle);
}

void qrSheetAddDataValidationDoubleW(SheetHandle sheet, int type, int op, int rowFirst,
                                     int rowLast, int colFirst, int colLast, double value1,
                                     double value2) {
    asSheet(sheet)->addDataValidationDouble(type, op, rowFirst, rowLast, colFirst, colLast, value1,
                                            value2, true, false, true, true, nullptr, nullptr,
                                            nullptr, nullptr, 0);
}

void qrSheetRemoveDataValidationsW(SheetHandle sheet) { asSheet(sheet)->removeDataValidations(); }

}  // extern "C"
