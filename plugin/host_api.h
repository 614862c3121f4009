#pragma once
// The host's functions, resolved by name through the host's resolver on first use and cached.
// A function the host does not offer makes its wrapper return 0, null or false.
#include "host_sdk.h"

namespace quire_plugin {

void setHostResolver(REALresolver resolver);
bool hasHostResolver();

// The address of a host function, resolved once per name and kept.
void* resolveHostFunction(const char* name);

double hostVersionNumber();            // "REALGetRBVersion"; 0.0 without it
void registerPluginVersion(int code);  // "RegisterPluginVersion"
bool registerClassWithHost(void* definition);  // "PluginRegisterClass"

REALobject newInstance(const char* className);  // "PluginNewInstance"
void lockObject(REALobject object);
void unlockObject(REALobject object);
void lockString(REALstring text);
void unlockString(REALstring text);
void raiseException(REALobject exception);  // "RuntimeRaiseException"

bool setPropertyString(REALobject object, const char* name, REALstring value);
bool setPropertyInteger(REALobject object, const char* name, RBInteger value);
bool getPropertyInteger(REALobject object, const char* name, RBInteger* value);
void* loadObjectMethod(REALobject object, const char* declaration);  // "REALLoadObjectMethod"

REALstring buildString(const void* bytes, int byteCount);
REALstring buildStringWithEncoding(const void* bytes, int byteCount, uint32_t encoding);
void setStringEncoding(REALstring text, uint32_t encoding);
uint32_t getStringEncoding(REALstring text);  // kEncodingUnknown without the function
REALstring convertString(REALstring text, uint32_t encoding);
bool getStringData(REALstring text, uint32_t encoding, REALstringData* data);
void disposeStringData(REALstringData* data);

REALstring pathFromFolderItem(REALobject folderItem);

REALobject newMemoryBlockObject(int size);
void* memoryBlockPointer(REALobject block);
RBInteger memoryBlockSize(REALobject block);

REALarray newObjectArray(RBInteger upperBound);
bool insertIntoObjectArray(REALarray array, RBInteger index, REALobject object);

void yieldToHost();

}  // namespace quire_plugin
