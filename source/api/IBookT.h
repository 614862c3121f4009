#pragma once
#include "ISheetT.h"

namespace quire {

// A workbook. Every operation leaves a message ("ok", a failure text or a "warning: " text).
template <class TCHAR>
class IBookT {
public:
    virtual bool load(const TCHAR* fileName, const TCHAR* tempFile) = 0;
    virtual bool loadSheet(const TCHAR* fileName, int sheetIndex, const TCHAR* tempFile) = 0;
    virtual bool loadPartially(const TCHAR* fileName, int sheetIndex, int firstRow, int lastRow,
                               const TCHAR* tempFile) = 0;
    virtual bool loadInfo(const TCHAR* fileName) = 0;
    virtual bool save(const TCHAR* fileName, bool useTempFile) = 0;
    virtual bool loadRaw(const char* data, unsigned size, int sheetIndex, int firstRow,
                         int lastRow) = 0;
    virtual bool saveRaw(const char** data, unsigned* size) = 0;
    virtual ISheetT<TCHAR>* addSheet(const TCHAR* name, ISheetT<TCHAR>* initSheet) = 0;
    virtual ISheetT<TCHAR>* insertSheet(int index, const TCHAR* name,
                                        ISheetT<TCHAR>* initSheet) = 0;
    virtual ISheetT<TCHAR>* getSheet(int index) = 0;
    virtual const TCHAR* getSheetName(int index) = 0;
    virtual int sheetType(int index) = 0;
    virtual bool moveSheet(int srcIndex, int dstIndex) = 0;
    virtual bool delSheet(int index) = 0;
    virtual int sheetCount() = 0;
    virtual IFormatT<TCHAR>* addFormat(IFormatT<TCHAR>* initFormat) = 0;
    virtual IFontT<TCHAR>* addFont(IFontT<TCHAR>* initFont) = 0;
    virtual int addCustomNumFormat(const TCHAR* customNumFormat) = 0;
    virtual const TCHAR* customNumFormat(int fmt) = 0;
    virtual IFormatT<TCHAR>* format(int index) = 0;
    virtual int formatSize() = 0;
    virtual IFontT<TCHAR>* font(int index) = 0;
    virtual int fontSize() = 0;
    virtual double datePack(int year, int month, int day, int hour, int min, int sec,
                            int msec) = 0;
    virtual bool dateUnpack(double value, int* year, int* month, int* day, int* hour, int* min,
                            int* sec, int* msec) = 0;
    virtual int colorPack(int red, int green, int blue) = 0;
    virtual void colorUnpack(int color, int* red, int* green, int* blue) = 0;
    virtual int activeSheet() = 0;
    virtual void setActiveSheet(int index) = 0;
    virtual int pictureSize() = 0;
    virtual int getPicture(int index, const char** data, unsigned* size) = 0;
    virtual int addPicture(const TCHAR* fileName) = 0;
    virtual int addPicture2(const char* data, unsigned size) = 0;
    virtual int addPictureAsLink(const TCHAR* fileName, bool insert) = 0;
    virtual const TCHAR* defaultFont(int* fontSize) = 0;
    virtual void setDefaultFont(const TCHAR* fontName, int fontSize) = 0;
    virtual bool refR1C1() = 0;
    virtual void setRefR1C1(bool refR1C1) = 0;
    virtual bool rgbMode() = 0;
    virtual void setRgbMode(bool rgbMode) = 0;
    virtual int version() = 0;
    virtual int biffVersion() = 0;
    virtual bool isDate1904() = 0;
    virtual void setDate1904(bool date1904) = 0;
    virtual bool isTemplate() = 0;
    virtual void setTemplate(bool tmpl) = 0;
    virtual bool setLocale(const char* locale) = 0;
    virtual const char* errorMessage() = 0;
    virtual void release() = 0;
    virtual ~IBookT() = default;
};

using IBook = IBookT<wchar_t>;

// The packed library version both kinds of book report.
constexpr int kLibraryVersion = 0x03080800;

}  // namespace quire
