#include "lmx/value_conversion.h"

#include <cmath>

namespace lmx {

namespace {

bool is_digit(char c) { return c >= '0' && c <= '9'; }

// Optional sign, digits with an optional point and fraction (at least one
// digit in all), optional exponent.
bool is_decimal_syntax(std::string_view text)
{
    std::size_t i = 0;
    const std::size_t n = text.size();
    if (i < n && (text[i] == '+' || text[i] == '-'))
        ++i;
    std::size_t digits = 0;
    while (i < n && is_digit(text[i]))
        ++i, ++digits;
    if (i < n && text[i] == '.') {
        ++i;
        while (i < n && is_digit(text[i]))
            ++i, ++digits;
    }
    if (digits == 0)
        return false;
    if (i < n && (text[i] == 'e' || text[i] == 'E')) {
        ++i;
        if (i < n && (text[i] == '+' || text[i] == '-'))
            ++i;
        std::size_t exponent_digits = 0;
        while (i < n && is_digit(text[i]))
            ++i, ++exponent_digits;
        if (exponent_digits == 0)
            return false;
    }
    return i == n;
}

// Whether an out-of-range decimal was too large (else too small).
bool overflows(std::string_view text)
{
    const std::size_t exponent = text.find_first_of("eE");
    if (exponent != std::string_view::npos)
        return exponent + 1 < text.size() && text[exponent + 1] != '-';
    const std::string_view whole = text.substr(0, text.find('.'));
    return whole.find_first_of("123456789") != std::string_view::npos;
}

}  // namespace

std::string_view trim_xml_space(std::string_view text)
{
    constexpr std::string_view space = " \t\n\r";
    const std::size_t first = text.find_first_not_of(space);
    if (first == std::string_view::npos)
        return {};
    return text.substr(first, text.find_last_not_of(space) - first + 1);
}

elmx_error read_boolean(std::string_view text, bool& value)
{
    text = trim_xml_space(text);
    if (text == "true" || text == "1") {
        value = true;
        return ELMX_OK;
    }
    if (text == "false" || text == "0") {
        value = false;
        return ELMX_OK;
    }
    return ELMX_VALUE_BAD_FORMAT;
}

std::string write_boolean(bool value)
{
    return value ? "true" : "false";
}

elmx_error read_double(std::string_view text, double& value)
{
    text = trim_xml_space(text);
    if (text == "NaN") {
        value = std::numeric_limits<double>::quiet_NaN();
        return ELMX_OK;
    }
    if (text == "INF") {
        value = std::numeric_limits<double>::infinity();
        return ELMX_OK;
    }
    if (text == "-INF") {
        value = -std::numeric_limits<double>::infinity();
        return ELMX_OK;
    }
    if (!is_decimal_syntax(text))
        return ELMX_VALUE_BAD_FORMAT;
    const bool negative = text.front() == '-';
    std::string_view number = text;
    if (number.front() == '+')
        number.remove_prefix(1);
    double result = 0;
    const auto [end, status] = std::from_chars(number.data(), number.data() + number.size(), result);
    if (status == std::errc::result_out_of_range) {
        const double magnitude = overflows(number) ? std::numeric_limits<double>::infinity() : 0.0;
        value = negative ? -magnitude : magnitude;
        return ELMX_OK;
    }
    if (status != std::errc() || end != number.data() + number.size())
        return ELMX_VALUE_BAD_FORMAT;
    value = result;
    return ELMX_OK;
}

std::string write_double(double value)
{
    if (std::isnan(value))
        return "NaN";
    if (std::isinf(value))
        return value < 0 ? "-INF" : "INF";
    if (value == 0)
        return std::signbit(value) ? "-0.0" : "0.0";
    char buffer[40];
    constexpr int significant_digits = 14;
    const auto result =
        std::to_chars(buffer, buffer + sizeof buffer, value, std::chars_format::general, significant_digits);
    return std::string(buffer, result.ptr);
}

}  // namespace lmx
