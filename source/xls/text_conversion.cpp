#include "xls/text_conversion.h"

#include <cstdint>

#include "api/qrerror.h"

namespace quire::xls {

static_assert(sizeof(wchar_t) == 4, "wide text is UTF-32 on this platform");

std::u16string toUtf16(const wchar_t* text)
{
    std::u16string result;
    for (; *text; ++text) {
        const uint32_t c = static_cast<uint32_t>(*text);
        if (c > 0x10FFFF || (c >= 0xD800 && c <= 0xDFFF))
            throw qrerror("Invalid code point");
        if (c < 0x10000) {
            result.push_back(static_cast<char16_t>(c));
        } else {
            const uint32_t v = c - 0x10000;
            result.push_back(static_cast<char16_t>(0xD800 + (v >> 10)));
            result.push_back(static_cast<char16_t>(0xDC00 + (v & 0x3FF)));
        }
    }
    return result;
}

std::u16string toUtf16(const std::wstring& text)
{
    return toUtf16(text.c_str());
}

std::wstring toWide(const std::u16string& text)
{
    std::wstring result;
    result.reserve(text.size());
    for (size_t i = 0; i < text.size(); ++i) {
        const char16_t c = text[i];
        if (c >= 0xD800 && c <= 0xDBFF && i + 1 < text.size() && text[i + 1] >= 0xDC00 && text[i + 1] <= 0xDFFF) {
            result.push_back(static_cast<wchar_t>(0x10000 + ((c - 0xD800) << 10) + (text[i + 1] - 0xDC00)));
            ++i;
        } else if (c >= 0xD800 && c <= 0xDFFF) {
            result.push_back(static_cast<wchar_t>(0xFFFD));
        } else {
            result.push_back(static_cast<wchar_t>(c));
        }
    }
    return result;
}

} // namespace quire::xls
