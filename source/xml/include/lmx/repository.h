#pragma once
#include <string>
#include <string_view>
#include <unordered_set>

namespace lmx {

// Interns names (namespace URIs above all): each distinct text is stored once
// and the returned view stays valid for the repository's life, so views of
// the same text can be compared by address.
class c_repository {
public:
    std::string_view intern(std::string_view text);
    std::size_t size() const { return names_.size(); }

private:
    std::unordered_set<std::string> names_;
};

}  // namespace lmx
