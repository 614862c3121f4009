// Host exceptions raised by the glue, and switching to an external library module.
#include "test_support.h"

namespace plugintest {
namespace {

TEST(Exceptions, IndexOutOfRangeText) {
    Held book(newBook());
    Held a(host().call(book.v, "AddSheet", {text("A")}));
    Held b(host().call(book.v, "AddSheet", {text("B")}));
    Held sheet(host().call(book.v, "Sheet", {integer(-1)}));
    EXPECT_EQ(sheet.v.kind, Value::Nil);
    EXPECT_EQ(host().exceptionClass(), "OutOfBoundsException");
    EXPECT_EQ(host().exceptionMessage(),
              "The parameter index to method Sheet is too small. Range is 0 to 1, but value is -1.");
    Held count(host().call(book.v, "FormatCount"));
    Held format(host().call(book.v, "Format", {integer(count.v.i + 2)}));
    EXPECT_EQ(host().exceptionMessage(), "The parameter index to method Format is too big. Range is 0 to " +
                                             std::to_string(count.v.i - 1) + ", but value is " +
                                             std::to_string(count.v.i + 2) + ".");
}

TEST(Exceptions, ObjectNotInitialized) {
    Held book(newBook());
    // The handle is the host's plain field: clearing it only hides the library book, so it is
    // put back for the book to be released with the instance.
    Held handle(host().get(book.v, "Handle"));
    host().set(book.v, "Handle", integer(0));
    Held message(host().get(book.v, "ErrorMessage"));
    EXPECT_EQ(Host::utf8(message.v), "No book.");
    EXPECT_FALSE(host().raised());
    Held count(host().call(book.v, "SheetCount"));
    EXPECT_EQ(host().exceptionClass(), "NilObjectException");
    EXPECT_EQ(host().exceptionMessage(), "Object not initialized.");
    host().set(book.v, "Handle", integer(handle.v.i));
    Held restored(host().call(book.v, "SheetCount"));
    EXPECT_FALSE(host().raised());
}

TEST(Exceptions, NilArguments) {
    Held book(newBook());
    Held packed(host().call(book.v, "PackDate(d as date) as double", {nil()}));
    EXPECT_EQ(host().exceptionMessage(), "date is nil");
    Held saved(host().call(book.v, "Save(path as folderitem) as boolean", {nil()}));
    EXPECT_EQ(host().exceptionMessage(), "path is nil");
    Held loaded(host().callShared("QrBookKit", "LoadRaw2(data as MemoryBlock) as QrBookKit", {nil()}));
    EXPECT_EQ(host().exceptionMessage(), "memoryblock is nil");
    Held format(host().call(book.v, "AddFormat"));
    Held set(host().call(format.v, "SetFont", {nil()}));
    EXPECT_EQ(host().exceptionClass(), "NilObjectException");
    EXPECT_EQ(host().exceptionMessage(), "font is nil");
}

TEST(Exceptions, DebugLogWhileDebugging) {
    host().setShared("QrBookKit", "Debugging", boolean(true));
    host().clearDebugLines();
    Held book(newBook());
    Held message(host().get(book.v, "ErrorMessage"));
    host().setShared("QrBookKit", "Debugging", boolean(false));
    auto lines = host().debugLines();
    bool found = false;
    for (const auto& line : lines) found |= line == "Kit Debug: Error message: ok";
    EXPECT_TRUE(found);
}

TEST(ExternalLibrary, UnloadablePathLeavesTheTable) {
    Held loaded(host().callShared("QrBookKit", "LoadLibrary(Path as string) as boolean", {text("/no/such/module.so")}));
    EXPECT_FALSE(loaded.v.b);
    Held error(host().callShared("QrBookKit", "LoadError"));
    EXPECT_FALSE(Host::utf8(error.v).empty());
    Held book(newBook());
    EXPECT_FALSE(host().raised());
}

size_t countLines(const std::vector<std::string>& lines, const std::string& wanted) {
    size_t count = 0;
    for (const std::string& line : lines) count += line == wanted ? 1 : 0;
    return count;
}

bool hasLineStartingWith(const std::vector<std::string>& lines, const std::string& start) {
    for (const std::string& line : lines)
        if (line.rfind(start, 0) == 0) return true;
    return false;
}

TEST(ExternalLibrary, MissingEntryPointRaises) {
    host().clearDebugLines();
    host().setShared("QrBookKit", "Debugging", boolean(true));
    Held loaded(host().callShared("QrBookKit", "LoadLibrary(Path as string) as boolean", {text(QUIRE_MODULE_WITHOUT_LOAD)}));
    EXPECT_TRUE(loaded.v.b);
    // Each entry looked up in the module is logged with its address; the missing one as null.
    auto lookups = host().debugLines();
    EXPECT_EQ(countLines(lookups, "Kit Debug: rbLoadLibraryS"), 1u);
    EXPECT_TRUE(hasLineStartingWith(lookups, "Kit Debug: qrBookReleaseW 0x"));
    EXPECT_EQ(countLines(lookups, "Kit Debug: qrBookLoadW (nil)"), 1u);
    Held available(host().callShared("QrBookKit", "available"));
    EXPECT_TRUE(available.v.b);

    Held book(newBook());
    ASSERT_FALSE(host().raised());
    host().clearDebugLines();
    Held result(host().call(book.v, "Load(path as string) as boolean", {text("/tmp/x.xls")}));
    EXPECT_FALSE(result.v.b);
    EXPECT_EQ(host().exceptionClass(), "FunctionNotFoundException");
    EXPECT_EQ(host().exceptionMessage(), "_qrBookLoadW missing");
    // One line per call, naming the entry, written before the exception.
    EXPECT_EQ(host().debugLines(), std::vector<std::string>{"Kit Debug: _qrBookLoadW is nil"});
    Held item(host().folderItem("/tmp/x.xls"));
    Held again(host().call(book.v, "Load(path as folderitem) as boolean", {item.v}));
    EXPECT_FALSE(again.v.b);
    EXPECT_EQ(host().exceptionMessage(), "_qrBookLoadW missing");
    EXPECT_EQ(countLines(host().debugLines(), "Kit Debug: _qrBookLoadW is nil"), 2u);
    // The one-call loaders need the entry as well.
    Held viaLoad2(host().callShared("QrBookKit", "Load2(path as string) as QrBookKit", {text("/tmp/x.xls")}));
    EXPECT_EQ(viaLoad2.v.kind, Value::Nil);
    EXPECT_EQ(host().exceptionClass(), "FunctionNotFoundException");
    EXPECT_EQ(host().exceptionMessage(), "_qrBookLoadW missing");
    EXPECT_EQ(countLines(host().debugLines(), "Kit Debug: _qrBookLoadW is nil"), 3u);

    // Without the debug flag the exception comes alone.
    host().setShared("QrBookKit", "Debugging", boolean(false));
    host().clearDebugLines();
    Held quiet(host().call(book.v, "Load(path as string) as boolean", {text("/tmp/x.xls")}));
    EXPECT_EQ(host().exceptionMessage(), "_qrBookLoadW missing");
    EXPECT_TRUE(host().debugLines().empty());
    // Methods whose entries the module has keep working.
    Held sheet(host().call(book.v, "AddSheet", {text("Still")}));
    EXPECT_EQ(Host::className(sheet.v), "QrSheetKit");
    EXPECT_FALSE(host().raised());
}

}  // namespace
}  // namespace plugintest
