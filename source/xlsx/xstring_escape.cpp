#include "xlsx/xstring_escape.h"

namespace quire {

namespace {

int hexValue(wchar_t ch) {
    if (ch >= L'0' && ch <= L'9') return ch - L'0';
    if (ch >= L'A' && ch <= L'F') return ch - L'A' + 10;
    if (ch >= L'a' && ch <= L'f') return ch - L'a' + 10;
    return -1;
}

// "_xHHHH_" at `pos`: its code, or -1.
long escapeAt(const std::wstring& text, std::size_t pos) {
    if (pos + 7 > text.size() || text[pos] != L'_' || text[pos + 1] != L'x' || text[pos + 6] != L'_') return -1;
    long code = 0;
    for (std::size_t i = pos + 2; i < pos + 6; ++i) {
        const int digit = hexValue(text[i]);
        if (digit < 0) return -1;
        code = code * 16 + digit;
    }
    return code;
}

void appendEscape(std::wstring& out, unsigned code) {
    static const wchar_t digits[] = L"0123456789ABCDEF";
    out += L"_x";
    for (int shift = 12; shift >= 0; shift -= 4) out += digits[(code >> shift) & 0xF];
    out += L'_';
}

}  // namespace

std::wstring encodeXstring(const std::wstring& text) {
    std::wstring out;
    out.reserve(text.size());
    for (std::size_t i = 0; i < text.size(); ++i) {
        const wchar_t ch = text[i];
        const auto code = static_cast<unsigned long>(ch);
        if (code >= 0xD800 && code <= 0xDBFF && i + 1 < text.size() &&
            static_cast<unsigned long>(text[i + 1]) >= 0xDC00 && static_cast<unsigned long>(text[i + 1]) <= 0xDFFF) {
            out += ch;
            out += text[++i];
            continue;
        }
        const bool control = code < 32 && ch != L'\t' && ch != L'\n' && ch != L'\r';
        if (control || (code >= 0xD800 && code <= 0xDFFF) || code == 0xFFFE || code == 0xFFFF) {
            appendEscape(out, static_cast<unsigned>(code));
        } else if (ch == L'_' && escapeAt(text, i) >= 0) {
            // An escape-like sequence of the caller's own text must read back as itself.
            appendEscape(out, L'_');
        } else {
            out += ch;
        }
    }
    return out;
}

std::wstring decodeXstring(const std::wstring& text) {
    if (text.find(L"_x") == std::wstring::npos) return text;
    std::wstring out;
    out.reserve(text.size());
    for (std::size_t i = 0; i < text.size(); ++i) {
        const long code = text[i] == L'_' ? escapeAt(text, i) : -1;
        if (code >= 0) {
            out += static_cast<wchar_t>(code);
            i += 6;
        } else {
            out += text[i];
        }
    }
    return out;
}

}  // namespace quire
