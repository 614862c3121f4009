#pragma once
// The host's runtime records behind its strings and objects, shared by the host's files.
#include <cstdint>
#include <map>
#include <string>
#include <vector>

#include "test_host.h"

namespace testhost {

struct StringRec {
    int refs;
    uint32_t encoding;
    std::string bytes;
};

// Every object starts with this header; instance data or a memory block's fields follow it.
struct ObjectRec {
    const char* className;  // points into a stable name list
    intptr_t refs;
};

// State of the host's own classes, kept beside their objects.
struct BuiltinState {
    std::map<std::string, Integer> integers;
    std::vector<std::string> integersSet;  // names given to the property setter, in order
    Str message = nullptr;
    std::string path;
    std::vector<Obj> elements;
};

struct HostRuntime {
    static Str newString(const std::string& bytes, uint32_t encoding);
    static Obj newObject(const std::string& className);
    static void lock(Obj o);
    static void unlock(Obj o);
    static void lockString(Str s);
    static void unlockString(Str s);
    static BuiltinState& state(Obj o);
    static void* data(Obj o);  // instance data of plugin classes
    static void* resolve(const char* name);
    static void registerClass(void* definition);
    static void raise(Obj exception);
    static void setVersionCode(int code);
};

}  // namespace testhost
