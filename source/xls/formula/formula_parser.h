#pragma once

// Formula text to an expression tree: precedence, unary operators, calls and
// their argument counts, and the meaning of every word (reference, range,
// 3-D reference, defined name) resolved through the book.

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "xls/formula/cell_reference.h"
#include "xls/formula/formula_lexer.h"

namespace quire::xls {

class FormulaContext;
struct FunctionInfo;

struct FormulaNode {
    enum Kind {
        Number,     // text: as written (ptgInt or ptgNum)
        String,     // text
        Bool,       // code 0/1
        Error,      // code
        Missing,    // an empty argument
        Array,      // rows
        Ref,        // first
        Area,       // first, last
        Name,       // nameIndex
        Unary,      // op (ptgUminus, ptgUplus, ptgPercent), children[0]
        Binary,     // op, children[0..1]
        Paren,      // children[0]
        Call        // function (or userName for functions outside the table), children = arguments
    };
    Kind kind = Number;
    std::wstring text;
    uint8_t code = 0;
    uint8_t op = 0;
    CellRef first, last;
    int firstSheet = -1;   // Ref/Area with a sheet part: sheets of this book
    int lastSheet = -1;
    unsigned nameIndex = 0;
    const FunctionInfo* function = nullptr;
    unsigned userName = 0;  // Call of a function outside the table: its name index
    std::vector<std::vector<ArrayElement>> rows;
    std::vector<FormulaNode> children;

    bool has3d() const { return firstSheet >= 0; }
};

// Parses the text of a formula on sheet 'sheet' (-1: none). Failures are
// qrerror with the compiler's messages.
FormulaNode parseFormula(const std::wstring& text, FormulaContext& book, int sheet);

} // namespace quire::xls
