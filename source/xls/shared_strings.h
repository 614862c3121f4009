#pragma once

// The shared string table of a workbook (SST record, XLUnicodeRichExtendedString
// entries) and its EXTSST index.

#include <cstddef>
#include <cstdint>
#include <string>
#include <unordered_map>
#include <vector>

#include "xls/record_reader.h"
#include "xls/record_writer.h"

namespace quire::xls {

struct SharedString {
    uint8_t flags = 0;             // fHighByte, fExtSt, fRichSt as stored
    std::u16string chars;
    std::vector<uint8_t> runs;     // cRun formatting runs of 4 bytes each
    std::vector<uint8_t> extRst;   // phonetic data, kept verbatim

    bool plain() const { return runs.empty() && extRst.empty(); }
};

class SharedStringTable {
public:
    void clear();
    size_t size() const { return strings_.size(); }
    // cstTotal: string cells that refer to the table.
    uint32_t totalReferences() const { return total_; }
    void setTotalReferences(uint32_t total) { total_ = total; }

    // Fails with "StrMap: sst is out of range (2)" beyond the table.
    const SharedString& at(size_t index) const;
    // Index of an equal plain string already present, or of the string
    // appended (stored as UTF-16); every call counts one reference.
    size_t add(const std::u16string& chars);

    // Reads the SST record whose header was just read; leaves the reader
    // after the record and the CONTINUE records its strings use.
    void read(RecordReader& reader, const RecordHeader& header);
    // Writes SST (with CONTINUE records) and EXTSST.
    void write(RecordWriter& writer) const;

    // One XLUnicodeRichExtendedString, continued as the SST continues.
    static SharedString readString(RecordReader& reader, size_t& remaining);

    // Appends a string as it stands (duplicates and rich strings included).
    void append(SharedString&& s);

private:

    std::vector<SharedString> strings_;
    std::unordered_map<std::u16string, uint32_t> plainIndex_;
    uint32_t total_ = 0;
};

// Strings per EXTSST bucket for a table of 'unique' strings: at least 8 and
// no more than 128 buckets.
uint16_t extSstBucketSize(size_t unique);

} // namespace quire::xls
