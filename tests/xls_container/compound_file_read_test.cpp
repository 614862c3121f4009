// Opening compound files: header checks, DIFAT, FAT, mini FAT, directory and
// stream extraction, including hostile chains.

#include <gtest/gtest.h>

#include <numeric>

#include "api/qrerror.h"
#include "test_support.h"
#include "xls/compound_file.h"

using namespace quire::xls;
using namespace quire::xls::test;

namespace {

constexpr uint32_t EndOfChain = 0xFFFFFFFE;

std::vector<uint8_t> countingBytes(size_t n)
{
    std::vector<uint8_t> v(n);
    for (size_t i = 0; i < n; ++i)
        v[i] = static_cast<uint8_t>(i * 7 + i / 251);
    return v;
}

std::string openFailure(const std::vector<uint8_t>& file)
{
    return failureOf([&] {
        Xls xls;
        xls.open(file.data(), file.size());
    });
}

void renameEntry(std::vector<uint8_t>& file, uint32_t index, const std::u16string& name)
{
    const size_t at = dirEntryOffset(file, index);
    for (size_t i = 0; i < 32; ++i)
        setU16(file, at + 2 * i, i < name.size() ? static_cast<uint16_t>(name[i]) : 0);
    setU16(file, at + 64, static_cast<uint16_t>(name.size() * 2 + 2));
}

uint32_t sectorCount(const std::vector<uint8_t>& file) { return static_cast<uint32_t>(file.size() / 512 - 1); }

} // namespace

TEST(CompoundFileHeader, InputShorterThanAHeaderIsRefused)
{
    EXPECT_EQ(openFailure(std::vector<uint8_t>(511, 0)), "readHeader: file is corrupt (size < 512 bytes)");
    EXPECT_EQ(openFailure({}), "readHeader: file is corrupt (size < 512 bytes)");
}

TEST(CompoundFileHeader, WrongSignatureIsNotACompoundFile)
{
    std::vector<uint8_t> file = compoundFileWith(countingBytes(100));
    file.resize(512);
    file[7] = 0;
    EXPECT_EQ(openFailure(file), "invalid file format");
    std::vector<uint8_t> zip = {'P', 'K', 3, 4};
    zip.resize(4096);
    EXPECT_EQ(openFailure(zip), "invalid file format");
}

TEST(CompoundFileHeader, SectorShiftsThatGiveNoSizeAreRefused)
{
    std::vector<uint8_t> file = compoundFileWith(countingBytes(100));
    std::vector<uint8_t> bad = file;
    setU16(bad, 30, 40);
    EXPECT_EQ(openFailure(bad), "Xls::readHeader(): _sectorSize can't be 0");
    bad = file;
    setU16(bad, 32, 32);
    EXPECT_EQ(openFailure(bad), "Xls::readHeader(): _miniSectorSize can't be 0");
    bad = file;
    setU16(bad, 30, 30);  // a gigabyte sector cannot be laid out
    EXPECT_EQ(openFailure(bad), "invalid file format");
}

TEST(CompoundFileDifat, ChainLongerOrShorterThanTheHeaderSaysIsRefused)
{
    const std::vector<uint8_t> file = compoundFileWith(countingBytes(5000));
    std::vector<uint8_t> bad = file;
    setU32(bad, 68, 0);  // a DIFAT chain the header does not count
    EXPECT_EQ(openFailure(bad), "Xls::loadDifat(): difat chain contains more sectors than _header.numDifatSectors (0)");
    bad = file;
    setU32(bad, 72, 2);
    EXPECT_EQ(openFailure(bad), "Xls::loadDifat(): difat chain sectors (0) not equal _header.numDifatSectors (2)");
}

TEST(CompoundFileDifat, SectorsOutsideTheInputAreRefused)
{
    std::vector<uint8_t> file = compoundFileWith(countingBytes(5000));
    std::vector<uint8_t> bad = file;
    setU32(bad, 68, 100000);
    setU32(bad, 72, 1);
    EXPECT_EQ(openFailure(bad), "loadDifat: file is corrupt [1]");
    // The last sector cut just before its next-sector pointer.
    bad = file;
    const uint32_t last = sectorCount(bad) - 1;
    bad.resize((last + 1) * 512 + 508);
    setU32(bad, 68, last);
    setU32(bad, 72, 1);
    EXPECT_EQ(openFailure(bad), "loadDifat: file is corrupt [2]");
}

TEST(CompoundFileDifat, SelfReferencingChainEndsWithAnError)
{
    std::vector<uint8_t> file = compoundFileWith(countingBytes(5000));
    setU32(file, 68, 0);
    setU32(file, 72, 0xFFFFFFF0);  // the header's count gives no bound
    setU32(file, 512 + 508, 0);    // sector 0 names itself as the next DIFAT sector
    EXPECT_EQ(openFailure(file), "Xls::loadDifat(): difat chain is cyclic");
}

TEST(CompoundFileFat, SectorCountMustMatchTheHeader)
{
    std::vector<uint8_t> file = compoundFileWith(countingBytes(5000));
    const uint32_t count = getU32(file, 44);
    setU32(file, 44, count + 1);
    EXPECT_EQ(openFailure(file), "Xls::loadFat(): extract fat sectors (" + std::to_string(count) +
                                     ") not equal _header.numFatSectors (" + std::to_string(count + 1) + ")");
}

TEST(CompoundFileFat, FatSectorsOutsideTheInputOrListedTwiceAreRefused)
{
    const std::vector<uint8_t> file = compoundFileWith(countingBytes(5000));
    std::vector<uint8_t> bad = file;
    setU32(bad, 76, 100000);
    EXPECT_EQ(openFailure(bad), "loadFat: file is corrupt");
    bad = file;
    bad.resize(bad.size() - 512 * 2);  // cut the directory and the last FAT sector
    EXPECT_NE(openFailure(bad), "");
    bad = file;
    setU32(bad, 80, getU32(bad, 76));  // the same FAT sector twice
    EXPECT_EQ(openFailure(bad), "loadFat: file is corrupt");
}

TEST(CompoundFileMiniFat, BrokenChainsAreRefused)
{
    const std::vector<uint8_t> file = compoundFileWith(countingBytes(5000));
    const uint32_t sectors = sectorCount(file);
    auto withMiniFat = [&](uint32_t first, uint32_t count) {
        std::vector<uint8_t> bad = file;
        setU32(bad, 60, first);
        setU32(bad, 64, count);
        return bad;
    };
    std::vector<uint8_t> bad = withMiniFat(0, 1);
    setU32(bad, fatEntryOffset(bad, 0), 0);
    EXPECT_EQ(openFailure(bad), "loadMiniFat: error in fat");

    bad = withMiniFat(0, 100);
    setU32(bad, fatEntryOffset(bad, 0), 1);
    setU32(bad, fatEntryOffset(bad, 1), 0);
    EXPECT_EQ(openFailure(bad), "loadMiniFat: error in fat");

    bad = withMiniFat(100000, 1);
    EXPECT_EQ(openFailure(bad), "error in loading minifat");

    bad = withMiniFat(0, 1);
    setU32(bad, fatEntryOffset(bad, 0), 0xFFFFFFFF);  // ends in a free sector
    EXPECT_EQ(openFailure(bad), "error in loading minifat");

    bad = withMiniFat(0, 1);  // a chain of 2 where the header counts 1
    setU32(bad, fatEntryOffset(bad, 0), 1);
    setU32(bad, fatEntryOffset(bad, 1), EndOfChain);
    EXPECT_EQ(openFailure(bad), "Xls::loadMiniFat(): file is corrupt");

    bad = withMiniFat(sectors + 5, 1);  // inside the FAT, beyond the input
    setU32(bad, fatEntryOffset(bad, sectors + 5), EndOfChain);
    EXPECT_EQ(openFailure(bad), "loadMiniFat: file is corrupt");
}

TEST(CompoundFileDirectory, BrokenChainsAreRefused)
{
    const std::vector<uint8_t> file = compoundFileWith(countingBytes(5000));
    const uint32_t dirSector = getU32(file, 48);
    std::vector<uint8_t> bad = file;
    setU32(bad, 48, 100000);
    EXPECT_EQ(openFailure(bad), "Xls::loadDir(): sector #100000 is not found in _fat");

    bad = file;
    setU32(bad, fatEntryOffset(bad, dirSector), dirSector);
    EXPECT_EQ(openFailure(bad), "loadDir: error in fat [1]");

    bad = file;  // a two-sector loop through a data sector
    setU32(bad, fatEntryOffset(bad, dirSector), 0);
    setU32(bad, fatEntryOffset(bad, 0), dirSector);
    EXPECT_EQ(openFailure(bad), "loadDir: error in fat [1]");

    bad = file;
    const uint32_t beyond = sectorCount(file) + 3;
    setU32(bad, 48, beyond);
    setU32(bad, fatEntryOffset(bad, beyond), EndOfChain);
    EXPECT_EQ(openFailure(bad), "loadDir: file is corrupt [1]");
}

TEST(CompoundFileWorkbook, StreamNamedBookOrInAnyLetterCaseIsFound)
{
    const std::vector<uint8_t> content = countingBytes(6000);
    std::vector<uint8_t> file = compoundFileWith(content);
    renameEntry(file, 1, u"Book");
    Xls xls;
    xls.open(file.data(), file.size());
    EXPECT_FALSE(xls.encrypted());
    EXPECT_EQ(xls.workbookStreamName(), u"Book");
    EXPECT_EQ(xls.workbookStream(), content);

    renameEntry(file, 1, u"wORKbook");
    xls.open(file.data(), file.size());
    EXPECT_EQ(xls.workbookStream(), content);
}

TEST(CompoundFileWorkbook, EncryptedPackageIsReportedAsEncrypted)
{
    std::vector<uint8_t> file = compoundFileWith(countingBytes(6000));
    renameEntry(file, 1, u"EncryptionInfo");
    Xls xls;
    xls.open(file.data(), file.size());
    EXPECT_TRUE(xls.encrypted());
    EXPECT_EQ(failureOf([&] { xls.workbookStream(); }), "workbook is encrypted");

    renameEntry(file, 1, u"Something");
    EXPECT_EQ(openFailure(file), "Xls::read(): EncryptionInfo section is not found");
}

TEST(CompoundFileWorkbook, BrokenStreamChainsAreRefused)
{
    const std::vector<uint8_t> file = compoundFileWith(countingBytes(6000));
    const size_t entry = dirEntryOffset(file, 1);
    std::vector<uint8_t> bad = file;
    setU32(bad, entry + 116, EndOfChain);
    EXPECT_EQ(openFailure(bad), "Xls::read(): stream is empty");

    bad = file;
    setU32(bad, entry + 116, 100000);
    EXPECT_EQ(openFailure(bad), "Xls::read(): sector is out of fat");

    bad = file;  // sector 5 leads back to sector 2
    setU32(bad, fatEntryOffset(bad, 5), 2);
    EXPECT_EQ(openFailure(bad), "Xls::read(): error in fat");

    bad = file;  // sector 5 leads to a free sector
    setU32(bad, fatEntryOffset(bad, 5), 0xFFFFFFFF);
    EXPECT_EQ(openFailure(bad), "Xls::read(): sector is out of fat");
}

TEST(CompoundFileWorkbook, DeclaredSizeIsBoundedByTheChain)
{
    const std::vector<uint8_t> content = countingBytes(6000);
    std::vector<uint8_t> file = compoundFileWith(content);
    const size_t entry = dirEntryOffset(file, 1);
    setU32(file, entry + 120, 0xFFFFFFF0);  // a size no chain of this file can hold
    Xls xls;
    xls.open(file.data(), file.size());
    ASSERT_EQ(xls.workbookStream().size(), 12u * 512);
    EXPECT_TRUE(std::equal(content.begin(), content.end(), xls.workbookStream().begin()));

    setU32(file, entry + 120, 6000);
    setU32(file, entry + 124, 0xDEADBEEF);  // version 3 ignores the high half
    xls.open(file.data(), file.size());
    EXPECT_EQ(xls.workbookStream(), content);
}

TEST(CompoundFileWorkbook, ChainEndingEarlyGivesTheBytesItHas)
{
    std::vector<uint8_t> file = compoundFileWith(countingBytes(6000));
    setU32(file, fatEntryOffset(file, 3), EndOfChain);
    Xls xls;
    xls.open(file.data(), file.size());
    EXPECT_EQ(xls.workbookStream().size(), 4u * 512);
}

TEST(CompoundFileWorkbook, ShortStreamIsReadFromTheMiniStream)
{
    const std::vector<uint8_t> small = countingBytes(700);
    Xls writer;
    writer.setWorkbookStream(countingBytes(5000));
    writer.addStream(u"Small", small);
    std::vector<uint8_t> file;
    writer.close(file);
    // Make the short stream the workbook stream.
    renameEntry(file, 1, u"Large");
    renameEntry(file, 2, u"Workbook");
    Xls xls;
    xls.open(file.data(), file.size());
    EXPECT_EQ(xls.workbookStream(), small);
}

TEST(CompoundFileWorkbook, MiniStreamLoopIsRefused)
{
    Xls writer;
    writer.setWorkbookStream(countingBytes(5000));
    writer.addStream(u"Small", countingBytes(700));
    std::vector<uint8_t> file;
    writer.close(file);
    renameEntry(file, 1, u"Large");
    renameEntry(file, 2, u"Workbook");
    const uint32_t miniFatSector = getU32(file, 60);
    setU32(file, (miniFatSector + 1) * 512 + 4 * 3, 1);  // mini sector 3 back to 1
    EXPECT_EQ(openFailure(file), "Xls::read(): error in fat");
}

TEST(CompoundFileOpen, FromPathAndFromMemoryAgree)
{
    const std::vector<uint8_t> content = countingBytes(10000);
    const std::vector<uint8_t> file = compoundFileWith(content);
    const std::string path = tempPath("from_path.xls");
    writeFileBytes(path, file);
    Xls fromPath;
    fromPath.open(path);
    Xls fromMemory;
    fromMemory.open(file.data(), file.size());
    EXPECT_EQ(fromPath.workbookStream(), fromMemory.workbookStream());
    EXPECT_EQ(fromPath.workbookStream(), content);
    EXPECT_EQ(failureOf([&] { fromPath.open(tempPath("does_not_exist.xls")); }), "can't open file");
}

TEST(CompoundFileOpen, FailedOpenLeavesNothingBehind)
{
    const std::vector<uint8_t> good = compoundFileWith(countingBytes(5000));
    Xls xls;
    xls.open(good.data(), good.size());
    std::vector<uint8_t> bad = good;
    setU32(bad, 48, 100000);
    EXPECT_THROW(xls.open(bad.data(), bad.size()), qrerror);
    EXPECT_TRUE(xls.directory().empty());
    EXPECT_EQ(failureOf([&] { xls.workbookStream(); }), "Xls::read(): stream is empty");
}

TEST(CompoundFileOpen, RandomCorruptionNeverCrashesOrHangs)
{
    Xls writer;
    writer.setWorkbookStream(countingBytes(9000));
    writer.addStream(u"\x05SummaryInformation", countingBytes(300));
    writer.addStream(u"Big", countingBytes(5000));
    std::vector<uint8_t> file;
    writer.close(file);
    uint32_t seed = 12345;
    auto random = [&] {
        seed = seed * 1103515245u + 12345u;
        return seed >> 8;
    };
    // Corrupt the tables (header, FAT, directory) far more than the data.
    const size_t tablesStart = (size_t{getU32(file, 60)} + 1) * 512;  // mini FAT, FAT, directory
    for (int round = 0; round < 3000; ++round) {
        std::vector<uint8_t> bad = file;
        const int edits = 1 + random() % 4;
        for (int e = 0; e < edits; ++e) {
            size_t at = random() % 3 == 0 ? random() % 512 : tablesStart + random() % (bad.size() - tablesStart);
            if (random() % 2)
                bad[at] = static_cast<uint8_t>(random());
            else if (at + 4 <= bad.size())
                setU32(bad, at & ~size_t{3}, random() % 64);
        }
        if (random() % 8 == 0)
            bad.resize(random() % bad.size());
        try {
            Xls xls;
            xls.open(bad.data(), bad.size());
            if (!xls.encrypted()) {
                EXPECT_LE(xls.workbookStream().size(), bad.size());
            }
            size_t total = 0;
            for (const CompoundStream& s : xls.rootStreams())
                total += s.data.size();
            EXPECT_LE(total, bad.size());
        } catch (const qrerror&) {
        }
    }
}
