// View, print and protection settings, names, links and the other sheet-wide options.
#include <algorithm>
#include <map>

#include "api/cell_address.h"
#include "api/password_hash.h"
#include "api/sheet_names.h"
#include "api/wide_text.h"
#include "book_impl.h"
#include "sheet_impl.h"

namespace quire {
namespace {

constexpr size_t kMaxHeaderFooterUnits = 255;
constexpr const char* kPicturesPending = "pictures of .xls sheets are not available yet";
constexpr const char* kNotForXls = "function is not supported for xls files";

template <class Word>
void setFlag(Word& word, Word flag, bool on) {
    word = on ? static_cast<Word>(word | flag) : static_cast<Word>(word & ~flag);
}

Ref8 makeRef(int rowFirst, int rowLast, int colFirst, int colLast) {
    Ref8 ref;
    ref.rwFirst = static_cast<uint16_t>(rowFirst);
    ref.rwLast = static_cast<uint16_t>(rowLast);
    ref.colFirst = static_cast<uint16_t>(colFirst);
    ref.colLast = static_cast<uint16_t>(colLast);
    return ref;
}

}  // namespace

void SheetImplT::setSelected(bool selected) {
    setFlag(view_.window2.grbit, Window2::kSelected, selected);
    setFlag(view_.window2.grbit, Window2::kPaged, selected);
}

// ---- View ----

bool SheetImplT::displayGridlines() {
    message().ok();
    return (view_.window2.grbit & Window2::kDspGrid) != 0;
}

void SheetImplT::setDisplayGridlines(bool show) {
    message().ok();
    setFlag(view_.window2.grbit, Window2::kDspGrid, show);
}

int SheetImplT::zoom() {
    message().ok();
    if (view_.sclDenominator == 0) return 100;
    return view_.sclNumerator * 100 / view_.sclDenominator;
}

void SheetImplT::setZoom(int zoom) {
    message().ok();
    int clamped = std::min(std::max(zoom, 10), 400);  // the range spreadsheet programs accept
    view_.sclNumerator = static_cast<uint16_t>(clamped);
    view_.sclDenominator = 100;
    view_.sclPresent = true;
}

void SheetImplT::getTopLeftView(int* row, int* col) {
    message().ok();
    if (row) *row = view_.window2.rwTop;
    if (col) *col = view_.window2.colLeft;
}

void SheetImplT::setTopLeftView(int row, int col) {
    message().guardVoid([&] {
        checkCell(row, col);
        view_.window2.rwTop = static_cast<uint16_t>(row);
        view_.window2.colLeft = static_cast<uint16_t>(col);
    });
}

bool SheetImplT::rightToLeft() {
    message().ok();
    return (view_.window2.grbit & Window2::kRightToLeft) != 0;
}

void SheetImplT::setRightToLeft(bool rightToLeft) {
    message().ok();
    setFlag(view_.window2.grbit, Window2::kRightToLeft, rightToLeft);
}

// ---- Printing ----

bool SheetImplT::printGridlines() {
    message().ok();
    return page_.printGrid;
}

void SheetImplT::setPrintGridlines(bool print) {
    message().ok();
    page_.printGrid = print;
}

int SheetImplT::printZoom() {
    message().ok();
    return page_.setup.iScale;
}

void SheetImplT::setPrintZoom(int zoom) {
    message().ok();
    page_.setup.iScale = static_cast<uint16_t>(std::min(std::max(zoom, 10), 400));
    setFlag(page_.setup.grbit, Setup::kNoPrinterSettings, false);
    setFlag(wsBool_.grbit, WsBool::kFitToPage, false);
}

bool SheetImplT::getPrintFit(int* wPages, int* hPages) {
    message().ok();
    if (wPages) *wPages = page_.setup.iFitWidth;
    if (hPages) *hPages = page_.setup.iFitHeight;
    return (wsBool_.grbit & WsBool::kFitToPage) != 0;
}

void SheetImplT::setPrintFit(int wPages, int hPages) {
    message().ok();
    page_.setup.iFitWidth = static_cast<uint16_t>(std::max(wPages, 0));
    page_.setup.iFitHeight = static_cast<uint16_t>(std::max(hPages, 0));
    setFlag(wsBool_.grbit, WsBool::kFitToPage, true);
}

bool SheetImplT::landscape() {
    message().ok();
    return (page_.setup.grbit & Setup::kPortrait) == 0;
}

void SheetImplT::setLandscape(bool landscape) {
    message().ok();
    setFlag(page_.setup.grbit, Setup::kPortrait, !landscape);
    setFlag(page_.setup.grbit, Setup::kNoPrinterSettings, false);
}

int SheetImplT::paper() {
    message().ok();
    return page_.setup.iPaperSize;
}

void SheetImplT::setPaper(int paper) {
    message().ok();
    page_.setup.iPaperSize = static_cast<uint16_t>(paper);
    setFlag(page_.setup.grbit, Setup::kNoPrinterSettings, false);
}

const wchar_t* SheetImplT::header() {
    message().ok();
    return returnString(page_.header);
}

bool SheetImplT::setHeader(const wchar_t* header, double margin) {
    return message().guard(false, [&] {
        std::wstring text = header ? header : L"";
        if (utf16Length(text) > kMaxHeaderFooterUnits) throw qrerror("header is too long");
        page_.header = text;
        page_.setup.numHdr = margin;
        return true;
    });
}

double SheetImplT::headerMargin() {
    message().ok();
    return page_.setup.numHdr;
}

const wchar_t* SheetImplT::footer() {
    message().ok();
    return returnString(page_.footer);
}

bool SheetImplT::setFooter(const wchar_t* footer, double margin) {
    return message().guard(false, [&] {
        std::wstring text = footer ? footer : L"";
        if (utf16Length(text) > kMaxHeaderFooterUnits) throw qrerror("footer is too long");
        page_.footer = text;
        page_.setup.numFtr = margin;
        return true;
    });
}

double SheetImplT::footerMargin() {
    message().ok();
    return page_.setup.numFtr;
}

bool SheetImplT::hCenter() { message().ok(); return page_.hCenter; }
void SheetImplT::setHCenter(bool hCenter) { message().ok(); page_.hCenter = hCenter; }
bool SheetImplT::vCenter() { message().ok(); return page_.vCenter; }
void SheetImplT::setVCenter(bool vCenter) { message().ok(); page_.vCenter = vCenter; }
double SheetImplT::marginLeft() { message().ok(); return page_.leftMargin; }
void SheetImplT::setMarginLeft(double margin) { message().ok(); page_.leftMargin = margin; }
double SheetImplT::marginRight() { message().ok(); return page_.rightMargin; }
void SheetImplT::setMarginRight(double margin) { message().ok(); page_.rightMargin = margin; }
double SheetImplT::marginTop() { message().ok(); return page_.topMargin; }
void SheetImplT::setMarginTop(double margin) { message().ok(); page_.topMargin = margin; }
double SheetImplT::marginBottom() { message().ok(); return page_.bottomMargin; }
void SheetImplT::setMarginBottom(double margin) { message().ok(); page_.bottomMargin = margin; }
bool SheetImplT::printRowCol() { message().ok(); return page_.printRowCol; }
void SheetImplT::setPrintRowCol(bool print) { message().ok(); page_.printRowCol = print; }

// ---- Tables, hyperlinks, autofilter ----

int SheetImplT::tableSize() {
    message().ok();
    return 0;  // tables exist in Open XML packages only
}

const wchar_t* SheetImplT::table(int, int*, int*, int*, int*, int*, int*) {
    message().set("index is out of range");
    return nullptr;
}

int SheetImplT::hyperlinkSize() {
    message().ok();
    return static_cast<int>(hyperlinks_.size());
}

const wchar_t* SheetImplT::hyperlink(int index, int* rowFirst, int* rowLast, int* colFirst,
                                     int* colLast) {
    return message().guard<const wchar_t*>(nullptr, [&]() -> const wchar_t* {
        if (index < 0 || index >= static_cast<int>(hyperlinks_.size()))
            throw qrerror("index is out of range");
        const Hyperlink& link = hyperlinks_[index];
        if (rowFirst) *rowFirst = link.ref.rwFirst;
        if (rowLast) *rowLast = link.ref.rwLast;
        if (colFirst) *colFirst = link.ref.colFirst;
        if (colLast) *colLast = link.ref.colLast;
        return returnString(link.target);
    });
}

bool SheetImplT::delHyperlink(int index) {
    return message().guard(false, [&] {
        if (index < 0 || index >= static_cast<int>(hyperlinks_.size()))
            throw qrerror("index is out of range");
        hyperlinks_.erase(hyperlinks_.begin() + index);
        return true;
    });
}

void SheetImplT::addHyperlink(const wchar_t* hyperlink, int rowFirst, int rowLast, int colFirst,
                              int colLast) {
    message().guardVoid([&] {
        if (!hyperlink) throw qrerror("hyperlink can't be 0");
        checkCell(rowFirst, colFirst);
        checkCell(rowLast, colLast);
        if (rowLast < rowFirst) throw qrerror("rowLast must be greater than or equal to rowFirst");
        if (colLast < colFirst) throw qrerror("colLast must be greater than or equal to colFirst");
        Hyperlink link;
        link.ref = makeRef(rowFirst, rowLast, colFirst, colLast);
        link.target = hyperlink;
        hyperlinks_.push_back(std::move(link));
    });
}

IAutoFilterT<wchar_t>* SheetImplT::autoFilter() {
    message().ok();
    return nullptr;  // autofilters are kept in Open XML packages only
}

void SheetImplT::applyFilter() { message().ok(); }
void SheetImplT::removeFilter() { message().ok(); }

// ---- Name, protection, visibility ----

const wchar_t* SheetImplT::name() {
    return message().guard<const wchar_t*>(nullptr, [&]() -> const wchar_t* {
        int index = book_->sheetIndexOf(this);
        if (index < 0) throw qrerror("sheet not found");
        return returnString(book_->boundSheet(index).stName);
    });
}

void SheetImplT::setName(const wchar_t* name) {
    message().guardVoid([&] {
        if (!name) throw qrerror("incorrect sheet name");
        std::wstring sheetName = name;
        bool cut = utf16Length(sheetName) > kMaxSheetNameUnits;
        if (cut) sheetName = cutToUtf16Units(sheetName, kMaxSheetNameUnits);
        // Two sheets of one name make a file that no program opens.
        if (!book_->nameIsFree(sheetName, this)) throw qrerror("book already contains such sheet name");
        int index = book_->sheetIndexOf(this);
        if (index < 0) throw qrerror("sheet not found");
        book_->boundSheet(index).stName = sheetName;
        if (cut) message().set("warning: sheet's name is cut to 31 characters");
    });
}

bool SheetImplT::protect() {
    message().ok();
    return protection_.protect;
}

void SheetImplT::setProtectEx(bool protect, const wchar_t* password, int enhancedProtection) {
    message().ok();
    protection_.protect = protect;
    protection_.password = protect ? passwordVerifier(password) : 0;
    protection_.enhancedProtection = enhancedProtection;
}

int SheetImplT::hidden() {
    return message().guard(static_cast<int>(SheetStateVisible), [&] {
        int index = book_->sheetIndexOf(this);
        if (index < 0) throw qrerror("sheet not found");
        return static_cast<int>(book_->boundSheet(index).hsState);
    });
}

bool SheetImplT::setHidden(int state) {
    return message().guard(false, [&] {
        if (state < SheetStateVisible || state > SheetStateVeryHidden)
            throw qrerror("hidden is out of range");
        int index = book_->sheetIndexOf(this);
        if (index < 0) throw qrerror("sheet not found");
        if (state != SheetStateVisible && book_->isLastVisibleSheet(this))
            throw qrerror("a workbook must contain at least one visible worksheet");
        book_->boundSheet(index).hsState = static_cast<uint8_t>(state);
        return true;
    });
}

// ---- Addresses, colours, checks ----

void SheetImplT::setAutoFitArea(int, int, int, int) {
    message().set("column auto-fit is not available yet");
}

void SheetImplT::addrToRowCol(const wchar_t* addr, int* row, int* col, bool* rowRelative,
                              bool* colRelative) {
    message().ok();
    quire::addrToRowCol(addr, row, col, rowRelative, colRelative);
}

const wchar_t* SheetImplT::rowColToAddr(int row, int col, bool rowRelative, bool colRelative) {
    return message().guard<const wchar_t*>(nullptr, [&]() -> const wchar_t* {
        checkCell(row, col);
        return returnString(quire::rowColToAddr(row, col, rowRelative, colRelative));
    });
}

void SheetImplT::setTabRgbColor(int red, int green, int blue) {
    int color = book_->colorPack(red, green, blue);
    if (color != ColorAuto) setTabColor(color);
}

void SheetImplT::setTabColor(int color) {
    message().ok();
    tabColor_ = color & 0x7F;
}

bool SheetImplT::addIgnoredError(int rowFirst, int colFirst, int rowLast, int colLast, int iError) {
    return message().guard(false, [&] {
        checkCell(rowFirst, colFirst);
        checkCell(rowLast, colLast);
        if (rowLast < rowFirst) throw qrerror("rowLast must be greater than or equal to rowFirst");
        if (colLast < colFirst) throw qrerror("colLast must be greater than or equal to colFirst");
        IgnoredErrorRange range;
        range.ref = makeRef(rowFirst, rowLast, colFirst, colLast);
        range.flags = static_cast<uint32_t>(iError) & 0xFF;
        for (const auto& existing : ignoredErrors_) {
            if (existing.ref.rwFirst == range.ref.rwFirst && existing.ref.rwLast == range.ref.rwLast &&
                existing.ref.colFirst == range.ref.colFirst &&
                existing.ref.colLast == range.ref.colLast && existing.flags == range.flags)
                throw qrerror("ignored error already exists");
        }
        ignoredErrors_.push_back(range);
        return true;
    });
}

void SheetImplT::addDataValidation(int, int, int, int, int, int, const wchar_t*, const wchar_t*,
                                   bool, bool, bool, bool, const wchar_t*, const wchar_t*,
                                   const wchar_t*, const wchar_t*, int) {
    message().set(kNotForXls);
}

void SheetImplT::addDataValidationDouble(int, int, int, int, int, int, double, double, bool, bool,
                                         bool, bool, const wchar_t*, const wchar_t*,
                                         const wchar_t*, const wchar_t*, int) {
    message().set(kNotForXls);
}

void SheetImplT::removeDataValidations() { message().set(kNotForXls); }

// ---- Pictures ----

int SheetImplT::pictureSize() {
    message().ok();
    return 0;
}

int SheetImplT::getPicture(int, int*, int*, int*, int*, int*, int*, int*, int*, int) {
    message().set("index is out of range");
    return -1;
}

void SheetImplT::setPicture(int, int, int, double, int, int, int) { message().set(kPicturesPending); }

void SheetImplT::setPicture2(int, int, int, int, int, int, int, int) {
    message().set(kPicturesPending);
}

// ---- Copying a whole sheet ----

void SheetImplT::copyFrom(ISheetT<wchar_t>& source) {
    auto* binary = dynamic_cast<SheetImplT*>(&source);
    if (binary && binary->book_ == book_) {
        // Same book: formats and shared strings are common, so the records copy as they are.
        BookImplT* own = book_;
        *this = *binary;
        book_ = own;
        setSelected(false);
        return;
    }
    // Another book: cell by cell through the interface, each format copied once.
    std::map<IFormatT<wchar_t>*, IFormatT<wchar_t>*> copied;
    auto mapFormat = [&](IFormatT<wchar_t>* format) -> IFormatT<wchar_t>* {
        if (!format) return nullptr;
        auto found = copied.find(format);
        if (found != copied.end()) return found->second;
        IFormatT<wchar_t>* copy = book_->addFormat(format);
        copied.emplace(format, copy);
        return copy;
    };
    int rowEnd = source.lastRow(), colEnd = source.lastCol();
    for (int r = source.firstRow(); r < rowEnd && r <= kMaxRow; ++r) {
        for (int c = source.firstCol(); c < colEnd && c <= kMaxCol; ++c) {
            IFormatT<wchar_t>* format = nullptr;
            if (source.isFormula(r, c)) {
                const wchar_t* expr = source.readFormula(r, c, &format);
                if (expr) {
                    std::wstring text = expr;
                    writeFormula(r, c, text.c_str(), mapFormat(format));
                    continue;
                }
            }
            switch (source.cellType(r, c)) {
                case CellTypeNumber: {
                    double value = source.readNum(r, c, &format);
                    writeNum(r, c, value, mapFormat(format));
                    break;
                }
                case CellTypeString: {
                    const wchar_t* text = source.readStr(r, c, &format);
                    std::wstring value = text ? text : L"";
                    writeStr(r, c, value.c_str(), mapFormat(format), 2);
                    break;
                }
                case CellTypeBoolean: {
                    bool value = source.readBool(r, c, &format);
                    writeBool(r, c, value, mapFormat(format), ErrorTypeNoError);
                    break;
                }
                case CellTypeError: {
                    int error = source.readError(r, c);
                    writeError(r, c, error, mapFormat(source.cellFormat(r, c)));
                    break;
                }
                case CellTypeBlank:
                    writeBlank(r, c, mapFormat(source.cellFormat(r, c)));
                    break;
                default:
                    break;
            }
        }
    }
    for (int i = 0; i < source.mergeSize(); ++i) {
        int rf, rl, cf, cl;
        if (source.merge(i, &rf, &rl, &cf, &cl)) setMerge(rf, rl, cf, cl);
    }
    book_->message().ok();
}

}  // namespace quire
