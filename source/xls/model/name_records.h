#pragma once
#include <cstddef>
#include <cstdint>

namespace quire {

class BookImplT;
namespace xls { class RecordWriter; }

// Lbl and ExternSheet records (their CONTINUE data merged) into the book's names and XTI table.
void readLblRecord(BookImplT& book, const uint8_t* data, size_t size);
void readExternSheetRecord(BookImplT& book, const uint8_t* data, size_t size);

// The SupBook blocks, the ExternSheet table and every Lbl, in that order.
void writeExternalReferencesAndNames(BookImplT& book, xls::RecordWriter& out);

}  // namespace quire
