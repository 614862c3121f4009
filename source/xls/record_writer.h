#pragma once

// Builds a BIFF8 workbook stream in memory: records with known or patched
// lengths, and the split of long data into CONTINUE records.

#include <cstddef>
#include <cstdint>
#include <vector>

#include "xls/little_endian.h"
#include "xls/record_types.h"

namespace quire::xls {

class RecordWriter {
public:
    size_t position() const { return bytes_.size(); }
    void reserve(size_t bytes) { bytes_.reserve(bytes); }
    const std::vector<uint8_t>& bytes() const { return bytes_; }
    std::vector<uint8_t> take() { return std::move(bytes_); }

    // A whole record; data longer than one record goes on in CONTINUE records.
    void writeRecord(uint16_t type, const uint8_t* data, size_t size);
    void writeRecord(uint16_t type, const std::vector<uint8_t>& data) { writeRecord(type, data.data(), data.size()); }

    // A record whose length is patched when it ends.
    void beginRecord(uint16_t type);
    void endRecord();
    bool recordOpen() const { return open_; }
    // Stream position of the open record's header.
    size_t recordStart() const { return recordStart_; }
    // Bytes still free in the open record.
    size_t roomLeft() const
    {
        if (!open_)
            return 0;
        const size_t used = bytes_.size() - recordStart_ - RecordHeaderSize;
        return used >= MaxRecordData ? 0 : MaxRecordData - used;
    }
    // Ends the open record and opens a CONTINUE record in its place.
    void continueRecord();
    // Makes room for an indivisible item: continues the record when the item
    // no longer fits; fails with 'message' when it cannot fit any record.
    void reserveRoom(size_t itemSize, const char* message);

    // Data of the open record.
    void writeUInt8(uint8_t v) { appendU8(bytes_, v); }
    void writeUInt16(uint16_t v) { appendU16(bytes_, v); }
    void writeUInt32(uint32_t v) { appendU32(bytes_, v); }
    void writeDouble(double v) { appendDouble(bytes_, v); }
    void writeBytes(const uint8_t* data, size_t size) { bytes_.insert(bytes_.end(), data, data + size); }
    void writeBytes(const std::vector<uint8_t>& data) { writeBytes(data.data(), data.size()); }

    // Overwrites earlier bytes, for example a BoundSheet8's lbPlyPos.
    void patchUInt16(size_t position, uint16_t v);
    void patchUInt32(size_t position, uint32_t v);

private:
    std::vector<uint8_t> bytes_;
    size_t recordStart_ = 0;
    bool open_ = false;
};

} // namespace quire::xls
