#pragma once
// The host's own text conversions between its encodings.
#include <cstdint>
#include <string>
#include <vector>

namespace testhost {

// Code points of `bytes` in `encoding`; false when the bytes are not valid in it.
bool decodeText(const std::string& bytes, uint32_t encoding, std::vector<char32_t>& codePoints);
// `codePoints` in `encoding`; characters it cannot hold become '?'.
std::string encodeText(const std::vector<char32_t>& codePoints, uint32_t encoding);

}  // namespace testhost
