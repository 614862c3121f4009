// QrBookKit: sheets, formats, fonts, pictures, dates, colours and the book's settings.
#include "book_methods.h"

#include "glue.h"
#include "host_binary.h"
#include "host_dates.h"

namespace quire_plugin {

namespace {
BookHandle bookOf(REALobject self) { return bookHandleOf(self); }

// Raises the range exception for an index outside [0, count).
bool indexInRange(RBInteger index, int count, const char* method) {
    if (index >= 0 && index < count) return true;
    raiseOutOfRange("index", method, 0, count, index);
    return false;
}
}  // namespace

// ---- Constructor and destructor ----

void bookConstructor(REALobject self, RBBoolean xml) {
    // Only the factory that is used must be present: a missing Open XML engine does not stop
    // binary books.
    if (xml ? !QR_NEED(qrCreateXMLBookCW) : !QR_NEED(qrCreateBookCW)) return;
    BookHandle book = xml ? QR_CALL(qrCreateXMLBookCW)() : QR_CALL(qrCreateBookCW)();
    auto* data = instanceData<BookData>(self, bookClass());
    if (data->book && functions().qrBookReleaseW) functions().qrBookReleaseW(data->book);
    data->book = book;
}

void bookDestructor(REALobject self) {
    auto* data = instanceData<BookData>(self, bookClass());
    if (data->book && functions().qrBookReleaseW) functions().qrBookReleaseW(data->book);
    data->book = nullptr;
}

// ---- Properties ----

REALstring bookErrorMessage(REALobject self, RBInteger) {
    if (!QR_NEED(qrBookErrorMessageW)) return nullptr;
    if (!bookOf(self)) return cStringToHostString("No book.", kEncodingAscii);
    const char* message = QR_CALL(qrBookErrorMessageW)(bookOf(self));
    if (debugging()) debugLine("Error message:", message);
    return cStringToHostString(message, kEncodingAscii);
}

#define QR_BOOK_FLAG(getterName, setterName, getEntry, setEntry)                      \
    RBBoolean getterName(REALobject self, RBInteger) {                               \
        if (!QR_NEED(getEntry) || !requireHandle(bookOf(self))) return false;         \
        return hostBool(QR_CALL(getEntry)(bookOf(self)));                             \
    }                                                                                 \
    void setterName(REALobject self, RBInteger, RBBoolean value) {                    \
        if (!QR_NEED(setEntry) || !requireHandle(bookOf(self))) return;               \
        QR_CALL(setEntry)(bookOf(self), value ? 1 : 0);                               \
    }
QR_BOOK_FLAG(bookIsTemplate, bookSetIsTemplate, qrBookIsTemplateW, qrBookSetTemplateW)
QR_BOOK_FLAG(bookIsDate1904, bookSetIsDate1904, qrBookIsDate1904W, qrBookSetDate1904W)
QR_BOOK_FLAG(bookRgbMode, bookSetRgbMode, qrBookRgbModeW, qrBookSetRgbModeW)
#undef QR_BOOK_FLAG

RBInteger bookActiveSheet(REALobject self, RBInteger) {
    if (!QR_NEED(qrBookActiveSheetW) || !requireHandle(bookOf(self))) return 0;
    return QR_CALL(qrBookActiveSheetW)(bookOf(self));
}
void bookSetActiveSheet(REALobject self, RBInteger, RBInteger value) {
    if (!QR_NEED(qrBookSetActiveSheetW) || !requireHandle(bookOf(self))) return;
    QR_CALL(qrBookSetActiveSheetW)(bookOf(self), static_cast<int>(value));
}
RBInteger bookRefR1C1(REALobject self, RBInteger) {
    if (!QR_NEED(qrBookRefR1C1W) || !requireHandle(bookOf(self))) return 0;
    return QR_CALL(qrBookRefR1C1W)(bookOf(self));
}
void bookSetRefR1C1(REALobject self, RBInteger, RBInteger value) {
    if (!QR_NEED(qrBookSetRefR1C1W) || !requireHandle(bookOf(self))) return;
    QR_CALL(qrBookSetRefR1C1W)(bookOf(self), static_cast<int>(value));
}
RBInteger bookBiffVersion(REALobject self, RBInteger) {
    if (!QR_NEED(qrBookBiffVersionW) || !requireHandle(bookOf(self))) return 0;
    return QR_CALL(qrBookBiffVersionW)(bookOf(self));
}

RBBoolean bookDebugging(RBInteger) { return debugging() ? 1 : 0; }
void bookSetDebugging(RBInteger, RBBoolean value) { setDebugging(value != 0); }

// ---- Sheets ----

RBBoolean bookMoveSheet(REALobject self, RBInteger source, RBInteger dest) {
    if (!QR_NEED(qrBookMoveSheetW) || !requireHandle(bookOf(self))) return false;
    return hostBool(QR_CALL(qrBookMoveSheetW)(bookOf(self), static_cast<int>(source), static_cast<int>(dest)));
}

RBInteger bookSheetType(REALobject self, RBInteger index) {
    if (!QR_NEED(qrBookSheetTypeW) || !requireHandle(bookOf(self))) return 0;
    return QR_CALL(qrBookSheetTypeW)(bookOf(self), static_cast<int>(index));
}

RBInteger bookVersion(REALobject self) {
    if (!QR_NEED(qrBookVersionW) || !requireHandle(bookOf(self))) return 0;
    return QR_CALL(qrBookVersionW)(bookOf(self));
}

REALarray bookSheets(REALobject self) {
    if (!QR_NEED(qrBookSheetCountW) || !QR_NEED(qrBookGetSheetW) || !requireHandle(bookOf(self))) return nullptr;
    BookHandle book = bookOf(self);
    return wrapperArray(sheetClass(), QR_CALL(qrBookSheetCountW)(book), self,
                        [book](int i) { return QR_CALL(qrBookGetSheetW)(book, i); });
}

REALarray bookFormats(REALobject self) {
    if (!QR_NEED(qrBookFormatW) || !QR_NEED(qrBookFormatSizeW) || !requireHandle(bookOf(self))) return nullptr;
    BookHandle book = bookOf(self);
    return wrapperArray(formatClass(), QR_CALL(qrBookFormatSizeW)(book), self,
                        [book](int i) { return QR_CALL(qrBookFormatW)(book, i); });
}

REALarray bookFonts(REALobject self) {
    if (!QR_NEED(qrBookFontSizeW) || !QR_NEED(qrBookFontW) || !requireHandle(bookOf(self))) return nullptr;
    BookHandle book = bookOf(self);
    return wrapperArray(fontClass(), QR_CALL(qrBookFontSizeW)(book), self,
                        [book](int i) { return QR_CALL(qrBookFontW)(book, i); });
}

REALobject bookInsertSheet(REALobject self, RBInteger index, REALstring name, REALobject initSheet) {
    if (!QR_NEED(qrBookInsertSheetW) || !requireHandle(bookOf(self))) return nullptr;
    HostText text(name);
    SheetHandle sheet =
        QR_CALL(qrBookInsertSheetW)(bookOf(self), static_cast<int>(index), text.wide(), sheetHandleOf(initSheet));
    return wrapHandle(sheetClass(), sheet, self);
}

REALobject bookAddSheet(REALobject self, REALstring name, REALobject initSheet) {
    if (!QR_NEED(qrBookAddSheetW) || !requireHandle(bookOf(self))) return nullptr;
    HostText text(name);
    return wrapHandle(sheetClass(), QR_CALL(qrBookAddSheetW)(bookOf(self), text.wide(), sheetHandleOf(initSheet)), self);
}

REALobject bookSheet(REALobject self, RBInteger index) {
    if (!QR_NEED(qrBookSheetCountW) || !QR_NEED(qrBookGetSheetW) || !requireHandle(bookOf(self))) return nullptr;
    if (!indexInRange(index, QR_CALL(qrBookSheetCountW)(bookOf(self)), "Sheet")) return nullptr;
    return wrapHandle(sheetClass(), QR_CALL(qrBookGetSheetW)(bookOf(self), static_cast<int>(index)), self);
}

RBInteger bookSheetCount(REALobject self) {
    if (!QR_NEED(qrBookSheetCountW) || !requireHandle(bookOf(self))) return 0;
    return QR_CALL(qrBookSheetCountW)(bookOf(self));
}

RBBoolean bookDelSheet(REALobject self, RBInteger index) {
    if (!QR_NEED(qrBookDelSheetW) || !requireHandle(bookOf(self))) return false;
    return hostBool(QR_CALL(qrBookDelSheetW)(bookOf(self), static_cast<int>(index)));
}

// ---- Formats, fonts, number formats ----

void bookSetLocale(REALobject self, REALstring locale) {
    if (!QR_NEED(qrBookSetLocaleW) || !requireHandle(bookOf(self))) return;
    HostText text(locale);
    QR_CALL(qrBookSetLocaleW)(bookOf(self), text.singleByte().c_str());
}

RBInteger bookAddCustomNumFormat(REALobject self, REALstring format) {
    if (!QR_NEED(qrBookAddCustomNumFormatW) || !requireHandle(bookOf(self))) return 0;
    HostText text(format);
    return QR_CALL(qrBookAddCustomNumFormatW)(bookOf(self), text.wide());
}

REALstring bookCustomNumFormat(REALobject self, RBInteger format) {
    if (!QR_NEED(qrBookCustomNumFormatW) || !requireHandle(bookOf(self))) return nullptr;
    return wideToHostString(QR_CALL(qrBookCustomNumFormatW)(bookOf(self), static_cast<int>(format)));
}

REALobject bookAddFormat(REALobject self, REALobject initFormat) {
    if (!QR_NEED(qrBookAddFormatW) || !requireHandle(bookOf(self))) return nullptr;
    return wrapHandle(formatClass(), QR_CALL(qrBookAddFormatW)(bookOf(self), formatOf(initFormat)), self);
}

REALobject bookAddFont(REALobject self, REALobject initFont) {
    if (!QR_NEED(qrBookAddFontW) || !requireHandle(bookOf(self))) return nullptr;
    return wrapHandle(fontClass(), QR_CALL(qrBookAddFontW)(bookOf(self), fontOf(initFont)), self);
}

REALobject bookFont(REALobject self, RBInteger index) {
    if (!QR_NEED(qrBookFontSizeW) || !QR_NEED(qrBookFontW) || !requireHandle(bookOf(self))) return nullptr;
    if (!indexInRange(index, QR_CALL(qrBookFontSizeW)(bookOf(self)), "Font")) return nullptr;
    return wrapHandle(fontClass(), QR_CALL(qrBookFontW)(bookOf(self), static_cast<int>(index)), self);
}

RBInteger bookFontCount(REALobject self) {
    if (!QR_NEED(qrBookFontSizeW) || !requireHandle(bookOf(self))) return 0;
    return QR_CALL(qrBookFontSizeW)(bookOf(self));
}

REALobject bookFormat(REALobject self, RBInteger index) {
    if (!QR_NEED(qrBookFormatSizeW) || !QR_NEED(qrBookFormatW) || !requireHandle(bookOf(self))) return nullptr;
    if (!indexInRange(index, QR_CALL(qrBookFormatSizeW)(bookOf(self)), "Format")) return nullptr;
    return wrapHandle(formatClass(), QR_CALL(qrBookFormatW)(bookOf(self), static_cast<int>(index)), self);
}

RBInteger bookFormatCount(REALobject self) {
    if (!QR_NEED(qrBookFormatSizeW) || !requireHandle(bookOf(self))) return 0;
    return QR_CALL(qrBookFormatSizeW)(bookOf(self));
}

REALstring bookDefaultFont(REALobject self, RBInteger* fontSize) {
    if (!QR_NEED(qrBookDefaultFontW) || !requireHandle(bookOf(self))) return nullptr;
    int size = 0;
    const wchar_t* name = QR_CALL(qrBookDefaultFontW)(bookOf(self), &size);
    if (fontSize) *fontSize = size;
    return wideToHostString(name);
}

void bookSetDefaultFont(REALobject self, REALstring fontName, RBInteger fontSize) {
    if (!QR_NEED(qrBookSetDefaultFontW) || !requireHandle(bookOf(self))) return;
    HostText text(fontName);
    QR_CALL(qrBookSetDefaultFontW)(bookOf(self), text.wide(), static_cast<int>(fontSize));
}

// ---- Pictures ----

RBInteger bookAddPictureFolder(REALobject self, REALobject path) {
    if (!QR_NEED(qrBookAddPictureW) || !requireHandle(bookOf(self))) return 0;
    if (!requireArgument(path, "value", "path is nil")) return 0;
    std::wstring native;
    folderItemPath(path, native);
    return QR_CALL(qrBookAddPictureW)(bookOf(self), native.c_str());
}

RBInteger bookAddPictureString(REALobject self, REALstring path) {
    if (!QR_NEED(qrBookAddPictureW) || !requireHandle(bookOf(self))) return 0;
    HostText text(path);
    return QR_CALL(qrBookAddPictureW)(bookOf(self), text.wide());
}

RBInteger bookAddPictureData(REALobject self, REALstring data) {
    if (!QR_NEED(qrBookAddPicture2W) || !requireHandle(bookOf(self))) return 0;
    HostBytes bytes = HostBytes::fromString(data);
    return QR_CALL(qrBookAddPicture2W)(bookOf(self), bytes.data(), bytes.size());
}

RBInteger bookPicture(REALobject self, RBInteger index, REALstring* data) {
    assignString(data, nullptr);
    if (!QR_NEED(qrBookGetPictureW) || !requireHandle(bookOf(self))) return 0;
    const char* bytes = nullptr;
    unsigned size = 0;
    int type = QR_CALL(qrBookGetPictureW)(bookOf(self), static_cast<int>(index), &bytes, &size);
    assignString(data, binaryToHostString(bytes, size));
    return type;
}

RBInteger bookPictureCount(REALobject self) {
    if (!QR_NEED(qrBookPictureSizeW) || !requireHandle(bookOf(self))) return 0;
    return QR_CALL(qrBookPictureSizeW)(bookOf(self));
}

// ---- Dates and colours ----

double bookPackDateObject(REALobject self, REALobject date) {
    if (!QR_NEED(qrBookDatePackW) || !requireHandle(bookOf(self))) return 0.0;
    if (!requireArgument(date, "date", "date is nil")) return 0.0;
    DateParts p = readHostDate(date);
    return QR_CALL(qrBookDatePackW)(bookOf(self), p.year, p.month, p.day, p.hour, p.minute, p.second, 0);
}

REALobject bookUnpackDateObject(REALobject self, double value) {
    if (!QR_NEED(qrBookDateUnpackW) || !requireHandle(bookOf(self))) return nullptr;
    DateParts p;
    int msec = 0;
    if (!QR_CALL(qrBookDateUnpackW)(bookOf(self), value, &p.year, &p.month, &p.day, &p.hour, &p.minute, &p.second, &msec))
        return nullptr;
    return newHostDate(p);
}

double bookPackDate(REALobject self, RBInteger year, RBInteger month, RBInteger day, RBInteger hour, RBInteger minute,
                    RBInteger second, RBInteger msec) {
    if (!QR_NEED(qrBookDatePackW) || !requireHandle(bookOf(self))) return 0.0;
    return QR_CALL(qrBookDatePackW)(bookOf(self), static_cast<int>(year), static_cast<int>(month), static_cast<int>(day),
                                    static_cast<int>(hour), static_cast<int>(minute), static_cast<int>(second),
                                    static_cast<int>(msec));
}

RBBoolean bookUnpackDate7(REALobject self, double value, RBInteger* year, RBInteger* month, RBInteger* day,
                          RBInteger* hour, RBInteger* minute, RBInteger* second, RBInteger* msec) {
    if (!QR_NEED(qrBookDateUnpackW) || !requireHandle(bookOf(self))) return false;
    int y = 0, mo = 0, d = 0, h = 0, mi = 0, s = 0, ms = 0;
    int ok = QR_CALL(qrBookDateUnpackW)(bookOf(self), value, &y, &mo, &d, &h, &mi, &s, &ms);
    RBInteger* outputs[] = {year, month, day, hour, minute, second, msec};
    int values[] = {y, mo, d, h, mi, s, ms};
    for (int i = 0; i < 7; ++i)
        if (outputs[i]) *outputs[i] = values[i];
    return hostBool(ok);
}

RBBoolean bookUnpackDate6(REALobject self, double value, RBInteger* year, RBInteger* month, RBInteger* day,
                          RBInteger* hour, RBInteger* minute, RBInteger* second) {
    return bookUnpackDate7(self, value, year, month, day, hour, minute, second, nullptr);
}

RBBoolean bookUnpackDate3(REALobject self, double value, RBInteger* year, RBInteger* month, RBInteger* day) {
    return bookUnpackDate7(self, value, year, month, day, nullptr, nullptr, nullptr, nullptr);
}

RBColor bookUnpackColorValue(REALobject self, RBInteger color) {
    if (!QR_NEED(qrBookColorUnpackW) || !requireHandle(bookOf(self))) return 0;
    int red = 0, green = 0, blue = 0;
    QR_CALL(qrBookColorUnpackW)(bookOf(self), static_cast<int>(color), &red, &green, &blue);
    if (debugging()) debugLine("color", red, green, blue);
    return static_cast<RBColor>(((red & 0xFF) << 16) | ((green & 0xFF) << 8) | (blue & 0xFF));
}

void bookUnpackColor(REALobject self, RBInteger color, RBInteger* red, RBInteger* green, RBInteger* blue) {
    for (RBInteger* output : {red, green, blue})
        if (output) *output = 0;
    if (!QR_NEED(qrBookColorUnpackW) || !requireHandle(bookOf(self))) return;
    int r = 0, g = 0, b = 0;
    QR_CALL(qrBookColorUnpackW)(bookOf(self), static_cast<int>(color), &r, &g, &b);
    if (red) *red = r;
    if (green) *green = g;
    if (blue) *blue = b;
}

RBInteger bookPackColorValue(REALobject self, RBColor color) {
    if (!QR_NEED(qrBookColorPackW) || !requireHandle(bookOf(self))) return 0;
    int result = QR_CALL(qrBookColorPackW)(bookOf(self), (color >> 16) & 0xFF, (color >> 8) & 0xFF, color & 0xFF);
    if (debugging()) debugLine("rgb color", result);
    return result;
}

RBInteger bookPackColor(REALobject self, RBInteger red, RBInteger green, RBInteger blue) {
    if (!QR_NEED(qrBookColorPackW) || !requireHandle(bookOf(self))) return 0;
    return QR_CALL(qrBookColorPackW)(bookOf(self), static_cast<int>(red), static_cast<int>(green), static_cast<int>(blue));
}

}  // namespace quire_plugin
