#include "ZipCompressor.h"

#include "ZipBzip2Compressor.h"
#include "ZipDeflateCompressor.h"
#include "ZipFileHeader.h"

namespace quire::zip {

std::unique_ptr<CZipCompressor> CZipCompressor::forMethod(int method)
{
    switch (method) {
    case CZipFileHeader::deflated: return std::make_unique<CZipDeflateCompressor>();
    case CZipFileHeader::bzip2: return std::make_unique<CZipBzip2Compressor>();
    default: return nullptr;
    }
}

} // namespace quire::zip
