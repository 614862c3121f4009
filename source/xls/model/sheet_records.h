#pragma once
#include <cstdint>

namespace quire {

class SheetImplT;
namespace xls { class RecordReader; class RecordWriter; }

// What part of a sheet substream becomes cells.
struct SheetReadOptions {
    int firstRow = -1;      // first row stored; -1: no bound
    int endRow = -1;        // one past the last row stored; -1: no bound
    bool skipBlanks = false;
    bool biff5 = false;
};

// Reads a worksheet substream from its BOF (at the reader's position) to its EOF.
void readSheetSubstream(SheetImplT& sheet, xls::RecordReader& reader, const SheetReadOptions& options);

// Writes the sheet's substream, BOF to EOF.
void writeSheetSubstream(SheetImplT& sheet, xls::RecordWriter& out);

}  // namespace quire
