#include "host_binary.h"

#include <climits>
#include <cstdio>
#include <cstring>
#include <new>

#include "debug_log.h"
#include "host_api.h"
#include "host_exceptions.h"
#include "host_strings.h"
#include "host_version.h"

namespace quire_plugin {

HostBytes HostBytes::fromString(REALstring data) {
    HostBytes bytes;
    if (data && hostStringBytes(data, bytes.copy_) && bytes.copy_.size() <= UINT_MAX) {
        bytes.owned_ = true;
        bytes.size_ = static_cast<unsigned>(bytes.copy_.size());
    }
    return bytes;
}

HostBytes HostBytes::fromMemoryBlock(REALobject block) {
    HostBytes bytes;
    if (!block) return bytes;
    void* pointer = nullptr;
    RBInteger size = 0;
    if (hostHasMemoryBlockAccessors()) {
        pointer = memoryBlockPointer(block);
        size = memoryBlockSize(block);
    } else {
        const auto* record = reinterpret_cast<const REALmemoryBlockRecordOld*>(block);
        pointer = record->data;
        size = record->size;
    }
    if (pointer && size > 0 && static_cast<unsigned long long>(size) <= UINT_MAX) {
        bytes.pointer_ = static_cast<const char*>(pointer);
        bytes.size_ = static_cast<unsigned>(size);
    }
    return bytes;
}

REALobject newMemoryBlock(long long size) {
    if (size < 0) return nullptr;
    if (size >= 0x7FFFFFFF) {
        if (debugging()) debugWrite("Size too big in REALNewMemoryBlock!");
        return nullptr;
    }
    REALobject block = newMemoryBlockObject(static_cast<int>(size));
    if (!block && debugging()) debugWrite("Failed to allocate memory block.");
    return block;
}

REALobject memoryBlockFromBytes(const char* bytes, long long size) {
    if (!bytes || size <= 0) return nullptr;
    REALobject block = newMemoryBlock(size);
    void* target = nullptr;
    if (block) {
        if (hostHasMemoryBlockAccessors()) {
            target = memoryBlockPointer(block);
        } else {
            target = reinterpret_cast<REALmemoryBlockRecordOld*>(block)->data;
        }
    }
    if (!target) {
        debugWrite("Error: Failed to allocate memoryblock");
        unlockObject(block);
        char message[200];
        std::snprintf(message, sizeof message, "Failed to allocate a memoryblock with %lld bytes in size.", size);
        raiseHostException("OutOfMemoryException", message);
        return nullptr;
    }
    std::memcpy(target, bytes, static_cast<size_t>(size));
    return block;
}

REALstring binaryToHostString(const char* bytes, unsigned size) {
    if (!bytes || size == 0) return nullptr;
    return bytesToHostString(bytes, size, kEncodingUnknown);
}

}  // namespace quire_plugin
