// QrSheetKit: rows and columns, merges, pictures, page setup, names, hyperlinks and validation.
// Arguments reach the library by name: where a host declaration lists them in another order than
// the entry point (rowFirst, colFirst, rowLast, colLast), each goes to its own parameter.
#include "sheet_methods.h"

#include "glue.h"

namespace quire_plugin {

namespace {
SheetHandle sh(REALobject self) { return sheetOf(self); }
int i32(RBInteger value) { return static_cast<int>(value); }
void put(RBInteger* output, int value) {
    if (output) *output = value;
}
void putBool(RBBoolean* output, int value) {
    if (output) *output = value ? 1 : 0;
}
}  // namespace

void sheetConstructor(REALobject) {}

RBInteger sheetColWidthPx(REALobject self, RBInteger col) {
    if (!QR_NEED(qrSheetColWidthPxW) || !requireHandle(sh(self))) return 0;
    return QR_CALL(qrSheetColWidthPxW)(sh(self), i32(col));
}

RBInteger sheetRowHeightPx(REALobject self, RBInteger row) {
    if (!QR_NEED(qrSheetRowHeightPxW) || !requireHandle(sh(self))) return 0;
    return QR_CALL(qrSheetRowHeightPxW)(sh(self), i32(row));
}

void sheetAddDataValidationDoubleEx(REALobject self, RBInteger type, RBInteger op, RBInteger rowFirst, RBInteger colFirst,
                                    RBInteger rowLast, RBInteger colLast, double value1, double value2, RBBoolean allowBlank,
                                    RBBoolean hideDropDown, RBBoolean showInputMessage, RBBoolean showErrorMessage,
                                    REALstring promptTitle, REALstring prompt, REALstring errorTitle, REALstring error,
                                    RBInteger errorStyle) {
    if (!QR_NEED(qrSheetAddDataValidationDoubleExW) || !requireHandle(sh(self))) return;
    HostText title(promptTitle), text(prompt), errTitle(errorTitle), err(error);
    QR_CALL(qrSheetAddDataValidationDoubleExW)(sh(self), i32(type), i32(op), i32(rowFirst), i32(rowLast), i32(colFirst),
                                               i32(colLast), value1, value2, allowBlank ? 1 : 0, hideDropDown ? 1 : 0,
                                               showInputMessage ? 1 : 0, showErrorMessage ? 1 : 0, title.wide(),
                                               text.wide(), errTitle.wide(), err.wide(), i32(errorStyle));
}

void sheetAddDataValidationDouble(REALobject self, RBInteger type, RBInteger op, RBInteger rowFirst, RBInteger colFirst,
                                  RBInteger rowLast, RBInteger colLast, double value1, double value2) {
    if (!QR_NEED(qrSheetAddDataValidationDoubleW) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetAddDataValidationDoubleW)(sh(self), i32(type), i32(op), i32(rowFirst), i32(rowLast), i32(colFirst),
                                             i32(colLast), value1, value2);
}

void sheetAddDataValidationEx(REALobject self, RBInteger type, RBInteger op, RBInteger rowFirst, RBInteger colFirst,
                              RBInteger rowLast, RBInteger colLast, REALstring value1, REALstring value2, RBBoolean allowBlank,
                              RBBoolean hideDropDown, RBBoolean showInputMessage, RBBoolean showErrorMessage,
                              REALstring promptTitle, REALstring prompt, REALstring errorTitle, REALstring error,
                              RBInteger errorStyle) {
    if (!QR_NEED(qrSheetAddDataValidationExW) || !requireHandle(sh(self))) return;
    HostText first(value1), second(value2), title(promptTitle), text(prompt), errTitle(errorTitle), err(error);
    QR_CALL(qrSheetAddDataValidationExW)(sh(self), i32(type), i32(op), i32(rowFirst), i32(rowLast), i32(colFirst),
                                         i32(colLast), first.wide(), second.wide(), allowBlank ? 1 : 0,
                                         hideDropDown ? 1 : 0, showInputMessage ? 1 : 0, showErrorMessage ? 1 : 0,
                                         title.wide(), text.wide(), errTitle.wide(), err.wide(), i32(errorStyle));
}

void sheetAddDataValidation(REALobject self, RBInteger type, RBInteger op, RBInteger rowFirst, RBInteger colFirst,
                            RBInteger rowLast, RBInteger colLast, REALstring value1, REALstring value2) {
    if (!QR_NEED(qrSheetAddDataValidationW) || !requireHandle(sh(self))) return;
    HostText first(value1), second(value2);
    QR_CALL(qrSheetAddDataValidationW)(sh(self), i32(type), i32(op), i32(rowFirst), i32(rowLast), i32(colFirst),
                                       i32(colLast), first.wide(), second.wide());
}

#define QR_SHEET_ACTION(function, entry)                              \
    void function(REALobject self) {                                  \
        if (!QR_NEED(entry) || !requireHandle(sh(self))) return;      \
        QR_CALL(entry)(sh(self));                                     \
    }
QR_SHEET_ACTION(sheetRemoveDataValidations, qrSheetRemoveDataValidationsW)
QR_SHEET_ACTION(sheetApplyFilter, qrSheetApplyFilterW)
QR_SHEET_ACTION(sheetRemoveFilter, qrSheetRemoveFilterW)
QR_SHEET_ACTION(sheetClearPrintRepeats, qrSheetClearPrintRepeatsW)
QR_SHEET_ACTION(sheetClearPrintArea, qrSheetClearPrintAreaW)
#undef QR_SHEET_ACTION

void sheetAddIgnoredError(REALobject self, RBInteger rowFirst, RBInteger colFirst, RBInteger rowLast, RBInteger colLast,
                          RBInteger error) {
    if (!QR_NEED(qrSheetAddIgnoredErrorW) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetAddIgnoredErrorW)(sh(self), i32(rowFirst), i32(colFirst), i32(rowLast), i32(colLast), i32(error));
}

void sheetSetProtectEx(REALobject self, RBBoolean protect, REALstring password, RBInteger enhancedProtection) {
    if (!QR_NEED(qrSheetSetProtectExW) || !requireHandle(sh(self))) return;
    HostText text(password);
    QR_CALL(qrSheetSetProtectExW)(sh(self), protect ? 1 : 0, text.wide(), i32(enhancedProtection));
}

void sheetSetTabRgbColor(REALobject self, RBInteger red, RBInteger green, RBInteger blue) {
    if (!QR_NEED(qrSheetSetTabRgbColorW) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetSetTabRgbColorW)(sh(self), i32(red), i32(green), i32(blue));
}

void sheetSetTabColor(REALobject self, RBInteger color) {
    if (!QR_NEED(qrSheetSetTabColorW) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetSetTabColorW)(sh(self), i32(color));
}

REALstring sheetTable(REALobject self, RBInteger index, RBInteger* rowFirst, RBInteger* rowLast, RBInteger* colFirst,
                      RBInteger* colLast, RBInteger* headerRowCount, RBInteger* totalsRowCount) {
    if (!QR_NEED(qrSheetTableW) || !requireHandle(sh(self))) return nullptr;
    int rf = 0, rl = 0, cf = 0, cl = 0, header = 0, totals = 0;
    const wchar_t* name = QR_CALL(qrSheetTableW)(sh(self), i32(index), &rf, &rl, &cf, &cl, &header, &totals);
    put(rowFirst, rf), put(rowLast, rl), put(colFirst, cf), put(colLast, cl), put(headerRowCount, header),
        put(totalsRowCount, totals);
    return wideToHostString(name);
}

RBBoolean sheetGetPrintRepeatRows(REALobject self, RBInteger* rowFirst, RBInteger* rowLast) {
    if (!QR_NEED(qrSheetPrintRepeatRowsW) || !requireHandle(sh(self))) return false;
    int first = 0, last = 0;
    int ok = QR_CALL(qrSheetPrintRepeatRowsW)(sh(self), &first, &last);
    put(rowFirst, first), put(rowLast, last);
    return hostBool(ok);
}

RBBoolean sheetGetPrintRepeatCols(REALobject self, RBInteger* colFirst, RBInteger* colLast) {
    if (!QR_NEED(qrSheetPrintRepeatColsW) || !requireHandle(sh(self))) return false;
    int first = 0, last = 0;
    int ok = QR_CALL(qrSheetPrintRepeatColsW)(sh(self), &first, &last);
    put(colFirst, first), put(colLast, last);
    return hostBool(ok);
}

RBBoolean sheetGetPrintArea(REALobject self, RBInteger* rowFirst, RBInteger* colFirst, RBInteger* rowLast, RBInteger* colLast) {
    if (!QR_NEED(qrSheetPrintAreaW) || !requireHandle(sh(self))) return false;
    int rf = 0, rl = 0, cf = 0, cl = 0;
    int ok = QR_CALL(qrSheetPrintAreaW)(sh(self), &rf, &rl, &cf, &cl);
    put(rowFirst, rf), put(colFirst, cf), put(rowLast, rl), put(colLast, cl);
    return hostBool(ok);
}

void sheetSetAutoFitArea(REALobject self, RBInteger rowFirst, RBInteger colFirst, RBInteger rowLast, RBInteger colLast) {
    if (!QR_NEED(qrSheetSetAutoFitAreaW) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetSetAutoFitAreaW)(sh(self), i32(rowFirst), i32(colFirst), i32(rowLast), i32(colLast));
}

void sheetAddHyperlink(REALobject self, REALstring hyperlink, RBInteger rowFirst, RBInteger rowLast, RBInteger colFirst,
                       RBInteger colLast) {
    if (!QR_NEED(qrSheetAddHyperlinkW) || !requireHandle(sh(self))) return;
    HostText text(hyperlink);
    QR_CALL(qrSheetAddHyperlinkW)(sh(self), text.wide(), i32(rowFirst), i32(rowLast), i32(colFirst), i32(colLast));
}

REALstring sheetHyperlink(REALobject self, RBInteger index, RBInteger* rowFirst, RBInteger* rowLast, RBInteger* colFirst,
                          RBInteger* colLast) {
    if (!QR_NEED(qrSheetHyperlinkW) || !requireHandle(sh(self))) return nullptr;
    int rf = 0, rl = 0, cf = 0, cl = 0;
    const wchar_t* link = QR_CALL(qrSheetHyperlinkW)(sh(self), i32(index), &rf, &rl, &cf, &cl);
    put(rowFirst, rf), put(rowLast, rl), put(colFirst, cf), put(colLast, cl);
    return wideToHostString(link);
}

RBBoolean sheetDelHyperlink(REALobject self, RBInteger index) {
    if (!QR_NEED(qrSheetDelHyperlinkW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetDelHyperlinkW)(sh(self), i32(index)));
}

RBBoolean sheetMerge(REALobject self, RBInteger index, RBInteger* rowFirst, RBInteger* rowLast, RBInteger* colFirst,
                     RBInteger* colLast) {
    if (!QR_NEED(qrSheetMergeW) || !requireHandle(sh(self))) return false;
    int rf = 0, rl = 0, cf = 0, cl = 0;
    int ok = QR_CALL(qrSheetMergeW)(sh(self), i32(index), &rf, &rl, &cf, &cl);
    put(rowFirst, rf), put(rowLast, rl), put(colFirst, cf), put(colLast, cl);
    return hostBool(ok);
}

RBBoolean sheetSplitInfo(REALobject self, RBInteger* row, RBInteger* col) {
    if (!QR_NEED(qrSheetSplitInfoW) || !requireHandle(sh(self))) return false;
    int r = 0, c = 0;
    int ok = QR_CALL(qrSheetSplitInfoW)(sh(self), &r, &c);
    put(row, r), put(col, c);
    return hostBool(ok);
}

RBBoolean sheetDelMergeByIndex(REALobject self, RBInteger index) {
    if (!QR_NEED(qrSheetDelMergeByIndexW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetDelMergeByIndexW)(sh(self), i32(index)));
}

void sheetAddrToRowCol(REALobject self, REALstring addr, RBInteger* row, RBInteger* col, RBBoolean* rowRelative,
                       RBBoolean* colRelative) {
    if (!QR_NEED(qrSheetAddrToRowColW) || !requireHandle(sh(self))) return;
    HostText text(addr);
    int r = 0, c = 0, rowRel = 0, colRel = 0;
    QR_CALL(qrSheetAddrToRowColW)(sh(self), text.wide(), &r, &c, &rowRel, &colRel);
    put(row, r), put(col, c), putBool(rowRelative, rowRel), putBool(colRelative, colRel);
}

REALstring sheetRowColToAddr(REALobject self, RBInteger row, RBInteger col, RBBoolean rowRelative, RBBoolean colRelative) {
    if (!QR_NEED(qrSheetRowColToAddrW) || !requireHandle(sh(self))) return nullptr;
    return wideToHostString(
        QR_CALL(qrSheetRowColToAddrW)(sh(self), i32(row), i32(col), rowRelative ? 1 : 0, colRelative ? 1 : 0));
}

void sheetGetTopLeftView(REALobject self, RBInteger* row, RBInteger* col) {
    if (!QR_NEED(qrSheetGetTopLeftViewW) || !requireHandle(sh(self))) return;
    int r = 0, c = 0;
    QR_CALL(qrSheetGetTopLeftViewW)(sh(self), &r, &c);
    put(row, r), put(col, c);
}

void sheetSetTopLeftView(REALobject self, RBInteger row, RBInteger col) {
    if (!QR_NEED(qrSheetSetTopLeftViewW) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetSetTopLeftViewW)(sh(self), i32(row), i32(col));
}

RBInteger sheetGetPicture(REALobject self, RBInteger index, RBInteger* rowTop, RBInteger* colLeft, RBInteger* rowBottom,
                          RBInteger* colRight, RBInteger* width, RBInteger* height, RBInteger* offsetX, RBInteger* offsetY) {
    if (!QR_NEED(qrSheetGetPictureW) || !requireHandle(sh(self))) return 0;
    int v[8] = {};
    int id = QR_CALL(qrSheetGetPictureW)(sh(self), i32(index), &v[0], &v[1], &v[2], &v[3], &v[4], &v[5], &v[6], &v[7]);
    RBInteger* outputs[8] = {rowTop, colLeft, rowBottom, colRight, width, height, offsetX, offsetY};
    for (int i = 0; i < 8; ++i) put(outputs[i], v[i]);
    return id;
}

RBBoolean sheetGetMerge(REALobject self, RBInteger row, RBInteger col, RBInteger* rowFirst, RBInteger* rowLast,
                        RBInteger* colFirst, RBInteger* colLast) {
    if (!QR_NEED(qrSheetGetMergeW) || !requireHandle(sh(self))) return false;
    int rf = 0, rl = 0, cf = 0, cl = 0;
    int ok = QR_CALL(qrSheetGetMergeW)(sh(self), i32(row), i32(col), &rf, &rl, &cf, &cl);
    put(rowFirst, rf), put(rowLast, rl), put(colFirst, cf), put(colLast, cl);
    return hostBool(ok);
}

RBBoolean sheetSetMerge(REALobject self, RBInteger rowFirst, RBInteger rowLast, RBInteger colFirst, RBInteger colLast) {
    if (!QR_NEED(qrSheetSetMergeW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetSetMergeW)(sh(self), i32(rowFirst), i32(rowLast), i32(colFirst), i32(colLast)));
}

RBBoolean sheetDelMerge(REALobject self, RBInteger row, RBInteger col) {
    if (!QR_NEED(qrSheetDelMergeW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetDelMergeW)(sh(self), i32(row), i32(col)));
}

void sheetSetPicture(REALobject self, RBInteger row, RBInteger col, RBInteger id, double scale, RBInteger offsetX,
                     RBInteger offsetY, RBInteger pos) {
    if (!QR_NEED(qrSheetSetPictureW) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetSetPictureW)(sh(self), i32(row), i32(col), i32(id), scale, i32(offsetX), i32(offsetY), i32(pos));
}

void sheetSetPicture2(REALobject self, RBInteger row, RBInteger col, RBInteger id, RBInteger width, RBInteger height,
                      RBInteger offsetX, RBInteger offsetY, RBInteger pos) {
    if (!QR_NEED(qrSheetSetPicture2W) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetSetPicture2W)(sh(self), i32(row), i32(col), i32(id), i32(width), i32(height), i32(offsetX),
                                 i32(offsetY), i32(pos));
}

RBBoolean sheetSetRow(REALobject self, RBInteger row, double height, REALobject format, RBBoolean hidden) {
    if (!QR_NEED(qrSheetSetRowW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetSetRowW)(sh(self), i32(row), height, formatOf(format), hidden ? 1 : 0));
}

RBBoolean sheetSetCol(REALobject self, RBInteger colFirst, RBInteger colLast, double width, REALobject format, RBBoolean hidden) {
    if (!QR_NEED(qrSheetSetColW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetSetColW)(sh(self), i32(colFirst), i32(colLast), width, formatOf(format), hidden ? 1 : 0));
}

RBBoolean sheetGroupCols(REALobject self, RBInteger colFirst, RBInteger colLast, RBBoolean collapsed) {
    if (!QR_NEED(qrSheetGroupColsW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetGroupColsW)(sh(self), i32(colFirst), i32(colLast), collapsed ? 1 : 0));
}

RBBoolean sheetGroupRows(REALobject self, RBInteger rowFirst, RBInteger rowLast, RBBoolean collapsed) {
    if (!QR_NEED(qrSheetGroupRowsW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetGroupRowsW)(sh(self), i32(rowFirst), i32(rowLast), collapsed ? 1 : 0));
}

RBBoolean sheetGetNamedRangeScoped(REALobject self, REALstring name, RBInteger* rowFirst, RBInteger* rowLast,
                                   RBInteger* colFirst, RBInteger* colLast, RBInteger scopeId, RBInteger* hidden) {
    if (!QR_NEED(qrSheetGetNamedRangeW) || !requireHandle(sh(self))) return false;
    HostText text(name);
    int rf = 0, rl = 0, cf = 0, cl = 0, h = 0;
    int ok = QR_CALL(qrSheetGetNamedRangeW)(sh(self), text.wide(), &rf, &rl, &cf, &cl, i32(scopeId), &h);
    put(rowFirst, rf), put(rowLast, rl), put(colFirst, cf), put(colLast, cl), put(hidden, h);
    return hostBool(ok);
}

RBBoolean sheetGetNamedRange(REALobject self, REALstring name, RBInteger* rowFirst, RBInteger* rowLast, RBInteger* colFirst,
                             RBInteger* colLast) {
    return sheetGetNamedRangeScoped(self, name, rowFirst, rowLast, colFirst, colLast, ScopeUndefined, nullptr);
}

RBBoolean sheetSetNamedRange(REALobject self, REALstring name, RBInteger rowFirst, RBInteger rowLast, RBInteger colFirst,
                             RBInteger colLast, RBInteger) {
    // The entry point defines the name with its own fixed scope.
    if (!QR_NEED(qrSheetSetNamedRangeW) || !requireHandle(sh(self))) return false;
    HostText text(name);
    return hostBool(QR_CALL(qrSheetSetNamedRangeW)(sh(self), text.wide(), i32(rowFirst), i32(rowLast), i32(colFirst),
                                                   i32(colLast)));
}

RBBoolean sheetDelNamedRange(REALobject self, REALstring name, RBInteger scopeId) {
    if (!QR_NEED(qrSheetDelNamedRangeW) || !requireHandle(sh(self))) return false;
    HostText text(name);
    return hostBool(QR_CALL(qrSheetDelNamedRangeW)(sh(self), text.wide(), i32(scopeId)));
}

REALstring sheetNamedRangeScoped(REALobject self, RBInteger index, RBInteger* rowFirst, RBInteger* rowLast,
                                 RBInteger* colFirst, RBInteger* colLast, RBInteger* scopeId, RBBoolean* hidden) {
    if (!QR_NEED(qrSheetNamedRangeW) || !requireHandle(sh(self))) return nullptr;
    int rf = 0, rl = 0, cf = 0, cl = 0, scope = 0, h = 0;
    const wchar_t* name = QR_CALL(qrSheetNamedRangeW)(sh(self), i32(index), &rf, &rl, &cf, &cl, &scope, &h);
    put(rowFirst, rf), put(rowLast, rl), put(colFirst, cf), put(colLast, cl), put(scopeId, scope), putBool(hidden, h);
    return wideToHostString(name);
}

REALstring sheetNamedRange(REALobject self, RBInteger index, RBInteger* rowFirst, RBInteger* rowLast, RBInteger* colFirst,
                           RBInteger* colLast) {
    return sheetNamedRangeScoped(self, index, rowFirst, rowLast, colFirst, colLast, nullptr, nullptr);
}

void sheetSetPrintRepeatRows(REALobject self, RBInteger rowFirst, RBInteger rowLast) {
    if (!QR_NEED(qrSheetSetPrintRepeatRowsW) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetSetPrintRepeatRowsW)(sh(self), i32(rowFirst), i32(rowLast));
}

void sheetSetPrintRepeatCols(REALobject self, RBInteger colFirst, RBInteger colLast) {
    if (!QR_NEED(qrSheetSetPrintRepeatColsW) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetSetPrintRepeatColsW)(sh(self), i32(colFirst), i32(colLast));
}

void sheetSetPrintArea(REALobject self, RBInteger rowFirst, RBInteger rowLast, RBInteger colFirst, RBInteger colLast) {
    if (!QR_NEED(qrSheetSetPrintAreaW) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetSetPrintAreaW)(sh(self), i32(rowFirst), i32(rowLast), i32(colFirst), i32(colLast));
}

void sheetSetPrintFit(REALobject self, RBInteger wPages, RBInteger hPages) {
    if (!QR_NEED(qrSheetSetPrintFitW) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetSetPrintFitW)(sh(self), i32(wPages), i32(hPages));
}

RBBoolean sheetGetPrintFit(REALobject self, RBInteger* wPages, RBInteger* hPages) {
    if (!QR_NEED(qrSheetGetPrintFitW) || !requireHandle(sh(self))) return false;
    int w = 0, h = 0;
    int ok = QR_CALL(qrSheetGetPrintFitW)(sh(self), &w, &h);
    put(wPages, w), put(hPages, h);
    return hostBool(ok);
}

#define QR_SHEET_RANGE(function, entry)                                                   \
    RBBoolean function(REALobject self, RBInteger first, RBInteger last) {                \
        if (!QR_NEED(entry) || !requireHandle(sh(self))) return false;                    \
        return hostBool(QR_CALL(entry)(sh(self), i32(first), i32(last)));                 \
    }
QR_SHEET_RANGE(sheetRemoveRow, qrSheetRemoveRowW)
QR_SHEET_RANGE(sheetRemoveCol, qrSheetRemoveColW)
QR_SHEET_RANGE(sheetInsertRow, qrSheetInsertRowW)
QR_SHEET_RANGE(sheetInsertCol, qrSheetInsertColW)
#undef QR_SHEET_RANGE

RBBoolean sheetRowHidden(REALobject self, RBInteger row) {
    if (!QR_NEED(qrSheetRowHiddenW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetRowHiddenW)(sh(self), i32(row)));
}

void sheetSetRowHidden(REALobject self, RBInteger row, RBBoolean hidden) {
    if (!QR_NEED(qrSheetSetRowHiddenW) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetSetRowHiddenW)(sh(self), i32(row), hidden ? 1 : 0);
}

RBBoolean sheetColHidden(REALobject self, RBInteger col) {
    if (!QR_NEED(qrSheetColHiddenW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetColHiddenW)(sh(self), i32(col)));
}

void sheetSetColHidden(REALobject self, RBInteger col, RBBoolean hidden) {
    if (!QR_NEED(qrSheetSetColHiddenW) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetSetColHiddenW)(sh(self), i32(col), hidden ? 1 : 0);
}

double sheetRowHeight(REALobject self, RBInteger row) {
    if (!QR_NEED(qrSheetRowHeightW) || !requireHandle(sh(self))) return 0.0;
    return QR_CALL(qrSheetRowHeightW)(sh(self), i32(row));
}

double sheetColWidth(REALobject self, RBInteger col) {
    if (!QR_NEED(qrSheetColWidthW) || !requireHandle(sh(self))) return 0.0;
    return QR_CALL(qrSheetColWidthW)(sh(self), i32(col));
}

RBBoolean sheetSetFooter(REALobject self, REALstring footer, double margin) {
    if (!QR_NEED(qrSheetSetFooterW) || !requireHandle(sh(self))) return false;
    HostText text(footer);
    return hostBool(QR_CALL(qrSheetSetFooterW)(sh(self), text.wide(), margin));
}

RBBoolean sheetSetHeader(REALobject self, REALstring header, double margin) {
    if (!QR_NEED(qrSheetSetHeaderW) || !requireHandle(sh(self))) return false;
    HostText text(header);
    return hostBool(QR_CALL(qrSheetSetHeaderW)(sh(self), text.wide(), margin));
}

void sheetSplit(REALobject self, RBInteger row, RBInteger col) {
    if (!QR_NEED(qrSheetSplitW) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetSplitW)(sh(self), i32(row), i32(col));
}

RBBoolean sheetSetVerPageBreak(REALobject self, RBInteger col, RBBoolean pageBreak) {
    if (!QR_NEED(qrSheetSetVerPageBreakW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetSetVerPageBreakW)(sh(self), i32(col), pageBreak ? 1 : 0));
}

RBBoolean sheetSetHorPageBreak(REALobject self, RBInteger row, RBBoolean pageBreak) {
    if (!QR_NEED(qrSheetSetHorPageBreakW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetSetHorPageBreakW)(sh(self), i32(row), pageBreak ? 1 : 0));
}

RBInteger sheetGetVerPageBreak(REALobject self, RBInteger index) {
    if (!QR_NEED(qrSheetGetVerPageBreakW) || !requireHandle(sh(self))) return 0;
    return QR_CALL(qrSheetGetVerPageBreakW)(sh(self), i32(index));
}

RBInteger sheetGetHorPageBreak(REALobject self, RBInteger index) {
    if (!QR_NEED(qrSheetGetHorPageBreakW) || !requireHandle(sh(self))) return 0;
    return QR_CALL(qrSheetGetHorPageBreakW)(sh(self), i32(index));
}

void sheetClear(REALobject self, RBInteger rowFirst, RBInteger rowLast, RBInteger colFirst, RBInteger colLast) {
    if (!QR_NEED(qrSheetClearW) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetClearW)(sh(self), i32(rowFirst), i32(rowLast), i32(colFirst), i32(colLast));
}

}  // namespace quire_plugin
