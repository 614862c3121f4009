#pragma once
#include <array>
#include <cstdint>
#include <memory>
#include <string>
#include <unordered_map>
#include <vector>

#include "api/IBookT.h"
#include "api/book_message.h"
#include "api/enums.h"
#include "api/locale_settings.h"
#include "api/number_formats.h"
#include "api/palette.h"
#include "cell_store.h"
#include "defined_names.h"
#include "font_impl.h"
#include "format_impl.h"
#include "shared_string_table.h"
#include "workbook_globals.h"

namespace quire {

class SheetImplT;

// The sheet record of the workbook globals: name, visibility and kind of one sheet.
struct BoundSheet8 {
    uint32_t lbPlyPos = 0;
    uint8_t hsState = 0;   // SheetState
    uint8_t dt = 0;        // 0 worksheet, 2 chart, 1 macro sheet, 6 VBA module
    std::wstring stName;
};

// A Style record with the StyleExt records that follow it.
struct StyleRecord {
    uint16_t ixfe = 0;             // bits 0-11 XF index, bit 15 fBuiltIn
    uint8_t istyBuiltIn = 0;
    uint8_t iLevel = 0xFF;
    std::wstring name;             // user-defined styles only
    std::vector<KeptRecord> extensions;

    bool builtIn() const { return (ixfe & 0x8000) != 0; }
};

// A picture of the book: its bytes and detected type.
struct BookPicture {
    int type = 0;
    std::vector<char> data;
};

// The binary (.xls) workbook.
class BookImplT : public IBookT<wchar_t> {
public:
    BookImplT();
    ~BookImplT() override;

    // IBookT
    bool load(const wchar_t* fileName, const wchar_t* tempFile) override;
    bool loadSheet(const wchar_t* fileName, int sheetIndex, const wchar_t* tempFile) override;
    bool loadPartially(const wchar_t* fileName, int sheetIndex, int firstRow, int lastRow,
                       const wchar_t* tempFile) override;
    bool loadInfo(const wchar_t* fileName) override;
    bool save(const wchar_t* fileName, bool useTempFile) override;
    bool loadRaw(const char* data, unsigned size, int sheetIndex, int firstRow,
                 int lastRow) override;
    bool saveRaw(const char** data, unsigned* size) override;
    ISheetT<wchar_t>* addSheet(const wchar_t* name, ISheetT<wchar_t>* initSheet) override;
    ISheetT<wchar_t>* insertSheet(int index, const wchar_t* name,
                                  ISheetT<wchar_t>* initSheet) override;
    ISheetT<wchar_t>* getSheet(int index) override;
    const wchar_t* getSheetName(int index) override;
    int sheetType(int index) override;
    bool moveSheet(int srcIndex, int dstIndex) override;
    bool delSheet(int index) override;
    int sheetCount() override;
    IFormatT<wchar_t>* addFormat(IFormatT<wchar_t>* initFormat) override;
    IFontT<wchar_t>* addFont(IFontT<wchar_t>* initFont) override;
    int addCustomNumFormat(const wchar_t* customNumFormat) override;
    const wchar_t* customNumFormat(int fmt) override;
    IFormatT<wchar_t>* format(int index) override;
    int formatSize() override;
    IFontT<wchar_t>* font(int index) override;
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
    int addPicture(const wchar_t* fileName) override;
    int addPicture2(const char* data, unsigned size) override;
    int addPictureAsLink(const wchar_t* fileName, bool insert) override;
    const wchar_t* defaultFont(int* fontSize) override;
    void setDefaultFont(const wchar_t* fontName, int fontSize) override;
    bool refR1C1() override;
    void setRefR1C1(bool refR1C1) override;
    bool rgbMode() override { return rgbMode_; }
    void setRgbMode(bool rgbMode) override { rgbMode_ = rgbMode; }
    int version() override;
    int biffVersion() override;
    bool isDate1904() override;
    void setDate1904(bool date1904) override;
    bool isTemplate() override;
    void setTemplate(bool tmpl) override;
    bool setLocale(const char* locale) override;
    const char* errorMessage() override { return message_.c_str(); }
    void release() override;

    // Engine side.
    BookMessage& message() { return message_; }
    bool rgbMode() const { return rgbMode_; }
    NumFormatRegistry& numFormats() { return numFormats_; }
    SharedStringTable& sharedStrings() { return sst_; }
    wchar_t listSeparator() const { return locale_.listSeparator; }
    bool date1904() const { return date1904_; }

    // Fonts by the index the file uses (index 4 never names a font).
    FontImplT* fontByFileIndex(int fileIndex);
    int fileIndexOfFont(const IFontT<wchar_t>* font) const;
    static int fileIndexForPosition(int position) { return position < 4 ? position : position + 1; }
    FontImplT* addFontCopy(IFontT<wchar_t>* source);

    // XF index of a format of this book, -1 for any other pointer.
    int xfIndexOf(const IFormatT<wchar_t>* format) const;
    FormatImplT* formatAt(int xfIndex);

    int sheetIndexOf(const SheetImplT* sheet) const;
    BoundSheet8& boundSheet(int index) { return boundSheets_.at(index); }
    SheetImplT* sheetAt(int index) { return sheets_.at(index).get(); }
    // True when no other sheet than `except` has this name (A to Z compared without case).
    bool nameIsFree(const std::wstring& name, const SheetImplT* except) const;
    // True when the sheet is the only one not hidden.
    bool isLastVisibleSheet(const SheetImplT* sheet) const;

    // Back to the state of a new book: no sheets, the default fonts, formats and styles.
    void resetToNew();

    // Lists as stored, for the file reader and writer.
    std::vector<std::unique_ptr<FontImplT>>& fonts() { return fonts_; }
    std::vector<std::unique_ptr<FormatImplT>>& formats() { return formats_; }
    std::vector<StyleRecord>& styles() { return styles_; }
    std::vector<BoundSheet8>& boundSheets() { return boundSheets_; }
    std::vector<std::unique_ptr<SheetImplT>>& sheets() { return sheets_; }
    std::array<uint32_t, kPaletteSize>& palette() { return palette_; }
    bool paletteChanged() const { return paletteChanged_; }
    void setPaletteChanged(bool changed) { paletteChanged_ = changed; }
    void setBiffVersion(int version) { biffVersion_ = version; }
    WorkbookGlobals& globals() { return globals_; }
    std::vector<DefinedName>& names() { return names_; }
    std::vector<XtiEntry>& externSheets() { return externSheets_; }
    std::vector<SupBookBlock>& supBooks() { return supBooks_; }
    // The XTI index of sheets first..last of this book, added (with the self-reference SupBook)
    // when missing and `create` is set; -1 otherwise.
    int externSheetIndex(int firstSheet, int lastSheet, bool create);
    // The sheet an XTI entry of this book names when it names exactly one; -1 otherwise.
    int sheetOfExternSheet(unsigned xti) const;
    // Follows a change of sheet positions: oldToNew[i] is the new index of sheet i, -1 if deleted.
    void remapSheetReferences(const std::vector<int>& oldToNew);
    void setActiveSheetIndex(int index) { activeSheet_ = index; }
    void setTemplateFlag(bool tmpl) { template_ = tmpl; }
    void setDate1904Flag(bool date1904) { date1904_ = date1904; }
    std::vector<BookPicture>& pictures() { return pictures_; }
    FormatImplT* appendFormat();
    // Drops fonts, formats and styles, for a file that brings its own.
    void clearStyles();
    FontImplT* appendFont();

private:
    void addDefaultStyles();
    SheetImplT* createSheet(int index, const std::wstring& name, ISheetT<wchar_t>* initSheet);
    std::string narrowFileName(const wchar_t* fileName) const;

    BookMessage message_;
    std::vector<BoundSheet8> boundSheets_;
    std::vector<std::unique_ptr<SheetImplT>> sheets_;
    std::vector<std::unique_ptr<FormatImplT>> formats_;
    std::unordered_map<const void*, int> xfIndexes_;
    std::vector<std::unique_ptr<FontImplT>> fonts_;
    NumFormatRegistry numFormats_;
    std::vector<StyleRecord> styles_;
    std::vector<BookPicture> pictures_;
    std::array<uint32_t, kPaletteSize> palette_{};
    std::array<bool, kPaletteSize> paletteInUse_{};
    bool paletteChanged_ = false;
    SharedStringTable sst_;
    WorkbookGlobals globals_;
    std::vector<DefinedName> names_;
    std::vector<XtiEntry> externSheets_;
    std::vector<SupBookBlock> supBooks_;
    int activeSheet_ = 0;
    bool date1904_ = false;
    bool template_ = false;
    bool rgbMode_ = false;
    bool refR1C1_ = false;
    int biffVersion_ = 0x0600;
    LocaleSettings locale_;
    std::wstring stringResult_;
    std::vector<uint8_t> savedFile_;
};

}  // namespace quire
