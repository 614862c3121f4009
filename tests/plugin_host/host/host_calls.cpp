// Calling plugin members the way host code does: by declaration, with the host's argument kinds.
#include <cctype>
#include <cstring>
#include <stdexcept>

#include "host_runtime.h"

namespace testhost {

namespace {

struct Param {
    bool byref = false;
    std::string type;  // lower case
    std::string defaultText;
    bool hasDefault = false;
};
struct Signature {
    std::string name;
    std::vector<Param> params;
    std::string returnType;  // lower case, empty for none
};

std::string lower(std::string s) {
    for (char& c : s) c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
    return s;
}
std::string trim(const std::string& s) {
    size_t b = s.find_first_not_of(' '), e = s.find_last_not_of(' ');
    return b == std::string::npos ? "" : s.substr(b, e - b + 1);
}

Signature parse(const std::string& declaration) {
    Signature sig;
    size_t open = declaration.find('(');
    size_t asPos = declaration.find(" as ");
    if (open == std::string::npos || (asPos != std::string::npos && asPos < open)) {
        sig.name = trim(declaration.substr(0, asPos));
        if (asPos != std::string::npos) sig.returnType = lower(trim(declaration.substr(asPos + 4)));
        return sig;
    }
    sig.name = trim(declaration.substr(0, open));
    size_t close = declaration.rfind(')');
    std::string inside = declaration.substr(open + 1, close - open - 1);
    std::string rest = declaration.substr(close + 1);
    if (rest.find(" as ") != std::string::npos) sig.returnType = lower(trim(rest.substr(rest.find(" as ") + 4)));
    size_t start = 0;
    while (!trim(inside).empty() && start <= inside.size()) {
        size_t comma = inside.find(',', start);
        std::string part = trim(inside.substr(start, comma == std::string::npos ? std::string::npos : comma - start));
        Param p;
        if (lower(part).rfind("byref ", 0) == 0) {
            p.byref = true;
            part = part.substr(6);
        }
        size_t eq = part.find(" = ");
        if (eq != std::string::npos) {
            p.hasDefault = true;
            p.defaultText = trim(part.substr(eq + 3));
            part = part.substr(0, eq);
        }
        p.type = lower(trim(part.substr(part.find(" as ") + 4)));
        sig.params.push_back(p);
        if (comma == std::string::npos) break;
        start = comma + 1;
    }
    return sig;
}

bool isObjectType(const std::string& type) {
    return type != "integer" && type != "boolean" && type != "double" && type != "string" && type != "color";
}

bool fits(const Param& p, const Host::Arg& a) {
    if (p.byref != static_cast<bool>(a.cell)) return false;
    const Value& v = a.cell ? *a.cell : a.value;
    if (a.cell) return true;
    switch (v.kind) {
        case Value::Int: return p.type == "integer" || p.type == "double" || p.type == "color";
        case Value::Dbl: return p.type == "double";
        case Value::Bool: return p.type == "boolean";
        case Value::String: return p.type == "string";
        case Value::Object: return isObjectType(p.type) && lower(v.o->className) == p.type;
        case Value::Nil: return p.type == "string" || isObjectType(p.type);
    }
    return false;
}

Value defaultValue(const Param& p) {
    const std::string& t = p.defaultText;
    if (t == "nil") return nil();
    if (t == "\"\"") return nil();
    if (lower(t) == "true" || lower(t) == "false") return boolean(lower(t) == "true");
    if (p.type == "double") return dbl(std::stod(t));
    return integer(std::stoll(t));
}

// The x86-64 calling convention places integer-class and floating-point arguments in separate
// registers, so one untyped call shape serves every plugin function: six integer registers, eight
// floating-point registers, then integer arguments on the stack in order.
using IntCall = int64_t (*)(int64_t, int64_t, int64_t, int64_t, int64_t, int64_t, double, double, double, double, double,
                            double, double, double, int64_t, int64_t, int64_t, int64_t, int64_t, int64_t, int64_t,
                            int64_t, int64_t, int64_t, int64_t, int64_t, int64_t, int64_t, int64_t, int64_t);
using DoubleCall = double (*)(int64_t, int64_t, int64_t, int64_t, int64_t, int64_t, double, double, double, double, double,
                              double, double, double, int64_t, int64_t, int64_t, int64_t, int64_t, int64_t, int64_t,
                              int64_t, int64_t, int64_t, int64_t, int64_t, int64_t, int64_t, int64_t, int64_t);

struct Frame {
    std::vector<int64_t> ints;
    std::vector<double> doubles;
    void add(int64_t v) { ints.push_back(v); }
    void add(double v) { doubles.push_back(v); }
};

int64_t invokeInt(void* fn, Frame f) {
    f.ints.resize(22, 0);
    f.doubles.resize(8, 0.0);
    auto& i = f.ints;
    auto& d = f.doubles;
    return reinterpret_cast<IntCall>(fn)(i[0], i[1], i[2], i[3], i[4], i[5], d[0], d[1], d[2], d[3], d[4], d[5], d[6], d[7],
                                         i[6], i[7], i[8], i[9], i[10], i[11], i[12], i[13], i[14], i[15], i[16], i[17],
                                         i[18], i[19], i[20], i[21]);
}
double invokeDouble(void* fn, Frame f) {
    f.ints.resize(22, 0);
    f.doubles.resize(8, 0.0);
    auto& i = f.ints;
    auto& d = f.doubles;
    return reinterpret_cast<DoubleCall>(fn)(i[0], i[1], i[2], i[3], i[4], i[5], d[0], d[1], d[2], d[3], d[4], d[5], d[6],
                                            d[7], i[6], i[7], i[8], i[9], i[10], i[11], i[12], i[13], i[14], i[15], i[16],
                                            i[17], i[18], i[19], i[20], i[21]);
}

// Storage for one byref argument during the call.
struct ByrefSlot {
    Ref cell;
    std::string type;
    Integer integerValue = 0;
    double doubleValue = 0;
    int8_t boolValue = 0;
    Str stringValue = nullptr;
    Obj objectValue = nullptr;
};

void addValue(Frame& frame, const std::string& type, const Value& v) {
    if (type == "double") frame.add(v.kind == Value::Int ? static_cast<double>(v.i) : v.d);
    else if (type == "integer" || type == "color") frame.add(static_cast<int64_t>(v.i));
    else if (type == "boolean") frame.add(static_cast<int64_t>(v.b ? 1 : 0));
    else if (type == "string") frame.add(reinterpret_cast<int64_t>(v.kind == Value::String ? v.s : nullptr));
    else frame.add(reinterpret_cast<int64_t>(v.kind == Value::Object ? v.o : nullptr));
}

Value resultOf(const std::string& type, void* fn, const Frame& frame) {
    if (type.empty()) {
        invokeInt(fn, frame);
        return nil();
    }
    if (type == "double") return dbl(invokeDouble(fn, frame));
    int64_t raw = invokeInt(fn, frame);
    if (type == "integer") return integer(raw);
    if (type == "color") return integer(static_cast<uint32_t>(raw));
    if (type == "boolean") return boolean(static_cast<int8_t>(raw & 0xFF) != 0);
    if (type == "string") {
        Value v;
        if (raw) v.kind = Value::String, v.s = reinterpret_cast<Str>(raw);
        return v;
    }
    return object(reinterpret_cast<Obj>(raw));
}

// Calls `fn` with an optional instance, the arguments for `sig` and `extra` after them.
Value invoke(const Signature& sig, void* fn, Obj self, std::vector<Host::Arg> args, const Value* extra,
             const std::string& extraType) {
    Frame frame;
    if (self) frame.add(reinterpret_cast<int64_t>(self));
    std::vector<ByrefSlot> slots(sig.params.size());
    for (size_t k = 0; k < sig.params.size(); ++k) {
        const Param& p = sig.params[k];
        if (k >= args.size()) {
            if (!p.hasDefault) throw std::invalid_argument("missing argument for " + sig.name);
            addValue(frame, p.type, defaultValue(p));
            continue;
        }
        if (!p.byref) {
            addValue(frame, p.type, args[k].value);
            continue;
        }
        ByrefSlot& slot = slots[k];
        slot.cell = args[k].cell;
        slot.type = p.type;
        const Value& v = *slot.cell;
        slot.integerValue = v.i;
        slot.doubleValue = v.d;
        slot.boolValue = v.b;
        // The slot takes over the cell's reference; the call may replace it.
        slot.stringValue = v.kind == Value::String ? v.s : nullptr;
        slot.objectValue = v.kind == Value::Object ? v.o : nullptr;
        void* address = p.type == "integer" ? static_cast<void*>(&slot.integerValue)
                        : p.type == "double" ? static_cast<void*>(&slot.doubleValue)
                        : p.type == "boolean" ? static_cast<void*>(&slot.boolValue)
                        : p.type == "string" ? static_cast<void*>(&slot.stringValue)
                                             : static_cast<void*>(&slot.objectValue);
        frame.add(reinterpret_cast<int64_t>(address));
    }
    if (extra) addValue(frame, extraType, *extra);
    Value result = resultOf(sig.returnType, fn, frame);
    for (ByrefSlot& slot : slots) {
        if (!slot.cell) continue;
        Value& out = *slot.cell;
        if (slot.type == "integer") out = integer(slot.integerValue);
        else if (slot.type == "double") out = dbl(slot.doubleValue);
        else if (slot.type == "boolean") out = boolean(slot.boolValue != 0);
        else if (slot.type == "string") {
            out = Value();
            if (slot.stringValue) out.kind = Value::String, out.s = slot.stringValue;
        } else {
            out = object(slot.objectValue);
        }
    }
    return result;
}

const ClassInfo& classOf(const Host& host, const std::string& name) {
    const ClassInfo* info = host.findClass(name);
    if (!info) throw std::invalid_argument("no class " + name);
    return *info;
}

const MethodInfo& pick(const ClassInfo& info, const std::string& method, const std::vector<Host::Arg>& args, bool shared) {
    bool byDeclaration = method.find('(') != std::string::npos || method.find(" as ") != std::string::npos;
    const MethodInfo* chosen = nullptr;
    for (const MethodInfo& m : info.methods) {
        if (m.shared != shared) continue;
        if (byDeclaration) {
            if (m.declaration == method) return m;
            continue;
        }
        Signature sig = parse(m.declaration);
        if (sig.name != method || args.size() > sig.params.size()) continue;
        bool ok = true;
        for (size_t k = 0; k < sig.params.size() && ok; ++k)
            ok = k < args.size() ? fits(sig.params[k], args[k]) : sig.params[k].hasDefault;
        if (!ok) continue;
        if (chosen) throw std::invalid_argument("ambiguous call of " + method);
        chosen = &m;
    }
    if (!chosen) throw std::invalid_argument("no method " + info.name + "." + method);
    return *chosen;
}

const PropertyInfo& property(const ClassInfo& info, const std::string& name, bool shared) {
    for (const PropertyInfo& p : info.properties)
        if (p.name == name && p.shared == shared) return p;
    throw std::invalid_argument("no property " + info.name + "." + name);
}

// Releases the arguments that were made for the call.
void releaseTemporaries(std::vector<Host::Arg>& args) {
    for (Host::Arg& a : args)
        if (a.owned) Host::release(a.value);
}

void releaseTemporary(Host::Arg& arg) {
    if (arg.owned) Host::release(arg.value);
}

}  // namespace

Value Host::create(const std::string& className, std::vector<Arg> args) {
    exceptionClass_.clear();
    exceptionMessage_.clear();
    Obj o = HostRuntime::newObject(className);
    if (!o) throw std::invalid_argument("cannot create " + className);
    const ClassInfo& info = classOf(*this, className);
    bool hasConstructor = false;
    for (const MethodInfo& m : info.methods) hasConstructor |= parse(m.declaration).name == "Constructor";
    if (hasConstructor) {
        const MethodInfo& m = pick(info, "Constructor", args, false);
        invoke(parse(m.declaration), m.function, o, args, nullptr, "");
    }
    releaseTemporaries(args);
    return object(o);
}

Value Host::call(const Value& self, const std::string& method, std::vector<Arg> args) {
    exceptionClass_.clear();
    exceptionMessage_.clear();
    const MethodInfo& m = pick(classOf(*this, self.o->className), method, args, false);
    Value result = invoke(parse(m.declaration), m.function, self.o, args, nullptr, "");
    releaseTemporaries(args);
    return result;
}

Value Host::callShared(const std::string& className, const std::string& method, std::vector<Arg> args) {
    exceptionClass_.clear();
    exceptionMessage_.clear();
    const MethodInfo& m = pick(classOf(*this, className), method, args, true);
    Value result = invoke(parse(m.declaration), m.function, nullptr, args, nullptr, "");
    releaseTemporaries(args);
    return result;
}

void Host::assign(const Value& self, const std::string& method, std::vector<Arg> args, Arg value) {
    exceptionClass_.clear();
    exceptionMessage_.clear();
    const MethodInfo& m = pick(classOf(*this, self.o->className), method, args, false);
    if (!m.setter) throw std::invalid_argument(method + " is not assignable");
    Signature sig = parse(m.declaration);
    invoke(sig, m.setter, self.o, args, &value.value, sig.returnType);
    releaseTemporaries(args);
    releaseTemporary(value);
}

namespace {
Value readField(Obj self, const PropertyInfo& p) {
    char* field = static_cast<char*>(HostRuntime::data(self)) + p.param;
    int64_t raw;
    std::memcpy(&raw, field, sizeof raw);
    if (lower(p.type) == "integer") return integer(raw);
    auto* o = reinterpret_cast<Obj>(raw);
    HostRuntime::lock(o);
    return object(o);
}
}  // namespace

Value Host::get(const Value& self, const std::string& name) {
    exceptionClass_.clear();
    exceptionMessage_.clear();
    const PropertyInfo& p = property(classOf(*this, self.o->className), name, false);
    if (p.getter == reinterpret_cast<void*>(-1)) return readField(self.o, p);
    Frame frame;
    frame.add(reinterpret_cast<int64_t>(self.o));
    frame.add(static_cast<int64_t>(p.param));
    return resultOf(lower(p.type), p.getter, frame);
}

void Host::set(const Value& self, const std::string& name, Arg value) {
    exceptionClass_.clear();
    exceptionMessage_.clear();
    const PropertyInfo& p = property(classOf(*this, self.o->className), name, false);
    if (!p.setter) throw std::invalid_argument(name + " is read-only");
    if (p.setter == reinterpret_cast<void*>(-1)) {
        int64_t raw = value.value.i;
        std::memcpy(static_cast<char*>(HostRuntime::data(self.o)) + p.param, &raw, sizeof raw);
        return;
    }
    Frame frame;
    frame.add(reinterpret_cast<int64_t>(self.o));
    frame.add(static_cast<int64_t>(p.param));
    addValue(frame, lower(p.type), value.value);
    invokeInt(p.setter, frame);
    releaseTemporary(value);
}

Value Host::getShared(const std::string& className, const std::string& name) {
    const PropertyInfo& p = property(classOf(*this, className), name, true);
    Frame frame;
    frame.add(static_cast<int64_t>(p.param));
    return resultOf(lower(p.type), p.getter, frame);
}

void Host::setShared(const std::string& className, const std::string& name, Arg value) {
    const PropertyInfo& p = property(classOf(*this, className), name, true);
    Frame frame;
    frame.add(static_cast<int64_t>(p.param));
    addValue(frame, lower(p.type), value.value);
    invokeInt(p.setter, frame);
    releaseTemporary(value);
}

}  // namespace testhost
