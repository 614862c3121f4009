#pragma once
// The host's plugin interface: the records through which classes are declared to the host and
// the value types that cross the boundary. The layouts follow the host's published plugin SDK
// exactly, so that a real host reads them as its own.
#include <cstddef>
#include <cstdint>

extern "C" {

#if defined(__LP64__) || defined(_WIN64)
typedef int64_t RBInteger;
#else
typedef int32_t RBInteger;
#endif
typedef int64_t RBInt64;
typedef int8_t RBBoolean;
typedef uint32_t RBColor;

struct REALstringStruct;
typedef struct REALstringStruct* REALstring;
struct REALobjectStruct;
typedef struct REALobjectStruct* REALobject;
struct REALarrayStruct;
typedef struct REALarrayStruct* REALarray;

typedef void (*REALproc)(void);

// The host's own field accessor: a property whose getter or setter is this reads or writes the
// instance field at offset `param` of the class data.
#define REALstandardGetter ((REALproc)-1)
#define REALstandardSetter ((REALproc)-1)

// The class-definition layout this plugin is written against.
enum { kCurrentREALControlVersion = 13 };

typedef struct {
    const char* mName;
    const char* mValue;
} REALattribute;

typedef struct {
    REALproc function;
    REALproc setterFunction;
    const char* declaration;
    uint32_t mFlags;
    size_t attributeCount;
    REALattribute* attributes;
} REALmethodDefinition;

typedef struct {
    const char* group;
    const char* name;
    const char* type;
    uint32_t flags;
    REALproc getter;
    REALproc setter;
    int32_t param;
    REALproc editor;
    size_t enumCount;
    const char** enumEntries;
    size_t attributeCount;
    REALattribute* attributes;
} REALproperty;

typedef struct {
    const char* declaration;
    RBInteger forSystemUse;
    size_t attributeCount;
    REALattribute* attributes;
} REALevent;

typedef struct {
    const char* name;
    REALproc implementation;
} REALeventInstance;

typedef struct {
    const char* declaration;
    void* reserved1;
    uint32_t mFlags;
    size_t attributeCount;
    REALattribute* attributes;
} REALconstant;

typedef struct {
    const char* name;
    const char* type;
    uint32_t mFlags;
    const char** fields;
    size_t numFields;
    size_t attributeCount;
    REALattribute* attributes;
} REALenum;

typedef struct {
    const char* declaration;
    uint32_t mFlags;
    size_t attributeCount;
    REALattribute* attributes;
} REALdelegate;

typedef struct {
    uint32_t version;
    const char* name;
    const char* superName;
    size_t dataSize;
    RBInteger forSystemUse;  // the host stores the offset of the class data here
    REALproc constructor;
    REALproc destructor;
    REALproperty* properties;
    size_t propertyCount;
    REALmethodDefinition* methods;
    size_t methodCount;
    REALevent* events;
    size_t eventCount;
    REALeventInstance* eventInstances;
    size_t eventInstanceCount;
    const char* interfaces;
    REALattribute* attributes;
    size_t attributeCount;
    REALconstant* constants;
    size_t constantCount;
    uint32_t mFlags;
    REALproperty* sharedProperties;
    size_t sharedPropertyCount;
    REALmethodDefinition* sharedMethods;
    size_t sharedMethodCount;
    REALdelegate* delegates;
    size_t delegateCount;
    REALenum* enums;
    size_t enumCount;
} REALclassDefinition;

// The layout of hosts that predate attributes on members (version codes below 10): the same
// records without their trailing attribute fields, and a class record that ends after the
// shared methods.
typedef struct {
    REALproc function;
    REALproc setterFunction;
    const char* declaration;
    uint32_t mFlags;
} REALmethodDefinitionOld;

typedef struct {
    const char* group;
    const char* name;
    const char* type;
    uint32_t flags;
    REALproc getter;
    REALproc setter;
    int32_t param;
    REALproc editor;
    size_t enumCount;
    const char** enumEntries;
} REALpropertyOld;

typedef struct {
    const char* declaration;
    RBInteger forSystemUse;
} REALeventOld;

typedef struct {
    const char* declaration;
    void* reserved1;
    uint32_t mFlags;
} REALconstantOld;

typedef struct {
    uint32_t version;
    const char* name;
    const char* superName;
    size_t dataSize;
    RBInteger forSystemUse;
    REALproc constructor;
    REALproc destructor;
    REALpropertyOld* properties;
    size_t propertyCount;
    REALmethodDefinitionOld* methods;
    size_t methodCount;
    REALeventOld* events;
    size_t eventCount;
    REALeventInstance* eventInstances;
    size_t eventInstanceCount;
    const char* interfaces;
    REALattribute* attributes;
    size_t attributeCount;
    REALconstantOld* constants;
    size_t constantCount;
    uint32_t mFlags;
    REALpropertyOld* sharedProperties;
    size_t sharedPropertyCount;
    REALmethodDefinitionOld* sharedMethods;
    size_t sharedMethodCount;
} REALclassDefinitionOld;

// Text handed out by the host's "PluginGetStringData", released with "PluginDisposeStringData".
typedef struct {
    const void* data;
    size_t length;
    uint32_t encoding;
} REALstringData;

// A memory block object of hosts before 2017, which offer no accessor functions: the object
// header of two pointers, then the data pointer and the byte size.
typedef struct {
    void* header[2];
    void* data;
    RBInteger size;
} REALmemoryBlockRecordOld;

// The host's resolver: a host function's address by name, or null.
typedef void* (*REALresolver)(const char* entryName);

}  // extern "C"

#if UINTPTR_MAX == 0xFFFFFFFFu
// On 32-bit targets the records have the sizes the host expects of each layout.
static_assert(sizeof(REALmethodDefinition) == 24 && sizeof(REALmethodDefinitionOld) == 16, "");
static_assert(sizeof(REALproperty) == 48 && sizeof(REALpropertyOld) == 40, "");
static_assert(sizeof(REALconstant) == 20 && sizeof(REALconstantOld) == 12, "");
static_assert(sizeof(REALevent) == 16 && sizeof(REALeventOld) == 8, "");
static_assert(sizeof(REALclassDefinitionOld) == 100, "");
#endif

// Flags of the records.
namespace quire_plugin {
constexpr uint32_t kClassFlags = 4;
constexpr uint32_t kMethodFlags = 4;
constexpr uint32_t kConstructorFlags = 0x84;
constexpr uint32_t kPropertyFlags = 6;
constexpr uint32_t kSharedPropertyFlags = 0x26;

// Host text encodings.
constexpr uint32_t kEncodingUtf8 = 0x08000100;
constexpr uint32_t kEncodingUtf16 = 0x100;
constexpr uint32_t kEncodingUtf32 = 0x0C000100;
constexpr uint32_t kEncodingAscii = 0x600;
constexpr uint32_t kEncodingWindowsLatin1 = 0x500;
constexpr uint32_t kEncodingIsoLatin1 = 0x201;
constexpr uint32_t kEncodingMacRoman = 0;
constexpr uint32_t kEncodingUnknown = 0xFFFF;

// Element kind of object arrays.
constexpr int kArrayOfObjects = 4;
}  // namespace quire_plugin
