#pragma once
#include <cstddef>
#include <string>

namespace quire {

// Sheet names: at most 31 UTF-16 units, unique without regard to the case of A to Z.
constexpr std::size_t kMaxSheetNameUnits = 31;

bool sameSheetName(const std::wstring& a, const std::wstring& b);
// The name cut to 31 units; `cut` tells whether it had to be.
std::wstring fitSheetName(const std::wstring& name, bool& cut);

}  // namespace quire
