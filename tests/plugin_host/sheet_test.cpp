// Cells and sheet settings through QrSheetKit.
#include "test_support.h"

namespace plugintest {
namespace {

TEST(Sheet, CellsOfEveryKind) {
    Held book(newBook());
    Held sheet(host().call(book.v, "AddSheet", {text("Cells")}));
    Held a(host().call(sheet.v, "WriteString", {integer(0), integer(0), text("caf\xC3\xA9")}));
    EXPECT_TRUE(a.v.b);
    Held b(host().call(sheet.v, "WriteNumber", {integer(1), integer(0), dbl(2.5)}));
    Held c(host().call(sheet.v, "WriteBoolean", {integer(2), integer(0), boolean(true)}));
    Held s(host().call(sheet.v, "ReadString", {integer(0), integer(0)}));
    EXPECT_EQ(Host::utf8(s.v), "caf\xC3\xA9");
    Held n(host().call(sheet.v, "ReadNumber", {integer(1), integer(0)}));
    EXPECT_DOUBLE_EQ(n.v.d, 2.5);
    Held t(host().call(sheet.v, "ReadBoolean", {integer(2), integer(0)}));
    EXPECT_TRUE(t.v.b);
    Ref format = ref();
    Held withFormat(host().call(sheet.v, "ReadNumber", {integer(1), integer(0), format}));
    EXPECT_EQ(Host::className(*format), "QrFormatKit");
    Host::release(*format);
    Held type(host().call(sheet.v, "CellType", {integer(0), integer(0)}));
    EXPECT_EQ(type.v.i, 2);
}

TEST(Sheet, DatesAndNilDate) {
    Held book(newBook());
    Held sheet(host().call(book.v, "AddSheet", {text("Dates")}));
    Held date(host().date(2020, 2, 29));
    Held ok(host().call(sheet.v, "WriteDate", {integer(0), integer(0), date.v}));
    EXPECT_TRUE(ok.v.b);
    Held back(host().call(sheet.v, "ReadDate", {integer(0), integer(0)}));
    EXPECT_EQ(Host::dateField(back.v, "Month"), 2);
    EXPECT_EQ(Host::dateField(back.v, "Day"), 29);
    Held blank(host().call(sheet.v, "WriteDate(row as integer, col as integer, value as date, format as QrFormatKit = nil) as boolean",
                           {integer(1), integer(0), nil()}));
    EXPECT_TRUE(blank.v.b);
    Held type(host().call(sheet.v, "CellType", {integer(1), integer(0)}));
    EXPECT_EQ(type.v.i, 4);
}

TEST(Sheet, AddressesAndAssignableMembers) {
    Held book(newBook());
    Held sheet(host().call(book.v, "AddSheet", {text("S")}));
    Held addr(host().call(sheet.v, "RowColToAddr", {integer(2), integer(1)}));
    EXPECT_EQ(Host::utf8(addr.v), "B3");
    Ref row = ref(), col = ref(), rowRel = ref(), colRel = ref();
    host().call(sheet.v, "AddrToRowCol", {text("$C$4"), row, col, rowRel, colRel});
    EXPECT_EQ(row->i, 3);
    EXPECT_EQ(col->i, 2);
    EXPECT_FALSE(rowRel->b);
    host().assign(sheet.v, "RowHidden", {integer(3)}, boolean(true));
    Held hidden(host().call(sheet.v, "RowHidden", {integer(3)}));
    EXPECT_TRUE(hidden.v.b);
    host().assign(sheet.v, "CellFormat", {integer(0), integer(0)}, nil());
    EXPECT_EQ(host().exceptionMessage(), "format is nil");
}

}  // namespace
}  // namespace plugintest
