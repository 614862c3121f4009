#pragma once
#include "api/IBookT.h"

namespace quire {

// The book handed out by the Open XML factory: forwards to a transitional or Strict book and,
// when a load fails, tries once more with the other flavour.
class XMLBookProxy : public IBookT<wchar_t> {
public:
    XMLBookProxy();
    ~XMLBookProxy() override;
    XMLBookProxy(const XMLBookProxy&) = delete;
    XMLBookProxy& operator=(const XMLBookProxy&) = delete;

    bool load(const wchar_t* fileName, const wchar_t* tempFile) override;
    bool loadSheet(const wchar_t* fileName, int sheetIndex, const wchar_t* tempFile) override;
    bool loadPartially(const wchar_t* fileName, int sheetIndex, int firstRow, int lastRow,
                       const wchar_t* tempFile) override;
    bool loadInfo(const wchar_t* fileName) override { return book_->loadInfo(fileName); }
    bool save(const wchar_t* fileName, bool useTempFile) override { return book_->save(fileName, useTempFile); }
    bool loadRaw(const char* data, unsigned size, int sheetIndex, int firstRow, int lastRow) override;
    bool saveRaw(const char** data, unsigned* size) override { return book_->saveRaw(data, size); }
    ISheetT<wchar_t>* addSheet(const wchar_t* name, ISheetT<wchar_t>* initSheet) override {
        return book_->addSheet(name, initSheet);
    }
    ISheetT<wchar_t>* insertSheet(int index, const wchar_t* name, ISheetT<wchar_t>* initSheet) override {
        return book_->insertSheet(index, name, initSheet);
    }
    ISheetT<wchar_t>* getSheet(int index) override { return book_->getSheet(index); }
    const wchar_t* getSheetName(int index) override { return book_->getSheetName(index); }
    int sheetType(int index) override { return book_->sheetType(index); }
    bool moveSheet(int srcIndex, int dstIndex) override { return book_->moveSheet(srcIndex, dstIndex); }
    bool delSheet(int index) override { return book_->delSheet(index); }
    int sheetCount() override { return book_->sheetCount(); }
    IFormatT<wchar_t>* addFormat(IFormatT<wchar_t>* initFormat) override { return book_->addFormat(initFormat); }
    IFontT<wchar_t>* addFont(IFontT<wchar_t>* initFont) override { return book_->addFont(initFont); }
    int addCustomNumFormat(const wchar_t* customNumFormat) override {
        return book_->addCustomNumFormat(customNumFormat);
    }
    const wchar_t* customNumFormat(int fmt) override { return book_->customNumFormat(fmt); }
    IFormatT<wchar_t>* format(int index) override { return book_->format(index); }
    int formatSize() override { return book_->formatSize(); }
    IFontT<wchar_t>* font(int index) override { return book_->font(index); }
    int fontSize() override { return book_->fontSize(); }
    double datePack(int year, int month, int day, int hour, int min, int sec, int msec) override {
        return book_->datePack(year, month, day, hour, min, sec, msec);
    }
    bool dateUnpack(double value, int* year, int* month, int* day, int* hour, int* min, int* sec,
                    int* msec) override {
        return book_->dateUnpack(value, year, month, day, hour, min, sec, msec);
    }
    int colorPack(int red, int green, int blue) override { return book_->colorPack(red, green, blue); }
    void colorUnpack(int color, int* red, int* green, int* blue) override {
        book_->colorUnpack(color, red, green, blue);
    }
    int activeSheet() override { return book_->activeSheet(); }
    void setActiveSheet(int index) override { book_->setActiveSheet(index); }
    int pictureSize() override { return book_->pictureSize(); }
    int getPicture(int index, const char** data, unsigned* size) override {
        return book_->getPicture(index, data, size);
    }
    int addPicture(const wchar_t* fileName) override { return book_->addPicture(fileName); }
    int addPicture2(const char* data, unsigned size) override { return book_->addPicture2(data, size); }
    int addPictureAsLink(const wchar_t* fileName, bool insert) override {
        return book_->addPictureAsLink(fileName, insert);
    }
    const wchar_t* defaultFont(int* fontSize) override { return book_->defaultFont(fontSize); }
    void setDefaultFont(const wchar_t* fontName, int fontSize) override { book_->setDefaultFont(fontName, fontSize); }
    bool refR1C1() override { return book_->refR1C1(); }
    void setRefR1C1(bool refR1C1) override { book_->setRefR1C1(refR1C1); }
    bool rgbMode() override { return book_->rgbMode(); }
    void setRgbMode(bool rgbMode) override { book_->setRgbMode(rgbMode); }
    int version() override { return book_->version(); }
    int biffVersion() override { return book_->biffVersion(); }
    bool isDate1904() override { return book_->isDate1904(); }
    void setDate1904(bool date1904) override { book_->setDate1904(date1904); }
    bool isTemplate() override { return book_->isTemplate(); }
    void setTemplate(bool tmpl) override { book_->setTemplate(tmpl); }
    bool setLocale(const char* locale) override { return book_->setLocale(locale); }
    const char* errorMessage() override { return book_->errorMessage(); }
    void release() override { delete this; }

    // True while the book behind is the Strict flavour.
    bool isStrict() const { return strict_; }

private:
    template <class Load>
    bool retry(Load&& load);

    IBookT<wchar_t>* book_;
    bool strict_ = false;
};

// The Open XML book of the C interface; null when memory cannot be obtained.
IBookT<wchar_t>* createXmlBook() noexcept;

}  // namespace quire
