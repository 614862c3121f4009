// Books through QrBookKit: sheets, formats, fonts, dates, colours and round trips.
#include "test_support.h"

namespace plugintest {
namespace {

TEST(Book, SheetsFormatsAndFonts) {
    Held book(newBook());
    ASSERT_FALSE(host().raised());
    Held sheet(host().call(book.v, "AddSheet", {text("Data")}));
    ASSERT_EQ(Host::className(sheet.v), "QrSheetKit");
    Held count(host().call(book.v, "SheetCount"));
    EXPECT_EQ(count.v.i, 1);
    Held name(host().get(sheet.v, "Name"));
    EXPECT_EQ(Host::utf8(name.v), "Data");
    Held owner(host().get(sheet.v, "Book"));
    EXPECT_EQ(owner.v.o, book.v.o);
    Held sheets(host().call(book.v, "Sheets"));
    auto elements = Host::arrayElements(sheets.v);
    ASSERT_EQ(elements.size(), 1u);
    for (auto& e : elements) Host::release(e);
    Held format(host().call(book.v, "AddFormat"));
    Held font(host().call(book.v, "AddFont"));
    host().set(font.v, "Bold", boolean(true));
    Held bold(host().get(font.v, "Bold"));
    EXPECT_TRUE(bold.v.b);
    host().set(format.v, "Font", font.v);
    EXPECT_FALSE(host().raised());
    Held message(host().get(book.v, "ErrorMessage"));
    EXPECT_EQ(Host::utf8(message.v), "ok");
    EXPECT_EQ(Host::encoding(message.v), kAscii);
}

TEST(Book, DatesThroughPackAndUnpack) {
    Held book(newBook());
    Held date(host().date(2021, 3, 14, 15, 9, 26));
    Held serial(host().call(book.v, "PackDate", {date.v}));
    Held direct(host().call(book.v, "PackDate", {integer(2021), integer(3), integer(14), integer(15), integer(9), integer(26)}));
    EXPECT_DOUBLE_EQ(serial.v.d, direct.v.d);
    Held back(host().call(book.v, "UnpackDate", {serial.v}));
    ASSERT_EQ(Host::className(back.v), "Date");
    EXPECT_EQ(Host::dateField(back.v, "Year"), 2021);
    EXPECT_EQ(Host::dateField(back.v, "Minute"), 9);
    Ref year = ref(), month = ref(), day = ref();
    Held ok(host().call(book.v, "UnpackDate", {serial.v, year, month, day}));
    EXPECT_TRUE(ok.v.b);
    EXPECT_EQ(year->i, 2021);
    EXPECT_EQ(day->i, 14);
}

TEST(Book, Colours) {
    Held book(newBook());
    host().set(book.v, "RgbMode", boolean(true));
    Held packed(host().call(book.v, "PackColor", {integer(0x12), integer(0x34), integer(0x56)}));
    Held colour(host().call(book.v, "UnpackColor", {packed.v}));
    EXPECT_EQ(colour.v.i, 0x123456);
}

TEST(Book, LibraryVersion) {
    Held version(host().callShared("QrBookKit", "LibVersion"));
    EXPECT_EQ(Host::utf8(version.v), "3.8.8.0");
    Held number(host().callShared("QrBookKit", "LibVersionNumber"));
    EXPECT_EQ(number.v.i, 0x03080800);
    Held available(host().callShared("QrBookKit", "available"));
    EXPECT_TRUE(available.v.b);
}

TEST(Book, SaveRawAndLoadRawWithStringsAndMemoryBlocks) {
    Held book(newBook());
    Held sheet(host().call(book.v, "AddSheet", {text("Data")}));
    Held written(host().call(sheet.v, "WriteNumber", {integer(0), integer(0), dbl(42.0)}));
    Ref data = ref();
    Held saved(host().call(book.v, "SaveRaw(byref data as string) as boolean", {data}));
    if (!saved.v.b && notAvailableYet(book.v)) GTEST_SKIP() << "saving binary books is not built yet";
    ASSERT_TRUE(saved.v.b);
    EXPECT_NE(Host::rawBytes(*data).size(), 0u);
    Held copy(newBook());
    Held loaded(host().call(copy.v, "LoadRaw(data as string) as boolean", {*data}));
    EXPECT_TRUE(loaded.v.b);
    Ref block = ref();
    Held savedBlock(host().call(book.v, "SaveRaw(byref data as MemoryBlock) as boolean", {block}));
    EXPECT_EQ(Host::memoryBlockBytes(*block), Host::rawBytes(*data));
    Held fromBlock(host().call(copy.v, "LoadRaw(data as MemoryBlock) as boolean", {*block}));
    EXPECT_TRUE(fromBlock.v.b);
    Host::release(*data);
    Host::release(*block);
}

TEST(Book, WorkerThreadVariants) {
    Held book(newBook());
    Held sheet(host().call(book.v, "AddSheet", {text("Data")}));
    Ref data = ref();
    Held saved(host().call(book.v, "SaveRawMT(byref data as string) as boolean", {data}));
    Held sameThread(newBook());
    Held other(host().call(sameThread.v, "AddSheet", {text("Data")}));
    Ref direct = ref();
    Held savedDirect(host().call(sameThread.v, "SaveRaw(byref data as string) as boolean", {direct}));
    EXPECT_EQ(saved.v.b, savedDirect.v.b);
    Held loaded(host().call(book.v, "LoadRawMT(data as string) as boolean", {*data}));
    if (!saved.v.b) {
        EXPECT_TRUE(notAvailableYet(book.v));
        EXPECT_FALSE(loaded.v.b);
    } else {
        EXPECT_TRUE(loaded.v.b);
    }
    Held path(host().call(book.v, "SaveMT(path as string) as boolean", {text("/nonexistent-dir/x.xls")}));
    EXPECT_FALSE(path.v.b);
    Host::release(*data);
    Host::release(*direct);
}

TEST(Book, OpenXmlBooks) {
    if (!xmlEngineLinked()) {
        EXPECT_EQ(host().exceptionClass(), "FunctionNotFoundException");
        EXPECT_EQ(host().exceptionMessage(), "_qrCreateXMLBookCW missing");
        GTEST_SKIP() << "the Open XML engine is not linked in yet";
    }
    Held book(host().create("QrBookKit", {boolean(true)}));
    Held sheet(host().call(book.v, "AddSheet", {text("Data")}));
    EXPECT_EQ(Host::className(sheet.v), "QrSheetKit");
}

}  // namespace
}  // namespace plugintest
