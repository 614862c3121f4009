#include "xlsx/xml_formula_text.h"

#include <algorithm>
#include <cwctype>
#include <string_view>

#include "xlsx/cell_ref.h"

namespace quire {

namespace {

// Functions newer than the file format's base set: the part stores them as "_xlfn.NAME".
constexpr std::wstring_view kPrefixed[] = {
    L"ACOT", L"ACOTH", L"AGGREGATE", L"ARABIC", L"BASE", L"BETA.DIST", L"BETA.INV", L"BINOM.DIST",
    L"BINOM.DIST.RANGE", L"BINOM.INV", L"BITAND", L"BITLSHIFT", L"BITOR", L"BITRSHIFT", L"BITXOR",
    L"CEILING.MATH", L"CEILING.PRECISE", L"CHISQ.DIST", L"CHISQ.DIST.RT", L"CHISQ.INV", L"CHISQ.INV.RT",
    L"CHISQ.TEST", L"COMBINA", L"CONCAT", L"CONFIDENCE.NORM", L"CONFIDENCE.T", L"COTH", L"COVARIANCE.P",
    L"COVARIANCE.S", L"CSCH", L"DECIMAL", L"ERF.PRECISE", L"ERFC.PRECISE", L"EXPON.DIST", L"F.DIST",
    L"F.DIST.RT", L"F.INV", L"F.INV.RT", L"F.TEST", L"FILTERXML", L"FLOOR.MATH", L"FLOOR.PRECISE",
    L"FORECAST.ETS", L"FORECAST.ETS.CONFINT", L"FORECAST.ETS.SEASONALITY", L"FORECAST.ETS.STAT",
    L"FORECAST.LINEAR", L"FORMULATEXT", L"GAMMA", L"GAMMA.DIST", L"GAMMA.INV", L"GAMMALN.PRECISE", L"GAUSS",
    L"HYPGEOM.DIST", L"IFNA", L"IMCOSH", L"IMCOT", L"IMCSC", L"IMCSCH", L"IMSEC", L"IMSECH", L"IMSINH",
    L"IMTAN", L"ISFORMULA", L"ISOWEEKNUM", L"LOGNORM.DIST", L"LOGNORM.INV", L"MAXIFS", L"MINIFS",
    L"MODE.MULT", L"MODE.SNGL", L"MUNIT", L"NEGBINOM.DIST", L"NORM.DIST", L"NORM.INV", L"NORM.S.DIST",
    L"NORM.S.INV", L"NUMBERVALUE", L"PDURATION", L"PERCENTILE.EXC", L"PERCENTILE.INC", L"PERCENTRANK.EXC",
    L"PERCENTRANK.INC", L"PERMUTATIONA", L"POISSON.DIST", L"QUARTILE.EXC", L"QUARTILE.INC", L"QUERYSTRING",
    L"RANK.AVG", L"RANK.EQ", L"SECH", L"SHEET", L"SHEETS", L"SKEW.P", L"STDEV.P", L"STDEV.S", L"SWITCH",
    L"T.DIST", L"T.DIST.2T", L"T.DIST.RT", L"T.INV", L"T.INV.2T", L"T.TEST", L"TEXTJOIN", L"UNICHAR",
    L"UNICODE", L"VAR.P", L"VAR.S", L"WEBSERVICE", L"WEIBULL.DIST", L"Z.TEST"};

bool isNameChar(wchar_t ch) { return std::iswalnum(static_cast<wint_t>(ch)) || ch == L'_' || ch == L'.' || ch == L'$'; }

bool needsPrefix(const std::wstring& name) {
    std::wstring upper = name;
    for (auto& ch : upper) ch = static_cast<wchar_t>(std::towupper(static_cast<wint_t>(ch)));
    return std::find(std::begin(kPrefixed), std::end(kPrefixed), upper) != std::end(kPrefixed);
}

// Calls `visit` for each run of name characters outside quoted text and sheet names;
// everything else is copied as it stands.
template <class Visit>
std::wstring mapTokens(const std::wstring& text, Visit visit) {
    std::wstring out;
    out.reserve(text.size() + 8);
    std::size_t i = 0;
    while (i < text.size()) {
        const wchar_t ch = text[i];
        if (ch == L'"' || ch == L'\'') {
            std::size_t end = i + 1;
            while (end < text.size()) {
                if (text[end] == ch) {
                    if (end + 1 < text.size() && text[end + 1] == ch) {
                        end += 2;
                        continue;
                    }
                    break;
                }
                ++end;
            }
            end = std::min(end + 1, text.size());
            out.append(text, i, end - i);
            i = end;
        } else if (isNameChar(ch)) {
            std::size_t end = i;
            while (end < text.size() && isNameChar(text[end])) ++end;
            const bool call = end < text.size() && text[end] == L'(';
            const bool qualified = end < text.size() && text[end] == L'!';
            const bool ranged = (i > 0 && text[i - 1] == L':') || (end < text.size() && text[end] == L':');
            out += visit(text.substr(i, end - i), call, qualified, ranged);
            i = end;
        } else if (ch == L'[') {
            // Structured references and external book indexes pass untouched.
            const std::size_t end = text.find(L']', i);
            const std::size_t stop = end == std::wstring::npos ? text.size() : end + 1;
            out.append(text, i, stop - i);
            i = stop;
        } else {
            out += ch;
            ++i;
        }
    }
    return out;
}

std::wstring replaceOutsideQuotes(const std::wstring& text, wchar_t from, wchar_t to) {
    std::wstring out = text;
    bool quoted = false;
    for (auto& ch : out) {
        if (ch == L'"') quoted = !quoted;
        else if (!quoted && ch == from) ch = to;
    }
    return out;
}

// An A1 reference token with its absolute markers; false for names.
struct RefToken {
    bool colAbs = false, rowAbs = false;
    int row = -1, col = -1;  // -1: the part is absent (whole rows or columns)
};

// Whole rows ("3") and whole columns ("C") count only as one end of a range.
bool parseRefToken(const std::wstring& token, bool ranged, RefToken& ref) {
    std::size_t i = 0;
    const std::size_t n = token.size();
    if (i < n && token[i] == L'$') { ref.colAbs = true; ++i; }
    long col = 0;
    const std::size_t letters = i;
    while (i < n && std::iswalpha(static_cast<wint_t>(token[i]))) {
        const wchar_t up = static_cast<wchar_t>(std::towupper(static_cast<wint_t>(token[i])));
        if (up < L'A' || up > L'Z') return false;
        col = col * 26 + (up - L'A' + 1);
        if (col > 16384) return false;
        ++i;
    }
    const bool hasCol = i > letters;
    if (!hasCol && ref.colAbs) {
        ref.rowAbs = true;
        ref.colAbs = false;
    } else if (i < n && token[i] == L'$') {
        ref.rowAbs = true;
        ++i;
    }
    long row = 0;
    const std::size_t digits = i;
    while (i < n && std::iswdigit(static_cast<wint_t>(token[i]))) {
        row = row * 10 + (token[i] - L'0');
        if (row > 1048576) return false;
        ++i;
    }
    const bool hasRow = i > digits;
    if (i != n || (!hasCol && !hasRow)) return false;
    if (!ranged && (!hasCol || !hasRow)) return false;
    if (hasRow && row < 1) return false;
    ref.col = hasCol ? static_cast<int>(col - 1) : -1;
    ref.row = hasRow ? static_cast<int>(row - 1) : -1;
    return true;
}

std::wstring printRefToken(const RefToken& ref) {
    std::wstring out;
    if (ref.col >= 0) {
        if (ref.colAbs) out += L'$';
        out += cellRef(0, ref.col);
        out.resize(out.size() - 1);  // drop the row digit of the helper
    }
    if (ref.row >= 0) {
        if (ref.rowAbs) out += L'$';
        out += std::to_wstring(ref.row + 1);
    }
    return out;
}

// R1C1 token ("R", "R2C3", "R[-1]C", "C[2]") as A1, relative to (row, col); false for names.
bool r1c1ToA1(const std::wstring& token, int row, int col, std::wstring& out) {
    std::size_t i = 0;
    const std::size_t n = token.size();
    RefToken ref;
    auto part = [&](wchar_t letter, int origin, int& value, bool& absolute) -> int {
        if (i >= n || std::towupper(static_cast<wint_t>(token[i])) != static_cast<wint_t>(letter)) return 0;
        ++i;
        if (i < n && token[i] == L'[') {
            const std::size_t close = token.find(L']', i);
            if (close == std::wstring::npos) return -1;
            value = origin + std::stoi(token.substr(i + 1, close - i - 1));
            i = close + 1;
        } else if (i < n && std::iswdigit(static_cast<wint_t>(token[i]))) {
            int number = 0;
            while (i < n && std::iswdigit(static_cast<wint_t>(token[i]))) number = number * 10 + (token[i++] - L'0');
            value = number - 1;
            absolute = true;
        } else {
            value = origin;
        }
        return 1;
    };
    try {
        const int hasRow = part(L'R', row, ref.row, ref.rowAbs);
        const int hasCol = part(L'C', col, ref.col, ref.colAbs);
        if (hasRow < 0 || hasCol < 0 || i != n || (!hasRow && !hasCol)) return false;
        if (!hasRow) ref.row = -1;
        if (!hasCol) ref.col = -1;
    } catch (...) {
        return false;
    }
    if ((ref.row < -1) || ref.col < -1 || ref.row > 1048575 || ref.col > 16383) return false;
    out = printRefToken(ref);
    return true;
}

std::wstring a1ToR1C1(const RefToken& ref, int row, int col) {
    std::wstring out;
    auto part = [&](wchar_t letter, int value, bool absolute, int origin) {
        out += letter;
        if (absolute) out += std::to_wstring(value + 1);
        else if (value != origin) out += L"[" + std::to_wstring(value - origin) + L"]";
    };
    if (ref.row >= 0) part(L'R', ref.row, ref.rowAbs, row);
    if (ref.col >= 0) part(L'C', ref.col, ref.colAbs, col);
    return out;
}

}  // namespace

FileFormula formulaToFile(const std::wstring& expression, bool r1c1, wchar_t listSeparator, int row, int col) {
    FileFormula result;
    std::wstring text = expression;
    if (!text.empty() && text.front() == L'=') text.erase(0, 1);
    if (text.size() >= 2 && text.front() == L'{' && text.back() == L'}') {
        text = text.substr(1, text.size() - 2);
        if (!text.empty() && text.front() == L'=') text.erase(0, 1);
        result.array = true;
    }
    text = mapTokens(text, [&](const std::wstring& token, bool call, bool, bool) -> std::wstring {
        if (call && token.compare(0, 6, L"_xlfn.") != 0 && needsPrefix(token)) return L"_xlfn." + token;
        std::wstring a1;
        if (!call && r1c1 && r1c1ToA1(token, row, col, a1)) return a1;
        return token;
    });
    if (listSeparator == L';') text = replaceOutsideQuotes(text, L';', L',');
    result.text = std::move(text);
    return result;
}

std::wstring formulaFromFile(const std::wstring& text, bool r1c1, wchar_t listSeparator, int row, int col) {
    std::wstring out = mapTokens(text, [&](const std::wstring& token, bool call, bool qualified, bool ranged) -> std::wstring {
        std::wstring name = token;
        if (call && name.compare(0, 6, L"_xlfn.") == 0) name.erase(0, 6);
        RefToken ref;
        if (!call && !qualified && r1c1 && parseRefToken(name, ranged, ref)) return a1ToR1C1(ref, row, col);
        return name;
    });
    if (listSeparator == L';') out = replaceOutsideQuotes(out, L',', L';');
    return out;
}

std::wstring shiftFormula(const std::wstring& text, int rowOffset, int colOffset) {
    return mapTokens(text, [&](const std::wstring& token, bool call, bool qualified, bool ranged) -> std::wstring {
        RefToken ref;
        if (call || qualified || !parseRefToken(token, ranged, ref)) return token;
        const bool hasRow = ref.row >= 0, hasCol = ref.col >= 0;
        if (hasRow && !ref.rowAbs) ref.row += rowOffset;
        if (hasCol && !ref.colAbs) ref.col += colOffset;
        if ((hasRow && (ref.row < 0 || ref.row > 1048575)) || (hasCol && (ref.col < 0 || ref.col > 16383)))
            return L"#REF!";
        return printRefToken(ref);
    });
}

}  // namespace quire
