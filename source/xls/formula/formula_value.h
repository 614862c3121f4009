#pragma once

// The cached result of a formula cell (MS-XLS FormulaValue, 8 bytes): a
// number as its IEEE double, or a string, boolean, error or blank marked by
// 0xFFFF in the last two bytes.

#include <cstddef>
#include <cstdint>

namespace quire::xls {

struct FormulaValue {
    enum Kind { Number, String, Boolean, Error, Blank };
    Kind kind = Number;
    double number = 0;
    bool boolean = false;
    uint8_t error = 0;   // ErrorType code

    static FormulaValue ofNumber(double v);
    static FormulaValue ofString();        // the text follows in a String record
    static FormulaValue ofBoolean(bool v);
    static FormulaValue ofError(uint8_t code);
    static FormulaValue ofBlank();         // an empty string result
};

constexpr size_t FormulaValueSize = 8;

// Reads 8 bytes; an unknown result kind fails with "FormulaBlock: file is corrupt".
FormulaValue readFormulaValue(const uint8_t* bytes);
// Writes 8 bytes. A NaN number, which the format cannot hold as a number,
// is written as the error #NUM!.
void writeFormulaValue(const FormulaValue& value, uint8_t* bytes);

} // namespace quire::xls
