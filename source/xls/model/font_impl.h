#pragma once
#include <cstdint>
#include <string>

#include "api/IFontT.h"

namespace quire {

class BookImplT;

// One Font record of a binary book; the operations read and write its fields.
class FontImplT : public IFontPrivate<wchar_t> {
public:
    explicit FontImplT(BookImplT* book) : book_(book) {}
    void copyFrom(IFontT<wchar_t>& other);

    int size() const override { return dyHeight / 20; }
    void setSize(int size) override;
    bool italic() const override { return (grbit & kItalic) != 0; }
    void setItalic(bool italic) override { setBit(kItalic, italic); }
    bool strikeOut() const override { return (grbit & kStrikeOut) != 0; }
    void setStrikeOut(bool strikeOut) override { setBit(kStrikeOut, strikeOut); }
    int color() const override { return icv; }
    void setColor(int color) override { icv = static_cast<uint16_t>(color); }
    bool bold() const override { return bls >= 700; }
    void setBold(bool bold) override { bls = bold ? 700 : 400; }
    int script() const override { return sss; }
    void setScript(int script) override { sss = static_cast<uint16_t>(script); }
    int underline() const override { return uls; }
    void setUnderline(int underline) override { uls = static_cast<uint8_t>(underline); }
    const wchar_t* name() override;
    bool setName(const wchar_t* name) override;

    bool hasSize() const override { return true; }
    bool hasItalic() const override { return true; }
    bool hasStrikeOut() const override { return true; }
    bool hasColor() const override { return true; }
    bool hasBold() const override { return true; }
    bool hasScript() const override { return true; }
    bool hasUnderline() const override { return true; }
    bool hasName() const override { return true; }
    bool rgbMode() const override;
    void setRgbMode(bool rgbMode) override;

    BookImplT* book() const { return book_; }

    // Font record fields.
    uint16_t dyHeight = 200;
    uint16_t grbit = 0;
    uint16_t icv = 0x7FFF;
    uint16_t bls = 400;
    uint16_t sss = 0;
    uint8_t uls = 0;
    uint8_t bFamily = 0;
    uint8_t bCharSet = 0;
    uint8_t reserved = 0;
    std::wstring fontName = L"Arial";

    static constexpr uint16_t kItalic = 0x0002;
    static constexpr uint16_t kStrikeOut = 0x0008;
    static constexpr int kMaxHeight = 8191;  // twentieths of a point

private:
    void setBit(uint16_t bit, bool on) { grbit = on ? (grbit | bit) : (grbit & ~bit); }

    BookImplT* book_;
};

}  // namespace quire
