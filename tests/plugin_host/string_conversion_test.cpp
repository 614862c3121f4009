// Host strings to library text and back, on every host version the tests run with.
#include "test_support.h"

namespace plugintest {
namespace {

// Writes `value` into a cell and reads it back as a host string.
std::string roundTrip(const Value& value) {
    Held book(newBook());
    Held sheet(host().call(book.v, "AddSheet", {text("T")}));
    Held ok(host().call(sheet.v, "WriteString", {integer(0), integer(0), value}));
    Held back(host().call(sheet.v, "ReadString", {integer(0), integer(0)}));
    if (back.v.kind == Value::Nil) return "<nil>";
    return Host::utf8(back.v);
}

TEST(Strings, NilAndEmpty) {
    EXPECT_EQ(roundTrip(nil()), "<nil>");
    Held empty(text(""));
    EXPECT_EQ(roundTrip(empty.v), "<nil>");
}

TEST(Strings, AsciiAndUtf8) {
    Held ascii(bytes("plain", kAscii));
    EXPECT_EQ(roundTrip(ascii.v), "plain");
    Held utf8(text("\xE2\x82\xAC \xF0\x9F\x98\x80"));
    EXPECT_EQ(roundTrip(utf8.v), "\xE2\x82\xAC \xF0\x9F\x98\x80");
}

TEST(Strings, UntaggedBytesAreSingleByteText) {
    Held untagged(bytes("caf\xE9", kUnknown));
    EXPECT_EQ(roundTrip(untagged.v), "caf\xC3\xA9");
}

TEST(Strings, Utf16WithEitherByteOrderMark) {
    Held le(bytes(std::string("\xFF\xFE" "A\0" "\xE9\0", 6), kUtf16));
    EXPECT_EQ(roundTrip(le.v), "A\xC3\xA9");
    // Units in the other byte order: the mark reads as 0xFFFE, so every unit is swapped.
    Held be(bytes(std::string("\xFE\xFF" "\0A" "\0\xE9" "\x20\xAC", 8), kUtf16));
    EXPECT_EQ(roundTrip(be.v), "A\xC3\xA9\xE2\x82\xAC");
    Held swappedSupplementary(bytes(std::string("\xFE\xFF" "\xD8\x3D" "\xDE\x00" "\0x", 8), kUtf16));
    EXPECT_EQ(roundTrip(swappedSupplementary.v), "\xF0\x9F\x98\x80x");
    // Only a leading mark is dropped.
    Held inner(bytes(std::string("A\0" "\xFF\xFE" "B\0", 6), kUtf16));
    EXPECT_EQ(roundTrip(inner.v), "A\xEF\xBB\xBF" "B");
}

// The host's own conversion to UTF-16 may put a byte-order mark in front of the text.
class Utf16FromHost : public testing::TestWithParam<Utf16Marking> {
protected:
    void SetUp() override { host().setUtf16Marking(GetParam()); }
    void TearDown() override { host().setUtf16Marking(Utf16Marking::None); }
};

TEST_P(Utf16FromHost, MarkIsDroppedAndOrderFollowed) {
    Held utf8(text("caf\xC3\xA9 \xE2\x82\xAC \xF0\x9F\x98\x80"));
    EXPECT_EQ(roundTrip(utf8.v), "caf\xC3\xA9 \xE2\x82\xAC \xF0\x9F\x98\x80");
    Held latin1(bytes("na\xEFve", kLatin1Iso));
    EXPECT_EQ(roundTrip(latin1.v), "na\xC3\xAFve");
    Held untagged(bytes("caf\xE9", kUnknown));
    EXPECT_EQ(roundTrip(untagged.v), "caf\xC3\xA9");
    // Plain ASCII never goes through the host's conversion.
    Held ascii(bytes("plain", kAscii));
    EXPECT_EQ(roundTrip(ascii.v), "plain");
}

std::string markingName(const testing::TestParamInfo<Utf16Marking>& marking) {
    return marking.param == Utf16Marking::None        ? "NoMark"
           : marking.param == Utf16Marking::NativeBom ? "NativeMark"
                                                      : "SwappedMark";
}

INSTANTIATE_TEST_SUITE_P(Strings, Utf16FromHost,
                         testing::Values(Utf16Marking::None, Utf16Marking::NativeBom, Utf16Marking::SwappedBom),
                         markingName);

TEST(Strings, Utf32ResultsReachTheHostAsUtf8) {
    Held supplementary(text("\xF0\x9F\x98\x80x"));
    EXPECT_EQ(roundTrip(supplementary.v), "\xF0\x9F\x98\x80x");
}

TEST(Strings, SaveRawStringCarriesNoEncoding) {
    Held book(newBook());
    Held empty(newBook());
    Ref nothing = ref();
    Held refused(host().call(empty.v, "SaveRaw(byref data as string) as boolean", {nothing}));
    if (!refused.v.b) {
        EXPECT_EQ(nothing->kind, Value::Nil);
    }
    Host::release(*nothing);

    Held sheet(host().call(book.v, "AddSheet", {text("Data")}));
    Held written(host().call(sheet.v, "WriteString", {integer(0), integer(0), text("caf\xC3\xA9")}));
    Ref data = ref(), block = ref();
    Held saved(host().call(book.v, "SaveRaw(byref data as string) as boolean", {data}));
    if (!saved.v.b && notAvailableYet(book.v)) GTEST_SKIP() << "saving binary books is not built yet";
    ASSERT_TRUE(saved.v.b);
    EXPECT_EQ(Host::encoding(*data), kUnknown);
    Held savedBlock(host().call(book.v, "SaveRaw(byref data as MemoryBlock) as boolean", {block}));
    ASSERT_TRUE(savedBlock.v.b);
    // The bytes are the library's image, unchanged by any text conversion.
    EXPECT_EQ(Host::rawBytes(*data), Host::memoryBlockBytes(*block));
    EXPECT_EQ(Host::rawBytes(*data).compare(0, 8, "\xD0\xCF\x11\xE0\xA1\xB1\x1A\xE1"), 0);
    Host::release(*data);
    Host::release(*block);
}

}  // namespace
}  // namespace plugintest
