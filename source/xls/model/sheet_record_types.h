#pragma once
#include <cstdint>

#include "cell_store.h"
#include "xls/record_reader.h"

namespace quire {

// Record types of a worksheet substream.
namespace SheetRecord {
constexpr uint16_t Formula = 0x0006,
                   Eof = 0x000A,
                   CalcCount = 0x000C,
                   CalcMode = 0x000D,
                   CalcRefMode = 0x000F,
                   CalcDelta = 0x0010,
                   CalcIter = 0x0011,
                   Protect = 0x0012,
                   Password = 0x0013,
                   Header = 0x0014,
                   Footer = 0x0015,
                   VerticalPageBreaks = 0x001A,
                   HorizontalPageBreaks = 0x001B,
                   Selection = 0x001D,
                   LeftMargin = 0x0026,
                   RightMargin = 0x0027,
                   TopMargin = 0x0028,
                   BottomMargin = 0x0029,
                   PrintRowCol = 0x002A,
                   PrintGrid = 0x002B,
                   Continue = 0x003C,
                   Pane = 0x0041,
                   Pls = 0x004D,
                   DefColWidth = 0x0055,
                   Uncalced = 0x005E,
                   CalcSaveRecalc = 0x005F,
                   ColInfo = 0x007D,
                   Guts = 0x0080,
                   WsBool = 0x0081,
                   GridSet = 0x0082,
                   HCenter = 0x0083,
                   VCenter = 0x0084,
                   StandardWidth = 0x0099,
                   Scl = 0x00A0,
                   Setup = 0x00A1,
                   MulRk = 0x00BD,
                   MulBlank = 0x00BE,
                   RString = 0x00D6,
                   DbCell = 0x00D7,
                   MergeCells = 0x00E5,
                   LabelSst = 0x00FD,
                   Dimensions = 0x0200,
                   Blank = 0x0201,
                   Number = 0x0203,
                   Label = 0x0204,
                   BoolErr = 0x0205,
                   FormulaBiff3 = 0x0206,
                   String = 0x0207,
                   Row = 0x0208,
                   Index = 0x020B,
                   Array = 0x0221,
                   DefaultRowHeight = 0x0225,
                   Table = 0x0236,
                   Window2 = 0x023E,
                   Rk = 0x027E,
                   FormulaBiff4 = 0x0406,
                   SharedFmla = 0x04BC,
                   Bof = 0x0809,
                   SheetExt = 0x0862;
}  // namespace SheetRecord

// A record as read, kept to be written back.
inline KeptRecord keptCopy(const xls::Record& record) {
    KeptRecord kept;
    kept.id = record.type;
    kept.data.assign(record.data, record.data + record.size);
    return kept;
}

}  // namespace quire
