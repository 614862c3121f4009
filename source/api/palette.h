#pragma once
#include <array>
#include <cstdint>

namespace quire {

// The 56 colours of the binary format's palette, indexes 8 to 63; red in the low byte.
constexpr int kPaletteFirstIndex = 8;
constexpr int kPaletteSize = 56;
const std::array<uint32_t, kPaletteSize>& defaultPalette();

inline uint32_t packRgbWord(int red, int green, int blue) {
    return static_cast<uint32_t>(red & 0xFF) | (static_cast<uint32_t>(green & 0xFF) << 8) |
           (static_cast<uint32_t>(blue & 0xFF) << 16);
}

// Open XML colours: red * 65536 + green * 256 + blue.
inline int packRgbValue(int red, int green, int blue) { return red * 65536 + green * 256 + blue; }

}  // namespace quire
