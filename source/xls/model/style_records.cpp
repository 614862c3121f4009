#include "style_records.h"

#include "api/wide_text.h"
#include "book_impl.h"
#include "field_cursor.h"
#include "record_text.h"
#include "xls/record_writer.h"

namespace quire {
namespace {

constexpr uint16_t kFontRecord = 0x0031;
constexpr uint16_t kFormatRecord = 0x041E;
constexpr uint16_t kXfRecord = 0x00E0;
constexpr uint16_t kStyleRecord = 0x0293;
constexpr uint16_t kPaletteRecord = 0x0092;

// BIFF5 XFs keep alignment and borders in other places; these convert through the setters.
void readBiff5XfTail(FormatImplT& format, FieldCursor& in) {
    uint8_t align = in.u8();
    uint8_t orientation = in.u8();
    uint32_t fillAndBottom = in.u32();
    uint32_t borders = in.u32();
    format.setAlignH(align & 7);
    format.setWrap((align >> 3) & 1);
    format.setAlignV((align >> 4) & 7);
    static const int rotations[] = {0, 255, 90, 180};
    format.setRotation(rotations[orientation & 3]);
    format.setPatternForegroundColor(fillAndBottom & 0x7F);
    format.setPatternBackgroundColor((fillAndBottom >> 7) & 0x7F);
    format.setFillPattern((fillAndBottom >> 16) & 0x3F);
    format.setBorderBottom((fillAndBottom >> 22) & 7);
    format.setBorderBottomColor((fillAndBottom >> 25) & 0x7F);
    format.setBorderTop(borders & 7);
    format.setBorderLeft((borders >> 3) & 7);
    format.setBorderRight((borders >> 6) & 7);
    format.setBorderTopColor((borders >> 9) & 0x7F);
    format.setBorderLeftColor((borders >> 16) & 0x7F);
    format.setBorderRightColor((borders >> 23) & 0x7F);
}

}  // namespace

void readFontRecord(BookImplT& book, const uint8_t* data, size_t size, bool biff5) {
    if (size < 14) throw qrerror("Font size is incorrect");
    FieldCursor in(data, size, "error in Font record");
    FontImplT font(&book);
    font.dyHeight = in.u16();
    font.grbit = in.u16();
    font.icv = in.u16();
    font.bls = in.u16();
    font.sss = in.u16();
    font.uls = in.u8();
    font.bFamily = in.u8();
    font.bCharSet = in.u8();
    font.reserved = in.u8();
    size_t pos = in.pos();
    font.fontName = biff5 ? readByteString(data, size, pos, true, "error in Font record")
                          : readUnicodeString(data, size, pos, true, "error in Font record");
    *book.appendFont() = font;
}

void readFormatRecord(BookImplT& book, const uint8_t* data, size_t size, bool biff5) {
    if (size < 3) throw qrerror("Format size is incorrect");
    FieldCursor in(data, size, "Format size is incorrect");
    uint16_t id = in.u16();
    // Some writers declare one character more than they store; the characters present are kept.
    size_t count = biff5 ? in.u8() : in.u16();
    bool highByte = !biff5 && in.left() > 0 && (in.u8() & 0x01) != 0;
    size_t available = highByte ? in.left() / 2 : in.left();
    if (count > available) count = available;
    std::wstring text;
    text.reserve(count);
    const uint8_t* chars = data + in.pos();
    if (highByte) {
        std::u16string units(count, u'\0');
        for (size_t i = 0; i < count; ++i)
            units[i] = static_cast<char16_t>(chars[2 * i] | (chars[2 * i + 1] << 8));
        text = fromUtf16(units.data(), units.size());
    } else {
        text.assign(chars, chars + count);
    }
    book.numFormats().put(id, text);
}

void readXfRecord(BookImplT& book, const uint8_t* data, size_t size, bool biff5) {
    FormatImplT* format = book.appendFormat();
    FieldCursor in(data, size, "XF size is incorrect");
    // A record may stop after any of the first fields; the rest keep their defaults.
    format->ifnt = in.u16();
    if (in.left() == 0) return;
    format->ifmt = in.u16();
    if (in.left() == 0) return;
    format->protection = in.u16();
    if (in.left() == 0) return;
    if (biff5) {
        readBiff5XfTail(*format, in);
        format->alignment &= ~(FormatImplT::kAtrNum | FormatImplT::kAtrFnt | FormatImplT::kAtrAlc |
                               FormatImplT::kAtrBdr | FormatImplT::kAtrPat | FormatImplT::kAtrProt);
    } else {
        format->alignment = in.u32();
        if (in.left() == 0) return;
        format->border1 = in.u32();
        if (in.left() == 0) return;
        format->border2 = in.u32();
        if (in.left() == 0) return;
        format->fill = in.u16();
    }
    if (in.left() != 0) throw qrerror("XF size is incorrect");
}

void readStyleRecord(BookImplT& book, const uint8_t* data, size_t size, bool biff5) {
    FieldCursor in(data, size, "Style size is incorrect");
    StyleRecord style;
    style.ixfe = in.u16();
    if (style.builtIn()) {
        style.istyBuiltIn = in.u8();
        style.iLevel = in.u8();
    } else {
        size_t pos = in.pos();
        style.name = biff5 ? readByteString(data, size, pos, true, "Style size is incorrect")
                           : readUnicodeString(data, size, pos, false, "Style size is incorrect");
        in.setPos(pos);
    }
    if (in.left() != 0) throw qrerror("Style size is incorrect");
    book.styles().push_back(std::move(style));
}

void readPaletteRecord(BookImplT& book, const uint8_t* data, size_t size) {
    FieldCursor in(data, size, "Palette size is incorrect");
    uint16_t count = in.u16();
    if (size != 2 + 4u * count) throw qrerror("Palette size is incorrect");
    auto& palette = book.palette();
    for (uint16_t i = 0; i < count; ++i) {
        uint32_t rgb = in.u32() & 0x00FFFFFF;
        if (i < palette.size()) palette[i] = rgb;  // a longer palette than 56 entries has no indexes
    }
    book.setPaletteChanged(true);
}

void writeFontRecords(BookImplT& book, xls::RecordWriter& out) {
    std::vector<uint8_t> data;
    for (const auto& font : book.fonts()) {
        data.clear();
        putU16(data, font->dyHeight);
        putU16(data, font->grbit);
        putU16(data, font->icv);
        putU16(data, font->bls);
        putU16(data, font->sss);
        putU8(data, font->uls);
        putU8(data, font->bFamily);
        putU8(data, font->bCharSet);
        putU8(data, font->reserved);
        appendUnicodeString(data, font->fontName, true);
        out.writeRecord(kFontRecord, data);
    }
}

void writeFormatRecords(BookImplT& book, xls::RecordWriter& out) {
    std::vector<uint8_t> data;
    for (const auto& entry : book.numFormats().all()) {
        data.clear();
        putU16(data, static_cast<uint16_t>(entry.first));
        appendUnicodeString(data, entry.second, false);
        out.writeRecord(kFormatRecord, data);
    }
}

void writeXfRecords(BookImplT& book, xls::RecordWriter& out) {
    std::vector<uint8_t> data;
    for (const auto& format : book.formats()) {
        data.clear();
        putU16(data, format->ifnt);
        putU16(data, format->ifmt);
        putU16(data, format->protection);
        putU32(data, format->alignment);
        putU32(data, format->border1);
        putU32(data, format->border2);
        putU16(data, format->fill);
        out.writeRecord(kXfRecord, data);
    }
}

void writeStyleRecords(BookImplT& book, xls::RecordWriter& out) {
    std::vector<uint8_t> data;
    for (const auto& style : book.styles()) {
        data.clear();
        putU16(data, style.ixfe);
        if (style.builtIn()) {
            putU8(data, style.istyBuiltIn);
            putU8(data, style.iLevel);
        } else {
            appendUnicodeString(data, style.name, false);
        }
        out.writeRecord(kStyleRecord, data);
        for (const auto& ext : style.extensions) out.writeRecord(ext.id, ext.data);
    }
}

void writePaletteRecord(BookImplT& book, xls::RecordWriter& out) {
    if (!book.paletteChanged()) return;
    std::vector<uint8_t> data;
    putU16(data, static_cast<uint16_t>(book.palette().size()));
    for (uint32_t rgb : book.palette()) putU32(data, rgb & 0x00FFFFFF);
    out.writeRecord(kPaletteRecord, data);
}

}  // namespace quire
