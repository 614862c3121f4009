// The host functions the plugin resolves, and the records behind host strings and objects.
#include "host_runtime.h"

#include <dlfcn.h>

#include <atomic>
#include <cstdlib>
#include <cstring>
#include <mutex>
#include <set>
#include <stdexcept>

#include "../../../plugin/host_sdk.h"
#include "host_text.h"

namespace testhost {

namespace {

Host* theHost = nullptr;
std::mutex debugMutex;
std::vector<std::string> debugLog;
std::map<Obj, BuiltinState> builtins;
std::set<std::string> classNames;  // stable storage for ObjectRec::className
std::atomic<int> live{0};

const std::set<std::string> kBuiltinClasses = {"Date", "RuntimeException", "NilObjectException",
                                               "FunctionNotFoundException", "OutOfBoundsException",
                                               "OutOfMemoryException", "FolderItem", "MemoryBlock", "Array"};

const char* stableName(const std::string& name) { return classNames.insert(name).first->c_str(); }

ClassInfo* pluginClass(const std::string& name) {
    for (auto& c : const_cast<std::vector<ClassInfo>&>(theHost->classes()))
        if (c.name == name) return &c;
    return nullptr;
}

size_t headerSize() { return sizeof(ObjectRec); }

// ---- Host functions ----

double getVersion() { return *theHost->config().version; }
void registerPluginVersion(int code);
void pluginRegisterClass(void* definition) { HostRuntime::registerClass(definition); }
REALobject pluginNewInstance(const char* name) {
    return reinterpret_cast<REALobject>(HostRuntime::newObject(name));
}
void hostLockObject(REALobject o) { HostRuntime::lock(reinterpret_cast<Obj>(o)); }
void hostUnlockObject(REALobject o) { HostRuntime::unlock(reinterpret_cast<Obj>(o)); }
void hostLockString(REALstring s) { HostRuntime::lockString(reinterpret_cast<Str>(s)); }
void hostUnlockString(REALstring s) { HostRuntime::unlockString(reinterpret_cast<Str>(s)); }
void raiseException(REALobject o) { HostRuntime::raise(reinterpret_cast<Obj>(o)); }

RBBoolean setPropString(REALobject o, const char* name, REALstring value) {
    auto obj = reinterpret_cast<Obj>(o);
    if (std::strcmp(name, "Message") != 0) return 0;
    BuiltinState& st = HostRuntime::state(obj);
    HostRuntime::lockString(reinterpret_cast<Str>(value));
    HostRuntime::unlockString(st.message);
    st.message = reinterpret_cast<Str>(value);
    return 1;
}
RBBoolean setPropInteger(REALobject o, const char* name, RBInteger value) {
    BuiltinState& st = HostRuntime::state(reinterpret_cast<Obj>(o));
    st.integers[name] = value;
    st.integersSet.emplace_back(name);
    return 1;
}
RBBoolean getPropInteger(REALobject o, const char* name, RBInteger* value) {
    auto& ints = HostRuntime::state(reinterpret_cast<Obj>(o)).integers;
    auto found = ints.find(name);
    if (found == ints.end()) return 0;
    *value = found->second;
    return 1;
}

void setDate(Obj d, RBInteger y, RBInteger mo, RBInteger day, RBInteger h, RBInteger mi, RBInteger s) {
    auto& ints = HostRuntime::state(d).integers;
    ints["Year"] = y, ints["Month"] = mo, ints["Day"] = day, ints["Hour"] = h, ints["Minute"] = mi, ints["Second"] = s;
}
void dateConstructorWithOffset(REALobject d, RBInteger y, RBInteger mo, RBInteger day, RBInteger h, RBInteger mi,
                               RBInteger s, double offset) {
    setDate(reinterpret_cast<Obj>(d), y, mo, day, h, mi, s);
    HostRuntime::state(reinterpret_cast<Obj>(d)).integers["GMTOffsetGiven"] = offset == -10000.0 ? 1 : 0;
}
void dateConstructorPlain(REALobject d, RBInteger y, RBInteger mo, RBInteger day, RBInteger h, RBInteger mi, RBInteger s) {
    setDate(reinterpret_cast<Obj>(d), y, mo, day, h, mi, s);
}
void* loadObjectMethod(REALobject o, const char* declaration) {
    auto obj = reinterpret_cast<Obj>(o);
    if (!obj || std::strcmp(obj->className, "Date") != 0) return nullptr;
    std::string decl = declaration;
    if (decl.find("GMTOffset as Double") != std::string::npos)
        return theHost->config().dateConstructorWithOffset ? reinterpret_cast<void*>(&dateConstructorWithOffset) : nullptr;
    if (decl.rfind("Constructor(Year as Integer", 0) == 0)
        return theHost->config().dateConstructorPlain ? reinterpret_cast<void*>(&dateConstructorPlain) : nullptr;
    return nullptr;
}

REALstring buildString(const char* bytes, int count) {
    return reinterpret_cast<REALstring>(HostRuntime::newString(std::string(bytes, count), kUnknown));
}
REALstring buildStringWithEncoding(const char* bytes, int count, uint32_t encoding) {
    return reinterpret_cast<REALstring>(HostRuntime::newString(std::string(bytes, count), encoding));
}
void setStringEncoding(REALstring s, uint32_t encoding) { reinterpret_cast<Str>(s)->encoding = encoding; }
uint32_t getStringEncoding(REALstring s) { return reinterpret_cast<Str>(s)->encoding; }

bool convert(Str s, uint32_t target, std::string& out) {
    if (target == s->encoding || target == kUnknown) {
        out = s->bytes;
        return true;
    }
    std::vector<char32_t> cps;
    if (!decodeText(s->bytes, s->encoding, cps)) return false;
    if (target == kUtf16) {
        Utf16Marking marking = theHost->config().utf16Marking;
        if (marking != Utf16Marking::None) cps.insert(cps.begin(), 0xFEFF);
        out = encodeText(cps, target);
        if (marking == Utf16Marking::SwappedBom)
            for (size_t i = 0; i + 1 < out.size(); i += 2) std::swap(out[i], out[i + 1]);
        return true;
    }
    out = encodeText(cps, target);
    return true;
}
REALstring convertString(REALstring s, uint32_t target) {
    std::string out;
    if (!convert(reinterpret_cast<Str>(s), target, out)) return nullptr;
    return reinterpret_cast<REALstring>(HostRuntime::newString(out, target));
}
RBBoolean getStringData(REALstring s, uint32_t encoding, REALstringData* data) {
    std::string out;
    if (!s || !convert(reinterpret_cast<Str>(s), encoding, out)) return 0;
    char* copy = static_cast<char*>(std::calloc(out.size() + 4, 1));
    std::memcpy(copy, out.data(), out.size());
    data->data = copy;
    data->length = out.size();
    data->encoding = encoding;
    return 1;
}
void disposeStringData(REALstringData* data) {
    std::free(const_cast<void*>(data->data));
    data->data = nullptr;
}

REALstring pathFromFolderItem(REALobject o) {
    return reinterpret_cast<REALstring>(HostRuntime::newString(HostRuntime::state(reinterpret_cast<Obj>(o)).path, kUtf8));
}

REALobject newMemoryBlock(int size) {
    Obj block = HostRuntime::newObject("MemoryBlock");
    auto* record = reinterpret_cast<REALmemoryBlockRecordOld*>(block);
    record->data = std::calloc(size > 0 ? size : 1, 1);
    record->size = size;
    return reinterpret_cast<REALobject>(block);
}
void* memoryBlockGetPtr(REALobject o) { return reinterpret_cast<REALmemoryBlockRecordOld*>(o)->data; }
RBInteger memoryBlockGetSize(REALobject o) { return reinterpret_cast<REALmemoryBlockRecordOld*>(o)->size; }

REALarray createArray(int kind, RBInteger) {
    if (kind != 4) return nullptr;
    return reinterpret_cast<REALarray>(HostRuntime::newObject("Array"));
}
void arrayInsert(REALarray a, RBInteger index, REALobject o) {
    auto& elements = HostRuntime::state(reinterpret_cast<Obj>(a)).elements;
    HostRuntime::lock(reinterpret_cast<Obj>(o));
    elements.insert(elements.begin() + static_cast<long>(index), reinterpret_cast<Obj>(o));
}
using InsertProc = void (*)(REALarray, RBInteger, REALobject);
InsertProc insertProc(REALarray) { return &arrayInsert; }

std::atomic<long> yields{0};
void yieldToHost() { ++yields; }

void debugSink(const char* text) {
    std::lock_guard<std::mutex> lock(debugMutex);
    debugLog.emplace_back(text);
}

}  // namespace

namespace {
void registerPluginVersion(int code) { HostRuntime::setVersionCode(code); }
}  // namespace

void HostRuntime::setVersionCode(int code) { theHost->pluginVersionCode_ = code; }

Str HostRuntime::newString(const std::string& bytes, uint32_t encoding) {
    return new StringRec{1, encoding, bytes};
}

Obj HostRuntime::newObject(const std::string& className) {
    ClassInfo* plugin = pluginClass(className);
    if (!plugin && !kBuiltinClasses.count(className)) return nullptr;
    size_t payload = plugin ? plugin->dataSize : sizeof(REALmemoryBlockRecordOld) - headerSize();
    auto* memory = static_cast<char*>(std::calloc(headerSize() + payload + 1, 1));
    auto* object = reinterpret_cast<Obj>(memory);
    object->className = stableName(className);
    object->refs = 1;
    ++live;
    if (plugin && plugin->constructor) reinterpret_cast<void (*)(REALobject)>(plugin->constructor)(reinterpret_cast<REALobject>(object));
    return object;
}

void HostRuntime::lock(Obj o) {
    if (o) ++o->refs;
}

void HostRuntime::unlock(Obj o) {
    if (!o || --o->refs > 0) return;
    if (ClassInfo* plugin = pluginClass(o->className)) {
        o->refs = 1;  // the destructor may hand the object around
        if (plugin->destructor) reinterpret_cast<void (*)(REALobject)>(plugin->destructor)(reinterpret_cast<REALobject>(o));
    }
    auto found = builtins.find(o);
    if (found != builtins.end()) {
        BuiltinState st = std::move(found->second);
        builtins.erase(found);
        unlockString(st.message);
        for (Obj element : st.elements) unlock(element);
    }
    if (std::strcmp(o->className, "MemoryBlock") == 0) std::free(reinterpret_cast<REALmemoryBlockRecordOld*>(o)->data);
    std::free(o);
    --live;
}

void HostRuntime::lockString(Str s) {
    if (s) ++s->refs;
}

void HostRuntime::unlockString(Str s) {
    if (s && --s->refs == 0) delete s;
}

BuiltinState& HostRuntime::state(Obj o) { return builtins[o]; }

void* HostRuntime::data(Obj o) { return reinterpret_cast<char*>(o) + headerSize(); }

void HostRuntime::raise(Obj exception) {
    theHost->exceptionClass_ = exception->className;
    Str message = state(exception).message;
    theHost->exceptionMessage_ = message ? message->bytes : "";
}

void* HostRuntime::resolve(const char* name) {
    static const std::map<std::string, void*> functions = {
        {"RegisterPluginVersion", reinterpret_cast<void*>(&registerPluginVersion)},
        {"PluginRegisterClass", reinterpret_cast<void*>(&pluginRegisterClass)},
        {"PluginNewInstance", reinterpret_cast<void*>(&pluginNewInstance)},
        {"REALLockObject", reinterpret_cast<void*>(&hostLockObject)},
        {"REALUnlockObject", reinterpret_cast<void*>(&hostUnlockObject)},
        {"REALLockString", reinterpret_cast<void*>(&hostLockString)},
        {"REALUnlockString", reinterpret_cast<void*>(&hostUnlockString)},
        {"RuntimeRaiseException", reinterpret_cast<void*>(&raiseException)},
        {"REALSetPropValueString", reinterpret_cast<void*>(&setPropString)},
        {"REALSetPropValueInteger", reinterpret_cast<void*>(&setPropInteger)},
        {"REALGetPropValueInteger", reinterpret_cast<void*>(&getPropInteger)},
        {"REALLoadObjectMethod", reinterpret_cast<void*>(&loadObjectMethod)},
        {"REALBuildString", reinterpret_cast<void*>(&buildString)},
        {"REALBuildStringWithEncoding", reinterpret_cast<void*>(&buildStringWithEncoding)},
        {"REALSetStringEncoding", reinterpret_cast<void*>(&setStringEncoding)},
        {"REALGetStringEncoding", reinterpret_cast<void*>(&getStringEncoding)},
        {"REALConvertString", reinterpret_cast<void*>(&convertString)},
        {"PluginGetStringData", reinterpret_cast<void*>(&getStringData)},
        {"PluginDisposeStringData", reinterpret_cast<void*>(&disposeStringData)},
        {"REALpathFromFolderItem", reinterpret_cast<void*>(&pathFromFolderItem)},
        {"newMemoryBlock", reinterpret_cast<void*>(&newMemoryBlock)},
        {"memoryBlockGetPtr", reinterpret_cast<void*>(&memoryBlockGetPtr)},
        {"memoryBlockGetSize", reinterpret_cast<void*>(&memoryBlockGetSize)},
        {"RuntimeArrayCreateSingleDimBoundedArray", reinterpret_cast<void*>(&createArray)},
        {"PluginObjectArrayInsertProc", reinterpret_cast<void*>(&insertProc)},
        {"REALYieldToRB", reinterpret_cast<void*>(&yieldToHost)},
        {"QuireDebugSink", reinterpret_cast<void*>(&debugSink)},
    };
    if (std::strcmp(name, "REALGetRBVersion") == 0)
        return theHost->config().version ? reinterpret_cast<void*>(&getVersion) : nullptr;
    auto found = functions.find(name);
    return found == functions.end() ? nullptr : found->second;
}

namespace {
template <typename Definition, typename Method, typename Property, typename Constant>
ClassInfo readDefinition(Definition* d) {
    ClassInfo info;
    info.name = d->name;
    info.dataSize = d->dataSize;
    info.version = d->version;
    info.flags = d->mFlags;
    info.constructor = reinterpret_cast<void*>(d->constructor);
    info.destructor = reinterpret_cast<void*>(d->destructor);
    auto methods = [&](Method* list, size_t count, bool shared) {
        for (size_t i = 0; i < count; ++i)
            info.methods.push_back({list[i].declaration, reinterpret_cast<void*>(list[i].function),
                                    reinterpret_cast<void*>(list[i].setterFunction), list[i].mFlags, shared});
    };
    auto properties = [&](Property* list, size_t count, bool shared) {
        for (size_t i = 0; i < count; ++i)
            info.properties.push_back({list[i].name, list[i].type, reinterpret_cast<void*>(list[i].getter),
                                       reinterpret_cast<void*>(list[i].setter), list[i].param, list[i].flags, shared});
    };
    methods(d->methods, d->methodCount, false);
    methods(d->sharedMethods, d->sharedMethodCount, true);
    properties(d->properties, d->propertyCount, false);
    properties(d->sharedProperties, d->sharedPropertyCount, true);
    for (size_t i = 0; i < d->constantCount; ++i) info.constants.push_back(static_cast<Constant*>(d->constants)[i].declaration);
    // Instance data follows the object header.
    d->forSystemUse = static_cast<RBInteger>(sizeof(ObjectRec));
    return info;
}
}  // namespace

void HostRuntime::registerClass(void* definition) {
    ClassInfo info;
    if (theHost->pluginVersionCode() < 10) {
        info = readDefinition<REALclassDefinitionOld, REALmethodDefinitionOld, REALpropertyOld, REALconstantOld>(
            static_cast<REALclassDefinitionOld*>(definition));
        info.oldLayout = true;
    } else {
        info = readDefinition<REALclassDefinition, REALmethodDefinition, REALproperty, REALconstant>(
            static_cast<REALclassDefinition*>(definition));
    }
    theHost->classes_.push_back(info);
}

// ---- Host ----

Host& Host::start(const Config& config) {
    if (theHost) throw std::logic_error("the host runs once per process");
    theHost = new Host();
    theHost->config_ = config;
    void* plugin = dlopen(QUIRE_PLUGIN_PATH, RTLD_NOW | RTLD_LOCAL);
    if (!plugin) throw std::runtime_error(dlerror());
    auto main = reinterpret_cast<void (*)(void* (*)(const char*))>(dlsym(plugin, "REALPluginMain"));
    if (!main) throw std::runtime_error("no REALPluginMain");
    main([](const char* name) { return HostRuntime::resolve(name); });
    return *theHost;
}

Host& Host::get() { return *theHost; }

const ClassInfo* Host::findClass(const std::string& name) const {
    for (const auto& c : classes_)
        if (c.name == name) return &c;
    return nullptr;
}

std::vector<std::string> Host::debugLines() const {
    std::lock_guard<std::mutex> lock(debugMutex);
    return debugLog;
}

void Host::clearDebugLines() {
    std::lock_guard<std::mutex> lock(debugMutex);
    debugLog.clear();
}

int Host::liveObjects() { return live; }

void Host::setDateConstructors(bool withOffset, bool plain) {
    config_.dateConstructorWithOffset = withOffset;
    config_.dateConstructorPlain = plain;
}

void Host::setUtf16Marking(Utf16Marking marking) { config_.utf16Marking = marking; }

Integer Host::constant(const std::string& className, const std::string& name) const {
    const ClassInfo* info = findClass(className);
    if (info)
        for (const std::string& declaration : info->constants) {
            if (declaration.compare(0, name.size() + 3, name + " = ") != 0) continue;
            std::string value = declaration.substr(name.size() + 3);
            if (value.size() > 2 && value[0] == '&' && (value[1] == 'H' || value[1] == 'h'))
                return std::stoll(value.substr(2), nullptr, 16);
            return std::stoll(value);
        }
    throw std::invalid_argument("no constant " + className + "." + name);
}

Value Host::folderItem(const std::string& path) {
    Obj item = HostRuntime::newObject("FolderItem");
    HostRuntime::state(item).path = path;
    return object(item);
}

Value Host::date(int year, int month, int day, int hour, int minute, int second) {
    Obj d = HostRuntime::newObject("Date");
    setDate(d, year, month, day, hour, minute, second);
    return object(d);
}

Value Host::memoryBlock(const std::string& content) {
    auto block = reinterpret_cast<Obj>(newMemoryBlock(static_cast<int>(content.size())));
    if (!content.empty()) std::memcpy(reinterpret_cast<REALmemoryBlockRecordOld*>(block)->data, content.data(), content.size());
    return object(block);
}

std::string Host::rawBytes(const Value& v) { return v.kind == Value::String && v.s ? v.s->bytes : ""; }
uint32_t Host::encoding(const Value& v) { return v.kind == Value::String && v.s ? v.s->encoding : kUnknown; }

std::string Host::utf8(const Value& v) {
    if (v.kind != Value::String || !v.s) return "";
    std::string out;
    convert(v.s, kUtf8, out);
    return out;
}

std::string Host::className(const Value& v) { return v.kind == Value::Object && v.o ? v.o->className : ""; }

Integer Host::dateField(const Value& v, const std::string& field) {
    return v.kind == Value::Object && v.o ? HostRuntime::state(v.o).integers[field] : 0;
}

std::vector<std::string> Host::propertiesSet(const Value& v) {
    if (v.kind != Value::Object || !v.o) return {};
    return HostRuntime::state(v.o).integersSet;
}

std::string Host::memoryBlockBytes(const Value& v) {
    if (v.kind != Value::Object || !v.o) return "";
    auto* record = reinterpret_cast<REALmemoryBlockRecordOld*>(v.o);
    return std::string(static_cast<const char*>(record->data), static_cast<size_t>(record->size));
}

std::vector<Value> Host::arrayElements(const Value& v) {
    std::vector<Value> out;
    if (v.kind != Value::Object || !v.o) return out;
    for (Obj o : HostRuntime::state(v.o).elements) {
        HostRuntime::lock(o);
        out.push_back(object(o));
    }
    return out;
}

void Host::release(Value& v) {
    if (v.kind == Value::String) HostRuntime::unlockString(v.s);
    if (v.kind == Value::Object) HostRuntime::unlock(v.o);
    v = Value();
}

// ---- Values ----

Value nil() { return Value(); }
Value integer(Integer v) {
    Value r;
    r.kind = Value::Int;
    r.i = v;
    return r;
}
Value dbl(double v) {
    Value r;
    r.kind = Value::Dbl;
    r.d = v;
    return r;
}
Value boolean(bool v) {
    Value r;
    r.kind = Value::Bool;
    r.b = v;
    return r;
}
Value text(const std::string& utf8) { return bytes(utf8, kUtf8); }
Value bytes(const std::string& raw, uint32_t encoding) {
    Value r;
    r.kind = Value::String;
    r.s = HostRuntime::newString(raw, encoding);
    return r;
}
Value object(Obj o) {
    Value r;
    if (!o) return r;
    r.kind = Value::Object;
    r.o = o;
    return r;
}
Ref ref(Value initial) { return std::make_shared<Value>(initial); }

}  // namespace testhost
