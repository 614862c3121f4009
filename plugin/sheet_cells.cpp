// QrSheetKit: reading and writing cells.
#include "sheet_methods.h"

#include "book_methods.h"
#include "glue.h"
#include "host_dates.h"

namespace quire_plugin {

namespace {

SheetHandle sh(REALobject self) { return sheetOf(self); }
int i32(RBInteger value) { return static_cast<int>(value); }

// Sets a byref format to a new wrapper of `handle` (owner: the sheet) or nil.
void returnFormat(REALobject self, REALobject* format, FormatHandle handle) {
    assignObject(format, wrapHandle(formatClass(), handle, self));
}

REALobject unpackDate(REALobject self, double value) {
    BookHandle book = bookHandleOf(ownerBookOf(self));
    if (!QR_NEED(qrBookDateUnpackW) || !requireHandle(book)) return nullptr;
    DateParts p;
    int msec = 0;
    if (!QR_CALL(qrBookDateUnpackW)(book, value, &p.year, &p.month, &p.day, &p.hour, &p.minute, &p.second, &msec))
        return nullptr;
    return newHostDate(p);
}

}  // namespace

RBInteger sheetCellType(REALobject self, RBInteger row, RBInteger col) {
    if (!QR_NEED(qrSheetCellTypeW) || !requireHandle(sh(self))) return 0;
    return QR_CALL(qrSheetCellTypeW)(sh(self), i32(row), i32(col));
}

RBBoolean sheetIsFormula(REALobject self, RBInteger row, RBInteger col) {
    if (!QR_NEED(qrSheetIsFormulaW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetIsFormulaW)(sh(self), i32(row), i32(col)));
}

RBBoolean sheetIsDate(REALobject self, RBInteger row, RBInteger col) {
    if (!QR_NEED(qrSheetIsDateW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetIsDateW)(sh(self), i32(row), i32(col)));
}

REALobject sheetCellFormat(REALobject self, RBInteger row, RBInteger col) {
    if (!QR_NEED(qrSheetCellFormatW) || !requireHandle(sh(self))) return nullptr;
    return wrapHandle(formatClass(), QR_CALL(qrSheetCellFormatW)(sh(self), i32(row), i32(col)), self);
}

void sheetSetCellFormat(REALobject self, RBInteger row, RBInteger col, REALobject format) {
    if (!QR_NEED(qrSheetSetCellFormatW) || !requireHandle(sh(self))) return;
    if (!requireArgument(format, "format", "format is nil")) return;
    QR_CALL(qrSheetSetCellFormatW)(sh(self), i32(row), i32(col), formatOf(format));
}

REALstring sheetReadStringFormat(REALobject self, RBInteger row, RBInteger col, REALobject* format) {
    assignObject(format, nullptr);
    if (!QR_NEED(qrSheetReadStrW) || !requireHandle(sh(self))) return nullptr;
    if (debugging()) debugLine("SheetReadStrW3", i32(row), i32(col));
    FormatHandle handle = nullptr;
    REALstring result = wideToHostString(QR_CALL(qrSheetReadStrW)(sh(self), i32(row), i32(col), &handle));
    returnFormat(self, format, handle);
    if (debugging()) debugLine("return", result);
    return result;
}

REALstring sheetReadString(REALobject self, RBInteger row, RBInteger col) {
    if (!QR_NEED(qrSheetReadStrW) || !requireHandle(sh(self))) return nullptr;
    if (debugging()) debugLine("SheetReadStrW2", i32(row), i32(col));
    REALstring result = wideToHostString(QR_CALL(qrSheetReadStrW)(sh(self), i32(row), i32(col), nullptr));
    if (debugging()) debugLine("return", result);
    return result;
}

RBBoolean sheetWriteString(REALobject self, RBInteger row, RBInteger col, REALstring value, REALobject format) {
    if (!QR_NEED(qrSheetWriteStrW) || !requireHandle(sh(self))) return false;
    HostText text(value);
    return hostBool(QR_CALL(qrSheetWriteStrW)(sh(self), i32(row), i32(col), text.wide(), formatOf(format)));
}

double sheetReadNumberFormat(REALobject self, RBInteger row, RBInteger col, REALobject* format) {
    assignObject(format, nullptr);
    if (!QR_NEED(qrSheetReadNumW) || !requireHandle(sh(self))) return 0.0;
    FormatHandle handle = nullptr;
    double value = QR_CALL(qrSheetReadNumW)(sh(self), i32(row), i32(col), &handle);
    returnFormat(self, format, handle);
    return value;
}

double sheetReadNumber(REALobject self, RBInteger row, RBInteger col) {
    if (!QR_NEED(qrSheetReadNumW) || !requireHandle(sh(self))) return 0.0;
    return QR_CALL(qrSheetReadNumW)(sh(self), i32(row), i32(col), nullptr);
}

RBBoolean sheetWriteNumber(REALobject self, RBInteger row, RBInteger col, double value, REALobject format) {
    if (!QR_NEED(qrSheetWriteNumW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetWriteNumW)(sh(self), i32(row), i32(col), value, formatOf(format)));
}

RBBoolean sheetReadBooleanFormat(REALobject self, RBInteger row, RBInteger col, REALobject* format) {
    assignObject(format, nullptr);
    if (!QR_NEED(qrSheetReadBoolW) || !requireHandle(sh(self))) return false;
    FormatHandle handle = nullptr;
    int value = QR_CALL(qrSheetReadBoolW)(sh(self), i32(row), i32(col), &handle);
    returnFormat(self, format, handle);
    return hostBool(value);
}

RBBoolean sheetReadBoolean(REALobject self, RBInteger row, RBInteger col) {
    if (!QR_NEED(qrSheetReadBoolW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetReadBoolW)(sh(self), i32(row), i32(col), nullptr));
}

RBBoolean sheetWriteBoolean(REALobject self, RBInteger row, RBInteger col, RBBoolean value, REALobject format) {
    if (!QR_NEED(qrSheetWriteBoolW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetWriteBoolW)(sh(self), i32(row), i32(col), value ? 1 : 0, formatOf(format)));
}

RBBoolean sheetReadBlankFormat(REALobject self, RBInteger row, RBInteger col, REALobject* format) {
    assignObject(format, nullptr);
    if (!QR_NEED(qrSheetReadBlankW) || !requireHandle(sh(self))) return false;
    FormatHandle handle = nullptr;
    int value = QR_CALL(qrSheetReadBlankW)(sh(self), i32(row), i32(col), &handle);
    returnFormat(self, format, handle);
    return hostBool(value);
}

RBBoolean sheetReadBlank(REALobject self, RBInteger row, RBInteger col) {
    if (!QR_NEED(qrSheetReadBlankW) || !requireHandle(sh(self))) return false;
    // The library needs somewhere to put the blank cell's format even when it is not wanted.
    FormatHandle handle = nullptr;
    return hostBool(QR_CALL(qrSheetReadBlankW)(sh(self), i32(row), i32(col), &handle));
}

RBBoolean sheetWriteBlank(REALobject self, RBInteger row, RBInteger col, REALobject format) {
    if (!QR_NEED(qrSheetWriteBlankW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetWriteBlankW)(sh(self), i32(row), i32(col), formatOf(format)));
}

REALstring sheetReadFormulaFormat(REALobject self, RBInteger row, RBInteger col, REALobject* format) {
    assignObject(format, nullptr);
    if (!QR_NEED(qrSheetReadFormulaW) || !requireHandle(sh(self))) return nullptr;
    FormatHandle handle = nullptr;
    REALstring result = wideToHostString(QR_CALL(qrSheetReadFormulaW)(sh(self), i32(row), i32(col), &handle));
    returnFormat(self, format, handle);
    return result;
}

REALstring sheetReadFormula(REALobject self, RBInteger row, RBInteger col) {
    if (!QR_NEED(qrSheetReadFormulaW) || !requireHandle(sh(self))) return nullptr;
    return wideToHostString(QR_CALL(qrSheetReadFormulaW)(sh(self), i32(row), i32(col), nullptr));
}

RBBoolean sheetWriteFormula(REALobject self, RBInteger row, RBInteger col, REALstring value, REALobject format) {
    if (!QR_NEED(qrSheetWriteFormulaW) || !requireHandle(sh(self))) return false;
    HostText text(value);
    return hostBool(QR_CALL(qrSheetWriteFormulaW)(sh(self), i32(row), i32(col), text.wide(), formatOf(format)));
}

RBBoolean sheetWriteFormulaNum(REALobject self, RBInteger row, RBInteger col, REALstring expr, double value, REALobject format) {
    if (!QR_NEED(qrSheetWriteFormulaNumW) || !requireHandle(sh(self))) return false;
    HostText text(expr);
    return hostBool(QR_CALL(qrSheetWriteFormulaNumW)(sh(self), i32(row), i32(col), text.wide(), value, formatOf(format)));
}

RBBoolean sheetWriteFormulaString(REALobject self, RBInteger row, RBInteger col, REALstring expr, REALstring value,
                                  REALobject format) {
    if (!QR_NEED(qrSheetWriteFormulaStrW) || !requireHandle(sh(self))) return false;
    HostText text(expr), result(value);
    return hostBool(
        QR_CALL(qrSheetWriteFormulaStrW)(sh(self), i32(row), i32(col), text.wide(), result.wide(), formatOf(format)));
}

RBBoolean sheetWriteFormulaBool(REALobject self, RBInteger row, RBInteger col, REALstring expr, RBBoolean value,
                                REALobject format) {
    if (!QR_NEED(qrSheetWriteFormulaBoolW) || !requireHandle(sh(self))) return false;
    HostText text(expr);
    return hostBool(
        QR_CALL(qrSheetWriteFormulaBoolW)(sh(self), i32(row), i32(col), text.wide(), value ? 1 : 0, formatOf(format)));
}

REALstring sheetReadComment(REALobject self, RBInteger row, RBInteger col) {
    if (!QR_NEED(qrSheetReadCommentW) || !requireHandle(sh(self))) return nullptr;
    return wideToHostString(QR_CALL(qrSheetReadCommentW)(sh(self), i32(row), i32(col)));
}

void sheetWriteComment(REALobject self, RBInteger row, RBInteger col, REALstring value, REALstring author, RBInteger width,
                       RBInteger height) {
    if (!QR_NEED(qrSheetWriteCommentW) || !requireHandle(sh(self))) return;
    HostText text(value), writer(author);
    QR_CALL(qrSheetWriteCommentW)(sh(self), i32(row), i32(col), text.wide(), writer.wide(), i32(width), i32(height));
}

void sheetRemoveComment(REALobject self, RBInteger row, RBInteger col) {
    if (!QR_NEED(qrSheetRemoveCommentW) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetRemoveCommentW)(sh(self), i32(row), i32(col));
}

RBInteger sheetReadError(REALobject self, RBInteger row, RBInteger col) {
    if (!QR_NEED(qrSheetReadErrorW) || !requireHandle(sh(self))) return 0;
    return QR_CALL(qrSheetReadErrorW)(sh(self), i32(row), i32(col));
}

void sheetWriteError(REALobject self, RBInteger row, RBInteger col, RBInteger error, REALobject format) {
    if (!QR_NEED(qrSheetWriteErrorW) || !requireHandle(sh(self))) return;
    QR_CALL(qrSheetWriteErrorW)(sh(self), i32(row), i32(col), i32(error), formatOf(format));
}

REALobject sheetReadDateFormat(REALobject self, RBInteger row, RBInteger col, REALobject* format) {
    assignObject(format, nullptr);
    if (!QR_NEED(qrSheetReadNumW) || !requireHandle(sh(self))) return nullptr;
    FormatHandle handle = nullptr;
    double value = QR_CALL(qrSheetReadNumW)(sh(self), i32(row), i32(col), &handle);
    returnFormat(self, format, handle);
    return unpackDate(self, value);
}

REALobject sheetReadDate(REALobject self, RBInteger row, RBInteger col) {
    if (!QR_NEED(qrSheetReadNumW) || !requireHandle(sh(self))) return nullptr;
    return unpackDate(self, QR_CALL(qrSheetReadNumW)(sh(self), i32(row), i32(col), nullptr));
}

RBBoolean sheetWriteDate(REALobject self, RBInteger row, RBInteger col, REALobject value, REALobject format) {
    if (!QR_NEED(qrSheetWriteNumW) || !QR_NEED(qrSheetWriteBlankW) || !requireHandle(sh(self))) return false;
    if (!value) return hostBool(QR_CALL(qrSheetWriteBlankW)(sh(self), i32(row), i32(col), formatOf(format)));
    if (!QR_NEED(qrBookDatePackW) || !requireHandle(bookHandleOf(ownerBookOf(self)))) return false;
    double serial = bookPackDateObject(ownerBookOf(self), value);
    return hostBool(QR_CALL(qrSheetWriteNumW)(sh(self), i32(row), i32(col), serial, formatOf(format)));
}

RBBoolean sheetCopyCell(REALobject self, RBInteger rowSrc, RBInteger colSrc, RBInteger rowDst, RBInteger colDst) {
    if (!QR_NEED(qrSheetCopyCellW) || !requireHandle(sh(self))) return false;
    return hostBool(QR_CALL(qrSheetCopyCellW)(sh(self), i32(rowSrc), i32(colSrc), i32(rowDst), i32(colDst)));
}

}  // namespace quire_plugin
