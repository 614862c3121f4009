#include "xls/formula/formula_compiler.h"

#include "api/qrerror.h"
#include "api/wide_text.h"
#include "xls/byte_stream.h"
#include "xls/formula/formula_parser.h"
#include "xls/formula/formula_text.h"
#include "xls/formula/function_table.h"
#include "xls/formula/ptg.h"

namespace quire::xls {

namespace {

constexpr uint8_t HighByte = 0x01;  // strings are written as UTF-16

// How an operand is used where it stands: passed on as a reference (alone,
// as an argument, with the reference operators) or taken as a value by an
// operator. Areas inside SUMPRODUCT's arguments are arrays.
struct Use {
    bool value = false;
    bool arrays = false;
};

class Emitter {
public:
    explicit Emitter(FormulaContext& book) : book_(book) {}

    ParsedFormula run(const FormulaNode& root)
    {
        emit(root, Use{});
        ParsedFormula f;
        if (volatile_) {
            // The volatile attribute must open the token array.
            const uint8_t attr[] = {ptg::Attr, ptg::AttrVolatile, 0, 0};
            f.rgce.assign(attr, attr + sizeof attr);
        }
        f.rgce.insert(f.rgce.end(), out_.data(), out_.data() + out_.size());
        f.rgcb.assign(extra_.data(), extra_.data() + extra_.size());
        if (f.rgce.size() > 0xFFFF)
            throw qrerror("error in formula");
        return f;
    }

private:
    void emit(const FormulaNode& n, Use use)
    {
        switch (n.kind) {
        case FormulaNode::Number:
            number(n.text);
            break;
        case FormulaNode::String:
            string(n.text);
            break;
        case FormulaNode::Bool:
            out_.pushInt8(ptg::Bool);
            out_.pushInt8(n.code);
            break;
        case FormulaNode::Error:
            out_.pushInt8(ptg::Err);
            out_.pushInt8(n.code);
            break;
        case FormulaNode::Missing:
            out_.pushInt8(ptg::MissArg);
            break;
        case FormulaNode::Array:
            array(n);
            break;
        case FormulaNode::Ref:
            reference(n, use);
            break;
        case FormulaNode::Area:
            area(n, use);
            break;
        case FormulaNode::Name:
            out_.pushInt8(ptg::Name);
            out_.pushInt32(n.nameIndex);
            break;
        case FormulaNode::Unary:
            emit(n.children[0], Use{true, use.arrays});
            out_.pushInt8(n.op);
            break;
        case FormulaNode::Binary: {
            const bool referenceOperator = n.op == ptg::Range || n.op == ptg::Isect || n.op == ptg::Union;
            const Use operands{!referenceOperator, use.arrays};
            emit(n.children[0], operands);
            emit(n.children[1], operands);
            out_.pushInt8(n.op);
            break;
        }
        case FormulaNode::Paren:
            emit(n.children[0], use);
            out_.pushInt8(ptg::Paren);
            break;
        case FormulaNode::Call:
            call(n);
            break;
        }
    }

    void number(const std::wstring& text)
    {
        // One to five digits that fit 16 bits: ptgInt.
        if (text.size() <= 5 && text.find_first_not_of(L"0123456789") == std::wstring::npos) {
            const unsigned long v = std::stoul(text);
            if (v <= 0xFFFF) {
                out_.pushInt8(ptg::Int);
                out_.pushInt16(static_cast<uint16_t>(v));
                return;
            }
        }
        double value = 0;
        if (!parseNumber(text, value))
            throw qrerror("incorrect token in formula");
        out_.pushInt8(ptg::Num);
        out_.pushDouble(value);
    }

    void string(const std::wstring& text)
    {
        const std::u16string units = toUtf16(text);
        if (units.size() >= 256)
            throw qrerror("ShortXLUnicodeString: string is too long");
        out_.pushInt8(ptg::Str);
        out_.pushInt8(static_cast<uint8_t>(units.size()));
        out_.pushInt8(HighByte);
        for (char16_t u : units)
            out_.pushInt16(static_cast<uint16_t>(u));
    }

    // ptgArray with its values in rgcb (PtgExtraArray of SerAr items).
    void array(const FormulaNode& n)
    {
        const size_t cols = n.rows.front().size();
        if (cols == 0 || cols > 256 || n.rows.size() > 65536)
            throw qrerror("error in formula");
        out_.pushInt8(ptg::Array + ptg::ClassArray);
        for (int i = 0; i < 7; ++i)
            out_.pushInt8(0);
        extra_.pushInt8(static_cast<uint8_t>(cols - 1));
        extra_.pushInt16(static_cast<uint16_t>(n.rows.size() - 1));
        for (const auto& row : n.rows)
            for (const auto& e : row) {
                switch (e.kind) {
                case ArrayElement::Number:
                    extra_.pushInt8(0x01);
                    extra_.pushDouble(e.number);
                    break;
                case ArrayElement::String: {
                    const std::u16string units = toUtf16(e.text);
                    if (units.size() >= 256)  // Excel's limit for strings in array constants
                        throw qrerror("ShortXLUnicodeString: string is too long");
                    extra_.pushInt8(0x02);
                    extra_.pushInt16(static_cast<uint16_t>(units.size()));
                    extra_.pushInt8(HighByte);
                    for (char16_t u : units)
                        extra_.pushInt16(static_cast<uint16_t>(u));
                    break;
                }
                case ArrayElement::Bool:
                case ArrayElement::Error:
                    extra_.pushInt8(e.kind == ArrayElement::Bool ? 0x04 : 0x10);
                    extra_.pushInt8(e.code);
                    for (int i = 0; i < 7; ++i)
                        extra_.pushInt8(0);
                    break;
                }
            }
    }

    static uint16_t columnField(const CellRef& r)
    {
        uint16_t v = static_cast<uint16_t>(r.col);
        if (r.rowRelative)
            v |= ptg::RowRelative;
        if (r.colRelative)
            v |= ptg::ColRelative;
        return v;
    }

    uint16_t xti(const FormulaNode& n)
    {
        const int index = book_.externSheetIndex(n.firstSheet, n.lastSheet);
        if (index < 0 || index > 0xFFFF)
            throw qrerror("incorrect token in formula");
        return static_cast<uint16_t>(index);
    }

    void reference(const FormulaNode& n, Use use)
    {
        const uint8_t cls = use.value ? ptg::ClassValue : ptg::ClassRef;
        out_.pushInt8(static_cast<uint8_t>((n.has3d() ? ptg::Ref3d : ptg::Ref) + cls));
        if (n.has3d())
            out_.pushInt16(xti(n));
        out_.pushInt16(static_cast<uint16_t>(n.first.row));
        out_.pushInt16(columnField(n.first));
    }

    void area(const FormulaNode& n, Use use)
    {
        const uint8_t cls = use.arrays ? ptg::ClassArray : use.value ? ptg::ClassValue : ptg::ClassRef;
        out_.pushInt8(static_cast<uint8_t>((n.has3d() ? ptg::Area3d : ptg::Area) + cls));
        if (n.has3d())
            out_.pushInt16(xti(n));
        out_.pushInt16(static_cast<uint16_t>(n.first.row));
        out_.pushInt16(static_cast<uint16_t>(n.last.row));
        out_.pushInt16(columnField(n.first));
        out_.pushInt16(columnField(n.last));
    }

    void call(const FormulaNode& n)
    {
        const size_t argc = n.children.size();
        const FunctionInfo* f = n.function;
        if (!f) {
            // A function outside the table: its name, the arguments, USERDEFINED.
            out_.pushInt8(ptg::Name);
            out_.pushInt32(n.userName);
            emitArguments(n, Use{});
            out_.pushInt8(ptg::FuncVar + ptg::ClassValue);
            out_.pushInt8(static_cast<uint8_t>(argc + 1));
            out_.pushInt16(FunctionUserDefined);
            return;
        }
        emitArguments(n, Use{false, f->id == FunctionSumProduct});
        if (f->id == FunctionToday) {
            volatile_ = true;
            out_.pushInt8(ptg::Func + ptg::ClassValue);
            out_.pushInt16(f->id);
        } else if (f->id == FunctionSum && argc == 1) {
            const uint8_t attr[] = {ptg::Attr, ptg::AttrSum, 0, 0};
            out_.pushBytes(attr, sizeof attr);
        } else if (f->fixedArgs != 0) {
            out_.pushInt8(ptg::Func + ptg::ClassValue);
            out_.pushInt16(f->id);
        } else {
            const uint8_t cls = f->id == FunctionOffset ? ptg::ClassRef : ptg::ClassValue;
            out_.pushInt8(static_cast<uint8_t>(ptg::FuncVar + cls));
            out_.pushInt8(static_cast<uint8_t>(argc));
            out_.pushInt16(f->id);
        }
    }

    void emitArguments(const FormulaNode& n, Use use)
    {
        for (const auto& arg : n.children)
            emit(arg, use);
    }

    FormulaContext& book_;
    ByteStream out_;
    ByteStream extra_;
    bool volatile_ = false;
};

} // namespace

ParsedFormula MakeFormula(const std::wstring& text, FormulaContext& book, int sheet)
{
    const FormulaNode root = parseFormula(text, book, sheet);
    return Emitter(book).run(root);
}

bool isSingleError(const ParsedFormula& formula, uint8_t& code)
{
    if (formula.rgce.size() != 2 || formula.rgce[0] != ptg::Err)
        return false;
    code = formula.rgce[1];
    return true;
}

} // namespace quire::xls
