#pragma once
#include <cstdint>

namespace quire {

// The 16-bit verifier of the legacy sheet-protection password hash; 0 for no password.
uint16_t passwordVerifier(const wchar_t* password);

}  // namespace quire
