#include "host_objects.h"

#include "function_table.h"
#include "host_api.h"
#include "host_strings.h"

namespace quire_plugin {

REALobject wrapHandle(REALclassDefinition& definition, void* handle, REALobject owner) {
    if (!handle) return nullptr;
    REALobject instance = newInstance(definition.name);
    if (!instance) return nullptr;
    auto* data = instanceData<ObjectData>(instance, definition);
    data->handle = handle;
    data->owner = owner;
    lockObject(owner);
    return instance;
}

REALobject wrapBook(BookHandle book) {
    if (!book) return nullptr;
    REALobject instance = newInstance(bookClass().name);
    if (!instance) return nullptr;
    auto* data = instanceData<BookData>(instance, bookClass());
    // A host that ran a constructor on the new instance has given it a book of its own.
    if (data->book && data->book != book && functions().qrBookReleaseW) functions().qrBookReleaseW(data->book);
    data->book = book;
    return instance;
}

void releaseWrapper(REALobject instance, REALclassDefinition& definition) {
    auto* data = instanceData<ObjectData>(instance, definition);
    REALobject owner = data->owner;
    data->owner = nullptr;
    data->handle = nullptr;
    unlockObject(owner);
}

REALarray newWrapperArray() { return newObjectArray(-1); }

void appendToWrapperArray(REALarray array, RBInteger index, REALobject wrapper) {
    insertIntoObjectArray(array, index, wrapper);
    unlockObject(wrapper);
}

bool folderItemPath(REALobject folderItem, std::wstring& path) {
    if (!folderItem) return false;
    REALstring hostPath = pathFromFolderItem(folderItem);
    if (!hostPath) return false;
    {
        HostText text(hostPath);
        path = text.wide();
    }
    unlockString(hostPath);
    return true;
}

}  // namespace quire_plugin
