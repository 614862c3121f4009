#include "glue.h"

#include <string>

namespace quire_plugin {

bool requireEntry(bool present, const char* entryName) {
    if (present) return true;
    std::string name = std::string("_") + entryName;
    if (debugging()) debugLine(name.c_str(), "is nil");
    raiseHostException("FunctionNotFoundException", (name + " missing").c_str());
    return false;
}

bool requireHandle(const void* handle) {
    if (handle) return true;
    raiseNotInitialized();
    return false;
}

bool requireArgument(const void* argument, const char* label, const char* message) {
    if (argument) return true;
    if (debugging()) debugLine(label, "is nil");
    raiseNilObject(message);
    return false;
}

void assignString(REALstring* slot, REALstring value) {
    if (!slot) {
        unlockString(value);
        return;
    }
    REALstring old = *slot;
    *slot = value;
    unlockString(old);
}

void assignObject(REALobject* slot, REALobject value) {
    if (!slot) {
        unlockObject(value);
        return;
    }
    REALobject old = *slot;
    *slot = value;
    unlockObject(old);
}

}  // namespace quire_plugin
