// CZipBzip2Compressor: bzip2 (method 12) decompression through libbz2. The
// archives we write never use bzip2, so compression is not offered.
#pragma once

#include "ZipCompressor.h"

#include <bzlib.h>

namespace quire::zip {

class CZipBzip2Compressor final : public CZipCompressor {
public:
    CZipBzip2Compressor() = default;
    ~CZipBzip2Compressor() override { end(); }

    void beginCompression(int level) override;
    Progress compress(const unsigned char* input, std::size_t inputSize,
                      unsigned char* output, std::size_t outputSize, bool lastInput) override;
    void beginDecompression() override;
    Progress decompress(const unsigned char* input, std::size_t inputSize,
                        unsigned char* output, std::size_t outputSize) override;
    int truncatedDataCode() const override;

private:
    void end();

    bz_stream m_stream {};
    bool m_active = false;
};

} // namespace quire::zip
