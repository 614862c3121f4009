#pragma once

// One 128-byte directory entry of a compound file.

#include <cstddef>
#include <cstdint>
#include <string>

namespace quire::xls {

struct DirEntry {
    static constexpr size_t Size = 128;
    static constexpr size_t MaxNameUnits = 32;  // including the terminating zero

    enum Type : uint8_t { Unused = 0, Storage = 1, Stream = 2, Root = 5 };
    enum Colour : uint8_t { Red = 0, Black = 1 };
    static constexpr uint32_t NoStream = 0xFFFFFFFF;

    char16_t name[MaxNameUnits] = {};
    uint16_t nameLength = 0;  // bytes, including the terminating zero
    uint8_t type = Unused;
    uint8_t colour = Red;
    uint32_t leftSibling = NoStream;
    uint32_t rightSibling = NoStream;
    uint32_t child = NoStream;
    uint8_t clsid[16] = {};
    uint32_t stateBits = 0;
    uint64_t creationTime = 0;
    uint64_t modificationTime = 0;
    uint32_t startingSector = 0;
    uint64_t streamSize = 0;

    bool saved = false;  // set once the writer has laid out this entry's data

    DirEntry() = default;
    // A null name or one of 32 characters or more is refused.
    DirEntry(const char16_t* newName, uint8_t newType, uint32_t newChild);

    std::u16string nameString() const;
    // Directory names compare without regard to the case of A to Z.
    bool hasName(const std::u16string& other) const;

    static DirEntry parse(const uint8_t* p);
    void serialize(uint8_t* p) const;
};

} // namespace quire::xls
