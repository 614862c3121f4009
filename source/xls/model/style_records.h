#pragma once
#include <cstddef>
#include <cstdint>
#include <vector>

namespace quire {

class BookImplT;
struct KeptRecord;
namespace xls { class RecordWriter; }

// Font, Format, XF, Style and Palette records of the workbook globals. Readers take one
// record's data (CONTINUE data merged) and add what it describes to the book.
void readFontRecord(BookImplT& book, const uint8_t* data, size_t size, bool biff5);
void readFormatRecord(BookImplT& book, const uint8_t* data, size_t size, bool biff5);
void readXfRecord(BookImplT& book, const uint8_t* data, size_t size, bool biff5);
void readStyleRecord(BookImplT& book, const uint8_t* data, size_t size, bool biff5);
void readPaletteRecord(BookImplT& book, const uint8_t* data, size_t size);

// Writes every font, number format, XF, style (with its StyleExt records) and, when the
// palette changed, the palette, in that order.
void writeFontRecords(BookImplT& book, xls::RecordWriter& out);
void writeFormatRecords(BookImplT& book, xls::RecordWriter& out);
void writeXfRecords(BookImplT& book, xls::RecordWriter& out);
void writeStyleRecords(BookImplT& book, xls::RecordWriter& out);
void writePaletteRecord(BookImplT& book, xls::RecordWriter& out);

}  // namespace quire
