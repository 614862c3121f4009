// Book entry points of the C interface: each forwards to one IBook operation.
#include "handles.h"

using namespace quire::flat;

extern "C" {

int qrBookLoadUsingTempFileW(BookHandle book, const wchar_t* fileName, const wchar_t* tempFile) {
    return asBook(book)->load(fileName, tempFile);
}

int qrBookLoadW(BookHandle book, const wchar_t* fileName) {
    return asBook(book)->load(fileName, nullptr);
}

int qrBookLoadPartiallyUsingTempFileW(BookHandle book, const wchar_t* fileName, int sheetIndex,
                                      int firstRow, int lastRow, const wchar_t* tempFile) {
    return asBook(book)->loadPartially(fileName, sheetIndex, firstRow, lastRow, tempFile);
}

int qrBookLoadPartiallyW(BookHandle book, const wchar_t* fileName, int sheetIndex, int firstRow,
                         int lastRow) {
    return asBook(book)->loadPartially(fileName, sheetIndex, firstRow, lastRow, nullptr);
}

int qrBookSaveUsingTempFileW(BookHandle book, const wchar_t* fileName, int useTempFile) {
    return asBook(book)->save(fileName, isTrue(useTempFile));
}

int qrBookSaveW(BookHandle book, const wchar_t* fileName) {
    return asBook(book)->save(fileName, false);
}

int qrBookLoadRawPartiallyW(BookHandle book, const char* data, unsigned size, int sheetIndex,
                            int firstRow, int lastRow) {
    return asBook(book)->loadRaw(data, size, sheetIndex, firstRow, lastRow);
}

int qrBookLoadRawW(BookHandle book, const char* data, unsigned size) {
    // -1 everywhere: every sheet, every row.
    return asBook(book)->loadRaw(data, size, -1, -1, -1);
}

int qrBookSaveRawW(BookHandle book, const char** data, unsigned* size) {
    return asBook(book)->saveRaw(data, size);
}

SheetHandle qrBookAddSheetW(BookHandle book, const wchar_t* name, SheetHandle initSheet) {
    return toHandle(asBook(book)->addSheet(name, asSheet(initSheet)));
}

SheetHandle qrBookInsertSheetW(BookHandle book, int index, const wchar_t* name,
                               SheetHandle initSheet) {
    return toHandle(asBook(book)->insertSheet(index, name, asSheet(initSheet)));
}

SheetHandle qrBookGetSheetW(BookHandle book, int index) {
    return toHandle(asBook(book)->getSheet(index));
}

int qrBookSheetTypeW(BookHandle book, int index) { return asBook(book)->sheetType(index); }

int qrBookMoveSheetW(BookHandle book, int srcIndex, int dstIndex) {
    return asBook(book)->moveSheet(srcIndex, dstIndex);
}

int qrBookDelSheetW(BookHandle book, int index) { return asBook(book)->delSheet(index); }

int qrBookSheetCountW(BookHandle book) { return asBook(book)->sheetCount(); }

FormatHandle qrBookAddFormatW(BookHandle book, FormatHandle initFormat) {
    return toHandle(asBook(book)->addFormat(asFormat(initFormat)));
}

FontHandle qrBookAddFontW(BookHandle book, FontHandle initFont) {
    return toHandle(asBook(book)->addFont(asFont(initFont)));
}

int qrBookAddCustomNumFormatW(BookHandle book, const wchar_t* customNumFormat) {
    return asBook(book)->addCustomNumFormat(customNumFormat);
}

const wchar_t* qrBookCustomNumFormatW(BookHandle book, int fmt) {
    return asBook(book)->customNumFormat(fmt);
}

FormatHandle qrBookFormatW(BookHandle book, int index) {
    return toHandle(asBook(book)->format(index));
}

int qrBookFormatSizeW(BookHandle book) { return asBook(book)->formatSize(); }

FontHandle qrBookFontW(BookHandle book, int index) { return toHandle(asBook(book)->font(index)); }

int qrBookFontSizeW(BookHandle book) { return asBook(book)->fontSize(); }

double qrBookDatePackW(BookHandle book, int year, int month, int day, int hour, int min, int sec,
                       int msec) {
    return asBook(book)->datePack(year, month, day, hour, min, sec, msec);
}

int qrBookDateUnpackW(BookHandle book, double value, int* year, int* month, int* day, int* hour,
                      int* min, int* sec, int* msec) {
    return asBook(book)->dateUnpack(value, year, month, day, hour, min, sec, msec);
}

int qrBookColorPackW(BookHandle book, int red, int green, int blue) {
    return asBook(book)->colorPack(red, green, blue);
}

void qrBookColorUnpackW(BookHandle book, int color, int* red, int* green, int* blue) {
    asBook(book)->colorUnpack(color, red, green, blue);
}

int qrBookActiveSheetW(BookHandle book) { return asBook(book)->activeSheet(); }

void qrBookSetActiveSheetW(BookHandle book, int index) { asBook(book)->setActiveSheet(index); }

int qrBookPictureSizeW(BookHandle book) { return asBook(book)->pictureSize(); }

int qrBookGetPictureW(BookHandle book, int index, const char** data, unsigned* size) {
    return asBook(book)->getPicture(index, data, size);
}

int qrBookAddPictureW(BookHandle book, const wchar_t* fileName) {
    return asBook(book)->addPicture(fileName);
}

int qrBookAddPicture2W(BookHandle book, const char* data, unsigned size) {
    return asBook(book)->addPicture2(data, size);
}

const wchar_t* qrBookDefaultFontW(BookHandle book, int* fontSize) {
    return asBook(book)->defaultFont(fontSize);
}

void qrBookSetDefaultFontW(BookHandle book, const wchar_t* fontName, int fontSize) {
    asBook(book)->setDefaultFont(fontName, fontSize);
}

int qrBookRefR1C1W(BookHandle book) { return asBook(book)->refR1C1(); }

void qrBookSetRefR1C1W(BookHandle book, int refR1C1) {
    asBook(book)->setRefR1C1(isTrue(refR1C1));
}

int qrBookRgbModeW(BookHandle book) { return asBook(book)->rgbMode(); }

void qrBookSetRgbModeW(BookHandle book, int rgbMode) { asBook(book)->setRgbMode(isTrue(rgbMode)); }

int qrBookVersionW(BookHandle book) { return asBook(book)->version(); }

int qrBookBiffVersionW(BookHandle book) { return asBook(book)->biffVersion(); }

int qrBookIsDate1904W(BookHandle book) { return asBook(book)->isDate1904(); }

void qrBookSetDate1904W(BookHandle book, int date1904) {
    asBook(book)->setDate1904(isTrue(date1904));
}

int qrBookIsTemplateW(BookHandle book) { return asBook(book)->isTemplate(); }

void qrBookSetTemplateW(BookHandle book, int tmpl) { asBook(book)->setTemplate(isTrue(tmpl)); }

int qrBookSetLocaleW(BookHandle book, const char* locale) {
    return asBook(book)->setLocale(locale);
}

const char* qrBookErrorMessageW(BookHandle book) { return asBook(book)->errorMessage(); }

void qrBookReleaseW(BookHandle book) { asBook(book)->release(); }

}  // extern "C"
