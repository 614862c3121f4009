// CZipFileHeader: one archive entry as the central directory describes it,
// and the encoding of its local and central header records.
#pragma once

#include <cstdint>
#include <ctime>
#include <string>

namespace quire::zip {

class ZipFieldReader;

class CZipFileHeader {
public:
    static constexpr std::uint32_t localSignature = 0x04034B50;
    static constexpr std::uint32_t centralSignature = 0x02014B50;
    static constexpr std::uint32_t dataDescriptorSignature = 0x08074B50;
    static constexpr std::size_t localFixedSize = 30;
    static constexpr std::size_t centralFixedSize = 46;
    static constexpr std::uint16_t zip64ExtraTag = 0x0001;
    static constexpr std::uint32_t max32 = 0xFFFFFFFF;

    enum Method : std::uint16_t { stored = 0, deflated = 8, bzip2 = 12, winZipAes = 99 };
    enum Flag : std::uint16_t {
        encrypted = 0x0001,
        hasDataDescriptor = 0x0008,
        strongEncryption = 0x0040,
        utf8Name = 0x0800,
    };

    // Parses one central directory record; throws CZipException(201) when it
    // is malformed. Zip64 sizes and offsets are taken from the extra field.
    static CZipFileHeader readCentral(ZipFieldReader& record);

    // Encodes the local header. With reserveZip64 the sizes go to a Zip64
    // extra field, so that they can be patched in after the data is written.
    std::string localRecord(bool reserveZip64) const;
    // Encodes the central directory record, with a Zip64 extra field for the
    // values that do not fit in 32 bits.
    std::string centralRecord() const;
    // Offset, inside the local header, of the CRC and 32-bit sizes, and of the
    // Zip64 sizes when reserved.
    static constexpr std::size_t localCrcOffset = 14;
    std::size_t localZip64SizesOffset() const { return localFixedSize + m_rawName.size() + 4; }

    const std::wstring& fileName() const { return m_fileName; }
    const std::string& rawFileName() const { return m_rawName; }
    void setFileName(const std::wstring& name);

    bool isEncrypted() const { return (m_flags & encrypted) != 0; }
    bool isDirectory() const;
    // Entry time as local calendar time, from the DOS date and time fields.
    std::time_t time() const;
    void setTime(std::time_t when);

    std::uint16_t versionMadeBy = 0x031E;   // Unix, format 3.0
    std::uint16_t versionNeeded = 20;
    std::uint16_t flags() const { return m_flags; }
    std::uint16_t method = deflated;
    std::uint16_t dosTime = 0;
    std::uint16_t dosDate = 0x21;            // 1980-01-01
    std::uint32_t crc32 = 0;
    std::uint64_t compressedSize = 0;
    std::uint64_t uncompressedSize = 0;
    std::uint64_t localHeaderOffset = 0;
    std::uint32_t diskStart = 0;
    std::uint16_t internalAttributes = 0;
    std::uint32_t externalAttributes = 0100644u << 16;   // regular file, rw-r--r--
    std::string centralExtra;
    std::string comment;

private:
    void readZip64Extra();

    std::wstring m_fileName;
    std::string m_rawName;
    std::uint16_t m_flags = 0;
};

} // namespace quire::zip
