#include "picture_type.h"

#include <cstring>

#include "enums.h"

namespace quire {
namespace {

bool startsWith(const unsigned char* data, size_t size, const char* signature, size_t length) {
    return size >= length && std::memcmp(data, signature, length) == 0;
}

}  // namespace

int detectPictureType(const unsigned char* data, size_t size) {
    if (!data) return PictureTypeError;
    if (startsWith(data, size, "\x89PNG\r\n\x1A\n", 8)) return PictureTypePNG;
    if (startsWith(data, size, "\xFF\xD8\xFF", 3)) return PictureTypeJPEG;
    if (startsWith(data, size, "GIF87a", 6) || startsWith(data, size, "GIF89a", 6))
        return PictureTypeGIF;
    if (startsWith(data, size, "BM", 2)) return PictureTypeDIB;
    if (startsWith(data, size, "\xD7\xCD\xC6\x9A", 4) || startsWith(data, size, "\x01\x00\x09\x00", 4) ||
        startsWith(data, size, "\x02\x00\x09\x00", 4))
        return PictureTypeWMF;
    if (size >= 44 && data[0] == 1 && data[1] == 0 && data[2] == 0 && data[3] == 0 &&
        std::memcmp(data + 40, " EMF", 4) == 0)
        return PictureTypeEMF;
    if (startsWith(data, size, "II*\0", 4) || startsWith(data, size, "MM\0*", 4))
        return PictureTypeTIFF;
    // PICT files carry a 512-byte header before the picture's own frame.
    if (size > 522 && data[522] == 0x00 && data[523] == 0x11 && data[524] == 0x02)
        return PictureTypePICT;
    return PictureTypeError;
}

}  // namespace quire
