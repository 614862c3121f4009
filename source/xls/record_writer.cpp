#include "xls/record_writer.h"

#include "api/qrerror.h"

namespace quire::xls {

void RecordWriter::writeRecord(uint16_t type, const uint8_t* data, size_t size)
{
    if (open_)
        throw qrerror("RecordWriter: a record is still open");
    size_t piece = size < MaxRecordData ? size : MaxRecordData;
    appendU16(bytes_, type);
    appendU16(bytes_, static_cast<uint16_t>(piece));
    writeBytes(data, piece);
    for (size_t done = piece; done < size; done += piece) {
        piece = size - done < MaxRecordData ? size - done : MaxRecordData;
        appendU16(bytes_, RecordType::Continue);
        appendU16(bytes_, static_cast<uint16_t>(piece));
        writeBytes(data + done, piece);
    }
}

void RecordWriter::beginRecord(uint16_t type)
{
    if (open_)
        throw qrerror("RecordWriter: a record is still open");
    recordStart_ = bytes_.size();
    appendU16(bytes_, type);
    appendU16(bytes_, 0);  // patched by endRecord
    open_ = true;
}

void RecordWriter::endRecord()
{
    if (!open_)
        throw qrerror("RecordWriter: no record is open");
    const size_t length = bytes_.size() - recordStart_ - RecordHeaderSize;
    // A longer record would be refused by spreadsheet programs or, past
    // 65535, would not even fit its length field.
    if (length > MaxRecordData)
        throw qrerror("record is too long");
    storeU16(bytes_.data() + recordStart_ + 2, static_cast<uint16_t>(length));
    open_ = false;
}

void RecordWriter::continueRecord()
{
    endRecord();
    beginRecord(RecordType::Continue);
}

void RecordWriter::reserveRoom(size_t itemSize, const char* message)
{
    if (itemSize > MaxRecordData)
        throw qrerror(message);
    if (itemSize > roomLeft())
        continueRecord();
}

void RecordWriter::patchUInt16(size_t position, uint16_t v)
{
    if (position + 2 > bytes_.size())
        throw qrerror("can't get the current write position");
    storeU16(bytes_.data() + position, v);
}

void RecordWriter::patchUInt32(size_t position, uint32_t v)
{
    if (position + 4 > bytes_.size())
        throw qrerror("can't get the current write position");
    storeU32(bytes_.data() + position, v);
}

} // namespace quire::xls
