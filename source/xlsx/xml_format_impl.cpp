#include "xlsx/xml_format_impl.h"

#include <cstdlib>

#include "api/enums.h"
#include "api/number_formats.h"
#include "xlsx/xml_font_impl.h"

namespace quire {

namespace {

constexpr int kBorderStyles = 14;  // none .. slantDashDot
constexpr int kFillPatterns = 19;  // none .. gray0625

bool ignoredColor(int color) { return color == -1 || color == 32767; }

template <class Border, class Side>
auto* findSide(const Border& border, Side side) {
    switch (side) {
    case 0: return border.find_left();
    case 1: return border.find_right();
    case 2: return border.find_top();
    case 3: return border.find_bottom();
    default: return border.find_diagonal();
    }
}

template <class Border, class Side>
auto& getSide(Border& border, Side side) {
    switch (side) {
    case 0: return border.get_left();
    case 1: return border.get_right();
    case 2: return border.get_top();
    case 3: return border.get_bottom();
    default: return border.get_diagonal();
    }
}

}  // namespace

template <class TCHAR, class Tag>
XMLFormatImplT<TCHAR, Tag>::XMLFormatImplT(Styles<Tag>* styles, Xf* xf) : styles_(styles), xf_(xf) {
    if (!styles) throw qrerror("XMLFormatImplT(): styles can't be 0");
    if (!xf) throw qrerror("XMLFormatImplT(): xf can't be 0");
    // Border 0 and fill 0 are the shared defaults: never changed through a format.
    auto& sheet = styles->document();
    if (auto* borders = sheet.find_borders())
        if (xf->isset_borderId() && xf->get_borderId() > 0 && xf->get_borderId() < borders->size_border())
            border_ = &borders->get_border(xf->get_borderId());
    if (auto* fills = sheet.find_fills())
        if (xf->isset_fillId() && xf->get_fillId() > 0 && xf->get_fillId() < fills->size_fill())
            fill_ = &fills->get_fill(xf->get_fillId());
}

template <class TCHAR, class Tag>
auto XMLFormatImplT<TCHAR, Tag>::currentBorder() const -> const Border* {
    if (border_) return border_;
    const auto* borders = styles_->document().find_borders();
    const std::uint32_t id = xf_->get_borderId();
    return borders && id < borders->size_border() ? &borders->get_border(id) : nullptr;
}

template <class TCHAR, class Tag>
auto XMLFormatImplT<TCHAR, Tag>::currentFill() const -> const Fill* {
    if (fill_) return fill_;
    const auto* fills = styles_->document().find_fills();
    const std::uint32_t id = xf_->get_fillId();
    return fills && id < fills->size_fill() ? &fills->get_fill(id) : nullptr;
}

template <class TCHAR, class Tag>
auto XMLFormatImplT<TCHAR, Tag>::ownBorder() -> Border& {
    if (!border_) {
        auto& borders = styles_->document().get_borders();
        const Border* shared = currentBorder();
        auto& border = borders.append_border();
        if (shared) border = *shared;  // keeps what the format showed so far
        borders.set_count(static_cast<std::uint32_t>(borders.size_border()));
        xf_->set_borderId(static_cast<std::uint32_t>(borders.size_border() - 1));
        border_ = &border;
    }
    return *border_;
}

template <class TCHAR, class Tag>
auto XMLFormatImplT<TCHAR, Tag>::ownFill() -> Fill& {
    if (!fill_) {
        auto& fills = styles_->document().get_fills();
        const Fill* shared = currentFill();
        auto& fill = fills.append_fill();
        if (shared) fill = *shared;
        fills.set_count(static_cast<std::uint32_t>(fills.size_fill()));
        xf_->set_fillId(static_cast<std::uint32_t>(fills.size_fill() - 1));
        fill_ = &fill;
    }
    return *fill_;
}

// ---- Font and number format ----

template <class TCHAR, class Tag>
IFontT<TCHAR>* XMLFormatImplT<TCHAR, Tag>::font() {
    const int id = static_cast<int>(xf_->get_fontId());
    return id < styles_->fontCount() ? styles_->font(id) : nullptr;
}

template <class TCHAR, class Tag>
bool XMLFormatImplT<TCHAR, Tag>::setFont(IFontT<TCHAR>* font) {
    const int index = styles_->fontIndex(font);
    if (index < 0) return false;
    xf_->set_fontId(static_cast<std::uint32_t>(index));
    xf_->set_applyFont(true);
    return true;
}

template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::numFormat() const {
    return static_cast<int>(xf_->get_numFmtId());
}

template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setNumFormat(int numFormat) {
    if (numFormat < 0) return;
    xf_->set_numFmtId(static_cast<std::uint32_t>(numFormat));
    xf_->set_applyNumberFormat(true);
}

template <class TCHAR, class Tag>
const TCHAR* XMLFormatImplT<TCHAR, Tag>::customNumFormatText() {
    const std::wstring* text = styles_->customNumFormat(numFormat());
    return text ? text->c_str() : nullptr;
}

// ---- Alignment ----

template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::alignH() const {
    const auto* alignment = xf_->find_alignment();
    return alignment && alignment->isset_horizontal() ? alignment->get_horizontal() : AlignHGeneral;
}

template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setAlignH(int align) {
    if (align < 0 || align > 7) return;
    xf_->get_alignment().set_horizontal(align);
    xf_->set_applyAlignment(true);
}

template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::alignV() const {
    const auto* alignment = xf_->find_alignment();
    return alignment && alignment->isset_vertical() ? alignment->get_vertical() : AlignVBottom;
}

template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setAlignV(int align) {
    if (align < 0 || align > 4) return;
    xf_->get_alignment().set_vertical(align);
    xf_->set_applyAlignment(true);
}

template <class TCHAR, class Tag>
bool XMLFormatImplT<TCHAR, Tag>::wrap() const {
    const auto* alignment = xf_->find_alignment();
    return alignment && alignment->get_wrapText();
}

template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setWrap(bool wrap) {
    xf_->get_alignment().set_wrapText(wrap);
    xf_->set_applyAlignment(true);
}

template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::rotation() const {
    const auto* alignment = xf_->find_alignment();
    if (!alignment || !alignment->isset_textRotation()) return 0;
    return std::wcstol(alignment->get_textRotation().c_str(), nullptr, 10);
}

template <class TCHAR, class Tag>
bool XMLFormatImplT<TCHAR, Tag>::setRotation(int rotation) {
    if (!((rotation >= 0 && rotation <= 180) || rotation == 255)) return false;
    xf_->get_alignment().set_textRotation(std::to_wstring(rotation));
    xf_->set_applyAlignment(true);
    return true;
}

template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::indent() const {
    const auto* alignment = xf_->find_alignment();
    return alignment ? static_cast<int>(alignment->get_indent()) : 0;
}

template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setIndent(int indent) {
    if (indent < 0 || indent > 250) return;
    xf_->get_alignment().set_indent(static_cast<std::uint32_t>(indent));
    xf_->set_applyAlignment(true);
}

template <class TCHAR, class Tag>
bool XMLFormatImplT<TCHAR, Tag>::shrinkToFit() const {
    const auto* alignment = xf_->find_alignment();
    return alignment && alignment->get_shrinkToFit();
}

template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setShrinkToFit(bool shrinkToFit) {
    xf_->get_alignment().set_shrinkToFit(shrinkToFit);
    xf_->set_applyAlignment(true);
}

// ---- Borders ----

template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::sideStyle(Side side) const {
    const Border* border = currentBorder();
    const auto* element = border ? findSide(*border, static_cast<int>(side)) : nullptr;
    return element ? element->get_style() : BorderStyleNone;
}

template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::sideColor(Side side) const {
    const Border* border = currentBorder();
    const auto* element = border ? findSide(*border, static_cast<int>(side)) : nullptr;
    const auto* color = element ? element->find_color() : nullptr;
    return color ? styles_->readColor(*color) : -1;
}

template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setSideStyle(Side side, int style) {
    if (style < 0 || style >= kBorderStyles) return;
    auto& element = getSide(ownBorder(), static_cast<int>(side));
    if (style == BorderStyleNone)
        element.unset_style();
    else
        element.set_style(style);
    xf_->set_applyBorder(true);
}

template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setSideColor(Side side, int color) {
    if (ignoredColor(color)) return;
    auto& element = getSide(ownBorder(), static_cast<int>(side)).get_color();
    element = std::remove_reference_t<decltype(element)>();
    styles_->writeColor(element, color);
}

template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setBorder(int style) {
    for (Side side : {Left, Right, Top, Bottom}) setSideStyle(side, style);
}
template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setBorderColor(int color) {
    for (Side side : {Left, Right, Top, Bottom}) setSideColor(side, color);
}
template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::borderLeft() const { return sideStyle(Left); }
template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setBorderLeft(int style) { setSideStyle(Left, style); }
template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::borderRight() const { return sideStyle(Right); }
template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setBorderRight(int style) { setSideStyle(Right, style); }
template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::borderTop() const { return sideStyle(Top); }
template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setBorderTop(int style) { setSideStyle(Top, style); }
template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::borderBottom() const { return sideStyle(Bottom); }
template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setBorderBottom(int style) { setSideStyle(Bottom, style); }
template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::borderLeftColor() const { return sideColor(Left); }
template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setBorderLeftColor(int color) { setSideColor(Left, color); }
template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::borderRightColor() const { return sideColor(Right); }
template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setBorderRightColor(int color) { setSideColor(Right, color); }
template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::borderTopColor() const { return sideColor(Top); }
template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setBorderTopColor(int color) { setSideColor(Top, color); }
template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::borderBottomColor() const { return sideColor(Bottom); }
template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setBorderBottomColor(int color) { setSideColor(Bottom, color); }
template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::borderDiagonalStyle() const { return sideStyle(Diagonal); }
template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setBorderDiagonalStyle(int style) { setSideStyle(Diagonal, style); }
template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::borderDiagonalColor() const { return sideColor(Diagonal); }
template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setBorderDiagonalColor(int color) { setSideColor(Diagonal, color); }

template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::borderDiagonal() const {
    const Border* border = currentBorder();
    if (!border) return BorderDiagonalNone;
    const bool down = border->get_diagonalDown();
    const bool up = border->get_diagonalUp();
    return down && up ? BorderDiagonalBoth : down ? BorderDiagonalDown : up ? BorderDiagonalUp : BorderDiagonalNone;
}

template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setBorderDiagonal(int diagonal) {
    if (diagonal < BorderDiagonalNone || diagonal > BorderDiagonalBoth) return;
    auto& border = ownBorder();
    const bool down = diagonal == BorderDiagonalDown || diagonal == BorderDiagonalBoth;
    const bool up = diagonal == BorderDiagonalUp || diagonal == BorderDiagonalBoth;
    if (down) border.set_diagonalDown(true); else border.unset_diagonalDown();
    if (up) border.set_diagonalUp(true); else border.unset_diagonalUp();
    xf_->set_applyBorder(true);
}

// ---- Fill ----

template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::fillPattern() const {
    const Fill* fill = currentFill();
    const auto* pattern = fill ? fill->find_patternFill() : nullptr;
    return pattern && pattern->isset_patternType() ? pattern->get_patternType() : FillPatternNone;
}

template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setFillPattern(int pattern) {
    if (pattern < 0 || pattern >= kFillPatterns) return;
    if (pattern == FillPatternNone) {
        xf_->set_fillId(0);
        fill_ = nullptr;
        return;
    }
    ownFill().get_patternFill().set_patternType(pattern);
    xf_->set_applyFill(true);
}

template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::patternForegroundColor() const {
    const Fill* fill = currentFill();
    const auto* pattern = fill ? fill->find_patternFill() : nullptr;
    const auto* color = pattern ? pattern->find_fgColor() : nullptr;
    return color ? styles_->readColor(*color) : -1;
}

template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setPatternForegroundColor(int color) {
    if (ignoredColor(color)) return;
    auto& element = ownFill().get_patternFill().get_fgColor();
    element = std::remove_reference_t<decltype(element)>();
    styles_->writeColor(element, color);
}

template <class TCHAR, class Tag>
int XMLFormatImplT<TCHAR, Tag>::patternBackgroundColor() const {
    const Fill* fill = currentFill();
    const auto* pattern = fill ? fill->find_patternFill() : nullptr;
    const auto* color = pattern ? pattern->find_bgColor() : nullptr;
    return color ? styles_->readColor(*color) : -1;
}

template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setPatternBackgroundColor(int color) {
    if (ignoredColor(color)) return;
    auto& element = ownFill().get_patternFill().get_bgColor();
    element = std::remove_reference_t<decltype(element)>();
    styles_->writeColor(element, color);
}

// ---- Protection ----

template <class TCHAR, class Tag>
bool XMLFormatImplT<TCHAR, Tag>::locked() const {
    const auto* protection = xf_->find_protection();
    return !protection || !protection->isset_locked() || protection->get_locked();
}

template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setLocked(bool locked) {
    xf_->get_protection().set_locked(locked);
    xf_->set_applyProtection(true);
}

template <class TCHAR, class Tag>
bool XMLFormatImplT<TCHAR, Tag>::hidden() const {
    const auto* protection = xf_->find_protection();
    return protection && protection->get_hidden();
}

template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setHidden(bool hidden) {
    xf_->get_protection().set_hidden(hidden);
    xf_->set_applyProtection(true);
}

template <class TCHAR, class Tag>
bool XMLFormatImplT<TCHAR, Tag>::rgbMode() const { return styles_->rgbMode(); }
template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::setRgbMode(bool rgbMode) { styles_->setRgbMode(rgbMode); }

// ---- Copies ----

template <class TCHAR, class Tag>
void XMLFormatImplT<TCHAR, Tag>::copyFrom(IFormatT<TCHAR>& source) {
    auto* same = dynamic_cast<XMLFormatImplT*>(&source);
    if (IFontT<TCHAR>* sourceFont = source.font()) {
        auto* copy = styles_->addFont();
        copy->copyFrom(*sourceFont);
        setFont(copy);
    }
    int id = source.numFormat();
    if (id >= kFirstBinaryCustomNumFormat) {
        auto* privateSource = dynamic_cast<IFormatPrivate<TCHAR>*>(&source);
        const TCHAR* text = privateSource ? privateSource->customNumFormatText() : nullptr;
        if (text) {
            id = styles_->addCustomNumFormat(text);
            if (id == 0) throw qrerror("maximum number of custom formats is exceeded");
        }
    }
    setNumFormat(id);
    setAlignH(source.alignH());
    setAlignV(source.alignV());
    setWrap(source.wrap());
    setRotation(source.rotation());
    setIndent(source.indent());
    setShrinkToFit(source.shrinkToFit());
    setLocked(source.locked());
    setHidden(source.hidden());
    if (same) {
        // Between two Open XML formats the border and the fill travel as whole elements.
        if (const Border* border = same->currentBorder()) {
            Border copy = *border;
            ownBorder() = copy;
            xf_->set_applyBorder(true);
        }
        if (same->fillPattern() == FillPatternNone) {
            setFillPattern(FillPatternNone);
        } else if (const Fill* fill = same->currentFill()) {
            Fill copy = *fill;
            ownFill() = copy;
            xf_->set_applyFill(true);
        }
        return;
    }
    setBorderLeft(source.borderLeft());
    setBorderRight(source.borderRight());
    setBorderTop(source.borderTop());
    setBorderBottom(source.borderBottom());
    setBorderDiagonal(source.borderDiagonal());
    setBorderDiagonalStyle(source.borderDiagonalStyle());
    setFillPattern(source.fillPattern());
    setBorderLeftColor(source.borderLeftColor());
    setBorderRightColor(source.borderRightColor());
    setBorderTopColor(source.borderTopColor());
    setBorderBottomColor(source.borderBottomColor());
    setBorderDiagonalColor(source.borderDiagonalColor());
    if (source.fillPattern() != FillPatternNone) {
        setPatternForegroundColor(source.patternForegroundColor());
        setPatternBackgroundColor(source.patternBackgroundColor());
    }
}

template class XMLFormatImplT<wchar_t, excelNormal_tag>;
template class XMLFormatImplT<wchar_t, excelStrict_tag>;

}  // namespace quire
