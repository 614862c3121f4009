#pragma once

// Sequential reader of the BIFF8 records of a workbook stream held in memory.
// Record headers are validated against the stream's size when read, so every
// later read is bounded by the stream. Field readers take the count of bytes
// left in the current record by reference; the continuation readers refill it
// from the next CONTINUE record when a value is split across records.

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "api/qrerror.h"
#include "xls/little_endian.h"
#include "xls/record_types.h"

namespace quire::xls {

struct RecordHeader {
    uint16_t type = 0;
    uint16_t length = 0;
    size_t offset = 0;  // stream position of the header
};

// A record with its data in one piece.
struct Record {
    uint16_t type = 0;
    size_t offset = 0;          // stream position of the header
    const uint8_t* data = nullptr;
    size_t size = 0;            // data bytes, including merged CONTINUE data
    size_t continueCount = 0;   // CONTINUE records merged into data
};

class RecordReader {
public:
    RecordReader() = default;
    RecordReader(const uint8_t* data, size_t size) : data_(data), size_(size) {}
    explicit RecordReader(const std::vector<uint8_t>& stream) : data_(stream.data()), size_(stream.size()) {}

    size_t position() const { return pos_; }
    size_t size() const { return size_; }
    bool atEnd() const { return pos_ >= size_; }
    // Moves to a stream position, for example a BoundSheet8's lbPlyPos.
    void seek(size_t position);

    // Reads the next record header; false at the end of the stream. Fails on
    // a record type of 0 and on a length that reaches past the stream's end.
    bool readHeader(RecordHeader& header)
    {
        if (pos_ >= size_)
            return false;
        if (size_ - pos_ < RecordHeaderSize)
            throw qrerror("read error: record is truncated");
        header.offset = pos_;
        header.type = loadU16(data_ + pos_);
        header.length = loadU16(data_ + pos_ + 2);
        if (header.type == 0)
            throw qrerror("read error: record id can't be 0");
        if (size_ - pos_ - RecordHeaderSize < header.length)
            throw qrerror("read error: record is truncated");
        pos_ += RecordHeaderSize;
        return true;
    }

    // The next record with a view of its data; false at the end of the stream.
    bool next(Record& record)
    {
        RecordHeader header;
        if (!readHeader(header))
            return false;
        record.type = header.type;
        record.offset = header.offset;
        record.data = data_ + pos_;
        record.size = header.length;
        record.continueCount = 0;
        pos_ += header.length;
        return true;
    }

    // The next record with the data of the CONTINUE records that follow it
    // appended; 'scratch' holds the merged data when there is any.
    bool nextWithContinues(Record& record, std::vector<uint8_t>& scratch);

    // Type of the next record without consuming it; false at the end.
    bool peekType(uint16_t& type) const
    {
        if (pos_ >= size_ || size_ - pos_ < RecordHeaderSize)
            return false;
        type = loadU16(data_ + pos_);
        return true;
    }

    // Reads inside the current record only.
    const uint8_t* readBytes(size_t n, size_t& remaining)
    {
        if (n > remaining || n > size_ - pos_)
            throw qrerror("read error: record is too short");
        const uint8_t* p = data_ + pos_;
        pos_ += n;
        remaining -= n;
        return p;
    }
    uint8_t readUInt8(size_t& remaining) { return *readBytes(1, remaining); }
    uint16_t readUInt16(size_t& remaining) { return loadU16(readBytes(2, remaining)); }
    uint32_t readUInt32(size_t& remaining) { return loadU32(readBytes(4, remaining)); }
    double readDouble(size_t& remaining) { return loadDouble(readBytes(8, remaining)); }
    void skip(size_t n, size_t& remaining) { readBytes(n, remaining); }

    // Continuation readers: a value may be split at any byte across CONTINUE records.
    uint16_t readInt16(size_t& remaining);
    uint32_t readInt32(size_t& remaining);
    void readWithContinueRecords(uint8_t* out, size_t n, size_t& remaining);
    // Appends n bytes to out; n is checked against the stream before anything is allocated.
    void readWithContinueRecords(std::vector<uint8_t>& out, size_t n, size_t& remaining);

    // When the current record is used up and the next one is CONTINUE, enters
    // it and sets remaining to its length; false (nothing consumed) otherwise.
    bool enterContinue(size_t& remaining);

    // 16-bit characters up to a zero character, with or without the zero.
    void readString(std::u16string* s, size_t& remaining);
    void readStringWithoutNull(std::u16string* s, size_t& remaining);

private:
    uint8_t readContinuedByte(size_t& remaining, const char* message);

    const uint8_t* data_ = nullptr;
    size_t size_ = 0;
    size_t pos_ = 0;
};

} // namespace quire::xls
