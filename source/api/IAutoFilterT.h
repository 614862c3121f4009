#pragma once
#include "IFilterColumnT.h"

namespace quire {

// The autofilter of a sheet: a range and its filtered columns.
template <class TCHAR>
class IAutoFilterT {
public:
    virtual bool getRef(int* rowFirst, int* rowLast, int* colFirst, int* colLast) = 0;
    virtual void setRef(int rowFirst, int rowLast, int colFirst, int colLast) = 0;
    virtual IFilterColumnT<TCHAR>* column(int colId) = 0;
    virtual int columnSize() = 0;
    virtual IFilterColumnT<TCHAR>* columnByIndex(int index) = 0;
    virtual bool getSortRange(int* rowFirst, int* rowLast, int* colFirst, int* colLast) = 0;
    virtual bool getSort(int* columnIndex, bool* descending) = 0;
    virtual bool setSort(int columnIndex, bool descending) = 0;
    virtual ~IAutoFilterT() = default;
};

using IAutoFilter = IAutoFilterT<wchar_t>;

}  // namespace quire
