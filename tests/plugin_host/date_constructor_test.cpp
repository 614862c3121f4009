// Host dates made by the plugin on hosts whose Date class offers fewer constructors.
#include "test_support.h"

namespace plugintest {
namespace {

bool hasLine(const std::string& wanted) {
    for (const std::string& line : host().debugLines())
        if (line == wanted) return true;
    return false;
}

class DateConstructors : public testing::Test {
protected:
    void SetUp() override { host().clearDebugLines(); }
    void TearDown() override {
        host().setDateConstructors(true, true);
        host().setShared("QrBookKit", "Debugging", boolean(false));
    }

    // A date serial of the book unpacked into a new host date by the plugin.
    static Value unpacked(const Value& book) {
        Held serial(host().call(book, "PackDate", {integer(2021), integer(3), integer(14), integer(15), integer(9),
                                                   integer(26)}));
        return host().call(book, "UnpackDate(Value as double) as date", {serial.v});
    }

    static void expectFields(const Value& date) {
        ASSERT_EQ(Host::className(date), "Date");
        EXPECT_EQ(Host::dateField(date, "Year"), 2021);
        EXPECT_EQ(Host::dateField(date, "Month"), 3);
        EXPECT_EQ(Host::dateField(date, "Day"), 14);
        EXPECT_EQ(Host::dateField(date, "Hour"), 15);
        EXPECT_EQ(Host::dateField(date, "Minute"), 9);
        EXPECT_EQ(Host::dateField(date, "Second"), 26);
    }
};

TEST_F(DateConstructors, ConstructorWithTimeZoneOffsetComesFirst) {
    Held book(newBook());
    host().setShared("QrBookKit", "Debugging", boolean(true));
    Held date(unpacked(book.v));
    expectFields(date.v);
    // The local time zone is asked for with the offset -10000.
    EXPECT_EQ(Host::dateField(date.v, "GMTOffsetGiven"), 1);
    EXPECT_TRUE(Host::propertiesSet(date.v).empty());
    EXPECT_TRUE(hasLine("Kit Debug: NewDate 2021, 3, 14, 15, 9, 26"));
    EXPECT_FALSE(hasLine("Date Constructor 3 missing!?"));
}

TEST_F(DateConstructors, PlainConstructorWithoutOffset) {
    host().setDateConstructors(false, true);
    Held book(newBook());
    Held date(unpacked(book.v));
    expectFields(date.v);
    EXPECT_EQ(Host::dateField(date.v, "GMTOffsetGiven"), 0);
    EXPECT_TRUE(Host::propertiesSet(date.v).empty());
    EXPECT_FALSE(hasLine("Date Constructor 3 missing!?"));
    EXPECT_FALSE(hasLine("Kit Debug: NewDate 2021, 3, 14, 15, 9, 26")) << "logged while not debugging";
}

TEST_F(DateConstructors, PropertiesWhenNoConstructorIsFound) {
    host().setDateConstructors(false, false);
    Held book(newBook());
    Held date(unpacked(book.v));
    expectFields(date.v);
    // The day goes to 3 first so that no step passes through a day its month lacks.
    EXPECT_EQ(Host::propertiesSet(date.v),
              (std::vector<std::string>{"Day", "Year", "Month", "Day", "Hour", "Minute", "Second"}));
    // Written whether or not debugging is on.
    EXPECT_TRUE(hasLine("Date Constructor 3 missing!?"));
}

TEST_F(DateConstructors, SheetDatesThroughTheFallback) {
    host().setDateConstructors(false, false);
    Held book(newBook());
    Held sheet(host().call(book.v, "AddSheet", {text("Dates")}));
    Held leapDay(host().date(2020, 2, 29, 23, 59, 58));
    Held ok(host().call(sheet.v, "WriteDate", {integer(0), integer(0), leapDay.v}));
    EXPECT_TRUE(ok.v.b);
    Held back(host().call(sheet.v, "ReadDate(row as integer, col as integer) as date", {integer(0), integer(0)}));
    ASSERT_EQ(Host::className(back.v), "Date");
    EXPECT_EQ(Host::dateField(back.v, "Year"), 2020);
    EXPECT_EQ(Host::dateField(back.v, "Month"), 2);
    EXPECT_EQ(Host::dateField(back.v, "Day"), 29);
    EXPECT_EQ(Host::dateField(back.v, "Hour"), 23);
    EXPECT_EQ(Host::dateField(back.v, "Minute"), 59);
    EXPECT_EQ(Host::dateField(back.v, "Second"), 58);
    Ref format = ref();
    Held withFormat(host().call(sheet.v, "ReadDate(row as integer, col as integer, byref format as QrFormatKit) as date",
                                {integer(0), integer(0), format}));
    EXPECT_EQ(Host::dateField(withFormat.v, "Day"), 29);
    EXPECT_EQ(Host::className(*format), "QrFormatKit");
    Host::release(*format);
}

}  // namespace
}  // namespace plugintest
