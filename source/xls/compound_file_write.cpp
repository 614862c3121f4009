// Writing side of the compound file: lays out header, workbook stream,
// further streams, mini stream and mini FAT, DIFAT, FAT and directory with
// 512-byte sectors.

#include <algorithm>
#include <cstring>
#include <fstream>

#include "api/qrerror.h"
#include "xls/compound_file.h"
#include "xls/little_endian.h"

namespace quire::xls {

namespace {

constexpr uint32_t SectorSize = 512;
constexpr uint32_t MiniSectorSize = 64;
constexpr uint32_t FatEntriesPerSector = SectorSize / 4;
constexpr uint32_t DifatEntriesPerSector = FatEntriesPerSector - 1;
constexpr uint32_t DirEntriesPerSector = SectorSize / DirEntry::Size;
constexpr uint32_t MaxRegularSector = 0xFFFFFFFA;

uint64_t ceilDiv(uint64_t a, uint64_t b) { return (a + b - 1) / b; }

uint64_t difatSectorsFor(uint64_t fatSectors)
{
    return fatSectors <= CompoundFileHeader::HeaderDifatEntries
               ? 0
               : ceilDiv(fatSectors - CompoundFileHeader::HeaderDifatEntries, DifatEntriesPerSector);
}

char16_t upperAscii(char16_t c)
{
    return (c >= u'a' && c <= u'z') ? static_cast<char16_t>(c - u'a' + u'A') : c;
}

// Directory order of sibling names: shorter first, then by upper-cased units.
bool directoryLess(const std::u16string& a, const std::u16string& b)
{
    if (a.size() != b.size())
        return a.size() < b.size();
    for (size_t i = 0; i < a.size(); ++i) {
        const char16_t x = upperAscii(a[i]);
        const char16_t y = upperAscii(b[i]);
        if (x != y)
            return x < y;
    }
    return false;
}

// Builds a balanced search tree over sorted[lo, hi) and returns its root.
// Nodes on the deepest level are red, all others black: every path from the
// root then meets the same number of black nodes, as a red-black tree needs.
uint32_t buildSiblingTree(std::vector<DirEntry>& dir, const std::vector<uint32_t>& sorted, size_t lo, size_t hi,
                          size_t depth, std::vector<size_t>& depths)
{
    if (lo >= hi)
        return DirEntry::NoStream;
    const size_t mid = lo + (hi - lo) / 2;
    const uint32_t node = sorted[mid];
    depths[node] = depth;
    dir[node].leftSibling = buildSiblingTree(dir, sorted, lo, mid, depth + 1, depths);
    dir[node].rightSibling = buildSiblingTree(dir, sorted, mid + 1, hi, depth + 1, depths);
    return node;
}

void writeFatChain(std::vector<uint32_t>& fat, uint64_t start, uint64_t count, const char* startMessage)
{
    if (count == 0)
        return;
    if (start >= fat.size())
        throw qrerror(startMessage);
    for (uint64_t i = 0; i < count; ++i) {
        if (start + i >= fat.size())
            throw qrerror("Xls::close(): sector is out of fat");
        fat[start + i] = i + 1 < count ? static_cast<uint32_t>(start + i + 1) : Xls::EndOfChain;
    }
}

} // namespace

Xls::Xls()
{
    dir_.emplace_back(u"Root Entry", DirEntry::Root, 1);
    dir_.emplace_back(u"Workbook", DirEntry::Stream, DirEntry::NoStream);
}

void Xls::setWorkbookStream(std::vector<uint8_t> bytes)
{
    workbookOut_ = std::move(bytes);
}

void Xls::addStream(const std::u16string& name, std::vector<uint8_t> bytes)
{
    const DirEntry probe(name.c_str(), DirEntry::Stream, DirEntry::NoStream);  // checks the name
    if (name.empty() || probe.hasName(u"Workbook") || probe.hasName(u"Root Entry") ||
        std::any_of(extraStreams_.begin(), extraStreams_.end(),
                    [&](const CompoundStream& s) { return probe.hasName(s.name); }))
        throw qrerror("Xls::addStream(): duplicate stream name");
    extraStreams_.push_back(CompoundStream{name, std::move(bytes)});
}

void Xls::close(std::vector<uint8_t>& out) const
{
    // Sizes of the streams. A short workbook stream is padded to the cutoff so
    // that it never lives in the mini stream; short further streams do, as the
    // format requires of every stream below the cutoff.
    const uint64_t workbookSize = std::max<uint64_t>(workbookOut_.size(), MiniStreamCutoff);
    if (workbookSize > 0xFFFFFFFFu)
        throw qrerror("Xls::close(): stream is too big");
    const uint64_t workbookSectors = ceilDiv(workbookSize, SectorSize);

    struct Placement {
        uint64_t start = EndOfChain;
        uint64_t count = 0;  // sectors, or mini sectors when inMini
        bool inMini = false;
    };
    std::vector<Placement> placements(extraStreams_.size());
    uint64_t nextSector = workbookSectors;
    uint64_t miniSectors = 0;
    for (size_t i = 0; i < extraStreams_.size(); ++i) {
        const uint64_t size = extraStreams_[i].data.size();
        if (size > 0xFFFFFFFFu)
            throw qrerror("Xls::close(): stream is too big");
        Placement& p = placements[i];
        if (size == 0)
            continue;
        if (size < MiniStreamCutoff) {
            p.inMini = true;
            p.start = miniSectors;
            p.count = ceilDiv(size, MiniSectorSize);
            miniSectors += p.count;
        } else {
            p.start = nextSector;
            p.count = ceilDiv(size, SectorSize);
            nextSector += p.count;
        }
    }
    const uint64_t miniStreamBytes = miniSectors * MiniSectorSize;
    const uint64_t miniStreamStart = nextSector;
    const uint64_t miniStreamSectorCount = ceilDiv(miniStreamBytes, SectorSize);
    nextSector += miniStreamSectorCount;
    const uint64_t miniFatStart = nextSector;
    const uint64_t miniFatSectorCount = ceilDiv(miniSectors, FatEntriesPerSector);
    nextSector += miniFatSectorCount;
    const uint64_t dataSectors = nextSector;

    const uint64_t entryCount = 2 + extraStreams_.size();
    const uint64_t dirSectors = ceilDiv(entryCount, DirEntriesPerSector);

    // FAT size: the established estimate first, then grown until the FAT
    // covers every sector including its own and the DIFAT's.
    const uint64_t d = dataSectors + dirSectors;
    const uint64_t f1 = ceilDiv(d, FatEntriesPerSector);
    const uint64_t f2 = ceilDiv(f1, FatEntriesPerSector);
    uint64_t fatSectors = f1 + f2 + f2 / FatEntriesPerSector;
    if (f2 % FatEntriesPerSector != 0)
        fatSectors += 1;
    if (f2 > 100)
        fatSectors += 3;
    while (fatSectors * FatEntriesPerSector < d + fatSectors + difatSectorsFor(fatSectors))
        ++fatSectors;
    const uint64_t difatSectors = difatSectorsFor(fatSectors);
    const uint64_t difatStart = dataSectors;
    const uint64_t fatStart = difatStart + difatSectors;
    const uint64_t dirStart = fatStart + fatSectors;
    const uint64_t totalSectors = dirStart + dirSectors;
    if (totalSectors > MaxRegularSector)
        throw qrerror("Xls::close(): file is too big");

    // FAT.
    std::vector<uint32_t> fat(fatSectors * FatEntriesPerSector, FreeSect);
    writeFatChain(fat, 0, workbookSectors, "startingSectorLocation is out of range");
    for (const Placement& p : placements)
        if (!p.inMini)
            writeFatChain(fat, p.start, p.count, "startingSectorLocation is out of range");
    writeFatChain(fat, miniStreamStart, miniStreamSectorCount, "startingSectorLocation is out of range");
    writeFatChain(fat, miniFatStart, miniFatSectorCount, "miniFatSectorLocation is out of range");
    for (uint64_t i = 0; i < difatSectors; ++i)
        fat.at(difatStart + i) = DifSect;
    for (uint64_t i = 0; i < fatSectors; ++i)
        fat.at(fatStart + i) = FatSect;
    writeFatChain(fat, dirStart, dirSectors, "Xls::close(): sector is out of fat");

    // Mini FAT: one chain per short stream.
    std::vector<uint32_t> miniFat(miniFatSectorCount * FatEntriesPerSector, FreeSect);
    for (const Placement& p : placements)
        if (p.inMini)
            writeFatChain(miniFat, p.start, p.count, "miniFatSectorLocation is out of range");

    // Header and DIFAT: the first 109 FAT sectors in the header, the rest in
    // DIFAT sectors of 127 entries, each ending with the next DIFAT sector.
    CompoundFileHeader header;
    header.numFatSectors = static_cast<uint32_t>(fatSectors);
    header.firstDirSector = static_cast<uint32_t>(dirStart);
    if (miniFatSectorCount > 0) {
        header.firstMiniFatSector = static_cast<uint32_t>(miniFatStart);
        header.numMiniFatSectors = static_cast<uint32_t>(miniFatSectorCount);
    }
    if (difatSectors > 0) {
        header.firstDifatSector = static_cast<uint32_t>(difatStart);
        header.numDifatSectors = static_cast<uint32_t>(difatSectors);
    }
    std::vector<uint32_t> difat(difatSectors * FatEntriesPerSector, FreeSect);
    for (uint64_t i = 0; i < fatSectors; ++i) {
        const uint32_t fatSector = static_cast<uint32_t>(fatStart + i);
        if (i < CompoundFileHeader::HeaderDifatEntries) {
            header.difat[i] = fatSector;
            continue;
        }
        const uint64_t k = i - CompoundFileHeader::HeaderDifatEntries;
        const uint64_t index = (k / DifatEntriesPerSector) * FatEntriesPerSector + k % DifatEntriesPerSector;
        if (index >= difat.size())
            throw qrerror("Xls::close(): difat index is out of range");
        difat[index] = fatSector;
    }
    for (uint64_t s = 0; s < difatSectors; ++s)
        difat[s * FatEntriesPerSector + DifatEntriesPerSector] =
            s + 1 < difatSectors ? static_cast<uint32_t>(difatStart + s + 1) : EndOfChain;

    // Directory: root, workbook, further streams; the root's children form a
    // red-black tree in directory order.
    std::vector<DirEntry> dir;
    dir.reserve(entryCount);
    dir.emplace_back(u"Root Entry", DirEntry::Root, DirEntry::NoStream);
    dir.emplace_back(u"Workbook", DirEntry::Stream, DirEntry::NoStream);
    dir[0].startingSector = miniStreamBytes > 0 ? static_cast<uint32_t>(miniStreamStart) : EndOfChain;
    dir[0].streamSize = miniStreamBytes;
    dir[1].startingSector = 0;
    dir[1].streamSize = workbookSize;
    dir[1].saved = true;
    for (size_t i = 0; i < extraStreams_.size(); ++i) {
        DirEntry entry(extraStreams_[i].name.c_str(), DirEntry::Stream, DirEntry::NoStream);
        entry.startingSector = static_cast<uint32_t>(placements[i].start);
        entry.streamSize = extraStreams_[i].data.size();
        entry.saved = true;
        dir.push_back(entry);
    }
    std::vector<uint32_t> sorted;
    for (uint32_t i = 1; i < dir.size(); ++i)
        sorted.push_back(i);
    std::sort(sorted.begin(), sorted.end(), [&](uint32_t a, uint32_t b) {
        return directoryLess(dir[a].nameString(), dir[b].nameString());
    });
    std::vector<size_t> depths(dir.size(), 0);
    dir[0].child = buildSiblingTree(dir, sorted, 0, sorted.size(), 0, depths);
    const size_t deepest = *std::max_element(depths.begin() + 1, depths.end());
    for (size_t i = 1; i < dir.size(); ++i)
        dir[i].colour = (deepest > 0 && depths[i] == deepest) ? DirEntry::Red : DirEntry::Black;

    // Output.
    out.assign((totalSectors + 1) * SectorSize, 0);
    header.serialize(out.data());
    auto sectorData = [&](uint64_t sector) { return out.data() + (sector + 1) * SectorSize; };
    std::copy(workbookOut_.begin(), workbookOut_.end(), sectorData(0));
    std::vector<uint8_t> miniStream(miniStreamBytes, 0);
    for (size_t i = 0; i < extraStreams_.size(); ++i) {
        const Placement& p = placements[i];
        const std::vector<uint8_t>& data = extraStreams_[i].data;
        if (p.count == 0)
            continue;
        if (p.inMini)
            std::copy(data.begin(), data.end(), miniStream.begin() + p.start * MiniSectorSize);
        else
            std::copy(data.begin(), data.end(), sectorData(p.start));
    }
    std::copy(miniStream.begin(), miniStream.end(), sectorData(miniStreamStart));
    for (size_t i = 0; i < miniFat.size(); ++i)
        storeU32(sectorData(miniFatStart) + 4 * i, miniFat[i]);
    for (size_t i = 0; i < difat.size(); ++i)
        storeU32(sectorData(difatStart) + 4 * i, difat[i]);
    for (size_t i = 0; i < fat.size(); ++i)
        storeU32(sectorData(fatStart) + 4 * i, fat[i]);
    for (size_t i = 0; i < dir.size(); ++i)
        dir[i].serialize(sectorData(dirStart) + i * DirEntry::Size);
}

void Xls::close(const std::string& path) const
{
    std::vector<uint8_t> bytes;
    close(bytes);
    std::ofstream file(path, std::ios::binary | std::ios::trunc);
    if (!file)
        throw qrerror("stream error");
    file.write(reinterpret_cast<const char*>(bytes.data()), static_cast<std::streamsize>(bytes.size()));
    file.close();
    if (!file)
        throw qrerror("stream error");
}

size_t Xls::close(uint8_t* buffer, size_t capacity) const
{
    std::vector<uint8_t> bytes;
    close(bytes);
    if (!buffer || bytes.size() > capacity)
        throw qrerror("stream error, perhaps it's too small writing buffer");
    std::copy(bytes.begin(), bytes.end(), buffer);
    return bytes.size();
}

void CompoundFileHeader::serialize(uint8_t* p) const
{
    std::memcpy(p, signature, 8);
    std::memcpy(p + 8, clsid, 16);
    storeU16(p + 24, minorVersion);
    storeU16(p + 26, majorVersion);
    storeU16(p + 28, byteOrder);
    storeU16(p + 30, sectorShift);
    storeU16(p + 32, miniSectorShift);
    std::memset(p + 34, 0, 6);
    storeU32(p + 40, numDirSectors);
    storeU32(p + 44, numFatSectors);
    storeU32(p + 48, firstDirSector);
    storeU32(p + 52, transactionSignature);
    storeU32(p + 56, miniStreamCutoff);
    storeU32(p + 60, firstMiniFatSector);
    storeU32(p + 64, numMiniFatSectors);
    storeU32(p + 68, firstDifatSector);
    storeU32(p + 72, numDifatSectors);
    for (size_t i = 0; i < HeaderDifatEntries; ++i)
        storeU32(p + 76 + 4 * i, difat[i]);
}

} // namespace quire::xls
