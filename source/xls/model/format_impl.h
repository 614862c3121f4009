#pragma once
#include <cstdint>

#include "api/IFormatT.h"

namespace quire {

class BookImplT;

// One XF record of a binary book. Setters write their bit field (masked to its width, so a
// value out of range never spills into a neighbouring field) and mark the attribute group used.
class FormatImplT : public IFormatPrivate<wchar_t> {
public:
    explicit FormatImplT(BookImplT* book) : book_(book) {}

    IFontT<wchar_t>* font() override;
    bool setFont(IFontT<wchar_t>* font) override;
    int numFormat() const override { return ifmt; }
    void setNumFormat(int numFormat) override;
    int alignH() const override { return field(alignment, 0, 3); }
    void setAlignH(int align) override { setAlignmentField(0, 3, align); }
    int alignV() const override { return field(alignment, 4, 3); }
    void setAlignV(int align) override { setAlignmentField(4, 3, align); }
    bool wrap() const override { return field(alignment, 3, 1) != 0; }
    void setWrap(bool wrap) override { setAlignmentField(3, 1, wrap); }
    int rotation() const override { return field(alignment, 8, 8); }
    bool setRotation(int rotation) override;
    int indent() const override { return field(alignment, 16, 4); }
    void setIndent(int indent) override { setAlignmentField(16, 4, indent); }
    bool shrinkToFit() const override { return field(alignment, 20, 1) != 0; }
    void setShrinkToFit(bool shrink) override { setAlignmentField(20, 1, shrink); }
    void setBorder(int style) override;
    void setBorderColor(int color) override;
    int borderLeft() const override { return field(border1, 0, 4); }
    void setBorderLeft(int style) override { setBorderField(border1, 0, 4, style); }
    int borderRight() const override { return field(border1, 4, 4); }
    void setBorderRight(int style) override { setBorderField(border1, 4, 4, style); }
    int borderTop() const override { return field(border1, 8, 4); }
    void setBorderTop(int style) override { setBorderField(border1, 8, 4, style); }
    int borderBottom() const override { return field(border1, 12, 4); }
    void setBorderBottom(int style) override { setBorderField(border1, 12, 4, style); }
    int borderLeftColor() const override { return field(border1, 16, 7); }
    void setBorderLeftColor(int color) override { setBorderField(border1, 16, 7, color); }
    int borderRightColor() const override { return field(border1, 23, 7); }
    void setBorderRightColor(int color) override { setBorderField(border1, 23, 7, color); }
    int borderTopColor() const override { return field(border2, 0, 7); }
    void setBorderTopColor(int color) override { setBorderField(border2, 0, 7, color); }
    int borderBottomColor() const override { return field(border2, 7, 7); }
    void setBorderBottomColor(int color) override { setBorderField(border2, 7, 7, color); }
    int borderDiagonal() const override { return field(border1, 30, 2); }
    void setBorderDiagonal(int border) override { setBorderField(border1, 30, 2, border); }
    int borderDiagonalStyle() const override { return field(border2, 21, 4); }
    void setBorderDiagonalStyle(int style) override { setBorderField(border2, 21, 4, style); }
    int borderDiagonalColor() const override { return field(border2, 14, 7); }
    void setBorderDiagonalColor(int color) override { setBorderField(border2, 14, 7, color); }
    int fillPattern() const override { return field(border2, 26, 6); }
    void setFillPattern(int pattern) override;
    int patternForegroundColor() const override { return field(fill, 0, 7); }
    void setPatternForegroundColor(int color) override;
    int patternBackgroundColor() const override { return field(fill, 7, 7); }
    void setPatternBackgroundColor(int color) override;
    bool locked() const override { return field(protection, 0, 1) != 0; }
    void setLocked(bool locked) override;
    bool hidden() const override { return field(protection, 1, 1) != 0; }
    void setHidden(bool hidden) override;

    bool rgbMode() const override;
    void setRgbMode(bool rgbMode) override;
    const wchar_t* customNumFormatText() override;

    BookImplT* book() const { return book_; }
    // Copies every property of another format, of this engine or not, into this one.
    void copyFrom(IFormatT<wchar_t>& source);

    // XF record fields.
    uint16_t ifnt = 0;
    uint16_t ifmt = 0;
    uint16_t protection = 0xFFF5;
    uint32_t alignment = 0x00000020;
    uint32_t border1 = (64u << 16) | (64u << 23);
    uint32_t border2 = 64u | (64u << 7);
    uint16_t fill = 64u | (65u << 7);

    static constexpr uint32_t kAtrNum = 1u << 26;
    static constexpr uint32_t kAtrFnt = 1u << 27;
    static constexpr uint32_t kAtrAlc = 1u << 28;
    static constexpr uint32_t kAtrBdr = 1u << 29;
    static constexpr uint32_t kAtrPat = 1u << 30;
    static constexpr uint32_t kAtrProt = 1u << 31;

private:
    static int field(uint32_t word, int shift, int width) {
        return static_cast<int>((word >> shift) & ((1u << width) - 1));
    }
    template <class Word>
    static void putField(Word& word, int shift, int width, int value) {
        uint32_t mask = ((1u << width) - 1) << shift;
        word = static_cast<Word>((word & ~mask) | ((static_cast<uint32_t>(value) << shift) & mask));
    }
    void setAlignmentField(int shift, int width, int value) {
        putField(alignment, shift, width, value);
        alignment |= kAtrAlc;
    }
    void setBorderField(uint32_t& word, int shift, int width, int value) {
        putField(word, shift, width, value);
        alignment |= kAtrBdr;
    }

    BookImplT* book_;
};

}  // namespace quire
