#pragma once
// The host methods and property accessors of QrSheetKit.
#include "host_sdk.h"

namespace quire_plugin {

// Cells (sheet_cells.cpp)
RBInteger sheetCellType(REALobject self, RBInteger row, RBInteger col);
RBBoolean sheetIsFormula(REALobject self, RBInteger row, RBInteger col);
RBBoolean sheetIsDate(REALobject self, RBInteger row, RBInteger col);
REALobject sheetCellFormat(REALobject self, RBInteger row, RBInteger col);
void sheetSetCellFormat(REALobject self, RBInteger row, RBInteger col, REALobject format);
REALstring sheetReadStringFormat(REALobject self, RBInteger row, RBInteger col, REALobject* format);
REALstring sheetReadString(REALobject self, RBInteger row, RBInteger col);
RBBoolean sheetWriteString(REALobject self, RBInteger row, RBInteger col, REALstring value, REALobject format);
double sheetReadNumberFormat(REALobject self, RBInteger row, RBInteger col, REALobject* format);
double sheetReadNumber(REALobject self, RBInteger row, RBInteger col);
RBBoolean sheetWriteNumber(REALobject self, RBInteger row, RBInteger col, double value, REALobject format);
RBBoolean sheetReadBooleanFormat(REALobject self, RBInteger row, RBInteger col, REALobject* format);
RBBoolean sheetReadBoolean(REALobject self, RBInteger row, RBInteger col);
RBBoolean sheetWriteBoolean(REALobject self, RBInteger row, RBInteger col, RBBoolean value, REALobject format);
RBBoolean sheetReadBlankFormat(REALobject self, RBInteger row, RBInteger col, REALobject* format);
RBBoolean sheetReadBlank(REALobject self, RBInteger row, RBInteger col);
RBBoolean sheetWriteBlank(REALobject self, RBInteger row, RBInteger col, REALobject format);
REALstring sheetReadFormulaFormat(REALobject self, RBInteger row, RBInteger col, REALobject* format);
REALstring sheetReadFormula(REALobject self, RBInteger row, RBInteger col);
RBBoolean sheetWriteFormula(REALobject self, RBInteger row, RBInteger col, REALstring value, REALobject format);
RBBoolean sheetWriteFormulaNum(REALobject self, RBInteger row, RBInteger col, REALstring expr, double value, REALobject format);
RBBoolean sheetWriteFormulaString(REALobject self, RBInteger row, RBInteger col, REALstring expr, REALstring value,
                                  REALobject format);
RBBoolean sheetWriteFormulaBool(REALobject self, RBInteger row, RBInteger col, REALstring expr, RBBoolean value,
                                REALobject format);
REALstring sheetReadComment(REALobject self, RBInteger row, RBInteger col);
void sheetWriteComment(REALobject self, RBInteger row, RBInteger col, REALstring value, REALstring author, RBInteger width,
                       RBInteger height);
void sheetRemoveComment(REALobject self, RBInteger row, RBInteger col);
RBInteger sheetReadError(REALobject self, RBInteger row, RBInteger col);
void sheetWriteError(REALobject self, RBInteger row, RBInteger col, RBInteger error, REALobject format);
REALobject sheetReadDateFormat(REALobject self, RBInteger row, RBInteger col, REALobject* format);
REALobject sheetReadDate(REALobject self, RBInteger row, RBInteger col);
RBBoolean sheetWriteDate(REALobject self, RBInteger row, RBInteger col, REALobject value, REALobject format);
RBBoolean sheetCopyCell(REALobject self, RBInteger rowSrc, RBInteger colSrc, RBInteger rowDst, RBInteger colDst);

}  // namespace quire_plugin

namespace quire_plugin {

// Layout, printing and sheet objects (sheet_layout.cpp)
RBInteger sheetColWidthPx(REALobject self, RBInteger col);
RBInteger sheetRowHeightPx(REALobject self, RBInteger row);
void sheetAddDataValidationDoubleEx(REALobject self, RBInteger type, RBInteger op, RBInteger rowFirst, RBInteger colFirst,
                                    RBInteger rowLast, RBInteger colLast, double value1, double value2, RBBoolean allowBlank,
                                    RBBoolean hideDropDown, RBBoolean showInputMessage, RBBoolean showErrorMessage,
                                    REALstring promptTitle, REALstring prompt, REALstring errorTitle, REALstring error,
                                    RBInteger errorStyle);
void sheetAddDataValidationDouble(REALobject self, RBInteger type, RBInteger op, RBInteger rowFirst, RBInteger colFirst,
                                  RBInteger rowLast, RBInteger colLast, double value1, double value2);
void sheetAddDataValidationEx(REALobject self, RBInteger type, RBInteger op, RBInteger rowFirst, RBInteger colFirst,
                              RBInteger rowLast, RBInteger colLast, REALstring value1, REALstring value2, RBBoolean allowBlank,
                              RBBoolean hideDropDown, RBBoolean showInputMessage, RBBoolean showErrorMessage,
                              REALstring promptTitle, REALstring prompt, REALstring errorTitle, REALstring error,
                              RBInteger errorStyle);
void sheetAddDataValidation(REALobject self, RBInteger type, RBInteger op, RBInteger rowFirst, RBInteger colFirst,
                            RBInteger rowLast, RBInteger colLast, REALstring value1, REALstring value2);
void sheetRemoveDataValidations(REALobject self);
void sheetApplyFilter(REALobject self);
void sheetRemoveFilter(REALobject self);
void sheetAddIgnoredError(REALobject self, RBInteger rowFirst, RBInteger colFirst, RBInteger rowLast, RBInteger colLast,
                          RBInteger error);
void sheetSetProtectEx(REALobject self, RBBoolean protect, REALstring password, RBInteger enhancedProtection);
void sheetSetTabRgbColor(REALobject self, RBInteger red, RBInteger green, RBInteger blue);
void sheetSetTabColor(REALobject self, RBInteger color);
REALstring sheetTable(REALobject self, RBInteger index, RBInteger* rowFirst, RBInteger* rowLast, RBInteger* colFirst,
                      RBInteger* colLast, RBInteger* headerRowCount, RBInteger* totalsRowCount);
RBBoolean sheetGetPrintRepeatRows(REALobject self, RBInteger* rowFirst, RBInteger* rowLast);
RBBoolean sheetGetPrintRepeatCols(REALobject self, RBInteger* colFirst, RBInteger* colLast);
RBBoolean sheetGetPrintArea(REALobject self, RBInteger* rowFirst, RBInteger* colFirst, RBInteger* rowLast, RBInteger* colLast);
void sheetSetAutoFitArea(REALobject self, RBInteger rowFirst, RBInteger colFirst, RBInteger rowLast, RBInteger colLast);
void sheetAddHyperlink(REALobject self, REALstring hyperlink, RBInteger rowFirst, RBInteger rowLast, RBInteger colFirst,
                       RBInteger colLast);
REALstring sheetHyperlink(REALobject self, RBInteger index, RBInteger* rowFirst, RBInteger* rowLast, RBInteger* colFirst,
                          RBInteger* colLast);
RBBoolean sheetDelHyperlink(REALobject self, RBInteger index);
RBBoolean sheetMerge(REALobject self, RBInteger index, RBInteger* rowFirst, RBInteger* rowLast, RBInteger* colFirst,
                     RBInteger* colLast);
RBBoolean sheetSplitInfo(REALobject self, RBInteger* row, RBInteger* col);
RBBoolean sheetDelMergeByIndex(REALobject self, RBInteger index);
void sheetAddrToRowCol(REALobject self, REALstring addr, RBInteger* row, RBInteger* col, RBBoolean* rowRelative,
                       RBBoolean* colRelative);
REALstring sheetRowColToAddr(REALobject self, RBInteger row, RBInteger col, RBBoolean rowRelative, RBBoolean colRelative);
void sheetGetTopLeftView(REALobject self, RBInteger* row, RBInteger* col);
void sheetSetTopLeftView(REALobject self, RBInteger row, RBInteger col);
RBInteger sheetGetPicture(REALobject self, RBInteger index, RBInteger* rowTop, RBInteger* colLeft, RBInteger* rowBottom,
                          RBInteger* colRight, RBInteger* width, RBInteger* height, RBInteger* offsetX, RBInteger* offsetY);
RBBoolean sheetGetMerge(REALobject self, RBInteger row, RBInteger col, RBInteger* rowFirst, RBInteger* rowLast,
                        RBInteger* colFirst, RBInteger* colLast);
RBBoolean sheetSetMerge(REALobject self, RBInteger rowFirst, RBInteger rowLast, RBInteger colFirst, RBInteger colLast);
RBBoolean sheetDelMerge(REALobject self, RBInteger row, RBInteger col);
void sheetSetPicture(REALobject self, RBInteger row, RBInteger col, RBInteger id, double scale, RBInteger offsetX,
                     RBInteger offsetY, RBInteger pos);
void sheetSetPicture2(REALobject self, RBInteger row, RBInteger col, RBInteger id, RBInteger width, RBInteger height,
                      RBInteger offsetX, RBInteger offsetY, RBInteger pos);
RBBoolean sheetSetRow(REALobject self, RBInteger row, double height, REALobject format, RBBoolean hidden);
RBBoolean sheetSetCol(REALobject self, RBInteger colFirst, RBInteger colLast, double width, REALobject format, RBBoolean hidden);
RBBoolean sheetGroupCols(REALobject self, RBInteger colFirst, RBInteger colLast, RBBoolean collapsed);
RBBoolean sheetGroupRows(REALobject self, RBInteger rowFirst, RBInteger rowLast, RBBoolean collapsed);
RBBoolean sheetGetNamedRangeScoped(REALobject self, REALstring name, RBInteger* rowFirst, RBInteger* rowLast,
                                   RBInteger* colFirst, RBInteger* colLast, RBInteger scopeId, RBInteger* hidden);
RBBoolean sheetGetNamedRange(REALobject self, REALstring name, RBInteger* rowFirst, RBInteger* rowLast, RBInteger* colFirst,
                             RBInteger* colLast);
RBBoolean sheetSetNamedRange(REALobject self, REALstring name, RBInteger rowFirst, RBInteger rowLast, RBInteger colFirst,
                             RBInteger colLast, RBInteger scopeId);
RBBoolean sheetDelNamedRange(REALobject self, REALstring name, RBInteger scopeId);
REALstring sheetNamedRange(REALobject self, RBInteger index, RBInteger* rowFirst, RBInteger* rowLast, RBInteger* colFirst,
                           RBInteger* colLast);
REALstring sheetNamedRangeScoped(REALobject self, RBInteger index, RBInteger* rowFirst, RBInteger* rowLast,
                                 RBInteger* colFirst, RBInteger* colLast, RBInteger* scopeId, RBBoolean* hidden);
void sheetSetPrintRepeatRows(REALobject self, RBInteger rowFirst, RBInteger rowLast);
void sheetSetPrintRepeatCols(REALobject self, RBInteger colFirst, RBInteger colLast);
void sheetSetPrintArea(REALobject self, RBInteger rowFirst, RBInteger rowLast, RBInteger colFirst, RBInteger colLast);
void sheetSetPrintFit(REALobject self, RBInteger wPages, RBInteger hPages);
RBBoolean sheetGetPrintFit(REALobject self, RBInteger* wPages, RBInteger* hPages);
RBBoolean sheetRemoveRow(REALobject self, RBInteger first, RBInteger last);
RBBoolean sheetRemoveCol(REALobject self, RBInteger first, RBInteger last);
RBBoolean sheetInsertRow(REALobject self, RBInteger first, RBInteger last);
RBBoolean sheetInsertCol(REALobject self, RBInteger first, RBInteger last);
RBBoolean sheetRowHidden(REALobject self, RBInteger row);
void sheetSetRowHidden(REALobject self, RBInteger row, RBBoolean hidden);
RBBoolean sheetColHidden(REALobject self, RBInteger col);
void sheetSetColHidden(REALobject self, RBInteger col, RBBoolean hidden);
double sheetRowHeight(REALobject self, RBInteger row);
double sheetColWidth(REALobject self, RBInteger col);
RBBoolean sheetSetFooter(REALobject self, REALstring footer, double margin);
RBBoolean sheetSetHeader(REALobject self, REALstring header, double margin);
void sheetSplit(REALobject self, RBInteger row, RBInteger col);
RBBoolean sheetSetVerPageBreak(REALobject self, RBInteger col, RBBoolean pageBreak);
RBBoolean sheetSetHorPageBreak(REALobject self, RBInteger row, RBBoolean pageBreak);
RBInteger sheetGetVerPageBreak(REALobject self, RBInteger index);
RBInteger sheetGetHorPageBreak(REALobject self, RBInteger index);
void sheetClearPrintRepeats(REALobject self);
void sheetClearPrintArea(REALobject self);
void sheetClear(REALobject self, RBInteger rowFirst, RBInteger rowLast, RBInteger colFirst, RBInteger colLast);
void sheetConstructor(REALobject self);

}  // namespace quire_plugin
