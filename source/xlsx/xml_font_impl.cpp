#include "xlsx/xml_font_impl.h"

#include <cmath>

#include "api/enums.h"

namespace quire {

namespace {

// Underline values as the file names them: single, double, singleAccounting, doubleAccounting, none.
constexpr int kFileUnderline[] = {UnderlineSingle, UnderlineDouble, UnderlineSingleacc, UnderlineDoubleacc, UnderlineNone};

// A boolean property element: present with val true (or no val) means on.
template <class Font, class Size, class Get>
bool flag(const Font& font, Size size, Get get) {
    return (font.*size)() > 0 && (font.*get)(0).get_val();
}

template <class Font, class Size, class Get, class Append>
void setFlag(Font& font, Size size, Get get, Append append, bool value) {
    auto& property = (font.*size)() > 0 ? (font.*get)(0) : (font.*append)();
    property.set_val(value);
}

}  // namespace

template <class TCHAR, class Tag>
XMLFontImplT<TCHAR, Tag>::XMLFontImplT(Styles<Tag>* styles, FontElement* font) : styles_(styles), font_(font) {
    if (!styles) throw qrerror("XMLFontImplT(): styles can't be 0");
    if (!font) throw qrerror("XMLFontImplT(): font can't be 0");
}

template <class TCHAR, class Tag>
int XMLFontImplT<TCHAR, Tag>::size() const {
    return font_->size_sz() ? static_cast<int>(std::lround(font_->get_sz(0).get_val())) : 11;
}
template <class TCHAR, class Tag>
void XMLFontImplT<TCHAR, Tag>::setSize(int size) {
    (font_->size_sz() ? font_->get_sz(0) : font_->append_sz()).set_val(static_cast<double>(size));
}
template <class TCHAR, class Tag>
bool XMLFontImplT<TCHAR, Tag>::italic() const {
    return flag(*font_, &FontElement::size_i, &FontElement::get_i);
}
template <class TCHAR, class Tag>
void XMLFontImplT<TCHAR, Tag>::setItalic(bool italic) {
    setFlag(*font_, &FontElement::size_i, &FontElement::get_i, &FontElement::append_i, italic);
}
template <class TCHAR, class Tag>
bool XMLFontImplT<TCHAR, Tag>::strikeOut() const {
    return flag(*font_, &FontElement::size_strike, &FontElement::get_strike);
}
template <class TCHAR, class Tag>
void XMLFontImplT<TCHAR, Tag>::setStrikeOut(bool strikeOut) {
    setFlag(*font_, &FontElement::size_strike, &FontElement::get_strike, &FontElement::append_strike, strikeOut);
}
template <class TCHAR, class Tag>
bool XMLFontImplT<TCHAR, Tag>::bold() const {
    return flag(*font_, &FontElement::size_b, &FontElement::get_b);
}
template <class TCHAR, class Tag>
void XMLFontImplT<TCHAR, Tag>::setBold(bool bold) {
    setFlag(*font_, &FontElement::size_b, &FontElement::get_b, &FontElement::append_b, bold);
}

template <class TCHAR, class Tag>
int XMLFontImplT<TCHAR, Tag>::color() const {
    if (!font_->size_color()) return ColorDefaultForeground;
    return styles_->readColor(font_->get_color(0));
}
template <class TCHAR, class Tag>
void XMLFontImplT<TCHAR, Tag>::setColor(int color) {
    auto& element = font_->size_color() ? font_->get_color(0) : font_->append_color();
    element = std::remove_reference_t<decltype(element)>();
    styles_->writeColor(element, color);
}

template <class TCHAR, class Tag>
int XMLFontImplT<TCHAR, Tag>::script() const {
    if (!font_->size_vertAlign()) return ScriptNormal;
    const int value = font_->get_vertAlign(0).get_val();  // baseline, superscript, subscript
    return value == 1 ? ScriptSuper : value == 2 ? ScriptSub : ScriptNormal;
}
template <class TCHAR, class Tag>
void XMLFontImplT<TCHAR, Tag>::setScript(int script) {
    while (font_->size_vertAlign()) font_->delete_vertAlign(0);
    if (script == ScriptSuper) font_->append_vertAlign().set_val(1);
    if (script == ScriptSub) font_->append_vertAlign().set_val(2);
}

template <class TCHAR, class Tag>
int XMLFontImplT<TCHAR, Tag>::underline() const {
    if (!font_->size_u()) return UnderlineNone;
    const auto& u = font_->get_u(0);
    if (!u.isset_val()) return UnderlineSingle;
    const int value = u.get_val();
    return value >= 0 && value < 5 ? kFileUnderline[value] : UnderlineNone;
}
template <class TCHAR, class Tag>
void XMLFontImplT<TCHAR, Tag>::setUnderline(int underline) {
    while (font_->size_u()) font_->delete_u(0);
    for (int i = 0; i < 4; ++i)
        if (kFileUnderline[i] == underline) font_->append_u().set_val(i);
}

template <class TCHAR, class Tag>
const TCHAR* XMLFontImplT<TCHAR, Tag>::name() {
    nameResult_ = font_->size_name() ? font_->get_name(0).get_val() : std::wstring();
    return nameResult_.c_str();
}
template <class TCHAR, class Tag>
bool XMLFontImplT<TCHAR, Tag>::setName(const TCHAR* name) {
    if (!name) return false;
    (font_->size_name() ? font_->get_name(0) : font_->append_name()).set_val(name);
    return true;
}

template <class TCHAR, class Tag>
bool XMLFontImplT<TCHAR, Tag>::hasSize() const { return font_->size_sz() > 0; }
template <class TCHAR, class Tag>
bool XMLFontImplT<TCHAR, Tag>::hasItalic() const { return font_->size_i() > 0; }
template <class TCHAR, class Tag>
bool XMLFontImplT<TCHAR, Tag>::hasStrikeOut() const { return font_->size_strike() > 0; }
template <class TCHAR, class Tag>
bool XMLFontImplT<TCHAR, Tag>::hasColor() const { return font_->size_color() > 0; }
template <class TCHAR, class Tag>
bool XMLFontImplT<TCHAR, Tag>::hasBold() const { return font_->size_b() > 0; }
template <class TCHAR, class Tag>
bool XMLFontImplT<TCHAR, Tag>::hasScript() const { return font_->size_vertAlign() > 0; }
template <class TCHAR, class Tag>
bool XMLFontImplT<TCHAR, Tag>::hasUnderline() const { return font_->size_u() > 0; }
template <class TCHAR, class Tag>
bool XMLFontImplT<TCHAR, Tag>::hasName() const { return font_->size_name() > 0; }
template <class TCHAR, class Tag>
bool XMLFontImplT<TCHAR, Tag>::rgbMode() const { return styles_->rgbMode(); }
template <class TCHAR, class Tag>
void XMLFontImplT<TCHAR, Tag>::setRgbMode(bool rgbMode) { styles_->setRgbMode(rgbMode); }

template <class TCHAR, class Tag>
void XMLFontImplT<TCHAR, Tag>::copyFrom(IFontT<TCHAR>& other) {
    if (auto* same = dynamic_cast<XMLFontImplT*>(&other)) {
        // Same engine: the element as it stands, including properties no setter reaches.
        if (same->font_ != font_) *font_ = *same->font_;
        return;
    }
    auto* known = dynamic_cast<IFontPrivate<TCHAR>*>(&other);
    auto has = [&](bool (IFontPrivate<TCHAR>::*test)() const) { return !known || (known->*test)(); };
    if (has(&IFontPrivate<TCHAR>::hasSize)) setSize(other.size());
    if (has(&IFontPrivate<TCHAR>::hasItalic)) setItalic(other.italic());
    if (has(&IFontPrivate<TCHAR>::hasStrikeOut)) setStrikeOut(other.strikeOut());
    if (has(&IFontPrivate<TCHAR>::hasBold)) setBold(other.bold());
    if (has(&IFontPrivate<TCHAR>::hasScript)) setScript(other.script());
    if (has(&IFontPrivate<TCHAR>::hasUnderline)) setUnderline(other.underline());
    if (has(&IFontPrivate<TCHAR>::hasColor)) {
        const int color = other.color();
        if (color != -1) setColor(color);
    }
    if (has(&IFontPrivate<TCHAR>::hasName))
        if (const TCHAR* name = other.name()) setName(name);
}

template class XMLFontImplT<wchar_t, excelNormal_tag>;
template class XMLFontImplT<wchar_t, excelStrict_tag>;

}  // namespace quire
