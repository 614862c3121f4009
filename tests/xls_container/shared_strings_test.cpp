// The shared string table: reading across CONTINUE records, writing with
// CONTINUE splits and the EXTSST index.

#include <gtest/gtest.h>

#include "test_support.h"
#include "xls/little_endian.h"
#include "xls/shared_strings.h"
#include "xls/strings.h"

using namespace quire::xls;
using namespace quire::xls::test;

namespace {

void appendRecord(std::vector<uint8_t>& stream, uint16_t type, const std::vector<uint8_t>& data)
{
    appendU16(stream, type);
    appendU16(stream, static_cast<uint16_t>(data.size()));
    stream.insert(stream.end(), data.begin(), data.end());
}

SharedStringTable readTable(const std::vector<uint8_t>& stream, size_t* endPosition = nullptr)
{
    RecordReader reader(stream);
    RecordHeader h;
    reader.readHeader(h);
    SharedStringTable table;
    table.read(reader, h);
    if (endPosition)
        *endPosition = reader.position();
    return table;
}

std::u16string tenCharacters(size_t i)
{
    std::u16string s = u"str";
    for (int k = 0; k < 7; ++k) {
        s.push_back(static_cast<char16_t>(u'A' + i % 26));
        i /= 26;
    }
    return s;
}

} // namespace

TEST(SharedStrings, TenThousandStringsRoundTripWithinRecordLimits)
{
    SharedStringTable table;
    for (size_t i = 0; i < 10000; ++i)
        ASSERT_EQ(table.add(tenCharacters(i)), i);
    RecordWriter writer;
    table.write(writer);
    const std::vector<uint8_t>& stream = writer.bytes();

    // Every record stays within 8224 data bytes; the SST goes on in CONTINUE records.
    RecordReader scan(stream);
    Record r;
    std::vector<size_t> recordStarts;
    std::vector<uint16_t> types;
    const uint8_t* extSst = nullptr;
    size_t extSstSize = 0;
    while (scan.next(r)) {
        EXPECT_LE(r.size, MaxRecordData);
        recordStarts.push_back(r.offset);
        types.push_back(r.type);
        if (r.type == RecordType::ExtSst) {
            extSst = r.data;
            extSstSize = r.size;
        }
    }
    ASSERT_GE(types.size(), 3u);
    EXPECT_EQ(types.front(), RecordType::Sst);
    EXPECT_EQ(types.back(), RecordType::ExtSst);
    for (size_t i = 1; i + 1 < types.size(); ++i)
        EXPECT_EQ(types[i], RecordType::Continue);

    size_t end = 0;
    const SharedStringTable back = readTable(stream, &end);
    EXPECT_EQ(end, recordStarts.back());  // left just before EXTSST
    EXPECT_EQ(back.totalReferences(), 10000u);
    ASSERT_EQ(back.size(), 10000u);
    for (size_t i = 0; i < back.size(); ++i)
        ASSERT_EQ(back.at(i).chars, tenCharacters(i)) << i;

    // EXTSST: a bucket per dsst strings, each pointing at its string's cch.
    ASSERT_NE(extSst, nullptr);
    const uint16_t dsst = loadU16(extSst);
    EXPECT_EQ(dsst, extSstBucketSize(10000));
    const size_t buckets = (10000 + dsst - 1) / dsst;
    EXPECT_LE(buckets, 128u);
    EXPECT_EQ(extSstSize, buckets * 8 + 2);
    for (size_t b = 0; b < buckets; ++b) {
        const uint32_t ib = loadU32(extSst + 2 + 8 * b);
        const uint16_t cbOffset = loadU16(extSst + 6 + 8 * b);
        EXPECT_EQ(loadU16(extSst + 8 + 8 * b), 0);
        ASSERT_LT(ib + 2u, stream.size());
        EXPECT_EQ(loadU16(&stream[ib]), tenCharacters(b * dsst).size());
        const size_t recordStart = *(std::upper_bound(recordStarts.begin(), recordStarts.end(), ib) - 1);
        EXPECT_EQ(cbOffset, ib - recordStart) << b;
    }
}

TEST(SharedStrings, StringCutAtARecordBoundaryGoesOnWithItsFlagsByte)
{
    SharedStringTable table;
    table.add(std::u16string(5000, u'x'));  // 10000 bytes of UTF-16
    RecordWriter writer;
    table.write(writer);
    const std::vector<uint8_t>& stream = writer.bytes();
    // 8224 - 8 - 3 = 8213 bytes of room, rounded down to 8212 = 4106 characters.
    ASSERT_EQ(loadU16(&stream[2]), 8223);
    const size_t continueAt = 4 + 8223;
    EXPECT_EQ(loadU16(&stream[continueAt]), RecordType::Continue);
    EXPECT_EQ(stream[continueAt + 4], 1);  // fHighByte of the rest
    EXPECT_EQ(loadU16(&stream[continueAt + 2]), 1 + (5000 - 4106) * 2);
    EXPECT_EQ(readTable(stream).at(0).chars, std::u16string(5000, u'x'));
}

TEST(SharedStrings, ContinuedPartMayChangeCharacterWidth)
{
    // "abc" in one byte per character, then "\u4e2d" in UTF-16 after the CONTINUE.
    std::vector<uint8_t> sst = {2, 0, 0, 0, 2, 0, 0, 0};
    const std::vector<uint8_t> first = {4, 0, 0, 'a', 'b', 'c'};
    sst.insert(sst.end(), first.begin(), first.end());
    std::vector<uint8_t> stream;
    appendRecord(stream, RecordType::Sst, sst);
    appendRecord(stream, RecordType::Continue, {1, 0x2D, 0x4E, 1, 0, 0, 'z'});
    appendRecord(stream, RecordType::ExtSst, {8, 0});
    const SharedStringTable table = readTable(stream);
    ASSERT_EQ(table.size(), 2u);
    EXPECT_EQ(table.at(0).chars, u"abc\u4e2d");
    EXPECT_EQ(table.at(1).chars, u"z");
}

TEST(SharedStrings, RichAndPhoneticDataSurviveARoundTrip)
{
    std::vector<uint8_t> sst = {1, 0, 0, 0, 1, 0, 0, 0};
    const std::vector<uint8_t> head = {3, 0, 0x0C, 2, 0, 5, 0, 0, 0, 'a', 'b', 'c'};  // fRichSt | fExtSt
    sst.insert(sst.end(), head.begin(), head.end());
    sst.insert(sst.end(), {0, 0, 1, 0, 2, 0});  // first run and a half
    std::vector<uint8_t> stream;
    appendRecord(stream, RecordType::Sst, sst);
    appendRecord(stream, RecordType::Continue, {2, 0, 9, 8, 7, 6, 5});
    SharedStringTable table = readTable(stream);
    ASSERT_EQ(table.size(), 1u);
    const SharedString& s = table.at(0);
    EXPECT_EQ(s.chars, u"abc");
    EXPECT_EQ(s.runs, (std::vector<uint8_t>{0, 0, 1, 0, 2, 0, 2, 0}));
    EXPECT_EQ(s.extRst, (std::vector<uint8_t>{9, 8, 7, 6, 5}));

    RecordWriter writer;
    table.write(writer);
    const SharedStringTable back = readTable(writer.bytes());
    EXPECT_EQ(back.at(0).runs, s.runs);
    EXPECT_EQ(back.at(0).extRst, s.extRst);
    EXPECT_EQ(back.at(0).flags & 0x0C, 0x0C);
    // A rich string is never handed out for plain text.
    EXPECT_EQ(table.add(u"abc"), 1u);
}

TEST(SharedStrings, AddingReusesEqualStringsAndCountsReferences)
{
    SharedStringTable table;
    EXPECT_EQ(table.add(u"one"), 0u);
    EXPECT_EQ(table.add(u"two"), 1u);
    EXPECT_EQ(table.add(u"one"), 0u);
    EXPECT_EQ(table.size(), 2u);
    EXPECT_EQ(table.totalReferences(), 3u);
    EXPECT_TRUE(table.at(0).flags & StringFlags::HighByte);
    EXPECT_EQ(failureOf([&] { table.at(2); }), "StrMap: sst is out of range (2)");
}

TEST(SharedStrings, MalformedTablesFailOrStopWithinTheirRecords)
{
    std::vector<uint8_t> stream;
    appendRecord(stream, RecordType::Sst, {1, 0, 0, 0});
    EXPECT_EQ(failureOf([&] { readTable(stream); }), "SST size is incorrect");

    // cstUnique far beyond what the records hold: the table ends with them.
    stream.clear();
    appendRecord(stream, RecordType::Sst, {1, 0, 0, 0, 0xFF, 0xFF, 0xFF, 0xFF, 1, 0, 0, 'q'});
    appendRecord(stream, RecordType::Eof, {});
    size_t end = 0;
    const SharedStringTable table = readTable(stream, &end);
    EXPECT_EQ(table.size(), 1u);
    EXPECT_EQ(end, stream.size() - 4);

    // A phonetic block longer than the stream fails without allocating it.
    stream.clear();
    appendRecord(stream, RecordType::Sst, {1, 0, 0, 0, 1, 0, 0, 0, 1, 0, 0x04, 0xFF, 0xFF, 0xFF, 0x7F, 'q'});
    EXPECT_EQ(failureOf([&] { readTable(stream); }), "readWithContinueRecords: CONTINUE record not found");

    // A string cut by a record that is not CONTINUE.
    stream.clear();
    appendRecord(stream, RecordType::Sst, {1, 0, 0, 0, 1, 0, 0, 0, 5, 0, 0, 'a'});
    appendRecord(stream, RecordType::Eof, {});
    EXPECT_EQ(failureOf([&] { readTable(stream); }), "error in XLUnicodeString record #1");
}
