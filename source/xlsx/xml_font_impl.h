#pragma once
// A font of an Open XML book: one font element of the styles part. A property is absent
// from the element until it is set.
#include <string>

#include "api/IFontT.h"
#include "xlsx/xml_styles.h"

namespace quire {

template <class TCHAR, class Tag>
class XMLFontImplT : public IFontPrivate<TCHAR> {
public:
    using FontElement = typename StyleElements<Tag>::Font;

    XMLFontImplT(Styles<Tag>* styles, FontElement* font);
    FontElement& element() const { return *font_; }
    // Copies the properties the other font has set (all of them from a font of another kind).
    void copyFrom(IFontT<TCHAR>& other);

    int size() const override;
    void setSize(int size) override;
    bool italic() const override;
    void setItalic(bool italic) override;
    bool strikeOut() const override;
    void setStrikeOut(bool strikeOut) override;
    int color() const override;
    void setColor(int color) override;
    bool bold() const override;
    void setBold(bool bold) override;
    int script() const override;
    void setScript(int script) override;
    int underline() const override;
    void setUnderline(int underline) override;
    const TCHAR* name() override;
    bool setName(const TCHAR* name) override;

    bool hasSize() const override;
    bool hasItalic() const override;
    bool hasStrikeOut() const override;
    bool hasColor() const override;
    bool hasBold() const override;
    bool hasScript() const override;
    bool hasUnderline() const override;
    bool hasName() const override;
    bool rgbMode() const override;
    void setRgbMode(bool rgbMode) override;

private:
    Styles<Tag>* styles_;
    FontElement* font_;
    std::basic_string<TCHAR> nameResult_;
};

}  // namespace quire
