// CZipException: the single error type of the ZIP layer. It carries a numeric
// code (system error numbers, 2xx archive errors, 5xx zlib, 6xx bzip2) and, for
// file errors, the name of the file involved.
#pragma once

#include <exception>
#include <string>

namespace quire::zip {

class CZipException : public std::exception {
public:
    enum Code : int {
        // 201-215: archive errors
        badZipFile = 201,
        badCrc = 202,
        noCallback = 203,
        noVolumeSize = 204,
        volumeChangeAborted = 205,
        aborted = 206,
        abortedSafely = 207,
        nonRemovable = 208,
        tooManyVolumes = 209,
        tooManyFiles = 210,
        tooLongData = 211,
        tooBigSize = 212,
        badPassword = 213,
        dirWithSize = 214,
        internalError = 215,
        genericError = 216,
        notRemoved = 218,
        notRenamed = 219,
        platformNotSupported = 220,
        cdirNotFound = 221,
        noZip64 = 222,
        badZip64Offset = 223,
        badAuthCode = 224,
        zip64NotEnabled = 225,
        aesNotEnabled = 226,
        noBounds = 227,
        // 500-507: zlib
        zlibStreamEnd = 500,
        zlibErrno = 502,
        zlibStreamError = 503,
        zlibDataError = 504,
        zlibMemError = 505,
        zlibBufError = 506,
        zlibVersionError = 507,
        // 600-609: bzip2
        bzSequenceError = 600,
        bzParamError = 601,
        bzMemError = 602,
        bzDataError = 603,
        bzDataErrorMagic = 604,
        bzIoError = 605,
        bzUnexpectedEof = 606,
        bzOutbuffFull = 607,
        bzConfigError = 608,
        bzInternalError = 609,
    };

    explicit CZipException(int code, std::string fileName = {});

    int code() const noexcept { return m_code; }
    const std::string& fileName() const noexcept { return m_fileName; }

    // The fixed text of the code alone, without the file name.
    std::string description() const { return describe(m_code); }
    // The full message: the description, followed by the file name when known.
    const char* what() const noexcept override { return m_message.c_str(); }

    static std::string describe(int code);
    // Code for a zlib return value (Z_STREAM_END, Z_DATA_ERROR, ...).
    static int fromZlib(int zlibResult);
    // Code for a bzip2 return value (BZ_DATA_ERROR, ...).
    static int fromBzip2(int bzipResult);
    // Code for a system error number; numbers without their own text become
    // the generic file error so that the file name is still reported.
    static int fromErrno(int errorNumber);

private:
    int m_code;
    std::string m_fileName;
    std::string m_message;
};

} // namespace quire::zip
