// Reading side of the compound file: header, DIFAT, FAT, mini FAT,
// directory and stream extraction. Every walk along a sector chain marks the
// sectors it has visited, so a hostile chain can neither loop nor make the
// reader allocate more than the input's own size.

#include <algorithm>
#include <cstring>
#include <fstream>

#include "api/qrerror.h"
#include "xls/compound_file.h"
#include "xls/little_endian.h"

namespace quire::xls {

namespace {

constexpr const char16_t* WorkbookName = u"Workbook";
constexpr const char16_t* BookName = u"Book";
constexpr const char16_t* EncryptionInfoName = u"EncryptionInfo";

std::string numberText(uint64_t n) { return std::to_string(n); }

} // namespace

CompoundFileHeader::CompoundFileHeader()
{
    std::fill(std::begin(difat), std::end(difat), Xls::FreeSect);
}

CompoundFileHeader CompoundFileHeader::parse(const uint8_t* p)
{
    CompoundFileHeader h;
    std::memcpy(h.signature, p, 8);
    std::memcpy(h.clsid, p + 8, 16);
    h.minorVersion = loadU16(p + 24);
    h.majorVersion = loadU16(p + 26);
    h.byteOrder = loadU16(p + 28);
    h.sectorShift = loadU16(p + 30);
    h.miniSectorShift = loadU16(p + 32);
    h.numDirSectors = loadU32(p + 40);
    h.numFatSectors = loadU32(p + 44);
    h.firstDirSector = loadU32(p + 48);
    h.transactionSignature = loadU32(p + 52);
    h.miniStreamCutoff = loadU32(p + 56);
    h.firstMiniFatSector = loadU32(p + 60);
    h.numMiniFatSectors = loadU32(p + 64);
    h.firstDifatSector = loadU32(p + 68);
    h.numDifatSectors = loadU32(p + 72);
    for (size_t i = 0; i < HeaderDifatEntries; ++i)
        h.difat[i] = loadU32(p + 76 + 4 * i);
    return h;
}

void Xls::open(const std::string& path)
{
    std::ifstream file(path, std::ios::binary | std::ios::ate);
    if (!file)
        throw qrerror("can't open file");
    const std::streamoff size = file.tellg();
    if (size < 0)
        throw qrerror("can't read file");
    std::vector<uint8_t> bytes(static_cast<size_t>(size));
    file.seekg(0);
    if (!file.read(reinterpret_cast<char*>(bytes.data()), size))
        throw qrerror("can't read file");
    open(std::move(bytes));
}

void Xls::open(const uint8_t* data, size_t size)
{
    open(std::vector<uint8_t>(data, data + size));
}

void Xls::open(std::vector<uint8_t>&& bytes)
{
    ownedInput_ = std::move(bytes);
    inputData_ = ownedInput_.data();
    inputSize_ = ownedInput_.size();
    loadInput();
}

void Xls::openView(const uint8_t* data, size_t size)
{
    ownedInput_ = std::vector<uint8_t>();
    inputData_ = data;
    inputSize_ = data ? size : 0;
    loadInput();
}

void Xls::loadInput()
{
    header_ = CompoundFileHeader();
    difat_.clear();
    fat_.clear();
    miniFat_.clear();
    dir_.clear();
    workbook_.clear();
    workbookEntry_ = SIZE_MAX;
    encryptionInfoEntry_ = SIZE_MAX;
    encrypted_ = false;
    try {
        load();
    } catch (...) {
        // A failed open leaves nothing half-read behind.
        ownedInput_ = std::vector<uint8_t>();
        inputData_ = nullptr;
        inputSize_ = 0;
        difat_.clear();
        fat_.clear();
        miniFat_.clear();
        dir_.clear();
        workbookEntry_ = SIZE_MAX;
        encrypted_ = false;
        throw;
    }
}

void Xls::load()
{
    readHeader();
    loadDifat();
    loadFat();
    loadMiniFat();
    loadDir();
    locateWorkbook();
}

void Xls::readHeader()
{
    if (inputSize_ < CompoundFileHeader::Size)
        throw qrerror("readHeader: file is corrupt (size < 512 bytes)");
    header_ = CompoundFileHeader::parse(inputData_);
    static const uint8_t signature[8] = {0xD0, 0xCF, 0x11, 0xE0, 0xA1, 0xB1, 0x1A, 0xE1};
    if (std::memcmp(header_.signature, signature, 8) != 0)
        throw qrerror("invalid file format");
    // Shifts of 32 or more would overflow; they leave a zero size like a
    // missing one does.
    sectorSize_ = header_.sectorShift < 32 ? (uint32_t{1} << header_.sectorShift) : 0;
    miniSectorSize_ = header_.miniSectorShift < 32 ? (uint32_t{1} << header_.miniSectorShift) : 0;
    if (sectorSize_ == 0)
        throw qrerror("Xls::readHeader(): _sectorSize can't be 0");
    if (miniSectorSize_ == 0)
        throw qrerror("Xls::readHeader(): _miniSectorSize can't be 0");
    // Real files use 512 or 4096; anything outside 128..65536, or a mini
    // sector larger than a sector, cannot be laid out consistently.
    if (sectorSize_ < 128 || sectorSize_ > 65536 || miniSectorSize_ > sectorSize_)
        throw qrerror("invalid file format");
    const uint64_t body = inputSize_ - CompoundFileHeader::Size;
    sectorsInInput_ = (body + sectorSize_ - 1) / sectorSize_;
}

bool Xls::wholeSectorInInput(uint32_t sector) const
{
    return sector < sectorsInInput_ && sectorOffset(sector) + sectorSize_ <= inputSize_;
}

void Xls::loadDifat()
{
    difat_.assign(header_.difat, header_.difat + CompoundFileHeader::HeaderDifatEntries);
    const uint32_t entriesPerSector = sectorSize_ / 4 - 1;
    std::vector<bool> visited;
    uint32_t count = 0;
    uint32_t sector = header_.firstDifatSector;
    while (sector != EndOfChain && sector != FreeSect) {
        if (count >= header_.numDifatSectors)
            throw qrerror("Xls::loadDifat(): difat chain contains more sectors than _header.numDifatSectors (" +
                          numberText(header_.numDifatSectors) + ")");
        const uint64_t offset = sectorOffset(sector);
        if (sector >= sectorsInInput_ || offset + uint64_t{entriesPerSector} * 4 > inputSize_)
            throw qrerror("loadDifat: file is corrupt [1]");
        if (offset + sectorSize_ > inputSize_)
            throw qrerror("loadDifat: file is corrupt [2]");
        if (visited.empty())
            visited.resize(sectorsInInput_);
        if (visited[sector])
            throw qrerror("Xls::loadDifat(): difat chain is cyclic");
        visited[sector] = true;
        const uint8_t* p = inputData_ + offset;
        for (uint32_t i = 0; i < entriesPerSector; ++i)
            difat_.push_back(loadU32(p + 4 * i));
        sector = loadU32(p + 4 * entriesPerSector);
        ++count;
    }
    if (count != header_.numDifatSectors)
        throw qrerror("Xls::loadDifat(): difat chain sectors (" + numberText(count) +
                      ") not equal _header.numDifatSectors (" + numberText(header_.numDifatSectors) + ")");
}

void Xls::loadFat()
{
    std::vector<uint32_t> fatSectors;
    for (uint32_t s : difat_)
        if (s != FreeSect)
            fatSectors.push_back(s);
    if (fatSectors.size() != header_.numFatSectors)
        throw qrerror("Xls::loadFat(): extract fat sectors (" + numberText(fatSectors.size()) +
                      ") not equal _header.numFatSectors (" + numberText(header_.numFatSectors) + ")");
    // Every FAT sector must lie in the input and appear once, which bounds
    // the FAT by the input's size before anything is allocated.
    std::vector<bool> seen(sectorsInInput_);
    for (uint32_t s : fatSectors) {
        if (!wholeSectorInInput(s) || seen[s])
            throw qrerror("loadFat: file is corrupt");
        seen[s] = true;
    }
    const uint32_t entriesPerSector = sectorSize_ / 4;
    fat_.resize(fatSectors.size() * size_t{entriesPerSector});
    size_t index = 0;
    for (uint32_t s : fatSectors) {
        const uint8_t* p = inputData_ + sectorOffset(s);
        for (uint32_t i = 0; i < entriesPerSector; ++i) {
            if (index >= fat_.size())
                throw qrerror("Xls::loadFat(): index is out of range of _fat");
            fat_[index++] = loadU32(p + 4 * i);
        }
    }
}

void Xls::loadMiniFat()
{
    // A zero count or an end-of-chain start means there is no mini FAT; a
    // start at sector 0 with a non-zero count is an ordinary chain.
    if (header_.firstMiniFatSector == EndOfChain || header_.firstMiniFatSector == FreeSect ||
        header_.numMiniFatSectors == 0)
        return;
    const uint32_t entriesPerSector = sectorSize_ / 4;
    std::vector<bool> visited(fat_.size());
    uint32_t sectorsRead = 0;
    uint32_t sector = header_.firstMiniFatSector;
    while (sector != EndOfChain) {
        if (sector >= fat_.size())
            throw qrerror("error in loading minifat");
        if (fat_[sector] == sector || visited[sector])
            throw qrerror("loadMiniFat: error in fat");
        visited[sector] = true;
        if (sectorsRead >= header_.numMiniFatSectors)
            throw qrerror("Xls::loadMiniFat(): file is corrupt");
        if (!wholeSectorInInput(sector))
            throw qrerror("loadMiniFat: file is corrupt");
        const uint8_t* p = inputData_ + sectorOffset(sector);
        for (uint32_t i = 0; i < entriesPerSector; ++i)
            miniFat_.push_back(loadU32(p + 4 * i));
        ++sectorsRead;
        sector = fat_[sector];
    }
}

void Xls::loadDir()
{
    std::vector<uint32_t> chain;
    std::vector<bool> visited(fat_.size());
    uint32_t sector = header_.firstDirSector;
    while (sector != EndOfChain) {
        if (sector >= fat_.size())
            throw qrerror("Xls::loadDir(): sector #" + numberText(sector) + " is not found in _fat");
        if (fat_[sector] == sector || visited[sector])
            throw qrerror("loadDir: error in fat [1]");
        visited[sector] = true;
        if (!wholeSectorInInput(sector))
            throw qrerror("loadDir: file is corrupt [1]");
        chain.push_back(sector);
        sector = fat_[sector];
    }
    const size_t entriesPerSector = sectorSize_ / DirEntry::Size;
    dir_.reserve(chain.size() * entriesPerSector);
    for (uint32_t s : chain) {
        const uint8_t* p = inputData_ + sectorOffset(s);
        for (size_t i = 0; i < entriesPerSector; ++i)
            dir_.push_back(DirEntry::parse(p + i * DirEntry::Size));
    }
}

void Xls::locateWorkbook()
{
    auto findStream = [this](const std::u16string& name) {
        for (size_t i = 0; i < dir_.size(); ++i)
            if (dir_[i].type == DirEntry::Stream && dir_[i].hasName(name))
                return i;
        return size_t{SIZE_MAX};
    };
    workbookEntry_ = findStream(WorkbookName);
    if (workbookEntry_ == SIZE_MAX)
        workbookEntry_ = findStream(BookName);
    if (workbookEntry_ == SIZE_MAX) {
        encryptionInfoEntry_ = findStream(EncryptionInfoName);
        if (encryptionInfoEntry_ == SIZE_MAX)
            throw qrerror("Xls::read(): EncryptionInfo section is not found");
        encrypted_ = true;
        return;
    }
    std::vector<bool> usedSectors(fat_.size());
    std::vector<bool> usedMiniSectors(miniFat_.size());
    readEntry(dir_[workbookEntry_], workbook_, usedSectors, usedMiniSectors);
}

const std::vector<uint8_t>& Xls::workbookStream() const
{
    if (encrypted_)
        throw qrerror("workbook is encrypted");
    if (workbookEntry_ == SIZE_MAX)
        throw qrerror("Xls::read(): stream is empty");
    return workbook_;
}

std::vector<uint8_t> Xls::takeWorkbookStream()
{
    workbookStream();  // the same checks
    std::vector<uint8_t> stream = std::move(workbook_);
    workbook_ = std::vector<uint8_t>();
    ownedInput_ = std::vector<uint8_t>();
    inputData_ = nullptr;
    inputSize_ = 0;
    return stream;
}

std::u16string Xls::workbookStreamName() const
{
    return workbookEntry_ == SIZE_MAX ? std::u16string() : dir_[workbookEntry_].nameString();
}

uint64_t Xls::declaredStreamSize(const DirEntry& entry) const
{
    // Version 3 files keep a 32-bit size; some writers leave garbage in the
    // high half.
    return header_.majorVersion == 3 ? (entry.streamSize & 0xFFFFFFFFu) : entry.streamSize;
}

std::vector<uint32_t> Xls::miniStreamSectors() const
{
    if (dir_.empty())
        throw qrerror("Xls::goMiniSector(): _dir is empty");
    std::vector<uint32_t> chain;
    std::vector<bool> visited(fat_.size());
    const uint64_t wanted = (declaredStreamSize(dir_[0]) + sectorSize_ - 1) / sectorSize_;
    uint32_t sector = dir_[0].startingSector;
    while (sector != EndOfChain && chain.size() < wanted) {
        if (sector >= fat_.size())
            throw qrerror("Xls::read(): sector is out of fat");
        if (visited[sector])
            throw qrerror("Xls::read(): error in fat");
        visited[sector] = true;
        chain.push_back(sector);
        sector = fat_[sector];
    }
    return chain;
}

void Xls::readEntry(const DirEntry& entry, std::vector<uint8_t>& out, std::vector<bool>& usedSectors,
                    std::vector<bool>& usedMiniSectors) const
{
    if (entry.startingSector == EndOfChain)
        throw qrerror("Xls::read(): stream is empty");
    const uint64_t declared = declaredStreamSize(entry);
    // A chain cannot hold more than the input; a larger declared size is a lie.
    uint64_t remaining = std::min<uint64_t>(declared, inputSize_);
    out.reserve(out.size() + remaining);

    // The cutoff is fixed at 4096 by the format, whatever the header says.
    if (declared < MiniStreamCutoff) {
        if (remaining == 0)
            return;
        const std::vector<uint32_t> container = miniStreamSectors();
        const uint32_t perSector = sectorSize_ / miniSectorSize_;
        uint32_t mini = entry.startingSector;
        while (remaining > 0 && mini != EndOfChain) {
            if (mini >= miniFat_.size())
                throw qrerror("Xls::read(): sector is out of fat");
            if (usedMiniSectors[mini])
                throw qrerror("Xls::read(): error in fat");
            usedMiniSectors[mini] = true;
            const size_t position = mini / perSector;
            if (position >= container.size())
                break;  // the mini stream ends early: return what there is
            const uint64_t offset = sectorOffset(container[position]) + uint64_t{mini % perSector} * miniSectorSize_;
            if (offset >= inputSize_)
                break;
            const uint64_t n = std::min<uint64_t>({remaining, miniSectorSize_, inputSize_ - offset});
            out.insert(out.end(), inputData_ + offset, inputData_ + offset + n);
            remaining -= n;
            mini = miniFat_[mini];
        }
        return;
    }

    uint32_t sector = entry.startingSector;
    if (sector >= fat_.size())
        throw qrerror("Xls::read(): sector is out of fat");
    while (remaining > 0 && sector != EndOfChain) {
        if (sector >= fat_.size())
            throw qrerror("Xls::read(): sector is out of fat");
        if (usedSectors[sector])
            throw qrerror("Xls::read(): error in fat");
        usedSectors[sector] = true;
        const uint64_t offset = sectorOffset(sector);
        if (offset >= inputSize_)
            break;  // truncated file: return what there is
        const uint64_t n = std::min<uint64_t>({remaining, sectorSize_, inputSize_ - offset});
        out.insert(out.end(), inputData_ + offset, inputData_ + offset + n);
        remaining -= n;
        if (n < sectorSize_ && remaining > 0)
            break;
        sector = fat_[sector];
    }
}

std::vector<uint8_t> Xls::readStream(size_t entryIndex) const
{
    if (entryIndex >= dir_.size())
        throw qrerror("index is out of range");
    std::vector<uint8_t> out;
    std::vector<bool> usedSectors(fat_.size());
    std::vector<bool> usedMiniSectors(miniFat_.size());
    readEntry(dir_[entryIndex], out, usedSectors, usedMiniSectors);
    return out;
}

std::vector<size_t> Xls::rootLevelEntries() const
{
    std::vector<size_t> result;
    if (dir_.empty())
        return result;
    std::vector<bool> visited(dir_.size());
    std::vector<uint32_t> pending{dir_[0].child};
    while (!pending.empty()) {
        const uint32_t index = pending.back();
        pending.pop_back();
        if (index >= dir_.size() || index == 0 || visited[index])
            continue;
        visited[index] = true;
        result.push_back(index);
        pending.push_back(dir_[index].leftSibling);
        pending.push_back(dir_[index].rightSibling);
    }
    std::sort(result.begin(), result.end());
    return result;
}

std::vector<CompoundStream> Xls::rootStreams() const
{
    std::vector<CompoundStream> streams;
    // Shared across all streams: a sector serves one stream only, so the
    // total extracted stays within the input's size.
    std::vector<bool> usedSectors(fat_.size());
    std::vector<bool> usedMiniSectors(miniFat_.size());
    for (size_t index : rootLevelEntries()) {
        const DirEntry& entry = dir_[index];
        if (index == workbookEntry_ || entry.type != DirEntry::Stream)
            continue;
        const std::u16string name = entry.nameString();
        if (name.empty() ||
            std::any_of(streams.begin(), streams.end(), [&](const CompoundStream& s) { return entry.hasName(s.name); }))
            continue;
        CompoundStream stream{name, {}};
        if (entry.startingSector != EndOfChain || declaredStreamSize(entry) != 0) {
            try {
                readEntry(entry, stream.data, usedSectors, usedMiniSectors);
            } catch (const qrerror&) {
                continue;  // an unreadable side stream is dropped, not fatal
            }
        }
        streams.push_back(std::move(stream));
    }
    return streams;
}

} // namespace quire::xls
