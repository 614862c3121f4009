// CZipAbstractFile: the random-access byte storage under an archive, either a
// disk file (CZipFile) or a memory buffer (CZipMemFile). Failures throw
// CZipException.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>

namespace quire::zip {

class CZipAbstractFile {
public:
    virtual ~CZipAbstractFile() = default;

    // Reads up to size bytes at the current position; returns how many were
    // read, fewer only at the end of the storage.
    virtual std::size_t read(void* buffer, std::size_t size) = 0;
    virtual void write(const void* data, std::size_t size) = 0;
    virtual void seek(std::uint64_t position) = 0;
    virtual std::uint64_t position() const = 0;
    virtual std::uint64_t length() const = 0;
    // Cuts or extends the storage to length bytes; used to roll back a failed entry.
    virtual void setLength(std::uint64_t length) = 0;
    virtual void flush() {}
    virtual void close() = 0;
    virtual bool isClosed() const = 0;
    // The path of a disk file, empty for memory; used in error messages.
    virtual std::string filePath() const { return {}; }

    // Reads exactly size bytes or throws the given archive error code.
    void readExactly(void* buffer, std::size_t size, int errorCode);
    void seekToEnd() { seek(length()); }

protected:
    CZipAbstractFile() = default;
    CZipAbstractFile(const CZipAbstractFile&) = delete;
    CZipAbstractFile& operator=(const CZipAbstractFile&) = delete;
};

} // namespace quire::zip
