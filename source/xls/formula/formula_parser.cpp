#include "xls/formula/formula_parser.h"

#include "api/qrerror.h"
#include "xls/formula/formula_context.h"
#include "xls/formula/formula_text.h"
#include "xls/formula/function_table.h"
#include "xls/formula/ptg.h"

namespace quire::xls {

namespace {

constexpr size_t MaxArguments = 127;  // ptgFuncVar holds the count in 7 bits
constexpr int MaxDepth = 512;         // nesting of brackets and operators
constexpr size_t MaxTokens = 4096;

[[noreturn]] void badToken() { throw qrerror("incorrect token in formula"); }
[[noreturn]] void badFormula() { throw qrerror("error in formula"); }

std::wstring upperAscii(std::wstring text)
{
    for (auto& c : text)
        if (c >= L'a' && c <= L'z')
            c = static_cast<wchar_t>(c - 32);
    return text;
}

// Precedence of the binary operators (higher binds tighter); -1 for others.
int binaryLevel(const FormulaToken& t)
{
    if (t.kind != FormulaToken::Operator)
        return -1;
    const std::wstring& op = t.text;
    if (op == L"^")
        return 7;
    if (op == L"*" || op == L"/")
        return 6;
    if (op == L"+" || op == L"-")
        return 5;
    if (op == L"<" || op == L">" || op == L"<=" || op == L">=")
        return 4;
    if (op == L"=" || op == L"<>")
        return 3;
    if (op == L"&")
        return 2;
    return -1;
}

uint8_t binaryPtg(const std::wstring& op)
{
    if (op == L"+") return ptg::Add;
    if (op == L"-") return ptg::Sub;
    if (op == L"*") return ptg::Mul;
    if (op == L"/") return ptg::Div;
    if (op == L"^") return ptg::Power;
    if (op == L"&") return ptg::Concat;
    if (op == L"<") return ptg::Lt;
    if (op == L"<=") return ptg::Le;
    if (op == L"=") return ptg::Eq;
    if (op == L">=") return ptg::Ge;
    if (op == L">") return ptg::Gt;
    return ptg::Ne;
}

FormulaNode binary(uint8_t op, FormulaNode left, FormulaNode right)
{
    FormulaNode n;
    n.kind = FormulaNode::Binary;
    n.op = op;
    n.children.push_back(std::move(left));
    n.children.push_back(std::move(right));
    return n;
}

bool isReferenceNode(const FormulaNode& n)
{
    return n.kind == FormulaNode::Ref || n.kind == FormulaNode::Area || n.kind == FormulaNode::Name ||
           n.kind == FormulaNode::Paren ||
           (n.kind == FormulaNode::Binary && (n.op == ptg::Range || n.op == ptg::Isect));
}

class Parser {
public:
    Parser(const std::wstring& text, FormulaContext& book, int sheet)
        : tokens_(splitFormula(text)), book_(book), sheet_(sheet)
    {
    }

    FormulaNode run()
    {
        // No formula that fits a record has this many tokens; the cap also
        // bounds the depth of the tree.
        if (tokens_.size() > MaxTokens)
            badFormula();
        if (peek().kind == FormulaToken::End)
            badFormula();
        FormulaNode root = expression(2);
        if (peek().kind != FormulaToken::End)
            badFormula();
        return root;
    }

private:
    const FormulaToken& peek() const { return tokens_[pos_]; }
    const FormulaToken& take() { return tokens_[pos_ < tokens_.size() - 1 ? pos_++ : pos_]; }

    struct DepthGuard {
        explicit DepthGuard(int& d) : depth(d)
        {
            if (++depth > MaxDepth)
                badFormula();
        }
        ~DepthGuard() { --depth; }
        int& depth;
    };

    // Binary operators of level minLevel and up, left to right.
    FormulaNode expression(int minLevel)
    {
        DepthGuard guard(depth_);
        FormulaNode left = postfix();
        while (true) {
            const int level = binaryLevel(peek());
            if (level < minLevel)
                return left;
            const uint8_t op = binaryPtg(take().text);
            FormulaNode right = expression(level + 1);
            left = binary(op, std::move(left), std::move(right));
        }
    }

    // Postfix percent binds looser than the prefix signs: -A1% is (-A1)%.
    FormulaNode postfix()
    {
        FormulaNode operand = prefix();
        while (peek().kind == FormulaToken::Operator && peek().text == L"%") {
            take();
            FormulaNode n;
            n.kind = FormulaNode::Unary;
            n.op = ptg::Percent;
            n.children.push_back(std::move(operand));
            operand = std::move(n);
        }
        return operand;
    }

    FormulaNode prefix()
    {
        DepthGuard guard(depth_);
        const FormulaToken& t = peek();
        if (t.kind == FormulaToken::Operator && (t.text == L"-" || t.text == L"+")) {
            const uint8_t op = t.text == L"-" ? ptg::Uminus : ptg::Uplus;
            take();
            FormulaNode n;
            n.kind = FormulaNode::Unary;
            n.op = op;
            n.children.push_back(prefix());
            return n;
        }
        return intersection();
    }

    // Reference operators bind tighter than every other: range, then
    // intersection (a space between two references).
    FormulaNode intersection()
    {
        FormulaNode left = range();
        while (isReferenceNode(left) && peek().spaceBefore &&
               (peek().kind == FormulaToken::Word || peek().kind == FormulaToken::Open)) {
            FormulaNode right = range();
            left = binary(ptg::Isect, std::move(left), std::move(right));
        }
        return left;
    }

    FormulaNode range()
    {
        FormulaNode left = primary();
        while (peek().kind == FormulaToken::Operator && peek().text == L":") {
            take();
            FormulaNode right = primary();
            left = binary(ptg::Range, std::move(left), std::move(right));
        }
        return left;
    }

    FormulaNode primary()
    {
        DepthGuard guard(depth_);
        const FormulaToken& t = take();
        FormulaNode n;
        switch (t.kind) {
        case FormulaToken::Number:
            n.kind = FormulaNode::Number;
            n.text = t.text;
            return n;
        case FormulaToken::String:
            n.kind = FormulaNode::String;
            n.text = t.text;
            return n;
        case FormulaToken::Error:
            n.kind = FormulaNode::Error;
            n.code = t.code;
            return n;
        case FormulaToken::Array:
            n.kind = FormulaNode::Array;
            n.rows = t.rows;
            return n;
        case FormulaToken::Word:
            return word(t);
        case FormulaToken::Function:
            return call(t.text);
        case FormulaToken::Open:
            return brackets();
        case FormulaToken::End:
        case FormulaToken::Operator:
        case FormulaToken::Separator:
        case FormulaToken::Close:
            break;
        }
        badFormula();
    }

    // "(" expression ")" or a union "(A1,B2)".
    FormulaNode brackets()
    {
        FormulaNode inner = expression(2);
        while (peek().kind == FormulaToken::Separator) {
            take();
            FormulaNode right = expression(2);
            inner = binary(ptg::Union, std::move(inner), std::move(right));
        }
        if (peek().kind != FormulaToken::Close)
            badFormula();
        take();
        FormulaNode n;
        n.kind = FormulaNode::Paren;
        n.children.push_back(std::move(inner));
        return n;
    }

    FormulaNode call(const std::wstring& name)
    {
        FormulaNode n;
        n.kind = FormulaNode::Call;
        n.function = findFunction(name);
        if (peek().kind != FormulaToken::Open)
            throw qrerror("error: function name without open parenthesis");
        take();
        if (peek().kind == FormulaToken::Close) {
            take();
        } else {
            while (true) {
                const FormulaToken& t = peek();
                if (t.kind == FormulaToken::Separator || t.kind == FormulaToken::Close) {
                    FormulaNode missing;
                    missing.kind = FormulaNode::Missing;
                    n.children.push_back(std::move(missing));
                } else if (t.kind == FormulaToken::End) {
                    throw qrerror("error: function parentheses not found");
                } else {
                    n.children.push_back(expression(2));
                }
                const FormulaToken& after = take();
                if (after.kind == FormulaToken::Close)
                    break;
                if (after.kind == FormulaToken::End)
                    throw qrerror("error: function parentheses not found");
                if (after.kind != FormulaToken::Separator)
                    badFormula();
            }
        }
        const size_t argc = n.children.size();
        if (n.function) {
            if (n.function->fixedArgs != 0 && argc != n.function->fixedArgs)
                throw qrerror("incorrect number of function parameters");
            // TODAY is written as ptgFunc, which carries no argument count.
            if (n.function->id == FunctionToday && argc != 0)
                throw qrerror("incorrect number of function parameters");
            if (argc > MaxArguments)
                throw qrerror("incorrect number of function parameters");
        } else {
            if (argc + 1 > MaxArguments)
                throw qrerror("incorrect number of function parameters");
            n.userName = book_.userFunctionIndex(name);
            if (n.userName == 0)
                badToken();
        }
        return n;
    }

    // Sheet part "First" or "First:Last" to sheet indexes.
    void resolveSheets(const std::wstring& sheetText, FormulaNode& n)
    {
        const size_t colon = sheetText.find(L':');
        const std::wstring first = colon == std::wstring::npos ? sheetText : sheetText.substr(0, colon);
        const std::wstring last = colon == std::wstring::npos ? sheetText : sheetText.substr(colon + 1);
        n.firstSheet = book_.sheetIndex(first);
        n.lastSheet = book_.sheetIndex(last);
        if (n.firstSheet < 0 || n.lastSheet < 0)
            badToken();
        if (n.lastSheet < n.firstSheet)
            std::swap(n.firstSheet, n.lastSheet);
    }

    unsigned findName(const std::wstring& name, const FormulaToken& t)
    {
        if (t.hasSheet) {
            if (t.sheet.find(L':') != std::wstring::npos)
                return 0;
            const int scope = book_.sheetIndex(t.sheet);
            return scope < 0 ? 0 : book_.nameIndex(name, scope);
        }
        if (sheet_ >= 0)
            if (const unsigned local = book_.nameIndex(name, sheet_))
                return local;
        return book_.nameIndex(name, WorkbookScope);
    }

    // One part of a word: a cell, or a defined name.
    bool cellOrName(const std::wstring& part, const FormulaToken& t, FormulaNode& n)
    {
        try {
            if (isReference(part, n.first)) {
                n.kind = FormulaNode::Ref;
                return true;
            }
        } catch (const qrerror&) {
            // Out of the sheet's range: only a defined name of that text saves it.
            if (const unsigned index = findName(part, t)) {
                n.kind = FormulaNode::Name;
                n.nameIndex = index;
                return true;
            }
            throw;
        }
        if (const unsigned index = findName(part, t)) {
            n.kind = FormulaNode::Name;
            n.nameIndex = index;
            return true;
        }
        return false;
    }

    FormulaNode word(const FormulaToken& t)
    {
        FormulaNode n;
        const std::wstring& text = t.text;
        if (!t.hasSheet) {
            const std::wstring upper = upperAscii(text);
            if (upper == L"TRUE" || upper == L"FALSE") {
                n.kind = FormulaNode::Bool;
                n.code = upper == L"TRUE" ? 1 : 0;
                return n;
            }
            if (findFunction(text) && !findName(text, t))
                throw qrerror("error: function name without open parenthesis");
        }

        const size_t colon = text.find(L':');
        if (colon == std::wstring::npos) {
            if (!cellOrName(text, t, n))
                badToken();
            if (n.kind == FormulaNode::Ref && t.hasSheet)
                resolveSheets(t.sheet, n);
            return n;
        }

        const std::wstring a = text.substr(0, colon);
        const std::wstring b = text.substr(colon + 1);
        if (b.find(L':') == std::wstring::npos && areaOf(a, b, n)) {
            if (t.hasSheet)
                resolveSheets(t.sheet, n);
            return n;
        }

        // Anything else with colons: its parts joined by the range operator.
        FormulaNode result;
        size_t start = 0;
        bool firstPart = true;
        while (true) {
            const size_t end = text.find(L':', start);
            const std::wstring part = text.substr(start, end == std::wstring::npos ? std::wstring::npos : end - start);
            FormulaNode p;
            if (part.empty() || !cellOrName(part, t, p))
                badToken();
            if (p.kind == FormulaNode::Ref && t.hasSheet)
                resolveSheets(t.sheet, p);
            result = firstPart ? std::move(p) : binary(ptg::Range, std::move(result), std::move(p));
            firstPart = false;
            if (end == std::wstring::npos)
                break;
            start = end + 1;
        }
        return result;
    }

    // "A1:B2", whole columns "A:C", whole rows "1:3".
    bool areaOf(const std::wstring& a, const std::wstring& b, FormulaNode& n)
    {
        CellRef first, last;
        bool ok = false;
        try {
            ok = isReference(a, first) && isReference(b, last);
        } catch (const qrerror&) {
            if (isReferenceShape(a) && isReferenceShape(b))
                throw;
            ok = false;
        }
        if (!ok) {
            int c1 = 0, c2 = 0, r1 = 0, r2 = 0;
            bool rel1 = false, rel2 = false;
            if (isColumnOnly(a, c1, rel1) && isColumnOnly(b, c2, rel2)) {
                first = {0, c1, false, rel1};
                last = {MaxRow, c2, false, rel2};
                ok = true;
            } else if (isRowOnly(a, r1, rel1) && isRowOnly(b, r2, rel2)) {
                first = {r1, 0, rel1, false};
                last = {r2, MaxColumn, rel2, false};
                ok = true;
            }
        }
        if (!ok)
            return false;
        n.kind = FormulaNode::Area;
        n.first = first;
        n.last = last;
        return true;
    }

    static bool isReferenceShape(const std::wstring& text)
    {
        CellRef ignored;
        try {
            return isReference(text, ignored);
        } catch (const qrerror&) {
            return true;
        }
    }

    std::vector<FormulaToken> tokens_;
    size_t pos_ = 0;
    FormulaContext& book_;
    int sheet_;
    int depth_ = 0;
};

} // namespace

FormulaNode parseFormula(const std::wstring& text, FormulaContext& book, int sheet)
{
    return Parser(text, book, sheet).run();
}

} // namespace quire::xls
