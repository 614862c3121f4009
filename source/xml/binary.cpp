#include "lmx/binary.h"

#include "lmx/value_conversion.h"

namespace lmx {

namespace {

constexpr std::string_view base64_alphabet = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";

int hex_value(char c)
{
    if (c >= '0' && c <= '9')
        return c - '0';
    if (c >= 'a' && c <= 'f')
        return c - 'a' + 10;
    if (c >= 'A' && c <= 'F')
        return c - 'A' + 10;
    return -1;
}

int base64_value(char c)
{
    const std::size_t position = base64_alphabet.find(c);
    return position == std::string_view::npos ? -1 : static_cast<int>(position);
}

}  // namespace

elmx_error c_binary::from_hex(std::string_view text, c_binary& value)
{
    text = trim_xml_space(text);
    if (text.size() % 2 != 0)
        return ELMX_VALUE_BAD_FORMAT;
    std::vector<unsigned char> bytes;
    bytes.reserve(text.size() / 2);
    for (std::size_t i = 0; i < text.size(); i += 2) {
        const int high = hex_value(text[i]);
        const int low = hex_value(text[i + 1]);
        if (high < 0 || low < 0)
            return ELMX_VALUE_BAD_FORMAT;
        bytes.push_back(static_cast<unsigned char>(high << 4 | low));
    }
    value.bytes_ = std::move(bytes);
    return ELMX_OK;
}

elmx_error c_binary::from_base64(std::string_view text, c_binary& value)
{
    std::vector<unsigned char> bytes;
    bytes.reserve(text.size() * 3 / 4);
    unsigned int accumulator = 0;
    int bits = 0;
    int padding = 0;
    std::size_t symbols = 0;
    for (const char c : text) {
        if (c == ' ' || c == '\t' || c == '\n' || c == '\r')
            continue;
        ++symbols;
        if (c == '=') {
            if (++padding > 2)
                return ELMX_VALUE_BAD_FORMAT;
            continue;
        }
        const int sextet = base64_value(c);
        if (sextet < 0 || padding > 0)
            return ELMX_VALUE_BAD_FORMAT;
        accumulator = (accumulator << 6 | static_cast<unsigned int>(sextet)) & 0xFFFFFF;
        bits += 6;
        if (bits >= 8) {
            bits -= 8;
            bytes.push_back(static_cast<unsigned char>(accumulator >> bits));
        }
    }
    if (symbols % 4 != 0)
        return ELMX_VALUE_BAD_FORMAT;
    value.bytes_ = std::move(bytes);
    return ELMX_OK;
}

std::string c_binary::to_hex() const
{
    constexpr std::string_view digits = "0123456789ABCDEF";
    std::string text;
    text.reserve(bytes_.size() * 2);
    for (const unsigned char byte : bytes_) {
        text += digits[byte >> 4];
        text += digits[byte & 15];
    }
    return text;
}

std::string c_binary::to_base64() const
{
    std::string text;
    text.reserve((bytes_.size() + 2) / 3 * 4);
    std::size_t i = 0;
    for (; i + 2 < bytes_.size(); i += 3) {
        const unsigned int group = bytes_[i] << 16 | bytes_[i + 1] << 8 | bytes_[i + 2];
        for (int shift = 18; shift >= 0; shift -= 6)
            text += base64_alphabet[group >> shift & 63];
    }
    const std::size_t left = bytes_.size() - i;
    if (left > 0) {
        const unsigned int group = bytes_[i] << 16 | (left > 1 ? bytes_[i + 1] << 8 : 0);
        text += base64_alphabet[group >> 18 & 63];
        text += base64_alphabet[group >> 12 & 63];
        text += left > 1 ? base64_alphabet[group >> 6 & 63] : '=';
        text += '=';
    }
    return text;
}

}  // namespace lmx
