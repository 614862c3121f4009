#include "external_library.h"

#include <dlfcn.h>

#include "function_table.h"

namespace quire_plugin {

namespace {
std::string& lastError() {
    static std::string text;
    return text;
}
}  // namespace

bool loadExternalLibrary(const std::string& path) {
    void* module = dlopen(path.c_str(), RTLD_NOW | RTLD_LOCAL);
    if (!module) {
        const char* reason = dlerror();
        lastError() = reason ? reason : "the library could not be loaded";
        return false;
    }
    fillFromModule(module);
    return functions().qrBookReleaseW != nullptr;
}

const std::string& externalLibraryError() { return lastError(); }
void clearExternalLibraryError() { lastError().clear(); }

}  // namespace quire_plugin
