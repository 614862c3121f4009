// Reading a worksheet substream into a sheet.
#include <cstring>

#include "api/wide_text.h"
#include "book_impl.h"
#include "field_cursor.h"
#include "record_text.h"
#include "sheet_impl.h"
#include "sheet_record_types.h"
#include "sheet_records.h"
#include "xls/record_reader.h"
#include "xls/strings.h"

namespace quire {
namespace {

namespace Rec = SheetRecord;

void checkSize(bool ok, const char* name) {
    if (!ok) throw qrerror(std::string(name) + " size is incorrect");
}

uint16_t u16At(const uint8_t* p) { return static_cast<uint16_t>(p[0] | (p[1] << 8)); }
uint32_t u32At(const uint8_t* p) {
    return static_cast<uint32_t>(p[0]) | (static_cast<uint32_t>(p[1]) << 8) |
           (static_cast<uint32_t>(p[2]) << 16) | (static_cast<uint32_t>(p[3]) << 24);
}
double f64At(const uint8_t* p) {
    double v;
    std::memcpy(&v, p, 8);
    return v;
}

// Reads one substream's records into a sheet, tracking where unmodelled records stood.
class SheetReader {
public:
    SheetReader(SheetImplT& sheet, xls::RecordReader& reader, const SheetReadOptions& options)
        : sheet_(sheet), cells_(sheet.cells()), reader_(reader), options_(options) {}

    void run();

private:
    bool rowWanted(int row) const {
        return (options_.firstRow < 0 || row >= options_.firstRow) &&
               (options_.endRow < 0 || row < options_.endRow);
    }
    bool cellWanted(int row, int col) const { return col <= SheetImplT::kMaxCol && rowWanted(row); }
    std::vector<KeptRecord>& currentList() {
        if (phase_ == 0) return sheet_.keptBeforeCells;
        if (phase_ == 1) return sheet_.keptAfterCells;
        return sheet_.keptAfterView;
    }
    void keepRecord(const xls::Record& record) {
        lastList_ = &currentList();
        lastList_->push_back(keptCopy(record));
    }
    void keepEmbeddedSubstream(const xls::Record& bof);
    void readCell(const xls::Record& record);
    void readFormula(const xls::Record& record);
    void readSetting(const xls::Record& record);
    void readPageBreaks(const xls::Record& record, std::vector<PageBreak>& breaks, const char* name);
    std::wstring readStringRecord();

    SheetImplT& sheet_;
    CellStore& cells_;
    xls::RecordReader& reader_;
    SheetReadOptions options_;
    int phase_ = 0;  // 0 before the cells, 1 cells and drawings, 2 after the view settings
    std::vector<KeptRecord>* lastList_ = nullptr;
};

void SheetReader::run() {
    xls::Record record;
    if (!reader_.next(record) || record.type != Rec::Bof) throw qrerror("sheet BOF record not found");
    while (reader_.next(record)) {
        switch (record.type) {
            case Rec::Eof:
                return;
            case Rec::Bof:
                keepEmbeddedSubstream(record);
                break;
            case Rec::Continue:
                if (lastList_) lastList_->push_back(keptCopy(record));
                break;
            case Rec::Rk: case Rec::Number: case Rec::LabelSst: case Rec::Label: case Rec::RString:
            case Rec::BoolErr: case Rec::Blank: case Rec::MulRk: case Rec::MulBlank:
            case Rec::Dimensions: case Rec::Row: case Rec::DbCell: case Rec::Index:
                if (phase_ == 0 && record.type != Rec::Index) phase_ = 1;
                readCell(record);
                lastList_ = nullptr;
                break;
            case Rec::Formula:
            case Rec::FormulaBiff3:
            case Rec::FormulaBiff4:
                phase_ = phase_ == 0 ? 1 : phase_;
                readFormula(record);
                break;
            case Rec::Window2:
                phase_ = 2;
                readSetting(record);
                lastList_ = nullptr;
                break;
            default:
                readSetting(record);
                break;
        }
    }
    throw qrerror("sheet EOF record not found");
}

void SheetReader::keepEmbeddedSubstream(const xls::Record& bof) {
    // A chart embedded in the sheet brings its own BOF..EOF; it is kept whole where it stood.
    std::vector<KeptRecord>& list = currentList();
    list.push_back(keptCopy(bof));
    int depth = 1;
    xls::Record record;
    while (depth > 0 && reader_.next(record)) {
        if (record.type == Rec::Bof) ++depth;
        if (record.type == Rec::Eof) --depth;
        list.push_back(keptCopy(record));
    }
    if (depth > 0) throw qrerror("sheet EOF record not found");
    lastList_ = nullptr;
}

void SheetReader::readCell(const xls::Record& r) {
    const uint8_t* d = r.data;
    size_t n = r.size;
    switch (r.type) {
        case Rec::Rk: {
            checkSize(n == 10, "RK");
            int row = u16At(d), col = u16At(d + 2);
            if (cellWanted(row, col)) cells_.putRk(row, col, u16At(d + 4), u32At(d + 6));
            break;
        }
        case Rec::Number: {
            checkSize(n == 14, "Number");
            int row = u16At(d), col = u16At(d + 2);
            if (cellWanted(row, col)) cells_.putNumber(row, col, u16At(d + 4), f64At(d + 6));
            break;
        }
        case Rec::LabelSst: {
            checkSize(n == 10, "LabelSst");
            int row = u16At(d), col = u16At(d + 2);
            uint32_t isst = u32At(d + 6);
            if (!sheet_.book()->sharedStrings().contains(isst)) throw qrerror("StrMap: sst is out of range (2)");
            if (cellWanted(row, col)) cells_.putLabelSst(row, col, u16At(d + 4), isst);
            break;
        }
        case Rec::Label:
        case Rec::RString: {
            checkSize(n >= 8, "Label");
            int row = u16At(d), col = u16At(d + 2);
            size_t pos = 6;
            std::wstring text = options_.biff5
                                    ? readByteString(d, n, pos, false, "Label size is incorrect")
                                    : readUnicodeString(d, n, pos, false, "Label size is incorrect");
            if (cellWanted(row, col)) cells_.putLabel(row, col, u16At(d + 4), std::move(text));
            break;
        }
        case Rec::BoolErr: {
            checkSize(n == 8, "BoolErr");
            int row = u16At(d), col = u16At(d + 2);
            if (cellWanted(row, col)) cells_.putBoolErr(row, col, u16At(d + 4), d[6], d[7] ? 1 : 0);
            break;
        }
        case Rec::Blank: {
            checkSize(n == 6, "Blank");
            int row = u16At(d), col = u16At(d + 2);
            if (!options_.skipBlanks && cellWanted(row, col)) cells_.putBlank(row, col, u16At(d + 4));
            break;
        }
        case Rec::MulRk: {
            checkSize(n >= 6, "MulRk");
            int row = u16At(d), first = u16At(d + 2);
            size_t count = (n - 6) / 6;
            for (size_t i = 0; i < count; ++i) {
                const uint8_t* item = d + 4 + 6 * i;
                int col = first + static_cast<int>(i);
                if (cellWanted(row, col)) cells_.putRk(row, col, u16At(item), u32At(item + 2));
            }
            break;
        }
        case Rec::MulBlank: {
            checkSize(n >= 6, "MulBlank");
            if (options_.skipBlanks) break;
            int row = u16At(d), first = u16At(d + 2);
            size_t count = (n - 6) / 2;
            for (size_t i = 0; i < count; ++i) {
                int col = first + static_cast<int>(i);
                if (cellWanted(row, col)) cells_.putBlank(row, col, u16At(d + 4 + 2 * i));
            }
            break;
        }
        case Rec::Dimensions:
            // Recomputed on save, so a writer's odd padding after the fields does no harm.
            checkSize(n >= 10, "Dimensions");
            break;
        case Rec::Row: {
            checkSize(n == 16, "Row");
            int row = u16At(d);
            if (!rowWanted(row)) break;
            RowInfo info;
            info.rw = static_cast<uint16_t>(row);
            info.miyRw = u16At(d + 6);
            info.grbit = u16At(d + 12);
            info.ixfeFlags = u16At(d + 14);
            sheet_.rows()[row] = info;
            break;
        }
        case Rec::DbCell:
            checkSize(n >= 4 && (n - 4) % 2 == 0, "DBCell");
            break;
        default:  // Index: rebuilt on save
            break;
    }
}

void SheetReader::readFormula(const xls::Record& r) {
    checkSize(r.size >= 22, "Formula");
    const uint8_t* d = r.data;
    int row = u16At(d), col = u16At(d + 2);
    FormulaCell cell;
    cell.ixfe = u16At(d + 4);
    if (u16At(d + 12) == 0xFFFF) {
        switch (d[6]) {
            case 0: cell.result = FormulaResult::String; break;
            case 1: cell.result = FormulaResult::Boolean; cell.boolOrError = d[8]; break;
            case 2: cell.result = FormulaResult::Error; cell.boolOrError = d[8]; break;
            default: cell.result = FormulaResult::Blank; break;
        }
    } else {
        cell.result = FormulaResult::Number;
        cell.num = f64At(d + 6);
    }
    cell.grbit = u16At(d + 14);
    cell.chn = u32At(d + 16);
    cell.formula.assign(d + 20, d + r.size);
    // The records that belong to the formula follow it directly.
    uint16_t next = 0;
    xls::Record extra;
    while (reader_.peekType(next) &&
           (next == Rec::String || next == Rec::SharedFmla || next == Rec::Array || next == Rec::Table ||
            next == Rec::Continue)) {
        if (next == Rec::String) {
            cell.text = readStringRecord();
            continue;
        }
        reader_.next(extra);
        cell.shared.push_back(keptCopy(extra));
    }
    if (!cellWanted(row, col)) return;
    lastList_ = nullptr;
    if (!options_.biff5) {
        cells_.putFormula(row, col, std::move(cell));
        return;
    }
    // Tokens of the older version would be wrong in the file we write: keep the result only.
    switch (cell.result) {
        case FormulaResult::String: cells_.putLabel(row, col, cell.ixfe, cell.text); break;
        case FormulaResult::Boolean: cells_.putBoolErr(row, col, cell.ixfe, cell.boolOrError, 0); break;
        case FormulaResult::Error: cells_.putBoolErr(row, col, cell.ixfe, cell.boolOrError, 1); break;
        case FormulaResult::Blank: cells_.putLabel(row, col, cell.ixfe, std::wstring()); break;
        default: cells_.putNumber(row, col, cell.ixfe, cell.num); break;
    }
}

// The cached text of a formula; a long one goes on in CONTINUE records, each starting with
// the flags byte that says how its characters are stored.
std::wstring SheetReader::readStringRecord() {
    xls::RecordHeader header;
    reader_.readHeader(header);
    size_t remaining = header.length;
    std::u16string units;
    if (remaining > 0) {
        size_t count = reader_.readInt16(remaining);
        bool highByte = false;
        if (!options_.biff5 && (count > 0 || remaining > 0)) {
            uint8_t flags = 0;
            reader_.readWithContinueRecords(&flags, 1, remaining);
            highByte = (flags & 0x01) != 0;
        }
        xls::readStringCharacters(reader_, remaining, count, highByte, !options_.biff5, units);
    }
    reader_.readBytes(remaining, remaining);
    return fromUtf16(units.data(), units.size());
}

void SheetReader::readPageBreaks(const xls::Record& r, std::vector<PageBreak>& breaks, const char* name) {
    checkSize(r.size >= 2, name);
    size_t count = u16At(r.data);
    size_t width = options_.biff5 ? 2 : 6;
    checkSize(r.size == 2 + width * count, name);
    breaks.clear();
    for (size_t i = 0; i < count; ++i) {
        const uint8_t* p = r.data + 2 + width * i;
        PageBreak b;
        b.index = u16At(p);
        if (!options_.biff5) {
            b.start = u16At(p + 2);
            b.end = u16At(p + 4);
        }
        breaks.push_back(b);
    }
}

void SheetReader::readSetting(const xls::Record& r) {
    const uint8_t* d = r.data;
    size_t n = r.size;
    PageSettings& page = sheet_.page();
    ViewSettings& view = sheet_.view();
    switch (r.type) {
        case Rec::Uncalced: checkSize(n == 2, "Uncalced"); break;
        case Rec::CalcMode: if (n >= 2) sheet_.calcMode = u16At(d); break;
        case Rec::CalcCount: checkSize(n == 2, "CalcCount"); sheet_.calcCount = u16At(d); break;
        case Rec::CalcRefMode:
            checkSize(n == 2, "CalcRefMode");
            sheet_.setRefR1C1Mode(u16At(d) == 0);
            break;
        case Rec::CalcIter: checkSize(n == 2, "CalcIter"); sheet_.calcIter = u16At(d); break;
        case Rec::CalcDelta: checkSize(n == 8, "CalcDelta"); sheet_.calcDelta = f64At(d); break;
        case Rec::CalcSaveRecalc: checkSize(n == 2, "CalcSaveRecalc"); sheet_.calcSaveRecalc = u16At(d); break;
        case Rec::PrintRowCol: checkSize(n == 2, "PrintRowCol"); page.printRowCol = u16At(d) & 1; break;
        case Rec::PrintGrid: checkSize(n == 2, "PrintGrid"); page.printGrid = u16At(d) & 1; break;
        case Rec::GridSet: checkSize(n == 2, "GridSet"); sheet_.gridSet = u16At(d); break;
        case Rec::Guts: checkSize(n == 8, "Guts"); break;  // rebuilt from the outline levels
        case Rec::DefaultRowHeight:
            checkSize(n == 4, "DefaultRowHeight");
            sheet_.defaultRowHeightFlags = u16At(d);
            sheet_.defaultRowHeight = u16At(d + 2);
            break;
        case Rec::WsBool: checkSize(n == 2, "WsBool"); sheet_.wsBool().grbit = u16At(d); break;
        case Rec::HorizontalPageBreaks:
            readPageBreaks(r, sheet_.horizontalBreaks(), "HorizontalPageBreaks");
            break;
        case Rec::VerticalPageBreaks:
            readPageBreaks(r, sheet_.verticalBreaks(), "VerticalPageBreaks");
            break;
        case Rec::Header:
        case Rec::Footer: {
            std::wstring text;
            if (n > 0) {
                size_t pos = 0;
                text = options_.biff5 ? readByteString(d, n, pos, true, "error in Header/Footer record")
                                      : readUnicodeString(d, n, pos, false, "error in Header/Footer record");
            }
            (r.type == Rec::Header ? page.header : page.footer) = text;
            break;
        }
        case Rec::HCenter: checkSize(n == 2, "HCenter"); page.hCenter = u16At(d) & 1; break;
        case Rec::VCenter: checkSize(n == 2, "VCenter"); page.vCenter = u16At(d) & 1; break;
        case Rec::LeftMargin: checkSize(n == 8, "Margin"); page.leftMargin = f64At(d); break;
        case Rec::RightMargin: checkSize(n == 8, "Margin"); page.rightMargin = f64At(d); break;
        case Rec::TopMargin: checkSize(n == 8, "Margin"); page.topMargin = f64At(d); break;
        case Rec::BottomMargin: checkSize(n == 8, "Margin"); page.bottomMargin = f64At(d); break;
        case Rec::Pls:
            sheet_.printerSettings.push_back(keptCopy(r));
            lastList_ = &sheet_.printerSettings;
            return;
        case Rec::Setup: {
            checkSize(n == 34, "Setup");
            Setup& s = page.setup;
            s.iPaperSize = u16At(d);
            s.iScale = u16At(d + 2);
            s.iPageStart = static_cast<int16_t>(u16At(d + 4));
            s.iFitWidth = u16At(d + 6);
            s.iFitHeight = u16At(d + 8);
            s.grbit = u16At(d + 10);
            s.iRes = u16At(d + 12);
            s.iVRes = u16At(d + 14);
            s.numHdr = f64At(d + 16);
            s.numFtr = f64At(d + 24);
            s.iCopies = u16At(d + 32);
            break;
        }
        case Rec::Protect: checkSize(n == 2, "Protect"); sheet_.protection().protect = u16At(d) & 1; break;
        case Rec::Password: checkSize(n == 2, "Password"); sheet_.protection().password = u16At(d); break;
        case Rec::DefColWidth: checkSize(n == 2, "DefColWidth"); sheet_.defColWidth = u16At(d); break;
        case Rec::StandardWidth: checkSize(n == 2, "StandardWidth"); sheet_.standardWidth = u16At(d); break;
        case Rec::ColInfo: {
            checkSize(n >= 10, "ColInfo");
            ColInfo info;
            int first = u16At(d), last = u16At(d + 2);
            if (first > SheetImplT::kMaxCol) break;
            info.colFirst = static_cast<uint16_t>(first);
            info.colLast = static_cast<uint16_t>(last > SheetImplT::kMaxCol ? SheetImplT::kMaxCol : last);
            if (info.colLast < info.colFirst) break;
            info.coldx = u16At(d + 4);
            info.ixfe = u16At(d + 6);
            info.grbit = u16At(d + 8);
            sheet_.cols().push_back(info);
            break;
        }
        case Rec::Window2: {
            checkSize(n >= 10, "Window2");
            Window2& w = view.window2;
            w.grbit = u16At(d);
            w.rwTop = u16At(d + 2);
            w.colLeft = u16At(d + 4);
            w.icvHdr = u16At(d + 6);
            if (n >= 14) {
                w.wScaleSLV = u16At(d + 10);
                w.wScaleNormal = u16At(d + 12);
            }
            break;
        }
        case Rec::Scl:
            checkSize(n == 4, "Scl");
            view.sclNumerator = u16At(d);
            view.sclDenominator = u16At(d + 2);
            view.sclPresent = true;
            break;
        case Rec::Pane:
            checkSize(n >= 9, "Pane");
            view.pane.present = true;
            view.pane.x = u16At(d);
            view.pane.y = u16At(d + 2);
            view.pane.rwTop = u16At(d + 4);
            view.pane.colLeft = u16At(d + 6);
            view.pane.pnnAcct = d[8];
            break;
        case Rec::Selection:
            checkSize(n >= 9, "Selection");
            sheet_.selections.emplace_back(d, d + n);
            break;
        case Rec::MergeCells: {
            checkSize(n >= 2, "MergeCells");
            size_t count = u16At(d);
            checkSize(n == 2 + 8 * count, "MergeCells");
            for (size_t i = 0; i < count; ++i) {
                const uint8_t* p = d + 2 + 8 * i;
                Ref8 ref;
                ref.rwFirst = u16At(p);
                ref.rwLast = u16At(p + 2);
                ref.colFirst = u16At(p + 4);
                ref.colLast = u16At(p + 6);
                if (ref.rwFirst <= ref.rwLast && ref.colFirst <= ref.colLast &&
                    rowWanted(ref.rwFirst))
                    sheet_.merges().push_back(ref);
            }
            break;
        }
        case Rec::SheetExt:
            checkSize(n >= 20, "SheetExt");
            sheet_.sheetExt.assign(d, d + n);
            if ((d[16] & 0x7F) != 0x7F) sheet_.setTabColorIndex(d[16] & 0x7F);
            break;
        case Rec::String:
            break;  // a cached string without its formula has no cell to go to
        default:
            keepRecord(r);
            return;
    }
    lastList_ = nullptr;
}

// Counts the cell records of the substream ahead, hopping from header to header.
CellStore::Counts countCellRecords(const xls::RecordReader& reader) {
    CellStore::Counts counts;
    xls::RecordReader ahead = reader;
    xls::Record record;
    int depth = 0;
    try {
        while (ahead.next(record)) {
            switch (record.type) {
                case Rec::Bof: ++depth; break;
                case Rec::Eof:
                    if (--depth <= 0) return counts;
                    break;
                case Rec::Rk: ++counts.rk; break;
                case Rec::MulRk: counts.rk += record.size / 6; break;
                case Rec::Number: ++counts.number; break;
                case Rec::LabelSst: ++counts.labelSst; break;
                case Rec::Blank: ++counts.blank; break;
                case Rec::MulBlank: counts.blank += record.size / 2; break;
                case Rec::BoolErr: ++counts.boolErr; break;
                case Rec::Label: case Rec::RString: ++counts.label; break;
                case Rec::Formula: ++counts.formula; break;
                default: break;
            }
        }
    } catch (const qrerror&) {
        // A damaged stream is reported by the reader proper.
    }
    return counts;
}

}  // namespace

void readSheetSubstream(SheetImplT& sheet, xls::RecordReader& reader, const SheetReadOptions& options) {
    CellStore::Counts counts = countCellRecords(reader);
    if (options.skipBlanks) counts.blank = 0;
    if (options.firstRow < 0 && options.endRow < 0) sheet.cells().reserve(counts);
    SheetReader(sheet, reader, options).run();
    sheet.invalidateUsedRange();
}

}  // namespace quire
