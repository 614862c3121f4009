#pragma once
#include <string>
#include <type_traits>
#include <vector>

#include "api/ISheetT.h"
#include "api/book_message.h"
#include "xlsx/flavour.h"
#include "xlsx/xfile.h"

namespace quire {

template <class TCHAR, class Tag>
class XMLBookImplT;

// A worksheet: at once the part holding the bound worksheet document and the sheet that
// callers hold. Cell operations work on the document directly.
template <class TCHAR, class Tag>
class XMLSheetImplT : public XmlFile<typename XmlFlavour<Tag>::Worksheet>, public ISheetT<TCHAR> {
public:
    using Worksheet = typename XmlFlavour<Tag>::Worksheet;
    using Book = XMLBookImplT<TCHAR, Tag>;
    using SheetData = std::remove_reference_t<decltype(std::declval<Worksheet&>().get_sheetData())>;
    using Row = std::remove_reference_t<decltype(std::declval<SheetData&>().get_row(0))>;
    using Cell = std::remove_reference_t<decltype(std::declval<Row&>().get_c(0))>;

    XMLSheetImplT();
    // A new sheet with an empty sheetData.
    void makeEmpty();
    // Reads the part keeping only rows first..last (0-based, -1: no bound).
    void readRows(const std::string& partName, const char* data, std::size_t size, int firstRow, int lastRow);
    // Reads the cells without the general XML reader where the part allows; false otherwise.
    bool readCellsDirectly(const std::string& partName, const char* data, std::size_t size);
    void readRowsFromFile(const std::string& partName, const std::string& path, int firstRow, int lastRow);

    void bind(Book* book) { book_ = book; }
    Book* book() const { return book_; }
    bool isBound() const { return book_ != nullptr; }
    int firstRowLimit() const { return firstRowLimit_; }
    int lastRowLimit() const { return lastRowLimit_; }

    int cellType(int row, int col) override;
    bool isFormula(int row, int col) override;
    IFormatT<TCHAR>* cellFormat(int row, int col) override;
    void setCellFormat(int row, int col, IFormatT<TCHAR>* format) override;
    const TCHAR* readStr(int row, int col, IFormatT<TCHAR>** format) override;
    bool writeStr(int row, int col, const TCHAR* value, IFormatT<TCHAR>* format, int stringKind) override;
    double readNum(int row, int col, IFormatT<TCHAR>** format) override;
    bool writeNum(int row, int col, double value, IFormatT<TCHAR>* format) override;
    bool readBool(int row, int col, IFormatT<TCHAR>** format) override;
    bool writeBool(int row, int col, bool value, IFormatT<TCHAR>* format, int errorCode) override;
    bool readBlank(int row, int col, IFormatT<TCHAR>** format) override;
    bool writeBlank(int row, int col, IFormatT<TCHAR>* format) override;
    const TCHAR* readFormula(int row, int col, IFormatT<TCHAR>** format) override;
    bool writeFormula(int row, int col, const TCHAR* expr, IFormatT<TCHAR>* format) override;
    bool writeFormulaNum(int row, int col, const TCHAR* expr, double value, IFormatT<TCHAR>* format) override;
    bool writeFormulaStr(int row, int col, const TCHAR* expr, const TCHAR* value, IFormatT<TCHAR>* format) override;
    bool writeFormulaBool(int row, int col, const TCHAR* expr, bool value, IFormatT<TCHAR>* format) override;
    const TCHAR* readComment(int row, int col) override;
    void writeComment(int row, int col, const TCHAR* value, const TCHAR* author, int width, int height) override;
    void removeComment(int row, int col) override;
    bool isDate(int row, int col) override;
    int readError(int row, int col) override;
    void writeError(int row, int col, int error, IFormatT<TCHAR>* format) override;
    double colWidth(int col) override;
    double rowHeight(int row) override;
    int colWidthPx(int col) override;
    int rowHeightPx(int row) override;
    bool setCol(int colFirst, int colLast, double width, IFormatT<TCHAR>* format, bool hidden) override;
    bool setRow(int row, double height, IFormatT<TCHAR>* format, bool hidden) override;
    bool rowHidden(int row) override;
    bool setRowHidden(int row, bool hidden) override;
    bool colHidden(int col) override;
    bool setColHidden(int col, bool hidden) override;
    bool getMerge(int row, int col, int* rowFirst, int* rowLast, int* colFirst, int* colLast) override;
    bool setMerge(int rowFirst, int rowLast, int colFirst, int colLast) override;
    bool delMerge(int row, int col) override;
    int mergeSize() override;
    bool merge(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast) override;
    bool delMergeByIndex(int index) override;
    int pictureSize() override;
    int getPicture(int index, int* rowTop, int* colLeft, int* rowBottom, int* colRight, int* width, int* height, int* offset_x, int* offset_y, int reserved) override;
    void setPicture(int row, int col, int pictureId, double scale, int offset_x, int offset_y, int position) override;
    void setPicture2(int row, int col, int pictureId, int width, int height, int offset_x, int offset_y, int position) override;
    int getHorPageBreak(int index) override;
    int getHorPageBreakSize() override;
    int getVerPageBreak(int index) override;
    int getVerPageBreakSize() override;
    bool setHorPageBreak(int row, bool pageBreak) override;
    bool setVerPageBreak(int col, bool pageBreak) override;
    void split(int row, int col) override;
    bool splitInfo(int* row, int* col) override;
    bool groupRows(int rowFirst, int rowLast, bool collapsed) override;
    bool groupCols(int colFirst, int colLast, bool collapsed) override;
    bool groupSummaryBelow() override;
    void setGroupSummaryBelow(bool below) override;
    bool groupSummaryRight() override;
    void setGroupSummaryRight(bool right) override;
    void clear(int rowFirst, int rowLast, int colFirst, int colLast) override;
    bool insertCol(int colFirst, int colLast, bool updateReferences) override;
    bool insertRow(int rowFirst, int rowLast, bool updateReferences) override;
    bool removeCol(int colFirst, int colLast, bool updateReferences) override;
    bool removeRow(int rowFirst, int rowLast, bool updateReferences) override;
    bool copyCell(int rowSrc, int colSrc, int rowDst, int colDst) override;
    int firstRow() override;
    int lastRow() override;
    int firstCol() override;
    int lastCol() override;
    bool displayGridlines() override;
    void setDisplayGridlines(bool show) override;
    bool printGridlines() override;
    void setPrintGridlines(bool print) override;
    int zoom() override;
    void setZoom(int zoom) override;
    int printZoom() override;
    void setPrintZoom(int zoom) override;
    bool getPrintFit(int* wPages, int* hPages) override;
    void setPrintFit(int wPages, int hPages) override;
    bool landscape() override;
    void setLandscape(bool landscape) override;
    int paper() override;
    void setPaper(int paper) override;
    const TCHAR* header() override;
    bool setHeader(const TCHAR* header, double margin) override;
    double headerMargin() override;
    const TCHAR* footer() override;
    bool setFooter(const TCHAR* footer, double margin) override;
    double footerMargin() override;
    bool hCenter() override;
    void setHCenter(bool hCenter) override;
    bool vCenter() override;
    void setVCenter(bool vCenter) override;
    double marginLeft() override;
    void setMarginLeft(double margin) override;
    double marginRight() override;
    void setMarginRight(double margin) override;
    double marginTop() override;
    void setMarginTop(double margin) override;
    double marginBottom() override;
    void setMarginBottom(double margin) override;
    bool printRowCol() override;
    void setPrintRowCol(bool print) override;
    bool printRepeatRows(int* rowFirst, int* rowLast) override;
    void setPrintRepeatRows(int rowFirst, int rowLast) override;
    bool printRepeatCols(int* colFirst, int* colLast) override;
    void setPrintRepeatCols(int colFirst, int colLast) override;
    bool printArea(int* rowFirst, int* rowLast, int* colFirst, int* colLast) override;
    void setPrintArea(int rowFirst, int rowLast, int colFirst, int colLast) override;
    void clearPrintRepeats() override;
    void clearPrintArea() override;
    bool getNamedRange(const TCHAR* name, int* rowFirst, int* rowLast, int* colFirst, int* colLast, int scopeId, bool* hidden) override;
    bool setNamedRange(const TCHAR* name, int rowFirst, int rowLast, int colFirst, int colLast, int scopeId) override;
    bool delNamedRange(const TCHAR* name, int scopeId) override;
    int namedRangeSize() override;
    const TCHAR* namedRange(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast, int* scopeId, bool* hidden) override;
    int tableSize() override;
    const TCHAR* table(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast, int* headerRowCount, int* totalsRowCount) override;
    int hyperlinkSize() override;
    const TCHAR* hyperlink(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast) override;
    bool delHyperlink(int index) override;
    void addHyperlink(const TCHAR* hyperlink, int rowFirst, int rowLast, int colFirst, int colLast) override;
    IAutoFilterT<TCHAR>* autoFilter() override;
    void applyFilter() override;
    void removeFilter() override;
    const TCHAR* name() override;
    void setName(const TCHAR* name) override;
    bool protect() override;
    void setProtectEx(bool protect, const TCHAR* password, int enhancedProtection) override;
    int hidden() override;
    bool setHidden(int state) override;
    void getTopLeftView(int* row, int* col) override;
    void setTopLeftView(int row, int col) override;
    bool rightToLeft() override;
    void setRightToLeft(bool rightToLeft) override;
    void setAutoFitArea(int rowFirst, int colFirst, int rowLast, int colLast) override;
    void addrToRowCol(const TCHAR* addr, int* row, int* col, bool* rowRelative, bool* colRelative) override;
    const TCHAR* rowColToAddr(int row, int col, bool rowRelative, bool colRelative) override;
    void setTabRgbColor(int red, int green, int blue) override;
    void setTabColor(int color) override;
    bool addIgnoredError(int rowFirst, int colFirst, int rowLast, int colLast, int iError) override;
    void addDataValidation(int type, int op, int rowFirst, int rowLast, int colFirst, int colLast, const TCHAR* value1, const TCHAR* value2, bool allowBlank, bool hideDropDown, bool showInputMessage, bool showErrorMessage, const TCHAR* promptTitle, const TCHAR* prompt, const TCHAR* errorTitle, const TCHAR* error, int errorStyle) override;
    void addDataValidationDouble(int type, int op, int rowFirst, int rowLast, int colFirst, int colLast, double value1, double value2, bool allowBlank, bool hideDropDown, bool showInputMessage, bool showErrorMessage, const TCHAR* promptTitle, const TCHAR* prompt, const TCHAR* errorTitle, const TCHAR* error, int errorStyle) override;
    void removeDataValidations() override;
protected:
    lmx::elmx_error unmarshalRoot(lmx::c_xml_reader& reader) override;

private:
    // ---- The cell store over sheetData ----
    Row* findRow(int row) const;
    Row& rowAt(int row);
    Cell* findCell(int row, int col) const;
    Cell& cellAt(int row, int col, IFormatT<TCHAR>* format, bool reset);
    Cell& existingCell(int row, int col) const;
    void returnFormat(const Cell& cell, IFormatT<TCHAR>** format);
    // Gives every row and cell read without a reference its position as one.
    void readColumnStyles();
    void expandSharedFormula(Cell& master, int row, int col);
    const Cell* sharedMaster(const Cell& cell, int& masterRow, int& masterCol) const;
    bool writeFormulaValue(int row, int col, const TCHAR* expr, IFormatT<TCHAR>* format, int kind,
                           double number, const TCHAR* text, bool flag);
    void refreshUsedRange();
    // Of the book's default font (the first of the styles); 7 without one or without the font.
    int maxDigitWidth() const;
    int columnPadding() const;
    template <class Cols>
    void setColRange(Cols& cols, int first, int last, double width, int style, bool hidden);
    void moveRows(int rowFirst, int count);
    void moveCols(int colFirst, int count);

    BookMessage& message();
    int indexInBook();
    template <class Result>
    Result unsupported(Result failure);
    void unsupported();

    Book* book_ = nullptr;
    std::vector<int> colStyles_;  // default style of each column from cols; -1 none
    bool usedStale_ = true;
    mutable std::size_t lastFoundRow_ = 0;  // a hint only: checked before use
    int usedFirstRow_ = 0, usedLastRow_ = 0, usedFirstCol_ = 0, usedLastCol_ = 0;
    int firstRowLimit_ = -1;
    int lastRowLimit_ = -1;
    std::basic_string<TCHAR> stringResult_;
    BookMessage unboundMessage_;
};

}  // namespace quire
