#include "format_impl.h"

#include "api/qrerror.h"
#include "book_impl.h"

namespace quire {

IFontT<wchar_t>* FormatImplT::font() {
    FontImplT* found = book_->fontByFileIndex(ifnt);
    if (!found) book_->message().set("incorrect font");
    return found;
}

bool FormatImplT::setFont(IFontT<wchar_t>* font) {
    int fileIndex = book_->fileIndexOfFont(font);
    if (fileIndex < 0) {
        book_->message().set("specified font not found");
        return false;
    }
    ifnt = static_cast<uint16_t>(fileIndex);
    alignment |= kAtrFnt;
    book_->message().ok();
    return true;
}

void FormatImplT::setNumFormat(int numFormat) {
    ifmt = static_cast<uint16_t>(numFormat);
    alignment |= kAtrNum;
}

bool FormatImplT::setRotation(int rotation) {
    if (!((rotation >= 0 && rotation <= 180) || rotation == 255)) {
        book_->message().set("rotation must be in range 0-180 or 255");
        return false;
    }
    setAlignmentField(8, 8, rotation);
    book_->message().ok();
    return true;
}

void FormatImplT::setBorder(int style) {
    setBorderLeft(style);
    setBorderRight(style);
    setBorderTop(style);
    setBorderBottom(style);
}

void FormatImplT::setBorderColor(int color) {
    setBorderLeftColor(color);
    setBorderRightColor(color);
    setBorderTopColor(color);
    setBorderBottomColor(color);
}

void FormatImplT::setFillPattern(int pattern) {
    putField(border2, 26, 6, pattern);
    alignment |= kAtrPat;
}

void FormatImplT::setPatternForegroundColor(int color) {
    putField(fill, 0, 7, color);
    alignment |= kAtrPat;
}

void FormatImplT::setPatternBackgroundColor(int color) {
    putField(fill, 7, 7, color);
    alignment |= kAtrPat;
}

void FormatImplT::setLocked(bool locked) {
    putField(protection, 0, 1, locked);
    alignment |= kAtrProt;
}

void FormatImplT::setHidden(bool hidden) {
    putField(protection, 1, 1, hidden);
    alignment |= kAtrProt;
}

bool FormatImplT::rgbMode() const { return book_->rgbMode(); }
void FormatImplT::setRgbMode(bool rgbMode) { book_->setRgbMode(rgbMode); }

const wchar_t* FormatImplT::customNumFormatText() {
    if (ifmt < kFirstBinaryCustomNumFormat) return nullptr;
    const std::wstring* text = book_->numFormats().find(ifmt);
    return text ? text->c_str() : nullptr;
}

void FormatImplT::copyFrom(IFormatT<wchar_t>& source) {
    if (IFontT<wchar_t>* sourceFont = source.font()) {
        IFontT<wchar_t>* copy = book_->addFontCopy(sourceFont);
        setFont(copy);
    }
    int id = source.numFormat();
    if (id >= kFirstBinaryCustomNumFormat) {
        auto* privateSource = dynamic_cast<IFormatPrivate<wchar_t>*>(&source);
        const wchar_t* text = privateSource ? privateSource->customNumFormatText() : nullptr;
        if (text) {
            int newId = book_->numFormats().add(text, kFirstBinaryCustomNumFormat);
            if (newId == 0) throw qrerror("maximum number of custom formats is exceeded");
            id = newId;
        }
    }
    setNumFormat(id);
    setAlignH(source.alignH());
    setAlignV(source.alignV());
    setWrap(source.wrap());
    int rotation = source.rotation();
    if ((rotation >= 0 && rotation <= 180) || rotation == 255) setAlignmentField(8, 8, rotation);
    setIndent(source.indent());
    setShrinkToFit(source.shrinkToFit());
    setBorderLeft(source.borderLeft());
    setBorderRight(source.borderRight());
    setBorderTop(source.borderTop());
    setBorderBottom(source.borderBottom());
    setBorderDiagonal(source.borderDiagonal());
    setBorderDiagonalStyle(source.borderDiagonalStyle());
    setFillPattern(source.fillPattern());
    setLocked(source.locked());
    setHidden(source.hidden());
    auto copyColor = [](int value, auto setter) {
        if (value != -1) setter(value);
    };
    copyColor(source.borderLeftColor(), [&](int c) { setBorderLeftColor(c); });
    copyColor(source.borderRightColor(), [&](int c) { setBorderRightColor(c); });
    copyColor(source.borderTopColor(), [&](int c) { setBorderTopColor(c); });
    copyColor(source.borderBottomColor(), [&](int c) { setBorderBottomColor(c); });
    copyColor(source.borderDiagonalColor(), [&](int c) { setBorderDiagonalColor(c); });
    copyColor(source.patternForegroundColor(), [&](int c) { setPatternForegroundColor(c); });
    copyColor(source.patternBackgroundColor(), [&](int c) { setPatternBackgroundColor(c); });
}

}  // namespace quire
