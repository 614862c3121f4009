#include "ZipBzip2Compressor.h"

#include "ZipException.h"

#include <algorithm>
#include <climits>

namespace quire::zip {

namespace {

unsigned int clampToUInt(std::size_t size)
{
    return static_cast<unsigned int>(std::min<std::size_t>(size, UINT_MAX));
}

} // namespace

void CZipBzip2Compressor::end()
{
    if (m_active)
        BZ2_bzDecompressEnd(&m_stream);
    m_active = false;
}

void CZipBzip2Compressor::beginCompression(int)
{
    throw CZipException(CZipException::bzConfigError);
}

CZipCompressor::Progress CZipBzip2Compressor::compress(const unsigned char*, std::size_t, unsigned char*,
                                                       std::size_t, bool)
{
    throw CZipException(CZipException::bzConfigError);
}

void CZipBzip2Compressor::beginDecompression()
{
    end();
    m_stream = bz_stream {};
    const int result = BZ2_bzDecompressInit(&m_stream, 0, 0);
    if (result != BZ_OK)
        throw CZipException(CZipException::fromBzip2(result));
    m_active = true;
}

CZipCompressor::Progress CZipBzip2Compressor::decompress(const unsigned char* input, std::size_t inputSize,
                                                         unsigned char* output, std::size_t outputSize)
{
    if (!m_active)
        throw CZipException(CZipException::bzSequenceError);
    const unsigned int inputCount = clampToUInt(inputSize);
    const unsigned int outputCount = clampToUInt(outputSize);
    m_stream.next_in = const_cast<char*>(reinterpret_cast<const char*>(input));
    m_stream.avail_in = inputCount;
    m_stream.next_out = reinterpret_cast<char*>(output);
    m_stream.avail_out = outputCount;
    const int result = BZ2_bzDecompress(&m_stream);
    if (result != BZ_OK && result != BZ_STREAM_END) {
        end();
        throw CZipException(CZipException::fromBzip2(result));
    }
    Progress progress;
    progress.consumed = inputCount - m_stream.avail_in;
    progress.produced = outputCount - m_stream.avail_out;
    progress.finished = result == BZ_STREAM_END;
    if (progress.finished)
        end();
    return progress;
}

int CZipBzip2Compressor::truncatedDataCode() const
{
    return CZipException::bzUnexpectedEof;
}

} // namespace quire::zip
