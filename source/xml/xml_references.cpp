// Entity and character references, with the bounds on nested expansion.
#include <algorithm>
#include <iterator>

#include <utf8.h>

#include "character_classes.h"
#include "lmx/xml_scanner.h"

namespace lmx {

namespace {

bool is_xml_character(std::uint32_t c)
{
    return c == 0x9 || c == 0xA || c == 0xD || (c >= 0x20 && c <= 0xD7FF) || (c >= 0xE000 && c <= 0xFFFD) ||
           (c >= 0x10000 && c <= 0x10FFFF);
}

char predefined_entity(std::string_view name)
{
    if (name == "lt")
        return '<';
    if (name == "gt")
        return '>';
    if (name == "amp")
        return '&';
    if (name == "apos")
        return '\'';
    if (name == "quot")
        return '"';
    return 0;
}

}  // namespace

bool c_xml::parse_character_reference(const char*& p, const char* end, std::uint32_t& code_point)
{
    const char* q = p + 1;  // after '#'
    const bool hex = q < end && *q == 'x';
    if (hex)
        ++q;
    std::uint32_t value = 0;
    const char* digits = q;
    for (; q < end; ++q) {
        const char c = *q;
        std::uint32_t digit;
        if (c >= '0' && c <= '9')
            digit = static_cast<std::uint32_t>(c - '0');
        else if (hex && c >= 'a' && c <= 'f')
            digit = static_cast<std::uint32_t>(c - 'a' + 10);
        else if (hex && c >= 'A' && c <= 'F')
            digit = static_cast<std::uint32_t>(c - 'A' + 10);
        else
            break;
        // Saturate above the Unicode range instead of overflowing.
        value = std::min<std::uint32_t>(value * (hex ? 16 : 10) + digit, 0x110000);
    }
    if (q >= end)
        return unexpected_end();
    if (q == digits || *q != ';')
        return fail(ELMX_NOT_WELL_FORMED, "XML not Well-Formed: bad character reference");
    if (!is_xml_character(value))
        return fail(ELMX_NOT_WELL_FORMED, "XML not Well-Formed: character reference to an invalid character");
    code_point = value;
    p = q + 1;
    return true;
}

bool c_xml::append_reference(const char*& p, const char* end, std::string& out, bool in_attribute)
{
    const char* q = p + 1;
    if (q < end && *q == '#') {
        std::uint32_t code_point = 0;
        if (!parse_character_reference(q, end, code_point))
            return false;
        utf8::unchecked::append(code_point, std::back_inserter(out));
        p = q;
        return check_expansion({}, out);
    }
    const char* name_start = q;
    if (q >= end || !has_class(*q, class_name_start))
        return fail(ELMX_NOT_WELL_FORMED, "XML not Well-Formed: '&' not followed by a name");
    while (q < end && has_class(*q, class_name))
        ++q;
    const std::string_view name(name_start, static_cast<std::size_t>(q - name_start));
    if (q >= end)
        return unexpected_end();
    if (*q != ';')
        return fail(ELMX_NOT_WELL_FORMED, "XML not Well-Formed: entity reference " + std::string(name) +
                                              " not terminated by ';'");
    p = q + 1;
    if (const char c = predefined_entity(name)) {
        out += c;
        return check_expansion({}, out);
    }
    return append_entity(name, out, in_attribute);
}

// Bounds the output of nested entity references across the document.
bool c_xml::check_expansion(std::string_view name, const std::string& out)
{
    if (entity_stack_.empty())
        return true;
    if (expanded_bytes_ + (out.size() - expansion_start_) > limits_.max_entity_expansion)
        return fail(ELMX_RECURSIVE_ENTITY,
                    "Entity expansion limit exceeded in: " + std::string(name.empty() ? entity_stack_.back() : name));
    return true;
}

bool c_xml::append_entity(std::string_view name, std::string& out, bool in_attribute)
{
    const auto entity = entities_.find(std::string(name));
    if (entity == entities_.end())
        return fail(ELMX_ENTITY_NOT_FOUND, "Entity '" + std::string(name) + "' not found");
    const std::string_view stable_name = entity->first;
    if (std::find(entity_stack_.begin(), entity_stack_.end(), stable_name) != entity_stack_.end())
        return fail(ELMX_BAD_DTD, "Recursive entity definition for: " + std::string(name));
    if (entity_stack_.size() >= limits_.max_entity_depth)
        return fail(ELMX_RECURSIVE_ENTITY, "Entity references nested too deeply in: " + std::string(name));
    if (++entity_references_ > limits_.max_entity_references)
        return fail(ELMX_RECURSIVE_ENTITY, "Too many entity references, at: " + std::string(name));
    if (entity_stack_.empty())
        expansion_start_ = out.size();
    entity_stack_.push_back(stable_name);

    const std::string& value = entity->second;
    const char* v = value.data();
    const char* const value_end = v + value.size();
    while (v < value_end) {
        const char c = *v;
        if (c == '&') {
            if (!append_reference(v, value_end, out, in_attribute))
                return false;
            continue;
        }
        if (c == '<') {
            if (in_attribute)
                return fail(ELMX_NOT_WELL_FORMED, "'<' in entity '" + std::string(name) +
                                                      "' is not allowed in attribute values");
            return fail(ELMX_UNEXPECTED_ENTITY, "Markup in entity '" + std::string(name) + "' is not supported");
        }
        const char* run = v;
        while (v < value_end && *v != '&' && *v != '<')
            ++v;
        if (in_attribute) {
            for (const char* r = run; r < v; ++r)
                out += (*r == '\t' || *r == '\n' || *r == '\r') ? ' ' : *r;
        } else {
            out.append(run, v);
        }
        if (!check_expansion(name, out))
            return false;
    }

    entity_stack_.pop_back();
    if (entity_stack_.empty())
        expanded_bytes_ += out.size() - expansion_start_;
    return true;
}

}  // namespace lmx
