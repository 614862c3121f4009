#include "xls/shared_strings.h"

#include <algorithm>

#include "api/qrerror.h"
#include "xls/strings.h"

namespace quire::xls {

namespace {

constexpr size_t SstHeadSize = 8;       // cstTotal, cstUnique
constexpr size_t MinRoomForString = 10;  // cch, flags, cRun, cbExtRst never split
constexpr size_t RunSize = 4;
constexpr size_t MaxExtSstBuckets = 128;

} // namespace

uint16_t extSstBucketSize(size_t unique)
{
    const size_t perBucket = (unique + MaxExtSstBuckets - 1) / MaxExtSstBuckets;
    return static_cast<uint16_t>(std::max<size_t>(8, perBucket));
}

void SharedStringTable::clear()
{
    strings_.clear();
    plainIndex_.clear();
    total_ = 0;
}

const SharedString& SharedStringTable::at(size_t index) const
{
    if (index >= strings_.size())
        throw qrerror("StrMap: sst is out of range (2)");
    return strings_[index];
}

void SharedStringTable::append(SharedString&& s)
{
    if (s.plain())
        plainIndex_.emplace(s.chars, static_cast<uint32_t>(strings_.size()));
    strings_.push_back(std::move(s));
}

size_t SharedStringTable::add(const std::u16string& chars)
{
    if (chars.size() > 0xFFFF)
        throw qrerror("string is too long");
    ++total_;
    const auto found = plainIndex_.find(chars);
    if (found != plainIndex_.end())
        return found->second;
    SharedString s;
    s.flags = StringFlags::HighByte;
    s.chars = chars;
    append(std::move(s));
    return strings_.size() - 1;
}

SharedString SharedStringTable::readString(RecordReader& reader, size_t& remaining)
{
    SharedString s;
    const size_t cch = reader.readInt16(remaining);
    reader.readWithContinueRecords(&s.flags, 1, remaining);
    size_t runCount = 0;
    size_t extSize = 0;
    if (s.flags & StringFlags::RichSt)
        runCount = reader.readInt16(remaining);
    if (s.flags & StringFlags::ExtSt)
        extSize = reader.readInt32(remaining);
    readStringCharacters(reader, remaining, cch, (s.flags & StringFlags::HighByte) != 0, true, s.chars);
    reader.readWithContinueRecords(s.runs, runCount * RunSize, remaining);
    reader.readWithContinueRecords(s.extRst, extSize, remaining);
    return s;
}

void SharedStringTable::read(RecordReader& reader, const RecordHeader& header)
{
    clear();
    size_t remaining = header.length;
    checkRecordSize(remaining >= SstHeadSize, "SST");
    total_ = reader.readUInt32(remaining);
    const uint32_t unique = reader.readUInt32(remaining);
    // Every string takes at least 3 bytes, so the stream bounds the count
    // whatever cstUnique claims.
    strings_.reserve(std::min<size_t>(unique, (reader.size() - reader.position()) / 3));
    for (uint32_t i = 0; i < unique; ++i) {
        // Some writers overstate cstUnique: the table ends with its records.
        if (remaining == 0 && !reader.enterContinue(remaining))
            break;
        append(readString(reader, remaining));
    }
    reader.skip(remaining, remaining);
}

void SharedStringTable::write(RecordWriter& writer) const
{
    const uint16_t bucketSize = extSstBucketSize(strings_.size());
    std::vector<uint8_t> extSst;
    appendU16(extSst, bucketSize);

    writer.beginRecord(RecordType::Sst);
    writer.writeUInt32(total_);
    writer.writeUInt32(static_cast<uint32_t>(strings_.size()));
    std::vector<uint8_t> chars;
    for (size_t i = 0; i < strings_.size(); ++i) {
        const SharedString& s = strings_[i];
        if (writer.roomLeft() < MinRoomForString)
            writer.continueRecord();
        if (i % bucketSize == 0) {
            appendU32(extSst, static_cast<uint32_t>(writer.position()));
            appendU16(extSst, static_cast<uint16_t>(writer.position() - writer.recordStart()));
            appendU16(extSst, 0);
        }
        // Characters that gained code units above 0xFF need UTF-16.
        const bool highByte = (s.flags & StringFlags::HighByte) || !fitsOneByte(s.chars);
        uint8_t flags = highByte ? StringFlags::HighByte : 0;
        if (!s.runs.empty())
            flags |= StringFlags::RichSt;
        if (!s.extRst.empty())
            flags |= StringFlags::ExtSt;
        writer.writeUInt16(static_cast<uint16_t>(s.chars.size()));
        writer.writeUInt8(flags);
        if (!s.runs.empty())
            writer.writeUInt16(static_cast<uint16_t>(s.runs.size() / RunSize));
        if (!s.extRst.empty())
            writer.writeUInt32(static_cast<uint32_t>(s.extRst.size()));

        chars.clear();
        appendStringCharacters(chars, s.chars, highByte);
        size_t done = 0;
        while (done < chars.size()) {
            size_t room = writer.roomLeft();
            if (highByte)
                room &= ~size_t{1};
            const size_t piece = std::min(room, chars.size() - done);
            writer.writeBytes(chars.data() + done, piece);
            done += piece;
            if (done < chars.size()) {
                // A continued string starts its next record with its fHighByte.
                writer.continueRecord();
                writer.writeUInt8(highByte ? StringFlags::HighByte : 0);
            }
        }

        // Formatting runs are never split; phonetic data may split anywhere.
        for (size_t r = 0; r + RunSize <= s.runs.size(); r += RunSize) {
            writer.reserveRoom(RunSize, "error in record SST");
            writer.writeBytes(s.runs.data() + r, RunSize);
        }
        for (size_t extDone = 0; extDone < s.extRst.size();) {
            if (writer.roomLeft() == 0)
                writer.continueRecord();
            const size_t piece = std::min(writer.roomLeft(), s.extRst.size() - extDone);
            writer.writeBytes(s.extRst.data() + extDone, piece);
            extDone += piece;
        }
    }
    writer.endRecord();
    writer.writeRecord(RecordType::ExtSst, extSst);
}

} // namespace quire::xls
