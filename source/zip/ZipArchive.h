// CZipArchive: one open archive over a file or a memory storage, either
// opened read-only (entries can be listed and extracted) or created empty
// (entries can be added, and close() writes the central directory).
#pragma once

#include "ZipAbstractFile.h"
#include "ZipCentralDir.h"
#include "ZipLimits.h"

#include <memory>
#include <string>

namespace quire::zip {

class CZipArchive {
public:
    enum OpenMode { openReadOnly = 3, create = 4 };
    // Add options. storeSmallEntries: entries under smallEntrySize bytes are
    // stored, since deflate would only make them larger. Values 1 and 2 are
    // accepted and reserved.
    enum AddOption { storeSmallEntries = 4 };
    static constexpr int defaultAddOptions = 7;
    static constexpr std::uint64_t smallEntrySize = 5;
    static constexpr std::size_t npos = CZipCentralDir::npos;

    CZipArchive();
    ~CZipArchive();
    CZipArchive(const CZipArchive&) = delete;
    CZipArchive& operator=(const CZipArchive&) = delete;

    // Opens a disk file by path.
    void open(const std::string& path, OpenMode mode);
    // Opens over a storage that the caller keeps alive until close().
    void open(CZipAbstractFile& storage, OpenMode mode);
    // Read-only: releases the storage. Create: writes the central directory
    // and end records, then closes a disk file (a memory storage keeps the
    // whole archive).
    void close();
    // Closes without writing anything further; never throws.
    void abandon() noexcept;
    bool isClosed() const { return m_storage == nullptr; }
    OpenMode mode() const { return m_mode; }

    std::size_t getCount() const { return m_centralDir.size(); }
    // Throws CZipException(227) for an index out of range.
    const CZipFileHeader& getFileInfo(std::size_t index) const { return m_centralDir.at(index); }
    std::size_t findFile(const std::wstring& name, bool caseSensitive = true) const;
    const CZipCentralDir& centralDir() const { return m_centralDir; }

    // Decompresses one entry into destination at its current position,
    // checking the CRC-32. Never writes more than the header's uncompressed
    // size; deflated entries whose declared size exceeds what deflate can
    // produce from their compressed size are refused before any work.
    void extractFile(std::size_t index, CZipAbstractFile& destination,
                     std::size_t bufferSize = defaultTransferBufferSize);
    // Decompresses one entry into a new disk file at path.
    void extractFile(std::size_t index, const std::string& path,
                     std::size_t bufferSize = defaultTransferBufferSize);

    // Adds the whole of source as a new entry. level -1 is the compressor's
    // default. A failed add leaves the archive as it was before the call.
    void addNewFile(CZipAbstractFile& source, const std::wstring& nameInZip, int level = -1,
                    int options = defaultAddOptions, std::size_t bufferSize = defaultTransferBufferSize);
    void addNewFile(const std::string& sourcePath, const std::wstring& nameInZip, int level = -1,
                    int options = defaultAddOptions, std::size_t bufferSize = defaultTransferBufferSize);

    // Adds an entry whose data arrives in pieces (it is deflated as it comes, never held
    // whole): openNewFile, any number of writeNewFile calls, then closeNewFile. A failure, or
    // abandonNewFile, cuts the archive back to where the entry began.
    void openNewFile(const std::wstring& nameInZip, int level = -1);
    void writeNewFile(const void* data, std::size_t size);
    void closeNewFile();
    void abandonNewFile() noexcept;
    bool isEntryOpen() const { return m_openEntry != nullptr; }

private:
    class EntryWriter;
    void requireMode(OpenMode wanted) const;
    CZipFileHeader newHeader(const std::wstring& nameInZip) const;
    std::uint64_t seekToEntryData(const CZipFileHeader& header);
    void copyStored(const CZipFileHeader& header, CZipAbstractFile& destination, std::size_t bufferSize);
    void decompressEntry(const CZipFileHeader& header, CZipAbstractFile& destination, std::size_t bufferSize);
    void writeEntry(CZipAbstractFile& source, CZipFileHeader& header, int level, std::size_t bufferSize);

    std::unique_ptr<CZipAbstractFile> m_ownedStorage;
    CZipAbstractFile* m_storage = nullptr;
    OpenMode m_mode = openReadOnly;
    CZipCentralDir m_centralDir;
    std::unique_ptr<EntryWriter> m_openEntry;
};

} // namespace quire::zip
