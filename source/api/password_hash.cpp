#include "password_hash.h"

#include <cwchar>

namespace quire {
namespace {

uint16_t rotateLeft15(uint16_t value) {
    return static_cast<uint16_t>(((value << 1) & 0x7FFF) | ((value >> 14) & 1));
}

}  // namespace

uint16_t passwordVerifier(const wchar_t* password) {
    if (!password || !*password) return 0;
    size_t length = std::wcslen(password);
    uint16_t verifier = 0;
    for (size_t i = length; i-- > 0;) {
        verifier = rotateLeft15(verifier);
        verifier ^= static_cast<uint16_t>(password[i] & 0xFFFF);
    }
    verifier = rotateLeft15(verifier);
    verifier ^= static_cast<uint16_t>(length);
    verifier ^= 0xCE4B;
    return verifier;
}

}  // namespace quire
