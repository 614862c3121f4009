#include "xls/record_reader.h"

#include <cstring>

namespace quire::xls {

void RecordReader::seek(size_t position)
{
    if (position > size_)
        throw qrerror("read error: position is out of the stream");
    pos_ = position;
}

bool RecordReader::nextWithContinues(Record& record, std::vector<uint8_t>& scratch)
{
    if (!next(record))
        return false;
    uint16_t type;
    if (!peekType(type) || type != RecordType::Continue)
        return true;
    // The merged data is at most the rest of the stream.
    scratch.assign(record.data, record.data + record.size);
    Record piece;
    while (peekType(type) && type == RecordType::Continue) {
        next(piece);
        scratch.insert(scratch.end(), piece.data, piece.data + piece.size);
        ++record.continueCount;
    }
    record.data = scratch.data();
    record.size = scratch.size();
    return true;
}

bool RecordReader::enterContinue(size_t& remaining)
{
    uint16_t type;
    if (remaining != 0 || !peekType(type) || type != RecordType::Continue)
        return false;
    RecordHeader header;
    readHeader(header);
    remaining = header.length;
    return true;
}

uint8_t RecordReader::readContinuedByte(size_t& remaining, const char* message)
{
    // Empty CONTINUE records are stepped over; each costs a header, so the
    // loop ends with the stream.
    while (remaining == 0)
        if (!enterContinue(remaining))
            throw qrerror(message);
    return readUInt8(remaining);
}

uint16_t RecordReader::readInt16(size_t& remaining)
{
    const uint8_t lo = readContinuedByte(remaining, "readInt16: CONTINUE record not found");
    const uint8_t hi = readContinuedByte(remaining, "readInt16: CONTINUE record not found");
    return static_cast<uint16_t>(lo | (hi << 8));
}

uint32_t RecordReader::readInt32(size_t& remaining)
{
    uint32_t value = 0;
    for (int i = 0; i < 4; ++i)
        value |= static_cast<uint32_t>(readContinuedByte(remaining, "readInt32: CONTINUE record not found")) << (8 * i);
    return value;
}

void RecordReader::readWithContinueRecords(uint8_t* out, size_t n, size_t& remaining)
{
    while (n > 0) {
        while (remaining == 0)
            if (!enterContinue(remaining))
                throw qrerror("readWithContinueRecords: CONTINUE record not found");
        const size_t piece = n < remaining ? n : remaining;
        std::memcpy(out, readBytes(piece, remaining), piece);
        out += piece;
        n -= piece;
    }
}

void RecordReader::readWithContinueRecords(std::vector<uint8_t>& out, size_t n, size_t& remaining)
{
    if (n > size_ - pos_)
        throw qrerror("readWithContinueRecords: CONTINUE record not found");
    const size_t start = out.size();
    out.resize(start + n);
    readWithContinueRecords(out.data() + start, n, remaining);
}

void RecordReader::readString(std::u16string* s, size_t& remaining)
{
    if (!s)
        throw qrerror("Xls::readString(): s == 0");
    uint8_t unit[2];
    do {
        readWithContinueRecords(unit, 2, remaining);
        s->push_back(static_cast<char16_t>(loadU16(unit)));
    } while (s->back() != 0);
}

void RecordReader::readStringWithoutNull(std::u16string* s, size_t& remaining)
{
    if (!s)
        throw qrerror("Xls::readStringWithoutNull(): s == 0");
    uint8_t unit[2];
    for (;;) {
        readWithContinueRecords(unit, 2, remaining);
        const char16_t c = static_cast<char16_t>(loadU16(unit));
        if (c == 0)
            break;
        s->push_back(c);
    }
}

} // namespace quire::xls
