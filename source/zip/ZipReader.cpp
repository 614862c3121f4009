#include "ZipReader.h"

#include "ZipError.h"
#include "ZipException.h"
#include "ZipLimits.h"
#include "ZipNameCodec.h"

#include <cerrno>
#include <filesystem>
#include <new>
#include <stdexcept>
#include <unistd.h>

namespace quire::zip {

namespace {

constexpr const char* incorrectSizeMessage = "incorrect file size in archive";
constexpr const char* allocationFailureMessage = "Zip Memory Allocation Failure";

void removeQuietly(const std::string& path) noexcept
{
    std::error_code ignored;
    std::filesystem::remove(path, ignored);
}

// Collects an entry at the end of a string or byte vector.
template <class Container> class AppendingSink final : public CZipAbstractFile {
public:
    explicit AppendingSink(Container& target) : m_target(target) {}
    std::size_t read(void*, std::size_t) override { return 0; }
    void write(const void* data, std::size_t size) override
    {
        const auto* bytes = static_cast<const typename Container::value_type*>(data);
        m_target.insert(m_target.end(), bytes, bytes + size);
    }
    void seek(std::uint64_t position) override
    {
        if (position != m_target.size())
            throw CZipException(CZipException::internalError);
    }
    std::uint64_t position() const override { return m_target.size(); }
    std::uint64_t length() const override { return m_target.size(); }
    void setLength(std::uint64_t length) override { m_target.resize(static_cast<std::size_t>(length)); }
    void close() override {}
    bool isClosed() const override { return false; }

private:
    Container& m_target;
};

// How much memory to set aside before extracting: the declared size, but
// never more than the compressed data could expand to with deflate, so that
// a false size (bzip2 has no such bound) costs memory only as data arrives.
std::size_t initialCapacity(const CZipFileHeader& header, std::size_t declared)
{
    const std::uint64_t compressed = header.compressedSize;
    if (compressed > (UINT64_MAX - deflateRatioAllowance) / maxDeflateRatio)
        return declared;
    const std::uint64_t plausible = compressed * maxDeflateRatio + deflateRatioAllowance;
    return plausible < declared ? static_cast<std::size_t>(plausible) : declared;
}

} // namespace

void ZipReader::open(const std::string& path)
{
    close();
    m_archive.open(path, CZipArchive::openReadOnly);
}

void ZipReader::open(const void* data, std::size_t size)
{
    close();
    m_memFile.attachReadOnly(data, size);
    m_archive.open(m_memFile, CZipArchive::openReadOnly);
}

void ZipReader::close() noexcept
{
    m_archive.abandon();
    m_memFile.attachReadOnly(nullptr, 0);   // drops the caller's buffer without freeing it
}

std::string ZipReader::entryNameUtf8(std::size_t index) const
{
    return wideToUtf8(entryName(index));
}

std::size_t ZipReader::find(const std::wstring& name, bool caseSensitive) const
{
    return m_archive.findFile(name, caseSensitive);
}

std::size_t ZipReader::find(const std::string& utf8Name, bool caseSensitive) const
{
    return m_archive.findFile(utf8ToWide(utf8Name), caseSensitive);
}

std::size_t ZipReader::checkedMemorySize(std::size_t index) const
{
    const std::uint64_t size = m_archive.getFileInfo(index).uncompressedSize;
    // A saturated 32-bit size without its Zip64 value is no size at all.
    if (size == CZipFileHeader::max32)
        throw ZipError(incorrectSizeMessage);
    if (size > m_maxEntrySize || size > SIZE_MAX)
        throw CZipException(CZipException::tooBigSize);
    return static_cast<std::size_t>(size);
}

template <class Container> Container ZipReader::extractInto(std::size_t index)
{
    const std::size_t size = checkedMemorySize(index);
    Container out;
    try {
        out.reserve(initialCapacity(m_archive.getFileInfo(index), size));
        AppendingSink<Container> sink(out);
        m_archive.extractFile(index, sink, defaultTransferBufferSize);
    } catch (const std::bad_alloc&) {
        throw ZipError(allocationFailureMessage);
    } catch (const std::length_error&) {
        throw ZipError(allocationFailureMessage);
    }
    return out;
}

std::string ZipReader::extract(std::size_t index)
{
    return extractInto<std::string>(index);
}

std::vector<unsigned char> ZipReader::extractBytes(std::size_t index)
{
    return extractInto<std::vector<unsigned char>>(index);
}

ZipBuffer ZipReader::extractBuffer(std::size_t index)
{
    const std::size_t size = checkedMemorySize(index);
    CZipMemFile sink;
    try {
        sink.reserve(initialCapacity(m_archive.getFileInfo(index), size));
        m_archive.extractFile(index, sink, defaultTransferBufferSize);
    } catch (const std::bad_alloc&) {
        throw ZipError(allocationFailureMessage);
    } catch (const CZipException& error) {
        if (error.code() == ENOMEM)
            throw ZipError(allocationFailureMessage);
        throw;
    }
    return sink.detach();
}

void ZipReader::extractToFile(std::size_t index, const std::string& path)
{
    m_archive.extractFile(index, path, defaultTransferBufferSize);
}

std::string ZipReader::extractToTempFile(std::size_t index)
{
    m_archive.getFileInfo(index);
    std::error_code error;
    std::filesystem::path directory = std::filesystem::temp_directory_path(error);
    if (error)
        directory = "/tmp";
    std::string path = (directory / "quire-zip-XXXXXX").string();
    const int descriptor = ::mkstemp(path.data());
    if (descriptor < 0)
        throw CZipException(CZipException::fromErrno(errno), path);
    ::close(descriptor);
    try {
        extractToFile(index, path);
    } catch (...) {
        removeQuietly(path);
        throw;
    }
    return path;
}

} // namespace quire::zip
