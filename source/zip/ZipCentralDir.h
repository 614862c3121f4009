// CZipCentralDir: the list of entry headers of an archive, in archive order.
// Reading locates the end-of-central-directory record (and its Zip64 form)
// and parses every central record; writing emits the headers and end records.
#pragma once

#include "ZipFileHeader.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace quire::zip {

class CZipAbstractFile;

class CZipCentralDir {
public:
    static constexpr std::uint32_t endSignature = 0x06054B50;
    static constexpr std::uint32_t zip64EndSignature = 0x06064B50;
    static constexpr std::uint32_t zip64LocatorSignature = 0x07064B50;
    static constexpr std::size_t endFixedSize = 22;
    static constexpr std::size_t zip64EndFixedSize = 56;
    static constexpr std::size_t zip64LocatorSize = 20;
    static constexpr std::size_t npos = static_cast<std::size_t>(-1);

    // Reads the central directory of storage. Throws CZipException: 221 when
    // no end record is found in something that starts like an archive, 201
    // for anything else that is not a sound archive, 222/223 for a misplaced
    // Zip64 end record.
    void read(CZipAbstractFile& storage);
    // Writes the central directory and end records at the storage position.
    void write(CZipAbstractFile& storage) const;

    void clear();
    std::size_t size() const { return m_headers.size(); }
    const CZipFileHeader& operator[](std::size_t index) const { return m_headers[index]; }
    const CZipFileHeader& at(std::size_t index) const;
    void add(CZipFileHeader header) { m_headers.push_back(std::move(header)); }
    // Index of the entry with this name, or npos. ASCII letters compare
    // without case when caseSensitive is false.
    std::size_t find(const std::wstring& name, bool caseSensitive = true) const;

    // Offset of the archive inside its storage (data prepended to it, such as
    // a self-extractor stub); local header offsets are relative to it.
    std::uint64_t bytesBeforeZip() const { return m_bytesBeforeZip; }
    std::uint64_t centralDirOffset() const { return m_centralDirOffset; }
    bool isZip64() const { return m_zip64; }
    const std::string& comment() const { return m_comment; }

private:
    struct EndRecord {
        std::uint64_t position = 0;       // where it was found in the storage
        std::uint64_t entryCount = 0;
        std::uint64_t size = 0;
        std::uint64_t offset = 0;
        std::uint32_t diskNumber = 0;
        std::uint32_t centralDirDisk = 0;
    };

    EndRecord locateEndRecord(CZipAbstractFile& storage);
    void readZip64EndRecord(CZipAbstractFile& storage, EndRecord& end);
    void parseHeaders(const std::vector<unsigned char>& records, std::uint64_t entryCount);
    void rejectOverlappingEntries() const;

    std::vector<CZipFileHeader> m_headers;
    std::uint64_t m_bytesBeforeZip = 0;
    std::uint64_t m_centralDirOffset = 0;
    bool m_zip64 = false;
    std::string m_comment;
};

} // namespace quire::zip
