#pragma once
// Text between host strings and the library: host strings become wide text for the library, and
// the library's wide and 8-bit texts become host strings.
#include <string>

#include "host_sdk.h"

namespace quire_plugin {

// A host string argument as library text, valid for the duration of the call. A nil string is the
// empty text; a failed conversion marks the converter failed and yields the empty text.
class HostText {
public:
    explicit HostText(REALstring text);
    HostText(const HostText&) = delete;
    HostText& operator=(const HostText&) = delete;

    const wchar_t* wide() const { return text_.c_str(); }
    bool failed() const { return failed_; }

    // The 8-bit forms: the raw bytes of ASCII or UTF-8 tagged strings, otherwise the host's
    // conversion to UTF-8, or to single-byte Windows Latin-1 text.
    std::string utf8() const;
    std::string singleByte() const;

private:
    std::string eightBit(uint32_t encoding) const;

    REALstring source_;
    std::wstring text_;
    bool failed_ = false;
};

// The bytes of a host string as they are stored, whatever its encoding.
bool hostStringBytes(REALstring text, std::string& bytes);

// The bytes of a host string converted by the host into `encoding`.
bool hostStringConverted(REALstring text, uint32_t encoding, std::string& bytes);

// Library text (terminated) as a new host string in UTF-8; empty text gives nil.
REALstring wideToHostString(const wchar_t* text);
REALstring utf16ToHostString(const char16_t* units, size_t count);
REALstring utf32ToHostString(const char32_t* units, size_t count);

// 8-bit text (terminated) tagged with `encoding`; null text gives nil.
REALstring cStringToHostString(const char* text, uint32_t encoding);
// Bytes with a count, tagged with `encoding`.
REALstring bytesToHostString(const char* bytes, size_t count, uint32_t encoding);

}  // namespace quire_plugin
