#include "name_records.h"

#include "api/wide_text.h"
#include "book_impl.h"
#include "field_cursor.h"
#include "xls/record_writer.h"

namespace quire {
namespace {

constexpr size_t kMaxLblLength = 8223;

}  // namespace

void readLblRecord(BookImplT& book, const uint8_t* data, size_t size) {
    FieldCursor in(data, size, "Lbl: file is corrupt");
    DefinedName name;
    name.flags = in.u16();
    name.chKey = in.u8();
    size_t count = in.u8();
    size_t cce = in.u16();
    in.skip(2);
    name.itab = in.u16();
    in.skip(4);
    if (count > 0) {
        bool highByte = (in.u8() & 0x01) != 0;
        std::u16string units;
        for (size_t i = 0; i < count; ++i) units.push_back(highByte ? in.u16() : in.u8());
        name.text = fromUtf16(units.data(), units.size());
    }
    if (in.left() < cce) throw qrerror("Lbl: file is corrupt");
    name.rgce.assign(data + in.pos(), data + in.pos() + cce);
    name.rgcb.assign(data + in.pos() + cce, data + size);
    book.names().push_back(std::move(name));
}

void readExternSheetRecord(BookImplT& book, const uint8_t* data, size_t size) {
    if (size < 2) throw qrerror("error in record ExternSheet");
    size_t count = data[0] | (data[1] << 8);
    if (size != 2 + 6 * count) throw qrerror("error in record ExternSheet");
    FieldCursor in(data + 2, size - 2, "error in XTI");
    auto& entries = book.externSheets();
    entries.clear();
    for (size_t i = 0; i < count; ++i) {
        XtiEntry e;
        e.iSupBook = in.u16();
        e.itabFirst = in.u16();
        e.itabLast = in.u16();
        entries.push_back(e);
    }
}

void writeExternalReferencesAndNames(BookImplT& book, xls::RecordWriter& out) {
    auto& supBooks = book.supBooks();
    for (auto& block : supBooks) {
        for (size_t i = 0; i < block.records.size(); ++i) {
            KeptRecord record = block.records[i];
            if (i == 0 && block.selfReference()) {
                auto sheets = static_cast<uint16_t>(book.sheets().size());
                record.data[0] = static_cast<uint8_t>(sheets);
                record.data[1] = static_cast<uint8_t>(sheets >> 8);
            }
            out.writeRecord(record.id, record.data);
        }
    }
    if (!supBooks.empty()) {
        const auto& entries = book.externSheets();
        out.beginRecord(GlobalsRecord::ExternSheet);
        out.writeUInt16(static_cast<uint16_t>(entries.size()));
        for (const auto& e : entries) {
            out.reserveRoom(6, "error in record ExternSheet");
            out.writeUInt16(e.iSupBook);
            out.writeUInt16(e.itabFirst);
            out.writeUInt16(e.itabLast);
        }
        out.endRecord();
    }
    std::vector<uint8_t> data;
    for (const auto& name : book.names()) {
        std::u16string units = toUtf16(name.text);
        bool oneByte = true;
        for (char16_t unit : units) oneByte = oneByte && unit < 0x100;
        data.clear();
        putU16(data, name.flags);
        putU8(data, name.chKey);
        putU8(data, static_cast<uint8_t>(units.size()));
        putU16(data, static_cast<uint16_t>(name.rgce.size()));
        putU16(data, 0);
        putU16(data, name.itab);
        putU32(data, 0);
        if (!units.empty()) {
            putU8(data, oneByte ? 0 : 1);
            for (char16_t unit : units) {
                if (oneByte) putU8(data, static_cast<uint8_t>(unit));
                else putU16(data, static_cast<uint16_t>(unit));
            }
        }
        data.insert(data.end(), name.rgce.begin(), name.rgce.end());
        data.insert(data.end(), name.rgcb.begin(), name.rgcb.end());
        if (data.size() > kMaxLblLength) data.resize(kMaxLblLength);
        out.writeRecord(GlobalsRecord::Lbl, data);
    }
}

}  // namespace quire
