#include "xls/dir_entry.h"

#include <cstring>

#include "api/qrerror.h"
#include "xls/little_endian.h"

namespace quire::xls {

namespace {

constexpr uint32_t EndOfChain = 0xFFFFFFFE;

char16_t foldAsciiCase(char16_t c)
{
    return (c >= u'a' && c <= u'z') ? static_cast<char16_t>(c - u'a' + u'A') : c;
}

} // namespace

DirEntry::DirEntry(const char16_t* newName, uint8_t newType, uint32_t newChild)
{
    if (!newName)
        throw qrerror("DirEntry::DirEntry(): incorrect name");
    size_t length = 0;
    while (newName[length] != 0)
        ++length;
    if (length >= MaxNameUnits)
        throw qrerror("DirEntry::DirEntry(): newName is too big (length must be less 32)");
    for (size_t i = 0; i < length; ++i)
        name[i] = newName[i];
    child = newChild;
    nameLength = static_cast<uint16_t>(length * 2 + 2);
    type = newType;
    colour = Black;
    startingSector = EndOfChain;
}

std::u16string DirEntry::nameString() const
{
    // The stored length may lie; never read past the 32-unit field or a zero.
    size_t units = nameLength / 2;
    if (units > MaxNameUnits)
        units = MaxNameUnits;
    std::u16string result;
    for (size_t i = 0; i < units && name[i] != 0; ++i)
        result.push_back(name[i]);
    return result;
}

bool DirEntry::hasName(const std::u16string& other) const
{
    const std::u16string own = nameString();
    if (own.size() != other.size())
        return false;
    for (size_t i = 0; i < own.size(); ++i)
        if (foldAsciiCase(own[i]) != foldAsciiCase(other[i]))
            return false;
    return true;
}

DirEntry DirEntry::parse(const uint8_t* p)
{
    DirEntry e;
    for (size_t i = 0; i < MaxNameUnits; ++i)
        e.name[i] = static_cast<char16_t>(loadU16(p + 2 * i));
    e.nameLength = loadU16(p + 64);
    e.type = p[66];
    e.colour = p[67];
    e.leftSibling = loadU32(p + 68);
    e.rightSibling = loadU32(p + 72);
    e.child = loadU32(p + 76);
    std::memcpy(e.clsid, p + 80, sizeof e.clsid);
    e.stateBits = loadU32(p + 96);
    e.creationTime = loadU64(p + 100);
    e.modificationTime = loadU64(p + 108);
    e.startingSector = loadU32(p + 116);
    e.streamSize = loadU64(p + 120);
    return e;
}

void DirEntry::serialize(uint8_t* p) const
{
    for (size_t i = 0; i < MaxNameUnits; ++i)
        storeU16(p + 2 * i, static_cast<uint16_t>(name[i]));
    storeU16(p + 64, nameLength);
    p[66] = type;
    p[67] = colour;
    storeU32(p + 68, leftSibling);
    storeU32(p + 72, rightSibling);
    storeU32(p + 76, child);
    std::memcpy(p + 80, clsid, sizeof clsid);
    storeU32(p + 96, stateBits);
    storeU64(p + 100, creationTime);
    storeU64(p + 108, modificationTime);
    storeU32(p + 116, startingSector);
    storeU64(p + 120, streamSize);
}

} // namespace quire::xls
