#pragma once
// The table of library entry points through which every host method reaches the library. It is
// filled with the library linked into the plugin at start-up and can be pointed at an external
// module that exports the same names.
#include <quire.h>

namespace quire_plugin {

struct FunctionTable {
#define QR_ENTRY(name) decltype(&::name) name = nullptr;
#include "entry_points.def"
#undef QR_ENTRY
};

// The table in use; every host method reads its entries at the time of the call.
FunctionTable& functions();

// Number of entries, and the name of each in table order.
constexpr int kEntryPointCount = 281;
const char* entryPointName(int index);

// Every entry to the library linked into the plugin.
void fillWithInternalLibrary();

// Every entry looked up by name in `module` (a handle from dlopen); unknown names become null.
void fillFromModule(void* module);

}  // namespace quire_plugin
