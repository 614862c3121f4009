#pragma once
// The styles part of a book: cell formats over the xf elements of cellXfs and fonts over the
// font elements of fonts. A format's index in the list is the `s` value cells carry.
#include <memory>
#include <string>
#include <type_traits>
#include <vector>

#include "api/IFontT.h"
#include "api/IFormatT.h"
#include "xlsx/flavour.h"
#include "xlsx/xfile.h"

namespace quire {

template <class TCHAR, class Tag>
class XMLFormatImplT;
template <class TCHAR, class Tag>
class XMLFontImplT;

template <class Tag>
struct StyleElements {
    using Stylesheet = typename XmlFlavour<Tag>::Stylesheet;
    using Xf = std::remove_reference_t<decltype(std::declval<Stylesheet&>().get_cellXfs().get_xf(0))>;
    using Font = std::remove_reference_t<decltype(std::declval<Stylesheet&>().get_fonts().get_font(0))>;
    using Fill = std::remove_reference_t<decltype(std::declval<Stylesheet&>().get_fills().get_fill(0))>;
    using Border = std::remove_reference_t<decltype(std::declval<Stylesheet&>().get_borders().get_border(0))>;
    using Color = std::remove_reference_t<decltype(std::declval<Font&>().get_color(0))>;
};

template <class Tag>
class Styles : public XmlFile<typename XmlFlavour<Tag>::Stylesheet> {
public:
    using Elements = StyleElements<Tag>;
    using Xf = typename Elements::Xf;
    using Color = typename Elements::Color;
    using Format = XMLFormatImplT<wchar_t, Tag>;
    using Font = XMLFontImplT<wchar_t, Tag>;

    Styles();
    ~Styles() override;
    // The stylesheet of a new book: one font, two fills, one border, one format, one style.
    void makeDefault();

    Format* addFormat(const Xf* copy);
    Font* addFont();
    Format* format(int index) const;
    int formatCount() const { return static_cast<int>(formats_.size()); }
    Font* font(int index) const;
    int fontCount() const { return static_cast<int>(fonts_.size()); }
    // "unknown format" when the format is not of this list.
    int formatIndex(const IFormatT<wchar_t>* format) const;
    // -1 when the font is not of this list.
    int fontIndex(const IFontT<wchar_t>* font) const;

    // 0 when all custom identifiers are taken.
    int addCustomNumFormat(const std::wstring& text);
    const std::wstring* customNumFormat(int id) const;

    void writeColor(Color& element, int value) const;
    int readColor(const Color& element) const;
    bool rgbMode() const { return rgbMode_; }
    void setRgbMode(bool rgbMode) { rgbMode_ = rgbMode; }

protected:
    lmx::elmx_error unmarshalRoot(lmx::c_xml_reader& reader) override;

private:
    void buildObjects();

    std::vector<std::unique_ptr<Format>> formats_;
    std::vector<std::unique_ptr<Font>> fonts_;
    bool rgbMode_ = false;
};

}  // namespace quire
