#pragma once

// The built-in function table shared by the formula compiler and printer
// (and by the Open XML engine for function names): the MS-XLS function ids
// with their names, fixed argument counts and reference-parameter masks.

#include <cstddef>
#include <cstdint>
#include <string>

namespace quire::xls {

struct FunctionInfo {
    uint16_t id;
    const wchar_t* name;   // upper case, as written in formula text
    uint8_t fixedArgs;     // 1-4 for fixed-arity functions, 0 for variable arity or none
    uint32_t refMask;      // bit n: argument n is passed with reference class
};

constexpr uint16_t FunctionUserDefined = 255;  // calls of add-in and user functions
constexpr uint16_t FunctionSum = 4;
constexpr uint16_t FunctionOffset = 78;
constexpr uint16_t FunctionToday = 221;
constexpr uint16_t FunctionSumProduct = 228;
constexpr uint32_t AllArgumentsReference = 0x3FFFFFFF;

// The entry for a name, compared without regard to ASCII case; null when none.
const FunctionInfo* findFunction(const std::wstring& name);
// The entry for a function id; null when none.
const FunctionInfo* functionById(unsigned id);
// The name for a function id; empty when none.
std::wstring functionName(unsigned id);
// The entries in id order (functionCount() of them).
const FunctionInfo* functionTable();
size_t functionCount();

} // namespace quire::xls
