// The plugin used the way a host program uses it: the stand-in host loads libquire_plugin.so, and
// everything below goes through the registered classes. Builds a book with QrBookKit, saves
// example-plugin.xls, loads it back and prints what it holds.
#include <cstdio>
#include <exception>
#include <string>
#include <utility>
#include <vector>

#include "test_host.h"

using namespace testhost;

namespace {

Host* host = nullptr;

// Reports the exception of the last call, if any; true when there was none.
bool fine(const char* what) {
    if (!host->raised()) return true;
    std::fprintf(stderr, "%s raised %s: %s\n", what, host->exceptionClass().c_str(), host->exceptionMessage().c_str());
    return false;
}

std::string bookMessage(const Value& book) {
    Held message(host->get(book, "ErrorMessage"));
    return Host::utf8(message.v);
}

bool check(const Value& book, bool ok, const char* what) {
    if (!fine(what)) return false;
    if (!ok) std::fprintf(stderr, "%s failed: %s\n", what, bookMessage(book).c_str());
    return ok;
}

Integer integerProperty(const Value& self, const char* name) {
    Held value(host->get(self, name));
    return value.v.i;
}

// Writes a value made for this call, which the call releases.
bool write(const Value& book, const Value& sheet, const char* method, Integer row, Integer col, Value value,
           const Value& format) {
    Held ok(host->call(sheet, method, {integer(row), integer(col), std::move(value), format}));
    return check(book, ok.v.b, method);
}

void printCell(const Value& sheet, Integer row, Integer col) {
    Held type(host->call(sheet, "CellType", {integer(row), integer(col)}));
    std::vector<Host::Arg> at = {integer(row), integer(col)};
    if (type.v.i == host->constant("QrSheetKit", "CellTypeNumber")) {
        Held isDate(host->call(sheet, "IsDate", at));
        if (isDate.v.b) {
            Held date(host->call(sheet, "ReadDate(row as integer, col as integer) as date", at));
            std::printf("  row %lld col %lld: date %04lld-%02lld-%02lld\n", static_cast<long long>(row),
                        static_cast<long long>(col), static_cast<long long>(Host::dateField(date.v, "Year")),
                        static_cast<long long>(Host::dateField(date.v, "Month")),
                        static_cast<long long>(Host::dateField(date.v, "Day")));
        } else {
            Held number(host->call(sheet, "ReadNumber(row as integer, col as integer) as double", at));
            std::printf("  row %lld col %lld: number %g\n", static_cast<long long>(row), static_cast<long long>(col),
                        number.v.d);
        }
    } else if (type.v.i == host->constant("QrSheetKit", "CellTypeString")) {
        Held text(host->call(sheet, "ReadString(row as integer, col as integer) as string", at));
        std::printf("  row %lld col %lld: string \"%s\"\n", static_cast<long long>(row), static_cast<long long>(col),
                    Host::utf8(text.v).c_str());
    } else if (type.v.i == host->constant("QrSheetKit", "CellTypeBoolean")) {
        Held flag(host->call(sheet, "ReadBoolean(row as integer, col as integer) as boolean", at));
        std::printf("  row %lld col %lld: boolean %s\n", static_cast<long long>(row), static_cast<long long>(col),
                    flag.v.b ? "True" : "False");
    }
}

bool build(const char* path) {
    Held book(host->create("QrBookKit"));
    if (!fine("New QrBookKit")) return false;
    Held sales(host->call(book.v, "AddSheet", {text("Sales")}));
    Held notes(host->call(book.v, "AddSheet", {text("Notes")}));
    if (!check(book.v, sales.v.kind == Value::Object && notes.v.kind == Value::Object, "AddSheet")) return false;

    Held dateFormat(host->call(book.v, "AddFormat"));
    host->set(dateFormat.v, "NumFormat", integer(host->constant("QrFormatKit", "NumformatDate")));
    Held money(host->call(book.v, "AddFormat"));
    Held custom(host->call(book.v, "AddCustomNumFormat", {text("#,##0.00 \"EUR\"")}));
    host->set(money.v, "NumFormat", integer(custom.v.i));
    Held bold(host->call(book.v, "AddFont"));
    host->set(bold.v, "Bold", boolean(true));
    Held heading(host->call(book.v, "AddFormat"));
    host->set(heading.v, "Font", bold.v);
    host->set(heading.v, "FillPattern", integer(host->constant("QrFormatKit", "FillPatternSolid")));
    host->set(heading.v, "PatternForegroundColor", integer(host->constant("QrFontKit", "ColorLightyellow")));
    host->call(heading.v, "SetBorder");
    if (!fine("formats")) return false;

    bool ok = write(book.v, sales.v, "WriteString", 0, 0, text("Item"), heading.v) &&
              write(book.v, sales.v, "WriteString", 0, 1, text("Amount"), heading.v) &&
              write(book.v, sales.v, "WriteString", 0, 2, text("Date"), heading.v) &&
              write(book.v, sales.v, "WriteString", 0, 3, text("Paid"), heading.v) &&
              write(book.v, sales.v, "WriteString", 1, 0, text("Apples"), nil()) &&
              write(book.v, sales.v, "WriteNumber", 1, 1, dbl(1234.5), money.v) &&
              write(book.v, sales.v, "WriteDate", 1, 2, host->date(2026, 12, 6), dateFormat.v) &&
              write(book.v, sales.v, "WriteBoolean", 1, 3, boolean(true), nil()) &&
              write(book.v, sales.v, "WriteString", 2, 0, text("Poires \xC3\xA0 l'\xC3\xA9t\xC3\xA9"), nil()) &&
              write(book.v, sales.v, "WriteNumber", 2, 1, dbl(99.75), money.v) &&
              write(book.v, sales.v, "WriteDate", 2, 2, host->date(2027, 1, 15), dateFormat.v) &&
              write(book.v, sales.v, "WriteBoolean", 2, 3, boolean(false), nil()) &&
              write(book.v, notes.v, "WriteString", 0, 0, text("Written through the host plugin"), nil());
    if (!ok) return false;
    Held widths(host->call(sales.v, "SetCol", {integer(0), integer(3), dbl(14.0)}));

    Held sheetCount(host->call(book.v, "SheetCount"));
    Held formatCount(host->call(book.v, "FormatCount"));
    Held fontCount(host->call(book.v, "FontCount"));
    Held version(host->callShared("QrBookKit", "LibVersion"));
    std::printf("quire %s through the plugin: %lld sheets, %lld formats, %lld fonts\n", Host::utf8(version.v).c_str(),
                static_cast<long long>(sheetCount.v.i), static_cast<long long>(formatCount.v.i),
                static_cast<long long>(fontCount.v.i));
    Held saved(host->call(book.v, "Save(path as string) as boolean", {text(path)}));
    return check(book.v, saved.v.b, "Save");
}

bool show(const char* path) {
    Ref message = ref();
    Held book(host->callShared("QrBookKit", "Load2(path as string, byref ErrorMessage as String) as QrBookKit",
                               {text(path), message}));
    Held keepMessage(*message);
    if (!fine("Load2")) return false;
    if (book.v.kind != Value::Object) {
        std::fprintf(stderr, "loading %s failed: %s\n", path, Host::utf8(*message).c_str());
        return false;
    }
    Held sheets(host->call(book.v, "Sheets"));
    std::vector<Value> list = Host::arrayElements(sheets.v);
    std::printf("%s loaded back: %zu sheets\n", path, list.size());
    for (size_t i = 0; i < list.size(); ++i) {
        Held sheet(list[i]);
        Held name(host->get(sheet.v, "Name"));
        Integer firstRow = integerProperty(sheet.v, "FirstRow"), lastRow = integerProperty(sheet.v, "LastRow");
        Integer firstCol = integerProperty(sheet.v, "FirstCol"), lastCol = integerProperty(sheet.v, "LastCol");
        std::printf("sheet %zu \"%s\": rows %lld-%lld, columns %lld-%lld\n", i, Host::utf8(name.v).c_str(),
                    static_cast<long long>(firstRow), static_cast<long long>(lastRow - 1),
                    static_cast<long long>(firstCol), static_cast<long long>(lastCol - 1));
        for (Integer row = firstRow; row < lastRow; ++row)
            for (Integer col = firstCol; col < lastCol; ++col) printCell(sheet.v, row, col);
    }
    return fine("reading cells");
}

}  // namespace

int main(int argc, char** argv) {
    const char* path = argc > 1 ? argv[1] : "example-plugin.xls";
    try {
        host = &Host::start();
    } catch (const std::exception& e) {
        std::fprintf(stderr, "cannot load the plugin: %s\n", e.what());
        return 1;
    }
    int before = Host::liveObjects();
    bool ok = false;
    try {
        ok = build(path) && show(path);
    } catch (const std::exception& e) {
        std::fprintf(stderr, "the host could not make the call: %s\n", e.what());
        return 1;
    }
    if (ok && Host::liveObjects() != before) {
        std::fprintf(stderr, "%d host objects still alive\n", Host::liveObjects() - before);
        ok = false;
    }
    return ok ? 0 : 1;
}
