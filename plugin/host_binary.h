#pragma once
// Binary data between host values and the library: file data in host strings and memory blocks
// in, saved books and pictures out.
#include <string>

#include "host_sdk.h"

namespace quire_plugin {

// The bytes of a binary argument, kept for the duration of the call.
class HostBytes {
public:
    static HostBytes fromString(REALstring data);
    static HostBytes fromMemoryBlock(REALobject block);

    // Points into the copy for strings: computed on each call so moving the object is safe.
    const char* data() const { return owned_ ? copy_.data() : pointer_; }
    unsigned size() const { return size_; }

private:
    std::string copy_;
    bool owned_ = false;
    const char* pointer_ = nullptr;
    unsigned size_ = 0;
};

// A new memory block of `size` bytes; nil for a negative size or one of 0x7FFFFFFF or more.
REALobject newMemoryBlock(long long size);

// A new memory block holding a copy of the bytes; nil for no bytes. Raises
// "OutOfMemoryException" when the block cannot be had.
REALobject memoryBlockFromBytes(const char* bytes, long long size);

// Bytes as a host string without a stated encoding (ASCII when every byte is below 0x80);
// no bytes give nil.
REALstring binaryToHostString(const char* bytes, unsigned size);

}  // namespace quire_plugin
