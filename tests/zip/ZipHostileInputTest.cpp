// Damaged and hostile archives fail with a code, within bounded memory.
#include "ZipArchive.h"
#include "ZipError.h"
#include "ZipException.h"
#include "ZipMemFile.h"
#include "ZipReader.h"
#include "ZipTestSupport.h"
#include "ZipWriter.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <random>

using namespace ziptest;
using quire::zip::CZipArchive;
using quire::zip::CZipException;
using quire::zip::CZipMemFile;
using quire::zip::ZipError;
using quire::zip::ZipReader;
using quire::zip::ZipWriter;

namespace {

std::string buildArchive(const std::vector<std::pair<std::string, std::string>>& entries)
{
    ZipWriter writer;
    writer.createInMemory();
    for (const auto& [name, data] : entries)
        writer.add(name, data.data(), data.size());
    writer.close();
    const auto buffer = writer.takeBuffer();
    return std::string(reinterpret_cast<const char*>(buffer.data()), buffer.size());
}

std::string sampleArchive()
{
    return buildArchive({{"xl/workbook.xml", sampleText(41, 100000)},
                         {"stored.bin", "abc"},
                         {"xl/styles.xml", sampleText(42, 3000)}});
}

std::uint32_t le(const std::string& data, std::size_t pos, int bytes)
{
    std::uint32_t value = 0;
    for (int i = bytes - 1; i >= 0; --i)
        value = (value << 8) | static_cast<unsigned char>(data[pos + static_cast<std::size_t>(i)]);
    return value;
}

void setLe(std::string& data, std::size_t pos, int bytes, std::uint32_t value)
{
    for (int i = 0; i < bytes; ++i)
        data[pos + static_cast<std::size_t>(i)] = static_cast<char>((value >> (8 * i)) & 0xFF);
}

std::size_t endRecord(const std::string& archive)
{
    return archive.size() - 22;
}

std::size_t centralRecord(const std::string& archive, std::size_t index)
{
    std::size_t pos = le(archive, endRecord(archive) + 16, 4);
    for (std::size_t i = 0; i < index; ++i)
        pos += 46 + le(archive, pos + 28, 2) + le(archive, pos + 30, 2) + le(archive, pos + 32, 2);
    return pos;
}

// Field offsets inside a central directory record.
constexpr std::size_t centralFlags = 8, centralMethod = 10, centralCrc = 16, centralCompressed = 20,
                      centralUncompressed = 24, centralLocalOffset = 42;

int openCode(const std::string& archive)
{
    try {
        ZipReader reader;
        reader.open(archive.data(), archive.size());
    } catch (const CZipException& error) {
        return error.code();
    }
    return 0;
}

int extractCode(const std::string& archive, std::size_t index)
{
    try {
        ZipReader reader;
        reader.open(archive.data(), archive.size());
        reader.extract(index);
    } catch (const CZipException& error) {
        return error.code();
    }
    return 0;
}

bool isCorruptionCode(int code)
{
    return code == CZipException::badZipFile || code == CZipException::badCrc || (code >= 500 && code <= 507) ||
           (code >= 600 && code <= 609);
}

} // namespace

TEST(ZipTruncated, EveryTruncationFailsWithCentralDirectoryNotFound)
{
    const std::string archive = sampleArchive();
    for (std::size_t length = 4; length < archive.size(); ++length)
        ASSERT_EQ(openCode(archive.substr(0, length)), CZipException::cdirNotFound) << length;
}

TEST(ZipTruncated, TruncatedFileOnDiskNamesTheFile)
{
    TempDir dir;
    const std::string archive = sampleArchive();
    writeFile(dir.file("cut.xlsx"), archive.substr(0, archive.size() / 2));
    try {
        ZipReader reader;
        reader.open(dir.file("cut.xlsx"));
        FAIL() << "a truncated archive opened";
    } catch (const CZipException& error) {
        EXPECT_EQ(error.code(), CZipException::cdirNotFound);
        EXPECT_EQ(error.fileName(), dir.file("cut.xlsx"));
    }
}

TEST(ZipNotAnArchive, TextEmptyAndTinyInputsAreNotArchives)
{
    EXPECT_EQ(openCode(""), CZipException::badZipFile);
    EXPECT_EQ(openCode("PK"), CZipException::badZipFile);
    EXPECT_EQ(openCode(sampleText(1, 5000)), CZipException::badZipFile);
    EXPECT_EQ(openCode(randomBytes(2, 100000)), CZipException::badZipFile);
}

TEST(ZipNotAnArchive, MissingFileIsASystemError)
{
    try {
        ZipReader reader;
        reader.open("/nonexistent/book.xlsx");
        FAIL();
    } catch (const CZipException& error) {
        EXPECT_EQ(error.code(), ENOENT);
    }
    try {
        ZipReader reader;
        reader.open("/tmp");
        FAIL();
    } catch (const CZipException& error) {
        EXPECT_EQ(error.code(), EISDIR);
    }
}

TEST(ZipCorruptData, FlippedDeflateBytesAreDetected)
{
    const std::string archive = sampleArchive();
    const std::size_t dataStart = 30 + std::string("xl/workbook.xml").size();
    const std::size_t dataSize = le(archive, centralRecord(archive, 0) + centralCompressed, 4);
    for (std::size_t offset = 0; offset < dataSize; offset += dataSize / 50 + 1) {
        std::string damaged = archive;
        damaged[dataStart + offset] = static_cast<char>(damaged[dataStart + offset] ^ 0x5A);
        const int code = extractCode(damaged, 0);
        EXPECT_TRUE(isCorruptionCode(code)) << "offset " << offset << " gave " << code;
    }
}

TEST(ZipCorruptData, StoredDataWithWrongCrcIsMismatched)
{
    std::string archive = sampleArchive();
    const std::size_t local = le(archive, centralRecord(archive, 1) + centralLocalOffset, 4);
    archive[local + 30 + std::string("stored.bin").size()] = 'X';
    EXPECT_EQ(extractCode(archive, 1), CZipException::badCrc);
}

TEST(ZipCorruptData, WrongCrcInTheDirectoryIsMismatched)
{
    std::string archive = sampleArchive();
    const std::size_t record = centralRecord(archive, 0);
    setLe(archive, record + centralCrc, 4, le(archive, record + centralCrc, 4) ^ 1);
    EXPECT_EQ(extractCode(archive, 0), CZipException::badCrc);
}

TEST(ZipCorruptData, DataShorterThanDeclaredIsMismatched)
{
    const std::string text = sampleText(43, 5000);
    std::string archive = buildArchive({{"a.xml", text}});
    setLe(archive, centralRecord(archive, 0) + centralUncompressed, 4, 6000);
    EXPECT_EQ(extractCode(archive, 0), CZipException::badCrc);
}

TEST(ZipSizeLimits, InflatingBeyondTheDeclaredSizeStopsAtIt)
{
    std::string archive = sampleArchive();
    setLe(archive, centralRecord(archive, 0) + centralUncompressed, 4, 1000);
    CZipMemFile storage;
    storage.attachReadOnly(archive.data(), archive.size());
    CZipArchive zip;
    zip.open(storage, CZipArchive::openReadOnly);
    CZipMemFile sink;
    try {
        zip.extractFile(0, sink);
        FAIL() << "an entry inflated beyond its declared size";
    } catch (const CZipException& error) {
        EXPECT_EQ(error.code(), CZipException::badZipFile);
    }
    EXPECT_LE(sink.length(), 1000u);
    EXPECT_EQ(extractCode(archive, 0), CZipException::badZipFile);
}

TEST(ZipSizeLimits, DeclaredSizeBeyondDeflateRatioIsRefusedBeforeWork)
{
    std::string archive = sampleArchive();
    const std::size_t record = centralRecord(archive, 2);
    const std::uint32_t compressed = le(archive, record + centralCompressed, 4);
    setLe(archive, record + centralUncompressed, 4, compressed * 1032 + 4096 + 1);
    CZipMemFile storage;
    storage.attachReadOnly(archive.data(), archive.size());
    CZipArchive zip;
    zip.open(storage, CZipArchive::openReadOnly);
    CZipMemFile sink;
    try {
        zip.extractFile(2, sink);
        FAIL() << "an impossible declared size was accepted";
    } catch (const CZipException& error) {
        EXPECT_EQ(error.code(), CZipException::tooBigSize);
    }
    EXPECT_EQ(sink.length(), 0u);

    ZipReader reader;
    reader.setMaxEntrySize(UINT64_MAX);
    reader.open(archive.data(), archive.size());
    try {
        reader.extract(2);
        FAIL();
    } catch (const CZipException& error) {
        EXPECT_STREQ(error.what(), "The file size is too large to be supported.");
    }
}

TEST(ZipSizeLimits, SaturatedSizeWithoutZip64IsAnIncorrectFileSize)
{
    std::string archive = sampleArchive();
    setLe(archive, centralRecord(archive, 0) + centralUncompressed, 4, 0xFFFFFFFF);
    ZipReader reader;
    reader.open(archive.data(), archive.size());
    try {
        reader.extract(0);
        FAIL();
    } catch (const ZipError& error) {
        EXPECT_STREQ(error.what(), "incorrect file size in archive");
    }
}

TEST(ZipSizeLimits, EntryLargerThanTheMemoryCeilingIsNotExtractedToMemory)
{
    TempDir dir;
    const std::string zeros(20u << 20, '\0');   // a 20 MiB entry that deflates to ~20 KiB
    const std::string archive = buildArchive({{"zeros.bin", zeros}});
    ASSERT_LT(archive.size(), 100000u);
    ZipReader reader;
    reader.open(archive.data(), archive.size());
    EXPECT_EQ(reader.maxEntrySize(), 1u << 30);
    reader.setMaxEntrySize(1u << 20);
    try {
        reader.extract(0);
        FAIL();
    } catch (const CZipException& error) {
        EXPECT_EQ(error.code(), CZipException::tooBigSize);
    }
    EXPECT_THROW(reader.extractBuffer(0), CZipException);
    // Streaming to a file is bounded by the header, not by memory.
    reader.extractToFile(0, dir.file("zeros.bin"));
    EXPECT_EQ(std::filesystem::file_size(dir.file("zeros.bin")), zeros.size());
}

TEST(ZipSizeLimits, Bzip2IsNotHeldToTheDeflateRatio)
{
    TempDir dir;
    const CommandResult made = runPython(dir, R"(
import sys, zipfile
with zipfile.ZipFile(sys.argv[1], 'w', zipfile.ZIP_BZIP2) as z:
    z.writestr('zeros.bin', bytes(20 << 20))
)", {dir.file("bz.zip")});
    ASSERT_EQ(made.exitCode, 0) << made.output;
    std::string archive = readFile(dir.file("bz.zip"));
    ASSERT_LT(archive.size(), 1000u);   // far beyond 1032:1
    {
        ZipReader reader;
        reader.open(archive.data(), archive.size());
        EXPECT_EQ(reader.extract(0), std::string(20u << 20, '\0'));
    }
    // A false size claim costs only the memory the data really fills.
    setLe(archive, centralRecord(archive, 0) + centralUncompressed, 4, 900u << 20);
    EXPECT_EQ(extractCode(archive, 0), CZipException::badCrc);
}

TEST(ZipDirectoryDamage, AbsurdEntryCountIsRefused)
{
    std::string archive = sampleArchive();
    setLe(archive, endRecord(archive) + 8, 2, 0xFFFE);
    setLe(archive, endRecord(archive) + 10, 2, 0xFFFE);
    EXPECT_EQ(openCode(archive), CZipException::badZipFile);
}

TEST(ZipDirectoryDamage, DirectoryOutsideTheArchiveIsRefused)
{
    std::string archive = sampleArchive();
    setLe(archive, endRecord(archive) + 16, 4, 0x7FFFFFF0);
    EXPECT_EQ(openCode(archive), CZipException::badZipFile);
    archive = sampleArchive();
    setLe(archive, endRecord(archive) + 12, 4, 0x7FFFFFF0);
    EXPECT_EQ(openCode(archive), CZipException::badZipFile);
}

TEST(ZipDirectoryDamage, LocalHeaderOutsideTheArchiveIsRefused)
{
    std::string archive = sampleArchive();
    setLe(archive, centralRecord(archive, 1) + centralLocalOffset, 4, 0x7FFFFFF0);
    EXPECT_EQ(openCode(archive), CZipException::badZipFile);
}

TEST(ZipDirectoryDamage, LocalHeaderWithoutSignatureIsRefused)
{
    std::string archive = sampleArchive();
    const std::size_t local = le(archive, centralRecord(archive, 2) + centralLocalOffset, 4);
    archive[local] = 'X';
    EXPECT_EQ(extractCode(archive, 2), CZipException::badZipFile);
    EXPECT_EQ(extractCode(archive, 0), 0);   // the other entries stay readable
}

TEST(ZipDirectoryDamage, EntriesSharingTheirDataAreRefused)
{
    std::string archive = sampleArchive();
    setLe(archive, centralRecord(archive, 2) + centralLocalOffset, 4, 0);
    setLe(archive, centralRecord(archive, 2) + centralCompressed, 4, le(archive, centralRecord(archive, 0) + centralCompressed, 4));
    EXPECT_EQ(openCode(archive), CZipException::badZipFile);
}

TEST(ZipUnsupported, EncryptionAndUnknownMethodsAreRefused)
{
    std::string archive = sampleArchive();
    setLe(archive, centralRecord(archive, 0) + centralFlags, 2, 1);
    EXPECT_EQ(extractCode(archive, 0), CZipException::badPassword);

    archive = sampleArchive();
    setLe(archive, centralRecord(archive, 0) + centralMethod, 2, 99);
    EXPECT_EQ(extractCode(archive, 0), CZipException::aesNotEnabled);

    archive = sampleArchive();
    setLe(archive, centralRecord(archive, 0) + centralMethod, 2, 14);
    EXPECT_EQ(extractCode(archive, 0), CZipException::badZipFile);
}

TEST(ZipUnsupported, InfoZipEncryptedEntryIsRefused)
{
    if (!haveProgram("zip"))
        GTEST_SKIP() << "Info-ZIP zip is not installed";
    TempDir dir;
    writeFile(dir.file("secret.txt"), sampleText(44, 1000));
    const CommandResult made = run("cd " + quote(dir.path()) + " && zip -q -P password secret.zip secret.txt");
    ASSERT_EQ(made.exitCode, 0) << made.output;
    ZipReader reader;
    reader.open(dir.file("secret.zip"));
    EXPECT_TRUE(reader.entryInfo(0).isEncrypted());
    try {
        reader.extract(0);
        FAIL();
    } catch (const CZipException& error) {
        EXPECT_EQ(error.code(), CZipException::badPassword);
    }
}

TEST(ZipZip64Damage, MisplacedZip64EndRecordIsReported)
{
    TempDir dir;
    const CommandResult made = runPython(dir, R"(
import sys, zipfile
zipfile.ZIP64_LIMIT = 1
zipfile.ZIP_FILECOUNT_LIMIT = 1
with zipfile.ZipFile(sys.argv[1], 'w', zipfile.ZIP_DEFLATED) as z:
    z.writestr('a.xml', '<a>' * 100)
    z.writestr('b.xml', '<b>' * 100)
)", {dir.file("z64.zip")});
    ASSERT_EQ(made.exitCode, 0) << made.output;
    const std::string archive = readFile(dir.file("z64.zip"));
    ASSERT_EQ(openCode(archive), 0);
    const std::size_t locator = endRecord(archive) - 20;
    ASSERT_EQ(le(archive, locator, 4), 0x07064B50u);

    std::string lost = archive;
    lost[le(archive, locator + 8, 4)] = 'X';   // the Zip64 end record's signature
    EXPECT_EQ(openCode(lost), CZipException::noZip64);

    std::string pointedAway = archive;
    setLe(pointedAway, locator + 8, 4, 3);
    EXPECT_EQ(openCode(pointedAway), CZipException::badZip64Offset);   // still found just before the locator

    EXPECT_EQ(openCode(randomBytes(45, 64) + archive), CZipException::badZip64Offset);
}

TEST(ZipFuzz, RandomDamageNeverCrashesOrExhaustsMemory)
{
    const std::string original = sampleArchive();
    std::mt19937 engine(20240601);
    int failures = 0;
    for (int round = 0; round < 3000; ++round) {
        std::string damaged = original;
        const int changes = 1 + static_cast<int>(engine() % 8);
        for (int i = 0; i < changes; ++i) {
            // Aim half the damage at the directory and headers, where the structure is.
            const std::size_t pos = (engine() % 2) ? engine() % damaged.size()
                                                   : damaged.size() - 1 - engine() % std::min<std::size_t>(300, damaged.size());
            damaged[pos] = static_cast<char>(engine() & 0xFF);
        }
        if (engine() % 10 == 0)
            damaged.resize(engine() % damaged.size());
        try {
            ZipReader reader;
            reader.setMaxEntrySize(1u << 24);
            reader.open(damaged.data(), damaged.size());
            for (std::size_t i = 0; i < reader.entryCount(); ++i) {
                try {
                    reader.extract(i);
                } catch (const CZipException&) {
                    ++failures;
                } catch (const ZipError&) {
                    ++failures;
                }
            }
        } catch (const CZipException&) {
            ++failures;
        }
    }
    EXPECT_GT(failures, 1000);
}
