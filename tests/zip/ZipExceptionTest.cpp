#include "ZipException.h"

#include <gtest/gtest.h>

#include <bzlib.h>
#include <cerrno>
#include <zlib.h>

using quire::zip::CZipException;

TEST(ZipExceptionText, SystemErrorsHaveTheirTexts)
{
    EXPECT_EQ(CZipException::describe(1), "Not super-user.");
    EXPECT_EQ(CZipException::describe(ENOENT), "No such file or directory.");
    EXPECT_EQ(CZipException::describe(EACCES), "Permission denied.");
    EXPECT_EQ(CZipException::describe(ENOSPC), "No space left on device.");
    EXPECT_EQ(CZipException::describe(30), "Read-only file system.");
}

TEST(ZipExceptionText, ArchiveErrorsHaveTheirTexts)
{
    EXPECT_EQ(CZipException::describe(201), "Damaged or not a zip file.");
    EXPECT_EQ(CZipException::describe(202), "Crc is mismatched.");
    EXPECT_EQ(CZipException::describe(212), "The file size is too large to be supported.");
    EXPECT_EQ(CZipException::describe(215), "An internal error.");
    EXPECT_EQ(CZipException::describe(216), "A file error occurred");
    EXPECT_EQ(CZipException::describe(221),
              "The central directory was not found in the archive (or you were trying to open not the last "
              "volume of a segmented archive).");
    EXPECT_EQ(CZipException::describe(227), "The collection is empty and the bounds do not exist.");
}

TEST(ZipExceptionText, CodecErrorsHaveTheirTexts)
{
    EXPECT_EQ(CZipException::describe(500), "Zlib library error (end of stream).");
    EXPECT_EQ(CZipException::describe(504), "Zlib library error (data error).");
    EXPECT_EQ(CZipException::describe(505), "Not enough memory.");
    EXPECT_EQ(CZipException::describe(507), "Zlib library error (version error).");
    EXPECT_EQ(CZipException::describe(600), "Bzlib library sequence error.");
    EXPECT_EQ(CZipException::describe(609), "Bzlib library internal error.");
}

TEST(ZipExceptionText, CodesWithoutTextAreUnspecified)
{
    for (int code : {0, 3, 7, 200, 217, 228, 501, 502, 508, 599, 610, 9999})
        EXPECT_EQ(CZipException::describe(code), "Unspecified error") << code;
}

TEST(ZipExceptionText, FileErrorsNameTheFile)
{
    const CZipException error(ENOENT, "/no/such.xlsx");
    EXPECT_STREQ(error.what(), "No such file or directory. (/no/such.xlsx).");
    EXPECT_EQ(error.description(), "No such file or directory.");
    EXPECT_EQ(error.fileName(), "/no/such.xlsx");
    EXPECT_STREQ(CZipException(202).what(), "Crc is mismatched.");
}

TEST(ZipExceptionCodes, CodecResultsMapToTheirRanges)
{
    EXPECT_EQ(CZipException::fromZlib(Z_STREAM_END), 500);
    EXPECT_EQ(CZipException::fromZlib(Z_STREAM_ERROR), 503);
    EXPECT_EQ(CZipException::fromZlib(Z_DATA_ERROR), 504);
    EXPECT_EQ(CZipException::fromZlib(Z_MEM_ERROR), 505);
    EXPECT_EQ(CZipException::fromZlib(Z_BUF_ERROR), 506);
    EXPECT_EQ(CZipException::fromZlib(Z_VERSION_ERROR), 507);
    EXPECT_EQ(CZipException::fromBzip2(BZ_SEQUENCE_ERROR), 600);
    EXPECT_EQ(CZipException::fromBzip2(BZ_DATA_ERROR), 603);
    EXPECT_EQ(CZipException::fromBzip2(BZ_DATA_ERROR_MAGIC), 604);
    EXPECT_EQ(CZipException::fromBzip2(BZ_UNEXPECTED_EOF), 606);
    EXPECT_EQ(CZipException::fromBzip2(BZ_CONFIG_ERROR), 608);
}

TEST(ZipExceptionCodes, UnlistedSystemErrorsBecomeTheGenericFileError)
{
    EXPECT_EQ(CZipException::fromErrno(ENOENT), ENOENT);
    EXPECT_EQ(CZipException::fromErrno(ENAMETOOLONG), 216);
    EXPECT_EQ(CZipException::fromErrno(ELOOP), 216);
}
