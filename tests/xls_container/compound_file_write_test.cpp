// Writing compound files: layout, FAT and DIFAT sizing, directory, further
// streams in the mini stream, and write failures.

#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <map>

#include "test_support.h"
#include "xls/compound_file.h"

using namespace quire::xls;
using namespace quire::xls::test;

namespace {

constexpr uint32_t EndOfChain = 0xFFFFFFFE;

std::vector<uint8_t> patterned(size_t n, uint8_t salt = 0)
{
    std::vector<uint8_t> v(n);
    for (size_t i = 0; i < n; ++i)
        v[i] = static_cast<uint8_t>(i * 13 + salt + (i >> 9));
    return v;
}

Xls reopen(const std::vector<uint8_t>& file)
{
    Xls xls;
    xls.open(file.data(), file.size());
    return xls;
}

} // namespace

TEST(DirEntry, NameIsCheckedAndTheEntryInitialised)
{
    EXPECT_EQ(failureOf([] { DirEntry(nullptr, DirEntry::Stream, 0); }), "DirEntry::DirEntry(): incorrect name");
    const std::u16string longName(32, u'x');
    EXPECT_EQ(failureOf([&] { DirEntry(longName.c_str(), DirEntry::Stream, 0); }),
              "DirEntry::DirEntry(): newName is too big (length must be less 32)");
    const std::u16string fits(31, u'x');
    const DirEntry e(fits.c_str(), DirEntry::Storage, 7);
    EXPECT_EQ(e.nameLength, 64);
    EXPECT_EQ(e.type, DirEntry::Storage);
    EXPECT_EQ(e.colour, DirEntry::Black);
    EXPECT_EQ(e.child, 7u);
    EXPECT_EQ(e.leftSibling, 0xFFFFFFFFu);
    EXPECT_EQ(e.rightSibling, 0xFFFFFFFFu);
    EXPECT_EQ(e.startingSector, EndOfChain);
    EXPECT_EQ(e.streamSize, 0u);
}

TEST(CompoundFileWrite, NewContainerHoldsRootEntryAndWorkbook)
{
    const Xls xls;
    ASSERT_EQ(xls.directory().size(), 2u);
    EXPECT_EQ(xls.directory()[0].nameString(), u"Root Entry");
    EXPECT_EQ(xls.directory()[0].type, DirEntry::Root);
    EXPECT_EQ(xls.directory()[0].child, 1u);
    EXPECT_EQ(xls.directory()[1].nameString(), u"Workbook");
    EXPECT_EQ(xls.directory()[1].type, DirEntry::Stream);
}

TEST(CompoundFileWrite, ShortWorkbookIsPaddedToEightSectorsOutsideTheMiniStream)
{
    const std::vector<uint8_t> content = patterned(100);
    const std::vector<uint8_t> file = compoundFileWith(content);
    // Header fields of a new file.
    EXPECT_EQ(getU32(file, 0), 0xE011CFD0u);
    EXPECT_EQ(file[24] | file[25] << 8, 0x003E);
    EXPECT_EQ(file[26] | file[27] << 8, 3);
    EXPECT_EQ(file[28] | file[29] << 8, 0xFFFE);
    EXPECT_EQ(file[30] | file[31] << 8, 9);
    EXPECT_EQ(file[32] | file[33] << 8, 6);
    EXPECT_EQ(getU32(file, 56), 4096u);
    EXPECT_EQ(getU32(file, 60), EndOfChain);  // no mini FAT
    EXPECT_EQ(getU32(file, 68), EndOfChain);  // no DIFAT sector
    for (uint32_t i = 0; i < 8; ++i)
        EXPECT_EQ(getU32(file, fatEntryOffset(file, i)), i < 7 ? i + 1 : EndOfChain);
    const size_t workbookEntry = dirEntryOffset(file, 1);
    EXPECT_EQ(getU32(file, workbookEntry + 116), 0u);
    EXPECT_EQ(getU32(file, workbookEntry + 120), 4096u);
    EXPECT_EQ(getU32(file, dirEntryOffset(file, 0) + 116), EndOfChain);  // empty mini stream

    Xls xls = reopen(file);
    ASSERT_EQ(xls.workbookStream().size(), 4096u);
    EXPECT_TRUE(std::equal(content.begin(), content.end(), xls.workbookStream().begin()));
    EXPECT_TRUE(std::all_of(xls.workbookStream().begin() + 100, xls.workbookStream().end(),
                            [](uint8_t b) { return b == 0; }));
}

TEST(CompoundFileWrite, StreamsOfEverySizeReadBackUnchanged)
{
    for (size_t size : {size_t{4096}, size_t{4097}, size_t{65536}, size_t{65537}, size_t{1} << 20}) {
        const std::vector<uint8_t> content = patterned(size, static_cast<uint8_t>(size));
        Xls xls = reopen(compoundFileWith(content));
        EXPECT_EQ(xls.workbookStream(), content) << size;
    }
}

TEST(CompoundFileWrite, FurtherStreamsKeepTheirBytesAndShortOnesUseTheMiniStream)
{
    Xls writer;
    writer.setWorkbookStream(patterned(7000));
    const std::vector<uint8_t> summary = patterned(412, 1);
    const std::vector<uint8_t> documentSummary = patterned(4095, 2);
    const std::vector<uint8_t> big = patterned(20000, 3);
    writer.addStream(u"\x05SummaryInformation", summary);
    writer.addStream(u"Big", big);
    writer.addStream(u"\x05DocumentSummaryInformation", documentSummary);
    writer.addStream(u"Empty", {});
    std::vector<uint8_t> file;
    writer.close(file);
    EXPECT_NE(getU32(file, 60), EndOfChain);  // a mini FAT exists
    EXPECT_EQ(getU32(file, 64), 1u);

    Xls xls = reopen(file);
    EXPECT_EQ(xls.workbookStream(), patterned(7000));
    const std::vector<CompoundStream> streams = xls.rootStreams();
    ASSERT_EQ(streams.size(), 4u);
    std::map<std::u16string, std::vector<uint8_t>> byName;
    for (const CompoundStream& s : streams)
        byName[s.name] = s.data;
    EXPECT_EQ(byName[u"\x05SummaryInformation"], summary);
    EXPECT_EQ(byName[u"\x05DocumentSummaryInformation"], documentSummary);
    EXPECT_EQ(byName[u"Big"], big);
    EXPECT_TRUE(byName[u"Empty"].empty());
}

TEST(CompoundFileWrite, StreamNamesMustBeUniqueAndShort)
{
    Xls writer;
    writer.addStream(u"A", {1});
    EXPECT_EQ(failureOf([&] { writer.addStream(u"a", {2}); }), "Xls::addStream(): duplicate stream name");
    EXPECT_EQ(failureOf([&] { writer.addStream(u"WORKBOOK", {2}); }), "Xls::addStream(): duplicate stream name");
    EXPECT_EQ(failureOf([&] { writer.addStream(std::u16string(40, u'n'), {2}); }),
              "DirEntry::DirEntry(): newName is too big (length must be less 32)");
}

namespace {

// Black height of the subtree at 'node', or -1 when it breaks a red-black rule
// or the search order.
int checkTree(const std::vector<DirEntry>& dir, uint32_t node, bool parentRed, const std::u16string* low,
              const std::u16string* high)
{
    if (node == DirEntry::NoStream)
        return 0;
    const DirEntry& e = dir.at(node);
    const std::u16string name = e.nameString();
    auto less = [](const std::u16string& a, const std::u16string& b) {
        return a.size() != b.size() ? a.size() < b.size() : a < b;  // names here are upper-case
    };
    if ((low && !less(*low, name)) || (high && !less(name, *high)))
        return -1;
    const bool red = e.colour == DirEntry::Red;
    if (red && parentRed)
        return -1;
    const int left = checkTree(dir, e.leftSibling, red, low, &name);
    const int right = checkTree(dir, e.rightSibling, red, &name, high);
    if (left < 0 || right < 0 || left != right)
        return -1;
    return left + (red ? 0 : 1);
}

} // namespace

TEST(CompoundFileWrite, DirectoryIsAValidRedBlackTree)
{
    for (int count = 0; count <= 40; ++count) {
        Xls writer;
        writer.setWorkbookStream(patterned(5000));
        for (int i = 0; i < count; ++i) {
            // Upper-case names of varying length, unique by their last two letters.
            std::u16string name = u"S" + std::u16string(static_cast<size_t>(i % 5), u'X');
            name += static_cast<char16_t>(u'A' + i / 26);
            name += static_cast<char16_t>(u'A' + i % 26);
            writer.addStream(name, patterned(static_cast<size_t>(10 * i)));
        }
        std::vector<uint8_t> file;
        writer.close(file);
        Xls xls = reopen(file);
        const std::vector<DirEntry>& dir = xls.directory();
        EXPECT_GE(checkTree(dir, dir[0].child, false, nullptr, nullptr), 1) << count;
        EXPECT_EQ(xls.rootStreams().size(), static_cast<size_t>(count)) << count;
    }
}

namespace {

std::vector<uint8_t> fileWithFatSectors(uint32_t wanted, uint32_t& gotFatSectors)
{
    // With one directory sector, F1 = ceil((workbookSectors + 1) / 128) and
    // the FAT takes F1 + 2 sectors while it is below 128 * 128.
    const size_t workbookSectors = size_t{wanted - 2} * 128 - 1;
    const std::vector<uint8_t> file = compoundFileWith(patterned(workbookSectors * 512));
    gotFatSectors = getU32(file, 44);
    return file;
}

} // namespace

TEST(CompoundFileWrite, DifatSectorIsAddedOnlyPast109FatSectors)
{
    uint32_t fatSectors = 0;
    std::vector<uint8_t> file = fileWithFatSectors(109, fatSectors);
    ASSERT_EQ(fatSectors, 109u);
    EXPECT_EQ(getU32(file, 72), 0u);
    EXPECT_EQ(getU32(file, 68), EndOfChain);
    EXPECT_EQ(reopen(file).workbookStream().size(), (107u * 128 - 1) * 512);

    file = fileWithFatSectors(110, fatSectors);
    ASSERT_EQ(fatSectors, 110u);
    EXPECT_EQ(getU32(file, 72), 1u);
    const uint32_t difatSector = getU32(file, 68);
    const size_t difatOffset = (size_t{difatSector} + 1) * 512;
    EXPECT_EQ(getU32(file, difatOffset + 127 * 4), EndOfChain);
    EXPECT_NE(getU32(file, difatOffset), 0xFFFFFFFFu);       // the 110th FAT sector
    EXPECT_EQ(getU32(file, difatOffset + 4), 0xFFFFFFFFu);   // nothing more
    const std::vector<uint8_t> expected = patterned((108u * 128 - 1) * 512);
    EXPECT_EQ(reopen(file).workbookStream(), expected);
}

TEST(CompoundFileWrite, ManyDifatSectorsAreChained)
{
    // 16 MB: 261 FAT sectors need two DIFAT sectors.
    const std::vector<uint8_t> content = patterned(size_t{16} << 20);
    const std::vector<uint8_t> file = compoundFileWith(content);
    EXPECT_EQ(getU32(file, 44), 261u);
    EXPECT_EQ(getU32(file, 72), 2u);
    EXPECT_EQ(reopen(file).workbookStream(), content);
}

TEST(CompoundFileWrite, OutputGoesToFilesAndFixedBuffers)
{
    Xls writer;
    writer.setWorkbookStream(patterned(5000));
    std::vector<uint8_t> inMemory;
    writer.close(inMemory);

    const std::string path = tempPath("written.xls");
    writer.close(path);
    EXPECT_EQ(readFileBytes(path), inMemory);

    std::vector<uint8_t> buffer(inMemory.size());
    EXPECT_EQ(writer.close(buffer.data(), buffer.size()), inMemory.size());
    EXPECT_EQ(buffer, inMemory);
    EXPECT_EQ(failureOf([&] { writer.close(buffer.data(), buffer.size() - 1); }),
              "stream error, perhaps it's too small writing buffer");
    EXPECT_EQ(failureOf([&] { writer.close(tempPath("no_such_dir/x.xls")); }), "stream error");
}
