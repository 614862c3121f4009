#pragma once
#include "IAutoFilterT.h"
#include "IFormatT.h"

namespace quire {

// One worksheet. Messages go to the owning book; string results live until the sheet's next one.
template <class TCHAR>
class ISheetT {
public:
    // Cells
    virtual int cellType(int row, int col) = 0;
    virtual bool isFormula(int row, int col) = 0;
    virtual IFormatT<TCHAR>* cellFormat(int row, int col) = 0;
    virtual void setCellFormat(int row, int col, IFormatT<TCHAR>* format) = 0;
    virtual const TCHAR* readStr(int row, int col, IFormatT<TCHAR>** format) = 0;
    virtual bool writeStr(int row, int col, const TCHAR* value, IFormatT<TCHAR>* format,
                          int stringKind) = 0;
    virtual double readNum(int row, int col, IFormatT<TCHAR>** format) = 0;
    virtual bool writeNum(int row, int col, double value, IFormatT<TCHAR>* format) = 0;
    virtual bool readBool(int row, int col, IFormatT<TCHAR>** format) = 0;
    virtual bool writeBool(int row, int col, bool value, IFormatT<TCHAR>* format, int errorCode) = 0;
    virtual bool readBlank(int row, int col, IFormatT<TCHAR>** format) = 0;
    virtual bool writeBlank(int row, int col, IFormatT<TCHAR>* format) = 0;
    virtual const TCHAR* readFormula(int row, int col, IFormatT<TCHAR>** format) = 0;
    virtual bool writeFormula(int row, int col, const TCHAR* expr, IFormatT<TCHAR>* format) = 0;
    virtual bool writeFormulaNum(int row, int col, const TCHAR* expr, double value,
                                 IFormatT<TCHAR>* format) = 0;
    virtual bool writeFormulaStr(int row, int col, const TCHAR* expr, const TCHAR* value,
                                 IFormatT<TCHAR>* format) = 0;
    virtual bool writeFormulaBool(int row, int col, const TCHAR* expr, bool value,
                                  IFormatT<TCHAR>* format) = 0;
    virtual const TCHAR* readComment(int row, int col) = 0;
    virtual void writeComment(int row, int col, const TCHAR* value, const TCHAR* author, int width,
                              int height) = 0;
    virtual void removeComment(int row, int col) = 0;
    virtual bool isDate(int row, int col) = 0;
    virtual int readError(int row, int col) = 0;
    virtual void writeError(int row, int col, int error, IFormatT<TCHAR>* format) = 0;

    // Rows and columns
    virtual double colWidth(int col) = 0;
    virtual double rowHeight(int row) = 0;
    virtual int colWidthPx(int col) = 0;
    virtual int rowHeightPx(int row) = 0;
    virtual bool setCol(int colFirst, int colLast, double width, IFormatT<TCHAR>* format,
                        bool hidden) = 0;
    virtual bool setRow(int row, double height, IFormatT<TCHAR>* format, bool hidden) = 0;
    virtual bool rowHidden(int row) = 0;
    virtual bool setRowHidden(int row, bool hidden) = 0;
    virtual bool colHidden(int col) = 0;
    virtual bool setColHidden(int col, bool hidden) = 0;

    // Merged ranges
    virtual bool getMerge(int row, int col, int* rowFirst, int* rowLast, int* colFirst,
                          int* colLast) = 0;
    virtual bool setMerge(int rowFirst, int rowLast, int colFirst, int colLast) = 0;
    virtual bool delMerge(int row, int col) = 0;
    virtual int mergeSize() = 0;
    virtual bool merge(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast) = 0;
    virtual bool delMergeByIndex(int index) = 0;

    // Pictures
    virtual int pictureSize() = 0;
    virtual int getPicture(int index, int* rowTop, int* colLeft, int* rowBottom, int* colRight,
                           int* width, int* height, int* offset_x, int* offset_y, int reserved) = 0;
    virtual void setPicture(int row, int col, int pictureId, double scale, int offset_x,
                            int offset_y, int position) = 0;
    virtual void setPicture2(int row, int col, int pictureId, int width, int height, int offset_x,
                             int offset_y, int position) = 0;

    // Page breaks, panes, outline
    virtual int getHorPageBreak(int index) = 0;
    virtual int getHorPageBreakSize() = 0;
    virtual int getVerPageBreak(int index) = 0;
    virtual int getVerPageBreakSize() = 0;
    virtual bool setHorPageBreak(int row, bool pageBreak) = 0;
    virtual bool setVerPageBreak(int col, bool pageBreak) = 0;
    virtual void split(int row, int col) = 0;
    virtual bool splitInfo(int* row, int* col) = 0;
    virtual bool groupRows(int rowFirst, int rowLast, bool collapsed) = 0;
    virtual bool groupCols(int colFirst, int colLast, bool collapsed) = 0;
    virtual bool groupSummaryBelow() = 0;
    virtual void setGroupSummaryBelow(bool below) = 0;
    virtual bool groupSummaryRight() = 0;
    virtual void setGroupSummaryRight(bool right) = 0;

    // Editing the grid
    virtual void clear(int rowFirst, int rowLast, int colFirst, int colLast) = 0;
    virtual bool insertCol(int colFirst, int colLast, bool updateReferences) = 0;
    virtual bool insertRow(int rowFirst, int rowLast, bool updateReferences) = 0;
    virtual bool removeCol(int colFirst, int colLast, bool updateReferences) = 0;
    virtual bool removeRow(int rowFirst, int rowLast, bool updateReferences) = 0;
    virtual bool copyCell(int rowSrc, int colSrc, int rowDst, int colDst) = 0;
    virtual int firstRow() = 0;
    virtual int lastRow() = 0;
    virtual int firstCol() = 0;
    virtual int lastCol() = 0;

    // View and print settings
    virtual bool displayGridlines() = 0;
    virtual void setDisplayGridlines(bool show) = 0;
    virtual bool printGridlines() = 0;
    virtual void setPrintGridlines(bool print) = 0;
    virtual int zoom() = 0;
    virtual void setZoom(int zoom) = 0;
    virtual int printZoom() = 0;
    virtual void setPrintZoom(int zoom) = 0;
    virtual bool getPrintFit(int* wPages, int* hPages) = 0;
    virtual void setPrintFit(int wPages, int hPages) = 0;
    virtual bool landscape() = 0;
    virtual void setLandscape(bool landscape) = 0;
    virtual int paper() = 0;
    virtual void setPaper(int paper) = 0;
    virtual const TCHAR* header() = 0;
    virtual bool setHeader(const TCHAR* header, double margin) = 0;
    virtual double headerMargin() = 0;
    virtual const TCHAR* footer() = 0;
    virtual bool setFooter(const TCHAR* footer, double margin) = 0;
    virtual double footerMargin() = 0;
    virtual bool hCenter() = 0;
    virtual void setHCenter(bool hCenter) = 0;
    virtual bool vCenter() = 0;
    virtual void setVCenter(bool vCenter) = 0;
    virtual double marginLeft() = 0;
    virtual void setMarginLeft(double margin) = 0;
    virtual double marginRight() = 0;
    virtual void setMarginRight(double margin) = 0;
    virtual double marginTop() = 0;
    virtual void setMarginTop(double margin) = 0;
    virtual double marginBottom() = 0;
    virtual void setMarginBottom(double margin) = 0;
    virtual bool printRowCol() = 0;
    virtual void setPrintRowCol(bool print) = 0;
    virtual bool printRepeatRows(int* rowFirst, int* rowLast) = 0;
    virtual void setPrintRepeatRows(int rowFirst, int rowLast) = 0;
    virtual bool printRepeatCols(int* colFirst, int* colLast) = 0;
    virtual void setPrintRepeatCols(int colFirst, int colLast) = 0;
    virtual bool printArea(int* rowFirst, int* rowLast, int* colFirst, int* colLast) = 0;
    virtual void setPrintArea(int rowFirst, int rowLast, int colFirst, int colLast) = 0;
    virtual void clearPrintRepeats() = 0;
    virtual void clearPrintArea() = 0;

    // Defined names, tables, hyperlinks, autofilter
    virtual bool getNamedRange(const TCHAR* name, int* rowFirst, int* rowLast, int* colFirst,
                               int* colLast, int scopeId, bool* hidden) = 0;
    virtual bool setNamedRange(const TCHAR* name, int rowFirst, int rowLast, int colFirst,
                               int colLast, int scopeId) = 0;
    virtual bool delNamedRange(const TCHAR* name, int scopeId) = 0;
    virtual int namedRangeSize() = 0;
    virtual const TCHAR* namedRange(int index, int* rowFirst, int* rowLast, int* colFirst,
                                    int* colLast, int* scopeId, bool* hidden) = 0;
    virtual int tableSize() = 0;
    virtual const TCHAR* table(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast,
                               int* headerRowCount, int* totalsRowCount) = 0;
    virtual int hyperlinkSize() = 0;
    virtual const TCHAR* hyperlink(int index, int* rowFirst, int* rowLast, int* colFirst,
                                   int* colLast) = 0;
    virtual bool delHyperlink(int index) = 0;
    virtual void addHyperlink(const TCHAR* hyperlink, int rowFirst, int rowLast, int colFirst,
                              int colLast) = 0;
    virtual IAutoFilterT<TCHAR>* autoFilter() = 0;
    virtual void applyFilter() = 0;
    virtual void removeFilter() = 0;

    // Name, protection, visibility, view
    virtual const TCHAR* name() = 0;
    virtual void setName(const TCHAR* name) = 0;
    virtual bool protect() = 0;
    virtual void setProtectEx(bool protect, const TCHAR* password, int enhancedProtection) = 0;
    virtual int hidden() = 0;
    virtual bool setHidden(int state) = 0;
    virtual void getTopLeftView(int* row, int* col) = 0;
    virtual void setTopLeftView(int row, int col) = 0;
    virtual bool rightToLeft() = 0;
    virtual void setRightToLeft(bool rightToLeft) = 0;
    virtual void setAutoFitArea(int rowFirst, int colFirst, int rowLast, int colLast) = 0;
    virtual void addrToRowCol(const TCHAR* addr, int* row, int* col, bool* rowRelative,
                              bool* colRelative) = 0;
    virtual const TCHAR* rowColToAddr(int row, int col, bool rowRelative, bool colRelative) = 0;
    virtual void setTabRgbColor(int red, int green, int blue) = 0;
    virtual void setTabColor(int color) = 0;
    virtual bool addIgnoredError(int rowFirst, int colFirst, int rowLast, int colLast,
                                 int iError) = 0;
    virtual void addDataValidation(int type, int op, int rowFirst, int rowLast, int colFirst,
                                   int colLast, const TCHAR* value1, const TCHAR* value2,
                                   bool allowBlank, bool hideDropDown, bool showInputMessage,
                                   bool showErrorMessage, const TCHAR* promptTitle,
                                   const TCHAR* prompt, const TCHAR* errorTitle,
                                   const TCHAR* error, int errorStyle) = 0;
    virtual void addDataValidationDouble(int type, int op, int rowFirst, int rowLast, int colFirst,
                                         int colLast, double value1, double value2,
                                         bool allowBlank, bool hideDropDown,
                                         bool showInputMessage, bool showErrorMessage,
                                         const TCHAR* promptTitle, const TCHAR* prompt,
                                         const TCHAR* errorTitle, const TCHAR* error,
                                         int errorStyle) = 0;
    virtual void removeDataValidations() = 0;
    virtual ~ISheetT() = default;
};

using ISheet = ISheetT<wchar_t>;

}  // namespace quire
