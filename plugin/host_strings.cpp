#include "host_strings.h"

#include <climits>
#include <cstring>
#include <new>
#include <vector>

#include "debug_log.h"
#include "host_api.h"
#include "host_version.h"
#include "unicode.h"

namespace quire_plugin {

namespace {

bool allBelow0x80(const std::string& bytes) {
    for (unsigned char c : bytes)
        if (c >= 0x80) return false;
    return true;
}

bool isSingleByteOrAscii(uint32_t encoding) {
    return encoding == kEncodingAscii || encoding == kEncodingUtf8 || encoding == kEncodingWindowsLatin1 ||
           encoding == kEncodingIsoLatin1 || encoding == kEncodingMacRoman;
}

// The host's UTF-16 form of a string as units; false when the host cannot give it.
bool hostUtf16(REALstring text, std::u16string& units) {
    std::string bytes;
    if (!hostStringConverted(text, kEncodingUtf16, bytes)) return false;
    units.assign(bytes.size() / 2, u'\0');
    if (!units.empty()) std::memcpy(&units[0], bytes.data(), units.size() * 2);
    // Stop at a terminator the host may have included.
    size_t end = 0;
    while (end < units.size() && units[end] != 0) ++end;
    units.resize(end);
    return true;
}

// A leading byte-order mark tells the unit order; it is not part of the text.
void normaliseByteOrder(std::u16string& units) {
    if (!units.empty() && units[0] == 0xFFFE)
        for (char16_t& unit : units) unit = static_cast<char16_t>((unit >> 8) | (unit << 8));
    if (!units.empty() && units[0] == 0xFEFF) units.erase(0, 1);
    if (!units.empty() && units[0] == 0xFFFE) units.erase(0, 1);
}

// A new string of `bytes` tagged `encoding`, built the way the host's version allows.
REALstring buildTagged(const void* bytes, int count, uint32_t encoding) {
    if (hostHasStringData()) return buildStringWithEncoding(bytes, count, encoding);
    REALstring built = buildString(bytes, count);
    setStringEncoding(built, encoding);
    return built;
}

REALstring toUtf8AndRelease(REALstring intermediate) {
    if (!intermediate) return nullptr;
    REALstring converted = convertString(intermediate, kEncodingUtf8);
    unlockString(intermediate);
    return converted;
}

}  // namespace

bool hostStringBytes(REALstring text, std::string& bytes) {
    REALstringData data{};
    if (!getStringData(text, kEncodingUnknown, &data)) return false;
    try {
        bytes.assign(static_cast<const char*>(data.data), data.data ? data.length : 0);
    } catch (const std::bad_alloc&) {
        disposeStringData(&data);
        return false;
    }
    disposeStringData(&data);
    return true;
}

bool hostStringConverted(REALstring text, uint32_t encoding, std::string& bytes) {
    if (hostHasStringData()) {
        REALstringData data{};
        if (!getStringData(text, encoding, &data)) return false;
        try {
            bytes.assign(static_cast<const char*>(data.data), data.data ? data.length : 0);
        } catch (const std::bad_alloc&) {
            disposeStringData(&data);
            return false;
        }
        disposeStringData(&data);
        return true;
    }
    REALstring converted = convertString(text, encoding);
    if (!converted) return false;
    bool ok = hostStringBytes(converted, bytes);
    unlockString(converted);
    return ok;
}

HostText::HostText(REALstring text) : source_(text) {
    if (!text) return;
    try {
        uint32_t encoding = getStringEncoding(text);
        if (isSingleByteOrAscii(encoding) || encoding == kEncodingUnknown) {
            std::string bytes;
            if (!hostStringBytes(text, bytes)) {
                failed_ = true;
                return;
            }
            if (allBelow0x80(bytes)) {
                text_.assign(bytes.begin(), bytes.end());
                return;
            }
            if (encoding == kEncodingUnknown) {
                // Bytes without a stated encoding are taken as single-byte Windows Latin-1 text.
                if (bytes.size() > INT_MAX) {
                    failed_ = true;
                    return;
                }
                REALstring latin1 = buildTagged(bytes.data(), static_cast<int>(bytes.size()), kEncodingWindowsLatin1);
                std::u16string units;
                bool ok = latin1 && hostUtf16(latin1, units);
                unlockString(latin1);
                if (!ok) {
                    failed_ = true;
                    return;
                }
                normaliseByteOrder(units);
                text_ = utf16ToWide(units.data(), units.size());
                return;
            }
        }
        std::u16string units;
        if (!hostUtf16(text, units)) {
            failed_ = true;
            return;
        }
        normaliseByteOrder(units);
        text_ = utf16ToWide(units.data(), units.size());
    } catch (const std::bad_alloc&) {
        failed_ = true;
        text_.clear();
    }
}

std::string HostText::eightBit(uint32_t encoding) const {
    std::string bytes;
    if (!source_) return bytes;
    uint32_t tag = getStringEncoding(source_);
    bool ok = (tag == kEncodingAscii || tag == kEncodingUtf8) ? hostStringBytes(source_, bytes)
                                                              : hostStringConverted(source_, encoding, bytes);
    if (!ok) bytes.clear();
    // Cut at an embedded terminator: the library takes zero-terminated text.
    bytes.resize(std::strlen(bytes.c_str()));
    return bytes;
}

std::string HostText::utf8() const { return eightBit(kEncodingUtf8); }
std::string HostText::singleByte() const { return eightBit(kEncodingWindowsLatin1); }

REALstring utf16ToHostString(const char16_t* units, size_t count) {
    if (!units || count == 0) return nullptr;
    if (count >= (1u << 30)) {
        if (debugging()) debugWrite("Count too big for REALBuildUnicodeString.");
        return nullptr;
    }
    REALstring result = toUtf8AndRelease(buildTagged(units, static_cast<int>(count * 2), kEncodingUtf16));
    if (!result && debugging()) debugWrite("Out of memory in REALBuildUnicodeStringUTF16.");
    return result;
}

REALstring utf32ToHostString(const char32_t* units, size_t count) {
    if (!units || count == 0) return nullptr;
    if (count >= (1u << 29)) {
        if (debugging()) debugWrite("Count too big for REALBuildUnicodeString.");
        return nullptr;
    }
    if (hostTakesUtf32())
        return toUtf8AndRelease(buildStringWithEncoding(units, static_cast<int>(count * 4), kEncodingUtf32));
    try {
        std::u16string utf16 = utf32ToUtf16(units, count);
        return utf16ToHostString(utf16.data(), utf16.size());
    } catch (const std::bad_alloc&) {
        if (debugging()) debugWrite("Out of memory in REALBuildUnicodeStringUTF32.");
        return nullptr;
    }
}

REALstring wideToHostString(const wchar_t* text) {
    static_assert(sizeof(wchar_t) == 4, "library text is UTF-32 here");
    return utf32ToHostString(reinterpret_cast<const char32_t*>(text), wideLength(text));
}

REALstring bytesToHostString(const char* bytes, size_t count, uint32_t encoding) {
    if (debugging()) {
        if (encoding == kEncodingUtf16) debugWrite("Error: kREALTextEncodingUTF16 not useful for CString2RB!");
        if (encoding == kEncodingUtf32) debugWrite("Error: kREALTextEncodingUTF32 not useful for CString2RB!");
        if (encoding == kEncodingAscii && bytes)
            for (size_t i = 0; i < count; ++i)
                if (static_cast<unsigned char>(bytes[i]) >= 0x80) {
                    debugWrite("Error: text is not ascii");
                    break;
                }
    }
    if (!bytes) return nullptr;
    if (encoding == kEncodingUtf16) return utf16ToHostString(reinterpret_cast<const char16_t*>(bytes), count / 2);
    if (encoding == kEncodingUtf32) return utf32ToHostString(reinterpret_cast<const char32_t*>(bytes), count / 4);
    if (encoding == kEncodingMacRoman || encoding == kEncodingIsoLatin1 || encoding == kEncodingWindowsLatin1 ||
        encoding == kEncodingUnknown) {
        bool ascii = true;
        for (size_t i = 0; i < count && ascii; ++i) ascii = static_cast<unsigned char>(bytes[i]) < 0x80;
        if (ascii) encoding = kEncodingAscii;
    } else if (encoding != kEncodingAscii && encoding != kEncodingUtf8) {
        debugWrite("Unknown encoding in REALBuildUnicodeString %u", encoding);
    }
    if (count > INT_MAX) return nullptr;
    REALstring result = buildString(bytes, static_cast<int>(count));
    setStringEncoding(result, encoding);
    return result;
}

REALstring cStringToHostString(const char* text, uint32_t encoding) {
    return bytesToHostString(text, text ? std::strlen(text) : 0, encoding);
}

}  // namespace quire_plugin
