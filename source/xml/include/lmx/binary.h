#pragma once
#include <string>
#include <string_view>
#include <vector>

#include "lmx/error.h"

namespace lmx {

// Value of the xs:hexBinary and xs:base64Binary types.
class c_binary {
public:
    c_binary() = default;
    explicit c_binary(std::vector<unsigned char> bytes) : bytes_(std::move(bytes)) {}

    const std::vector<unsigned char>& bytes() const { return bytes_; }
    std::vector<unsigned char>& bytes() { return bytes_; }
    bool operator==(const c_binary& other) const { return bytes_ == other.bytes_; }

    // Both ignore surrounding white space; base64 also white space inside.
    static elmx_error from_hex(std::string_view text, c_binary& value);
    static elmx_error from_base64(std::string_view text, c_binary& value);
    std::string to_hex() const;     // upper-case digits
    std::string to_base64() const;  // padded, no line breaks

private:
    std::vector<unsigned char> bytes_;
};

}  // namespace lmx
