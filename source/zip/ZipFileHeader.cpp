#include "ZipFileHeader.h"

#include "ZipBytes.h"
#include "ZipNameCodec.h"

namespace quire::zip {

namespace {

constexpr std::uint16_t zip64Version = 45;

} // namespace

CZipFileHeader CZipFileHeader::readCentral(ZipFieldReader& record)
{
    CZipFileHeader header;
    if (record.u32() != centralSignature)
        throw CZipException(CZipException::badZipFile);
    header.versionMadeBy = record.u16();
    header.versionNeeded = record.u16();
    header.m_flags = record.u16();
    header.method = record.u16();
    header.dosTime = record.u16();
    header.dosDate = record.u16();
    header.crc32 = record.u32();
    header.compressedSize = record.u32();
    header.uncompressedSize = record.u32();
    const std::uint16_t nameLength = record.u16();
    const std::uint16_t extraLength = record.u16();
    const std::uint16_t commentLength = record.u16();
    header.diskStart = record.u16();
    header.internalAttributes = record.u16();
    header.externalAttributes = record.u32();
    header.localHeaderOffset = record.u32();
    const unsigned char* name = record.bytes(nameLength);
    header.m_rawName.assign(reinterpret_cast<const char*>(name), nameLength);
    const unsigned char* extra = record.bytes(extraLength);
    header.centralExtra.assign(reinterpret_cast<const char*>(extra), extraLength);
    const unsigned char* text = record.bytes(commentLength);
    header.comment.assign(reinterpret_cast<const char*>(text), commentLength);
    header.m_fileName = decodeEntryName(header.m_rawName, (header.m_flags & utf8Name) != 0);
    header.readZip64Extra();
    return header;
}

void CZipFileHeader::readZip64Extra()
{
    const auto* data = reinterpret_cast<const unsigned char*>(centralExtra.data());
    ZipFieldReader extra(data, centralExtra.size());
    // Some writers pad the extra field; a block that overruns ends the scan.
    while (extra.remaining() >= 4) {
        const std::uint16_t tag = extra.u16();
        const std::uint16_t size = extra.u16();
        if (size > extra.remaining())
            return;
        ZipFieldReader block(extra.bytes(size), size);
        if (tag != zip64ExtraTag)
            continue;
        // Only the fields whose 32-bit value is saturated are present, in this order.
        if (uncompressedSize == max32 && block.remaining() >= 8)
            uncompressedSize = block.u64();
        if (compressedSize == max32 && block.remaining() >= 8)
            compressedSize = block.u64();
        if (localHeaderOffset == max32 && block.remaining() >= 8)
            localHeaderOffset = block.u64();
        if (diskStart == 0xFFFF && block.remaining() >= 4)
            diskStart = block.u32();
        return;
    }
}

void CZipFileHeader::setFileName(const std::wstring& name)
{
    m_fileName = name;
    m_rawName = wideToUtf8(name);
    if (isAscii(m_rawName))
        m_flags = static_cast<std::uint16_t>(m_flags & ~utf8Name);
    else
        m_flags = static_cast<std::uint16_t>(m_flags | utf8Name);
}

bool CZipFileHeader::isDirectory() const
{
    return !m_rawName.empty() && (m_rawName.back() == '/' || m_rawName.back() == '\\');
}

std::time_t CZipFileHeader::time() const
{
    std::tm when {};
    when.tm_year = ((dosDate >> 9) & 0x7F) + 80;
    when.tm_mon = ((dosDate >> 5) & 0x0F) - 1;
    when.tm_mday = dosDate & 0x1F;
    when.tm_hour = (dosTime >> 11) & 0x1F;
    when.tm_min = (dosTime >> 5) & 0x3F;
    when.tm_sec = (dosTime & 0x1F) * 2;
    when.tm_isdst = -1;
    return std::mktime(&when);
}

void CZipFileHeader::setTime(std::time_t when)
{
    std::tm local {};
    if (!localtime_r(&when, &local) || local.tm_year < 80 || local.tm_year > 207) {
        dosDate = 0x21;
        dosTime = 0;
        return;
    }
    dosDate = static_cast<std::uint16_t>(((local.tm_year - 80) << 9) | ((local.tm_mon + 1) << 5) | local.tm_mday);
    dosTime = static_cast<std::uint16_t>((local.tm_hour << 11) | (local.tm_min << 5) | (local.tm_sec / 2));
}

std::string CZipFileHeader::localRecord(bool reserveZip64) const
{
    ZipFieldWriter out;
    out.u32(localSignature);
    out.u16(reserveZip64 ? zip64Version : versionNeeded);
    out.u16(m_flags);
    out.u16(method);
    out.u16(dosTime);
    out.u16(dosDate);
    out.u32(crc32);
    out.u32(reserveZip64 ? max32 : static_cast<std::uint32_t>(compressedSize));
    out.u32(reserveZip64 ? max32 : static_cast<std::uint32_t>(uncompressedSize));
    out.u16(static_cast<std::uint16_t>(m_rawName.size()));
    out.u16(reserveZip64 ? 20 : 0);
    out.bytes(m_rawName);
    if (reserveZip64) {
        out.u16(zip64ExtraTag);
        out.u16(16);
        out.u64(uncompressedSize);
        out.u64(compressedSize);
    }
    return out.data();
}

std::string CZipFileHeader::centralRecord() const
{
    const bool bigUncompressed = uncompressedSize >= max32;
    const bool bigCompressed = compressedSize >= max32;
    const bool bigOffset = localHeaderOffset >= max32;
    ZipFieldWriter zip64;
    if (bigUncompressed)
        zip64.u64(uncompressedSize);
    if (bigCompressed)
        zip64.u64(compressedSize);
    if (bigOffset)
        zip64.u64(localHeaderOffset);
    const bool needsZip64 = zip64.size() > 0;
    const std::size_t extraSize = centralExtra.size() + (needsZip64 ? 4 + zip64.size() : 0);
    if (m_rawName.size() > 0xFFFF || extraSize > 0xFFFF || comment.size() > 0xFFFF)
        throw CZipException(CZipException::tooLongData);

    ZipFieldWriter out;
    out.u32(centralSignature);
    out.u16(versionMadeBy);
    out.u16(needsZip64 ? zip64Version : versionNeeded);
    out.u16(m_flags);
    out.u16(method);
    out.u16(dosTime);
    out.u16(dosDate);
    out.u32(crc32);
    out.u32(bigCompressed ? max32 : static_cast<std::uint32_t>(compressedSize));
    out.u32(bigUncompressed ? max32 : static_cast<std::uint32_t>(uncompressedSize));
    out.u16(static_cast<std::uint16_t>(m_rawName.size()));
    out.u16(static_cast<std::uint16_t>(extraSize));
    out.u16(static_cast<std::uint16_t>(comment.size()));
    out.u16(0);
    out.u16(internalAttributes);
    out.u32(externalAttributes);
    out.u32(bigOffset ? max32 : static_cast<std::uint32_t>(localHeaderOffset));
    out.bytes(m_rawName);
    if (needsZip64) {
        out.u16(zip64ExtraTag);
        out.u16(static_cast<std::uint16_t>(zip64.size()));
        out.bytes(zip64.data());
    }
    out.bytes(centralExtra);
    out.bytes(comment);
    return out.data();
}

} // namespace quire::zip
