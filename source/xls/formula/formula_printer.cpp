#include "xls/formula/formula_printer.h"

#include <vector>

#include "api/qrerror.h"
#include "api/wide_text.h"
#include "xls/byte_stream.h"
#include "xls/formula/cell_reference.h"
#include "xls/formula/formula_text.h"
#include "xls/formula/function_table.h"
#include "xls/formula/ptg.h"

namespace quire::xls {

namespace {

// Texts longer than any formula Excel writes; hostile token arrays could
// otherwise grow them quadratically.
constexpr size_t MaxText = 65536;

struct Operand {
    std::wstring text;
    bool missing = false;  // an empty argument ("MISS")
};

class Printer {
public:
    Printer(const uint8_t* rgce, size_t cce, const uint8_t* rgcb, size_t cbSize, const FormulaContext& book,
            const FormulaOrigin& origin)
        : in_(rgce, cce), extra_(rgcb, cbSize), book_(book), origin_(origin), separator_(book.listSeparator())
    {
    }

    std::wstring run()
    {
        while (!in_.empty())
            token(in_.popInt8());
        if (stack_.size() != 1)
            throw qrerror("can't build infix formula string");
        std::wstring text = std::move(stack_.back().text);
        if (!text.empty() && text[0] == L' ')
            text.erase(0, 1);
        return text;
    }

private:
    void push(std::wstring text, bool missing = false)
    {
        if (text.size() > MaxText)
            throw qrerror("can't build infix formula string");
        stack_.push_back({std::move(text), missing});
    }

    Operand pop()
    {
        Operand o = std::move(stack_.back());
        stack_.pop_back();
        return o;
    }

    void skip(size_t n)
    {
        if (in_.size() < n)
            throw qrerror("GetFormula move1 error");
        for (size_t i = 0; i < n; ++i)
            in_.popInt8();
    }

    void token(uint8_t id)
    {
        if (id >= ptg::Add && id <= ptg::Range && id != ptg::Isect && id != ptg::Union && id != ptg::Range) {
            binary(operatorText(id));
            return;
        }
        switch (id) {
        case ptg::Exp:
            throw qrerror("toInfix error: formula refers to a shared or array formula");
        case ptg::Tbl:
            throw qrerror("toInfix error: formula refers to a data table");
        case ptg::Isect:
            binary(L" ");
            return;
        case ptg::Union:
            binary(std::wstring(1, separator_));
            return;
        case ptg::Range: {
            if (stack_.size() < 2)
                throw qrerror("toInfix error: incorrect ptgRange expression");
            Operand right = pop();
            Operand left = pop();
            push(left.text + L":" + right.text);
            return;
        }
        case ptg::Uplus:
        case ptg::Uminus:
            if (stack_.empty())
                throw qrerror(id == ptg::Uminus ? "toInfix error: incorrect unary minus expression"
                                                : "toInfix error: incorrect unary plus expression");
            if (stack_.back().text.size() >= MaxText)
                throw qrerror("can't build infix formula string");
            stack_.back().text.insert(0, id == ptg::Uminus ? L"-" : L"+");
            stack_.back().missing = false;
            return;
        case ptg::Percent:
            if (stack_.empty())
                throw qrerror("toInfix error: incorrect percent expression");
            if (stack_.back().text.size() >= MaxText)
                throw qrerror("can't build infix formula string");
            stack_.back().text += L'%';
            stack_.back().missing = false;
            return;
        case ptg::Paren:
            if (stack_.empty())
                throw qrerror("toInfix error: incorrect brackets");
            push(L"(" + pop().text + L")");
            return;
        case ptg::MissArg:
            push(std::wstring(), true);
            return;
        case ptg::Str:
            push(quoteString(shortString()));
            return;
        case ptg::Extend:
            throw qrerror("unknown Ptg 0x18");
        case ptg::Attr:
            attribute();
            return;
        case ptg::Err: {
            const wchar_t* text = errorLiteral(in_.popInt8());
            if (!text)
                throw qrerror("can't build infix formula string");
            push(text);
            return;
        }
        case ptg::Bool:
            push(in_.popInt8() ? L"TRUE" : L"FALSE");
            return;
        case ptg::Int:
            push(std::to_wstring(in_.popInt16()));
            return;
        case ptg::Num:
            push(formatNumber(in_.popDouble()));
            return;
        default:
            break;
        }
        if (id < 0x20 || id >= 0x80)
            throw qrerror("can't recognize formula block: unknown ptg");
        classed(ptg::baseId(id));
    }

    static const wchar_t* operatorText(uint8_t id)
    {
        static const wchar_t* const texts[] = {L"+", L"-", L"*", L"/", L"^", L"&", L"<", L"<=", L"=", L">=", L">", L"<>"};
        return texts[id - ptg::Add];
    }

    void binary(const std::wstring& op)
    {
        if (stack_.size() < 2)
            throw qrerror("toInfix error: expected two operands for binary operator");
        Operand right = pop();
        Operand left = pop();
        push(left.text + op + right.text);
    }

    // ShortXLUnicodeString: cch, flags, characters.
    std::wstring shortString()
    {
        const uint8_t cch = in_.popInt8();
        const uint8_t flags = in_.popInt8();
        return characters(in_, cch, (flags & 0x01) != 0);
    }

    static std::wstring characters(ByteStream& s, size_t cch, bool highByte)
    {
        if (s.size() < (highByte ? cch * 2 : cch))
            throw qrerror("GetFormula move1 error");
        std::u16string units;
        units.reserve(cch);
        for (size_t i = 0; i < cch; ++i)
            units += static_cast<char16_t>(highByte ? s.popInt16() : s.popInt8());
        return fromUtf16(units.data(), units.size());
    }

    void attribute()
    {
        const uint8_t kind = in_.popInt8();
        switch (kind) {
        case ptg::AttrVolatile:
        case ptg::AttrIf:
        case ptg::AttrGoto:
        case ptg::AttrBaxcel:
        case ptg::AttrBaxcelVolatile:
        case ptg::AttrSpace:
        case ptg::AttrSpaceVolatile:
            in_.popInt16();
            return;
        case ptg::AttrChoose: {
            const uint16_t count = in_.popInt16();
            skip((static_cast<size_t>(count) + 1) * 2);
            return;
        }
        case ptg::AttrSum:
            in_.popInt16();
            if (stack_.empty())
                throw qrerror("toInfix error: incorrect function expression");
            push(L"SUM(" + pop().text + L")");
            return;
        default:
            throw qrerror("unknown Ptg 0x19");
        }
    }

    void classed(uint8_t base)
    {
        switch (base) {
        case ptg::Array:
            skip(7);
            push(arrayText());
            return;
        case ptg::Func: {
            const uint16_t id = in_.popInt16();
            const FunctionInfo* f = functionById(id);
            if (!f)
                throw qrerror("toInfix error: incorrect function expression");
            function(f, f->fixedArgs);
            return;
        }
        case ptg::FuncVar: {
            const uint8_t argc = in_.popInt8() & 0x7F;
            const uint16_t tab = in_.popInt16();
            const FunctionInfo* f = (tab & 0x8000) ? nullptr : functionById(tab);
            if (!f)
                throw qrerror("toInfix error: incorrect function expression");
            function(f, argc);
            return;
        }
        case ptg::Name:
            push(nameText(in_.popInt32()));
            return;
        case ptg::Ref: {
            const uint16_t row = in_.popInt16();
            const uint16_t col = in_.popInt16();
            push(cellText(row, col));
            return;
        }
        case ptg::Area:
            push(areaText());
            return;
        case ptg::MemArea: {
            skip(4);
            in_.popInt16();
            // Its extra data lists the cached areas; the subexpression follows.
            const uint16_t count = extra_.popInt16();
            if (extra_.size() < count * size_t{8})
                throw qrerror("GetFormula move1 error");
            for (size_t i = 0; i < count * size_t{8}; ++i)
                extra_.popInt8();
            return;
        }
        case ptg::MemErr:
        case ptg::MemNoMem:
            skip(4);
            in_.popInt16();
            return;
        case ptg::MemFunc:
            in_.popInt16();
            return;
        case ptg::RefErr:
            skip(4);
            push(L"#REF!");
            return;
        case ptg::AreaErr:
            skip(8);
            push(L"#REF!");
            return;
        case ptg::RefN: {
            const uint16_t row = in_.popInt16();
            const uint16_t col = in_.popInt16();
            push(relativeCellText(row, col));
            return;
        }
        case ptg::AreaN: {
            const uint16_t r1 = in_.popInt16();
            const uint16_t r2 = in_.popInt16();
            const uint16_t c1 = in_.popInt16();
            const uint16_t c2 = in_.popInt16();
            push(relativeCellText(r1, c1) + L":" + relativeCellText(r2, c2));
            return;
        }
        case ptg::NameX: {
            const uint16_t xti = in_.popInt16();
            const uint16_t index = in_.popInt16();
            in_.popInt16();
            push(externNameText(xti, index));
            return;
        }
        case ptg::Ref3d: {
            const uint16_t xti = in_.popInt16();
            const uint16_t row = in_.popInt16();
            const uint16_t col = in_.popInt16();
            std::wstring prefix;
            push(sheetPart(xti, prefix) ? prefix + cellText(row, col) : L"#REF!");
            return;
        }
        case ptg::Area3d: {
            const uint16_t xti = in_.popInt16();
            std::wstring prefix;
            const bool live = sheetPart(xti, prefix);
            const std::wstring area = areaText();
            push(live ? prefix + area : L"#REF!");
            return;
        }
        case ptg::RefErr3d:
            skip(6);
            push(L"#REF!");
            return;
        case ptg::AreaErr3d:
            skip(10);
            push(L"#REF!");
            return;
        default:
            throw qrerror("can't recognize formula block: unknown ptg");
        }
    }

    void function(const FunctionInfo* f, size_t argc)
    {
        if (stack_.size() < argc)
            throw qrerror("toInfix error: incorrect function expression");
        std::vector<Operand> args(argc);
        for (size_t i = argc; i-- > 0;)
            args[i] = pop();
        std::wstring text;
        size_t first = 0;
        if (f->id == FunctionUserDefined) {
            // The first operand names the add-in or macro function.
            if (argc == 0)
                throw qrerror("toInfix error: incorrect function expression");
            text = args[0].text;
            first = 1;
        } else {
            text = f->name;
        }
        text += L'(';
        for (size_t i = first; i < argc; ++i) {
            if (i > first)
                text += separator_;
            text += args[i].text;
            if (text.size() > MaxText)
                throw qrerror("can't build infix formula string");
        }
        text += L')';
        push(std::move(text));
    }

    static std::wstring cellText(uint16_t row, uint16_t colField)
    {
        CellRef r;
        r.row = row;
        r.col = colField & ptg::ColumnMask;
        r.rowRelative = (colField & ptg::RowRelative) != 0;
        r.colRelative = (colField & ptg::ColRelative) != 0;
        return referenceText(r);
    }

    // Whole columns and rows as A:C and 1:3, other areas as A1:C3.
    std::wstring areaText()
    {
        const uint16_t r1 = in_.popInt16();
        const uint16_t r2 = in_.popInt16();
        const uint16_t c1 = in_.popInt16();
        const uint16_t c2 = in_.popInt16();
        const bool rowsAbsolute = !((c1 | c2) & ptg::RowRelative);
        const bool colsAbsolute = !((c1 | c2) & ptg::ColRelative);
        if (r1 == 0 && r2 == MaxRow && rowsAbsolute) {
            auto col = [](uint16_t field) {
                return ((field & ptg::ColRelative) ? L"" : L"$") + columnName(field & ptg::ColumnMask);
            };
            return col(c1) + L":" + col(c2);
        }
        if ((c1 & ptg::ColumnMask) == 0 && (c2 & ptg::ColumnMask) == MaxColumn && colsAbsolute) {
            auto row = [](uint16_t r, uint16_t field) {
                return ((field & ptg::RowRelative) ? L"" : L"$") + std::to_wstring(r + 1);
            };
            return row(r1, c1) + L":" + row(r2, c2);
        }
        return cellText(r1, c1) + L":" + cellText(r2, c2);
    }

    // ptgRefN / ptgAreaN parts: relative parts are offsets from the origin cell.
    std::wstring relativeCellText(uint16_t row, uint16_t colField)
    {
        const bool rowRelative = (colField & ptg::RowRelative) != 0;
        const bool colRelative = (colField & ptg::ColRelative) != 0;
        if ((rowRelative || colRelative) && (origin_.row < 0 || origin_.col < 0))
            throw qrerror("toInfix error: relative reference without a cell");
        CellRef r;
        r.rowRelative = rowRelative;
        r.colRelative = colRelative;
        r.row = rowRelative ? (origin_.row + static_cast<int16_t>(row)) & 0xFFFF : row;
        r.col = colRelative ? (origin_.col + static_cast<int8_t>(colField & 0xFF)) & 0xFF
                            : colField & ptg::ColumnMask;
        return referenceText(r);
    }

    // The "Sheet!" part of a 3-D reference; false when the reference is dead.
    bool sheetPart(uint16_t xti, std::wstring& prefix) const
    {
        ExternSheetTarget target;
        if (!book_.externSheet(xti, target))
            throw qrerror("toInfix error: unknown XTI index");
        switch (target.kind) {
        case ExternSheetTarget::Sheets:
            prefix = sheetPrefix(target.firstSheet, target.lastSheet) + L"!";
            return true;
        case ExternSheetTarget::External: {
            const std::wstring book = L"[" + target.book + L"]";
            prefix = sheetPrefix(book + target.firstSheet,
                                 target.lastSheet == target.firstSheet ? book + target.firstSheet : target.lastSheet) +
                     L"!";
            return true;
        }
        case ExternSheetTarget::Workbook:
        case ExternSheetTarget::Deleted:
            break;
        }
        return false;
    }

    std::wstring nameText(uint32_t index) const
    {
        std::wstring name;
        int scope = WorkbookScope;
        if (index > 0xFFFF || !book_.nameText(index, name, scope))
            throw qrerror("toInfix error: unknown name");
        std::wstring sheet;
        if (scope >= 0 && scope != origin_.sheet && book_.sheetName(scope, sheet))
            return sheetPrefix(sheet, sheet) + L"!" + name;
        return name;
    }

    std::wstring externNameText(uint16_t xti, uint16_t index) const
    {
        std::wstring name;
        if (book_.externNameText(xti, index, name))
            return name;
        // Otherwise a defined name of this book, seen from a sheet or the workbook.
        ExternSheetTarget target;
        int scope = WorkbookScope;
        if (book_.externSheet(xti, target) && book_.nameText(index, name, scope)) {
            if (target.kind == ExternSheetTarget::Sheets)
                return sheetPrefix(target.firstSheet, target.lastSheet) + L"!" + name;
            if (target.kind == ExternSheetTarget::Workbook)
                return name;
        }
        throw qrerror("toInfix error: unknown name");
    }

    // PtgExtraArray from rgcb: columns - 1, rows - 1, then SerAr values by row.
    std::wstring arrayText()
    {
        const size_t cols = extra_.popInt8() + size_t{1};
        const size_t rows = extra_.popInt16() + size_t{1};
        std::wstring text = L"{";
        for (size_t r = 0; r < rows; ++r) {
            if (r > 0)
                text += L';';
            for (size_t c = 0; c < cols; ++c) {
                if (c > 0)
                    text += L',';
                text += arrayValue();
                if (text.size() > MaxText)
                    throw qrerror("can't build infix formula string");
            }
        }
        return text + L"}";
    }

    std::wstring arrayValue()
    {
        const uint8_t type = extra_.popInt8();
        switch (type) {
        case 0x00:  // empty
            extra_.popDouble();
            return std::wstring();
        case 0x01:
            return formatNumber(extra_.popDouble());
        case 0x02: {
            const uint16_t cch = extra_.popInt16();
            const uint8_t flags = extra_.popInt8();
            return quoteString(characters(extra_, cch, (flags & 0x01) != 0));
        }
        case 0x04: {
            const uint8_t value = extra_.popInt8();
            extra_.popInt32();
            extra_.popInt16();
            extra_.popInt8();
            return value ? L"TRUE" : L"FALSE";
        }
        case 0x10: {
            const wchar_t* text = errorLiteral(extra_.popInt8());
            extra_.popInt32();
            extra_.popInt16();
            extra_.popInt8();
            if (!text)
                throw qrerror("can't build infix formula string");
            return text;
        }
        default:
            throw qrerror("can't recognize formula block: unknown ptg");
        }
    }

    ByteStream in_;
    ByteStream extra_;
    const FormulaContext& book_;
    FormulaOrigin origin_;
    wchar_t separator_;
    std::vector<Operand> stack_;
};

} // namespace

std::wstring toInfix(const uint8_t* rgce, size_t cce, const uint8_t* rgcb, size_t cbSize, const FormulaContext& book,
                     const FormulaOrigin& origin)
{
    return Printer(rgce, rgce ? cce : 0, rgcb, rgcb ? cbSize : 0, book, origin).run();
}

std::wstring toInfix(const ParsedFormula& formula, const FormulaContext& book, const FormulaOrigin& origin)
{
    return toInfix(formula.rgce.data(), formula.rgce.size(), formula.rgcb.data(), formula.rgcb.size(), book, origin);
}

} // namespace quire::xls
