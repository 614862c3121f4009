#include "ZipDeflateCompressor.h"

#include "ZipException.h"

#include <algorithm>
#include <climits>

namespace quire::zip {

namespace {

// zlib counts in uInt; chunks are clamped so that no count can wrap.
uInt clampToUInt(std::size_t size)
{
    return static_cast<uInt>(std::min<std::size_t>(size, UINT_MAX));
}

} // namespace

void CZipDeflateCompressor::end()
{
    if (m_state == State::compressing)
        deflateEnd(&m_stream);
    else if (m_state == State::decompressing)
        inflateEnd(&m_stream);
    m_state = State::idle;
}

void CZipDeflateCompressor::beginCompression(int level)
{
    end();
    m_stream = z_stream {};
    if (level < Z_DEFAULT_COMPRESSION || level > Z_BEST_COMPRESSION)
        level = Z_DEFAULT_COMPRESSION;
    // Negative window bits: raw deflate data, as ZIP stores it.
    const int result = deflateInit2(&m_stream, level, Z_DEFLATED, -MAX_WBITS, 8, Z_DEFAULT_STRATEGY);
    if (result != Z_OK)
        throw CZipException(CZipException::fromZlib(result));
    m_state = State::compressing;
}

void CZipDeflateCompressor::beginDecompression()
{
    end();
    m_stream = z_stream {};
    const int result = inflateInit2(&m_stream, -MAX_WBITS);
    if (result != Z_OK)
        throw CZipException(CZipException::fromZlib(result));
    m_state = State::decompressing;
}

void CZipDeflateCompressor::setBuffers(const unsigned char* input, std::size_t inputSize,
                                       unsigned char* output, std::size_t outputSize)
{
    m_stream.next_in = const_cast<Bytef*>(input);
    m_stream.avail_in = clampToUInt(inputSize);
    m_stream.next_out = output;
    m_stream.avail_out = clampToUInt(outputSize);
}

CZipCompressor::Progress CZipDeflateCompressor::progressSince(std::size_t inputSize, std::size_t outputSize,
                                                              bool finished) const
{
    Progress progress;
    progress.consumed = clampToUInt(inputSize) - m_stream.avail_in;
    progress.produced = clampToUInt(outputSize) - m_stream.avail_out;
    progress.finished = finished;
    return progress;
}

CZipCompressor::Progress CZipDeflateCompressor::compress(const unsigned char* input, std::size_t inputSize,
                                                         unsigned char* output, std::size_t outputSize,
                                                         bool lastInput)
{
    if (m_state != State::compressing)
        throw CZipException(CZipException::zlibStreamError);
    setBuffers(input, inputSize, output, outputSize);
    // Finishing is only allowed once all the remaining input fits in this call.
    const bool finishing = lastInput && inputSize <= UINT_MAX;
    const int result = deflate(&m_stream, finishing ? Z_FINISH : Z_NO_FLUSH);
    if (result != Z_OK && result != Z_STREAM_END && result != Z_BUF_ERROR) {
        end();
        throw CZipException(CZipException::fromZlib(result));
    }
    const bool finished = result == Z_STREAM_END;
    const Progress progress = progressSince(inputSize, outputSize, finished);
    if (finished)
        end();
    return progress;
}

CZipCompressor::Progress CZipDeflateCompressor::decompress(const unsigned char* input, std::size_t inputSize,
                                                           unsigned char* output, std::size_t outputSize)
{
    if (m_state != State::decompressing)
        throw CZipException(CZipException::zlibStreamError);
    setBuffers(input, inputSize, output, outputSize);
    int result = inflate(&m_stream, Z_NO_FLUSH);
    if (result == Z_NEED_DICT)
        result = Z_DATA_ERROR;   // ZIP entries never use a preset dictionary
    if (result != Z_OK && result != Z_STREAM_END && result != Z_BUF_ERROR) {
        end();
        throw CZipException(CZipException::fromZlib(result));
    }
    const bool finished = result == Z_STREAM_END;
    const Progress progress = progressSince(inputSize, outputSize, finished);
    if (finished)
        end();
    return progress;
}

int CZipDeflateCompressor::truncatedDataCode() const
{
    return CZipException::zlibDataError;
}

} // namespace quire::zip
