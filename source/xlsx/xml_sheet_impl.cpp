#include "xlsx/xml_sheet_impl.h"

#include "api/enums.h"
#include "api/sheet_names.h"
#include "xlsx/xml_book_impl.h"

namespace quire {

template <class TCHAR, class Tag>
XMLSheetImplT<TCHAR, Tag>::XMLSheetImplT() : XmlFile<Worksheet>("worksheet") {}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::makeEmpty() {
    this->document().reset();
    this->document().get_sheetData();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::readRows(const std::string& partName, const char* data, std::size_t size,
                                         int firstRow, int lastRow) {
    firstRowLimit_ = firstRow;
    lastRowLimit_ = lastRow;
    this->read(partName, data, size);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::readRowsFromFile(const std::string& partName, const std::string& path, int firstRow,
                                                 int lastRow) {
    firstRowLimit_ = firstRow;
    lastRowLimit_ = lastRow;
    this->readFile(partName, path);
}

template <class TCHAR, class Tag>
lmx::elmx_error XMLSheetImplT<TCHAR, Tag>::unmarshalRoot(lmx::c_xml_reader& reader) {
    static const std::string name = "worksheet";
    return this->document().unmarshal(reader, name, firstRowLimit_, lastRowLimit_);
}

template <class TCHAR, class Tag>
BookMessage& XMLSheetImplT<TCHAR, Tag>::message() {
    return book_ ? book_->message() : unboundMessage_;
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::indexInBook() {
    const int index = book_ ? book_->sheetIndexOf(this) : -1;
    if (index < 0) throw qrerror("sheet not found");
    return index;
}

template <class TCHAR, class Tag>
template <class Result>
Result XMLSheetImplT<TCHAR, Tag>::unsupported(Result failure) {
    // Cell, layout and settings operations of Open XML sheets are not built yet.
    return message().guard(failure, [&]() -> Result { throw qrerror("not supported yet"); });
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::unsupported() {
    message().guardVoid([] { throw qrerror("not supported yet"); });
}

// ---- Name and visibility: kept in the workbook's sheet element ----

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::name() {
    return message().guard(static_cast<const TCHAR*>(nullptr), [&]() -> const TCHAR* {
        stringResult_ = book_->sheetElement(indexInBook()).get_name();
        return stringResult_.c_str();
    });
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setName(const TCHAR* name) {
    message().guardVoid([&] {
        if (!name) throw qrerror("incorrect sheet name");
        const int index = indexInBook();
        bool cut = false;
        const std::wstring sheetName = fitSheetName(name, cut);
        if (!book_->sheetNameIsFree(sheetName, index)) throw qrerror("book already contains such sheet name");
        book_->sheetElement(index).set_name(sheetName);
        if (cut) message().set("warning: sheet's name is cut to 31 characters");
    });
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::hidden() {
    return message().guard(static_cast<int>(SheetStateVisible), [&]() -> int {
        const auto& sheet = book_->sheetElement(indexInBook());
        return sheet.isset_state() ? sheet.get_state() : SheetStateVisible;
    });
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setHidden(int state) {
    return message().guard(false, [&]() -> bool {
        if (state < SheetStateVisible || state > SheetStateVeryHidden) throw qrerror("hidden is out of range");
        if (!book_) throw qrerror("sheet not found");
        const int index = book_->sheetIndexOf(this);
        if (index < 0) throw qrerror("index is out of range");
        auto& sheet = book_->sheetElement(index);
        const bool visible = !sheet.isset_state() || sheet.get_state() == SheetStateVisible;
        if (state != SheetStateVisible && visible && book_->visibleSheetCount() < 2)
            throw qrerror("a workbook must contain at least one visible worksheet");
        sheet.set_state(state);
        return true;
    });
}

// ---- Everything else waits for the cell engine ----

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::cellType(int row, int col) {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::isFormula(int row, int col) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
IFormatT<TCHAR>* XMLSheetImplT<TCHAR, Tag>::cellFormat(int row, int col) {
    return unsupported<IFormatT<TCHAR>*>(nullptr);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setCellFormat(int row, int col, IFormatT<TCHAR>* format) {
    unsupported();
}

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::readStr(int row, int col, IFormatT<TCHAR>** format) {
    return unsupported<const TCHAR*>(nullptr);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::writeStr(int row, int col, const TCHAR* value, IFormatT<TCHAR>* format, int stringKind) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::readNum(int row, int col, IFormatT<TCHAR>** format) {
    return unsupported<double>(0.0);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::writeNum(int row, int col, double value, IFormatT<TCHAR>* format) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::readBool(int row, int col, IFormatT<TCHAR>** format) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::writeBool(int row, int col, bool value, IFormatT<TCHAR>* format, int errorCode) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::readBlank(int row, int col, IFormatT<TCHAR>** format) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::writeBlank(int row, int col, IFormatT<TCHAR>* format) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::readFormula(int row, int col, IFormatT<TCHAR>** format) {
    return unsupported<const TCHAR*>(nullptr);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::writeFormula(int row, int col, const TCHAR* expr, IFormatT<TCHAR>* format) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::writeFormulaNum(int row, int col, const TCHAR* expr, double value, IFormatT<TCHAR>* format) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::writeFormulaStr(int row, int col, const TCHAR* expr, const TCHAR* value, IFormatT<TCHAR>* format) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::writeFormulaBool(int row, int col, const TCHAR* expr, bool value, IFormatT<TCHAR>* format) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::readComment(int row, int col) {
    return unsupported<const TCHAR*>(nullptr);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::writeComment(int row, int col, const TCHAR* value, const TCHAR* author, int width, int height) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::removeComment(int row, int col) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::isDate(int row, int col) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::readError(int row, int col) {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::writeError(int row, int col, int error, IFormatT<TCHAR>* format) {
    unsupported();
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::colWidth(int col) {
    return unsupported<double>(0.0);
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::rowHeight(int row) {
    return unsupported<double>(0.0);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::colWidthPx(int col) {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::rowHeightPx(int row) {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setCol(int colFirst, int colLast, double width, IFormatT<TCHAR>* format, bool hidden) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setRow(int row, double height, IFormatT<TCHAR>* format, bool hidden) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::rowHidden(int row) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setRowHidden(int row, bool hidden) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::colHidden(int col) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setColHidden(int col, bool hidden) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::getMerge(int row, int col, int* rowFirst, int* rowLast, int* colFirst, int* colLast) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setMerge(int rowFirst, int rowLast, int colFirst, int colLast) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::delMerge(int row, int col) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::mergeSize() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::merge(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::delMergeByIndex(int index) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::pictureSize() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::getPicture(int index, int* rowTop, int* colLeft, int* rowBottom, int* colRight, int* width, int* height, int* offset_x, int* offset_y, int reserved) {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPicture(int row, int col, int pictureId, double scale, int offset_x, int offset_y, int position) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPicture2(int row, int col, int pictureId, int width, int height, int offset_x, int offset_y, int position) {
    unsupported();
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::getHorPageBreak(int index) {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::getHorPageBreakSize() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::getVerPageBreak(int index) {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::getVerPageBreakSize() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setHorPageBreak(int row, bool pageBreak) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setVerPageBreak(int col, bool pageBreak) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::split(int row, int col) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::splitInfo(int* row, int* col) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::groupRows(int rowFirst, int rowLast, bool collapsed) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::groupCols(int colFirst, int colLast, bool collapsed) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::groupSummaryBelow() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setGroupSummaryBelow(bool below) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::groupSummaryRight() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setGroupSummaryRight(bool right) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::clear(int rowFirst, int rowLast, int colFirst, int colLast) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::insertCol(int colFirst, int colLast, bool updateReferences) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::insertRow(int rowFirst, int rowLast, bool updateReferences) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::removeCol(int colFirst, int colLast, bool updateReferences) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::removeRow(int rowFirst, int rowLast, bool updateReferences) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::copyCell(int rowSrc, int colSrc, int rowDst, int colDst) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::firstRow() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::lastRow() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::firstCol() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::lastCol() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::displayGridlines() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setDisplayGridlines(bool show) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::printGridlines() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPrintGridlines(bool print) {
    unsupported();
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::zoom() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setZoom(int zoom) {
    unsupported();
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::printZoom() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPrintZoom(int zoom) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::getPrintFit(int* wPages, int* hPages) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPrintFit(int wPages, int hPages) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::landscape() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setLandscape(bool landscape) {
    unsupported();
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::paper() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPaper(int paper) {
    unsupported();
}

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::header() {
    return unsupported<const TCHAR*>(nullptr);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setHeader(const TCHAR* header, double margin) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::headerMargin() {
    return unsupported<double>(0.0);
}

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::footer() {
    return unsupported<const TCHAR*>(nullptr);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setFooter(const TCHAR* footer, double margin) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::footerMargin() {
    return unsupported<double>(0.0);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::hCenter() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setHCenter(bool hCenter) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::vCenter() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setVCenter(bool vCenter) {
    unsupported();
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::marginLeft() {
    return unsupported<double>(0.0);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setMarginLeft(double margin) {
    unsupported();
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::marginRight() {
    return unsupported<double>(0.0);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setMarginRight(double margin) {
    unsupported();
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::marginTop() {
    return unsupported<double>(0.0);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setMarginTop(double margin) {
    unsupported();
}

template <class TCHAR, class Tag>
double XMLSheetImplT<TCHAR, Tag>::marginBottom() {
    return unsupported<double>(0.0);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setMarginBottom(double margin) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::printRowCol() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPrintRowCol(bool print) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::printRepeatRows(int* rowFirst, int* rowLast) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPrintRepeatRows(int rowFirst, int rowLast) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::printRepeatCols(int* colFirst, int* colLast) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPrintRepeatCols(int colFirst, int colLast) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::printArea(int* rowFirst, int* rowLast, int* colFirst, int* colLast) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setPrintArea(int rowFirst, int rowLast, int colFirst, int colLast) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::clearPrintRepeats() {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::clearPrintArea() {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::getNamedRange(const TCHAR* name, int* rowFirst, int* rowLast, int* colFirst, int* colLast, int scopeId, bool* hidden) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::setNamedRange(const TCHAR* name, int rowFirst, int rowLast, int colFirst, int colLast, int scopeId) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::delNamedRange(const TCHAR* name, int scopeId) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::namedRangeSize() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::namedRange(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast, int* scopeId, bool* hidden) {
    return unsupported<const TCHAR*>(nullptr);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::tableSize() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::table(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast, int* headerRowCount, int* totalsRowCount) {
    return unsupported<const TCHAR*>(nullptr);
}

template <class TCHAR, class Tag>
int XMLSheetImplT<TCHAR, Tag>::hyperlinkSize() {
    return unsupported<int>(0);
}

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::hyperlink(int index, int* rowFirst, int* rowLast, int* colFirst, int* colLast) {
    return unsupported<const TCHAR*>(nullptr);
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::delHyperlink(int index) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::addHyperlink(const TCHAR* hyperlink, int rowFirst, int rowLast, int colFirst, int colLast) {
    unsupported();
}

template <class TCHAR, class Tag>
IAutoFilterT<TCHAR>* XMLSheetImplT<TCHAR, Tag>::autoFilter() {
    return unsupported<IAutoFilterT<TCHAR>*>(nullptr);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::applyFilter() {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::removeFilter() {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::protect() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setProtectEx(bool protect, const TCHAR* password, int enhancedProtection) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::getTopLeftView(int* row, int* col) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setTopLeftView(int row, int col) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::rightToLeft() {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setRightToLeft(bool rightToLeft) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setAutoFitArea(int rowFirst, int colFirst, int rowLast, int colLast) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::addrToRowCol(const TCHAR* addr, int* row, int* col, bool* rowRelative, bool* colRelative) {
    unsupported();
}

template <class TCHAR, class Tag>
const TCHAR* XMLSheetImplT<TCHAR, Tag>::rowColToAddr(int row, int col, bool rowRelative, bool colRelative) {
    return unsupported<const TCHAR*>(nullptr);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setTabRgbColor(int red, int green, int blue) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::setTabColor(int color) {
    unsupported();
}

template <class TCHAR, class Tag>
bool XMLSheetImplT<TCHAR, Tag>::addIgnoredError(int rowFirst, int colFirst, int rowLast, int colLast, int iError) {
    return unsupported<bool>(false);
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::addDataValidation(int type, int op, int rowFirst, int rowLast, int colFirst, int colLast, const TCHAR* value1, const TCHAR* value2, bool allowBlank, bool hideDropDown, bool showInputMessage, bool showErrorMessage, const TCHAR* promptTitle, const TCHAR* prompt, const TCHAR* errorTitle, const TCHAR* error, int errorStyle) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::addDataValidationDouble(int type, int op, int rowFirst, int rowLast, int colFirst, int colLast, double value1, double value2, bool allowBlank, bool hideDropDown, bool showInputMessage, bool showErrorMessage, const TCHAR* promptTitle, const TCHAR* prompt, const TCHAR* errorTitle, const TCHAR* error, int errorStyle) {
    unsupported();
}

template <class TCHAR, class Tag>
void XMLSheetImplT<TCHAR, Tag>::removeDataValidations() {
    unsupported();
}

template class XMLSheetImplT<wchar_t, excelNormal_tag>;
template class XMLSheetImplT<wchar_t, excelStrict_tag>;

}  // namespace quire
