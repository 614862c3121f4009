// Archives we write, judged by python's zipfile (testzip, names, bytes and
// methods) and by unzip -t, in files and in memory; then read back by us.
#include "ZipException.h"
#include "ZipReader.h"
#include "ZipTestSupport.h"
#include "ZipWriter.h"

#include <gtest/gtest.h>

#include <filesystem>

using namespace ziptest;
using quire::zip::CZipException;
using quire::zip::ZipBuffer;
using quire::zip::ZipReader;
using quire::zip::ZipWriter;

namespace {

using EntryList = std::vector<std::pair<std::string, std::string>>;   // in archive order

const char* const pythonChecker = R"(
import os, sys, zipfile
archive, expected = sys.argv[1:3]
names = open(os.path.join(expected, 'names'), 'rb').read().decode('utf-8')
names = names.split('\n') if names else []
with zipfile.ZipFile(archive) as z:
    bad = z.testzip()
    if bad is not None:
        sys.exit('testzip failed on ' + bad)
    if z.namelist() != names:
        sys.exit('names differ: %r' % z.namelist())
    for i, info in enumerate(z.infolist()):
        data = open(os.path.join(expected, str(i)), 'rb').read()
        if z.read(info) != data:
            sys.exit('content differs: ' + info.filename)
        want = zipfile.ZIP_STORED if len(data) < 5 else zipfile.ZIP_DEFLATED
        if info.compress_type != want:
            sys.exit('method %d for %s' % (info.compress_type, info.filename))
print('OK')
)";

EntryList workbookLikeEntries()
{
    return {
        {"[Content_Types].xml", sampleText(11, 2000)},
        {"_rels/.rels", sampleText(12, 600)},
        {"xl/workbook.xml", sampleText(13, 100000)},
        {"xl/media/image1.png", randomBytes(14, 300000)},
        {"empty", ""},
        {"tiny", "1234"},
        {"five", "12345"},
        {"xl/worksheets/sheet1.xml", sampleText(15, 3000000)},
        {"donn\xC3\xA9" "es/\xC3\xA9t\xC3\xA9.xml", sampleText(16, 100)},
    };
}

void writeExpectation(const TempDir& dir, const EntryList& entries)
{
    std::filesystem::create_directories(dir.file("expected"));
    std::string names;
    for (std::size_t i = 0; i < entries.size(); ++i) {
        names += (i ? "\n" : "") + entries[i].first;
        writeFile(dir.file("expected/" + std::to_string(i)), entries[i].second);
    }
    writeFile(dir.file("expected/names"), names);
}

void expectOutsideProgramsAccept(const TempDir& dir, const std::string& archive, const EntryList& entries)
{
    writeExpectation(dir, entries);
    const CommandResult checked = runPython(dir, pythonChecker, {archive, dir.file("expected")});
    EXPECT_EQ(checked.exitCode, 0) << checked.output;
    EXPECT_EQ(checked.output, "OK\n");
    if (haveProgram("unzip")) {
        const CommandResult tested = run("unzip -t -qq " + quote(archive));
        EXPECT_EQ(tested.exitCode, 0) << tested.output;
    }
}

void expectWeReadBack(ZipReader& reader, const EntryList& entries)
{
    ASSERT_EQ(reader.entryCount(), entries.size());
    for (std::size_t i = 0; i < entries.size(); ++i) {
        EXPECT_EQ(reader.entryNameUtf8(i), entries[i].first);
        EXPECT_TRUE(reader.extract(i) == entries[i].second) << entries[i].first;
        EXPECT_EQ(reader.entryInfo(i).method, entries[i].second.size() < 5 ? 0 : 8) << entries[i].first;
    }
}

} // namespace

TEST(ZipWriteToFile, OutsideProgramsAcceptIt)
{
    TempDir dir;
    const EntryList entries = workbookLikeEntries();
    ZipWriter writer;
    writer.create(dir.file("out.zip"));
    for (const auto& [name, data] : entries)
        writer.add(name, data.data(), data.size());
    writer.close();
    expectOutsideProgramsAccept(dir, dir.file("out.zip"), entries);

    ZipReader reader;
    reader.open(dir.file("out.zip"));
    expectWeReadBack(reader, entries);
}

TEST(ZipWriteToMemory, OutsideProgramsAcceptIt)
{
    TempDir dir;
    const EntryList entries = workbookLikeEntries();
    ZipWriter writer;
    writer.createInMemory();
    for (const auto& [name, data] : entries)
        writer.add(name, data.data(), data.size());
    writer.close();
    ZipBuffer archive = writer.takeBuffer();
    ASSERT_GT(archive.size(), 0u);
    writeFile(dir.file("mem.zip"), std::string(reinterpret_cast<const char*>(archive.data()), archive.size()));
    expectOutsideProgramsAccept(dir, dir.file("mem.zip"), entries);

    // The memory reader uses the buffer in place and leaves it intact.
    const std::string before(reinterpret_cast<const char*>(archive.data()), archive.size());
    {
        ZipReader reader;
        reader.open(archive.data(), archive.size());
        expectWeReadBack(reader, entries);
        reader.close();
    }
    EXPECT_TRUE(before == std::string(reinterpret_cast<const char*>(archive.data()), archive.size()));
}

TEST(ZipWriteToMemory, TakingTheBufferLeavesTheWriterEmpty)
{
    ZipWriter writer;
    writer.createInMemory();
    writer.add("a.xml", "<a/>!", 5);
    EXPECT_THROW(writer.takeBuffer(), CZipException);   // still open
    writer.close();
    ZipBuffer first = writer.takeBuffer();
    EXPECT_GT(first.size(), 0u);
    ZipBuffer second = writer.takeBuffer();
    EXPECT_EQ(second.size(), 0u);
}

TEST(ZipWriteEntries, AddFromDiskFile)
{
    TempDir dir;
    const std::string part = sampleText(21, 250000);
    writeFile(dir.file("part.xml"), part);
    ZipWriter writer;
    writer.create(dir.file("out.zip"));
    writer.addFile("xl/worksheets/sheet1.xml", dir.file("part.xml"));
    writer.addFile("small", (writeFile(dir.file("small"), "ab"), dir.file("small")));
    writer.close();
    expectOutsideProgramsAccept(dir, dir.file("out.zip"), {{"xl/worksheets/sheet1.xml", part}, {"small", "ab"}});
}

TEST(ZipWriteEntries, WideNamesAreStoredAsFlaggedUtf8)
{
    ZipWriter writer;
    writer.createInMemory();
    writer.add(std::wstring(L"\u00e9t\u00e9/\u65e5\u672c.xml"), "hello", 5);
    writer.add(std::wstring(L"plain.xml"), "hello", 5);
    writer.close();
    ZipBuffer archive = writer.takeBuffer();
    ZipReader reader;
    reader.open(archive.data(), archive.size());
    EXPECT_EQ(reader.entryName(0), L"\u00e9t\u00e9/\u65e5\u672c.xml");
    EXPECT_NE(reader.entryInfo(0).flags() & 0x0800, 0);
    EXPECT_EQ(reader.entryInfo(1).flags() & 0x0800, 0);
    EXPECT_EQ(reader.find(std::wstring(L"PLAIN.XML"), false), 1u);
    EXPECT_EQ(reader.find(std::wstring(L"PLAIN.XML")), ZipReader::npos);
}

TEST(ZipWriteEntries, AFailedAddLeavesAValidArchive)
{
    TempDir dir;
    ZipWriter writer;
    writer.create(dir.file("out.zip"));
    writer.add("first.xml", "<first/>", 8);
    try {
        writer.addFile("missing.xml", dir.file("no-such-file"));
        FAIL() << "adding a missing file succeeded";
    } catch (const CZipException& error) {
        EXPECT_EQ(error.code(), ENOENT);
        EXPECT_NE(std::string(error.what()).find("no-such-file"), std::string::npos);
    }
    EXPECT_THROW(writer.add("", "x", 1), CZipException);
    writer.add("second.xml", "<second/>", 9);
    writer.close();
    expectOutsideProgramsAccept(dir, dir.file("out.zip"), {{"first.xml", "<first/>"}, {"second.xml", "<second/>"}});
}

TEST(ZipWriteEntries, AnEmptyArchiveIsValid)
{
    TempDir dir;
    ZipWriter writer;
    writer.create(dir.file("empty.zip"));
    writer.close();
    EXPECT_EQ(std::filesystem::file_size(dir.file("empty.zip")), 22u);
    const CommandResult checked = runPython(dir, "import zipfile,sys\nprint(len(zipfile.ZipFile(sys.argv[1]).namelist()))\n",
                                            {dir.file("empty.zip")});
    EXPECT_EQ(checked.output, "0\n");
    ZipReader reader;
    reader.open(dir.file("empty.zip"));
    EXPECT_EQ(reader.entryCount(), 0u);
}

TEST(ZipWriteEntries, AnAbandonedWriterRemovesItsIncompleteFile)
{
    TempDir dir;
    {
        ZipWriter writer;
        writer.create(dir.file("partial.zip"));
        writer.add("a.xml", "<a/>..", 6);
    }
    EXPECT_FALSE(std::filesystem::exists(dir.file("partial.zip")));
}

TEST(ZipWriteEntries, CreatingInAMissingFolderNamesTheFile)
{
    ZipWriter writer;
    try {
        writer.create("/nonexistent-folder/out.xlsx");
        FAIL() << "created a file in a missing folder";
    } catch (const CZipException& error) {
        EXPECT_EQ(error.code(), ENOENT);
        EXPECT_STREQ(error.what(), "No such file or directory. (/nonexistent-folder/out.xlsx).");
    }
}

TEST(ZipWriteZip64, MoreThan65535EntriesGetZip64EndRecords)
{
    TempDir dir;
    constexpr std::size_t count = 70000;
    ZipWriter writer;
    writer.create(dir.file("many.zip"));
    for (std::size_t i = 0; i < count; ++i) {
        const std::string data = "entry " + std::to_string(i);
        writer.add("e/" + std::to_string(i), data.data(), data.size());
    }
    writer.close();
    const CommandResult checked = runPython(dir, R"(
import sys, zipfile
with zipfile.ZipFile(sys.argv[1]) as z:
    names = z.namelist()
    assert len(names) == 70000, len(names)
    assert z.testzip() is None
    assert z.read('e/69999') == b'entry 69999'
print('OK')
)", {dir.file("many.zip")});
    EXPECT_EQ(checked.output, "OK\n");
    if (haveProgram("unzip")) {
        const CommandResult tested = run("unzip -t -qq " + quote(dir.file("many.zip")));
        EXPECT_EQ(tested.exitCode, 0) << tested.output.substr(0, 2000);
    }
    ZipReader reader;
    reader.open(dir.file("many.zip"));
    ASSERT_EQ(reader.entryCount(), count);
    EXPECT_TRUE(reader.archive().centralDir().isZip64());
    EXPECT_EQ(reader.extract(reader.find("e/12345")), "entry 12345");
}

TEST(ZipReadBack, ExtractToFileAndToTemporaryFile)
{
    TempDir dir;
    const std::string data = sampleText(31, 123456);
    ZipWriter writer;
    writer.createInMemory();
    writer.add("part.xml", data.data(), data.size());
    writer.add("empty.xml", "", 0);
    writer.close();
    ZipBuffer archive = writer.takeBuffer();

    ZipReader reader;
    reader.open(archive.data(), archive.size());
    reader.extractToFile(0, dir.file("part.xml"));
    EXPECT_TRUE(readFile(dir.file("part.xml")) == data);
    const std::string temporary = reader.extractToTempFile(0);
    EXPECT_TRUE(readFile(temporary) == data);
    std::filesystem::remove(temporary);
    EXPECT_EQ(reader.extract(1), "");
    EXPECT_TRUE(reader.extractBytes(1).empty());
    quire::zip::ZipBuffer bytes = reader.extractBuffer(0);
    EXPECT_TRUE(std::string(reinterpret_cast<const char*>(bytes.data()), bytes.size()) == data);
}

TEST(ZipReadBack, AFailedExtractionLeavesNoFile)
{
    TempDir dir;
    const std::string data = sampleText(32, 50000);
    ZipWriter writer;
    writer.createInMemory();
    writer.add("part.xml", data.data(), data.size());
    writer.close();
    ZipBuffer archive = writer.takeBuffer();
    archive.data()[archive.size() - 22 - 46 - 8 + 16] ^= 0x01;   // the directory's CRC of the only entry

    ZipReader reader;
    reader.open(archive.data(), archive.size());
    try {
        reader.extractToFile(0, dir.file("part.xml"));
        FAIL() << "a damaged entry was extracted";
    } catch (const CZipException& error) {
        EXPECT_EQ(error.code(), CZipException::badCrc);
    }
    EXPECT_FALSE(std::filesystem::exists(dir.file("part.xml")));
}
