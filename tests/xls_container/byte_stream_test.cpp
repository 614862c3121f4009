#include <gtest/gtest.h>

#include "test_support.h"
#include "xls/byte_stream.h"

using namespace quire::xls;
using quire::xls::test::failureOf;

TEST(ByteStream, ValuesComeOutInTheOrderAndByteOrderTheyWentIn)
{
    ByteStream s;
    s.pushInt8(0x17);
    s.pushInt16(0xBEEF);
    s.pushInt32(0x01020304);
    s.pushDouble(-2.5);
    ASSERT_EQ(s.size(), 15u);
    EXPECT_EQ(s.data()[1], 0xEF);  // little-endian
    EXPECT_EQ(s.data()[2], 0xBE);
    EXPECT_EQ(s.popInt8(), 0x17);
    EXPECT_EQ(s.popInt16(), 0xBEEF);
    EXPECT_EQ(s.popInt32(), 0x01020304u);
    EXPECT_EQ(s.popDouble(), -2.5);
    EXPECT_TRUE(s.empty());
}

TEST(ByteStream, PoppingMoreThanRemainsFailsAndKeepsTheBytes)
{
    ByteStream s;
    s.pushInt8(1);
    EXPECT_EQ(failureOf([&] { s.popInt16(); }), "ByteStream::popInt16() error");
    EXPECT_EQ(failureOf([&] { s.popInt32(); }), "ByteStream::popInt32() error");
    EXPECT_EQ(failureOf([&] { s.popDouble(); }), "ByteStream::popDouble() error");
    EXPECT_EQ(s.size(), 1u);
    EXPECT_EQ(s.popInt8(), 1);
    EXPECT_EQ(failureOf([&] { s.popInt8(); }), "ByteStream::popInt8() error");
}

TEST(ByteStream, AppendingItsOwnBytesIsSafe)
{
    ByteStream s;
    for (uint8_t i = 0; i < 100; ++i)
        s.pushInt8(i);
    s.popInt8();
    s.pushBytes(s);
    ASSERT_EQ(s.size(), 198u);
    EXPECT_EQ(s.data()[99], 1);
    EXPECT_EQ(s.data()[197], 99);
}
