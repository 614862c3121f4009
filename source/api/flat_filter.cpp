// AutoFilter and FilterColumn entry points of the C interface: each forwards to one
// IAutoFilter or IFilterColumn operation.
#include "handles.h"

using namespace quire::flat;

extern "C" {

// AutoFilter

int qrAutoFilterGetRefW(AutoFilterHandle autoFilter, int* rowFirst, int* rowLast, int* colFirst,
                        int* colLast) {
    return asAutoFilter(autoFilter)->getRef(rowFirst, rowLast, colFirst, colLast);
}

void qrAutoFilterSetRefW(AutoFilterHandle autoFilter, int rowFirst, int rowLast, int colFirst,
                         int colLast) {
    asAutoFilter(autoFilter)->setRef(rowFirst, rowLast, colFirst, colLast);
}

FilterColumnHandle qrAutoFilterColumnW(AutoFilterHandle autoFilter, int colId) {
    return toHandle(asAutoFilter(autoFilter)->column(colId));
}

int qrAutoFilterColumnSizeW(AutoFilterHandle autoFilter) {
    return asAutoFilter(autoFilter)->columnSize();
}

FilterColumnHandle qrAutoFilterColumnByIndexW(AutoFilterHandle autoFilter, int index) {
    return toHandle(asAutoFilter(autoFilter)->columnByIndex(index));
}

int qrAutoFilterGetSortRangeW(AutoFilterHandle autoFilter, int* rowFirst, int* rowLast,
                              int* colFirst, int* colLast) {
    return asAutoFilter(autoFilter)->getSortRange(rowFirst, rowLast, colFirst, colLast);
}

int qrAutoFilterGetSortW(AutoFilterHandle autoFilter, int* columnIndex, int* descending) {
    BoolOut descendingOut(descending);
    return asAutoFilter(autoFilter)->getSort(columnIndex, descendingOut.get());
}

int qrAutoFilterSetSortW(AutoFilterHandle autoFilter, int columnIndex, int descending) {
    return asAutoFilter(autoFilter)->setSort(columnIndex, isTrue(descending));
}

// FilterColumn

int qrFilterColumnIndexW(FilterColumnHandle filterColumn) {
    return asFilterColumn(filterColumn)->index();
}

int qrFilterColumnFilterTypeW(FilterColumnHandle filterColumn) {
    return asFilterColumn(filterColumn)->filterType();
}

int qrFilterColumnFilterSizeW(FilterColumnHandle filterColumn) {
    return asFilterColumn(filterColumn)->filterSize();
}

const wchar_t* qrFilterColumnFilterW(FilterColumnHandle filterColumn, int index) {
    return asFilterColumn(filterColumn)->filter(index);
}

void qrFilterColumnAddFilterW(FilterColumnHandle filterColumn, const wchar_t* value) {
    asFilterColumn(filterColumn)->addFilter(value);
}

int qrFilterColumnGetTop10W(FilterColumnHandle filterColumn, double* value, int* top,
                            int* percent) {
    BoolOut topOut(top);
    BoolOut percentOut(percent);
    return asFilterColumn(filterColumn)->getTop10(value, topOut.get(), percentOut.get());
}

void qrFilterColumnSetTop10W(FilterColumnHandle filterColumn, double value, int top,
                             int percent) {
    asFilterColumn(filterColumn)->setTop10(value, isTrue(top), isTrue(percent));
}

int qrFilterColumnGetCustomFilterW(FilterColumnHandle filterColumn, int* op1,
                                   const wchar_t** value1, int* op2, const wchar_t** value2,
                                   int* andOp) {
    // The operators go through locals and are stored only where the caller asked for them.
    int op1Value = 0;
    int op2Value = 0;
    BoolOut andOpOut(andOp);
    const bool found = asFilterColumn(filterColumn)->getCustomFilter(
        op1 != nullptr ? &op1Value : nullptr, value1, op2 != nullptr ? &op2Value : nullptr, value2,
        andOpOut.get());
    if (op1 != nullptr) *op1 = op1Value;
    if (op2 != nullptr) *op2 = op2Value;
    return found;
}

void qrFilterColumnSetCustomFilterExW(FilterColumnHandle filterColumn, int op1,
                                      const wchar_t* value1, int op2, const wchar_t* value2,
                                      int andOp) {
    asFilterColumn(filterColumn)->setCustomFilter(op1, value1, op2, value2, isTrue(andOp));
}

void qrFilterColumnSetCustomFilterW(FilterColumnHandle filterColumn, int op1,
                                    const wchar_t* value1) {
    // One condition: no second operator or value, joined by "or".
    asFilterColumn(filterColumn)->setCustomFilter(op1, value1, 0, nullptr, false);
}

void qrFilterColumnClearW(FilterColumnHandle filterColumn) {
    asFilterColumn(filterColumn)->clear();
}

}  // extern "C"
