#pragma once
#include <cstddef>
#include <memory>
#include <string>
#include <string_view>

namespace lmx {

// A pattern facet: the whole value must match. The patterns of the Open XML
// schemas (GUIDs, hex numbers, cell references) use the part of the XML
// Schema syntax that ECMAScript shares.
class c_regex {
public:
    explicit c_regex(const std::string& pattern);

    bool is_valid() const { return expression_ != nullptr; }
    // Values longer than the limit never match: the library's matcher
    // recurses per character and would exhaust the stack on huge values.
    bool matches(std::string_view value) const;

    static constexpr std::size_t longest_value = 4096;

private:
    struct compiled_pattern;
    std::shared_ptr<const compiled_pattern> expression_;
};

}  // namespace lmx
