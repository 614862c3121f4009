#include "xls/formula/formula_text.h"

#include <charconv>
#include <cmath>
#include <cstring>
#include <string_view>

namespace quire::xls {

namespace {

struct ErrorName {
    uint8_t code;
    const wchar_t* text;
};

const ErrorName ErrorNames[] = {
    {0x00, L"#NULL!"}, {0x07, L"#DIV/0!"}, {0x0F, L"#VALUE!"}, {0x17, L"#REF!"},
    {0x1D, L"#NAME?"}, {0x24, L"#NUM!"},   {0x2A, L"#N/A"},    {0x2B, L"#GETTING_DATA"},
};

wchar_t upper(wchar_t c) { return c >= L'a' && c <= L'z' ? static_cast<wchar_t>(c - 32) : c; }

bool isAsciiLetter(wchar_t c) { return (c >= L'A' && c <= L'Z') || (c >= L'a' && c <= L'z'); }
bool isDigit(wchar_t c) { return c >= L'0' && c <= L'9'; }

// Names the formula reader would take for a reference or a literal.
bool looksLikeReference(const std::wstring& name)
{
    size_t i = 0;
    while (i < name.size() && isAsciiLetter(name[i]))
        ++i;
    const size_t letters = i;
    while (i < name.size() && isDigit(name[i]))
        ++i;
    if (i == name.size() && letters >= 1 && letters <= 3 && i > letters)
        return true;
    // R1C1 forms: R, C, R1, C1, R1C1.
    std::wstring u;
    for (wchar_t c : name)
        u += upper(c);
    size_t k = 0;
    auto part = [&](wchar_t letter) {
        if (k < u.size() && u[k] == letter) {
            ++k;
            while (k < u.size() && isDigit(u[k]))
                ++k;
            return true;
        }
        return false;
    };
    const bool r = part(L'R');
    const bool c = part(L'C');
    return (r || c) && k == u.size();
}

} // namespace

const wchar_t* errorLiteral(uint8_t code)
{
    for (const auto& e : ErrorNames)
        if (e.code == code)
            return e.text;
    return nullptr;
}

size_t matchErrorLiteral(const wchar_t* text, size_t length, uint8_t& code)
{
    for (const auto& e : ErrorNames) {
        const size_t n = std::wcslen(e.text);
        if (n > length)
            continue;
        bool same = true;
        for (size_t i = 0; i < n && same; ++i)
            same = upper(text[i]) == e.text[i];
        if (same) {
            code = e.code;
            return n;
        }
    }
    return 0;
}

std::wstring formatNumber(double value)
{
    if (!std::isfinite(value))
        return L"#NUM!";
    if (value == 0)
        return L"0";  // also for -0
    char buffer[64];
    const auto result = std::to_chars(buffer, buffer + sizeof buffer, value);
    std::wstring text;
    for (const char* p = buffer; p != result.ptr; ++p)
        text += *p == 'e' ? L'E' : static_cast<wchar_t>(*p);
    return text;
}

bool parseNumber(const std::wstring& text, double& value)
{
    std::string narrow;
    narrow.reserve(text.size());
    for (wchar_t c : text) {
        if (c > 0x7F)
            return false;
        narrow += static_cast<char>(c);
    }
    const auto result = std::from_chars(narrow.data(), narrow.data() + narrow.size(), value);
    return result.ec == std::errc() && result.ptr == narrow.data() + narrow.size() && std::isfinite(value);
}

std::wstring quoteString(const std::wstring& text)
{
    std::wstring out = L"\"";
    for (wchar_t c : text) {
        if (c == L'"')
            out += L'"';
        out += c;
    }
    out += L'"';
    return out;
}

bool isNameChar(wchar_t c)
{
    return isAsciiLetter(c) || isDigit(c) || c == L'_' || c == L'\\' || c == L'.' || c >= 0x80;
}

bool sheetNameNeedsQuotes(const std::wstring& name)
{
    if (name.empty() || isDigit(name[0]) || name[0] == L'.')
        return true;
    for (wchar_t c : name)
        if (!isNameChar(c))
            return true;
    return looksLikeReference(name);
}

std::wstring sheetPrefix(const std::wstring& firstSheet, const std::wstring& lastSheet)
{
    std::wstring text = firstSheet;
    bool quote = sheetNameNeedsQuotes(firstSheet);
    if (lastSheet != firstSheet) {
        text += L':';
        text += lastSheet;
        quote = quote || sheetNameNeedsQuotes(lastSheet);
    }
    if (!quote)
        return text;
    std::wstring out = L"'";
    for (wchar_t c : text) {
        if (c == L'\'')
            out += L'\'';
        out += c;
    }
    out += L'\'';
    return out;
}

} // namespace quire::xls
