#include "lmx/repository.h"

namespace lmx {

std::string_view c_repository::intern(std::string_view text)
{
    // Node-based set: element addresses never move after insertion.
    const auto inserted = names_.emplace(text);
    return *inserted.first;
}

}  // namespace lmx
