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
    abandonNewFile();
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
    m_openEntry.reset();
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

// Compresses an entry's data as it arrives, counting CRC and sizes, and completes the local
// header once the data has ended.
class CZipArchive::EntryWriter {
public:
    EntryWriter(CZipAbstractFile& storage, CZipFileHeader header, int level, std::size_t bufferSize)
        : m_storage(storage), m_header(std::move(header)), m_codec(CZipCompressor::forMethod(m_header.method)),
          m_output(m_codec ? bufferSize : 0)
    {
        m_start = m_storage.position();
        m_header.localHeaderOffset = m_start;
        m_reserveZip64 = m_header.uncompressedSize >= CZipFileHeader::max32 - zip64Margin;
        const std::string local = m_header.localRecord(m_reserveZip64);
        m_storage.write(local.data(), local.size());
        if (m_codec)
            m_codec->beginCompression(level);
    }

    std::uint64_t start() const { return m_start; }

    void write(const unsigned char* data, std::size_t size)
    {
        m_crc = updateCrc(m_crc, data, size);
        m_read += size;
        if (!m_codec) {
            m_storage.write(data, size);
            m_written += size;
            return;
        }
        std::size_t consumed = 0;
        while (consumed < size) {
            const CZipCompressor::Progress step =
                m_codec->compress(data + consumed, size - consumed, m_output.data(), m_output.size(), false);
            consumed += step.consumed;
            emit(step.produced);
        }
    }

    CZipFileHeader finish(const std::string& sourceName)
    {
        if (m_codec) {
            for (bool finished = false; !finished;) {
                const CZipCompressor::Progress step =
                    m_codec->compress(nullptr, 0, m_output.data(), m_output.size(), true);
                emit(step.produced);
                finished = step.finished;
            }
        }
        m_header.crc32 = m_crc;
        m_header.uncompressedSize = m_read;
        m_header.compressedSize = m_written;
        if (!m_reserveZip64 && (m_read >= CZipFileHeader::max32 || m_written >= CZipFileHeader::max32))
            throw CZipException(CZipException::tooBigSize, sourceName);

        const std::uint64_t end = m_storage.position();
        ZipFieldWriter patch;
        patch.u32(m_crc);
        if (!m_reserveZip64) {
            patch.u32(static_cast<std::uint32_t>(m_written));
            patch.u32(static_cast<std::uint32_t>(m_read));
        }
        m_storage.seek(m_header.localHeaderOffset + CZipFileHeader::localCrcOffset);
        m_storage.write(patch.data().data(), patch.size());
        if (m_reserveZip64) {
            ZipFieldWriter sizes;
            sizes.u64(m_read);
            sizes.u64(m_written);
            m_storage.seek(m_header.localHeaderOffset + m_header.localZip64SizesOffset());
            m_storage.write(sizes.data().data(), sizes.size());
        }
        m_storage.seek(end);
        return m_header;
    }

private:
    void emit(std::size_t produced)
    {
        m_storage.write(m_output.data(), produced);
        m_written += produced;
    }

    CZipAbstractFile& m_storage;
    CZipFileHeader m_header;
    std::unique_ptr<CZipCompressor> m_codec;
    std::vector<unsigned char> m_output;
    std::uint64_t m_start = 0;
    bool m_reserveZip64 = false;
    std::uint32_t m_crc = 0;
    std::uint64_t m_read = 0;
    std::uint64_t m_written = 0;
};

CZipArchive::CZipArchive() = default;

CZipFileHeader CZipArchive::newHeader(const std::wstring& nameInZip) const
{
    requireMode(create);
    if (m_openEntry)
        throw CZipException(CZipException::internalError);
    if (nameInZip.empty())
        throw CZipException(EINVAL);
    CZipFileHeader header;
    header.setFileName(nameInZip);
    if (header.rawFileName().size() > 0xFFFF)
        throw CZipException(CZipException::tooLongData);
    header.setTime(std::time(nullptr));
    header.method = CZipFileHeader::deflated;
    header.versionNeeded = 20;
    return header;
}

void CZipArchive::addNewFile(CZipAbstractFile& source, const std::wstring& nameInZip, int level, int options,
                             std::size_t bufferSize)
{
    CZipFileHeader header = newHeader(nameInZip);
    const std::uint64_t sourceSize = source.length();
    if ((options & storeSmallEntries) != 0 && sourceSize < smallEntrySize) {
        header.method = CZipFileHeader::stored;
        header.versionNeeded = 10;
    }
    header.uncompressedSize = sourceSize;
    if (bufferSize == 0)
        bufferSize = defaultTransferBufferSize;

    m_storage->seekToEnd();
    const std::uint64_t start = m_storage->position();
    try {
        EntryWriter entry(*m_storage, std::move(header), level, bufferSize);
        std::vector<unsigned char> input(bufferSize);
        source.seek(0);
        for (;;) {
            const std::size_t chunk = source.read(input.data(), bufferSize);
            entry.write(input.data(), chunk);
            if (chunk < bufferSize)
                break;
        }
        m_centralDir.add(entry.finish(source.filePath()));
    } catch (...) {
        try {
            m_storage->setLength(start);
            m_storage->seek(start);
        } catch (...) {
            // The original failure is the one worth reporting.
        }
        throw;
    }
}

void CZipArchive::openNewFile(const std::wstring& nameInZip, int level)
{
    CZipFileHeader header = newHeader(nameInZip);
    m_storage->seekToEnd();
    m_openEntry = std::make_unique<EntryWriter>(*m_storage, std::move(header), level, defaultTransferBufferSize);
}

void CZipArchive::writeNewFile(const void* data, std::size_t size)
{
    if (!m_openEntry)
        throw CZipException(CZipException::internalError);
    try {
        m_openEntry->write(static_cast<const unsigned char*>(data), size);
    } catch (...) {
        abandonNewFile();
        throw;
    }
}

void CZipArchive::closeNewFile()
{
    if (!m_openEntry)
        throw CZipException(CZipException::internalError);
    try {
        m_centralDir.add(m_openEntry->finish(std::string()));
        m_openEntry.reset();
    } catch (...) {
        abandonNewFile();
        throw;
    }
}

void CZipArchive::abandonNewFile() noexcept
{
    if (!m_openEntry)
        return;
    const std::uint64_t start = m_openEntry->start();
    m_openEntry.reset();
    try {
        m_storage->setLength(start);
        m_storage->seek(start);
    } catch (...) {
        // Nothing more can be done; the archive is abandoned by the caller.
    }
}

} // namespace quire::zip
