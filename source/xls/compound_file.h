#pragma once

// The OLE2 compound file that wraps a binary workbook: reads the header,
// DIFAT, FAT, mini FAT and directory of an existing file and extracts its
// workbook stream; writes a new file from a workbook stream and any further
// root-level streams. Knows nothing of records.

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "xls/dir_entry.h"

namespace quire::xls {

struct CompoundFileHeader {
    static constexpr size_t Size = 512;
    static constexpr size_t HeaderDifatEntries = 109;

    uint8_t signature[8] = {0xD0, 0xCF, 0x11, 0xE0, 0xA1, 0xB1, 0x1A, 0xE1};
    uint8_t clsid[16] = {};
    uint16_t minorVersion = 0x003E;
    uint16_t majorVersion = 3;
    uint16_t byteOrder = 0xFFFE;
    uint16_t sectorShift = 9;
    uint16_t miniSectorShift = 6;
    uint32_t numDirSectors = 0;
    uint32_t numFatSectors = 0;
    uint32_t firstDirSector = 0xFFFFFFFE;
    uint32_t transactionSignature = 0;
    uint32_t miniStreamCutoff = 4096;
    uint32_t firstMiniFatSector = 0xFFFFFFFE;
    uint32_t numMiniFatSectors = 0;
    uint32_t firstDifatSector = 0xFFFFFFFE;
    uint32_t numDifatSectors = 0;
    uint32_t difat[HeaderDifatEntries];

    CompoundFileHeader();
    static CompoundFileHeader parse(const uint8_t* p);
    void serialize(uint8_t* p) const;
};

// A stream of the root storage, kept by name (for example "\x05SummaryInformation").
struct CompoundStream {
    std::u16string name;
    std::vector<uint8_t> data;
};

class Xls {
public:
    static constexpr uint32_t FreeSect = 0xFFFFFFFF;
    static constexpr uint32_t EndOfChain = 0xFFFFFFFE;
    static constexpr uint32_t FatSect = 0xFFFFFFFD;
    static constexpr uint32_t DifSect = 0xFFFFFFFC;
    static constexpr uint32_t MiniStreamCutoff = 4096;

    // A new container holding "Root Entry" and an empty "Workbook".
    Xls();

    // --- Reading -----------------------------------------------------------
    // Each open replaces whatever the object held. Failures throw qrerror.
    void open(const std::string& path);
    void open(const uint8_t* data, size_t size);
    void open(std::vector<uint8_t>&& bytes);
    // Reads the caller's bytes in place: they must outlive every later read of this object.
    void openView(const uint8_t* data, size_t size);

    // True when the file holds no workbook stream but an "EncryptionInfo"
    // stream (an encrypted package).
    bool encrypted() const { return encrypted_; }
    // The bytes of the "Workbook" (or "Book") stream; throws
    // "workbook is encrypted" for an encrypted file.
    const std::vector<uint8_t>& workbookStream() const;
    // Moves the workbook stream out and frees the file's bytes; the container is empty after.
    std::vector<uint8_t> takeWorkbookStream();
    // The directory name of the workbook stream ("Workbook" or "Book" as stored).
    std::u16string workbookStreamName() const;

    // Streams of the root storage other than the workbook stream, in
    // directory order; streams that cannot be read are left out.
    std::vector<CompoundStream> rootStreams() const;
    // The content of one directory entry's stream.
    std::vector<uint8_t> readStream(size_t entryIndex) const;

    const CompoundFileHeader& header() const { return header_; }
    const std::vector<DirEntry>& directory() const { return dir_; }
    const std::vector<uint32_t>& fat() const { return fat_; }
    const std::vector<uint32_t>& miniFat() const { return miniFat_; }

    // --- Writing -----------------------------------------------------------
    void setWorkbookStream(std::vector<uint8_t> bytes);
    // A further root-level stream written after the workbook stream, in the
    // order added. Names must be unique and shorter than 32 characters.
    void addStream(const std::u16string& name, std::vector<uint8_t> bytes);
    void clearStreams() { extraStreams_.clear(); }

    // Lays out and writes the whole compound file.
    void close(std::vector<uint8_t>& out) const;
    void close(const std::string& path) const;
    // Writes into a caller's fixed buffer; returns the bytes written.
    size_t close(uint8_t* buffer, size_t capacity) const;

private:
    void loadInput();
    void load();
    void readHeader();
    void loadDifat();
    void loadFat();
    void loadMiniFat();
    void loadDir();
    void locateWorkbook();

    uint64_t sectorOffset(uint32_t sector) const { return (static_cast<uint64_t>(sector) + 1) * sectorSize_; }
    bool wholeSectorInInput(uint32_t sector) const;
    uint64_t declaredStreamSize(const DirEntry& entry) const;
    std::vector<uint32_t> miniStreamSectors() const;
    // Appends an entry's bytes to out; 'used' marks sectors already taken so
    // that no sector is read twice (sized by fat_ and miniFat_ respectively).
    void readEntry(const DirEntry& entry, std::vector<uint8_t>& out, std::vector<bool>& usedSectors,
                   std::vector<bool>& usedMiniSectors) const;
    std::vector<size_t> rootLevelEntries() const;

    // Reading state.
    std::vector<uint8_t> ownedInput_;
    const uint8_t* inputData_ = nullptr;
    size_t inputSize_ = 0;
    CompoundFileHeader header_;
    uint32_t sectorSize_ = 512;
    uint32_t miniSectorSize_ = 64;
    uint64_t sectorsInInput_ = 0;  // sectors that begin inside the input
    std::vector<uint32_t> difat_;
    std::vector<uint32_t> fat_;
    std::vector<uint32_t> miniFat_;
    std::vector<DirEntry> dir_;
    size_t workbookEntry_ = SIZE_MAX;
    size_t encryptionInfoEntry_ = SIZE_MAX;
    bool encrypted_ = false;
    std::vector<uint8_t> workbook_;

    // Writing state.
    std::vector<uint8_t> workbookOut_;
    std::vector<CompoundStream> extraStreams_;
};

} // namespace quire::xls
