// Saving a binary workbook: the globals substream, each sheet substream, the compound file.
#include "api/wide_text.h"
#include "book_impl.h"
#include "field_cursor.h"
#include "record_text.h"
#include "sheet_impl.h"
#include "sheet_records.h"
#include "name_records.h"
#include "style_records.h"
#include "workbook_io.h"
#include "xls/compound_file.h"
#include "xls/record_writer.h"
#include "xls/shared_strings.h"

namespace quire {
namespace {

using namespace GlobalsRecord;

class GlobalsWriter {
public:
    GlobalsWriter(BookImplT& book, xls::RecordWriter& out) : book_(book), globals_(book.globals()), out_(out) {}
    // Writes the globals; returns the positions of the BoundSheet8 lbPlyPos fields.
    std::vector<size_t> run();

private:
    void single(uint16_t type) {
        if (const std::vector<uint8_t>* data = globals_.single(type)) out_.writeRecord(type, *data);
    }
    void verbatim(uint16_t type) {
        auto found = globals_.verbatim.find(type);
        if (found == globals_.verbatim.end()) return;
        for (const auto& kept : found->second) out_.writeRecord(kept.id, kept.data);
    }
    void kept(const std::vector<KeptRecord>& records) {
        for (const auto& record : records) out_.writeRecord(record.id, record.data);
    }
    void u16Record(uint16_t type, uint16_t value) {
        std::vector<uint8_t> data;
        putU16(data, value);
        out_.writeRecord(type, data);
    }
    void writeWindow1();
    std::vector<size_t> writeBoundSheets();
    void writeSharedStrings();

    BookImplT& book_;
    WorkbookGlobals& globals_;
    xls::RecordWriter& out_;
};

void GlobalsWriter::writeWindow1() {
    std::vector<uint8_t> data = *globals_.single(Window1);
    int active = book_.activeSheet();
    data[10] = static_cast<uint8_t>(active);
    data[11] = static_cast<uint8_t>(active >> 8);
    if (data[12] | data[13]) {  // the first visible tab must still exist
        int first = data[12] | (data[13] << 8);
        if (first >= static_cast<int>(book_.sheets().size())) data[12] = data[13] = 0;
    }
    data[14] = 1;  // one selected sheet: the active one
    data[15] = 0;
    out_.writeRecord(Window1, data);
}

std::vector<size_t> GlobalsWriter::writeBoundSheets() {
    std::vector<size_t> positions;
    for (const auto& sheet : book_.boundSheets()) {
        std::vector<uint8_t> data;
        putU32(data, 0);
        putU8(data, sheet.hsState);
        putU8(data, sheet.dt);
        appendUnicodeString(data, sheet.stName, true);
        positions.push_back(out_.position() + 4);
        out_.writeRecord(GlobalsRecord::BoundSheet8, data);
    }
    return positions;
}

void GlobalsWriter::writeSharedStrings() {
    const SharedStringTable& strings = book_.sharedStrings();
    xls::SharedStringTable table;
    for (size_t i = 0; i < strings.size(); ++i) {
        const SharedStringEntry& entry = strings.entry(static_cast<uint32_t>(i));
        xls::SharedString s;
        s.chars = toUtf16(entry.text);
        s.flags = entry.flags;
        s.runs = entry.runs;
        s.extRst = entry.extRst;
        table.append(std::move(s));
    }
    uint32_t references = 0;
    for (const auto& sheet : book_.sheets()) {
        CellStore& cells = sheet->cells();
        for (size_t row = 0; row < cells.rowCount(); ++row)
            for (uint32_t w : cells.rowWords(row))
                if (CellStore::kindOf(w) == CellKind::LabelSst) ++references;
    }
    table.setTotalReferences(references);
    table.write(out_);
}

std::vector<size_t> GlobalsWriter::run() {
    out_.writeRecord(Bof, globals_.bof);
    if (book_.isTemplate()) out_.writeRecord(Template, nullptr, 0);
    single(InterfaceHdr);
    single(Mms);
    out_.writeRecord(InterfaceEnd, nullptr, 0);
    single(WriteAccess);
    single(CodePage);
    single(Dsf);
    std::vector<uint8_t> tabIds;
    for (size_t i = 0; i < book_.sheets().size(); ++i) putU16(tabIds, static_cast<uint16_t>(i + 1));
    out_.writeRecord(RRTabId, tabIds);
    verbatim(ObProj);
    verbatim(ObNoMacros);
    verbatim(CodeName);
    single(BuiltInFnGroupCount);
    single(WinProtect);
    single(Protect);
    single(Password);
    single(Prot4Rev);
    single(Prot4RevPass);
    writeWindow1();
    single(Backup);
    single(HideObj);
    u16Record(Date1904, book_.date1904() ? 1 : 0);
    single(CalcPrecision);
    single(RefreshAll);
    single(BookBool);
    single(BookExt);
    writeFontRecords(book_, out_);
    writeFormatRecords(book_, out_);
    writeXfRecords(book_, out_);
    verbatim(XfCrc);
    kept(globals_.xfExt);
    writeStyleRecords(book_, out_);
    verbatim(TableStyles);
    writePaletteRecord(book_, out_);
    verbatim(ClrtClient);
    single(UsesElfs);
    std::vector<size_t> positions = writeBoundSheets();
    verbatim(MtrSettings);
    verbatim(ForceFullCalculation);
    single(Country);
    writeExternalReferencesAndNames(book_, out_);
    single(RecalcId);
    kept(globals_.hfPictures);
    kept(globals_.drawingGroup);
    writeSharedStrings();
    verbatim(Theme);
    verbatim(CompressPictures);
    verbatim(Compat12);
    kept(globals_.others);
    out_.writeRecord(Eof, nullptr, 0);
    return positions;
}

}  // namespace

std::vector<uint8_t> writeWorkbook(BookImplT& book) {
    if (book.sheets().empty()) throw qrerror("workbook must contain at least one sheet");
    xls::RecordWriter out;
    size_t cells = 0;
    for (const auto& sheet : book.sheets()) cells += sheet->cells().cellCount();
    out.reserve(4096 + cells * 16);
    std::vector<size_t> positions = GlobalsWriter(book, out).run();
    for (size_t i = 0; i < book.sheets().size(); ++i) {
        out.patchUInt32(positions[i], static_cast<uint32_t>(out.position()));
        writeSheetSubstream(*book.sheets()[i], out);
    }
    xls::Xls container;
    container.setWorkbookStream(out.take());
    std::vector<uint8_t> file;
    container.close(file);
    return file;
}

}  // namespace quire
