#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "xls/formula/formula_compiler.h"
#include "xls/formula/formula_printer.h"

namespace quire::xls::test {

inline std::string hex(const std::vector<uint8_t>& bytes)
{
    static const char digits[] = "0123456789abcdef";
    std::string out;
    for (uint8_t b : bytes) {
        out += digits[b >> 4];
        out += digits[b & 15];
    }
    return out;
}

inline std::vector<uint8_t> unhex(const std::string& text)
{
    std::vector<uint8_t> out;
    for (size_t i = 0; i + 1 < text.size(); i += 2)
        out.push_back(static_cast<uint8_t>(std::stoi(text.substr(i, 2), nullptr, 16)));
    return out;
}

// The message of the qrerror that 'f' throws; empty when it throws none.
template <class F>
std::string failure(F&& f)
{
    try {
        f();
    } catch (const std::exception& e) {
        return e.what();
    }
    return {};
}

} // namespace quire::xls::test
