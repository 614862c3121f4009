#include "ZipArchive.h"

#include "ZipBytes.h"
#include "ZipCompressor.h"
#include "ZipFile.h"

#include <algorithm>
#include <cerrno>
#include <ctime>
#include <filesystem>
#include <vector>
#include <zlib.h>

namespace quire::zip {

namespace {

// Entries at least this close to 4 GiB get Zip64 local sizes up front, since
// deflate may grow incompressible data slightly past the 32-bit limit.
constexpr std::uint64_t zip64Margin = 0x1000000;

std::uint32_t updateCrc(std::uint32_t crc, const unsigned char* data, std::size_t size)
{
    while (size > 0) {
        const auto chunk = static_cast<uInt>(std::min<std::size_t>(size, 0x40000000));
        crc = static_cast<std::uint32_t>(crc32(crc, data, chunk));
        data += chunk;
        size -= chunk;
    }
    return crc;
}

void checkDeclaredSizes(const CZipFileHeader& header)
{
    if (header.method == CZipFileHeader::winZipAes)
        throw CZipException(CZipException::aesNotEnabled);
    if (header.isEncrypted() || (header.flags() & CZipFileHeader::strongEncryption))
        throw CZipException(CZipException::badPassword);
    switch (header.method) {
    case CZipFileHeader::stored:
        if (header.compressedSize != header.uncompressedSize)
            throw CZipException(CZipException::badZipFile);
        break;
    case CZipFileHeader::deflated:
        if (header.compressedSize <= (UINT64_MAX - deflateRatioAllowance) / maxDeflateRatio &&
            header.uncompressedSize > header.compressedSize * maxDeflateRatio + deflateRatioAllowance)
            throw CZipException(CZipException::tooBigSize);
        break;
    case CZipFileHeader::bzip2:
        break;
    default:
        // Methods without a codec here (deflate64, LZMA, ...) cannot be read.
        throw CZipException(CZipException::badZipFile);
    }
}

} // namespace

CZipArchive::~CZipArchive()
{
    abandon();
}

void CZipArchive::requireMode(OpenMode wanted) const
{
    if (!m_storage || m_mode != wanted)
        throw CZipException(CZipException::internalError);
}

void CZipArchive::open(const std::string& path, OpenMode mode)
{
    auto file = std::make_unique<CZipFile>(path, mode == create ? CZipFile::Mode::create : CZipFile::Mode::readOnly);
    open(*file, mode);
    m_ownedStorage = std::move(file);
}

void CZipArchive::open(CZipAbstractFile& storage, OpenMode mode)
{
    abandon();
    if (mode != openReadOnly && mode != create)
        throw CZipException(EINVAL);
    if (mode == create) {
        storage.setLength(0);
        storage.seek(0);
    } else {
        m_centralDir.read(storage);
    }
    m_storage = &storage;
    m_mode = mode;
}

void CZipArchive::close()
{
    if (!m_storage)
        return;
    try {
        if (m_mode == create) {
            m_storage->seekToEnd();
            m_centralDir.write(*m_storage);
            m_storage->flush();
        }
        if (m_ownedStorage)
            m_ownedStorage->close();
    } catch (...) {
        abandon();
        throw;
    }
    m_ownedStorage.reset();
    m_storage = nullptr;
    m_centralDir.clear();
}

void CZipArchive::abandon() noexcept
{
    if (m_ownedStorage) {
        try {
            m_ownedStorage->close();
        } catch (...) {
            // Nothing more can be done for a storage being dropped.
        }
    }
    m_ownedStorage.reset();
    m_storage = nullptr;
    m_centralDir.clear();
}

std::size_t CZipArchive::findFile(const std::wstring& name, bool caseSensitive) const
{
    return m_centralDir.find(name, caseSensitive);
}

std::uint64_t CZipArchive::seekToEntryData(const CZipFileHeader& header)
{
    const std::uint64_t length = m_storage->length();
    const std::uint64_t start = m_centralDir.bytesBeforeZip() + header.localHeaderOffset;
    if (start > length || length - start < CZipFileHeader::localFixedSize)
        throw CZipException(CZipException::badZipFile, m_storage->filePath());
    unsigned char local[CZipFileHeader::localFixedSize];
    m_storage->seek(start);
    m_storage->readExactly(local, sizeof local, CZipException::badZipFile);
    ZipFieldReader fields(local, sizeof local);
    if (fields.u32() != CZipFileHeader::localSignature)
        throw CZipException(CZipException::badZipFile, m_storage->filePath());
    fields.skip(22);
    const std::uint16_t nameLength = fields.u16();
    const std::uint16_t extraLength = fields.u16();
    const std::uint64_t dataStart = start + CZipFileHeader::localFixedSize + nameLength + extraLength;
    if (dataStart > length || length - dataStart < header.compressedSize)
        throw CZipException(CZipException::badZipFile, m_storage->filePath());
    m_storage->seek(dataStart);
    return dataStart;
}

void CZipArchive::extractFile(std::size_t index, CZipAbstractFile& destination, std::size_t bufferSize)
{
    requireMode(openReadOnly);
    const CZipFileHeader& header = m_centralDir.at(index);
    checkDeclaredSizes(header);
    if (bufferSize == 0)
        bufferSize = defaultTransferBufferSize;
    seekToEntryData(header);
    if (header.method == CZipFileHeader::stored)
        copyStored(header, destination, bufferSize);
    else
        decompressEntry(header, destination, bufferSize);
}

void CZipArchive::extractFile(std::size_t index, const std::string& path, std::size_t bufferSize)
{
    requireMode(openReadOnly);
    checkDeclaredSizes(m_centralDir.at(index));
    CZipFile file(path, CZipFile::Mode::create);
    try {
        extractFile(index, file, bufferSize);
        file.close();
    } catch (...) {
        // Only a file that we created is removed: a partial entry is no entry.
        file.abandon();
        std::error_code ignored;
        std::filesystem::remove(path, ignored);
        throw;
    }
}

void CZipArchive::copyStored(const CZipFileHeader& header, CZipAbstractFile& destination, std::size_t bufferSize)
{
    std::vector<unsigned char> buffer(bufferSize);
    std::uint32_t crc = 0;
    std::uint64_t remaining = header.compressedSize;
    while (remaining > 0) {
        const auto chunk = static_cast<std::size_t>(std::min<std::uint64_t>(remaining, bufferSize));
        m_storage->readExactly(buffer.data(), chunk, CZipException::badZipFile);
        crc = updateCrc(crc, buffer.data(), chunk);
        destination.write(buffer.data(), chunk);
        remaining -= chunk;
    }
    if (crc != header.crc32)
        throw CZipException(CZipException::badCrc, m_storage->filePath());
}

void CZipArchive::decompressEntry(const CZipFileHeader& header, CZipAbstractFile& destination,
                                  std::size_t bufferSize)
{
    std::unique_ptr<CZipCompressor> codec = CZipCompressor::forMethod(header.method);
    if (!codec)
        throw CZipException(CZipException::badZipFile);
    codec->beginDecompression();

    std::vector<unsigned char> input(bufferSize);
    std::vector<unsigned char> output(bufferSize);
    std::uint64_t unread = header.compressedSize;
    std::size_t inputStart = 0;
    std::size_t inputEnd = 0;
    std::uint64_t written = 0;
    std::uint32_t crc = 0;
    for (;;) {
        if (inputStart == inputEnd && unread > 0) {
            const auto chunk = static_cast<std::size_t>(std::min<std::uint64_t>(unread, bufferSize));
            m_storage->readExactly(input.data(), chunk, CZipException::badZipFile);
            unread -= chunk;
            inputStart = 0;
            inputEnd = chunk;
        }
        const CZipCompressor::Progress step =
            codec->decompress(input.data() + inputStart, inputEnd - inputStart, output.data(), bufferSize);
        inputStart += step.consumed;
        if (step.produced > 0) {
            // The header's size is a hard ceiling: data that inflates beyond
            // it is damaged or hostile, and is not written anywhere.
            if (step.produced > header.uncompressedSize - written)
                throw CZipException(CZipException::badZipFile, m_storage->filePath());
            crc = updateCrc(crc, output.data(), step.produced);
            destination.write(output.data(), step.produced);
            written += step.produced;
        }
        if (step.finished)
            break;
        if (step.consumed == 0 && step.produced == 0) {
            if (inputStart == inputEnd && unread == 0)
                throw CZipException(codec->truncatedDataCode(), m_storage->filePath());
            if (inputStart != inputEnd)
                throw CZipException(CZipException::internalError);   // a codec that stalls
        }
    }
    // Data that ends short of the declared size does not match its header.
    if (written != header.uncompressedSize || crc != header.crc32)
        throw CZipException(CZipException::badCrc, m_storage->filePath());
}

void CZipArchive::addNewFile(const std::string& sourcePath, const std::wstring& nameInZip, int level, int options,
                             std::size_t bufferSize)
{
    requireMode(create);
    CZipFile source(sourcePath, CZipFile::Mode::readOnly);
    addNewFile(source, nameInZip, level, options, bufferSize);
}

void CZipArchive::addNewFile(CZipAbstractFile& source, const std::wstring& nameInZip, int level, int options,
                             std::size_t bufferSize)
{
    requireMode(create);
    if (nameInZip.empty())
        throw CZipException(EINVAL);
    CZipFileHeader header;
    header.setFileName(nameInZip);
    if (header.rawFileName().size() > 0xFFFF)
        throw CZipException(CZipException::tooLongData);
    header.setTime(std::time(nullptr));
    const std::uint64_t sourceSize = source.length();
    const bool storeIt = (options & storeSmallEntries) != 0 && sourceSize < smallEntrySize;
    header.method = storeIt ? CZipFileHeader::stored : CZipFileHeader::deflated;
    header.versionNeeded = storeIt ? 10 : 20;
    header.uncompressedSize = sourceSize;

    m_storage->seekToEnd();
    const std::uint64_t start = m_storage->position();
    header.localHeaderOffset = start;
    try {
        writeEntry(source, header, level, bufferSize == 0 ? defaultTransferBufferSize : bufferSize);
    } catch (...) {
        try {
            m_storage->setLength(start);
            m_storage->seek(start);
        } catch (...) {
            // The original failure is the one worth reporting.
        }
        throw;
    }
    m_centralDir.add(std::move(header));
}

void CZipArchive::writeEntry(CZipAbstractFile& source, CZipFileHeader& header, int level, std::size_t bufferSize)
{
    const bool reserveZip64 = header.uncompressedSize >= CZipFileHeader::max32 - zip64Margin;
    const std::string local = header.localRecord(reserveZip64);
    m_storage->write(local.data(), local.size());

    std::unique_ptr<CZipCompressor> codec = CZipCompressor::forMethod(header.method);
    if (codec)
        codec->beginCompression(level);
    std::vector<unsigned char> input(bufferSize);
    std::vector<unsigned char> output(codec ? bufferSize : 0);
    std::uint32_t crc = 0;
    std::uint64_t readTotal = 0;
    std::uint64_t writtenTotal = 0;
    source.seek(0);
    bool finished = false;
    while (!finished) {
        const std::size_t chunk = source.read(input.data(), bufferSize);
        const bool lastInput = chunk < bufferSize;
        crc = updateCrc(crc, input.data(), chunk);
        readTotal += chunk;
        if (!codec) {
            m_storage->write(input.data(), chunk);
            writtenTotal += chunk;
            finished = lastInput;
            continue;
        }
        std::size_t consumed = 0;
        do {
            const CZipCompressor::Progress step =
                codec->compress(input.data() + consumed, chunk - consumed, output.data(), bufferSize, lastInput);
            consumed += step.consumed;
            m_storage->write(output.data(), step.produced);
            writtenTotal += step.produced;
            finished = step.finished;
        } while (consumed < chunk || (lastInput && !finished));
    }

    header.crc32 = crc;
    header.uncompressedSize = readTotal;
    header.compressedSize = writtenTotal;
    if (!reserveZip64 && (readTotal >= CZipFileHeader::max32 || writtenTotal >= CZipFileHeader::max32))
        throw CZipException(CZipException::tooBigSize, source.filePath());

    // Complete the local header now that CRC and sizes are known.
    const std::uint64_t end = m_storage->position();
    ZipFieldWriter patch;
    patch.u32(crc);
    if (!reserveZip64) {
        patch.u32(static_cast<std::uint32_t>(writtenTotal));
        patch.u32(static_cast<std::uint32_t>(readTotal));
    }
    m_storage->seek(header.localHeaderOffset + CZipFileHeader::localCrcOffset);
    m_storage->write(patch.data().data(), patch.size());
    if (reserveZip64) {
        ZipFieldWriter sizes;
        sizes.u64(readTotal);
        sizes.u64(writtenTotal);
        m_storage->seek(header.localHeaderOffset + header.localZip64SizesOffset());
        m_storage->write(sizes.data().data(), sizes.size());
    }
    m_storage->seek(end);
}

} // namespace quire::zip
