// Writing a worksheet substream, in the record order spreadsheet programs expect.
#include <algorithm>
#include <cstring>

#include "api/wide_text.h"
#include "book_impl.h"
#include "field_cursor.h"
#include "record_text.h"
#include "sheet_impl.h"
#include "sheet_record_types.h"
#include "sheet_records.h"
#include "xls/record_writer.h"

namespace quire {
namespace {

namespace Rec = SheetRecord;

constexpr size_t kMergesPerRecord = 1026;

class SheetWriter {
public:
    SheetWriter(SheetImplT& sheet, xls::RecordWriter& out) : sheet_(sheet), out_(out) {}
    void run();

private:
    void record(uint16_t type) { out_.writeRecord(type, data_); }
    void u16Record(uint16_t type, uint16_t value) {
        data_.clear();
        putU16(data_, value);
        record(type);
    }
    void writeKept(const std::vector<KeptRecord>& records) {
        for (const auto& kept : records) out_.writeRecord(kept.id, kept.data);
    }
    void writeBof();
    void writeSettingsBeforeCells(size_t& indexPosition);
    void writeRows();
    void writeCells();
    void writeFormula(const FormulaCell& cell);
    void writeStringRecord(const std::wstring& text);
    void writeView();
    void writeMergesAndExtensions();

    SheetImplT& sheet_;
    xls::RecordWriter& out_;
    std::vector<uint8_t> data_;
};

void SheetWriter::writeBof() {
    data_.clear();
    const auto& globalsBof = sheet_.book()->globals().bof;
    data_.assign(globalsBof.begin(), globalsBof.end());
    data_.resize(16, 0);
    data_[0] = 0x00;
    data_[1] = 0x06;
    data_[2] = 0x10;  // a worksheet substream
    data_[3] = 0x00;
    record(Rec::Bof);
}

void SheetWriter::writeSettingsBeforeCells(size_t& indexPosition) {
    u16Record(Rec::Uncalced, 0);
    // Index: no DBCell offsets of our own; ibXF is patched once DefColWidth's place is known.
    int firstRow = sheet_.firstRow(), lastRow = sheet_.lastRow();
    data_.clear();
    putU32(data_, 0);
    putU32(data_, static_cast<uint32_t>(firstRow));
    putU32(data_, static_cast<uint32_t>(lastRow));
    putU32(data_, 0);
    indexPosition = out_.position() + 4 + 12;
    record(Rec::Index);

    u16Record(Rec::CalcMode, sheet_.calcMode);
    u16Record(Rec::CalcCount, sheet_.calcCount);
    u16Record(Rec::CalcRefMode, sheet_.refR1C1() ? 0 : 1);
    u16Record(Rec::CalcIter, sheet_.calcIter);
    data_.clear();
    putF64(data_, sheet_.calcDelta);
    record(Rec::CalcDelta);
    u16Record(Rec::CalcSaveRecalc, sheet_.calcSaveRecalc);

    const PageSettings& page = sheet_.page();
    u16Record(Rec::PrintRowCol, page.printRowCol ? 1 : 0);
    u16Record(Rec::PrintGrid, page.printGrid ? 1 : 0);
    u16Record(Rec::GridSet, sheet_.gridSet);

    int rowLevels = 0, colLevels = 0;
    for (const auto& entry : sheet_.rows()) rowLevels = std::max(rowLevels, entry.second.outlineLevel());
    for (const auto& info : sheet_.cols()) colLevels = std::max(colLevels, info.outlineLevel());
    data_.clear();
    putU16(data_, static_cast<uint16_t>(rowLevels ? 17 + 12 * rowLevels : 0));
    putU16(data_, static_cast<uint16_t>(colLevels ? 17 + 12 * colLevels : 0));
    putU16(data_, static_cast<uint16_t>(rowLevels ? rowLevels + 1 : 0));
    putU16(data_, static_cast<uint16_t>(colLevels ? colLevels + 1 : 0));
    record(Rec::Guts);

    data_.clear();
    putU16(data_, sheet_.defaultRowHeightFlags);
    putU16(data_, sheet_.defaultRowHeight);
    record(Rec::DefaultRowHeight);
    u16Record(Rec::WsBool, sheet_.wsBool().grbit);

    auto writeBreaks = [&](uint16_t type, const std::vector<PageBreak>& breaks) {
        if (breaks.empty()) return;
        data_.clear();
        putU16(data_, static_cast<uint16_t>(breaks.size()));
        for (const auto& b : breaks) {
            putU16(data_, b.index);
            putU16(data_, b.start);
            putU16(data_, b.end);
        }
        record(type);
    };
    writeBreaks(Rec::HorizontalPageBreaks, sheet_.horizontalBreaks());
    writeBreaks(Rec::VerticalPageBreaks, sheet_.verticalBreaks());

    auto writeText = [&](uint16_t type, const std::wstring& text) {
        data_.clear();
        if (!text.empty()) appendUnicodeString(data_, text, false);
        record(type);
    };
    writeText(Rec::Header, page.header);
    writeText(Rec::Footer, page.footer);
    u16Record(Rec::HCenter, page.hCenter ? 1 : 0);
    u16Record(Rec::VCenter, page.vCenter ? 1 : 0);
    auto writeMargin = [&](uint16_t type, double value) {
        data_.clear();
        putF64(data_, value);
        record(type);
    };
    writeMargin(Rec::LeftMargin, page.leftMargin);
    writeMargin(Rec::RightMargin, page.rightMargin);
    writeMargin(Rec::TopMargin, page.topMargin);
    writeMargin(Rec::BottomMargin, page.bottomMargin);
    writeKept(sheet_.printerSettings);
    const Setup& s = page.setup;
    data_.clear();
    putU16(data_, s.iPaperSize);
    putU16(data_, s.iScale);
    putU16(data_, static_cast<uint16_t>(s.iPageStart));
    putU16(data_, s.iFitWidth);
    putU16(data_, s.iFitHeight);
    putU16(data_, s.grbit);
    putU16(data_, s.iRes);
    putU16(data_, s.iVRes);
    putF64(data_, s.numHdr);
    putF64(data_, s.numFtr);
    putU16(data_, s.iCopies);
    record(Rec::Setup);

    const ProtectionSettings& protection = sheet_.protection();
    if (protection.protect) {
        u16Record(Rec::Protect, 1);
        if (protection.password) u16Record(Rec::Password, protection.password);
    }

    out_.patchUInt32(indexPosition, static_cast<uint32_t>(out_.position()));
    u16Record(Rec::DefColWidth, sheet_.defColWidth);
    if (sheet_.standardWidth) u16Record(Rec::StandardWidth, sheet_.standardWidth);
    for (const auto& info : sheet_.cols()) {
        data_.clear();
        putU16(data_, info.colFirst);
        putU16(data_, info.colLast);
        putU16(data_, info.coldx);
        putU16(data_, info.ixfe);
        putU16(data_, info.grbit);
        putU16(data_, 0);
        record(Rec::ColInfo);
    }
    writeKept(sheet_.keptBeforeCells);

    data_.clear();
    putU32(data_, static_cast<uint32_t>(firstRow));
    putU32(data_, static_cast<uint32_t>(lastRow));
    putU16(data_, static_cast<uint16_t>(sheet_.firstCol()));
    putU16(data_, static_cast<uint16_t>(sheet_.lastCol()));
    putU16(data_, 0);
    record(Rec::Dimensions);
}

void SheetWriter::writeRows() {
    CellStore& cells = sheet_.cells();
    for (const auto& entry : sheet_.rows()) {
        const RowInfo& info = entry.second;
        int colMic = 0, colMac = 0;
        if (static_cast<size_t>(entry.first) < cells.rowCount()) {
            const auto& words = cells.rowWords(entry.first);
            auto first = std::find_if(words.begin(), words.end(), [](uint32_t w) { return (w & 1u) != 0; });
            if (first != words.end()) {
                colMic = static_cast<int>(first - words.begin());
                auto last = std::find_if(words.rbegin(), words.rend(), [](uint32_t w) { return (w & 1u) != 0; });
                colMac = static_cast<int>(words.rend() - last);
            }
        }
        data_.clear();
        putU16(data_, info.rw);
        putU16(data_, static_cast<uint16_t>(colMic));
        putU16(data_, static_cast<uint16_t>(colMac));
        putU16(data_, info.miyRw);
        putU16(data_, 0);
        putU16(data_, 0);
        putU16(data_, static_cast<uint16_t>(info.grbit | 0x0100));
        putU16(data_, info.ixfeFlags);
        record(Rec::Row);
    }
}

void SheetWriter::writeFormula(const FormulaCell& cell) {
    if (cell.formula.empty()) throw qrerror("formula can't be saved: it was not compiled");
    data_.clear();
    putU16(data_, cell.rw);
    putU16(data_, cell.col);
    putU16(data_, cell.ixfe);
    switch (cell.result) {
        case FormulaResult::Number:
        case FormulaResult::None:
            putF64(data_, cell.num);
            break;
        default: {
            uint8_t kind = cell.result == FormulaResult::String ? 0
                         : cell.result == FormulaResult::Boolean ? 1
                         : cell.result == FormulaResult::Error ? 2 : 3;
            uint8_t value[8] = {kind, 0, cell.boolOrError, 0, 0, 0, 0xFF, 0xFF};
            data_.insert(data_.end(), value, value + 8);
            break;
        }
    }
    putU16(data_, static_cast<uint16_t>(cell.grbit | 0x0001));
    putU32(data_, 0);
    data_.insert(data_.end(), cell.formula.begin(), cell.formula.end());
    record(Rec::Formula);
    writeKept(cell.shared);
    if (cell.result == FormulaResult::String) writeStringRecord(cell.text);
}

// A long cached text goes on in CONTINUE records, each starting again with the flags byte.
void SheetWriter::writeStringRecord(const std::wstring& text) {
    std::u16string units = toUtf16(text);
    if (units.size() > 65535) units.resize(65535);
    out_.beginRecord(Rec::String);
    out_.writeUInt16(static_cast<uint16_t>(units.size()));
    out_.writeUInt8(0x01);
    for (char16_t unit : units) {
        if (out_.roomLeft() < 2) {
            out_.continueRecord();
            out_.writeUInt8(0x01);
        }
        out_.writeUInt16(static_cast<uint16_t>(unit));
    }
    out_.endRecord();
}

namespace {

// Little-endian stores into a record built on the stack.
inline void store16(uint8_t* p, uint16_t v) {
    p[0] = static_cast<uint8_t>(v);
    p[1] = static_cast<uint8_t>(v >> 8);
}
inline void store32(uint8_t* p, uint32_t v) {
    for (int i = 0; i < 4; ++i) p[i] = static_cast<uint8_t>(v >> (8 * i));
}
inline void storePosition(uint8_t* p, const CellPosition& cell) {
    store16(p, cell.rw);
    store16(p + 2, cell.col);
    store16(p + 4, cell.ixfe);
}

}  // namespace

void SheetWriter::writeCells() {
    CellStore& cells = sheet_.cells();
    const SharedStringTable& strings = sheet_.book()->sharedStrings();
    uint8_t fixed[16];
    for (size_t row = 0; row < cells.rowCount(); ++row) {
        const auto& words = cells.rowWords(row);
        for (size_t col = 0; col < words.size(); ++col) {
            uint32_t w = words[col];
            if (!(w & 1u)) continue;
            switch (CellStore::kindOf(w)) {
                case CellKind::Rk: {
                    const RkCell& c = cells.rk(w);
                    storePosition(fixed, c);
                    store32(fixed + 6, c.rk);
                    out_.writeRecord(Rec::Rk, fixed, 10);
                    break;
                }
                case CellKind::Number: {
                    const NumberCell& c = cells.number(w);
                    storePosition(fixed, c);
                    std::memcpy(fixed + 6, &c.num, 8);
                    out_.writeRecord(Rec::Number, fixed, 14);
                    break;
                }
                case CellKind::LabelSst: {
                    const LabelSstCell& c = cells.labelSst(w);
                    if (!strings.contains(c.isst)) throw qrerror("StrMap: sst is out of range (2)");
                    storePosition(fixed, c);
                    store32(fixed + 6, c.isst);
                    out_.writeRecord(Rec::LabelSst, fixed, 10);
                    break;
                }
                case CellKind::Blank:
                    storePosition(fixed, cells.blank(w));
                    out_.writeRecord(Rec::Blank, fixed, 6);
                    break;
                case CellKind::BoolErr: {
                    const BoolErrCell& c = cells.boolErr(w);
                    storePosition(fixed, c);
                    fixed[6] = c.bBoolErr;
                    fixed[7] = c.fError;
                    out_.writeRecord(Rec::BoolErr, fixed, 8);
                    break;
                }
                case CellKind::Label: {
                    const LabelCell& c = cells.label(w);
                    data_.clear();
                    putU16(data_, c.rw); putU16(data_, c.col); putU16(data_, c.ixfe);
                    appendUnicodeString(data_, c.text, false);
                    record(Rec::Label);
                    break;
                }
                case CellKind::Formula:
                    writeFormula(cells.formula(w));
                    break;
                case CellKind::None:
                    break;
            }
        }
    }
}

void SheetWriter::writeView() {
    const ViewSettings& view = sheet_.view();
    data_.clear();
    putU16(data_, view.window2.grbit);
    putU16(data_, view.window2.rwTop);
    putU16(data_, view.window2.colLeft);
    putU32(data_, view.window2.icvHdr);
    putU16(data_, view.window2.wScaleSLV);
    putU16(data_, view.window2.wScaleNormal);
    putU32(data_, 0);
    record(Rec::Window2);
    if (view.sclPresent) {
        data_.clear();
        putU16(data_, view.sclNumerator);
        putU16(data_, view.sclDenominator);
        record(Rec::Scl);
    }
    if (view.pane.present) {
        data_.clear();
        putU16(data_, view.pane.x);
        putU16(data_, view.pane.y);
        putU16(data_, view.pane.rwTop);
        putU16(data_, view.pane.colLeft);
        putU8(data_, view.pane.pnnAcct);
        putU8(data_, 0);
        record(Rec::Pane);
    }
    for (const auto& selection : sheet_.selections) out_.writeRecord(Rec::Selection, selection);
}

void SheetWriter::writeMergesAndExtensions() {
    const auto& merges = sheet_.merges();
    for (size_t start = 0; start < merges.size(); start += kMergesPerRecord) {
        size_t count = std::min(kMergesPerRecord, merges.size() - start);
        data_.clear();
        putU16(data_, static_cast<uint16_t>(count));
        for (size_t i = start; i < start + count; ++i) {
            putU16(data_, merges[i].rwFirst);
            putU16(data_, merges[i].rwLast);
            putU16(data_, merges[i].colFirst);
            putU16(data_, merges[i].colLast);
        }
        record(Rec::MergeCells);
    }
    writeKept(sheet_.keptAfterView);
    if (sheet_.tabColor() >= 0 || !sheet_.sheetExt.empty()) {
        data_ = sheet_.sheetExt;
        if (data_.size() < 20) {
            data_.assign(20, 0);
            data_[0] = 0x62;
            data_[1] = 0x08;
            data_[12] = 20;  // cb: the base structure only
            data_[16] = 0x7F;
        }
        if (sheet_.tabColor() >= 0) data_[16] = static_cast<uint8_t>((data_[16] & 0x80) | (sheet_.tabColor() & 0x7F));
        record(Rec::SheetExt);
    }
}

void SheetWriter::run() {
    if (!sheet_.rawSubstream.empty()) {
        writeKept(sheet_.rawSubstream);
        return;
    }
    writeBof();
    size_t indexPosition = 0;
    writeSettingsBeforeCells(indexPosition);
    writeRows();
    writeCells();
    writeKept(sheet_.keptAfterCells);
    writeView();
    writeMergesAndExtensions();
    data_.clear();
    record(Rec::Eof);
}

}  // namespace

void writeSheetSubstream(SheetImplT& sheet, xls::RecordWriter& out) { SheetWriter(sheet, out).run(); }

}  // namespace quire
