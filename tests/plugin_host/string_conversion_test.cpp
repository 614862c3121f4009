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
}

TEST(Strings, Utf32ResultsReachTheHostAsUtf8) {
    Held supplementary(text("\xF0\x9F\x98\x80x"));
    EXPECT_EQ(roundTrip(supplementary.v), "\xF0\x9F\x98\x80x");
}

TEST(Strings, SaveRawStringCarriesNoEncoding) {
    Held book(newBook());
    Ref data = ref();
    Held saved(host().call(book.v, "SaveRaw(byref data as string) as boolean", {data}));
    if (!saved.v.b) {
        EXPECT_EQ(data->kind, Value::Nil);
        GTEST_SKIP() << "saving binary books is not built yet";
    }
    EXPECT_EQ(Host::encoding(*data), kUnknown);
    Host::release(*data);
}

}  // namespace
}  // namespace plugintest
