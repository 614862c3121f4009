#include "class_registration.h"

#include <cstring>
#include <memory>
#include <vector>

#include "debug_log.h"
#include "host_api.h"
#include "host_version.h"

namespace quire_plugin {

namespace {

const char* pluginName = nullptr;

const char* text(const char* value) { return value ? value : ""; }

// One of a count and its list is set without the other.
template <typename T>
bool disagree(const T* list, size_t count) {
    return (list == nullptr) != (count == 0);
}

void checkAttributes(const char* className, const char* member, const REALattribute* attributes, size_t count) {
    if (!attributes) return;
    for (size_t i = 0; i < count; ++i) {
        if (!attributes[i].mName) debugWrite("Error: %s.%s has an attribute without name! Index: %d", className, member, static_cast<int>(i));
        else if (!attributes[i].mValue)
            debugWrite("Error: %s.%s has an attribute without value! Name: %s Index: %d", className, member,
                       attributes[i].mName, static_cast<int>(i));
    }
}

bool isStandardAccessor(REALproc proc) { return proc == REALstandardGetter; }

void checkMethods(const char* className, const REALmethodDefinition* methods, size_t count) {
    if (!methods) return;
    for (size_t i = 0; i < count; ++i) {
        const REALmethodDefinition& method = methods[i];
        if (!method.function) debugWrite("Error: The method %s.%s has nil function.", className, text(method.declaration));
        if (!method.declaration) debugWrite("Error: The method %s.%d has nil declaration.", className, static_cast<int>(i));
        if (disagree(method.attributes, method.attributeCount))
            debugWrite("Error: The method %s.%s has the wrong attributeCount value: %d", className,
                       text(method.declaration), static_cast<int>(method.attributeCount));
        checkAttributes(className, text(method.declaration), method.attributes, method.attributeCount);
    }
}

void checkProperties(const REALclassDefinition& d, const REALproperty* properties, size_t count) {
    if (!properties) return;
    for (size_t i = 0; i < count; ++i) {
        const REALproperty& p = properties[i];
        if (!p.getter) debugWrite("Error: The property %s.%s has nil getter.", d.name, text(p.name));
        if (!p.name) debugWrite("Error: The property %s.%d has nil name.", d.name, static_cast<int>(i));
        if (!p.type) debugWrite("Error: The property %s.%d has nil type.", d.name, static_cast<int>(i));
        if (p.editor) debugWrite("Error: The property %s.%s has editor.", d.name, text(p.name));
        if (disagree(p.enumEntries, p.enumCount))
            debugWrite("Error: The property %s.%s has wrong enumCount: %d", d.name, text(p.name), static_cast<int>(p.enumCount));
        if (disagree(p.attributes, p.attributeCount))
            debugWrite("Error: The property %s.%s has attributes: %d", d.name, text(p.name), static_cast<int>(p.attributeCount));
        checkAttributes(d.name, text(p.name), p.attributes, p.attributeCount);
        if ((isStandardAccessor(p.getter) || isStandardAccessor(p.setter)) &&
            (p.param < 0 || static_cast<size_t>(p.param) + sizeof(void*) > d.dataSize))
            debugWrite("Error: Offset for variable too big: %s.%s %d %d", d.name, text(p.name), static_cast<int>(p.param),
                       static_cast<int>(d.dataSize));
    }
}

// Findings on the definition; false when it cannot be registered at all.
bool validate(const REALclassDefinition* d) {
    if (!d) {
        debugWrite("Error: A class registered is nil.");
        return false;
    }
    if (!pluginName) {
        debugWrite("Error: gpartname is nil!? %s", text(d->name));
        return false;
    }
    const char* name = text(d->name);
    if (d->version != kCurrentREALControlVersion)
        debugWrite("Error: The class %s has the wrong kCurrentREALControlVersion: %d vs. %d", name,
                   static_cast<int>(d->version), static_cast<int>(kCurrentREALControlVersion));
    if (!d->name) debugWrite("Error: A class without name.");
    if (d->forSystemUse != 0)
        debugWrite("Error: The class %s has the wrong forSystemUse value: %d", name, static_cast<int>(d->forSystemUse));
    const auto count = [&](const void* list, size_t n, const char* field) {
        if ((list == nullptr) != (n == 0)) debugWrite("Error: The class %s has the wrong %s value: %d", name, field, static_cast<int>(n));
    };
    count(d->properties, d->propertyCount, "propertyCount");
    count(d->methods, d->methodCount, "methodCount");
    count(d->events, d->eventCount, "eventCount");
    count(d->eventInstances, d->eventInstanceCount, "eventInstanceCount");
    count(d->constants, d->constantCount, "constantCount");
    count(d->sharedProperties, d->sharedPropertyCount, "sharedPropertyCounttionCount");
    count(d->sharedMethods, d->sharedMethodCount, "sharedMethodCount");
    count(d->attributes, d->attributeCount, "attributeCount");
    count(d->delegates, d->delegateCount, "delegateCount");
    count(d->enums, d->enumCount, "enumCount");
    if (d->superName && d->dataSize != 0) {
        const char* super = d->superName;
        if (std::strcmp(super, "RuntimeException") != 0 && std::strcmp(super, "Database") != 0 &&
            std::strcmp(super, "Thread") != 0 && std::strcmp(super, "PluginGlobalsAnalyser") != 0)
            debugWrite("Warning: The subclass %s of %s has data size: %d", name, super, static_cast<int>(d->dataSize));
    }
    checkAttributes(name, "", d->attributes, d->attributeCount);
    if (d->methods)
        for (size_t i = 0; i < d->methodCount; ++i)
            if (!d->methods[i].function && !d->methods[i].declaration && !d->methods[i].setterFunction)
                debugWrite("Error: method %s.%d is NULL.", name, static_cast<int>(i));
    checkMethods(name, d->methods, d->methodCount);
    checkMethods(name, d->sharedMethods, d->sharedMethodCount);
    checkProperties(*d, d->properties, d->propertyCount);
    checkProperties(*d, d->sharedProperties, d->sharedPropertyCount);
    if (d->constants)
        for (size_t i = 0; i < d->constantCount; ++i) {
            const REALconstant& c = d->constants[i];
            if (!c.declaration) debugWrite("Error: The constant %s.%d has nil declaration.", name, static_cast<int>(i));
            if (disagree(c.attributes, c.attributeCount))
                debugWrite("Error: The constant %s.%s has the wrong attributeCount value: %d", name, text(c.declaration),
                           static_cast<int>(c.attributeCount));
            checkAttributes(name, text(c.declaration), c.attributes, c.attributeCount);
        }
    if (d->events)
        for (size_t i = 0; i < d->eventCount; ++i) {
            const REALevent& e = d->events[i];
            if (!e.declaration) debugWrite("Error: The event %s.%d has nil declaration.", name, static_cast<int>(i));
            if (disagree(e.attributes, e.attributeCount))
                debugWrite("Error: The event %s.%s has the wrong attributeCount value: %d", name, text(e.declaration),
                           static_cast<int>(e.attributeCount));
            checkAttributes(name, text(e.declaration), e.attributes, e.attributeCount);
        }
    return true;
}

// The older layout: the same records without their attribute fields.
struct OldLayoutCopy {
    REALclassDefinitionOld definition{};
    std::vector<REALpropertyOld> properties, sharedProperties;
    std::vector<REALmethodDefinitionOld> methods, sharedMethods;
    std::vector<REALconstantOld> constants;
    std::vector<REALeventOld> events;
};

bool listFits(const char* fixer, const void* list, size_t count) {
    if ((list == nullptr) != (count == 0)) {
        debugWrite("Error: %s called with wrong parameters: %p %d", fixer, list, static_cast<int>(count));
        return false;
    }
    return true;
}

std::vector<REALpropertyOld> fixProperties(const REALproperty* list, size_t count) {
    std::vector<REALpropertyOld> result;
    if (!listFits("FixProperties", list, count) || !list) return result;
    for (size_t i = 0; i < count; ++i) {
        const REALproperty& p = list[i];
        result.push_back({p.group, p.name, p.type, p.flags, p.getter, p.setter, p.param, p.editor, p.enumCount, p.enumEntries});
    }
    return result;
}

std::vector<REALmethodDefinitionOld> fixMethods(const REALmethodDefinition* list, size_t count) {
    std::vector<REALmethodDefinitionOld> result;
    if (!listFits("FixMethods", list, count) || !list) return result;
    for (size_t i = 0; i < count; ++i)
        result.push_back({list[i].function, list[i].setterFunction, list[i].declaration, list[i].mFlags});
    return result;
}

std::vector<REALconstantOld> fixConstants(const REALconstant* list, size_t count) {
    std::vector<REALconstantOld> result;
    if (!listFits("FixConstants", list, count) || !list) return result;
    for (size_t i = 0; i < count; ++i) result.push_back({list[i].declaration, list[i].reserved1, list[i].mFlags});
    return result;
}

std::vector<REALeventOld> fixEvents(const REALevent* list, size_t count) {
    std::vector<REALeventOld> result;
    if (!listFits("FixEvents", list, count) || !list) return result;
    for (size_t i = 0; i < count; ++i) result.push_back({list[i].declaration, list[i].forSystemUse});
    return result;
}

template <typename T>
T* dataOrNull(std::vector<T>& list) {
    return list.empty() ? nullptr : list.data();
}

void registerOldLayout(REALclassDefinition* d) {
    auto copy = std::make_unique<OldLayoutCopy>();
    copy->properties = fixProperties(d->properties, d->propertyCount);
    copy->sharedProperties = fixProperties(d->sharedProperties, d->sharedPropertyCount);
    copy->methods = fixMethods(d->methods, d->methodCount);
    copy->sharedMethods = fixMethods(d->sharedMethods, d->sharedMethodCount);
    copy->constants = fixConstants(d->constants, d->constantCount);
    copy->events = fixEvents(d->events, d->eventCount);
    REALclassDefinitionOld& old = copy->definition;
    old.version = static_cast<uint32_t>(versionCode());
    old.name = d->name;
    old.superName = d->superName;
    old.dataSize = d->dataSize;
    old.forSystemUse = d->forSystemUse;
    old.constructor = d->constructor;
    old.destructor = d->destructor;
    old.properties = dataOrNull(copy->properties);
    old.propertyCount = copy->properties.size();
    old.methods = dataOrNull(copy->methods);
    old.methodCount = copy->methods.size();
    old.events = dataOrNull(copy->events);
    old.eventCount = copy->events.size();
    old.eventInstances = d->eventInstances;
    old.eventInstanceCount = d->eventInstanceCount;
    old.interfaces = d->interfaces;
    old.attributes = d->attributes;
    old.attributeCount = d->attributeCount;
    old.constants = dataOrNull(copy->constants);
    old.constantCount = copy->constants.size();
    old.mFlags = d->mFlags;
    old.sharedProperties = dataOrNull(copy->sharedProperties);
    old.sharedPropertyCount = copy->sharedProperties.size();
    old.sharedMethods = dataOrNull(copy->sharedMethods);
    old.sharedMethodCount = copy->sharedMethods.size();
    registerClassWithHost(&old);
    // The host stores the offset of the class data in the record it was given; the plugin finds
    // its instance data through the original definition, which must learn that offset too.
    d->forSystemUse = old.forSystemUse;
    for (size_t i = 0; i < copy->events.size(); ++i) d->events[i].forSystemUse = copy->events[i].forSystemUse;
}

}  // namespace

void recordPluginName(const char* name) { pluginName = name; }

void registerClass(REALclassDefinition* definition) {
    if (!validate(definition)) return;
    if (versionCode() >= 10) {
        registerClassWithHost(definition);
        return;
    }
    registerOldLayout(definition);
}

}  // namespace quire_plugin
