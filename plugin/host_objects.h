#pragma once
// Instances of the plugin's host classes: their instance data, wrapping library objects in new
// instances, arrays of them, and folder items.
#include <quire.h>

#include <string>

#include "host_sdk.h"

namespace quire_plugin {

// Instance data of QrBookKit.
struct BookData {
    BookHandle book;
};

// Instance data of the classes whose objects come from the library: the library handle and the
// host object that handed it out, kept alive for the life of this instance.
struct ObjectData {
    void* handle;
    REALobject owner;
};

// The class definitions, defined next to each class.
REALclassDefinition& bookClass();
REALclassDefinition& sheetClass();
REALclassDefinition& formatClass();
REALclassDefinition& fontClass();
REALclassDefinition& autoFilterClass();
REALclassDefinition& filterColumnClass();
REALclassDefinition& copyOptionsClass();

// The class data of an instance: the host placed it at the offset it stored in the definition.
template <typename T>
T* instanceData(REALobject instance, const REALclassDefinition& definition) {
    return reinterpret_cast<T*>(reinterpret_cast<char*>(instance) + definition.forSystemUse);
}

inline BookHandle bookHandleOf(REALobject book) {
    return book ? instanceData<BookData>(book, bookClass())->book : nullptr;
}

// A new instance of a library-object class holding `handle`, with `owner` locked; nil for a null
// handle or when the host gives no instance.
REALobject wrapHandle(REALclassDefinition& definition, void* handle, REALobject owner);

// A new QrBookKit instance holding `book`.
REALobject wrapBook(BookHandle book);

// The destructor of the library-object classes: the owner is unlocked and both fields cleared.
void releaseWrapper(REALobject instance, REALclassDefinition& definition);

// An object array of `count` new wrappers of the objects `objectAt(i)` with `owner`.
template <typename ObjectAt>
REALarray wrapperArray(REALclassDefinition& definition, int count, REALobject owner, ObjectAt objectAt);
REALarray newWrapperArray();
void appendToWrapperArray(REALarray array, RBInteger index, REALobject wrapper);

// The native path of a folder item; false for a nil item or one without a path.
bool folderItemPath(REALobject folderItem, std::wstring& path);

template <typename ObjectAt>
REALarray wrapperArray(REALclassDefinition& definition, int count, REALobject owner, ObjectAt objectAt) {
    REALarray array = newWrapperArray();
    if (!array) return nullptr;
    for (int i = 0; i < count; ++i) appendToWrapperArray(array, i, wrapHandle(definition, objectAt(i), owner));
    return array;
}

}  // namespace quire_plugin
