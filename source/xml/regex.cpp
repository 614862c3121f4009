#include "lmx/regex.h"

// GCC 12 reports a false "may be used uninitialized" inside its own <regex>
// when sanitizers are on; the warning is about the library's code.
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wmaybe-uninitialized"
#include <regex>

namespace lmx {

struct c_regex::compiled_pattern {
    std::regex expression;
};

c_regex::c_regex(const std::string& pattern)
{
    try {
        expression_ = std::make_shared<const compiled_pattern>(compiled_pattern{std::regex(pattern, std::regex::ECMAScript)});
    } catch (const std::regex_error&) {
        expression_.reset();
    }
}

bool c_regex::matches(std::string_view value) const
{
    if (!expression_ || value.size() > longest_value)
        return false;
    return std::regex_match(value.begin(), value.end(), expression_->expression);
}

}  // namespace lmx

#pragma GCC diagnostic pop
