#pragma once
// A cell format of an Open XML book: one xf element of cellXfs. Borders and fills are shared
// elements of the styles part; a format changes only a border and a fill of its own.
#include <string>

#include "api/IFormatT.h"
#include "xlsx/xml_styles.h"

namespace quire {

template <class TCHAR, class Tag>
class XMLFormatImplT : public IFormatPrivate<TCHAR> {
public:
    using Xf = typename StyleElements<Tag>::Xf;
    using Border = typename StyleElements<Tag>::Border;
    using Fill = typename StyleElements<Tag>::Fill;

    XMLFormatImplT(Styles<Tag>* styles, Xf* xf);
    Xf& element() const { return *xf_; }
    // Takes the properties of a format of either kind of book.
    void copyFrom(IFormatT<TCHAR>& source);

    IFontT<TCHAR>* font() override;
    bool setFont(IFontT<TCHAR>* font) override;
    int numFormat() const override;
    void setNumFormat(int numFormat) override;
    int alignH() const override;
    void setAlignH(int align) override;
    int alignV() const override;
    void setAlignV(int align) override;
    bool wrap() const override;
    void setWrap(bool wrap) override;
    int rotation() const override;
    bool setRotation(int rotation) override;
    int indent() const override;
    void setIndent(int indent) override;
    bool shrinkToFit() const override;
    void setShrinkToFit(bool shrinkToFit) override;
    void setBorder(int style) override;
    void setBorderColor(int color) override;
    int borderLeft() const override;
    void setBorderLeft(int style) override;
    int borderRight() const override;
    void setBorderRight(int style) override;
    int borderTop() const override;
    void setBorderTop(int style) override;
    int borderBottom() const override;
    void setBorderBottom(int style) override;
    int borderLeftColor() const override;
    void setBorderLeftColor(int color) override;
    int borderRightColor() const override;
    void setBorderRightColor(int color) override;
    int borderTopColor() const override;
    void setBorderTopColor(int color) override;
    int borderBottomColor() const override;
    void setBorderBottomColor(int color) override;
    int borderDiagonal() const override;
    void setBorderDiagonal(int border) override;
    int borderDiagonalStyle() const override;
    void setBorderDiagonalStyle(int style) override;
    int borderDiagonalColor() const override;
    void setBorderDiagonalColor(int color) override;
    int fillPattern() const override;
    void setFillPattern(int pattern) override;
    int patternForegroundColor() const override;
    void setPatternForegroundColor(int color) override;
    int patternBackgroundColor() const override;
    void setPatternBackgroundColor(int color) override;
    bool locked() const override;
    void setLocked(bool locked) override;
    bool hidden() const override;
    void setHidden(bool hidden) override;
    bool rgbMode() const override;
    void setRgbMode(bool rgbMode) override;
    const TCHAR* customNumFormatText() override;

private:
    enum Side { Left, Right, Top, Bottom, Diagonal };
    // The border and fill the xf points at (shared ones included), or null.
    const Border* currentBorder() const;
    const Fill* currentFill() const;
    Border& ownBorder();
    Fill& ownFill();
    int sideStyle(Side side) const;
    int sideColor(Side side) const;
    void setSideStyle(Side side, int style);
    void setSideColor(Side side, int color);

    Styles<Tag>* styles_;
    Xf* xf_;
    Border* border_ = nullptr;
    Fill* fill_ = nullptr;
};

}  // namespace quire
