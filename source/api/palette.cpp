#include "palette.h"

namespace quire {
namespace {

constexpr uint32_t fromHex(uint32_t rgb) {
    // Table entries are written RRGGBB; the stored word keeps red in the low byte.
    return ((rgb >> 16) & 0xFF) | (rgb & 0xFF00) | ((rgb & 0xFF) << 16);
}

}  // namespace

const std::array<uint32_t, kPaletteSize>& defaultPalette() {
    static const std::array<uint32_t, kPaletteSize> palette = {
        fromHex(0x000000), fromHex(0xFFFFFF), fromHex(0xFF0000), fromHex(0x00FF00),
        fromHex(0x0000FF), fromHex(0xFFFF00), fromHex(0xFF00FF), fromHex(0x00FFFF),
        fromHex(0x800000), fromHex(0x008000), fromHex(0x000080), fromHex(0x808000),
        fromHex(0x800080), fromHex(0x008080), fromHex(0xC0C0C0), fromHex(0x808080),
        fromHex(0x9999FF), fromHex(0x993366), fromHex(0xFFFFCC), fromHex(0xCCFFFF),
        fromHex(0x660066), fromHex(0xFF8080), fromHex(0x0066CC), fromHex(0xCCCCFF),
        fromHex(0x000080), fromHex(0xFF00FF), fromHex(0xFFFF00), fromHex(0x00FFFF),
        fromHex(0x800080), fromHex(0x800000), fromHex(0x008080), fromHex(0x0000FF),
        fromHex(0x00CCFF), fromHex(0xCCFFFF), fromHex(0xCCFFCC), fromHex(0xFFFF99),
        fromHex(0x99CCFF), fromHex(0xFF99CC), fromHex(0xCC99FF), fromHex(0xFFCC99),
        fromHex(0x3366FF), fromHex(0x33CCCC), fromHex(0x99CC00), fromHex(0xFFCC00),
        fromHex(0xFF9900), fromHex(0xFF6600), fromHex(0x666699), fromHex(0x969696),
        fromHex(0x003366), fromHex(0x339966), fromHex(0x003300), fromHex(0x333300),
        fromHex(0x993300), fromHex(0x993366), fromHex(0x333399), fromHex(0x333333),
    };
    return palette;
}

}  // namespace quire
