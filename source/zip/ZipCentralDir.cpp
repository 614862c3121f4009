#include "ZipCentralDir.h"

#include "ZipAbstractFile.h"
#include "ZipBytes.h"

#include <algorithm>

namespace quire::zip {

namespace {

// The end record may be followed by a comment of at most 0xFFFF bytes.
constexpr std::size_t maxEndSearch = CZipCentralDir::endFixedSize + 0xFFFF;

bool hasSignature(const unsigned char* data, std::uint32_t signature)
{
    return data[0] == (signature & 0xFF) && data[1] == ((signature >> 8) & 0xFF) &&
           data[2] == ((signature >> 16) & 0xFF) && data[3] == (signature >> 24);
}

bool startsLikeArchive(CZipAbstractFile& storage)
{
    unsigned char head[4] = {};
    storage.seek(0);
    if (storage.read(head, sizeof head) != sizeof head)
        return false;
    return hasSignature(head, CZipFileHeader::localSignature) ||
           hasSignature(head, CZipFileHeader::dataDescriptorSignature) ||
           hasSignature(head, CZipFileHeader::centralSignature);
}

wchar_t asciiLower(wchar_t c)
{
    return (c >= L'A' && c <= L'Z') ? static_cast<wchar_t>(c - L'A' + L'a') : c;
}

} // namespace

void CZipCentralDir::clear()
{
    m_headers.clear();
    m_bytesBeforeZip = 0;
    m_centralDirOffset = 0;
    m_zip64 = false;
    m_comment.clear();
}

const CZipFileHeader& CZipCentralDir::at(std::size_t index) const
{
    if (index >= m_headers.size())
        throw CZipException(CZipException::noBounds);
    return m_headers[index];
}

std::size_t CZipCentralDir::find(const std::wstring& name, bool caseSensitive) const
{
    for (std::size_t i = 0; i < m_headers.size(); ++i) {
        const std::wstring& candidate = m_headers[i].fileName();
        if (caseSensitive) {
            if (candidate == name)
                return i;
        } else if (candidate.size() == name.size() &&
                   std::equal(candidate.begin(), candidate.end(), name.begin(),
                              [](wchar_t a, wchar_t b) { return asciiLower(a) == asciiLower(b); })) {
            return i;
        }
    }
    return npos;
}

CZipCentralDir::EndRecord CZipCentralDir::locateEndRecord(CZipAbstractFile& storage)
{
    const std::uint64_t length = storage.length();
    const auto tailSize = static_cast<std::size_t>(std::min<std::uint64_t>(length, maxEndSearch));
    std::vector<unsigned char> tail(tailSize);
    if (tailSize >= endFixedSize) {
        storage.seek(length - tailSize);
        storage.readExactly(tail.data(), tailSize, CZipException::badZipFile);
    }
    for (std::size_t pos = tailSize >= endFixedSize ? tailSize - endFixedSize + 1 : 0; pos-- > 0;) {
        if (!hasSignature(tail.data() + pos, endSignature))
            continue;
        ZipFieldReader record(tail.data() + pos + 4, endFixedSize - 4);
        EndRecord end;
        end.position = length - tailSize + pos;
        end.diskNumber = record.u16();
        end.centralDirDisk = record.u16();
        record.skip(2);   // entries on this disk
        end.entryCount = record.u16();
        end.size = record.u32();
        end.offset = record.u32();
        const std::uint16_t commentLength = record.u16();
        // A stray signature inside the comment would claim more bytes than remain.
        if (commentLength > tailSize - pos - endFixedSize)
            continue;
        m_comment.assign(reinterpret_cast<const char*>(tail.data() + pos + endFixedSize), commentLength);
        return end;
    }
    if (length > 0 && startsLikeArchive(storage))
        throw CZipException(CZipException::cdirNotFound, storage.filePath());
    throw CZipException(CZipException::badZipFile, storage.filePath());
}

void CZipCentralDir::readZip64EndRecord(CZipAbstractFile& storage, EndRecord& end)
{
    if (end.position < zip64LocatorSize)
        return;
    unsigned char locator[zip64LocatorSize];
    storage.seek(end.position - zip64LocatorSize);
    storage.readExactly(locator, sizeof locator, CZipException::badZipFile);
    if (!hasSignature(locator, zip64LocatorSignature))
        return;
    ZipFieldReader fields(locator + 4, sizeof locator - 4);
    fields.skip(4);   // disk holding the Zip64 end record
    const std::uint64_t recordOffset = fields.u64();
    const std::uint64_t locatorPosition = end.position - zip64LocatorSize;

    unsigned char record[zip64EndFixedSize];
    auto recordAt = [&](std::uint64_t position) {
        if (position > locatorPosition || locatorPosition - position < zip64EndFixedSize)
            return false;
        storage.seek(position);
        storage.readExactly(record, sizeof record, CZipException::badZipFile);
        return hasSignature(record, zip64EndSignature);
    };
    if (!recordAt(recordOffset)) {
        // Found just before the locator instead: the archive was moved by a prefix.
        if (locatorPosition >= zip64EndFixedSize && recordAt(locatorPosition - zip64EndFixedSize))
            throw CZipException(CZipException::badZip64Offset, storage.filePath());
        throw CZipException(CZipException::noZip64, storage.filePath());
    }
    ZipFieldReader zip64(record + 4, sizeof record - 4);
    zip64.skip(8 + 2 + 2);   // record size, versions
    end.diskNumber = zip64.u32();
    end.centralDirDisk = zip64.u32();
    zip64.skip(8);           // entries on this disk
    end.entryCount = zip64.u64();
    end.size = zip64.u64();
    end.offset = zip64.u64();
    end.position = recordOffset;   // the central directory ends here
    m_zip64 = true;
}

void CZipCentralDir::read(CZipAbstractFile& storage)
{
    clear();
    EndRecord end = locateEndRecord(storage);
    readZip64EndRecord(storage, end);
    if (end.diskNumber != 0 || end.centralDirDisk != 0)
        throw CZipException(CZipException::badZipFile, storage.filePath());
    if (end.offset > end.position || end.size > end.position - end.offset)
        throw CZipException(CZipException::badZipFile, storage.filePath());

    // Data prepended to the archive shifts every offset by the same amount.
    std::uint64_t prefix = m_zip64 ? 0 : end.position - end.offset - end.size;
    if (prefix != 0 && end.size > 0) {
        unsigned char signature[4] = {};
        storage.seek(end.offset + prefix);
        if (storage.read(signature, 4) != 4 || !hasSignature(signature, CZipFileHeader::centralSignature))
            prefix = 0;
    }
    m_bytesBeforeZip = prefix;
    m_centralDirOffset = end.offset;

    // Every central record takes at least 46 bytes: the declared count cannot
    // make us allocate more than the directory itself justifies.
    if (end.entryCount > end.size / CZipFileHeader::centralFixedSize)
        throw CZipException(CZipException::badZipFile, storage.filePath());
    std::vector<unsigned char> records(static_cast<std::size_t>(end.size));
    storage.seek(end.offset + prefix);
    storage.readExactly(records.data(), records.size(), CZipException::badZipFile);
    try {
        parseHeaders(records, end.entryCount);
        rejectOverlappingEntries();
    } catch (const CZipException& error) {
        clear();
        throw CZipException(error.code(), storage.filePath());
    }
}

void CZipCentralDir::parseHeaders(const std::vector<unsigned char>& records, std::uint64_t entryCount)
{
    ZipFieldReader reader(records.data(), records.size());
    m_headers.reserve(static_cast<std::size_t>(entryCount));
    for (std::uint64_t i = 0; i < entryCount; ++i)
        m_headers.push_back(CZipFileHeader::readCentral(reader));
}

void CZipCentralDir::rejectOverlappingEntries() const
{
    // Entries that share or overlap their data let a small archive expand
    // without bound; sound archives never do it.
    std::vector<std::pair<std::uint64_t, std::uint64_t>> spans;
    spans.reserve(m_headers.size());
    for (const CZipFileHeader& header : m_headers) {
        const std::uint64_t start = header.localHeaderOffset;
        const std::uint64_t minimalSize = CZipFileHeader::localFixedSize + header.compressedSize;
        if (start > m_centralDirOffset || minimalSize > m_centralDirOffset - start)
            throw CZipException(CZipException::badZipFile);
        spans.emplace_back(start, start + minimalSize);
    }
    std::sort(spans.begin(), spans.end());
    for (std::size_t i = 1; i < spans.size(); ++i)
        if (spans[i].first < spans[i - 1].second)
            throw CZipException(CZipException::badZipFile);
}

void CZipCentralDir::write(CZipAbstractFile& storage) const
{
    const std::uint64_t offset = storage.position();
    std::uint64_t size = 0;
    for (const CZipFileHeader& header : m_headers) {
        const std::string record = header.centralRecord();
        storage.write(record.data(), record.size());
        size += record.size();
    }
    const std::uint64_t count = m_headers.size();
    const bool needsZip64 = count >= 0xFFFF || size >= CZipFileHeader::max32 || offset >= CZipFileHeader::max32;
    ZipFieldWriter out;
    if (needsZip64) {
        const std::uint64_t zip64EndOffset = offset + size;
        out.u32(zip64EndSignature);
        out.u64(zip64EndFixedSize - 12);
        out.u16(0x032D);   // made by Unix, format 4.5
        out.u16(45);
        out.u32(0);
        out.u32(0);
        out.u64(count);
        out.u64(count);
        out.u64(size);
        out.u64(offset);
        out.u32(zip64LocatorSignature);
        out.u32(0);
        out.u64(zip64EndOffset);
        out.u32(1);
    }
    out.u32(endSignature);
    out.u16(0);
    out.u16(0);
    const auto count16 = static_cast<std::uint16_t>(needsZip64 ? 0xFFFF : count);
    out.u16(count16);
    out.u16(count16);
    out.u32(needsZip64 ? CZipFileHeader::max32 : static_cast<std::uint32_t>(size));
    out.u32(needsZip64 ? CZipFileHeader::max32 : static_cast<std::uint32_t>(offset));
    out.u16(0);
    storage.write(out.data().data(), out.size());
}

} // namespace quire::zip
