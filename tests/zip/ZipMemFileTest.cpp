#include "ZipException.h"
#include "ZipMemFile.h"

#include <gtest/gtest.h>

#include <cstring>
#include <string>

using quire::zip::CZipException;
using quire::zip::CZipMemFile;

TEST(ZipMemFileGrowth, CapacityGrowsInWholeSteps)
{
    CZipMemFile file;
    file.write("a", 1);
    EXPECT_EQ(file.capacity(), 1024u);
    const std::string block(1500, 'x');
    file.write(block.data(), block.size());
    EXPECT_EQ(file.length(), 1501u);
    EXPECT_EQ(file.capacity() % 1024, 0u);
    EXPECT_GE(file.capacity(), 1501u);
}

TEST(ZipMemFileGrowth, ManySmallWritesStayLinear)
{
    CZipMemFile file;
    const std::string chunk(100, 'y');
    std::size_t reallocations = 0;
    std::size_t lastCapacity = 0;
    for (int i = 0; i < 100000; ++i) {
        file.write(chunk.data(), chunk.size());
        if (file.capacity() != lastCapacity) {
            ++reallocations;
            lastCapacity = file.capacity();
        }
    }
    EXPECT_EQ(file.length(), 10000000u);
    // Geometric growth: a handful of reallocations, not one per 1024 bytes.
    EXPECT_LT(reallocations, 60u);
}

TEST(ZipMemFileGrowth, WritingPastTheEndZeroFillsTheGap)
{
    CZipMemFile file;
    file.seek(10);
    file.write("z", 1);
    ASSERT_EQ(file.length(), 11u);
    for (int i = 0; i < 10; ++i)
        EXPECT_EQ(file.data()[i], 0);
    EXPECT_EQ(file.data()[10], 'z');
}

TEST(ZipMemFileAttach, ReadsTheCallersBufferInPlace)
{
    const std::string caller = "caller's bytes";
    CZipMemFile file;
    file.attachReadOnly(caller.data(), caller.size());
    EXPECT_EQ(file.data(), reinterpret_cast<const unsigned char*>(caller.data()));
    EXPECT_FALSE(file.ownsBuffer());
    char got[64] = {};
    EXPECT_EQ(file.read(got, sizeof got), caller.size());
    EXPECT_EQ(std::string(got, caller.size()), caller);
    EXPECT_EQ(file.read(got, sizeof got), 0u);
}

TEST(ZipMemFileAttach, ReadOnlyBufferRefusesWrites)
{
    const std::string caller = "fixed";
    CZipMemFile file;
    file.attachReadOnly(caller.data(), caller.size());
    EXPECT_THROW(file.write("x", 1), CZipException);
    EXPECT_THROW(file.setLength(0), CZipException);
    EXPECT_THROW(file.detach(), CZipException);
    EXPECT_EQ(caller, "fixed");
}

TEST(ZipMemFileAttach, WritableBufferHasAFixedCapacity)
{
    char target[8] = {};
    CZipMemFile file;
    file.attachWritable(target, sizeof target);
    file.write("12345678", 8);
    EXPECT_EQ(std::string(target, 8), "12345678");
    try {
        file.write("9", 1);
        FAIL() << "wrote past a caller's buffer";
    } catch (const CZipException& error) {
        EXPECT_EQ(error.code(), ENOSPC);
    }
}

TEST(ZipMemFileDetach, CallerTakesTheBufferAndTheFileIsEmpty)
{
    CZipMemFile file;
    file.write("archive", 7);
    auto buffer = file.detach();
    ASSERT_EQ(buffer.size(), 7u);
    EXPECT_EQ(std::memcmp(buffer.data(), "archive", 7), 0);
    EXPECT_EQ(file.length(), 0u);
    EXPECT_EQ(file.data(), nullptr);
    unsigned char* raw = buffer.release();
    EXPECT_EQ(buffer.data(), nullptr);
    std::free(raw);
}

TEST(ZipMemFileLength, SetLengthCutsAndClampsThePosition)
{
    CZipMemFile file;
    file.write("0123456789", 10);
    file.setLength(4);
    EXPECT_EQ(file.length(), 4u);
    EXPECT_EQ(file.position(), 4u);
    file.seek(0);
    char got[10] = {};
    EXPECT_EQ(file.read(got, 10), 4u);
    EXPECT_EQ(std::string(got, 4), "0123");
}
