#include "ZipException.h"

#include <bzlib.h>
#include <zlib.h>

namespace quire::zip {

namespace {

const char* systemErrorText(int code)
{
    switch (code) {
    case 1: return "Not super-user.";
    case 2: return "No such file or directory.";
    case 4: return "Interrupted system call.";
    case 5: return "I/O error.";
    case 6: return "No such device or address.";
    case 9: return "Bad file number.";
    case 12: return "Not enough space.";
    case 13: return "Permission denied.";
    case 14: return "Bad address.";
    case 17: return "File exists.";
    case 18: return "Cross-device link.";
    case 19: return "No such device.";
    case 20: return "Not a directory.";
    case 21: return "Is a directory.";
    case 22: return "Invalid argument.";
    case 23: return "File table overflow.";
    case 24: return "Too many open files.";
    case 27: return "File too large.";
    case 28: return "No space left on device.";
    case 29: return "Illegal seek.";
    case 30: return "Read-only file system.";
    default: return nullptr;
    }
}

const char* archiveErrorText(int code)
{
    switch (code) {
    case 201: return "Damaged or not a zip file.";
    case 202: return "Crc is mismatched.";
    case 203: return "There is no spanned archive callback object set.";
    case 204: return "The volume size was not defined for a split archive.";
    case 205: return "Volume change aborted in a segmented archive.";
    case 206: return "Action aborted.";
    case 207: return "Action aborted safely.";
    case 208: return "The device selected for the spanned archive is not removable.";
    case 209: return "The limit of the maximum number of volumes has been reached.";
    case 210: return "The limit of the maximum number of files in an archive has been reached.";
    case 211: return "The filename, the comment or local or central extra field of the file added to the archive is too long.";
    case 212: return "The file size is too large to be supported.";
    case 213: return "An incorrect password set for the file being decrypted.";
    case 214: return "The directory with a non-zero size found while testing.";
    case 215: return "An internal error.";
    case 216: return "A file error occurred";
    case 218: return "Error while removing a file";
    case 219: return "Error while renaming a file";
    case 220: return "Cannot create a file for the specified platform.";
    case 221: return "The central directory was not found in the archive (or you were trying to open not the last volume of a segmented archive).";
    case 222: return "The Zip64 central directory signature was not found in the archive where expected.";
    case 223: return "The number of bytes before a zip archive must be zero in the Zip64 format.";
    case 224: return "Mismatched authentication code in WinZip AEC decrypted data.";
    case 225: return "The Zip64 format has not been enabled for the library, but is required to use the archive.";
    case 226: return "WinZip AES encryption has not been enabled for the library, but is required to decompress the archive.";
    case 227: return "The collection is empty and the bounds do not exist.";
    default: return nullptr;
    }
}

const char* compressionLibraryErrorText(int code)
{
    switch (code) {
    case 500: return "Zlib library error (end of stream).";
    case 503: return "Zlib library error (stream error).";
    case 504: return "Zlib library error (data error).";
    case 505: return "Not enough memory.";
    case 506: return "Zlib library error (buffer error).";
    case 507: return "Zlib library error (version error).";
    case 600: return "Bzlib library sequence error.";
    case 601: return "Bzlib library parameters error.";
    case 602: return "Bzlib library memory error.";
    case 603: return "Bzlib library data error.";
    case 604: return "Bzlib library error (invalid magic value).";
    case 605: return "Bzlib library IO error.";
    case 606: return "Bzlib library error (unexpected EOF).";
    case 607: return "Bzlib library error (buffer full).";
    case 608: return "Bzlib library configuration error.";
    case 609: return "Bzlib library internal error.";
    default: return nullptr;
    }
}

} // namespace

CZipException::CZipException(int code, std::string fileName)
    : m_code(code), m_fileName(std::move(fileName)), m_message(describe(code))
{
    if (!m_fileName.empty())
        m_message = m_message + " (" + m_fileName + ").";
}

std::string CZipException::describe(int code)
{
    const char* text = systemErrorText(code);
    if (!text)
        text = archiveErrorText(code);
    if (!text)
        text = compressionLibraryErrorText(code);
    return text ? text : "Unspecified error";
}

int CZipException::fromZlib(int zlibResult)
{
    switch (zlibResult) {
    case Z_STREAM_END: return zlibStreamEnd;
    case Z_ERRNO: return zlibErrno;
    case Z_STREAM_ERROR: return zlibStreamError;
    case Z_DATA_ERROR: return zlibDataError;
    case Z_MEM_ERROR: return zlibMemError;
    case Z_BUF_ERROR: return zlibBufError;
    case Z_VERSION_ERROR: return zlibVersionError;
    default: return internalError;
    }
}

int CZipException::fromBzip2(int bzipResult)
{
    switch (bzipResult) {
    case BZ_SEQUENCE_ERROR: return bzSequenceError;
    case BZ_PARAM_ERROR: return bzParamError;
    case BZ_MEM_ERROR: return bzMemError;
    case BZ_DATA_ERROR: return bzDataError;
    case BZ_DATA_ERROR_MAGIC: return bzDataErrorMagic;
    case BZ_IO_ERROR: return bzIoError;
    case BZ_UNEXPECTED_EOF: return bzUnexpectedEof;
    case BZ_OUTBUFF_FULL: return bzOutbuffFull;
    case BZ_CONFIG_ERROR: return bzConfigError;
    default: return bzInternalError;
    }
}

int CZipException::fromErrno(int errorNumber)
{
    return systemErrorText(errorNumber) ? errorNumber : genericError;
}

} // namespace quire::zip
