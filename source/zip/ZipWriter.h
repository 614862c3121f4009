// ZipWriter: writes a new archive, one entry at a time.
//
//   ZipWriter writer;
//   writer.createInMemory();              // or writer.create("book.xlsx")
//   writer.add("xl/workbook.xml", data, size);   // name: UTF-8 or wide text
//   writer.addFile("xl/media/image1.png", "/tmp/part.png");
//   writer.close();                        // writes the central directory
//   ZipBuffer archive = writer.takeBuffer();   // in-memory archives only
//
// Entries of fewer than 5 bytes are stored, larger ones deflated at zlib's
// default level. Errors throw CZipException; a failed add leaves the archive
// as it was. A writer destroyed or abandoned before close() removes the
// incomplete file it created.
#pragma once

#include "ZipArchive.h"
#include "ZipBuffer.h"
#include "ZipMemFile.h"

#include <string>

namespace quire::zip {

class ZipWriter {
public:
    ZipWriter() = default;
    ~ZipWriter() { abandon(); }
    ZipWriter(const ZipWriter&) = delete;
    ZipWriter& operator=(const ZipWriter&) = delete;

    void create(const std::string& path);
    void createInMemory();

    void add(const std::string& utf8Name, const void* data, std::size_t size);
    void add(const std::wstring& name, const void* data, std::size_t size);
    void addFile(const std::string& utf8Name, const std::string& sourcePath);
    void addFile(const std::wstring& name, const std::string& sourcePath);

    // An entry written in pieces: deflated as it arrives (level -1: zlib's default).
    void openEntry(const std::string& utf8Name, int level = -1);
    void writeEntry(const void* data, std::size_t size);
    void closeEntry();

    // Finishes the archive; a file is complete on disk afterwards.
    void close();
    // Drops an unfinished archive; never throws.
    void abandon() noexcept;
    bool isOpen() const { return !m_archive.isClosed(); }
    std::size_t entryCount() const { return m_archive.getCount(); }

    // The finished in-memory archive; the writer is left empty.
    ZipBuffer takeBuffer();

private:
    CZipArchive m_archive;
    CZipMemFile m_memFile;
    std::string m_path;
    bool m_inMemory = false;
};

} // namespace quire::zip
