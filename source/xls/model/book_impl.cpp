#include "book_impl.h"

#include <fcntl.h>
#include <sys/mman.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <fstream>

#include "api/dates.h"
#include "api/wide_text.h"
#include "api/book_factory.h"
#include "api/picture_type.h"
#include "api/sheet_names.h"
#include "sheet_impl.h"
#include "workbook_io.h"

namespace quire {
namespace {

// A file's bytes, mapped into memory when it can be (no copy), read otherwise.
class FileBytes {
public:
    FileBytes(const std::string& path, const char* failure) {
        int fd = ::open(path.c_str(), O_RDONLY | O_CLOEXEC);
        if (fd < 0) throw qrerror(failure);
        struct stat info {};
        if (::fstat(fd, &info) != 0 || !S_ISREG(info.st_mode)) {
            ::close(fd);
            throw qrerror(failure);
        }
        size_ = static_cast<size_t>(info.st_size);
        if (size_ > 0) {
            void* mapped = ::mmap(nullptr, size_, PROT_READ, MAP_PRIVATE, fd, 0);
            if (mapped != MAP_FAILED) {
                mapped_ = static_cast<const uint8_t*>(mapped);
            } else {
                try {
                    copy_.resize(size_);
                } catch (...) {
                    ::close(fd);
                    throw;
                }
                size_t done = 0;
                while (done < size_) {
                    ssize_t got = ::read(fd, copy_.data() + done, size_ - done);
                    if (got <= 0) break;
                    done += static_cast<size_t>(got);
                }
                size_ = done;
            }
        }
        ::close(fd);
    }
    ~FileBytes() {
        if (mapped_) ::munmap(const_cast<uint8_t*>(mapped_), size_);
    }
    FileBytes(const FileBytes&) = delete;
    FileBytes& operator=(const FileBytes&) = delete;

    const uint8_t* data() const { return mapped_ ? mapped_ : copy_.data(); }
    size_t size() const { return size_; }

private:
    const uint8_t* mapped_ = nullptr;
    std::vector<uint8_t> copy_;
    size_t size_ = 0;
};

}  // namespace

IBook* createBinaryBook() noexcept {
    try {
        return new BookImplT();
    } catch (...) {
        return nullptr;
    }
}

BookImplT::BookImplT() { resetToNew(); }

BookImplT::~BookImplT() = default;

void BookImplT::resetToNew() {
    sheets_.clear();
    boundSheets_.clear();
    formats_.clear();
    xfIndexes_.clear();
    fonts_.clear();
    numFormats_.clear();
    styles_.clear();
    pictures_.clear();
    palette_ = defaultPalette();
    paletteInUse_.fill(false);
    paletteChanged_ = false;
    sst_.clear();
    activeSheet_ = 0;
    date1904_ = false;
    template_ = false;
    refR1C1_ = false;
    biffVersion_ = 0x0600;
    savedFile_.clear();
    globals_.setDefaults();
    names_.clear();
    externSheets_.clear();
    supBooks_.clear();
    addDefaultStyles();
}

FontImplT* BookImplT::appendFont() {
    fonts_.push_back(std::make_unique<FontImplT>(this));
    return fonts_.back().get();
}

void BookImplT::clearStyles() {
    fonts_.clear();
    formats_.clear();
    xfIndexes_.clear();
    styles_.clear();
}

FormatImplT* BookImplT::appendFormat() {
    formats_.push_back(std::make_unique<FormatImplT>(this));
    FormatImplT* format = formats_.back().get();
    xfIndexes_[static_cast<const IFormatT<wchar_t>*>(format)] = static_cast<int>(formats_.size() - 1);
    return format;
}

void BookImplT::addDefaultStyles() {
    for (int i = 0; i < 5; ++i) appendFont();
    for (int i = 0; i < 21; ++i) appendFormat();
    formats_[1]->ifnt = formats_[2]->ifnt = 1;
    formats_[3]->ifnt = formats_[4]->ifnt = 2;
    formats_[15]->protection = 1;
    struct Builtin { int xf; int ifmt; uint32_t alignment; };
    const Builtin builtins[] = {{16, 44, 0xF8000020}, {17, 42, 0xF8000020}, {18, 9, 0xF8000020},
                                {19, 43, 0xF8000020}, {20, 41, 0}};
    for (const auto& b : builtins) {
        formats_[b.xf]->ifnt = 1;
        formats_[b.xf]->ifmt = static_cast<uint16_t>(b.ifmt);
        formats_[b.xf]->alignment = b.alignment;
    }
    // Currency, Currency [0], Normal, Percent, Comma, Comma [0].
    const std::pair<int, int> styles[] = {{16, 4}, {17, 7}, {0, 0}, {18, 5}, {19, 3}, {20, 6}};
    for (const auto& s : styles) {
        StyleRecord style;
        style.ixfe = static_cast<uint16_t>(0x8000 | s.first);
        style.istyBuiltIn = static_cast<uint8_t>(s.second);
        style.iLevel = 0xFF;
        styles_.push_back(style);
    }
}

std::string BookImplT::narrowFileName(const wchar_t* fileName) const {
    if (!locale_.utf8Mode) {
        size_t needed = std::wcstombs(nullptr, fileName, 0);
        if (needed != static_cast<size_t>(-1)) {
            std::string narrow(needed, '\0');
            std::wcstombs(&narrow[0], fileName, needed + 1);
            return narrow;
        }
    }
    return toUtf8(fileName);  // file names on this platform are UTF-8 whatever the locale says
}

// ---- Loading and saving ----

bool BookImplT::load(const wchar_t* fileName, const wchar_t* tempFile) {
    return loadPartially(fileName, -1, -1, -1, tempFile);
}

bool BookImplT::loadSheet(const wchar_t* fileName, int sheetIndex, const wchar_t* tempFile) {
    return loadPartially(fileName, sheetIndex, -1, -1, tempFile);
}

bool BookImplT::loadPartially(const wchar_t* fileName, int sheetIndex, int firstRow, int lastRow,
                              const wchar_t*) {
    bool loaded = message_.guard(false, [&] {
        resetToNew();
        if (!fileName) throw qrerror("file name name can't be 0");
        FileBytes bytes(narrowFileName(fileName), "can't open file for reading");
        LoadRequest request;
        request.sheetIndex = sheetIndex;
        request.firstRow = firstRow;
        request.lastRow = lastRow;
        readWorkbook(*this, bytes.data(), bytes.size(), request);
        return true;
    });
    if (!loaded) resetToNew();
    return loaded;
}

bool BookImplT::loadInfo(const wchar_t* fileName) {
    bool loaded = message_.guard(false, [&] {
        resetToNew();
        if (!fileName) throw qrerror("file name name can't be 0");
        FileBytes bytes(narrowFileName(fileName), "can't open file for reading");
        LoadRequest request;
        request.infoOnly = true;
        readWorkbook(*this, bytes.data(), bytes.size(), request);
        return true;
    });
    if (!loaded) resetToNew();
    return loaded;
}

bool BookImplT::loadRaw(const char* data, unsigned size, int, int, int) {
    bool loaded = message_.guard(false, [&] {
        resetToNew();
        LoadRequest request;
        request.skipBlanks = false;
        readWorkbook(*this, reinterpret_cast<const uint8_t*>(data), data ? size : 0, request);
        return true;
    });
    if (!loaded) resetToNew();
    return loaded;
}

bool BookImplT::save(const wchar_t* fileName, bool) {
    return message_.guard(false, [&] {
        if (!fileName) throw qrerror("file name can't be 0");
        std::vector<uint8_t> bytes = writeWorkbook(*this);
        std::string path = narrowFileName(fileName);
        std::FILE* out = std::fopen(path.c_str(), "wb");
        if (!out) throw qrerror("can't open file for writing");
        bool written = std::fwrite(bytes.data(), 1, bytes.size(), out) == bytes.size();
        written = (std::fclose(out) == 0) && written;
        if (!written) throw qrerror("can't open file for writing");
        return true;
    });
}

bool BookImplT::saveRaw(const char** data, unsigned* size) {
    return message_.guard(false, [&] {
        savedFile_ = writeWorkbook(*this);
        if (data) *data = reinterpret_cast<const char*>(savedFile_.data());
        if (size) *size = static_cast<unsigned>(savedFile_.size());
        return true;
    });
}

// ---- Sheets ----

SheetImplT* BookImplT::createSheet(int index, const std::wstring& name,
                                   ISheetT<wchar_t>* initSheet) {
    auto sheet = std::make_unique<SheetImplT>(this);
    if (initSheet) sheet->copyFrom(*initSheet);
    BoundSheet8 record;
    record.stName = name;
    boundSheets_.insert(boundSheets_.begin() + index, record);
    try {
        sheets_.insert(sheets_.begin() + index, std::move(sheet));
    } catch (...) {
        boundSheets_.erase(boundSheets_.begin() + index);
        throw;
    }
    SheetImplT* created = sheets_[index].get();
    std::vector<int> moved(sheets_.size() - 1);
    for (size_t i = 0; i < moved.size(); ++i) moved[i] = static_cast<int>(i) < index ? static_cast<int>(i) : static_cast<int>(i) + 1;
    remapSheetReferences(moved);
    if (sheets_.size() == 1) {
        activeSheet_ = 0;
    } else if (index <= activeSheet_) {
        ++activeSheet_;
    }
    created->setSelected(static_cast<int>(index) == activeSheet_);
    return created;
}

ISheetT<wchar_t>* BookImplT::addSheet(const wchar_t* name, ISheetT<wchar_t>* initSheet) {
    return message_.guard<ISheetT<wchar_t>*>(nullptr, [&]() -> ISheetT<wchar_t>* {
        if (boundSheets_.size() != sheets_.size())
            throw qrerror("integrity error: _boundSheets.size() != _sheets.size()");
        return insertSheet(sheetCount(), name, initSheet);
    });
}

ISheetT<wchar_t>* BookImplT::insertSheet(int index, const wchar_t* name,
                                         ISheetT<wchar_t>* initSheet) {
    return message_.guard<ISheetT<wchar_t>*>(nullptr, [&]() -> ISheetT<wchar_t>* {
        if (index < 0 || index > sheetCount()) throw qrerror("index is out of range");
        if (!name) throw qrerror("sheet name can't be 0");
        std::wstring sheetName = name;
        bool cut = utf16Length(sheetName) > kMaxSheetNameUnits;
        if (cut) sheetName = cutToUtf16Units(sheetName, kMaxSheetNameUnits);
        if (!nameIsFree(sheetName, nullptr)) throw qrerror("book already contains such sheet name");
        SheetImplT* sheet = createSheet(index, sheetName, initSheet);
        if (cut) message_.set("warning: sheet's name is cut to 31 characters");
        return sheet;
    });
}

ISheetT<wchar_t>* BookImplT::getSheet(int index) {
    return message_.guard<ISheetT<wchar_t>*>(nullptr, [&]() -> ISheetT<wchar_t>* {
        if (index < 0 || index >= static_cast<int>(sheets_.size()))
            throw qrerror("index is out of range");
        return sheets_[index].get();
    });
}

const wchar_t* BookImplT::getSheetName(int index) {
    return message_.guard<const wchar_t*>(nullptr, [&]() -> const wchar_t* {
        if (index < 0 || index >= static_cast<int>(boundSheets_.size()))
            throw qrerror("index is out of range");
        stringResult_ = boundSheets_[index].stName;
        return stringResult_.c_str();
    });
}

int BookImplT::sheetType(int index) {
    return message_.guard(static_cast<int>(SheetTypeUnknown), [&] {
        if (index < 0 || index >= static_cast<int>(boundSheets_.size()))
            throw qrerror("index is out of range");
        switch (boundSheets_[index].dt) {
            case 0: return static_cast<int>(SheetTypeSheet);
            case 2: return static_cast<int>(SheetTypeChart);
            default: return static_cast<int>(SheetTypeUnknown);
        }
    });
}

bool BookImplT::moveSheet(int srcIndex, int dstIndex) {
    return message_.guard(false, [&] {
        int count = sheetCount();
        if (srcIndex < 0 || srcIndex >= count) throw qrerror("srcIndex is out of range");
        if (dstIndex < 0 || dstIndex > count) throw qrerror("dstIndex is out of range");
        if (srcIndex == dstIndex) throw qrerror("there is no sense: srcIndex is equal to dstIndex");
        if (srcIndex == dstIndex - 1)
            throw qrerror("there is no sense: srcIndex is equal to dstIndex - 1");
        SheetImplT* active = (activeSheet_ >= 0 && activeSheet_ < count) ? sheets_[activeSheet_].get()
                                                                         : nullptr;
        int target = dstIndex > srcIndex ? dstIndex - 1 : dstIndex;
        auto sheet = std::move(sheets_[srcIndex]);
        BoundSheet8 record = boundSheets_[srcIndex];
        sheets_.erase(sheets_.begin() + srcIndex);
        boundSheets_.erase(boundSheets_.begin() + srcIndex);
        sheets_.insert(sheets_.begin() + target, std::move(sheet));
        boundSheets_.insert(boundSheets_.begin() + target, record);
        if (active) activeSheet_ = sheetIndexOf(active);
        std::vector<int> moved(static_cast<size_t>(count));
        for (int i = 0; i < count; ++i) {
            int position = i;
            if (i == srcIndex) position = target;
            else if (srcIndex < target && i > srcIndex && i <= target) position = i - 1;
            else if (target < srcIndex && i >= target && i < srcIndex) position = i + 1;
            moved[i] = position;
        }
        remapSheetReferences(moved);
        return true;
    });
}

bool BookImplT::delSheet(int index) {
    return message_.guard(false, [&] {
        int count = sheetCount();
        if (index < 0 || index >= count) throw qrerror("index is out of range");
        if (count == 1) throw qrerror("can't remove the last sheet in workbook");
        sheets_.erase(sheets_.begin() + index);
        boundSheets_.erase(boundSheets_.begin() + index);
        std::vector<int> moved(static_cast<size_t>(count));
        for (int i = 0; i < count; ++i) moved[i] = i < index ? i : (i == index ? -1 : i - 1);
        remapSheetReferences(moved);
        if (activeSheet_ > index || activeSheet_ >= count - 1) --activeSheet_;
        if (activeSheet_ < 0) activeSheet_ = 0;
        for (int i = 0; i < sheetCount(); ++i) sheets_[i]->setSelected(i == activeSheet_);
        return true;
    });
}

int BookImplT::sheetCount() {
    message_.ok();
    // A book read for information has sheet records but no sheet objects.
    return static_cast<int>(sheets_.empty() ? boundSheets_.size() : sheets_.size());
}

int BookImplT::sheetIndexOf(const SheetImplT* sheet) const {
    for (size_t i = 0; i < sheets_.size(); ++i) {
        if (sheets_[i].get() == sheet) return static_cast<int>(i);
    }
    return -1;
}

bool BookImplT::nameIsFree(const std::wstring& name, const SheetImplT* except) const {
    for (size_t i = 0; i < boundSheets_.size(); ++i) {
        if (i < sheets_.size() && sheets_[i].get() == except) continue;
        if (sameSheetName(boundSheets_[i].stName, name)) return false;
    }
    return true;
}

bool BookImplT::isLastVisibleSheet(const SheetImplT* sheet) const {
    int index = sheetIndexOf(sheet);
    if (index < 0 || boundSheets_[index].hsState != SheetStateVisible) return false;
    for (size_t i = 0; i < boundSheets_.size(); ++i) {
        if (static_cast<int>(i) != index && boundSheets_[i].hsState == SheetStateVisible)
            return false;
    }
    return true;
}

int BookImplT::activeSheet() {
    message_.ok();
    return activeSheet_;
}

void BookImplT::setActiveSheet(int index) {
    message_.guardVoid([&] {
        if (index < 0 || index >= static_cast<int>(sheets_.size()))
            throw qrerror("index is out of range");
        activeSheet_ = index;
        for (size_t i = 0; i < sheets_.size(); ++i) sheets_[i]->setSelected(static_cast<int>(i) == index);
    });
}

// ---- Formats and fonts ----

IFormatT<wchar_t>* BookImplT::addFormat(IFormatT<wchar_t>* initFormat) {
    return message_.guard<IFormatT<wchar_t>*>(nullptr, [&]() -> IFormatT<wchar_t>* {
        FormatImplT* format = appendFormat();
        format->protection = 1;
        if (!initFormat) return format;
        // Colours copy as stored: both books read palette indexes for the duration.
        auto* sourcePrivate = dynamic_cast<IFormatPrivate<wchar_t>*>(initFormat);
        bool sourceRgb = sourcePrivate && sourcePrivate->rgbMode();
        bool ownRgb = rgbMode_;
        rgbMode_ = false;
        if (sourcePrivate) sourcePrivate->setRgbMode(false);
        try {
            format->copyFrom(*initFormat);
        } catch (...) {
            rgbMode_ = ownRgb;
            if (sourcePrivate) sourcePrivate->setRgbMode(sourceRgb);
            throw;
        }
        rgbMode_ = ownRgb;
        if (sourcePrivate) sourcePrivate->setRgbMode(sourceRgb);
        message_.ok();
        return format;
    });
}

FontImplT* BookImplT::addFontCopy(IFontT<wchar_t>* source) {
    FontImplT* font = appendFont();
    if (source) font->copyFrom(*source);
    return font;
}

IFontT<wchar_t>* BookImplT::addFont(IFontT<wchar_t>* initFont) {
    return message_.guard<IFontT<wchar_t>*>(nullptr, [&]() -> IFontT<wchar_t>* {
        FontImplT* font = addFontCopy(initFont);
        message_.ok();
        return font;
    });
}

int BookImplT::addCustomNumFormat(const wchar_t* customNumFormat) {
    return message_.guard(0, [&] {
        if (!customNumFormat) throw qrerror("custom number format can't be 0");
        int id = numFormats_.add(customNumFormat, kFirstBinaryCustomNumFormat);
        if (id == 0) throw qrerror("maximum number of custom formats is exceeded");
        return id;
    });
}

const wchar_t* BookImplT::customNumFormat(int fmt) {
    return message_.guard<const wchar_t*>(nullptr, [&]() -> const wchar_t* {
        const std::wstring* text = numFormats_.find(fmt);
        if (!text) throw qrerror("custom number format not found");
        stringResult_ = *text;
        return stringResult_.c_str();
    });
}

IFormatT<wchar_t>* BookImplT::format(int index) {
    return message_.guard<IFormatT<wchar_t>*>(nullptr, [&]() -> IFormatT<wchar_t>* {
        if (index < 0 || index >= static_cast<int>(formats_.size()))
            throw qrerror("index is out of range");
        return formats_[index].get();
    });
}

int BookImplT::formatSize() {
    message_.ok();
    return static_cast<int>(formats_.size());
}

IFontT<wchar_t>* BookImplT::font(int index) {
    return message_.guard<IFontT<wchar_t>*>(nullptr, [&]() -> IFontT<wchar_t>* {
        if (index < 0 || index >= static_cast<int>(fonts_.size()))
            throw qrerror("index is out of range");
        return fonts_[index].get();
    });
}

int BookImplT::fontSize() {
    message_.ok();
    return static_cast<int>(fonts_.size());
}

FontImplT* BookImplT::fontByFileIndex(int fileIndex) {
    if (fileIndex == 4 || fileIndex < 0) return nullptr;
    int position = fileIndex < 4 ? fileIndex : fileIndex - 1;
    if (position >= static_cast<int>(fonts_.size())) return nullptr;
    return fonts_[position].get();
}

int BookImplT::fileIndexOfFont(const IFontT<wchar_t>* font) const {
    for (size_t i = 0; i < fonts_.size(); ++i) {
        if (static_cast<const IFontT<wchar_t>*>(fonts_[i].get()) == font)
            return fileIndexForPosition(static_cast<int>(i));
    }
    return -1;
}

int BookImplT::xfIndexOf(const IFormatT<wchar_t>* format) const {
    auto found = xfIndexes_.find(format);
    return found == xfIndexes_.end() ? -1 : found->second;
}

FormatImplT* BookImplT::formatAt(int xfIndex) {
    if (xfIndex < 0 || xfIndex >= static_cast<int>(formats_.size())) return nullptr;
    return formats_[xfIndex].get();
}

const wchar_t* BookImplT::defaultFont(int* fontSize) {
    return message_.guard<const wchar_t*>(nullptr, [&]() -> const wchar_t* {
        if (fonts_.empty()) throw qrerror("fonts is empty");
        if (fontSize) *fontSize = fonts_[0]->size();
        stringResult_ = fonts_[0]->fontName;
        return stringResult_.c_str();
    });
}

void BookImplT::setDefaultFont(const wchar_t* fontName, int fontSize) {
    message_.guardVoid([&] {
        if (fonts_.empty()) throw qrerror("fonts is empty");
        if (fontName) fonts_[0]->fontName = fontName;
        fonts_[0]->setSize(fontSize);
    });
}

// ---- Dates and colours ----

double BookImplT::datePack(int year, int month, int day, int hour, int min, int sec, int msec) {
    message_.ok();
    return quire::datePack(date1904_, year, month, day, hour, min, sec, msec);
}

bool BookImplT::dateUnpack(double value, int* year, int* month, int* day, int* hour, int* min,
                           int* sec, int* msec) {
    if (!quire::dateUnpack(date1904_, value, year, month, day, hour, min, sec, msec)) return false;
    message_.ok();
    return true;
}

int BookImplT::colorPack(int red, int green, int blue) {
    message_.ok();
    paletteChanged_ = true;
    uint32_t wanted = packRgbWord(red, green, blue);
    for (int i = 0; i < kPaletteSize; ++i) {
        if (palette_[i] == wanted) {
            paletteInUse_[i] = true;
            return i + kPaletteFirstIndex;
        }
    }
    for (int i = 0; i < kPaletteSize; ++i) {
        if (!paletteInUse_[i]) {
            palette_[i] = wanted;
            paletteInUse_[i] = true;
            return i + kPaletteFirstIndex;
        }
    }
    message_.set("no free color index, limit is reached for xls format");
    return ColorAuto;
}

void BookImplT::colorUnpack(int color, int* red, int* green, int* blue) {
    int entry = color - kPaletteFirstIndex;
    if (entry < 0 || entry >= kPaletteSize) {
        message_.set("invalid vector<T> subscript");
        return;
    }
    uint32_t word = palette_[entry];
    if (red) *red = static_cast<int>(word & 0xFF);
    if (green) *green = static_cast<int>((word >> 8) & 0xFF);
    if (blue) *blue = static_cast<int>((word >> 16) & 0xFF);
    message_.ok();
}

// ---- Pictures ----

int BookImplT::pictureSize() {
    message_.ok();
    return static_cast<int>(pictures_.size());
}

int BookImplT::getPicture(int index, const char** data, unsigned* size) {
    return message_.guard(static_cast<int>(PictureTypeError), [&] {
        if (index < 0 || index >= static_cast<int>(pictures_.size()))
            throw qrerror("index is out of range");
        const BookPicture& picture = pictures_[index];
        if (data) *data = picture.data.data();
        if (size) *size = static_cast<unsigned>(picture.data.size());
        return picture.type;
    });
}

int BookImplT::addPicture(const wchar_t* fileName) {
    return message_.guard(-1, [&] {
        if (!fileName) throw qrerror("file name can't be 0");
        FileBytes bytes(narrowFileName(fileName), "can't open file");
        if (bytes.size() == 0) throw qrerror("picture is empty");
        return addPicture2(reinterpret_cast<const char*>(bytes.data()), static_cast<unsigned>(bytes.size()));
    });
}

int BookImplT::addPicture2(const char* data, unsigned size) {
    return message_.guard(-1, [&] {
        if (!data || size == 0) throw qrerror("picture is empty");
        int type = detectPictureType(reinterpret_cast<const unsigned char*>(data), size);
        if (type == PictureTypeError) throw qrerror("unknown picture format");
        BookPicture picture;
        picture.type = type;
        picture.data.assign(data, data + size);
        pictures_.push_back(std::move(picture));
        return static_cast<int>(pictures_.size() - 1);
    });
}

int BookImplT::addPictureAsLink(const wchar_t*, bool) {
    message_.set("function is not supported for xls files");
    return -1;
}

// ---- Book-wide settings ----

bool BookImplT::refR1C1() {
    message_.ok();
    return sheets_.empty() ? refR1C1_ : sheets_[0]->refR1C1();
}

void BookImplT::setRefR1C1(bool refR1C1) {
    message_.ok();
    refR1C1_ = refR1C1;
    for (auto& sheet : sheets_) sheet->setRefR1C1Mode(refR1C1);
}

int BookImplT::version() {
    message_.ok();
    return kLibraryVersion;
}

int BookImplT::biffVersion() {
    message_.ok();
    return biffVersion_;
}

bool BookImplT::isDate1904() {
    message_.ok();
    return date1904_;
}

void BookImplT::setDate1904(bool date1904) {
    message_.ok();
    date1904_ = date1904;
}

bool BookImplT::isTemplate() {
    message_.ok();
    return template_;
}

void BookImplT::setTemplate(bool tmpl) {
    message_.ok();
    template_ = tmpl;
}

bool BookImplT::setLocale(const char* locale) {
    return message_.guard(false, [&] {
        applyLocale(locale_, locale);
        return true;
    });
}

void BookImplT::release() { delete this; }

}  // namespace quire
