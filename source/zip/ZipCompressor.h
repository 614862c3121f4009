// CZipCompressor: a streaming codec for one entry's data. The archive feeds it
// input in transfer-buffer chunks and drains its output; each call reports
// how much was consumed and produced and whether the stream has ended.
#pragma once

#include <cstddef>
#include <memory>

namespace quire::zip {

class CZipCompressor {
public:
    struct Progress {
        std::size_t consumed = 0;
        std::size_t produced = 0;
        bool finished = false;
    };

    virtual ~CZipCompressor() = default;

    // level: -1 for the codec's default, 0 to 9 otherwise.
    virtual void beginCompression(int level) = 0;
    // With lastInput, the stream is finished once all input is consumed and
    // the call reports finished.
    virtual Progress compress(const unsigned char* input, std::size_t inputSize,
                              unsigned char* output, std::size_t outputSize, bool lastInput) = 0;

    virtual void beginDecompression() = 0;
    virtual Progress decompress(const unsigned char* input, std::size_t inputSize,
                                unsigned char* output, std::size_t outputSize) = 0;
    // The error code for compressed data that ends before its stream does.
    virtual int truncatedDataCode() const = 0;

    // The codec for a compression method (8 deflate, 12 bzip2), or null when
    // the method has no codec here.
    static std::unique_ptr<CZipCompressor> forMethod(int method);

protected:
    CZipCompressor() = default;
    CZipCompressor(const CZipCompressor&) = delete;
    CZipCompressor& operator=(const CZipCompressor&) = delete;
};

} // namespace quire::zip
