// Record framing, the continuation readers and the record writer.

#include <gtest/gtest.h>

#include <chrono>
#include <cstdio>
#include <functional>

#include "test_support.h"
#include "xls/little_endian.h"
#include "xls/record_reader.h"
#include "xls/record_writer.h"

using namespace quire::xls;
using namespace quire::xls::test;

namespace {

void appendRecord(std::vector<uint8_t>& stream, uint16_t type, const std::vector<uint8_t>& data)
{
    appendU16(stream, type);
    appendU16(stream, static_cast<uint16_t>(data.size()));
    stream.insert(stream.end(), data.begin(), data.end());
}

std::vector<uint8_t> bytesOf(std::initializer_list<int> values)
{
    std::vector<uint8_t> v;
    for (int x : values)
        v.push_back(static_cast<uint8_t>(x));
    return v;
}

} // namespace

TEST(RecordFraming, RecordsGiveTypeDataAndStreamOffset)
{
    std::vector<uint8_t> stream;
    appendRecord(stream, 0x0809, bytesOf({1, 2, 3, 4}));
    appendRecord(stream, 0x0042, bytesOf({0xB0, 0x04}));
    appendRecord(stream, 0x000A, {});
    RecordReader reader(stream);
    Record r;
    ASSERT_TRUE(reader.next(r));
    EXPECT_EQ(r.type, 0x0809);
    EXPECT_EQ(r.offset, 0u);
    ASSERT_EQ(r.size, 4u);
    EXPECT_EQ(r.data[3], 4);
    ASSERT_TRUE(reader.next(r));
    EXPECT_EQ(r.type, 0x0042);
    EXPECT_EQ(r.offset, 8u);
    EXPECT_EQ(loadU16(r.data), 1200);
    ASSERT_TRUE(reader.next(r));
    EXPECT_EQ(r.type, RecordType::Eof);
    EXPECT_EQ(r.size, 0u);
    EXPECT_FALSE(reader.next(r));
    EXPECT_TRUE(reader.atEnd());

    reader.seek(8);  // as a BoundSheet8's lbPlyPos does
    ASSERT_TRUE(reader.next(r));
    EXPECT_EQ(r.type, 0x0042);
    EXPECT_EQ(failureOf([&] { reader.seek(stream.size() + 1); }), "read error: position is out of the stream");
}

TEST(RecordFraming, RecordTypeZeroStopsTheRead)
{
    std::vector<uint8_t> stream;
    appendRecord(stream, 0x0809, bytesOf({1, 2}));
    appendRecord(stream, 0x0000, bytesOf({1, 2}));
    RecordReader reader(stream);
    Record r;
    reader.next(r);
    EXPECT_EQ(failureOf([&] { reader.next(r); }), "read error: record id can't be 0");
}

TEST(RecordFraming, LengthsThatLieAreRefused)
{
    std::vector<uint8_t> stream;
    appendRecord(stream, 0x0809, bytesOf({1, 2, 3, 4}));
    setU16(stream, 2, 0xFFFF);
    RecordReader reader(stream);
    Record r;
    EXPECT_EQ(failureOf([&] { reader.next(r); }), "read error: record is truncated");

    std::vector<uint8_t> cut;
    appendRecord(cut, 0x0809, bytesOf({1, 2}));
    cut.push_back(0x0A);  // half a header
    RecordReader reader2(cut);
    ASSERT_TRUE(reader2.next(r));
    EXPECT_EQ(failureOf([&] { reader2.next(r); }), "read error: record is truncated");
}

TEST(RecordFraming, FieldReadsStayInsideTheRecord)
{
    std::vector<uint8_t> stream;
    appendRecord(stream, 0x0055, bytesOf({8, 0}));
    appendRecord(stream, 0x000A, {});
    RecordReader reader(stream);
    RecordHeader h;
    ASSERT_TRUE(reader.readHeader(h));
    size_t remaining = h.length;
    EXPECT_EQ(reader.readUInt16(remaining), 8);
    EXPECT_EQ(failureOf([&] { reader.readUInt8(remaining); }), "read error: record is too short");
}

TEST(RecordFraming, SizeChecksNameTheRecord)
{
    EXPECT_EQ(failureOf([] { checkRecordSize(false, "Window2"); }), "Window2 size is incorrect");
    EXPECT_EQ(failureOf([] { checkRecordSize(true, "Window2"); }), "");
}

TEST(ContinueReaders, ValueSplitAcrossAContinueRecordIsJoined)
{
    std::vector<uint8_t> stream;
    appendRecord(stream, 0x0017, bytesOf({0x44, 0x33}));
    appendRecord(stream, RecordType::Continue, bytesOf({0x22, 0x11, 0xBB}));
    appendRecord(stream, RecordType::Continue, {});
    appendRecord(stream, RecordType::Continue, bytesOf({0xAA, 5, 6}));
    RecordReader reader(stream);
    RecordHeader h;
    reader.readHeader(h);
    size_t remaining = h.length;
    EXPECT_EQ(reader.readInt32(remaining), 0x11223344u);
    EXPECT_EQ(reader.readInt16(remaining), 0xAABB);  // steps over the empty CONTINUE
    uint8_t two[2];
    reader.readWithContinueRecords(two, 2, remaining);
    EXPECT_EQ(two[1], 6);
    EXPECT_EQ(remaining, 0u);
}

TEST(ContinueReaders, MissingContinueRecordIsReportedByEachReader)
{
    std::vector<uint8_t> stream;
    appendRecord(stream, 0x0017, bytesOf({0x44, 0x33, 0x22}));
    appendRecord(stream, 0x000A, {});
    auto failureAfter = [&](size_t skip, const std::function<void(RecordReader&, size_t&)>& read) {
        RecordReader reader(stream);
        RecordHeader h;
        reader.readHeader(h);
        size_t remaining = h.length;
        reader.skip(skip, remaining);
        return failureOf([&] { read(reader, remaining); });
    };
    EXPECT_EQ(failureAfter(0, [](RecordReader& r, size_t& n) { r.readInt32(n); }),
              "readInt32: CONTINUE record not found");
    EXPECT_EQ(failureAfter(2, [](RecordReader& r, size_t& n) { r.readInt16(n); }),
              "readInt16: CONTINUE record not found");
    EXPECT_EQ(failureAfter(0, [](RecordReader& r, size_t& n) {
                  uint8_t b[4];
                  r.readWithContinueRecords(b, 4, n);
              }),
              "readWithContinueRecords: CONTINUE record not found");
    // A count no stream could satisfy fails before anything is allocated.
    EXPECT_EQ(failureAfter(0, [](RecordReader& r, size_t& n) {
                  std::vector<uint8_t> out;
                  r.readWithContinueRecords(out, size_t{1} << 40, n);
              }),
              "readWithContinueRecords: CONTINUE record not found");
}

TEST(ContinueReaders, ZeroTerminatedStringsCrossContinueRecords)
{
    std::vector<uint8_t> stream;
    appendRecord(stream, 0x0017, bytesOf({'a', 0, 'b'}));
    appendRecord(stream, RecordType::Continue, bytesOf({0, 0, 0, 'c', 0}));
    RecordReader reader(stream);
    RecordHeader h;
    reader.readHeader(h);
    size_t remaining = h.length;
    std::u16string s;
    reader.readString(&s, remaining);
    EXPECT_EQ(s, std::u16string(u"ab\0", 3));
    std::u16string t;
    EXPECT_EQ(failureOf([&] { reader.readStringWithoutNull(&t, remaining); }),
              "readWithContinueRecords: CONTINUE record not found");
    EXPECT_EQ(t, u"c");
    EXPECT_EQ(failureOf([&] { reader.readString(nullptr, remaining); }), "Xls::readString(): s == 0");
    EXPECT_EQ(failureOf([&] { reader.readStringWithoutNull(nullptr, remaining); }),
              "Xls::readStringWithoutNull(): s == 0");
}

TEST(ContinueReaders, MergedRecordCarriesAllItsContinueData)
{
    std::vector<uint8_t> stream;
    appendRecord(stream, 0x00EB, bytesOf({1, 2}));
    appendRecord(stream, RecordType::Continue, bytesOf({3}));
    appendRecord(stream, RecordType::Continue, bytesOf({4, 5}));
    appendRecord(stream, 0x000A, {});
    RecordReader reader(stream);
    Record r;
    std::vector<uint8_t> scratch;
    ASSERT_TRUE(reader.nextWithContinues(r, scratch));
    EXPECT_EQ(r.type, 0x00EB);
    EXPECT_EQ(r.continueCount, 2u);
    EXPECT_EQ(std::vector<uint8_t>(r.data, r.data + r.size), bytesOf({1, 2, 3, 4, 5}));
    ASSERT_TRUE(reader.nextWithContinues(r, scratch));
    EXPECT_EQ(r.type, RecordType::Eof);
}

TEST(RecordWriting, LongDataIsSplitIntoContinueRecords)
{
    std::vector<uint8_t> data(20000);
    for (size_t i = 0; i < data.size(); ++i)
        data[i] = static_cast<uint8_t>(i);
    RecordWriter writer;
    writer.writeRecord(0x00EB, data);
    const std::vector<uint8_t>& out = writer.bytes();
    ASSERT_EQ(out.size(), 20000u + 3 * 4);
    EXPECT_EQ(loadU16(&out[0]), 0x00EB);
    EXPECT_EQ(loadU16(&out[2]), 8224);
    EXPECT_EQ(loadU16(&out[4 + 8224]), RecordType::Continue);
    EXPECT_EQ(loadU16(&out[4 + 8224 + 2]), 8224);
    EXPECT_EQ(loadU16(&out[2 * (4 + 8224) + 2]), 20000 - 2 * 8224);

    RecordReader reader(out);
    Record r;
    std::vector<uint8_t> scratch;
    ASSERT_TRUE(reader.nextWithContinues(r, scratch));
    EXPECT_EQ(std::vector<uint8_t>(r.data, r.data + r.size), data);
}

TEST(RecordWriting, PatchedLengthsAndIndivisibleItems)
{
    RecordWriter writer;
    writer.beginRecord(0x0017);  // ExternSheet: a count, then 6-byte XTIs
    writer.writeUInt16(2000);
    for (int i = 0; i < 2000; ++i) {
        writer.reserveRoom(6, "error in record ExternSheet");
        writer.writeUInt16(0);
        writer.writeUInt16(static_cast<uint16_t>(i));
        writer.writeUInt16(static_cast<uint16_t>(i));
    }
    writer.endRecord();
    RecordReader reader(writer.bytes());
    Record r;
    size_t total = 0;
    size_t records = 0;
    while (reader.next(r)) {
        EXPECT_LE(r.size, MaxRecordData);
        if (records > 0) {
            EXPECT_EQ(r.type, RecordType::Continue);
        }
        EXPECT_EQ((records == 0 ? r.size - 2 : r.size) % 6, 0u);  // no XTI is split
        total += r.size;
        ++records;
    }
    EXPECT_EQ(total, 2u + 2000 * 6);
    EXPECT_EQ(records, 2u);

    RecordWriter other;
    other.beginRecord(0x0017);
    EXPECT_EQ(failureOf([&] { other.reserveRoom(9000, "error in record ExternSheet"); }),
              "error in record ExternSheet");
    other.writeBytes(std::vector<uint8_t>(9000));
    EXPECT_EQ(failureOf([&] { other.endRecord(); }), "record is too long");
}

namespace {

bool sanitized()
{
#if defined(__SANITIZE_ADDRESS__)
    return true;
#else
    return false;
#endif
}

} // namespace

TEST(RecordReadingSpeed, LargeStreamIsReadQuickly)
{
    // About 64 MB of cell-sized records, the shape of a big sheet.
    RecordWriter writer;
    std::vector<uint8_t> rk(10, 7);
    const size_t count = (size_t{64} << 20) / 14;
    for (size_t i = 0; i < count; ++i)
        writer.writeRecord(0x027E, rk);
    const std::vector<uint8_t> stream = writer.take();

    const auto start = std::chrono::steady_clock::now();
    RecordReader reader(stream);
    Record r;
    size_t records = 0;
    uint64_t checksum = 0;
    while (reader.next(r)) {
        ++records;
        checksum += r.data[r.size - 1];
    }
    const double seconds = std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
    ASSERT_EQ(records, count);
    EXPECT_EQ(checksum, count * 7);
    const double megabytesPerSecond = static_cast<double>(stream.size()) / (1 << 20) / seconds;
    RecordProperty("MBPerSecond", static_cast<int>(megabytesPerSecond));
    std::printf("record stream: %zu records, %.1f MB in %.3f s (%.0f MB/s)\n", records,
                static_cast<double>(stream.size()) / (1 << 20), seconds, megabytesPerSecond);
    if (!sanitized()) {
        EXPECT_GT(megabytesPerSecond, 200.0);
    }
}
