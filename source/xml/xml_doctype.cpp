// The document type declaration: internal subset and general entity declarations.
#include <algorithm>
#include <cstring>
#include <iterator>

#include <utf8.h>

#include "character_classes.h"
#include "lmx/xml_scanner.h"

namespace lmx {

namespace {

std::string snippet(const char* p, const char* end)
{
    constexpr std::ptrdiff_t longest = 20;
    return std::string(p, p + std::min(end - p, longest));
}

}  // namespace

bool c_xml::read_doctype()
{
    if (doctype_seen_)
        return fail(ELMX_BAD_DTD, "Document Type Declaration already read");
    if (root_seen_)
        return fail(ELMX_BAD_DTD, "Document Type Declaration not at start of document");
    doctype_seen_ = true;
    p_ += 9;  // "<!DOCTYPE"
    const char* before_space = p_;
    skip_space();
    const std::string_view name = scan_name();
    if (p_ >= end_)
        return unexpected_end();
    if (before_space == p_ || name.empty())
        return fail(ELMX_BAD_DTD, "DTD not Well Formed (got " + snippet(p_, end_) + ")");
    skip_space();
    // An external subset is named but never fetched.
    auto skip_literal = [this]() {
        skip_space();
        if (p_ >= end_)
            return unexpected_end();
        const char quote = *p_;
        if (quote != '"' && quote != '\'')
            return fail(ELMX_BAD_DTD, "DTD not Well Formed (got " + snippet(p_, end_) + ")");
        const void* close = std::memchr(p_ + 1, quote, static_cast<std::size_t>(end_ - p_ - 1));
        if (!close)
            return unexpected_end();
        p_ = static_cast<const char*>(close) + 1;
        return true;
    };
    if (at("SYSTEM")) {
        p_ += 6;
        if (!skip_literal())
            return false;
    } else if (at("PUBLIC")) {
        p_ += 6;
        if (!skip_literal() || !skip_literal())
            return false;
    }
    skip_space();
    if (p_ < end_ && *p_ == '[') {
        ++p_;
        if (!read_internal_subset())
            return false;
        skip_space();
    }
    if (p_ >= end_)
        return unexpected_end();
    if (*p_ != '>')
        return fail(ELMX_BAD_DTD, std::string("DTD not Well Formed (expected '>', got ") + *p_ + ")");
    ++p_;
    return true;
}

bool c_xml::read_internal_subset()
{
    for (;;) {
        skip_space();
        if (p_ >= end_)
            return unexpected_end();
        if (*p_ == ']') {
            ++p_;
            return true;
        }
        bool ok;
        if (at("<!ENTITY"))
            ok = read_entity_declaration();
        else if (at("<!--"))
            ok = skip_comment();
        else if (at("<?"))
            ok = skip_processing_instruction();
        else if (at("<!ELEMENT") || at("<!ATTLIST") || at("<!NOTATION"))
            ok = skip_markup_declaration();
        else
            ok = fail(ELMX_BAD_DTD, "DTD not Well Formed (got " + snippet(p_, end_) + ")");
        if (!ok)
            return false;
    }
}

bool c_xml::skip_markup_declaration()
{
    while (p_ < end_) {
        const char c = *p_++;
        if (c == '>')
            return true;
        if (c == '"' || c == '\'') {
            const void* close = std::memchr(p_, c, static_cast<std::size_t>(end_ - p_));
            if (!close)
                break;
            p_ = static_cast<const char*>(close) + 1;
        }
    }
    return unexpected_end();
}

bool c_xml::read_entity_declaration()
{
    p_ += 8;  // "<!ENTITY"
    const char* before_space = p_;
    skip_space();
    bool parameter_entity = false;
    if (p_ < end_ && *p_ == '%') {
        parameter_entity = true;
        ++p_;
        before_space = p_;
        skip_space();
    }
    const std::string_view name = scan_name();
    if (p_ >= end_)
        return unexpected_end();
    if (before_space == p_ || name.empty())
        return fail(ELMX_BAD_DTD, "Unexpected value in Entity definition:" + snippet(p_, end_));
    skip_space();
    if (at("SYSTEM") || at("PUBLIC"))
        return fail(ELMX_EXTERNAL_ENTITY, "External Entity definitions not supported");
    if (p_ >= end_)
        return unexpected_end();
    if (*p_ != '"' && *p_ != '\'')
        return fail(ELMX_BAD_DTD, "Unexpected value in Entity definition:" + snippet(p_, end_));
    std::string value;
    if (!read_entity_literal(value))
        return false;
    skip_space();
    if (p_ >= end_)
        return unexpected_end();
    if (*p_ != '>')
        return fail(ELMX_BAD_DTD, std::string("DTD not Well Formed (expected '>', got ") + *p_ + ")");
    ++p_;
    // Parameter entities are only meaningful in DTD markup, which is skipped.
    // The first declaration of a name is binding.
    if (!parameter_entity)
        entities_.emplace(std::string(name), std::move(value));
    return true;
}

// The replacement text: character references are replaced now, entity
// references are kept and replaced where the entity is used.
bool c_xml::read_entity_literal(std::string& value)
{
    const char quote = *p_++;
    for (;;) {
        if (p_ >= end_)
            return unexpected_end();
        const char c = *p_;
        if (c == quote) {
            ++p_;
            return true;
        }
        if (c == '%')
            return fail(ELMX_BAD_DTD, "DTD not Well Formed (got " + snippet(p_, end_) + ")");
        if (c == '&') {
            if (p_ + 1 < end_ && p_[1] == '#') {
                const char* q = p_ + 1;
                std::uint32_t code_point = 0;
                if (!parse_character_reference(q, end_, code_point))
                    return false;
                utf8::unchecked::append(code_point, std::back_inserter(value));
                p_ = q;
                continue;
            }
            const char* start = p_++;
            const std::string_view name = scan_name();
            if (p_ >= end_)
                return unexpected_end();
            if (name.empty() || *p_ != ';')
                return fail(ELMX_NOT_WELL_FORMED, "XML not Well-Formed: bad entity reference in entity value");
            ++p_;
            value.append(start, p_);
            continue;
        }
        if (c == '\r') {
            value += '\n';
            ++p_;
            if (p_ < end_ && *p_ == '\n')
                ++p_;
            continue;
        }
        value += c;
        ++p_;
    }
}

}  // namespace lmx
