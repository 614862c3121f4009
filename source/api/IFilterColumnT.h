#pragma once

namespace quire {

// One filtered column of an autofilter.
template <class TCHAR>
class IFilterColumnT {
public:
    virtual int index() = 0;
    virtual int filterType() = 0;
    virtual int filterSize() = 0;
    virtual const TCHAR* filter(int index) = 0;
    virtual void addFilter(const TCHAR* value) = 0;
    virtual bool getTop10(double* value, bool* top, bool* percent) = 0;
    virtual void setTop10(double value, bool top, bool percent) = 0;
    virtual bool getCustomFilter(int* op1, const TCHAR** value1, int* op2, const TCHAR** value2,
                                 bool* andOp) = 0;
    virtual void setCustomFilter(int op1, const TCHAR* value1, int op2, const TCHAR* value2,
                                 bool andOp) = 0;
    virtual void clear() = 0;
    virtual ~IFilterColumnT() = default;
};

using IFilterColumn = IFilterColumnT<wchar_t>;

}  // namespace quire
