#pragma once

// Spelling of literals in formula text, shared by the compiler and printer:
// numbers, strings, error literals and sheet names.

#include <cstdint>
#include <string>

namespace quire::xls {

// The error literal ("#DIV/0!") of an ErrorType code; null for unknown codes.
const wchar_t* errorLiteral(uint8_t code);
// Length of the error literal at the start of text (ASCII case ignored),
// with its code; 0 when none starts there.
size_t matchErrorLiteral(const wchar_t* text, size_t length, uint8_t& code);

// Shortest text that reads back as the same double, without locale
// ("0.1", "1E+20"); non-finite values as "#NUM!".
std::wstring formatNumber(double value);
// Reads a number written as digits, '.', and an exponent, without locale.
bool parseNumber(const std::wstring& text, double& value);

// A string literal in double quotes with inner quotes doubled.
std::wstring quoteString(const std::wstring& text);

// The sheet part of a reference ("Sheet1", "'My Sheet'", "'S 1:S 3'"),
// quoted when the names need it.
std::wstring sheetPrefix(const std::wstring& firstSheet, const std::wstring& lastSheet);
bool sheetNameNeedsQuotes(const std::wstring& name);

// Characters of names and references in formula text.
bool isNameChar(wchar_t c);

} // namespace quire::xls
