#pragma once

namespace quire {

// A font of a book; shared by every format that refers to it.
template <class TCHAR>
class IFontT {
public:
    virtual int size() const = 0;
    virtual void setSize(int size) = 0;
    virtual bool italic() const = 0;
    virtual void setItalic(bool italic) = 0;
    virtual bool strikeOut() const = 0;
    virtual void setStrikeOut(bool strikeOut) = 0;
    virtual int color() const = 0;
    virtual void setColor(int color) = 0;
    virtual bool bold() const = 0;
    virtual void setBold(bool bold) = 0;
    virtual int script() const = 0;
    virtual void setScript(int script) = 0;
    virtual int underline() const = 0;
    virtual void setUnderline(int underline) = 0;
    virtual const TCHAR* name() = 0;
    virtual bool setName(const TCHAR* name) = 0;
    virtual ~IFontT() = default;
};

// Engine-side extension: which properties a font states explicitly, and the owning book's colour mode.
template <class TCHAR>
class IFontPrivate : public IFontT<TCHAR> {
public:
    virtual bool hasSize() const = 0;
    virtual bool hasItalic() const = 0;
    virtual bool hasStrikeOut() const = 0;
    virtual bool hasColor() const = 0;
    virtual bool hasBold() const = 0;
    virtual bool hasScript() const = 0;
    virtual bool hasUnderline() const = 0;
    virtual bool hasName() const = 0;
    virtual bool rgbMode() const = 0;
    virtual void setRgbMode(bool rgbMode) = 0;
};

using IFont = IFontT<wchar_t>;

}  // namespace quire
