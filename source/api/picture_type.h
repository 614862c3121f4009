#pragma once
#include <cstddef>

namespace quire {

// The PictureType of image bytes, recognised by their signature; PictureTypeError when unknown.
int detectPictureType(const unsigned char* data, size_t size);

}  // namespace quire
