#include "function_table.h"

#include <dlfcn.h>

#include "debug_log.h"

// The Open XML engine may not be linked in: its factory is then null and the host methods that
// need it report the missing entry point.
extern "C" __attribute__((weak)) BookHandle qrCreateXMLBookCW(void);

namespace quire_plugin {

namespace {
const char* const kNames[] = {
#define QR_ENTRY(name) #name,
#include "entry_points.def"
#undef QR_ENTRY
};
static_assert(sizeof(kNames) / sizeof(kNames[0]) == kEntryPointCount, "entry point list");
}  // namespace

FunctionTable& functions() {
    static FunctionTable table;
    return table;
}

const char* entryPointName(int index) {
    return index >= 0 && index < kEntryPointCount ? kNames[index] : nullptr;
}

void fillWithInternalLibrary() {
    FunctionTable& table = functions();
#define QR_ENTRY(name) table.name = &::name;
#include "entry_points.def"
#undef QR_ENTRY
}

void fillFromModule(void* module) {
    FunctionTable& table = functions();
#define QR_ENTRY(name)                                                  \
    {                                                                   \
        void* address = dlsym(module, #name);                           \
        if (debugging()) debugLine(#name, address);                     \
        table.name = reinterpret_cast<decltype(table.name)>(address);   \
    }
#include "entry_points.def"
#undef QR_ENTRY
}

}  // namespace quire_plugin
