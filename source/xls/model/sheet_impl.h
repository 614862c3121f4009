#pragma once
#include <map>
#include <string>
#include <utility>
#include <vector>

#include "api/ISheetT.h"
#include "api/enums.h"
#include "cell_store.h"
#include "defined_names.h"
#include "sheet_settings.h"

namespace quire {

class BookImplT;
class BookMessage;

// A cell note kept with its box size.
struct CellComment {
    std::wstring text;
    std::wstring author;
    int width = 0;
    int height = 0;
};

// A worksheet of a binary book.
class SheetImplT : public ISheetT<wchar_t> {
public:
    static constexpr int kMaxRow = 65535;
    static constexpr int kMaxCol = 255;

    explicit SheetImplT(BookImplT* book);
    void copyFrom(ISheetT<wchar_t>& source);

    // Cells
    int cellType(int row, int col) override;
    bool isFormula(int row, int col) override;
    IFormatT<wchar_t>* cellFormat(int row, int col) override;
    void setCellFormat(int row, int col, IFormatT<wchar_t>* format) override;
    const wchar_t* readStr(int row, int col, IFormatT<wchar_t>** format) override;
    bool writeStr(int row, int col, const wchar_t* value, IFormatT<wchar_t>* format,
                  int stringKind) override;
    double readNum(int row, int col, IFormatT<wchar_t>** format) override;
    bool writeNum(int row, int col, double value, IFormatT<wchar_t>* format) override;
    bool readBool(int row, int col, IFormatT<wchar_t>** format) override;
    bool writeBool(int row, int col, bool value, IFormatT<wchar_t>* format, int errorCode) override;
    bool readBlank(int row, int col, IFormatT<wchar_t>** format) override;
    bool writeBlank(int row, int col, IFormatT<wchar_t>* format) override;
    const wchar_t* readFormula(int row, int col, IFormatT<wchar_t>** format) override;
    bool writeFormula(int row, int col, const wchar_t* expr, IFormatT<wchar_t>* format) override;
    bool writeFormulaNum(int row, int col, const wchar_t* expr, double value,
                         IFormatT<wchar_t>* format) override;
    bool writeFormulaStr(int row, int col, const wchar_t* expr, const wchar_t* value,
                         IFormatT<wchar_t>* format) override;
    bool writeFormulaBool(int row, int col, const wchar_t* expr, bool value,
                          IFormatT<wchar_t>* format) override;
    const wchar_t* readComment(int row, int col) override;
    void writeComment(int row, int col, const wchar_t* value, const wchar_t* author, int width,
                      int height) override;
    void removeComment(int row, int col) override;
    bool isDate(int row, int col) override;
    int readError(int row, int col) override;
    void writeError(int row, int col, int error, IFormatT<wchar_t>* format) override;

    // Rows and columns
    double colWidth(int col) override;
    double rowHeight(int row) override;
    int colWidthPx(int col) override;
    int rowHeightPx(int row) override;
    bool setCol(int colFirst, int colLast, double width, IFormatT<wchar_t>* format,
                bool hidden) override;
    bool setRow(int row, double height, IFormatT<wchar_t>* format, bool hidden) override;
    bool rowHidden(int row) override;
    bool setRowHidden(int row, bool hidden) override;
    bool colHidden(int col) override;
    bool setColHidden(int col, bool hidden) override;

    // Merged ranges
    bool getMerge(int row, int col, int* rowFirst, int* rowLast, int* colFirst,
                  int* colLast) override;
    bool setMerge(int rowFirst, int rowLast, int colFirst, int colLast) override;
    bool delMerge(int row, int col) override;
    int mergeSize() override;
    bool merge(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast) override;
    bool delMergeByIndex(int index) override;

    // Pictures
    int pictureSize() override;
    int getPicture(int index, int* rowTop, int* colLeft, int* rowBottom, int* colRight, int* width,
                   int* height, int* offset_x, int* offset_y, int reserved) override;
    void setPicture(int row, int col, int pictureId, double scale, int offset_x, int offset_y,
                    int position) override;
    void setPicture2(int row, int col, int pictureId, int width, int height, int offset_x,
                     int offset_y, int position) override;

    // Page breaks, panes, outline
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

    // Editing the grid
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

    // View and print settings
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
    const wchar_t* header() override;
    bool setHeader(const wchar_t* header, double margin) override;
    double headerMargin() override;
    const wchar_t* footer() override;
    bool setFooter(const wchar_t* footer, double margin) override;
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

    // Defined names, tables, hyperlinks, autofilter
    bool getNamedRange(const wchar_t* name, int* rowFirst, int* rowLast, int* colFirst,
                       int* colLast, int scopeId, bool* hidden) override;
    bool setNamedRange(const wchar_t* name, int rowFirst, int rowLast, int colFirst, int colLast,
                       int scopeId) override;
    bool delNamedRange(const wchar_t* name, int scopeId) override;
    int namedRangeSize() override;
    const wchar_t* namedRange(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast,
                              int* scopeId, bool* hidden) override;
    int tableSize() override;
    const wchar_t* table(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast,
                         int* headerRowCount, int* totalsRowCount) override;
    int hyperlinkSize() override;
    const wchar_t* hyperlink(int index, int* rowFirst, int* rowLast, int* colFirst,
                             int* colLast) override;
    bool delHyperlink(int index) override;
    void addHyperlink(const wchar_t* hyperlink, int rowFirst, int rowLast, int colFirst,
                      int colLast) override;
    IAutoFilterT<wchar_t>* autoFilter() override;
    void applyFilter() override;
    void removeFilter() override;

    // Name, protection, visibility, view
    const wchar_t* name() override;
    void setName(const wchar_t* name) override;
    bool protect() override;
    void setProtectEx(bool protect, const wchar_t* password, int enhancedProtection) override;
    int hidden() override;
    bool setHidden(int state) override;
    void getTopLeftView(int* row, int* col) override;
    void setTopLeftView(int row, int col) override;
    bool rightToLeft() override;
    void setRightToLeft(bool rightToLeft) override;
    void setAutoFitArea(int rowFirst, int colFirst, int rowLast, int colLast) override;
    void addrToRowCol(const wchar_t* addr, int* row, int* col, bool* rowRelative,
                      bool* colRelative) override;
    const wchar_t* rowColToAddr(int row, int col, bool rowRelative, bool colRelative) override;
    void setTabRgbColor(int red, int green, int blue) override;
    void setTabColor(int color) override;
    bool addIgnoredError(int rowFirst, int colFirst, int rowLast, int colLast, int iError) override;
    void addDataValidation(int type, int op, int rowFirst, int rowLast, int colFirst, int colLast,
                           const wchar_t* value1, const wchar_t* value2, bool allowBlank,
                           bool hideDropDown, bool showInputMessage, bool showErrorMessage,
                           const wchar_t* promptTitle, const wchar_t* prompt,
                           const wchar_t* errorTitle, const wchar_t* error,
                           int errorStyle) override;
    void addDataValidationDouble(int type, int op, int rowFirst, int rowLast, int colFirst,
                                 int colLast, double value1, double value2, bool allowBlank,
                                 bool hideDropDown, bool showInputMessage, bool showErrorMessage,
                                 const wchar_t* promptTitle, const wchar_t* prompt,
                                 const wchar_t* errorTitle, const wchar_t* error,
                                 int errorStyle) override;
    void removeDataValidations() override;

    // Engine side: state as the file reader and writer see it.
    BookImplT* book() const { return book_; }
    bool refR1C1() const { return refR1C1_; }
    void setRefR1C1Mode(bool r1c1) { refR1C1_ = r1c1; }
    void setSelected(bool selected);
    CellStore& cells() { return cells_; }
    std::map<int, RowInfo>& rows() { return rows_; }
    std::vector<ColInfo>& cols() { return cols_; }
    std::vector<Ref8>& merges() { return merges_; }
    std::vector<PageBreak>& horizontalBreaks() { return horBreaks_; }
    std::vector<PageBreak>& verticalBreaks() { return verBreaks_; }
    ViewSettings& view() { return view_; }
    PageSettings& page() { return page_; }
    WsBool& wsBool() { return wsBool_; }
    ProtectionSettings& protection() { return protection_; }
    std::vector<Hyperlink>& hyperlinks() { return hyperlinks_; }
    std::vector<IgnoredErrorRange>& ignoredErrors() { return ignoredErrors_; }
    std::map<std::pair<int, int>, CellComment>& comments() { return comments_; }
    std::vector<OutlineGroup>& rowGroups() { return rowGroups_; }
    std::vector<OutlineGroup>& colGroups() { return colGroups_; }
    int tabColor() const { return tabColor_; }
    void setTabColorIndex(int color) { tabColor_ = color; }
    uint16_t defColWidth = 8;          // DefColWidth, characters
    uint16_t defaultRowHeight = 255;   // DefaultRowHeight miyRw, twentieths of a point
    // Records read but not modelled, written back at their place: before the cells, between
    // the cells and the view settings (drawings and notes), and after the view settings.
    std::vector<KeptRecord> keptBeforeCells;
    std::vector<KeptRecord> keptAfterCells;
    std::vector<KeptRecord> keptAfterView;
    // Calculation settings: CalcMode, CalcCount, CalcIter, CalcSaveRecalc, CalcDelta.
    uint16_t calcMode = 1;
    uint16_t calcCount = 100;
    uint16_t calcIter = 0;
    uint16_t calcSaveRecalc = 1;
    double calcDelta = 0.001;
    uint16_t gridSet = 1;
    uint16_t defaultRowHeightFlags = 0;
    std::vector<KeptRecord> printerSettings;  // Pls with its CONTINUE records, kept before Setup
    std::vector<std::vector<uint8_t>> selections;  // Selection payloads, one per pane
    // A chart or macro sheet: its whole substream, BOF to EOF, written back as it came.
    std::vector<KeptRecord> rawSubstream;
    uint16_t standardWidth = 0;        // StandardWidth, 1/256 of a character; 0 when absent
    std::vector<uint8_t> sheetExt;     // SheetExt as loaded (tab colour and more)
    void invalidateUsedRange() { usedRangeValid_ = false; }

private:
    struct Area3d {
        uint16_t xti = 0;
        int rowFirst = 0, rowLast = 0, colFirst = 0, colLast = 0;
    };
    int ownIndex() const;
    DefinedName* builtInName(wchar_t code);
    DefinedName& addBuiltInName(wchar_t code);
    uint16_t ownExternSheet();
    bool isNamedRangeOfThisSheet(const DefinedName& name, Area3d& area) const;
    void setPrintTitle(bool rows, int first, int last);
    bool printTitle(bool rows, int* first, int* last);
    void shiftNamedRanges(bool rows, int from, int count);
    BookMessage& message();
    void checkCell(int row, int col) const;
    uint16_t xfForWrite(int row, int col, IFormatT<wchar_t>* format);
    IFormatT<wchar_t>* formatOfXf(int xf);
    void setFormatOut(IFormatT<wchar_t>** out, int row, int col);
    const wchar_t* returnString(const std::wstring& text);
    void storeNumber(int row, int col, uint16_t xf, double value);
    FormulaCell* formulaAt(int row, int col);
    std::wstring formulaText(const FormulaCell& cell, int row, int col);
    void releaseSharedFormula(int row, int col);
    void storeFormula(int row, int col, const wchar_t* expr, IFormatT<wchar_t>* format,
                      FormulaResult result, double num, bool flag, const wchar_t* text);
    void computeUsedRange();
    ColInfo* columnInfo(int col);
    void splitColumnRanges(int colFirst, int colLast);
    RowInfo& rowInfo(int row);
    void shiftRows(int from, int count);
    void shiftCols(int from, int count);
    bool setPageBreak(std::vector<PageBreak>& breaks, int index, bool pageBreak, uint16_t end);

    BookImplT* book_;
    CellStore cells_;
    std::map<int, RowInfo> rows_;
    std::vector<ColInfo> cols_;
    std::vector<Ref8> merges_;
    std::vector<PageBreak> horBreaks_;
    std::vector<PageBreak> verBreaks_;
    ViewSettings view_;
    PageSettings page_;
    WsBool wsBool_;
    ProtectionSettings protection_;
    std::vector<Hyperlink> hyperlinks_;
    std::vector<IgnoredErrorRange> ignoredErrors_;
    std::map<std::pair<int, int>, CellComment> comments_;
    std::vector<OutlineGroup> rowGroups_;
    std::vector<OutlineGroup> colGroups_;
    int tabColor_ = -1;
    bool refR1C1_ = false;
    bool usedRangeValid_ = false;
    int firstRow_ = 0, lastRow_ = 0, firstCol_ = 0, lastCol_ = 0;
    std::wstring stringResult_;
};

}  // namespace quire
