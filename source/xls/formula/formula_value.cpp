#include "xls/formula/formula_value.h"

#include <cmath>
#include <cstring>

#include "api/qrerror.h"
#include "xls/little_endian.h"

namespace quire::xls {

namespace {

constexpr uint16_t NotANumber = 0xFFFF;  // fExprO: bytes 6-7 of a non-number result
constexpr uint8_t ErrorNum = 0x24;

} // namespace

FormulaValue FormulaValue::ofNumber(double v)
{
    FormulaValue f;
    f.kind = Number;
    f.number = v;
    return f;
}

FormulaValue FormulaValue::ofString()
{
    FormulaValue f;
    f.kind = String;
    return f;
}

FormulaValue FormulaValue::ofBoolean(bool v)
{
    FormulaValue f;
    f.kind = Boolean;
    f.boolean = v;
    return f;
}

FormulaValue FormulaValue::ofError(uint8_t code)
{
    FormulaValue f;
    f.kind = Error;
    f.error = code;
    return f;
}

FormulaValue FormulaValue::ofBlank()
{
    FormulaValue f;
    f.kind = Blank;
    return f;
}

FormulaValue readFormulaValue(const uint8_t* bytes)
{
    if (loadU16(bytes + 6) != NotANumber)
        return FormulaValue::ofNumber(loadDouble(bytes));
    switch (bytes[0]) {
    case 0:
        return FormulaValue::ofString();
    case 1:
        return FormulaValue::ofBoolean(bytes[2] != 0);
    case 2:
        return FormulaValue::ofError(bytes[2]);
    case 3:
        return FormulaValue::ofBlank();
    default:
        throw qrerror("FormulaBlock: file is corrupt");
    }
}

void writeFormulaValue(const FormulaValue& value, uint8_t* bytes)
{
    std::memset(bytes, 0, FormulaValueSize);
    if (value.kind == FormulaValue::Number && !std::isnan(value.number)) {
        storeU64(bytes, [&] {
            uint64_t bits;
            std::memcpy(&bits, &value.number, sizeof bits);
            return bits;
        }());
        return;
    }
    switch (value.kind) {
    case FormulaValue::Number:  // NaN
        bytes[0] = 2;
        bytes[2] = ErrorNum;
        break;
    case FormulaValue::String:
        bytes[0] = 0;
        break;
    case FormulaValue::Boolean:
        bytes[0] = 1;
        bytes[2] = value.boolean ? 1 : 0;
        break;
    case FormulaValue::Error:
        bytes[0] = 2;
        bytes[2] = value.error;
        break;
    case FormulaValue::Blank:
        bytes[0] = 3;
        break;
    }
    storeU16(bytes + 6, NotANumber);
}

} // namespace quire::xls
