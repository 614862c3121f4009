#include "xls/formula/formula_lexer.h"

#include "api/qrerror.h"
#include "xls/formula/formula_text.h"

namespace quire::xls {

namespace {

bool isDigit(wchar_t c) { return c >= L'0' && c <= L'9'; }
bool isSpace(wchar_t c) { return c == L' ' || c == L'\t' || c == L'\r' || c == L'\n'; }
// Characters of a word: names, references, ranges and the sheet separator.
bool isWordChar(wchar_t c) { return isNameChar(c) || c == L'$' || c == L':' || c == L'!'; }

[[noreturn]] void badToken() { throw qrerror("incorrect token in formula"); }
[[noreturn]] void badFormula() { throw qrerror("error in formula"); }

class Lexer {
public:
    explicit Lexer(const std::wstring& text) : s_(text) {}

    std::vector<FormulaToken> run()
    {
        while (true) {
            bool space = false;
            while (i_ < s_.size() && isSpace(s_[i_])) {
                ++i_;
                space = true;
            }
            const size_t before = out_.size();
            if (i_ >= s_.size()) {
                FormulaToken end;
                end.spaceBefore = space;
                out_.push_back(end);
                return std::move(out_);
            }
            next();
            if (out_.size() > before)
                out_[before].spaceBefore = space;
        }
    }

private:
    void push(FormulaToken::Kind kind, std::wstring text = {})
    {
        FormulaToken t;
        t.kind = kind;
        t.text = std::move(text);
        out_.push_back(std::move(t));
    }

    void next()
    {
        const wchar_t c = s_[i_];
        if (c == L'"') {
            push(FormulaToken::String, readString());
        } else if (c == L'#') {
            FormulaToken t;
            t.kind = FormulaToken::Error;
            const size_t n = matchErrorLiteral(s_.data() + i_, s_.size() - i_, t.code);
            if (n == 0)
                badToken();
            i_ += n;
            out_.push_back(t);
        } else if (isDigit(c) || (c == L'.' && i_ + 1 < s_.size() && isDigit(s_[i_ + 1]))) {
            if (!readRowRange())
                push(FormulaToken::Number, readNumber());
        } else if (c == L'\'' || (isWordChar(c) && c != L':' && c != L'!')) {
            readWord();
        } else if (c == L'{') {
            readArray();
        } else if (c == L'(') {
            ++i_;
            push(FormulaToken::Open, L"(");
        } else if (c == L')') {
            ++i_;
            push(FormulaToken::Close, L")");
        } else if (c == L',' || c == L';') {
            ++i_;
            push(FormulaToken::Separator, std::wstring(1, c));
        } else if (c == L'<' || c == L'>') {
            std::wstring op(1, c);
            ++i_;
            if (i_ < s_.size() && (s_[i_] == L'=' || (c == L'<' && s_[i_] == L'>')))
                op += s_[i_++];
            push(FormulaToken::Operator, op);
        } else if (c == L'+' || c == L'-' || c == L'*' || c == L'/' || c == L'^' || c == L'&' ||
                   c == L'=' || c == L'%' || c == L':') {
            ++i_;
            push(FormulaToken::Operator, std::wstring(1, c));
        } else {
            badToken();
        }
    }

    std::wstring readString()
    {
        std::wstring value;
        ++i_;  // opening quote
        while (true) {
            if (i_ >= s_.size())
                badFormula();
            if (s_[i_] == L'"') {
                if (i_ + 1 < s_.size() && s_[i_ + 1] == L'"') {
                    value += L'"';
                    i_ += 2;
                    continue;
                }
                ++i_;
                return value;
            }
            value += s_[i_++];
        }
    }

    std::wstring readNumber()
    {
        const size_t start = i_;
        while (i_ < s_.size() && isDigit(s_[i_]))
            ++i_;
        if (i_ < s_.size() && s_[i_] == L'.') {
            ++i_;
            while (i_ < s_.size() && isDigit(s_[i_]))
                ++i_;
        }
        if (i_ < s_.size() && (s_[i_] == L'e' || s_[i_] == L'E')) {
            size_t k = i_ + 1;
            if (k < s_.size() && (s_[k] == L'+' || s_[k] == L'-'))
                ++k;
            if (k < s_.size() && isDigit(s_[k])) {
                while (k < s_.size() && isDigit(s_[k]))
                    ++k;
                i_ = k;
            }
        }
        return s_.substr(start, i_ - start);
    }

    // Whole rows: "1:3", "1:$3" (a word, not a number).
    bool readRowRange()
    {
        size_t k = i_;
        while (k < s_.size() && isDigit(s_[k]))
            ++k;
        if (k >= s_.size() || s_[k] != L':')
            return false;
        size_t m = k + 1;
        if (m < s_.size() && s_[m] == L'$')
            ++m;
        const size_t digits = m;
        while (m < s_.size() && isDigit(s_[m]))
            ++m;
        if (m == digits || (m < s_.size() && isWordChar(s_[m])))
            return false;
        push(FormulaToken::Word, s_.substr(i_, m - i_));
        i_ = m;
        return true;
    }

    void readWord()
    {
        FormulaToken t;
        t.kind = FormulaToken::Word;
        if (s_[i_] == L'\'') {
            // Quoted sheet name, quotes doubled inside; "!" must follow.
            ++i_;
            while (true) {
                if (i_ >= s_.size())
                    badFormula();
                if (s_[i_] == L'\'') {
                    if (i_ + 1 < s_.size() && s_[i_ + 1] == L'\'') {
                        t.sheet += L'\'';
                        i_ += 2;
                        continue;
                    }
                    ++i_;
                    break;
                }
                t.sheet += s_[i_++];
            }
            if (i_ >= s_.size() || s_[i_] != L'!')
                badToken();
            ++i_;
            t.hasSheet = true;
        }
        const size_t start = i_;
        while (i_ < s_.size() && isWordChar(s_[i_]))
            ++i_;
        std::wstring word = s_.substr(start, i_ - start);
        if (!t.hasSheet) {
            const size_t bang = word.find(L'!');
            if (bang != std::wstring::npos) {
                t.hasSheet = true;
                t.sheet = word.substr(0, bang);
                word.erase(0, bang + 1);
            }
        }
        if (t.hasSheet) {
            // "Sheet1!A1:Sheet1!B2" and "'S 1'!A1:'S 1'!B2": the range
            // operator between two sheet-qualified references.
            const size_t bang = word.find(L'!');
            const size_t colon = word.rfind(L':', bang);
            if (bang != std::wstring::npos && colon != std::wstring::npos) {
                i_ -= word.size() - colon;
                word.erase(colon);
            } else if (!word.empty() && word.back() == L':' && i_ < s_.size() && s_[i_] == L'\'') {
                --i_;
                word.pop_back();
            }
        }
        if (word.empty() || word.find(L'!') != std::wstring::npos)
            badToken();

        size_t k = i_;
        while (k < s_.size() && isSpace(s_[k]))
            ++k;
        const bool call = k < s_.size() && s_[k] == L'(';
        if (call && !t.hasSheet) {
            // "A1:INDEX(...)": a range whose second operand is a call.
            const size_t colon = word.rfind(L':');
            if (colon != std::wstring::npos) {
                if (colon == 0 || colon + 1 == word.size())
                    badToken();
                t.text = word.substr(0, colon);
                out_.push_back(t);
                push(FormulaToken::Operator, L":");
                word.erase(0, colon + 1);
            }
            push(FormulaToken::Function, word);
            return;
        }
        t.text = std::move(word);
        out_.push_back(std::move(t));
    }

    // {1,2;3,4}: "," between columns, ";" between rows.
    void readArray()
    {
        FormulaToken t;
        t.kind = FormulaToken::Array;
        ++i_;
        t.rows.emplace_back();
        while (true) {
            skipSpaces();
            t.rows.back().push_back(readArrayElement());
            skipSpaces();
            if (i_ >= s_.size())
                badFormula();
            const wchar_t c = s_[i_++];
            if (c == L',')
                continue;
            if (c == L';') {
                t.rows.emplace_back();
                continue;
            }
            if (c != L'}')
                badToken();
            break;
        }
        for (const auto& row : t.rows)
            if (row.size() != t.rows.front().size())
                badFormula();
        out_.push_back(std::move(t));
    }

    ArrayElement readArrayElement()
    {
        ArrayElement e;
        if (i_ >= s_.size())
            badFormula();
        const wchar_t c = s_[i_];
        if (c == L'"') {
            e.kind = ArrayElement::String;
            e.text = readString();
            return e;
        }
        if (c == L'#') {
            e.kind = ArrayElement::Error;
            const size_t n = matchErrorLiteral(s_.data() + i_, s_.size() - i_, e.code);
            if (n == 0)
                badToken();
            i_ += n;
            return e;
        }
        bool negative = false;
        if (c == L'-' || c == L'+') {
            negative = c == L'-';
            ++i_;
        }
        if (i_ < s_.size() && (isDigit(s_[i_]) || s_[i_] == L'.')) {
            if (!parseNumber(readNumber(), e.number))
                badToken();
            if (negative)
                e.number = -e.number;
            return e;
        }
        const size_t start = i_;
        while (i_ < s_.size() && isNameChar(s_[i_]))
            ++i_;
        std::wstring word = s_.substr(start, i_ - start);
        if (negative || c == L'+')
            badToken();
        for (auto& ch : word)
            if (ch >= L'a' && ch <= L'z')
                ch = static_cast<wchar_t>(ch - 32);
        if (word == L"TRUE" || word == L"FALSE") {
            e.kind = ArrayElement::Bool;
            e.code = word == L"TRUE" ? 1 : 0;
            return e;
        }
        badToken();
    }

    void skipSpaces()
    {
        while (i_ < s_.size() && isSpace(s_[i_]))
            ++i_;
    }

    const std::wstring& s_;
    size_t i_ = 0;
    std::vector<FormulaToken> out_;
};

} // namespace

std::vector<FormulaToken> splitFormula(const std::wstring& text)
{
    return Lexer(text).run();
}

} // namespace quire::xls
