#pragma once

// Record framing constants of the BIFF8 workbook stream and the size check
// shared by all fixed-size record classes.

#include <cstddef>
#include <cstdint>
#include <string>

#include "api/qrerror.h"

namespace quire::xls {

namespace RecordType {
constexpr uint16_t Eof = 0x000A;
constexpr uint16_t Continue = 0x003C;
constexpr uint16_t Sst = 0x00FC;
constexpr uint16_t ExtSst = 0x00FF;
constexpr uint16_t Bof = 0x0809;
} // namespace RecordType

constexpr size_t RecordHeaderSize = 4;
// Most data one record (or one CONTINUE record) may carry.
constexpr size_t MaxRecordData = 8224;

// Fails with "<RecordName> size is incorrect" unless the record's length fits.
inline void checkRecordSize(bool sizeIsCorrect, const char* recordName)
{
    if (!sizeIsCorrect)
        throw qrerror(std::string(recordName) + " size is incorrect");
}

} // namespace quire::xls
