#pragma once
#include <charconv>
#include <limits>
#include <string>
#include <string_view>
#include <type_traits>

#include "lmx/error.h"

namespace lmx {

// Text of XML Schema simple types to values and back. Reading ignores
// surrounding XML white space, as the schema types collapse it; conversions
// never depend on the process locale.

// "true"/"1" and "false"/"0".
elmx_error read_boolean(std::string_view text, bool& value);
std::string write_boolean(bool value);

// "NaN", "INF", "-INF" or a decimal with optional exponent.
elmx_error read_double(std::string_view text, double& value);
// NaN, INF, -INF, 0.0, -0.0, else 14 significant digits.
std::string write_double(double value);

std::string_view trim_xml_space(std::string_view text);

// Decimal integers with optional sign, range-tested against T.
template <class T>
elmx_error read_integer(std::string_view text, T& value)
{
    static_assert(std::is_integral_v<T> && !std::is_same_v<T, bool>, "integer types only");
    text = trim_xml_space(text);
    const bool negative = !text.empty() && text.front() == '-';
    if (!text.empty() && text.front() == '+') {
        text.remove_prefix(1);
        if (!text.empty() && (text.front() == '-' || text.front() == '+'))
            return ELMX_VALUE_BAD_FORMAT;
    }
    if (text.empty())
        return ELMX_VALUE_BAD_FORMAT;
    if (std::is_unsigned_v<T> && negative) {
        // "-0" is zero; anything below is out of range.
        std::string_view digits = text.substr(1);
        if (digits.empty() || digits.find_first_not_of('0') == std::string_view::npos) {
            if (digits.empty())
                return ELMX_VALUE_BAD_FORMAT;
            value = 0;
            return ELMX_OK;
        }
        if (digits.find_first_not_of("0123456789") != std::string_view::npos)
            return ELMX_VALUE_BAD_FORMAT;
        return ELMX_VALUE_EXCEEDS_MIN;
    }
    T result{};
    const auto [end, status] = std::from_chars(text.data(), text.data() + text.size(), result);
    if (status == std::errc::result_out_of_range) {
        // from_chars stops at the end of the digits even when out of range.
        if (end != text.data() + text.size())
            return ELMX_VALUE_BAD_FORMAT;
        return negative ? ELMX_VALUE_EXCEEDS_MIN : ELMX_VALUE_EXCEEDS_MAX;
    }
    if (status != std::errc() || end != text.data() + text.size())
        return ELMX_VALUE_BAD_FORMAT;
    value = result;
    return ELMX_OK;
}

template <class T>
std::string write_integer(T value)
{
    static_assert(std::is_integral_v<T> && !std::is_same_v<T, bool>, "integer types only");
    char buffer[32];
    const auto result = std::to_chars(buffer, buffer + sizeof buffer, value);
    return std::string(buffer, result.ptr);
}

}  // namespace lmx
