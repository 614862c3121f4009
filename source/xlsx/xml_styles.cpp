#include "xlsx/xml_styles.h"

#include "api/number_formats.h"
#include "api/palette.h"
#include "xlsx/xml_font_impl.h"
#include "xlsx/xml_format_impl.h"

namespace quire {

namespace {
constexpr int kLastXmlCustomNumFormat = 392;
}

template <class Tag>
Styles<Tag>::Styles() : XmlFile<typename XmlFlavour<Tag>::Stylesheet>("styleSheet") {}

template <class Tag>
Styles<Tag>::~Styles() = default;

template <class Tag>
lmx::elmx_error Styles<Tag>::unmarshalRoot(lmx::c_xml_reader& reader) {
    const lmx::elmx_error result = XmlFile<typename XmlFlavour<Tag>::Stylesheet>::unmarshalRoot(reader);
    if (result == lmx::ELMX_OK) buildObjects();
    return result;
}

template <class Tag>
void Styles<Tag>::buildObjects() {
    formats_.clear();
    fonts_.clear();
    auto& sheet = this->document();
    if (auto* fonts = sheet.find_fonts())
        for (std::size_t i = 0; i < fonts->size_font(); ++i)
            fonts_.push_back(std::make_unique<Font>(this, &fonts->get_font(i)));
    if (auto* xfs = sheet.find_cellXfs())
        for (std::size_t i = 0; i < xfs->size_xf(); ++i)
            formats_.push_back(std::make_unique<Format>(this, &xfs->get_xf(i)));
}

template <class Tag>
auto Styles<Tag>::addFormat(const Xf* copy) -> Format* {
    auto& xfs = this->document().get_cellXfs();
    auto& xf = xfs.append_xf();
    if (copy) {
        xf = *copy;
    } else {
        xf.set_numFmtId(0);
        xf.set_fontId(0);
        xf.set_fillId(0);
        xf.set_borderId(0);
        xf.set_xfId(0);
    }
    xfs.set_count(static_cast<std::uint32_t>(xfs.size_xf()));
    try {
        formats_.push_back(std::make_unique<Format>(this, &xf));
    } catch (...) {
        xfs.delete_xf(xfs.size_xf() - 1);
        xfs.set_count(static_cast<std::uint32_t>(xfs.size_xf()));
        throw;
    }
    return formats_.back().get();
}

template <class Tag>
auto Styles<Tag>::addFont() -> Font* {
    auto* fonts = this->document().find_fonts();
    if (!fonts) throw qrerror("fonts are not found");
    auto& font = fonts->append_font();
    fonts->set_count(static_cast<std::uint32_t>(fonts->size_font()));
    try {
        fonts_.push_back(std::make_unique<Font>(this, &font));
    } catch (...) {
        fonts->delete_font(fonts->size_font() - 1);
        fonts->set_count(static_cast<std::uint32_t>(fonts->size_font()));
        throw;
    }
    return fonts_.back().get();
}

template <class Tag>
auto Styles<Tag>::format(int index) const -> Format* {
    if (index < 0 || index >= formatCount()) throw qrerror("index is out of range");
    return formats_[static_cast<std::size_t>(index)].get();
}

template <class Tag>
auto Styles<Tag>::font(int index) const -> Font* {
    if (index < 0 || index >= fontCount()) throw qrerror("index is out of range");
    return fonts_[static_cast<std::size_t>(index)].get();
}

template <class Tag>
int Styles<Tag>::formatIndex(const IFormatT<wchar_t>* format) const {
    for (std::size_t i = 0; i < formats_.size(); ++i)
        if (formats_[i].get() == format) return static_cast<int>(i);
    throw qrerror("unknown format");
}

template <class Tag>
int Styles<Tag>::fontIndex(const IFontT<wchar_t>* font) const {
    for (std::size_t i = 0; i < fonts_.size(); ++i)
        if (fonts_[i].get() == font) return static_cast<int>(i);
    return -1;
}

template <class Tag>
int Styles<Tag>::addCustomNumFormat(const std::wstring& text) {
    auto* numFmts = this->document().find_numFmts();
    std::vector<bool> used(kLastXmlCustomNumFormat + 1, false);
    if (numFmts) {
        for (std::size_t i = 0; i < numFmts->size_numFmt(); ++i) {
            const auto& numFmt = numFmts->get_numFmt(i);
            if (numFmt.get_formatCode() == text) return static_cast<int>(numFmt.get_numFmtId());
            if (numFmt.get_numFmtId() <= static_cast<std::uint32_t>(kLastXmlCustomNumFormat))
                used[numFmt.get_numFmtId()] = true;
        }
    }
    int id = kFirstXmlCustomNumFormat;
    while (id <= kLastXmlCustomNumFormat && used[static_cast<std::size_t>(id)]) ++id;
    if (id > kLastXmlCustomNumFormat) return 0;
    auto& list = this->document().get_numFmts();
    auto& numFmt = list.append_numFmt();
    numFmt.set_numFmtId(static_cast<std::uint32_t>(id));
    numFmt.set_formatCode(text);
    list.set_count(static_cast<std::uint32_t>(list.size_numFmt()));
    return id;
}

template <class Tag>
const std::wstring* Styles<Tag>::customNumFormat(int id) const {
    const auto* numFmts = this->document().find_numFmts();
    if (!numFmts || id < 0) return nullptr;
    for (std::size_t i = 0; i < numFmts->size_numFmt(); ++i)
        if (numFmts->get_numFmt(i).get_numFmtId() == static_cast<std::uint32_t>(id))
            return &numFmts->get_numFmt(i).get_formatCode();
    return nullptr;
}

template <class Tag>
void Styles<Tag>::writeColor(Color& element, int value) const {
    if (rgbMode_) {
        element.set_rgb(lmx::c_binary({0xFF, static_cast<unsigned char>((value >> 16) & 0xFF),
                                       static_cast<unsigned char>((value >> 8) & 0xFF),
                                       static_cast<unsigned char>(value & 0xFF)}));
    } else {
        element.set_indexed(static_cast<std::uint32_t>(value));
    }
}

template <class Tag>
int Styles<Tag>::readColor(const Color& element) const {
    if (element.isset_rgb()) {
        const auto& bytes = element.get_rgb().bytes();
        if (bytes.size() != 3 && bytes.size() != 4) throw qrerror("rgb color is invalid");
        const std::size_t first = bytes.size() - 3;
        const int red = bytes[first], green = bytes[first + 1], blue = bytes[first + 2];
        if (rgbMode_) return packRgbValue(red, green, blue);
        if (bytes.size() == 4 && bytes[0] != 0xFF) return -1;
        const auto& palette = defaultPalette();
        const std::uint32_t word = packRgbWord(red, green, blue);
        for (int i = 0; i < kPaletteSize; ++i)
            if (palette[static_cast<std::size_t>(i)] == word) return i + kPaletteFirstIndex;
        return -1;
    }
    if (element.isset_indexed()) return static_cast<int>(element.get_indexed());
    return -1;
}

template class Styles<excelNormal_tag>;
template class Styles<excelStrict_tag>;

}  // namespace quire
