// ZipReader: reads the entries of an existing archive.
//
//   ZipReader reader;
//   reader.open("book.xlsx");             // or reader.open(data, size): the caller's
//                                         // buffer is used in place, never copied or freed
//   for (std::size_t i = 0; i < reader.entryCount(); ++i)
//       reader.entryName(i);              // wide text; entryNameUtf8(i) for UTF-8
//   std::size_t i = reader.find("xl/workbook.xml");   // ZipReader::npos when absent
//   std::string xml = reader.extract(i);   // also extractBytes(), extractBuffer()
//   reader.extractToFile(i, path);         // or extractToTempFile(i) -> path
//   reader.close();
//
// Errors are thrown: CZipException (numeric code and fixed text) for archive,
// file and codec errors, ZipError for "incorrect file size in archive" and
// "Zip Memory Allocation Failure". An entry larger than maxEntrySize() is not
// extracted into memory (CZipException 212).
#pragma once

#include "ZipArchive.h"
#include "ZipBuffer.h"
#include "ZipMemFile.h"

#include <cstdint>
#include <string>
#include <vector>

namespace quire::zip {

class ZipReader {
public:
    static constexpr std::size_t npos = CZipArchive::npos;

    ZipReader() = default;
    ~ZipReader() { close(); }
    ZipReader(const ZipReader&) = delete;
    ZipReader& operator=(const ZipReader&) = delete;

    void open(const std::string& path);
    // Reads the archive in place from the caller's buffer, which must stay
    // valid and unchanged until close().
    void open(const void* data, std::size_t size);
    void close() noexcept;
    bool isOpen() const { return !m_archive.isClosed(); }

    std::size_t entryCount() const { return m_archive.getCount(); }
    std::wstring entryName(std::size_t index) const { return m_archive.getFileInfo(index).fileName(); }
    std::string entryNameUtf8(std::size_t index) const;
    std::uint64_t entrySize(std::size_t index) const { return m_archive.getFileInfo(index).uncompressedSize; }
    const CZipFileHeader& entryInfo(std::size_t index) const { return m_archive.getFileInfo(index); }
    std::size_t find(const std::wstring& name, bool caseSensitive = true) const;
    std::size_t find(const std::string& utf8Name, bool caseSensitive = true) const;

    // The whole entry in memory, CRC-checked.
    std::string extract(std::size_t index);
    std::vector<unsigned char> extractBytes(std::size_t index);
    // The whole entry in a malloc'd buffer that the caller takes over.
    ZipBuffer extractBuffer(std::size_t index);
    // Writes the entry to path; a partly written file is removed on failure.
    void extractToFile(std::size_t index, const std::string& path);
    // Writes the entry to a new file in the temporary directory and returns
    // its path; the caller removes it.
    std::string extractToTempFile(std::size_t index);

    void setMaxEntrySize(std::uint64_t bytes) { m_maxEntrySize = bytes; }
    std::uint64_t maxEntrySize() const { return m_maxEntrySize; }

    CZipArchive& archive() { return m_archive; }

private:
    std::size_t checkedMemorySize(std::size_t index) const;
    template <class Container> Container extractInto(std::size_t index);

    CZipArchive m_archive;
    CZipMemFile m_memFile;
    std::uint64_t m_maxEntrySize = defaultMaxMemoryEntrySize;
};

} // namespace quire::zip
