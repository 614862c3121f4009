#pragma once
#include "IFontT.h"

namespace quire {

// A cell format (an extended format of the file); shared by the cells, rows and columns using it.
template <class TCHAR>
class IFormatT {
public:
    virtual IFontT<TCHAR>* font() = 0;
    virtual bool setFont(IFontT<TCHAR>* font) = 0;
    virtual int numFormat() const = 0;
    virtual void setNumFormat(int numFormat) = 0;
    virtual int alignH() const = 0;
    virtual void setAlignH(int align) = 0;
    virtual int alignV() const = 0;
    virtual void setAlignV(int align) = 0;
    virtual bool wrap() const = 0;
    virtual void setWrap(bool wrap) = 0;
    virtual int rotation() const = 0;
    virtual bool setRotation(int rotation) = 0;
    virtual int indent() const = 0;
    virtual void setIndent(int indent) = 0;
    virtual bool shrinkToFit() const = 0;
    virtual void setShrinkToFit(bool shrinkToFit) = 0;
    virtual void setBorder(int style) = 0;
    virtual void setBorderColor(int color) = 0;
    virtual int borderLeft() const = 0;
    virtual void setBorderLeft(int style) = 0;
    virtual int borderRight() const = 0;
    virtual void setBorderRight(int style) = 0;
    virtual int borderTop() const = 0;
    virtual void setBorderTop(int style) = 0;
    virtual int borderBottom() const = 0;
    virtual void setBorderBottom(int style) = 0;
    virtual int borderLeftColor() const = 0;
    virtual void setBorderLeftColor(int color) = 0;
    virtual int borderRightColor() const = 0;
    virtual void setBorderRightColor(int color) = 0;
    virtual int borderTopColor() const = 0;
    virtual void setBorderTopColor(int color) = 0;
    virtual int borderBottomColor() const = 0;
    virtual void setBorderBottomColor(int color) = 0;
    virtual int borderDiagonal() const = 0;
    virtual void setBorderDiagonal(int border) = 0;
    virtual int borderDiagonalStyle() const = 0;
    virtual void setBorderDiagonalStyle(int style) = 0;
    virtual int borderDiagonalColor() const = 0;
    virtual void setBorderDiagonalColor(int color) = 0;
    virtual int fillPattern() const = 0;
    virtual void setFillPattern(int pattern) = 0;
    virtual int patternForegroundColor() const = 0;
    virtual void setPatternForegroundColor(int color) = 0;
    virtual int patternBackgroundColor() const = 0;
    virtual void setPatternBackgroundColor(int color) = 0;
    virtual bool locked() const = 0;
    virtual void setLocked(bool locked) = 0;
    virtual bool hidden() const = 0;
    virtual void setHidden(bool hidden) = 0;
    virtual ~IFormatT() = default;
};

// Engine-side extension: the owning book's colour mode and the text of a custom number format.
template <class TCHAR>
class IFormatPrivate : public IFormatT<TCHAR> {
public:
    virtual bool rgbMode() const = 0;
    virtual void setRgbMode(bool rgbMode) = 0;
    virtual const TCHAR* customNumFormatText() = 0;
};

using IFormat = IFormatT<wchar_t>;

}  // namespace quire
