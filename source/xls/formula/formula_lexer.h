#pragma once

// Splits formula text into tokens: literals, words (references and names,
// with their sheet part), function names, operators, brackets and argument
// separators.

#include <cstdint>
#include <string>
#include <vector>

namespace quire::xls {

// One element of an array constant {1,"a";TRUE,#N/A}.
struct ArrayElement {
    enum Kind { Number, String, Bool, Error } kind = Number;
    double number = 0;
    std::wstring text;
    uint8_t code = 0;   // Bool: 0 or 1; Error: ErrorType code
};

struct FormulaToken {
    enum Kind {
        Number,     // text: the digits as written
        String,     // text: the value without quotes
        Error,      // code
        Word,       // text: reference or name; sheet: the sheet part, if any
        Function,   // text: the name; the next token is "("
        Operator,   // text: + - * / ^ & = <> < > <= >= % :
        Separator,  // text: "," or ";"
        Open,
        Close,
        Array,      // rows of elements
        End
    };
    Kind kind = End;
    std::wstring text;
    bool hasSheet = false;
    std::wstring sheet;     // unquoted, "First" or "First:Last"
    uint8_t code = 0;
    bool spaceBefore = false;
    std::vector<std::vector<ArrayElement>> rows;
};

// Fails with "incorrect token in formula" for characters that start no
// token and "error in formula" for an unterminated string or array.
std::vector<FormulaToken> splitFormula(const std::wstring& text);

} // namespace quire::xls
