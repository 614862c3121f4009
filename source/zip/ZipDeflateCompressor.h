// CZipDeflateCompressor: raw deflate (method 8) through zlib.
#pragma once

#include "ZipCompressor.h"

#include <zlib.h>

namespace quire::zip {

class CZipDeflateCompressor final : public CZipCompressor {
public:
    CZipDeflateCompressor() = default;
    ~CZipDeflateCompressor() override { end(); }

    void beginCompression(int level) override;
    Progress compress(const unsigned char* input, std::size_t inputSize,
                      unsigned char* output, std::size_t outputSize, bool lastInput) override;
    void beginDecompression() override;
    Progress decompress(const unsigned char* input, std::size_t inputSize,
                        unsigned char* output, std::size_t outputSize) override;
    int truncatedDataCode() const override;

private:
    enum class State { idle, compressing, decompressing };
    void end();
    void setBuffers(const unsigned char* input, std::size_t inputSize, unsigned char* output, std::size_t outputSize);
    Progress progressSince(std::size_t inputSize, std::size_t outputSize, bool finished) const;

    z_stream m_stream {};
    State m_state = State::idle;
};

} // namespace quire::zip
