#pragma once
// A stand-in for the plugin's host: it loads the plugin with dlopen, answers its resolver with
// host functions of its own (strings with encodings and reference counts, objects with instance
// data, exceptions, memory blocks, dates, folder items, arrays, class registration), records the
// classes the plugin registers and calls their members by declaration, as host code would.
#include <cstdint>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace testhost {

using Integer = int64_t;
struct StringRec;
struct ObjectRec;
using Str = StringRec*;
using Obj = ObjectRec*;

// Host text encodings.
enum : uint32_t {
    kUtf8 = 0x08000100, kUtf16 = 0x100, kUtf32 = 0x0C000100, kAscii = 0x600,
    kLatin1Windows = 0x500, kLatin1Iso = 0x201, kMacRoman = 0, kUnknown = 0xFFFF
};

// How the host's UTF-16 conversion marks its output.
enum class Utf16Marking { None, NativeBom, SwappedBom };

struct Config {
    std::optional<double> version = 2020.0;  // none: the host offers no version function
    bool dateConstructorWithOffset = true;
    bool dateConstructorPlain = true;
    Utf16Marking utf16Marking = Utf16Marking::None;
};

// A value crossing the boundary. Byref arguments share a cell that the call writes back.
struct Value {
    enum Kind { Nil, Int, Dbl, Bool, String, Object } kind = Nil;
    Integer i = 0;
    double d = 0;
    bool b = false;
    Str s = nullptr;  // held by this value
    Obj o = nullptr;  // held by this value
};
using Ref = std::shared_ptr<Value>;

Value nil();
Value integer(Integer v);
Value dbl(double v);
Value boolean(bool v);
Value text(const std::string& utf8);           // a new string tagged UTF-8
Value bytes(const std::string& raw, uint32_t encoding);
Value object(Obj o);                           // takes a reference
Ref ref(Value initial = nil());

struct MethodInfo {
    std::string declaration;
    void* function;
    void* setter;
    uint32_t flags;
    bool shared;
};
struct PropertyInfo {
    std::string name, type;
    void* getter;
    void* setter;
    int32_t param;
    uint32_t flags;
    bool shared;
};
struct ClassInfo {
    std::string name;
    size_t dataSize = 0;
    bool oldLayout = false;
    uint32_t version = 0;
    uint32_t flags = 0;
    void* constructor = nullptr;
    void* destructor = nullptr;
    std::vector<MethodInfo> methods;
    std::vector<PropertyInfo> properties;
    std::vector<std::string> constants;
};

class Host {
public:
    // The one host of this process, configured and with the plugin loaded.
    static Host& start(const Config& config = Config());
    static Host& get();

    const Config& config() const { return config_; }
    // Host behaviour that tests switch while the host runs; the version stays as started.
    void setDateConstructors(bool withOffset, bool plain);
    void setUtf16Marking(Utf16Marking marking);
    int pluginVersionCode() const { return pluginVersionCode_; }
    const std::vector<ClassInfo>& classes() const { return classes_; }
    const ClassInfo* findClass(const std::string& name) const;
    std::vector<std::string> debugLines() const;
    void clearDebugLines();
    // The value of a registered class constant ("Name = 14", "Name = &H7F"); throws when absent.
    Integer constant(const std::string& className, const std::string& name) const;

    // An argument of a call. A value made in the argument list (text("x"), host().date(...)) is
    // released when the call returns, as host code releases its temporaries; a value the caller
    // holds (held.v, *cell) stays the caller's. Byref parameters take Ref arguments.
    struct Arg {
        Arg(Value&& v) : value(v), owned(true) {}
        Arg(const Value& v) : value(v) {}
        Arg(Ref r) : cell(std::move(r)) {}
        Value value;
        Ref cell;
        bool owned = false;
    };

    // Objects: New ClassName(args), a host FolderItem, Date or MemoryBlock.
    Value create(const std::string& className, std::vector<Arg> args = {});
    Value folderItem(const std::string& path);
    Value date(int year, int month, int day, int hour = 0, int minute = 0, int second = 0);
    Value memoryBlock(const std::string& content);

    // Calls a method by its full declaration or by its name (the overload whose parameters fit the
    // arguments).
    Value call(const Value& self, const std::string& method, std::vector<Arg> args = {});
    Value callShared(const std::string& className, const std::string& method, std::vector<Arg> args = {});
    // Assigns through a method's setter: Method(args) = value.
    void assign(const Value& self, const std::string& method, std::vector<Arg> args, Arg value);
    Value get(const Value& self, const std::string& property);
    void set(const Value& self, const std::string& property, Arg value);
    Value getShared(const std::string& className, const std::string& property);
    void setShared(const std::string& className, const std::string& property, Arg value);

    // The exception raised by the last call, if any: its class and message.
    bool raised() const { return !exceptionClass_.empty(); }
    std::string exceptionClass() const { return exceptionClass_; }
    std::string exceptionMessage() const { return exceptionMessage_; }

    // Reading host values.
    static std::string utf8(const Value& v);      // the text as UTF-8 ("" for nil)
    static std::string rawBytes(const Value& v);  // the stored bytes
    static uint32_t encoding(const Value& v);
    static std::string className(const Value& v);
    static Integer dateField(const Value& v, const std::string& field);
    // The integer properties set on a host object through the property functions, in order.
    static std::vector<std::string> propertiesSet(const Value& v);
    static std::string memoryBlockBytes(const Value& v);
    static std::vector<Value> arrayElements(const Value& v);
    static void release(Value& v);
    static int liveObjects();

private:
    Config config_;
    int pluginVersionCode_ = -1;
    std::vector<ClassInfo> classes_;
    std::string exceptionClass_, exceptionMessage_;
    friend struct HostRuntime;
};

// Keeps a Value's references for a scope.
struct Held {
    Value v;
    explicit Held(Value value) : v(value) {}
    ~Held() { Host::release(v); }
    Held(const Held&) = delete;
    Held& operator=(const Held&) = delete;
};

}  // namespace testhost
