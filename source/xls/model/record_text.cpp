#include "record_text.h"

#include "api/qrerror.h"
#include "api/wide_text.h"
#include "xls/strings.h"

namespace quire {

std::wstring readUnicodeString(const uint8_t* data, size_t size, size_t& pos, bool shortCount,
                               const char* message) {
    if (pos > size) throw qrerror(message);
    xls::RecordReader reader(data + pos, size - pos);
    size_t remaining = size - pos;
    try {
        xls::XLString text = shortCount ? xls::readShortXLUnicodeString(reader, remaining)
                                        : xls::readXLUnicodeString(reader, remaining);
        pos = size - remaining;
        return fromUtf16(text.chars.data(), text.chars.size());
    } catch (const qrerror&) {
        throw qrerror(message);
    }
}

std::wstring readByteString(const uint8_t* data, size_t size, size_t& pos, bool shortCount,
                            const char* message) {
    if (pos > size) throw qrerror(message);
    xls::RecordReader reader(data + pos, size - pos);
    size_t remaining = size - pos;
    try {
        xls::XLString text = shortCount ? xls::readShortXLUnicodeString(reader, remaining, false)
                                        : xls::readXLUnicodeString(reader, remaining, false);
        pos = size - remaining;
        return fromUtf16(text.chars.data(), text.chars.size());
    } catch (const qrerror&) {
        throw qrerror(message);
    }
}

void appendUnicodeString(std::vector<uint8_t>& out, const std::wstring& text, bool shortCount) {
    if (shortCount) xls::writeShortXLUnicodeString(out, toUtf16(text));
    else xls::writeXLUnicodeString(out, toUtf16(text));
}

}  // namespace quire
