// QrFilterColumnKit: one filtered column of an autofilter.
#include <cstddef>

#include "accessor_macros.h"
#include "class_constants.h"
#include "object_constructor.h"

namespace quire_plugin {

namespace {

FilterColumnHandle fc(REALobject self) { return filterColumnOf(self); }

QR_GET_INTEGER(filterSize, fc, qrFilterColumnFilterSizeW)
QR_GET_INTEGER(index, fc, qrFilterColumnIndexW)
QR_GET_INTEGER(filterType, fc, qrFilterColumnFilterTypeW)

RBBoolean filterColumnGetCustomFilterEx(REALobject self, RBInteger* op1, REALstring* value1, RBInteger* op2,
                                        REALstring* value2, RBBoolean* andOp) {
    if (!QR_NEED(qrFilterColumnGetCustomFilterW) || !requireHandle(fc(self))) return false;
    int first = 0, second = 0, both = 0;
    const wchar_t* text1 = nullptr;
    const wchar_t* text2 = nullptr;
    int ok = QR_CALL(qrFilterColumnGetCustomFilterW)(fc(self), &first, &text1, &second, &text2, &both);
    if (op1) *op1 = first;
    if (op2) *op2 = second;
    if (andOp) *andOp = hostBool(both);
    // Both texts may share the book's string buffer: each is converted before the next is read.
    if (value1) assignString(value1, wideToHostString(text1));
    if (value2) assignString(value2, wideToHostString(text2));
    return hostBool(ok);
}

void filterColumnSetCustomFilterEx(REALobject self, RBInteger op1, REALstring value1, RBInteger op2, REALstring value2,
                                   RBBoolean andOp) {
    if (!QR_NEED(qrFilterColumnSetCustomFilterExW) || !requireHandle(fc(self))) return;
    HostText first(value1), second(value2);
    QR_CALL(qrFilterColumnSetCustomFilterExW)(fc(self), static_cast<int>(op1), first.wide(), static_cast<int>(op2),
                                              second.wide(), andOp ? 1 : 0);
}

void filterColumnSetCustomFilter(REALobject self, RBInteger op, REALstring value) {
    if (!QR_NEED(qrFilterColumnSetCustomFilterW) || !requireHandle(fc(self))) return;
    HostText text(value);
    QR_CALL(qrFilterColumnSetCustomFilterW)(fc(self), static_cast<int>(op), text.wide());
}

RBBoolean filterColumnGetTop10(REALobject self, double* value, RBBoolean* top, RBBoolean* percent) {
    if (!QR_NEED(qrFilterColumnGetTop10W) || !requireHandle(fc(self))) return false;
    double number = 0.0;
    int isTop = 0, isPercent = 0;
    int ok = QR_CALL(qrFilterColumnGetTop10W)(fc(self), &number, &isTop, &isPercent);
    if (value) *value = number;
    if (top) *top = hostBool(isTop);
    if (percent) *percent = hostBool(isPercent);
    return hostBool(ok);
}

void filterColumnSetTop10(REALobject self, double value, RBBoolean top, RBBoolean percent) {
    if (!QR_NEED(qrFilterColumnSetTop10W) || !requireHandle(fc(self))) return;
    QR_CALL(qrFilterColumnSetTop10W)(fc(self), value, top ? 1 : 0, percent ? 1 : 0);
}

void filterColumnClear(REALobject self) {
    if (!QR_NEED(qrFilterColumnClearW) || !requireHandle(fc(self))) return;
    QR_CALL(qrFilterColumnClearW)(fc(self));
}

void filterColumnAddFilter(REALobject self, REALstring filter) {
    if (!QR_NEED(qrFilterColumnAddFilterW) || !requireHandle(fc(self))) return;
    HostText text(filter);
    QR_CALL(qrFilterColumnAddFilterW)(fc(self), text.wide());
}

REALstring filterColumnFilter(REALobject self, RBInteger index) {
    if (!QR_NEED(qrFilterColumnFilterW) || !requireHandle(fc(self))) return nullptr;
    return wideToHostString(QR_CALL(qrFilterColumnFilterW)(fc(self), static_cast<int>(index)));
}

void destructor(REALobject self) { releaseWrapper(self, filterColumnClass()); }

REALproperty properties[] = {
    QR_FIELD_PROPERTY("Handle", "Integer", handle, true),
    QR_FIELD_PROPERTY("Owner", "Variant", owner, false),
    QR_PROPERTY("FilterSize", "Integer", &filterSize, nullptr),
    QR_PROPERTY("Index", "Integer", &index, nullptr),
    QR_PROPERTY("FilterType", "Integer", &filterType, nullptr),
};

REALmethodDefinition methods[] = {
    {reinterpret_cast<REALproc>(&filterColumnGetCustomFilterEx), nullptr,
     "GetCustomFilterEx(byref Op1 as Integer, byref Value1 as String, byref Op2 as Integer, byref Value2 as String, byref andOp as Boolean) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&filterColumnSetCustomFilterEx), nullptr,
     "SetCustomFilterEx(Op1 as Integer, Value1 as String, Op2 as Integer, Value2 as String, andOp as Boolean = false)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&filterColumnSetCustomFilter), nullptr,
     "SetCustomFilter(Op as Integer, Value as String)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&filterColumnGetTop10), nullptr,
     "GetTop10(byref value as double, byref top as boolean, byref percent as boolean) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&filterColumnSetTop10), nullptr,
     "SetTop10(value as double, top as boolean = true, percent as boolean = false)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&filterColumnClear), nullptr,
     "Clear",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&filterColumnAddFilter), nullptr,
     "AddFilter(Filter as String)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&filterColumnFilter), nullptr,
     "Filter(index as integer) as String",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&objectConstructor), nullptr,
     "Constructor",
     kConstructorFlags, 0, nullptr},
};

}  // namespace

REALclassDefinition& filterColumnClass() {
    static REALclassDefinition definition = {
        kCurrentREALControlVersion, "QrFilterColumnKit", nullptr, sizeof(ObjectData), 0, nullptr,
        reinterpret_cast<REALproc>(&destructor), properties, sizeof properties / sizeof properties[0], methods,
        sizeof methods / sizeof methods[0], nullptr, 0, nullptr, 0, nullptr, nullptr, 0, filterColumnConstants().list,
        filterColumnConstants().count, kClassFlags, nullptr, 0, nullptr, 0, nullptr, 0, nullptr, 0};
    return definition;
}

}  // namespace quire_plugin
