#include "xlsx/xml_book_impl.h"
#include "xlsx/xml_font_impl.h"
#include "xlsx/xml_format_impl.h"

#include <algorithm>
#include <clocale>
#include <cstdio>
#include <cstdlib>
#include <cstring>

#include "api/dates.h"
#include "api/enums.h"
#include "api/palette.h"
#include "api/picture_type.h"
#include "api/sheet_names.h"
#include "api/wide_text.h"
#include "xlsx/numeric_locale.h"
#include "xlsx/package_names.h"
#include "zip/ZipReader.h"
#include "zip/ZipWriter.h"

namespace quire {
namespace {

constexpr const char* kNotYet = "not supported yet";

bool isWorkbookType(const std::string& type) {
    return type == package::kXlsxMain || type == package::kXlsmMain || type == package::kXltxMain ||
           type == package::kXltmMain;
}

std::string withoutLeadingSlash(const std::string& name) { return name.substr(1); }

// A temporary file that is removed when the operation ends, however it ends.
struct TempFileGuard {
    std::string path;
    ~TempFileGuard() {
        if (!path.empty()) std::remove(path.c_str());
    }
};

}  // namespace

template <class TCHAR, class Tag>
XMLBookImplT<TCHAR, Tag>::XMLBookImplT() : XmlFile<Workbook>("workbook") {
    makeNewBook();
}

template <class TCHAR, class Tag>
XMLBookImplT<TCHAR, Tag>::~XMLBookImplT() {
    clearTable();
}

template <class TCHAR, class Tag>
void XMLBookImplT<TCHAR, Tag>::clearTable() {
    for (auto& entry : parts_)
        if (entry.second != this) delete entry.second;
    parts_.clear();
    contentTypes_ = nullptr;
    workbookRels_ = nullptr;
    sharedStrings_ = nullptr;
    styles_ = nullptr;
    pictures_.clear();
}

template <class TCHAR, class Tag>
void XMLBookImplT<TCHAR, Tag>::makeNewBook() {
    clearTable();
    this->document().reset();
    workbookName_ = package::kWorkbookPart;

    auto workbookRels = std::make_unique<Relationships>();
    workbookRels_ = workbookRels.get();
    insertPart("/xl/_rels/workbook.xml.rels", std::move(workbookRels));

    auto packageRels = std::make_unique<Relationships>();
    packageRels->add(package::kRelOfficeDocument, "xl/workbook.xml");
    insertPart("/_rels/.rels", std::move(packageRels));

    this->document().get_workbookPr();
    parts_[workbookName_] = this;

    auto types = std::make_unique<ContentTypes>();
    types->addDefault("rels", package::kRelationshipsType);
    types->addDefault("xml", package::kXmlType);
    types->setOverride(workbookName_, package::kXlsxMain);
    contentTypes_ = types.get();
    insertPart(package::kContentTypesPart, std::move(types));

    styles();
}

// ---- Part table ----

template <class TCHAR, class Tag>
XFile* XMLBookImplT<TCHAR, Tag>::findPart(const std::string& name) const {
    const auto found = parts_.find(name);
    return found == parts_.end() ? nullptr : found->second;
}

template <class TCHAR, class Tag>
void XMLBookImplT<TCHAR, Tag>::insertPart(const std::string& name, std::unique_ptr<XFile> part) {
    removePart(name);
    parts_[name] = part.release();
}

template <class TCHAR, class Tag>
void XMLBookImplT<TCHAR, Tag>::removePart(const std::string& name) {
    const auto found = parts_.find(name);
    if (found == parts_.end() || found->second == this) return;
    XFile* part = found->second;
    if (part == contentTypes_) contentTypes_ = nullptr;
    if (part == workbookRels_) workbookRels_ = nullptr;
    if (part == sharedStrings_) sharedStrings_ = nullptr;
    if (part == styles_) styles_ = nullptr;
    pictures_.erase(std::remove(pictures_.begin(), pictures_.end(), name), pictures_.end());
    parts_.erase(found);
    delete part;
}

template <class TCHAR, class Tag>
std::string XMLBookImplT<TCHAR, Tag>::relationshipsPartOf(const std::string& partName) const {
    const std::string name = package::relationshipsPartName(partName);
    return findPart(name) ? name : std::string();
}

template <class TCHAR, class Tag>
SharedStrings<Tag>& XMLBookImplT<TCHAR, Tag>::sharedStrings() {
    if (!sharedStrings_) {
        if (!contentTypes_) throw qrerror("workbook content types are not found");
        if (!workbookRels_) throw qrerror("workbook relationships are not found");
        auto part = std::make_unique<SharedStrings<Tag>>();
        auto* strings = part.get();
        insertPart(package::kSharedStringsPart, std::move(part));
        contentTypes_->setOverride(package::kSharedStringsPart, package::kSharedStringsType);
        workbookRels_->add(package::kRelSharedStrings, "sharedStrings.xml");
        sharedStrings_ = strings;
    }
    return *sharedStrings_;
}

template <class TCHAR, class Tag>
Styles<Tag>& XMLBookImplT<TCHAR, Tag>::styles() {
    if (!styles_) {
        if (!contentTypes_) throw qrerror("workbook content types are not found");
        if (!workbookRels_) throw qrerror("workbook relationships are not found");
        auto part = std::make_unique<Styles<Tag>>();
        part->makeDefault();
        auto* styles = part.get();
        insertPart(package::kStylesPart, std::move(part));
        contentTypes_->setOverride(package::kStylesPart, package::kStylesType);
        workbookRels_->add(package::kRelStyles, "styles.xml");
        styles_ = styles;
    }
    return *styles_;
}

// ---- Sheets in the workbook ----

template <class TCHAR, class Tag>
int XMLBookImplT<TCHAR, Tag>::checkedSheetCount() const {
    const auto* sheets = this->document().find_sheets();
    return sheets ? static_cast<int>(sheets->size_sheet()) : 0;
}

template <class TCHAR, class Tag>
typename XMLBookImplT<TCHAR, Tag>::SheetElement& XMLBookImplT<TCHAR, Tag>::sheetElement(int index) {
    if (index < 0 || index >= checkedSheetCount()) throw qrerror("sheet index is out of range");
    return this->document().get_sheets().get_sheet(static_cast<std::size_t>(index));
}

template <class TCHAR, class Tag>
std::string XMLBookImplT<TCHAR, Tag>::sheetPath(int index) const {
    if (index < 0 || index >= checkedSheetCount()) throw qrerror("index is out of range");
    if (!workbookRels_) throw qrerror("workbook relationships are not found");
    const auto& sheet = this->document().find_sheets()->get_sheet(static_cast<std::size_t>(index));
    const std::string target = workbookRels_->target(toUtf8(sheet.get_id()));
    if (target.empty()) return {};
    return package::resolveWorkbookTarget(target);
}

template <class TCHAR, class Tag>
int XMLBookImplT<TCHAR, Tag>::sheetIndexOf(const Sheet* sheet) const {
    const int count = checkedSheetCount();
    for (int i = 0; i < count; ++i) {
        const std::string path = sheetPath(i);
        if (!path.empty() && findPart(path) == sheet) return i;
    }
    return -1;
}

template <class TCHAR, class Tag>
bool XMLBookImplT<TCHAR, Tag>::sheetNameIsFree(const std::wstring& name, int exceptIndex) const {
    const int count = checkedSheetCount();
    for (int i = 0; i < count; ++i) {
        if (i == exceptIndex) continue;
        if (sameSheetName(this->document().find_sheets()->get_sheet(static_cast<std::size_t>(i)).get_name(), name))
            return false;
    }
    return true;
}

template <class TCHAR, class Tag>
int XMLBookImplT<TCHAR, Tag>::visibleSheetCount() const {
    int visible = 0;
    const int count = checkedSheetCount();
    for (int i = 0; i < count; ++i) {
        const auto& sheet = this->document().find_sheets()->get_sheet(static_cast<std::size_t>(i));
        if (!sheet.isset_state() || sheet.get_state() == 0) ++visible;
    }
    return visible;
}

template <class TCHAR, class Tag>
std::string XMLBookImplT<TCHAR, Tag>::makeSheetPath() const {
    if (!workbookRels_) throw qrerror("makeSheetPath error: workbook relationships are not found");
    std::vector<std::wstring> used;
    const auto& rels = workbookRels_->document();
    for (std::size_t i = 0; i < rels.size_Relationship(); ++i)
        if (rels.get_Relationship(i).get_Type() == fromUtf8(package::kRelWorksheet))
            used.push_back(rels.get_Relationship(i).get_Target());
    for (int n = 1;; ++n) {
        const std::string candidate = "worksheets/sheet" + std::to_string(n) + ".xml";
        const std::wstring wide = fromUtf8(candidate);
        // A part of that name left by another writer must not be overwritten either.
        if (std::find(used.begin(), used.end(), wide) == used.end() && !findPart("/xl/" + candidate))
            return "/xl/" + candidate;
    }
}

template <class TCHAR, class Tag>
ISheetT<TCHAR>* XMLBookImplT<TCHAR, Tag>::addSheet(const TCHAR* name, ISheetT<TCHAR>* initSheet) {
    return insertSheet(sheetCount(), name, initSheet);
}

template <class TCHAR, class Tag>
ISheetT<TCHAR>* XMLBookImplT<TCHAR, Tag>::insertSheet(int index, const TCHAR* name, ISheetT<TCHAR>* initSheet) {
    return message_.guard<ISheetT<TCHAR>*>(nullptr, [&]() -> ISheetT<TCHAR>* {
        const int count = checkedSheetCount();
        if (index < 0 || index > count) throw qrerror("index is out of range");
        if (!name) throw qrerror("sheet name can't be 0");
        bool cut = false;
        const std::wstring sheetName = fitSheetName(name, cut);
        if (!sheetNameIsFree(sheetName, -1)) throw qrerror("book already contains such sheet name");
        if (!contentTypes_) throw qrerror("workbook content types are not found");
        if (!workbookRels_) throw qrerror("workbook relationships are not found");

        auto part = std::make_unique<Sheet>();
        auto* source = dynamic_cast<Sheet*>(initSheet);
        if (source) {
            part->document() = source->document();
            // The copy cannot share the source's drawings, tables or links: their parts belong
            // to the source sheet.
            auto& ws = part->document();
            ws.unset_drawing();
            ws.unset_legacyDrawing();
            ws.unset_legacyDrawingHF();
            ws.unset_picture();
            ws.unset_tableParts();
            ws.unset_oleObjects();
            ws.unset_controls();
            ws.unset_hyperlinks();
            // Printer settings are a part of the source sheet as well.
            if (auto* pageSetup = ws.find_pageSetup()) pageSetup->unset_id();
        } else {
            if (initSheet) throw qrerror("sheet of another kind of book can't be copied yet");
            part->makeEmpty();
        }
        const std::string path = makeSheetPath();
        Sheet* sheet = part.get();
        insertPart(path, std::move(part));
        contentTypes_->setOverride(path, package::kWorksheetType);
        const std::string id = workbookRels_->add(package::kRelWorksheet, path.substr(4));

        std::uint32_t sheetId = 0;
        auto& sheets = this->document().get_sheets();
        for (std::size_t i = 0; i < sheets.size_sheet(); ++i)
            sheetId = std::max(sheetId, sheets.get_sheet(i).get_sheetId());
        auto& element = sheets.insert_sheet(static_cast<std::size_t>(index));
        element.set_name(sheetName);
        element.set_sheetId(sheetId + 1);
        element.set_id(fromUtf8(id));
        sheet->bind(this);

        // Later sheets move up by one: the active tab and the scopes of names follow them.
        if (auto* views = this->document().find_bookViews()) {
            for (std::size_t i = 0; i < views->size_workbookView(); ++i) {
                auto& view = views->get_workbookView(i);
                if (count > 0 && static_cast<int>(view.get_activeTab()) >= index)
                    view.set_activeTab(view.get_activeTab() + 1);
            }
        }
        if (auto* names = this->document().find_definedNames()) {
            const std::size_t existing = names->size_definedName();
            for (std::size_t i = 0; i < existing; ++i) {
                auto& definedName = names->get_definedName(i);
                if (!definedName.isset_localSheetId()) continue;
                const int scope = static_cast<int>(definedName.get_localSheetId());
                if (scope >= index) definedName.set_localSheetId(static_cast<std::uint32_t>(scope + 1));
            }
            if (source) {
                const int sourceIndex = sheetIndexOf(source);
                for (std::size_t i = 0; i < existing; ++i) {
                    const auto copy = names->get_definedName(i);
                    if (copy.isset_localSheetId() && static_cast<int>(copy.get_localSheetId()) == sourceIndex) {
                        auto& added = names->append_definedName();
                        added = copy;
                        added.set_localSheetId(static_cast<std::uint32_t>(index));
                    }
                }
            }
        }
        if (cut) message_.set("warning: sheet's name is cut to 31 characters");
        return sheet;
    });
}

template <class TCHAR, class Tag>
ISheetT<TCHAR>* XMLBookImplT<TCHAR, Tag>::getSheet(int index) {
    return message_.guard<ISheetT<TCHAR>*>(nullptr, [&]() -> ISheetT<TCHAR>* {
        if (index < 0 || index >= checkedSheetCount()) throw qrerror("sheet not found");
        auto* sheet = dynamic_cast<Sheet*>(findPart(sheetPath(index)));
        if (!sheet) throw qrerror("sheet not found");
        sheet->bind(this);
        return sheet;
    });
}

template <class TCHAR, class Tag>
const TCHAR* XMLBookImplT<TCHAR, Tag>::getSheetName(int index) {
    return message_.guard<const TCHAR*>(nullptr, [&]() -> const TCHAR* {
        stringResult_ = sheetElement(index).get_name();
        return stringResult_.c_str();
    });
}

template <class TCHAR, class Tag>
int XMLBookImplT<TCHAR, Tag>::sheetType(int index) {
    return message_.guard<int>(2, [&]() -> int {
        if (index < 0 || index >= checkedSheetCount()) throw qrerror("sheet not found");
        XFile* part = findPart(sheetPath(index));
        if (!part) throw qrerror("sheet not found");
        if (dynamic_cast<Sheet*>(part)) return 0;
        if (dynamic_cast<XMLChartSheet*>(part)) return 1;
        return 2;
    });
}

template <class TCHAR, class Tag>
int XMLBookImplT<TCHAR, Tag>::sheetCount() {
    message_.ok();
    return checkedSheetCount();
}

template <class TCHAR, class Tag>
bool XMLBookImplT<TCHAR, Tag>::moveSheet(int srcIndex, int dstIndex) {
    return message_.guard(false, [&]() -> bool {
        const int count = checkedSheetCount();
        if (srcIndex < 0 || srcIndex >= count) throw qrerror("srcIndex is out of range");
        if (dstIndex < 0 || dstIndex > count) throw qrerror("dstIndex is out of range");
        if (srcIndex == dstIndex) throw qrerror("there is no sense: srcIndex is equal to dstIndex");
        if (srcIndex == dstIndex - 1) throw qrerror("there is no sense: srcIndex is equal to dstIndex - 1");
        const int finalIndex = dstIndex > srcIndex ? dstIndex - 1 : dstIndex;
        auto& sheets = this->document().get_sheets();
        const SheetElement moved = sheets.get_sheet(static_cast<std::size_t>(srcIndex));
        sheets.delete_sheet(static_cast<std::size_t>(srcIndex));
        sheets.insert_sheet(static_cast<std::size_t>(finalIndex)) = moved;
        // Every index between the two places shifts by one toward the old place.
        auto newIndex = [&](int old) {
            if (old == srcIndex) return finalIndex;
            if (srcIndex < finalIndex && old > srcIndex && old <= finalIndex) return old - 1;
            if (finalIndex < srcIndex && old >= finalIndex && old < srcIndex) return old + 1;
            return old;
        };
        if (auto* names = this->document().find_definedNames()) {
            for (std::size_t i = 0; i < names->size_definedName(); ++i) {
                auto& definedName = names->get_definedName(i);
                if (definedName.isset_localSheetId())
                    definedName.set_localSheetId(
                        static_cast<std::uint32_t>(newIndex(static_cast<int>(definedName.get_localSheetId()))));
            }
        }
        return true;
    });
}

template <class TCHAR, class Tag>
void XMLBookImplT<TCHAR, Tag>::removeSheetElement(int index, bool removeNames) {
    auto& sheets = this->document().get_sheets();
    const std::wstring name = sheets.get_sheet(static_cast<std::size_t>(index)).get_name();
    if (auto* names = this->document().find_definedNames()) {
        for (std::size_t i = names->size_definedName(); i > 0; --i) {
            auto& definedName = names->get_definedName(i - 1);
            bool remove = false;
            if (removeNames) {
                // The sheet named before "!", quoted or not.
                const std::wstring& text = definedName.get_value();
                const std::size_t bang = text.find(L'!');
                if (bang != std::wstring::npos) {
                    std::wstring referenced = text.substr(0, bang);
                    if (referenced.size() >= 2 && referenced.front() == L'\'' && referenced.back() == L'\'') {
                        referenced = referenced.substr(1, referenced.size() - 2);
                        std::wstring unquoted;
                        for (std::size_t k = 0; k < referenced.size(); ++k) {
                            unquoted += referenced[k];
                            if (referenced[k] == L'\'' && k + 1 < referenced.size() && referenced[k + 1] == L'\'') ++k;
                        }
                        referenced = unquoted;
                    }
                    remove = sameSheetName(referenced, name);
                }
            }
            if (definedName.isset_localSheetId()) {
                const int scope = static_cast<int>(definedName.get_localSheetId());
                // A name scoped to the removed sheet has no sheet left to belong to.
                if (scope == index) remove = true;
                if (!remove && scope > index) definedName.set_localSheetId(static_cast<std::uint32_t>(scope - 1));
            }
            if (remove) names->delete_definedName(i - 1);
        }
        if (names->size_definedName() == 0) this->document().unset_definedNames();
    }
    sheets.delete_sheet(static_cast<std::size_t>(index));
}

template <class TCHAR, class Tag>
bool XMLBookImplT<TCHAR, Tag>::delSheet(int index) {
    return message_.guard(false, [&]() -> bool {
        const int count = checkedSheetCount();
        if (index < 0 || index >= count) throw qrerror("index is out of range");
        if (count == 1) throw qrerror("can't remove the last sheet in workbook");
        const std::string path = sheetPath(index);
        const std::string id = toUtf8(sheetElement(index).get_id());
        if (!path.empty()) removePart(package::relationshipsPartName(path));
        removeSheetElement(index, true);
        if (contentTypes_ && !path.empty()) contentTypes_->removeOverride(path);
        if (workbookRels_) workbookRels_->removeById(id);
        if (!path.empty()) removePart(path);
        if (auto* views = this->document().find_bookViews()) {
            for (std::size_t i = 0; i < views->size_workbookView(); ++i) {
                auto& view = views->get_workbookView(i);
                const int active = static_cast<int>(view.get_activeTab());
                if (active > index || active >= count - 1) view.set_activeTab(static_cast<std::uint32_t>(
                                                             active > index ? active - 1 : count - 2));
            }
        }
        return true;
    });
}

// ---- Workbook settings ----

template <class TCHAR, class Tag>
int XMLBookImplT<TCHAR, Tag>::activeSheet() {
    message_.ok();
    const auto* views = this->document().find_bookViews();
    if (!views || views->size_workbookView() == 0) return 0;
    return static_cast<int>(views->get_workbookView(0).get_activeTab());
}

template <class TCHAR, class Tag>
void XMLBookImplT<TCHAR, Tag>::setActiveSheet(int index) {
    message_.guardVoid([&] {
        const int count = checkedSheetCount();
        if (index < 0 || index >= count) throw qrerror("index is out of range");
        auto& views = this->document().get_bookViews();
        if (views.size_workbookView() == 0) views.append_workbookView();
        views.get_workbookView(0).set_activeTab(static_cast<std::uint32_t>(index));
        for (int i = 0; i < count; ++i) {
            auto* sheet = dynamic_cast<Sheet*>(findPart(sheetPath(i)));
            if (!sheet) continue;
            auto* sheetViews = sheet->document().find_sheetViews();
            if (sheetViews && sheetViews->size_sheetView() > 0) sheetViews->get_sheetView(0).unset_tabSelected();
        }
    });
}

template <class TCHAR, class Tag>
bool XMLBookImplT<TCHAR, Tag>::isDate1904() {
    message_.ok();
    const auto* pr = this->document().find_workbookPr();
    return pr && pr->get_date1904();
}

template <class TCHAR, class Tag>
void XMLBookImplT<TCHAR, Tag>::setDate1904(bool date1904) {
    message_.ok();
    auto& pr = this->document().get_workbookPr();
    if (pr.isset_date1904() || date1904) pr.set_date1904(date1904);
}

template <class TCHAR, class Tag>
bool XMLBookImplT<TCHAR, Tag>::isTemplate() {
    return message_.guard(false, [&]() -> bool {
        if (!contentTypes_) throw qrerror("workbook content types are not found");
        return contentTypes_->contentType(workbookName_) == package::kXltxMain;
    });
}

template <class TCHAR, class Tag>
void XMLBookImplT<TCHAR, Tag>::setTemplate(bool tmpl) {
    message_.guardVoid([&] {
        if (!contentTypes_) throw qrerror("workbook content types are not found");
        contentTypes_->setOverride(workbookName_, tmpl ? package::kXltxMain : package::kXlsxMain);
    });
}

// ---- Loading ----

template <class TCHAR, class Tag>
std::string XMLBookImplT<TCHAR, Tag>::narrowFileName(const TCHAR* fileName) const {
    if (!locale_.utf8Mode) {
        const std::size_t needed = std::wcstombs(nullptr, fileName, 0);
        if (needed != static_cast<std::size_t>(-1)) {
            std::string narrow(needed, '\0');
            std::wcstombs(&narrow[0], fileName, needed + 1);
            return narrow;
        }
    }
    return toUtf8(fileName);
}

template <class TCHAR, class Tag>
bool XMLBookImplT<TCHAR, Tag>::load(const TCHAR* fileName, const TCHAR* tempFile) {
    return loadPartially(fileName, -1, -1, -1, tempFile);
}

template <class TCHAR, class Tag>
bool XMLBookImplT<TCHAR, Tag>::loadSheet(const TCHAR* fileName, int sheetIndex, const TCHAR* tempFile) {
    return loadPartially(fileName, sheetIndex, -1, -1, tempFile);
}

template <class TCHAR, class Tag>
bool XMLBookImplT<TCHAR, Tag>::loadPartially(const TCHAR* fileName, int sheetIndex, int firstRow, int lastRow,
                                             const TCHAR* tempFile) {
    LoadRequest request;
    request.sheetIndex = sheetIndex;
    request.firstRow = sheetIndex >= 0 ? firstRow : -1;
    request.lastRow = sheetIndex >= 0 ? lastRow : -1;
    if (tempFile && *tempFile) request.tempFile = narrowFileName(tempFile);
    return loadFile(fileName, request);
}

template <class TCHAR, class Tag>
bool XMLBookImplT<TCHAR, Tag>::loadInfo(const TCHAR* fileName) {
    LoadRequest request;
    request.infoOnly = true;
    return loadFile(fileName, request);
}

template <class TCHAR, class Tag>
bool XMLBookImplT<TCHAR, Tag>::loadFile(const TCHAR* fileName, const LoadRequest& request) {
    return message_.guard(false, [&]() -> bool {
        if (!fileName) throw qrerror("file name can't be 0");
        const std::string path = narrowFileName(fileName);
        zip::ZipReader archive;
        {
            std::FILE* probe = std::fopen(path.c_str(), "rb");
            if (!probe) throw qrerror("can't open file for reading");
            std::fclose(probe);
        }
        archive.open(path);
        loadPackage(archive, request);
        return true;
    });
}

template <class TCHAR, class Tag>
bool XMLBookImplT<TCHAR, Tag>::loadRaw(const char* data, unsigned size, int sheetIndex, int firstRow, int lastRow) {
    return message_.guard(false, [&]() -> bool {
        if (!data || size == 0) throw qrerror("data is empty");
        LoadRequest request;
        request.sheetIndex = sheetIndex;
        request.firstRow = sheetIndex >= 0 ? firstRow : -1;
        request.lastRow = sheetIndex >= 0 ? lastRow : -1;
        zip::ZipReader archive;
        archive.open(data, size);
        loadPackage(archive, request);
        return true;
    });
}

template <class TCHAR, class Tag>
void XMLBookImplT<TCHAR, Tag>::loadPackage(zip::ZipReader& archive, const LoadRequest& request) {
    NumericLocaleC numericLocale;
    TempFileGuard temp;
    if (!request.tempFile.empty()) temp.path = request.tempFile;

    clearTable();
    this->document().reset();
    workbookName_.clear();

    const std::size_t entries = archive.entryCount();
    std::vector<std::string> names(entries);
    std::size_t typesEntry = zip::ZipReader::npos;
    for (std::size_t i = 0; i < entries; ++i) {
        names[i] = package::normalisePartName(archive.entryNameUtf8(i));
        if (typesEntry == zip::ZipReader::npos && names[i].size() == std::strlen(package::kContentTypesPart)) {
            std::string lower = names[i];
            for (char& c : lower) c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
            if (lower == "/[content_types].xml") typesEntry = i;
        }
    }
    if (typesEntry == zip::ZipReader::npos) throw qrerror("load error: workbook content types are not found");
    {
        const std::string bytes = archive.extract(typesEntry);
        auto types = std::make_unique<ContentTypes>();
        types->read(names[typesEntry], bytes.data(), bytes.size());
        contentTypes_ = types.get();
        insertPart(names[typesEntry], std::move(types));
    }

    // Reads entry i through memory or, when asked, through the temporary file.
    auto readEntry = [&](std::size_t i, auto&& fromMemory, auto&& fromFile) {
        if (temp.path.empty()) {
            const std::string bytes = archive.extract(i);
            fromMemory(bytes);
        } else {
            archive.extractToFile(i, temp.path);
            fromFile(temp.path);
        }
    };

    // The workbook and its relationships come first, whatever their place in the archive,
    // so that the sheet to keep is known before the sheets are read.
    std::size_t workbookEntry = zip::ZipReader::npos;
    for (std::size_t i = 0; i < entries && workbookEntry == zip::ZipReader::npos; ++i)
        if (i != typesEntry && isWorkbookType(contentTypes_->contentType(names[i]))) workbookEntry = i;
    if (workbookEntry == zip::ZipReader::npos) throw qrerror("workbook main xml file is not found");
    if (archive.entrySize(workbookEntry) == 0) throw qrerror("data is empty");
    readEntry(
        workbookEntry, [&](const std::string& bytes) { this->read(names[workbookEntry], bytes.data(), bytes.size()); },
        [&](const std::string& file) { this->readFile(names[workbookEntry], file); });
    workbookName_ = names[workbookEntry];
    parts_[workbookName_] = this;

    const std::string relsName = package::relationshipsPartName(workbookName_);
    std::size_t relsEntry = zip::ZipReader::npos;
    for (std::size_t i = 0; i < entries; ++i)
        if (names[i] == relsName) relsEntry = i;
    if (relsEntry != zip::ZipReader::npos && !request.infoOnly) {
        if (contentTypes_->contentType(relsName) != package::kRelationshipsType)
            throw qrerror("load error: workbook relationships are not found");
        auto rels = std::make_unique<Relationships>();
        Relationships* target = rels.get();
        readEntry(
            relsEntry, [&](const std::string& bytes) { target->read(relsName, bytes.data(), bytes.size()); },
            [&](const std::string& file) { target->readFile(relsName, file); });
        workbookRels_ = target;
        insertPart(relsName, std::move(rels));
    } else if (!request.infoOnly) {
        throw qrerror("workbook relationships not found");
    }

    std::string keptSheet;
    if (request.sheetIndex >= 0 && !request.infoOnly) {
        if (request.sheetIndex >= checkedSheetCount()) throw qrerror("sheetIndex is out of range");
        keptSheet = sheetPath(request.sheetIndex);
        keepOnlySheet(request.sheetIndex);
    }

    for (std::size_t i = 0; i < entries; ++i) {
        if (i == typesEntry || i == workbookEntry || i == relsEntry) continue;
        const std::string& name = names[i];
        const std::string type = contentTypes_->contentType(name);
        if (type.empty()) continue;
        if (request.infoOnly) continue;
        if (findPart(name)) continue;  // the same name twice in the archive: the first counts
        const bool worksheet = type == package::kWorksheetType;
        if (worksheet && !keptSheet.empty() && name != keptSheet) continue;
        if (isWorkbookType(type)) continue;

        std::unique_ptr<XFile> part;
        auto bindXml = [&](auto xmlPart) {
            auto* raw = xmlPart.get();
            readEntry(
                i, [&](const std::string& bytes) { raw->read(name, bytes.data(), bytes.size()); },
                [&](const std::string& file) { raw->readFile(name, file); });
            part = std::move(xmlPart);
        };
        // Parts that no book operation reads yet are kept as their bytes when other writers
        // bent the schema in them, rather than refusing the whole package.
        auto bindOrKeep = [&](auto xmlPart) {
            try {
                bindXml(std::move(xmlPart));
            } catch (const qrerror&) {
                part = std::make_unique<BinaryFile>(archive.extract(i));
            }
        };
        bool sheetLike = worksheet;
        std::string sniffed;
        if (!sheetLike && type == package::kXmlType && temp.path.empty()) {
            sniffed = archive.extract(i);
            sheetLike = sniffed.substr(0, 100).find("<worksheet xmlns=") != std::string::npos;
        }
        if (sheetLike) {
            auto sheet = std::make_unique<Sheet>();
            auto* raw = sheet.get();
            if (!sniffed.empty()) {
                raw->readRows(name, sniffed.data(), sniffed.size(), request.firstRow, request.lastRow);
            } else {
                readEntry(
                    i,
                    [&](const std::string& bytes) {
                        raw->readRows(name, bytes.data(), bytes.size(), request.firstRow, request.lastRow);
                    },
                    [&](const std::string& file) {
                        raw->readRowsFromFile(name, file, request.firstRow, request.lastRow);
                    });
            }
            part = std::move(sheet);
        } else if (type == package::kRelationshipsType) {
            auto rels = std::make_unique<Relationships>();
            auto* raw = rels.get();
            try {
                readEntry(
                    i, [&](const std::string& bytes) { raw->read(name, bytes.data(), bytes.size()); },
                    [&](const std::string& file) { raw->readFile(name, file); });
                part = std::move(rels);
            } catch (const qrerror&) {
                part = std::make_unique<BinaryFile>(archive.extract(i));
            }
        } else if (type == package::kStylesType) {
            bindXml(std::make_unique<Styles<Tag>>());
        } else if (type == package::kSharedStringsType) {
            bindXml(std::make_unique<SharedStrings<Tag>>());
        } else if (type == package::kDrawingType) {
            bindOrKeep(std::make_unique<Drawing<Tag>>());
        } else if (type == package::kTableType) {
            bindOrKeep(std::make_unique<Table<Tag>>());
        } else if (type == package::kCommentsType) {
            bindOrKeep(std::make_unique<Comments<Tag>>());
        } else {
            std::string bytes = sniffed.empty() ? archive.extract(i) : std::move(sniffed);
            if (type == package::kChartsheetType)
                part = std::make_unique<XMLChartSheet>(std::move(bytes));
            else
                part = std::make_unique<BinaryFile>(std::move(bytes));
            if (type.compare(0, 5, "image") == 0) pictures_.push_back(name);
        }
        insertPart(name, std::move(part));
    }

    if (workbookRels_) {
        auto findByType = [&](const char* transitional, const char* strict) -> std::string {
            std::string target = workbookRels_->targetOfType(transitional);
            if (target.empty()) target = workbookRels_->targetOfType(strict);
            return target.empty() ? std::string() : package::resolveWorkbookTarget(target);
        };
        sharedStrings_ = dynamic_cast<SharedStrings<Tag>*>(
            findPart(findByType(package::kRelSharedStrings, package::kRelStrictSharedStrings)));
        styles_ = dynamic_cast<Styles<Tag>*>(findPart(findByType(package::kRelStyles, package::kRelStrictStyles)));
    }
    for (auto& entry : parts_)
        if (auto* sheet = dynamic_cast<Sheet*>(entry.second)) sheet->bind(this);
}

template <class TCHAR, class Tag>
void XMLBookImplT<TCHAR, Tag>::keepOnlySheet(int index) {
    const int count = checkedSheetCount();
    for (int i = count - 1; i > index; --i) removeSheetElement(i, true);
    for (int i = index - 1; i >= 0; --i) removeSheetElement(i, true);
    if (auto* views = this->document().find_bookViews())
        for (std::size_t i = 0; i < views->size_workbookView(); ++i)
            if (views->get_workbookView(i).isset_activeTab()) views->get_workbookView(i).set_activeTab(0);
}

// ---- Saving ----

template <class TCHAR, class Tag>
void XMLBookImplT<TCHAR, Tag>::dropCalculationChain() {
    if (contentTypes_) contentTypes_->removeOverride(package::kCalcChainPart);
    if (workbookRels_) workbookRels_->removeByTarget("calcChain.xml");
    if (workbookRels_) workbookRels_->removeByTarget(package::kCalcChainPart);
    removePart(package::kCalcChainPart);
}

template <class TCHAR, class Tag>
void XMLBookImplT<TCHAR, Tag>::saveTo(const std::string& path, bool inMemory, bool useTempFile) {
    if (!contentTypes_) throw qrerror("workbook content types are not found");
    NumericLocaleC numericLocale;
    dropCalculationChain();
    auto& calcPr = this->document().get_calcPr();
    if (!calcPr.isset_calcId()) calcPr.set_calcId(125725);
    calcPr.set_fullCalcOnLoad(true);
    for (auto& entry : parts_)
        if (auto* sheet = dynamic_cast<Sheet*>(entry.second))
            if (!sheet->isBound()) sheet->bind(this);

    zip::ZipWriter writer;
    if (inMemory) {
        writer.createInMemory();
    } else {
        std::FILE* probe = std::fopen(path.c_str(), "ab");
        if (!probe) throw qrerror("can't open file for writing");
        std::fclose(probe);
        writer.create(path);
    }
    std::string tempPath;
    if (useTempFile && !inMemory) {
        std::size_t slash = path.rfind('\\');
        if (slash == std::string::npos) slash = path.rfind('/');
        tempPath = (slash == std::string::npos ? std::string() : path.substr(0, slash + 1)) + "quire-temp.xml";
    }
    std::string buffer;
    for (auto& entry : parts_) {
        const std::string entryName = withoutLeadingSlash(entry.first);
        if (!tempPath.empty()) {
            TempFileGuard temp{tempPath};
            entry.second->write(tempPath, buffer);
            writer.addFile(entryName, tempPath);
        } else if (auto* xml = dynamic_cast<XmlPart*>(entry.second)) {
            // Deflated as the text is made: a sheet's text is never held whole. On sheet and
            // string-table text, level 5 comes within half a percent of the default level's
            // size in 60% of its time.
            writer.openEntry(entryName, 5);
            xml->writeTo([&writer](const char* data, std::size_t size) { writer.writeEntry(data, size); });
            writer.closeEntry();
        } else {
            buffer.clear();
            entry.second->write(std::string(), buffer);
            writer.add(entryName, buffer.data(), buffer.size());
        }
    }
    writer.close();
    if (inMemory) {
        zip::ZipBuffer archive = writer.takeBuffer();
        savedBuffer_.assign(reinterpret_cast<const char*>(archive.data()), archive.size());
    }
}

template <class TCHAR, class Tag>
bool XMLBookImplT<TCHAR, Tag>::save(const TCHAR* fileName, bool useTempFile) {
    return message_.guard(false, [&]() -> bool {
        if (!fileName) throw qrerror("file name can't be 0");
        if (!contentTypes_) throw qrerror("workbook content types are not found");
        if (const char* type = package::workbookTypeForFileName(fileName))
            contentTypes_->setOverride(workbookName_, type);
        saveTo(narrowFileName(fileName), false, useTempFile);
        return true;
    });
}

template <class TCHAR, class Tag>
bool XMLBookImplT<TCHAR, Tag>::saveRaw(const char** data, unsigned* size) {
    return message_.guard(false, [&]() -> bool {
        saveTo(std::string(), true, false);
        if (data) *data = savedBuffer_.data();
        if (size) *size = static_cast<unsigned>(savedBuffer_.size());
        return true;
    });
}

// ---- Pictures ----

template <class TCHAR, class Tag>
int XMLBookImplT<TCHAR, Tag>::pictureSize() {
    message_.ok();
    return static_cast<int>(pictures_.size());
}

template <class TCHAR, class Tag>
int XMLBookImplT<TCHAR, Tag>::getPicture(int index, const char** data, unsigned* size) {
    return message_.guard<int>(PictureTypeError, [&]() -> int {
        if (index < 0 || index >= static_cast<int>(pictures_.size())) throw qrerror("index is out of range");
        auto* part = dynamic_cast<BinaryFile*>(findPart(pictures_[static_cast<std::size_t>(index)]));
        if (!part) throw qrerror("index is out of range");
        if (data) *data = part->bytes().data();
        if (size) *size = static_cast<unsigned>(part->bytes().size());
        return detectPictureType(reinterpret_cast<const unsigned char*>(part->bytes().data()), part->bytes().size());
    });
}

template <class TCHAR, class Tag>
int XMLBookImplT<TCHAR, Tag>::addPicture(const TCHAR* fileName) {
    return message_.guard<int>(-1, [&]() -> int {
        if (!fileName) throw qrerror("file name can't be 0");
        std::FILE* in = std::fopen(narrowFileName(fileName).c_str(), "rb");
        if (!in) throw qrerror("can't open file");
        std::string bytes;
        char chunk[65536];
        std::size_t got;
        while ((got = std::fread(chunk, 1, sizeof chunk, in)) > 0) bytes.append(chunk, got);
        std::fclose(in);
        if (bytes.empty()) throw qrerror("file is empty");
        return addPicture2(bytes.data(), static_cast<unsigned>(bytes.size()));
    });
}

template <class TCHAR, class Tag>
int XMLBookImplT<TCHAR, Tag>::addPicture2(const char* data, unsigned size) {
    return message_.guard<int>(-1, [&]() -> int {
        if (!data || size == 0) throw qrerror("picture is empty");
        const int type = detectPictureType(reinterpret_cast<const unsigned char*>(data), size);
        const char* extension = nullptr;
        const char* contentType = nullptr;
        switch (type) {
        case PictureTypePNG: extension = "png"; contentType = "image/png"; break;
        case PictureTypeJPEG: extension = "jpeg"; contentType = "image/jpeg"; break;
        case PictureTypeGIF: extension = "gif"; contentType = "image/gif"; break;
        case PictureTypeWMF: extension = "wmf"; contentType = "image/x-wmf"; break;
        case PictureTypeDIB: extension = "bmp"; contentType = "image/bmp"; break;
        case PictureTypeEMF: extension = "emf"; contentType = "image/x-emf"; break;
        case PictureTypeTIFF: extension = "tiff"; contentType = "image/tiff"; break;
        default: throw qrerror("unknown picture format");
        }
        if (!contentTypes_) throw qrerror("workbook content types are not found");
        std::string name;
        for (int n = 1;; ++n) {
            name = "/xl/media/image" + std::to_string(n) + "." + extension;
            if (!findPart(name)) break;
        }
        if (!contentTypes_->hasDefault(extension)) contentTypes_->addDefault(extension, contentType);
        insertPart(name, std::make_unique<BinaryFile>(std::string(data, size)));
        pictures_.push_back(name);
        return static_cast<int>(pictures_.size()) - 1;
    });
}

template <class TCHAR, class Tag>
int XMLBookImplT<TCHAR, Tag>::addPictureAsLink(const TCHAR*, bool) {
    return unsupported<int>(-1);
}

// ---- Formats and fonts: the styles engine answers these ----

template <class TCHAR, class Tag>
template <class Result>
Result XMLBookImplT<TCHAR, Tag>::unsupported(Result failure) {
    return message_.guard(failure, [&]() -> Result { throw qrerror(kNotYet); });
}

template <class TCHAR, class Tag>
Styles<Tag>& XMLBookImplT<TCHAR, Tag>::syncedStyles() {
    Styles<Tag>& part = styles();
    part.setRgbMode(rgbMode_);
    return part;
}

template <class TCHAR, class Tag>
IFormatT<TCHAR>* XMLBookImplT<TCHAR, Tag>::addFormat(IFormatT<TCHAR>* initFormat) {
    return message_.guard<IFormatT<TCHAR>*>(nullptr, [&]() -> IFormatT<TCHAR>* {
        Styles<Tag>& part = syncedStyles();
        auto* format = part.addFormat(nullptr);
        if (!initFormat) return format;
        // Colours copy as stored: both books read palette indexes for the duration.
        auto* source = dynamic_cast<IFormatPrivate<TCHAR>*>(initFormat);
        const bool sourceRgb = source && source->rgbMode();
        if (source) source->setRgbMode(false);
        part.setRgbMode(false);
        try {
            format->copyFrom(*initFormat);
        } catch (...) {
            if (source) source->setRgbMode(sourceRgb);
            part.setRgbMode(rgbMode_);
            throw;
        }
        if (source) source->setRgbMode(sourceRgb);
        part.setRgbMode(rgbMode_);
        return format;
    });
}

template <class TCHAR, class Tag>
IFontT<TCHAR>* XMLBookImplT<TCHAR, Tag>::addFont(IFontT<TCHAR>* initFont) {
    return message_.guard<IFontT<TCHAR>*>(nullptr, [&]() -> IFontT<TCHAR>* {
        Styles<Tag>& part = syncedStyles();
        auto* font = part.addFont();
        if (!initFont) return font;
        auto* source = dynamic_cast<IFontPrivate<TCHAR>*>(initFont);
        const bool sourceRgb = source && source->rgbMode();
        if (source) source->setRgbMode(false);
        part.setRgbMode(false);
        try {
            font->copyFrom(*initFont);
        } catch (...) {
            if (source) source->setRgbMode(sourceRgb);
            part.setRgbMode(rgbMode_);
            throw;
        }
        if (source) source->setRgbMode(sourceRgb);
        part.setRgbMode(rgbMode_);
        return font;
    });
}

template <class TCHAR, class Tag>
int XMLBookImplT<TCHAR, Tag>::addCustomNumFormat(const TCHAR* customNumFormat) {
    return message_.guard(0, [&]() -> int {
        if (!customNumFormat) throw qrerror("custom number format can't be 0");
        const int id = styles().addCustomNumFormat(customNumFormat);
        if (id == 0) throw qrerror("maximum number of custom formats is exceeded");
        return id;
    });
}

template <class TCHAR, class Tag>
const TCHAR* XMLBookImplT<TCHAR, Tag>::customNumFormat(int fmt) {
    return message_.guard(static_cast<const TCHAR*>(nullptr), [&]() -> const TCHAR* {
        const std::wstring* text = styles().customNumFormat(fmt);
        if (!text) throw qrerror("custom number format not found");
        stringResult_ = *text;
        return stringResult_.c_str();
    });
}

template <class TCHAR, class Tag>
IFormatT<TCHAR>* XMLBookImplT<TCHAR, Tag>::format(int index) {
    return message_.guard<IFormatT<TCHAR>*>(nullptr, [&]() -> IFormatT<TCHAR>* {
        if (!styles_) throw qrerror("formats are not found");
        return syncedStyles().format(index);
    });
}

template <class TCHAR, class Tag>
int XMLBookImplT<TCHAR, Tag>::formatSize() {
    message_.ok();
    return styles_ ? styles_->formatCount() : 0;
}

template <class TCHAR, class Tag>
IFontT<TCHAR>* XMLBookImplT<TCHAR, Tag>::font(int index) {
    return message_.guard<IFontT<TCHAR>*>(nullptr, [&]() -> IFontT<TCHAR>* {
        if (!styles_) throw qrerror("fonts are not found");
        return syncedStyles().font(index);
    });
}

template <class TCHAR, class Tag>
int XMLBookImplT<TCHAR, Tag>::fontSize() {
    message_.ok();
    return styles_ ? styles_->fontCount() : 0;
}

template <class TCHAR, class Tag>
const TCHAR* XMLBookImplT<TCHAR, Tag>::defaultFont(int* fontSize) {
    return message_.guard(static_cast<const TCHAR*>(nullptr), [&]() -> const TCHAR* {
        if (!styles_ || styles_->fontCount() == 0) throw qrerror("fonts are not found");
        auto* first = styles_->font(0);
        if (fontSize) *fontSize = first->size();
        stringResult_ = first->name();
        return stringResult_.c_str();
    });
}

template <class TCHAR, class Tag>
void XMLBookImplT<TCHAR, Tag>::setDefaultFont(const TCHAR* fontName, int fontSize) {
    message_.guardVoid([&] {
        if (!fontName) throw qrerror("font name can't be 0");
        Styles<Tag>& part = styles();
        if (part.fontCount() == 0) throw qrerror("fonts are not found");
        part.font(0)->setSize(fontSize);
        part.font(0)->setName(fontName);
    });
}

// ---- Dates, colours, modes ----

template <class TCHAR, class Tag>
double XMLBookImplT<TCHAR, Tag>::datePack(int year, int month, int day, int hour, int min, int sec, int msec) {
    message_.ok();
    return quire::datePack(isDate1904(), year, month, day, hour, min, sec, msec);
}

template <class TCHAR, class Tag>
bool XMLBookImplT<TCHAR, Tag>::dateUnpack(double value, int* year, int* month, int* day, int* hour, int* min,
                                          int* sec, int* msec) {
    if (!quire::dateUnpack(isDate1904(), value, year, month, day, hour, min, sec, msec)) return false;
    message_.ok();
    return true;
}

template <class TCHAR, class Tag>
int XMLBookImplT<TCHAR, Tag>::colorPack(int red, int green, int blue) {
    message_.ok();
    if (rgbMode_) return packRgbValue(red, green, blue);
    // The nearest colour of the default palette.
    const auto& palette = defaultPalette();
    int best = 0;
    long bestDistance = -1;
    for (int i = 0; i < kPaletteSize; ++i) {
        const long r = static_cast<long>(palette[i] & 0xFF) - red;
        const long g = static_cast<long>((palette[i] >> 8) & 0xFF) - green;
        const long b = static_cast<long>((palette[i] >> 16) & 0xFF) - blue;
        const long distance = r * r + g * g + b * b;
        if (bestDistance < 0 || distance < bestDistance) {
            bestDistance = distance;
            best = i;
        }
    }
    return best + kPaletteFirstIndex;
}

template <class TCHAR, class Tag>
void XMLBookImplT<TCHAR, Tag>::colorUnpack(int color, int* red, int* green, int* blue) {
    message_.ok();
    int r = 0, g = 0, b = 0;
    if (rgbMode_) {
        r = (color >> 16) & 0xFF;
        g = (color >> 8) & 0xFF;
        b = color & 0xFF;
    } else {
        const int entry = color - kPaletteFirstIndex;
        if (entry < 0 || entry >= kPaletteSize) {
            message_.set("invalid color");
            return;
        }
        const std::uint32_t word = defaultPalette()[static_cast<std::size_t>(entry)];
        r = static_cast<int>(word & 0xFF);
        g = static_cast<int>((word >> 8) & 0xFF);
        b = static_cast<int>((word >> 16) & 0xFF);
    }
    if (red) *red = r;
    if (green) *green = g;
    if (blue) *blue = b;
}

template <class TCHAR, class Tag>
bool XMLBookImplT<TCHAR, Tag>::refR1C1() {
    message_.ok();
    return refR1C1_;
}

template <class TCHAR, class Tag>
void XMLBookImplT<TCHAR, Tag>::setRefR1C1(bool refR1C1) {
    message_.ok();
    refR1C1_ = refR1C1;
}

template <class TCHAR, class Tag>
bool XMLBookImplT<TCHAR, Tag>::rgbMode() {
    message_.ok();
    return rgbMode_;
}

template <class TCHAR, class Tag>
void XMLBookImplT<TCHAR, Tag>::setRgbMode(bool rgbMode) {
    message_.ok();
    rgbMode_ = rgbMode;
    if (styles_) styles_->setRgbMode(rgbMode);
}

template <class TCHAR, class Tag>
int XMLBookImplT<TCHAR, Tag>::version() {
    message_.ok();
    return kLibraryVersion;
}

template <class TCHAR, class Tag>
int XMLBookImplT<TCHAR, Tag>::biffVersion() {
    message_.ok();
    return 0;
}

template <class TCHAR, class Tag>
bool XMLBookImplT<TCHAR, Tag>::setLocale(const char* locale) {
    return message_.guard(false, [&]() -> bool {
        applyLocale(locale_, locale);
        return true;
    });
}

template <class TCHAR, class Tag>
const char* XMLBookImplT<TCHAR, Tag>::errorMessage() {
    return message_.c_str();
}

template <class TCHAR, class Tag>
void XMLBookImplT<TCHAR, Tag>::release() {
    delete this;
}

template class XMLBookImplT<wchar_t, excelNormal_tag>;
template class XMLBookImplT<wchar_t, excelStrict_tag>;

}  // namespace quire
