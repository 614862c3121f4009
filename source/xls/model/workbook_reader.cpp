// Loading a binary workbook: the compound file, the globals substream, then each sheet.
#include <algorithm>

#include "api/wide_text.h"
#include "book_impl.h"
#include "field_cursor.h"
#include "record_text.h"
#include "sheet_impl.h"
#include "sheet_record_types.h"
#include "sheet_records.h"
#include "name_records.h"
#include "style_records.h"
#include "workbook_io.h"
#include "xls/compound_file.h"
#include "xls/record_reader.h"
#include "xls/shared_strings.h"

namespace quire {
namespace {

using namespace GlobalsRecord;

struct SingleRecordSize {
    uint16_t type;
    const char* name;
    size_t size;  // 0: any length
};

// The single-value records of the globals with the length each must have.
const SingleRecordSize kSingleRecords[] = {
    {InterfaceHdr, "InterfaceHdr", 0}, {Mms, "Mms", 2}, {CodePage, "CodePage", 2}, {Dsf, "DSF", 2},
    {BuiltInFnGroupCount, "BuiltInFnGroupCount", 2}, {WinProtect, "WinProtect", 2},
    {Protect, "Protect", 2}, {Password, "Password", 2}, {Prot4Rev, "Prot4Rev", 2},
    {Prot4RevPass, "Prot4RevPass", 2}, {Window1, "Window1", 18}, {Backup, "Backup", 2},
    {HideObj, "HideObj", 2}, {Date1904, "Date1904", 2}, {CalcPrecision, "CalcPrecision", 2},
    {RefreshAll, "RefreshAll", 2}, {BookBool, "BookBool", 2}, {UsesElfs, "UsesELFs", 2},
    {Country, "Country", 4}, {RecalcId, "RecalcId", 8}, {BookExt, "BookExt", 0},
    {WriteAccess, "WriteAccess", 0}, {RRTabId, "RRTabId", 0},
};

const uint16_t kVerbatimRecords[] = {ObProj, ObNoMacros, CodeName, XfCrc, TableStyles, ClrtClient,
                                     MtrSettings, ForceFullCalculation, Theme, CompressPictures,
                                     Compat12};

const SingleRecordSize* singleRecord(uint16_t type) {
    for (const auto& entry : kSingleRecords)
        if (entry.type == type) return &entry;
    return nullptr;
}

bool isVerbatim(uint16_t type) {
    return std::find(std::begin(kVerbatimRecords), std::end(kVerbatimRecords), type) !=
           std::end(kVerbatimRecords);
}

// Records that follow a SupBook and belong to it.
bool belongsToSupBook(uint16_t type) {
    return type == ExternName || type == 0x005A /* CRN */ || type == 0x0059 /* XCT */;
}

class GlobalsReader {
public:
    GlobalsReader(BookImplT& book, xls::RecordReader& reader) : book_(book), reader_(reader) {}
    void run();
    bool biff5() const { return biff5_; }

private:
    void readBof(const xls::Record& record);
    void dispatch(const xls::Record& record, const xls::RecordHeader& header);
    void readBoundSheet(const xls::Record& record);
    // The record's data with the data of the CONTINUE records after it.
    std::vector<uint8_t> withContinues(const xls::Record& record);

    BookImplT& book_;
    xls::RecordReader& reader_;
    bool biff5_ = false;
    std::vector<KeptRecord>* lastList_ = nullptr;
};

void GlobalsReader::readBof(const xls::Record& record) {
    if (record.type != Bof || record.size < 4) throw qrerror("This file format isn't supported");
    uint16_t version = static_cast<uint16_t>(record.data[0] | (record.data[1] << 8));
    if (version != 0x0500 && version != 0x0600) throw qrerror("This file format isn't supported");
    biff5_ = version < 0x0501;
    book_.setBiffVersion(version);
    book_.globals().bof.assign(record.data, record.data + record.size);
}

void GlobalsReader::run() {
    xls::RecordHeader header;
    if (!reader_.readHeader(header)) throw qrerror("This file format isn't supported");
    xls::Record record;
    record.type = header.type;
    record.offset = header.offset;
    size_t remaining = header.length;
    record.data = reader_.readBytes(header.length, remaining);
    record.size = header.length;
    readBof(record);
    book_.globals().singles.erase(BookExt);  // a new book has none; a file may bring one
    while (reader_.readHeader(header)) {
        if (header.type == Eof) return;
        if (header.type == Sst) {
            xls::SharedStringTable table;
            table.read(reader_, header);
            SharedStringTable& strings = book_.sharedStrings();
            strings.clear();
            for (size_t i = 0; i < table.size(); ++i) {
                const xls::SharedString& s = table.at(i);
                SharedStringEntry entry;
                entry.text = fromUtf16(s.chars.data(), s.chars.size());
                entry.flags = s.flags;
                entry.runs = s.runs;
                entry.extRst = s.extRst;
                strings.append(std::move(entry));
            }
            lastList_ = nullptr;
            continue;
        }
        remaining = header.length;
        record.type = header.type;
        record.offset = header.offset;
        record.data = reader_.readBytes(header.length, remaining);
        record.size = header.length;
        dispatch(record, header);
    }
    throw qrerror("globals EOF record not found");
}

std::vector<uint8_t> GlobalsReader::withContinues(const xls::Record& record) {
    std::vector<uint8_t> data(record.data, record.data + record.size);
    uint16_t next = 0;
    xls::Record more;
    while (reader_.peekType(next) && next == Continue && reader_.next(more))
        data.insert(data.end(), more.data, more.data + more.size);
    return data;
}

void GlobalsReader::readBoundSheet(const xls::Record& r) {
    if (r.size < 8) throw qrerror("BoundSheet8 size is incorrect");
    quire::BoundSheet8 sheet;
    sheet.lbPlyPos = static_cast<uint32_t>(r.data[0] | (r.data[1] << 8) | (r.data[2] << 16) |
                                           (static_cast<uint32_t>(r.data[3]) << 24));
    sheet.hsState = r.data[4] & 0x03;
    sheet.dt = r.data[5];
    size_t pos = 6;
    sheet.stName = biff5_ ? readByteString(r.data, r.size, pos, true, "BoundSheet8 size is incorrect")
                          : readUnicodeString(r.data, r.size, pos, true, "BoundSheet8 size is incorrect");
    book_.boundSheets().push_back(std::move(sheet));
}

void GlobalsReader::dispatch(const xls::Record& r, const xls::RecordHeader&) {
    WorkbookGlobals& globals = book_.globals();
    std::vector<KeptRecord>* keptIn = nullptr;
    switch (r.type) {
        case FilePass: throw qrerror("workbook is encrypted");
        case Font: readFontRecord(book_, r.data, r.size, biff5_); break;
        case Format: readFormatRecord(book_, r.data, r.size, biff5_); break;
        case Xf: readXfRecord(book_, r.data, r.size, biff5_); break;
        case Style: readStyleRecord(book_, r.data, r.size, biff5_); break;
        case StyleExt:
            if (book_.styles().empty()) throw qrerror("StyleExt: unexpected record");
            book_.styles().back().extensions.push_back(keptCopy(r));
            keptIn = &book_.styles().back().extensions;
            break;
        case XfExt: globals.xfExt.push_back(keptCopy(r)); keptIn = &globals.xfExt; break;
        case Palette: readPaletteRecord(book_, r.data, r.size); break;
        case GlobalsRecord::BoundSheet8: readBoundSheet(r); break;
        case ExtSst: break;  // rebuilt with the string table
        case MsoDrawingGroup: globals.drawingGroup.push_back(keptCopy(r)); keptIn = &globals.drawingGroup; break;
        case HfPicture: globals.hfPictures.push_back(keptCopy(r)); keptIn = &globals.hfPictures; break;
        case Template: book_.setTemplateFlag(true); break;
        case InterfaceEnd:
            if (r.size != 0 && r.size != 2) throw qrerror("InterfaceEnd size is incorrect");
            break;
        case Excel9File:
            if (r.size != 0) throw qrerror("Excel9File size is incorrect");
            break;
        case Continue:
            if (lastList_) lastList_->push_back(keptCopy(r));
            return;
        case Lbl:
        case ExternSheet: {
            if (biff5_) break;  // the older layouts would be wrong in the file we write
            std::vector<uint8_t> data = withContinues(r);
            if (r.type == Lbl) readLblRecord(book_, data.data(), data.size());
            else readExternSheetRecord(book_, data.data(), data.size());
            break;
        }
        case SupBook:
            if (biff5_) break;
            book_.supBooks().emplace_back();
            book_.supBooks().back().records.push_back(keptCopy(r));
            keptIn = &book_.supBooks().back().records;
            break;
        default:
            if (belongsToSupBook(r.type) && !book_.supBooks().empty()) {
                if (biff5_) break;
                book_.supBooks().back().records.push_back(keptCopy(r));
                keptIn = &book_.supBooks().back().records;
            } else if (isVerbatim(r.type)) {
                auto& list = globals.verbatim[r.type];
                list.clear();
                list.push_back(keptCopy(r));
                keptIn = &list;
            } else if (const SingleRecordSize* single = singleRecord(r.type)) {
                if (single->size && r.size != single->size)
                    throw qrerror(std::string(single->name) + " size is incorrect");
                globals.singles[r.type].assign(r.data, r.data + r.size);
                if (r.type == Date1904) book_.setDate1904Flag((r.data[0] & 1) != 0);
                if (r.type == Window1) book_.setActiveSheetIndex(r.data[10] | (r.data[11] << 8));
            } else {
                globals.others.push_back(keptCopy(r));
                keptIn = &globals.others;
            }
            break;
    }
    lastList_ = keptIn;
}

// A chart or macro sheet is kept whole, BOF to EOF.
void keepWholeSubstream(SheetImplT& sheet, xls::RecordReader& reader) {
    xls::Record record;
    int depth = 0;
    while (reader.next(record)) {
        if (record.type == Bof) ++depth;
        if (record.type == Eof) --depth;
        sheet.rawSubstream.push_back(keptCopy(record));
        if (depth == 0) return;
    }
    throw qrerror("sheet EOF record not found");
}

}  // namespace

void readWorkbook(BookImplT& book, const uint8_t* fileBytes, size_t size, const LoadRequest& request) {
    // A bare record stream without a compound file is an old (BIFF2 to BIFF4) workbook.
    if (size >= 4 && fileBytes[0] == 0x09 &&
        (fileBytes[1] == 0x00 || fileBytes[1] == 0x02 || fileBytes[1] == 0x04 || fileBytes[1] == 0x08))
        throw qrerror("This file format isn't supported");
    std::vector<uint8_t> stream;
    {
        xls::Xls container;
        container.openView(fileBytes, size);
        stream = container.takeWorkbookStream();
    }
    xls::RecordReader reader(stream);

    // Parsing the globals replaces the defaults of a new book with what the file holds.
    book.clearStyles();
    GlobalsReader globals(book, reader);
    globals.run();

    int sheetCount = static_cast<int>(book.boundSheets().size());
    if (request.sheetIndex != -1 && (request.sheetIndex < 0 || request.sheetIndex >= sheetCount))
        throw qrerror("sheetIndex is out of range");
    if (request.infoOnly) return;

    for (int i = 0; i < sheetCount; ++i) {
        auto sheet = std::make_unique<SheetImplT>(&book);
        SheetImplT* created = sheet.get();
        book.sheets().push_back(std::move(sheet));
        uint32_t position = book.boundSheet(i).lbPlyPos;
        if (position >= stream.size()) throw qrerror("sheet substream is not found");
        reader.seek(position);
        if (stream.size() - position >= 8 && stream[position] == 0x09 && stream[position + 1] == 0x08 &&
            !(stream[position + 6] == 0x10 && stream[position + 7] == 0x00)) {
            keepWholeSubstream(*created, reader);
            continue;
        }
        SheetReadOptions options;
        options.biff5 = globals.biff5();
        options.skipBlanks = request.skipBlanks;
        if (request.sheetIndex == -1 || request.sheetIndex == i) {
            options.firstRow = request.firstRow;
            options.endRow = request.lastRow < 0 ? -1 : request.lastRow + 1;
        } else {
            options.firstRow = 0;
            options.endRow = 0;  // the other sheets are read with no rows
        }
        readSheetSubstream(*created, reader, options);
    }

    if (request.sheetIndex != -1) {
        auto& sheets = book.sheets();
        auto& records = book.boundSheets();
        sheets.erase(sheets.begin() + request.sheetIndex + 1, sheets.end());
        records.erase(records.begin() + request.sheetIndex + 1, records.end());
        sheets.erase(sheets.begin(), sheets.begin() + request.sheetIndex);
        records.erase(records.begin(), records.begin() + request.sheetIndex);
        book.setActiveSheetIndex(0);
    }
    int active = book.activeSheet();
    if (active < 0 || active >= static_cast<int>(book.sheets().size())) book.setActiveSheetIndex(0);
    for (size_t i = 0; i < book.sheets().size(); ++i)
        book.sheets()[i]->setSelected(static_cast<int>(i) == book.activeSheet());
}

}  // namespace quire
