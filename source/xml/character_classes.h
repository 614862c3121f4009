#pragma once
// Byte classes used by the scanner's inner loops (internal).
#include <array>
#include <cstdint>

namespace lmx {

enum : std::uint8_t {
    class_name = 1,         // may continue a name
    class_name_start = 2,   // may start a name
    class_space = 4,        // XML white space
    class_text_stop = 8,    // ends a plain run of character data
    class_value_stop = 16,  // ends a plain run of an attribute value
};

constexpr std::array<std::uint8_t, 256> make_character_classes()
{
    std::array<std::uint8_t, 256> classes{};
    for (int c = 0; c < 256; ++c) {
        std::uint8_t bits = 0;
        const bool letter = (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z');
        if (letter || c == '_' || c == ':' || c >= 0x80)
            bits |= class_name_start | class_name;
        if ((c >= '0' && c <= '9') || c == '-' || c == '.')
            bits |= class_name;
        if (c == ' ' || c == '\t' || c == '\n' || c == '\r')
            bits |= class_space;
        if (c == '<' || c == '&' || c == '\r' || c == ']')
            bits |= class_text_stop;
        if (c == '<' || c == '&' || c == '\t' || c == '\n' || c == '\r' || c == '"' || c == '\'')
            bits |= class_value_stop;
        classes[static_cast<std::size_t>(c)] = bits;
    }
    return classes;
}

inline constexpr std::array<std::uint8_t, 256> character_classes = make_character_classes();

inline bool has_class(char c, std::uint8_t bits)
{
    return (character_classes[static_cast<unsigned char>(c)] & bits) != 0;
}

}  // namespace lmx
