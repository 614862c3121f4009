#include "host_api.h"

#include <map>
#include <mutex>
#include <string>

namespace quire_plugin {

namespace {
REALresolver hostResolver = nullptr;

// Resolution happens on the host thread and, for a few functions, on worker threads.
std::mutex& cacheMutex() {
    static std::mutex mutex;
    return mutex;
}
std::map<std::string, void*>& cache() {
    static std::map<std::string, void*> resolved;
    return resolved;
}

template <typename F>
F hostFunction(const char* name) {
    return reinterpret_cast<F>(resolveHostFunction(name));
}

template <typename F>
F hostFunction(const char* name, const char* fallback) {
    if (F function = hostFunction<F>(name)) return function;
    return hostFunction<F>(fallback);
}
}  // namespace

void setHostResolver(REALresolver resolver) {
    std::lock_guard<std::mutex> lock(cacheMutex());
    hostResolver = resolver;
    cache().clear();
}

bool hasHostResolver() { return hostResolver != nullptr; }

void* resolveHostFunction(const char* name) {
    std::lock_guard<std::mutex> lock(cacheMutex());
    auto found = cache().find(name);
    if (found != cache().end()) return found->second;
    void* address = hostResolver ? hostResolver(name) : nullptr;
    cache().emplace(name, address);
    return address;
}

double hostVersionNumber() {
    auto function = hostFunction<double (*)()>("REALGetRBVersion");
    return function ? function() : 0.0;
}

void registerPluginVersion(int code) {
    if (auto function = hostFunction<void (*)(int)>("RegisterPluginVersion")) function(code);
}

bool registerClassWithHost(void* definition) {
    auto function = hostFunction<void (*)(void*)>("PluginRegisterClass");
    if (!function) return false;
    function(definition);
    return true;
}

REALobject newInstance(const char* className) {
    auto function = hostFunction<REALobject (*)(const char*)>("PluginNewInstance");
    return function ? function(className) : nullptr;
}

void lockObject(REALobject object) {
    auto function = hostFunction<void (*)(REALobject)>("REALLockObject");
    if (function && object) function(object);
}

void unlockObject(REALobject object) {
    auto function = hostFunction<void (*)(REALobject)>("REALUnlockObject");
    if (function && object) function(object);
}

void lockString(REALstring text) {
    auto function = hostFunction<void (*)(REALstring)>("REALLockString");
    if (function && text) function(text);
}

void unlockString(REALstring text) {
    auto function = hostFunction<void (*)(REALstring)>("REALUnlockString");
    if (function && text) function(text);
}

void raiseException(REALobject exception) {
    if (auto function = hostFunction<void (*)(REALobject)>("RuntimeRaiseException")) function(exception);
}

bool setPropertyString(REALobject object, const char* name, REALstring value) {
    auto function = hostFunction<RBBoolean (*)(REALobject, const char*, REALstring)>("REALSetPropValueString");
    return function && function(object, name, value);
}

bool setPropertyInteger(REALobject object, const char* name, RBInteger value) {
    auto function = hostFunction<RBBoolean (*)(REALobject, const char*, RBInteger)>(
        "REALSetPropValueInteger", "REALSetPropValueInt");
    return function && function(object, name, value);
}

bool getPropertyInteger(REALobject object, const char* name, RBInteger* value) {
    auto function = hostFunction<RBBoolean (*)(REALobject, const char*, RBInteger*)>(
        "REALGetPropValueInteger", "REALGetPropValueInt");
    return function && function(object, name, value);
}

void* loadObjectMethod(REALobject object, const char* declaration) {
    auto function = hostFunction<void* (*)(REALobject, const char*)>("REALLoadObjectMethod");
    return function ? function(object, declaration) : nullptr;
}

REALstring buildString(const void* bytes, int byteCount) {
    auto function = hostFunction<REALstring (*)(const void*, int)>("REALBuildString");
    return function ? function(bytes, byteCount) : nullptr;
}

REALstring buildStringWithEncoding(const void* bytes, int byteCount, uint32_t encoding) {
    auto function = hostFunction<REALstring (*)(const void*, int, uint32_t)>("REALBuildStringWithEncoding");
    return function ? function(bytes, byteCount, encoding) : nullptr;
}

void setStringEncoding(REALstring text, uint32_t encoding) {
    auto function = hostFunction<void (*)(REALstring, uint32_t)>("REALSetStringEncoding");
    if (function && text) function(text, encoding);
}

uint32_t getStringEncoding(REALstring text) {
    auto function = hostFunction<uint32_t (*)(REALstring)>("REALGetStringEncoding");
    return function && text ? function(text) : kEncodingUnknown;
}

REALstring convertString(REALstring text, uint32_t encoding) {
    auto function = hostFunction<REALstring (*)(REALstring, uint32_t)>("REALConvertString");
    return function && text ? function(text, encoding) : nullptr;
}

bool getStringData(REALstring text, uint32_t encoding, REALstringData* data) {
    auto function = hostFunction<RBBoolean (*)(REALstring, uint32_t, REALstringData*)>("PluginGetStringData");
    return function && text && function(text, encoding, data);
}

void disposeStringData(REALstringData* data) {
    auto function = hostFunction<void (*)(REALstringData*)>("PluginDisposeStringData");
    if (function) function(data);
}

REALstring pathFromFolderItem(REALobject folderItem) {
    auto function = hostFunction<REALstring (*)(REALobject)>("REALpathFromFolderItem");
    return function && folderItem ? function(folderItem) : nullptr;
}

REALobject newMemoryBlockObject(int size) {
    auto function = hostFunction<REALobject (*)(int)>("newMemoryBlock");
    return function ? function(size) : nullptr;
}

void* memoryBlockPointer(REALobject block) {
    auto function = hostFunction<void* (*)(REALobject)>("memoryBlockGetPtr");
    return function && block ? function(block) : nullptr;
}

RBInteger memoryBlockSize(REALobject block) {
    auto function = hostFunction<RBInteger (*)(REALobject)>("memoryBlockGetSize");
    return function && block ? function(block) : 0;
}

REALarray newObjectArray(RBInteger upperBound) {
    auto function = hostFunction<REALarray (*)(int, RBInteger)>("RuntimeArrayCreateSingleDimBoundedArray");
    return function ? function(kArrayOfObjects, upperBound) : nullptr;
}

bool insertIntoObjectArray(REALarray array, RBInteger index, REALobject object) {
    using Insert = void (*)(REALarray, RBInteger, REALobject);
    auto getter = hostFunction<Insert (*)(REALarray)>("PluginObjectArrayInsertProc",
                                                      "RuntimeArrayDirectGetInsertProc");
    Insert insert = getter && array ? getter(array) : nullptr;
    if (!insert) return false;
    insert(array, index, object);
    return true;
}

void yieldToHost() {
    if (auto function = hostFunction<void (*)()>("REALYieldToRB")) function();
}

}  // namespace quire_plugin
