// QrAutoFilterKit: the autofilter of a sheet.
#include <cstddef>

#include "accessor_macros.h"
#include "object_constructor.h"

namespace quire_plugin {

namespace {

AutoFilterHandle af(REALobject self) { return autoFilterOf(self); }
void put(RBInteger* output, int value) {
    if (output) *output = value;
}

QR_GET_INTEGER(columnSize, af, qrAutoFilterColumnSizeW)

RBBoolean autoFilterGetSort(REALobject self, RBInteger* columnIndex, RBBoolean* descending) {
    if (!QR_NEED(qrAutoFilterGetSortW) || !requireHandle(af(self))) return false;
    int column = 0, down = 0;
    int ok = QR_CALL(qrAutoFilterGetSortW)(af(self), &column, &down);
    put(columnIndex, column);
    if (descending) *descending = hostBool(down);
    return hostBool(ok);
}

void autoFilterSetSort(REALobject self, RBInteger columnIndex, RBBoolean descending) {
    if (!QR_NEED(qrAutoFilterSetSortW) || !requireHandle(af(self))) return;
    QR_CALL(qrAutoFilterSetSortW)(af(self), static_cast<int>(columnIndex), descending ? 1 : 0);
}

RBBoolean autoFilterGetSortRange(REALobject self, RBInteger* rowFirst, RBInteger* rowLast, RBInteger* colFirst,
                                 RBInteger* colLast) {
    if (!QR_NEED(qrAutoFilterGetSortRangeW) || !requireHandle(af(self))) return false;
    int rf = 0, rl = 0, cf = 0, cl = 0;
    int ok = QR_CALL(qrAutoFilterGetSortRangeW)(af(self), &rf, &rl, &cf, &cl);
    put(rowFirst, rf), put(rowLast, rl), put(colFirst, cf), put(colLast, cl);
    return hostBool(ok);
}

RBBoolean autoFilterGetRef(REALobject self, RBInteger* rowFirst, RBInteger* rowLast, RBInteger* colFirst, RBInteger* colLast) {
    if (!QR_NEED(qrAutoFilterGetRefW) || !requireHandle(af(self))) return false;
    int rf = 0, rl = 0, cf = 0, cl = 0;
    int ok = QR_CALL(qrAutoFilterGetRefW)(af(self), &rf, &rl, &cf, &cl);
    put(rowFirst, rf), put(rowLast, rl), put(colFirst, cf), put(colLast, cl);
    return hostBool(ok);
}

void autoFilterSetRef(REALobject self, RBInteger rowFirst, RBInteger rowLast, RBInteger colFirst, RBInteger colLast) {
    if (!QR_NEED(qrAutoFilterSetRefW) || !requireHandle(af(self))) return;
    QR_CALL(qrAutoFilterSetRefW)(af(self), static_cast<int>(rowFirst), static_cast<int>(rowLast),
                                 static_cast<int>(colFirst), static_cast<int>(colLast));
}

REALobject autoFilterColumnByIndex(REALobject self, RBInteger index) {
    if (!QR_NEED(qrAutoFilterColumnSizeW) || !QR_NEED(qrAutoFilterColumnByIndexW) || !requireHandle(af(self)))
        return nullptr;
    int count = QR_CALL(qrAutoFilterColumnSizeW)(af(self));
    if (index < 0 || index >= count) {
        raiseOutOfRange("index", "ColumnByIndex", 0, count, index);
        return nullptr;
    }
    return wrapHandle(filterColumnClass(), QR_CALL(qrAutoFilterColumnByIndexW)(af(self), static_cast<int>(index)), self);
}

REALobject autoFilterColumn(REALobject self, RBInteger colId) {
    if (!QR_NEED(qrAutoFilterColumnW) || !requireHandle(af(self))) return nullptr;
    return wrapHandle(filterColumnClass(), QR_CALL(qrAutoFilterColumnW)(af(self), static_cast<int>(colId)), self);
}

void destructor(REALobject self) { releaseWrapper(self, autoFilterClass()); }

REALproperty properties[] = {
    QR_FIELD_PROPERTY("Handle", "Integer", handle, true),
    QR_FIELD_PROPERTY("Owner", "Variant", owner, false),
    QR_PROPERTY("ColumnSize", "Integer", &columnSize, nullptr),
};

REALmethodDefinition methods[] = {
    {reinterpret_cast<REALproc>(&autoFilterGetSort), nullptr,
     "GetSort(byref columnIndex as Integer, byref descending as boolean) as Boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&autoFilterSetSort), nullptr,
     "SetSort(columnIndex as Integer, descending as boolean)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&autoFilterGetSortRange), nullptr,
     "GetSortRange(byref rowFirst as Integer, byref rowLast as Integer, byref colFirst as Integer, byref colLast as Integer) as Boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&autoFilterGetRef), nullptr,
     "GetRef(byref rowFirst as Integer, byref rowLast as Integer, byref colFirst as Integer, byref colLast as Integer) as Boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&autoFilterSetRef), nullptr,
     "SetRef(rowFirst as Integer, rowLast as Integer, colFirst as Integer, colLast as Integer)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&autoFilterColumnByIndex), nullptr,
     "ColumnByIndex(colId as Integer) as QrFilterColumnKit",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&autoFilterColumn), nullptr,
     "Column(colId as Integer) as QrFilterColumnKit",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&objectConstructor), nullptr,
     "Constructor",
     kConstructorFlags, 0, nullptr},
};

}  // namespace

REALclassDefinition& autoFilterClass() {
    static REALclassDefinition definition = {
        kCurrentREALControlVersion, "QrAutoFilterKit", nullptr, sizeof(ObjectData), 0, nullptr,
        reinterpret_cast<REALproc>(&destructor), properties, sizeof properties / sizeof properties[0], methods,
        sizeof methods / sizeof methods[0], nullptr, 0, nullptr, 0, nullptr, nullptr, 0, nullptr, 0, kClassFlags,
        nullptr, 0, nullptr, 0, nullptr, 0, nullptr, 0};
    return definition;
}

}  // namespace quire_plugin
