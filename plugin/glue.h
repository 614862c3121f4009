#pragma once
// The convention every host method follows: its entry points present, its object holding a library
// handle, its required arguments present; then conversions, the call and the result conversion.
#include <quire.h>

#include <cstddef>

#include "debug_log.h"
#include "function_table.h"
#include "host_api.h"
#include "host_exceptions.h"
#include "host_objects.h"
#include "host_sdk.h"
#include "host_strings.h"

namespace quire_plugin {

// False, after raising "FunctionNotFoundException" with "_<entry> missing", when the entry is null.
bool requireEntry(bool present, const char* entryName);

// False, after raising "NilObjectException" with "Object not initialized.", for a null handle.
bool requireHandle(const void* handle);

// False, after raising "NilObjectException" with `message`, for a nil argument.
bool requireArgument(const void* argument, const char* label, const char* message);

inline RBBoolean hostBool(int value) { return value ? 1 : 0; }

// A function as the host's untyped procedure pointer; null stays null.
template <typename F>
REALproc toProc(F function) {
    return reinterpret_cast<REALproc>(function);
}
inline REALproc toProc(std::nullptr_t) { return nullptr; }

// Library objects behind instances of each class.
inline SheetHandle sheetOf(REALobject self) {
    return static_cast<SheetHandle>(instanceData<ObjectData>(self, sheetClass())->handle);
}
inline FormatHandle formatOf(REALobject self) {
    return self ? static_cast<FormatHandle>(instanceData<ObjectData>(self, formatClass())->handle) : nullptr;
}
inline FontHandle fontOf(REALobject self) {
    return self ? static_cast<FontHandle>(instanceData<ObjectData>(self, fontClass())->handle) : nullptr;
}
inline AutoFilterHandle autoFilterOf(REALobject self) {
    return static_cast<AutoFilterHandle>(instanceData<ObjectData>(self, autoFilterClass())->handle);
}
inline FilterColumnHandle filterColumnOf(REALobject self) {
    return static_cast<FilterColumnHandle>(instanceData<ObjectData>(self, filterColumnClass())->handle);
}
inline SheetHandle sheetHandleOf(REALobject sheet) { return sheet ? sheetOf(sheet) : nullptr; }
// The book instance that handed out a sheet.
inline REALobject ownerBookOf(REALobject sheet) { return instanceData<ObjectData>(sheet, sheetClass())->owner; }

// Replaces a byref host string with a new value, releasing the old one.
void assignString(REALstring* slot, REALstring value);
// Replaces a byref host object with a new value, releasing the old one.
void assignObject(REALobject* slot, REALobject value);

}  // namespace quire_plugin

// Checks one entry point of the function table by name.
#define QR_NEED(entry) ::quire_plugin::requireEntry(::quire_plugin::functions().entry != nullptr, #entry)
// The entry point itself.
#define QR_CALL(entry) (::quire_plugin::functions().entry)
