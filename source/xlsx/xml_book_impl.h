#pragma once
#include <map>
#include <memory>
#include <string>
#include <vector>

#include "api/IBookT.h"
#include "api/book_message.h"
#include "api/locale_settings.h"
#include "xlsx/content_types.h"
#include "xlsx/flavour.h"
#include "xlsx/parts.h"
#include "xlsx/relationships.h"
#include "xlsx/xfile.h"
#include "xlsx/xml_sheet_impl.h"

namespace quire::zip {
class ZipReader;
}

namespace quire {

// An Open XML book: the package in memory as a table of parts, the book itself being the
// workbook part. One template for the transitional and the Strict flavour.
template <class TCHAR, class Tag>
class XMLBookImplT : public IBookT<TCHAR>, public XmlFile<typename XmlFlavour<Tag>::Workbook> {
public:
    using Flavour = XmlFlavour<Tag>;
    using Workbook = typename Flavour::Workbook;
    using Sheet = XMLSheetImplT<TCHAR, Tag>;
    using SheetElement = std::remove_reference_t<decltype(std::declval<Workbook&>().get_sheets().get_sheet(0))>;

    XMLBookImplT();
    ~XMLBookImplT() override;
    XMLBookImplT(const XMLBookImplT&) = delete;
    XMLBookImplT& operator=(const XMLBookImplT&) = delete;

    // ---- IBookT ----
    bool load(const TCHAR* fileName, const TCHAR* tempFile) override;
    bool loadSheet(const TCHAR* fileName, int sheetIndex, const TCHAR* tempFile) override;
    bool loadPartially(const TCHAR* fileName, int sheetIndex, int firstRow, int lastRow,
                       const TCHAR* tempFile) override;
    bool loadInfo(const TCHAR* fileName) override;
    bool save(const TCHAR* fileName, bool useTempFile) override;
    bool loadRaw(const char* data, unsigned size, int sheetIndex, int firstRow, int lastRow) override;
    bool saveRaw(const char** data, unsigned* size) override;
    ISheetT<TCHAR>* addSheet(const TCHAR* name, ISheetT<TCHAR>* initSheet) override;
    ISheetT<TCHAR>* insertSheet(int index, const TCHAR* name, ISheetT<TCHAR>* initSheet) override;
    ISheetT<TCHAR>* getSheet(int index) override;
    const TCHAR* getSheetName(int index) override;
    int sheetType(int index) override;
    bool moveSheet(int srcIndex, int dstIndex) override;
    bool delSheet(int index) override;
    int sheetCount() override;
    IFormatT<TCHAR>* addFormat(IFormatT<TCHAR>* initFormat) override;
    IFontT<TCHAR>* addFont(IFontT<TCHAR>* initFont) override;
    int addCustomNumFormat(const TCHAR* customNumFormat) override;
    const TCHAR* customNumFormat(int fmt) override;
    IFormatT<TCHAR>* format(int index) override;
    int formatSize() override;
    IFontT<TCHAR>* font(int index) override;
    int fontSize() override;
    double datePack(int year, int month, int day, int hour, int min, int sec, int msec) override;
    bool dateUnpack(double value, int* year, int* month, int* day, int* hour, int* min, int* sec,
                    int* msec) override;
    int colorPack(int red, int green, int blue) override;
    void colorUnpack(int color, int* red, int* green, int* blue) override;
    int activeSheet() override;
    void setActiveSheet(int index) override;
    int pictureSize() override;
    int getPicture(int index, const char** data, unsigned* size) override;
    int addPicture(const TCHAR* fileName) override;
    int addPicture2(const char* data, unsigned size) override;
    int addPictureAsLink(const TCHAR* fileName, bool insert) override;
    const TCHAR* defaultFont(int* fontSize) override;
    void setDefaultFont(const TCHAR* fontName, int fontSize) override;
    bool refR1C1() override;
    void setRefR1C1(bool refR1C1) override;
    bool rgbMode() override;
    void setRgbMode(bool rgbMode) override;
    int version() override;
    int biffVersion() override;
    bool isDate1904() override;
    void setDate1904(bool date1904) override;
    bool isTemplate() override;
    void setTemplate(bool tmpl) override;
    bool setLocale(const char* locale) override;
    const char* errorMessage() override;
    void release() override;

    // ---- Toward the sheet, string, style and drawing parts ----
    BookMessage& message() { return message_; }
    XFile* findPart(const std::string& name) const;
    // The table owns the part from then on; a part of that name is destroyed first.
    void insertPart(const std::string& name, std::unique_ptr<XFile> part);
    void removePart(const std::string& name);
    const std::map<std::string, XFile*>& parts() const { return parts_; }
    ContentTypes* contentTypes() const { return contentTypes_; }
    Relationships* workbookRelationships() const { return workbookRels_; }
    // The relationships part of a part, when the table has one; empty otherwise.
    std::string relationshipsPartOf(const std::string& partName) const;
    // Created on first need.
    SharedStrings<Tag>& sharedStrings();
    Styles<Tag>& styles();
    SharedStrings<Tag>* findSharedStrings() const { return sharedStrings_; }
    Styles<Tag>* findStyles() const { return styles_; }
    // Part name of sheet `index` of the workbook.
    std::string sheetPath(int index) const;
    SheetElement& sheetElement(int index);
    int sheetIndexOf(const Sheet* sheet) const;
    bool sheetNameIsFree(const std::wstring& name, int exceptIndex) const;
    int visibleSheetCount() const;
    const std::string& workbookPartName() const { return workbookName_; }
    const std::vector<std::string>& pictureParts() const { return pictures_; }
    bool utf8Mode() const { return locale_.utf8Mode; }
    wchar_t listSeparator() const { return locale_.listSeparator; }
    bool usesR1C1() const { return refR1C1_; }

private:
    struct LoadRequest {
        int sheetIndex = -1;
        int firstRow = -1;
        int lastRow = -1;
        std::string tempFile;
        bool infoOnly = false;
    };

    void clearTable();
    void makeNewBook();
    bool loadFile(const TCHAR* fileName, const LoadRequest& request);
    void loadPackage(zip::ZipReader& archive, const LoadRequest& request);
    void keepOnlySheet(int index);
    void removeSheetElement(int index, bool removeNames);
    void saveTo(const std::string& path, bool inMemory, bool useTempFile);
    void dropCalculationChain();
    std::string makeSheetPath() const;
    std::string narrowFileName(const TCHAR* fileName) const;
    int checkedSheetCount() const;
    template <class Result>
    Result unsupported(Result failure);
    // The styles part with the book's colour mode.
    Styles<Tag>& syncedStyles();

    BookMessage message_;
    std::map<std::string, XFile*> parts_;  // owns every part except the book itself
    std::string workbookName_ = "/xl/workbook.xml";
    ContentTypes* contentTypes_ = nullptr;
    Relationships* workbookRels_ = nullptr;
    SharedStrings<Tag>* sharedStrings_ = nullptr;
    Styles<Tag>* styles_ = nullptr;
    std::vector<std::string> pictures_;
    LocaleSettings locale_;
    bool rgbMode_ = false;
    bool refR1C1_ = false;
    std::basic_string<TCHAR> stringResult_;
    std::string savedBuffer_;
};

extern template class XMLBookImplT<wchar_t, excelNormal_tag>;
extern template class XMLBookImplT<wchar_t, excelStrict_tag>;

}  // namespace quire
