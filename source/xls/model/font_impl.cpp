#include "font_impl.h"

#include "book_impl.h"

namespace quire {

void FontImplT::setSize(int size) {
    long twentieths = static_cast<long>(size) * 20;
    if (twentieths > kMaxHeight) twentieths = kMaxHeight;
    if (twentieths < 0) twentieths = 0;  // the field is unsigned: a negative size means nothing
    dyHeight = static_cast<uint16_t>(twentieths);
}

const wchar_t* FontImplT::name() {
    book_->message().ok();
    return fontName.c_str();
}

bool FontImplT::setName(const wchar_t* name) {
    fontName = name ? name : L"";
    book_->message().ok();
    return true;
}

bool FontImplT::rgbMode() const { return book_->rgbMode(); }
void FontImplT::setRgbMode(bool rgbMode) { book_->setRgbMode(rgbMode); }

void FontImplT::copyFrom(IFontT<wchar_t>& other) {
    if (auto* binary = dynamic_cast<FontImplT*>(&other)) {
        // Same engine: take the record as it is, including the bits no setter reaches.
        dyHeight = binary->dyHeight;
        grbit = binary->grbit;
        icv = binary->icv;
        bls = binary->bls;
        sss = binary->sss;
        uls = binary->uls;
        bFamily = binary->bFamily;
        bCharSet = binary->bCharSet;
        reserved = binary->reserved;
        fontName = binary->fontName;
        return;
    }
    setSize(other.size());
    setItalic(other.italic());
    setStrikeOut(other.strikeOut());
    setColor(other.color());
    setBold(other.bold());
    setScript(other.script());
    setUnderline(other.underline());
    const wchar_t* otherName = other.name();
    fontName = otherName ? otherName : L"Arial";
}

}  // namespace quire
