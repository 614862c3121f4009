#pragma once
// Conversions between the opaque handles of the C interface and the interface objects.
// A handle is the object's own address, so both directions are plain pointer casts.
#include "quire.h"

#include "IBookT.h"

namespace quire::flat {

inline IBook* asBook(BookHandle handle) { return reinterpret_cast<IBook*>(handle); }
inline ISheet* asSheet(SheetHandle handle) { return reinterpret_cast<ISheet*>(handle); }
inline IFormat* asFormat(FormatHandle handle) { return reinterpret_cast<IFormat*>(handle); }
inline IFont* asFont(FontHandle handle) { return reinterpret_cast<IFont*>(handle); }
inline IAutoFilter* asAutoFilter(AutoFilterHandle handle) {
    return reinterpret_cast<IAutoFilter*>(handle);
}
inline IFilterColumn* asFilterColumn(FilterColumnHandle handle) {
    return reinterpret_cast<IFilterColumn*>(handle);
}

inline BookHandle toHandle(IBook* object) { return reinterpret_cast<BookHandle>(object); }
inline SheetHandle toHandle(ISheet* object) { return reinterpret_cast<SheetHandle>(object); }
inline FormatHandle toHandle(IFormat* object) { return reinterpret_cast<FormatHandle>(object); }
inline FontHandle toHandle(IFont* object) { return reinterpret_cast<FontHandle>(object); }
inline AutoFilterHandle toHandle(IAutoFilter* object) {
    return reinterpret_cast<AutoFilterHandle>(object);
}
inline FilterColumnHandle toHandle(IFilterColumn* object) {
    return reinterpret_cast<FilterColumnHandle>(object);
}

// An int argument taken as a boolean: any non-zero value is true.
inline bool isTrue(int value) { return value != 0; }

// The stricter rule of a few entry points, where -1 must mean false: only positive values are true.
inline bool isPositive(int value) { return value > 0; }

// A boolean out-parameter crossing as int*. The operation fills a local bool (or sees null when
// the caller does not want the value); the destructor stores 0 or 1 back through the caller's
// pointer. The caller's variable is never read: C callers commonly pass it uninitialised.
class BoolOut {
public:
    explicit BoolOut(int* target) : target_(target) {}
    ~BoolOut() {
        if (target_ != nullptr) *target_ = value_ ? 1 : 0;
    }
    BoolOut(const BoolOut&) = delete;
    BoolOut& operator=(const BoolOut&) = delete;

    bool* get() { return target_ != nullptr ? &value_ : nullptr; }

private:
    int* target_;
    bool value_ = false;
};

// A format out-parameter crossing as FormatHandle*: the operation writes an interface pointer,
// which goes back to the caller as a handle when the caller gave somewhere to put it.
class FormatOut {
public:
    explicit FormatOut(FormatHandle* target) : target_(target) {}
    ~FormatOut() {
        if (target_ != nullptr) *target_ = toHandle(value_);
    }
    FormatOut(const FormatOut&) = delete;
    FormatOut& operator=(const FormatOut&) = delete;

    IFormat** get() { return target_ != nullptr ? &value_ : nullptr; }

private:
    FormatHandle* target_;
    IFormat* value_ = nullptr;
};

}  // namespace quire::flat
