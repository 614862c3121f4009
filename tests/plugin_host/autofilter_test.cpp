// A sheet's autofilter and its filter columns through QrAutoFilterKit and QrFilterColumnKit.
// Only Open XML sheets carry an autofilter; the tests that need one skip while that engine is not
// linked in.
#include "test_support.h"

namespace plugintest {
namespace {

Integer filterConstant(const std::string& name) { return host().constant("QrFilterColumnKit", name); }

// The autofilter of a new Open XML sheet, or nil (after a skip) without the engine.
struct XmlSheet {
    Value book, sheet, autoFilter;
    XmlSheet() {
        book = host().create("QrBookKit", {boolean(true)});
        if (host().raised()) return;
        sheet = host().call(book, "AddSheet", {text("Filtered")});
        autoFilter = host().get(sheet, "AutoFilter");
    }
    ~XmlSheet() {
        Host::release(autoFilter);
        Host::release(sheet);
        Host::release(book);
    }
    XmlSheet(const XmlSheet&) = delete;
    XmlSheet& operator=(const XmlSheet&) = delete;
};

#define NEED_XML_ENGINE()                                                          \
    if (!xmlEngineLinked()) GTEST_SKIP() << "the Open XML engine is not linked in yet"

TEST(AutoFilter, BinarySheetsHaveNone) {
    Held book(newBook());
    Held sheet(host().call(book.v, "AddSheet", {text("Binary")}));
    Held autoFilter(host().get(sheet.v, "AutoFilter"));
    EXPECT_EQ(autoFilter.v.kind, Value::Nil);
    EXPECT_FALSE(host().raised());
    Held message(host().get(book.v, "ErrorMessage"));
    EXPECT_EQ(Host::utf8(message.v), "ok");
    // Applying and removing a filter do nothing on a binary sheet.
    host().call(sheet.v, "ApplyFilter");
    EXPECT_FALSE(host().raised());
    host().call(sheet.v, "RemoveFilter");
    EXPECT_FALSE(host().raised());
}

TEST(AutoFilter, InstancesWithoutLibraryObject) {
    Held autoFilter(host().create("QrAutoFilterKit"));
    Held handle(host().get(autoFilter.v, "Handle"));
    EXPECT_EQ(handle.v.i, 0);
    Held size(host().get(autoFilter.v, "ColumnSize"));
    EXPECT_EQ(size.v.i, 0);
    EXPECT_EQ(host().exceptionClass(), "NilObjectException");
    EXPECT_EQ(host().exceptionMessage(), "Object not initialized.");
    Ref rowFirst = ref(integer(7)), rowLast = ref(integer(7)), colFirst = ref(integer(7)), colLast = ref(integer(7));
    Held got(host().call(autoFilter.v, "GetRef", {rowFirst, rowLast, colFirst, colLast}));
    EXPECT_FALSE(got.v.b);
    EXPECT_EQ(host().exceptionMessage(), "Object not initialized.");
    host().call(autoFilter.v, "SetSort", {integer(0), boolean(true)});
    EXPECT_EQ(host().exceptionMessage(), "Object not initialized.");
    Held column(host().call(autoFilter.v, "Column", {integer(0)}));
    EXPECT_EQ(column.v.kind, Value::Nil);
    EXPECT_EQ(host().exceptionClass(), "NilObjectException");
    Held byIndex(host().call(autoFilter.v, "ColumnByIndex", {integer(0)}));
    EXPECT_EQ(byIndex.v.kind, Value::Nil);
    EXPECT_EQ(host().exceptionClass(), "NilObjectException");
}

TEST(FilterColumn, InstancesWithoutLibraryObject) {
    Held column(host().create("QrFilterColumnKit"));
    for (const char* property : {"FilterSize", "Index", "FilterType"}) {
        Held value(host().get(column.v, property));
        EXPECT_EQ(value.v.i, 0) << property;
        EXPECT_EQ(host().exceptionMessage(), "Object not initialized.") << property;
    }
    host().call(column.v, "AddFilter", {text("a")});
    EXPECT_EQ(host().exceptionMessage(), "Object not initialized.");
    Held filter(host().call(column.v, "Filter", {integer(0)}));
    EXPECT_EQ(filter.v.kind, Value::Nil);
    EXPECT_EQ(host().exceptionClass(), "NilObjectException");
    Ref value = ref(dbl(5)), top = ref(boolean(true)), percent = ref(boolean(true));
    Held got(host().call(column.v, "GetTop10", {value, top, percent}));
    EXPECT_FALSE(got.v.b);
    EXPECT_EQ(host().exceptionMessage(), "Object not initialized.");
    // The byref outputs are left alone when nothing was called.
    EXPECT_DOUBLE_EQ(value->d, 5.0);
    Ref op1 = ref(), value1 = ref(), op2 = ref(), value2 = ref(), andOp = ref();
    Held custom(host().call(column.v, "GetCustomFilterEx", {op1, value1, op2, value2, andOp}));
    EXPECT_FALSE(custom.v.b);
    EXPECT_EQ(value1->kind, Value::Nil);
    EXPECT_EQ(host().exceptionMessage(), "Object not initialized.");
    host().call(column.v, "SetCustomFilter", {integer(0), text("x")});
    EXPECT_EQ(host().exceptionMessage(), "Object not initialized.");
    host().call(column.v, "Clear");
    EXPECT_EQ(host().exceptionMessage(), "Object not initialized.");
}

TEST(AutoFilter, RangeSortAndColumns) {
    NEED_XML_ENGINE();
    XmlSheet xml;
    ASSERT_EQ(Host::className(xml.autoFilter), "QrAutoFilterKit");
    Held owner(host().get(xml.autoFilter, "Owner"));
    EXPECT_EQ(owner.v.o, xml.sheet.o);
    host().call(xml.autoFilter, "SetRef", {integer(0), integer(9), integer(1), integer(3)});
    Ref rowFirst = ref(), rowLast = ref(), colFirst = ref(), colLast = ref();
    Held got(host().call(xml.autoFilter, "GetRef", {rowFirst, rowLast, colFirst, colLast}));
    EXPECT_TRUE(got.v.b);
    EXPECT_EQ(rowFirst->i, 0);
    EXPECT_EQ(rowLast->i, 9);
    EXPECT_EQ(colFirst->i, 1);
    EXPECT_EQ(colLast->i, 3);

    host().call(xml.autoFilter, "SetSort", {integer(2), boolean(true)});
    Ref column = ref(), descending = ref();
    Held sorted(host().call(xml.autoFilter, "GetSort", {column, descending}));
    EXPECT_TRUE(sorted.v.b);
    EXPECT_EQ(column->i, 2);
    EXPECT_TRUE(descending->b);

    Held first(host().call(xml.autoFilter, "Column", {integer(1)}));
    ASSERT_EQ(Host::className(first.v), "QrFilterColumnKit");
    Held columnOwner(host().get(first.v, "Owner"));
    EXPECT_EQ(columnOwner.v.o, xml.autoFilter.o);
    Held index(host().get(first.v, "Index"));
    EXPECT_EQ(index.v.i, 1);
    Held size(host().get(xml.autoFilter, "ColumnSize"));
    EXPECT_EQ(size.v.i, 1);
    Held byIndex(host().call(xml.autoFilter, "ColumnByIndex", {integer(0)}));
    Held byIndexHandle(host().get(byIndex.v, "Handle"));
    Held firstHandle(host().get(first.v, "Handle"));
    EXPECT_EQ(byIndexHandle.v.i, firstHandle.v.i);
    Held beyond(host().call(xml.autoFilter, "ColumnByIndex", {integer(1)}));
    EXPECT_EQ(beyond.v.kind, Value::Nil);
    EXPECT_EQ(host().exceptionClass(), "OutOfBoundsException");
    EXPECT_EQ(host().exceptionMessage(),
              "The parameter index to method ColumnByIndex is too big. Range is 0 to 0, but value is 1.");
}

TEST(FilterColumn, ValuesTopTenAndCustomFilters) {
    NEED_XML_ENGINE();
    XmlSheet xml;
    host().call(xml.autoFilter, "SetRef", {integer(0), integer(9), integer(0), integer(2)});
    Held column(host().call(xml.autoFilter, "Column", {integer(0)}));
    ASSERT_EQ(Host::className(column.v), "QrFilterColumnKit");
    Held unset(host().get(column.v, "FilterType"));
    EXPECT_EQ(unset.v.i, filterConstant("FilterNotSet"));

    host().call(column.v, "AddFilter", {text("apples")});
    host().call(column.v, "AddFilter", {text("p\xC3\xA9" "ches")});
    Held type(host().get(column.v, "FilterType"));
    EXPECT_EQ(type.v.i, filterConstant("FilterValue"));
    Held size(host().get(column.v, "FilterSize"));
    EXPECT_EQ(size.v.i, 2);
    Held second(host().call(column.v, "Filter", {integer(1)}));
    EXPECT_EQ(Host::utf8(second.v), "p\xC3\xA9" "ches");
    Held beyond(host().call(column.v, "Filter", {integer(2)}));
    EXPECT_EQ(beyond.v.kind, Value::Nil);

    host().call(column.v, "SetTop10", {dbl(25)});
    Ref value = ref(), top = ref(), percent = ref();
    Held topTen(host().call(column.v, "GetTop10", {value, top, percent}));
    EXPECT_TRUE(topTen.v.b);
    EXPECT_DOUBLE_EQ(value->d, 25.0);
    EXPECT_TRUE(top->b);
    EXPECT_FALSE(percent->b);

    host().call(column.v, "SetCustomFilterEx",
                {integer(filterConstant("OperatorGreaterThan")), text("10"),
                 integer(filterConstant("OperatorLessThanOrEqual")), text("20"), boolean(true)});
    Ref op1 = ref(), value1 = ref(), op2 = ref(), value2 = ref(), andOp = ref();
    Held custom(host().call(column.v, "GetCustomFilterEx", {op1, value1, op2, value2, andOp}));
    EXPECT_TRUE(custom.v.b);
    EXPECT_EQ(op1->i, filterConstant("OperatorGreaterThan"));
    EXPECT_EQ(Host::utf8(*value1), "10");
    EXPECT_EQ(op2->i, filterConstant("OperatorLessThanOrEqual"));
    EXPECT_EQ(Host::utf8(*value2), "20");
    EXPECT_TRUE(andOp->b);
    Host::release(*value1);
    Host::release(*value2);

    host().call(column.v, "SetCustomFilter", {integer(filterConstant("OperatorNotEqual")), text("0")});
    Held customType(host().get(column.v, "FilterType"));
    EXPECT_EQ(customType.v.i, filterConstant("FilterCustom"));
    host().call(column.v, "Clear");
    Held cleared(host().get(column.v, "FilterType"));
    EXPECT_EQ(cleared.v.i, filterConstant("FilterNotSet"));
}

}  // namespace
}  // namespace plugintest
