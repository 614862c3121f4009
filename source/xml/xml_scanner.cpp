// The pull scanner: document set-up, the event loop, tags, attributes and text.
#include "lmx/xml_scanner.h"

#include <algorithm>
#include <cstring>

#include "character_classes.h"
#include "character_encoding.h"

namespace lmx {

c_xml::c_xml(const c_read& source, const c_xml_limits& limits) : limits_(limits)
{
    if (!source.is_open()) {
        fail(ELMX_NO_FILE, "Unable to open file");
        return;
    }
    prepare(source.data(), source.size());
}

c_xml::c_xml(const void* data, std::size_t size, const c_xml_limits& limits) : limits_(limits)
{
    prepare(static_cast<const char*>(data), data ? size : 0);
}

bool c_xml::fail(elmx_error code, std::string detail)
{
    raise(code, std::move(detail));
    event_ = xml_event::error;
    return false;
}

elmx_error c_xml::raise(elmx_error code, std::string detail)
{
    if (error_count_++ == 0) {
        error_.code = code;
        error_.detail = std::move(detail);
        error_.xml_line = line();
    }
    return code;
}

elmx_error c_xml::raise(elmx_error code, std::string detail, std::string item_name,
                        std::string program_file, int program_line)
{
    if (error_count_ == 0) {
        error_.item_name = std::move(item_name);
        error_.program_file = std::move(program_file);
        error_.program_line = program_line;
    }
    return raise(code, std::move(detail));
}

int c_xml::line() const
{
    if (!p_ || !document_begin_)
        return 1;
    if (!counted_up_to_ || counted_up_to_ < document_begin_ || counted_up_to_ > p_) {
        counted_up_to_ = document_begin_;
        counted_lines_ = 1;
    }
    for (const char* q = counted_up_to_; q < p_; ++q)
        if (*q == '\n' || (*q == '\r' && (q + 1 == end_ || q[1] != '\n')))
            ++counted_lines_;
    counted_up_to_ = p_;
    return counted_lines_;
}

bool c_xml::at(std::string_view literal) const
{
    return static_cast<std::size_t>(end_ - p_) >= literal.size() &&
           std::memcmp(p_, literal.data(), literal.size()) == 0;
}

void c_xml::skip_space()
{
    while (p_ < end_ && has_class(*p_, class_space))
        ++p_;
}

std::string_view c_xml::scan_name()
{
    const char* start = p_;
    if (p_ >= end_ || !has_class(*p_, class_name_start))
        return {};
    ++p_;
    while (p_ < end_ && has_class(*p_, class_name))
        ++p_;
    return {start, static_cast<std::size_t>(p_ - start)};
}

bool c_xml::unexpected_end()
{
    return fail(ELMX_UNEXPECTED_EOM, "Premature end of file encountered");
}

bool c_xml::split_qname(std::string_view qname, std::string_view& prefix, std::string_view& local)
{
    const std::size_t colon = qname.find(':');
    if (colon == std::string_view::npos) {
        prefix = {};
        local = qname;
        return true;
    }
    if (colon == 0 || colon + 1 == qname.size() || qname.find(':', colon + 1) != std::string_view::npos ||
        !has_class(qname[colon + 1], class_name_start))
        return fail(ELMX_NOT_WELL_FORMED, "Badly formed qualified name: " + std::string(qname));
    prefix = qname.substr(0, colon);
    local = qname.substr(colon + 1);
    return true;
}

std::string_view c_xml::lookup_namespace(std::string_view prefix) const
{
    if (prefix == "xml")
        return xml_namespace_uri;
    for (auto binding = bindings_.rbegin(); binding != bindings_.rend(); ++binding)
        if (binding->prefix == prefix)
            return binding->namespace_uri;
    return {};
}

const c_xml_attribute* c_xml::find_attribute(std::string_view local_name,
                                             std::string_view namespace_uri) const
{
    for (const c_xml_attribute& attribute : attributes_)
        if (attribute.local_name == local_name && attribute.namespace_uri == namespace_uri)
            return &attribute;
    return nullptr;
}

xml_event c_xml::next()
{
    if (event_ == xml_event::error || event_ == xml_event::end_document)
        return event_;
    if (pending_end_) {
        pending_end_ = false;
        finish_end_element();
        return event_;
    }
    for (;;) {
        if (open_elements_.empty()) {
            skip_space();
            if (p_ >= end_) {
                if (!root_seen_)
                    fail(ELMX_UNEXPECTED_EOM, "Premature end of file encountered: no root element");
                else
                    event_ = xml_event::end_document;
                return event_;
            }
            if (at("<!--")) {
                if (!skip_comment())
                    return event_;
                continue;
            }
            if (at("<?")) {
                if (!skip_processing_instruction())
                    return event_;
                continue;
            }
            if (at("<!DOCTYPE")) {
                if (!read_doctype())
                    return event_;
                continue;
            }
            if (root_closed_) {
                fail(ELMX_NOT_WELL_FORMED, "XML not Well-Formed: extra content at the end of the document");
                return event_;
            }
            if (*p_ != '<' || p_ + 1 >= end_ || !has_class(p_[1], class_name_start)) {
                fail(ELMX_NOT_WELL_FORMED, "XML not Well-Formed: start tag expected");
                return event_;
            }
            if (read_start_tag())
                root_seen_ = true;
            return event_;
        }
        if (p_ >= end_) {
            unexpected_end();
            return event_;
        }
        if (*p_ == '<') {
            if (p_ + 1 >= end_) {
                unexpected_end();
                return event_;
            }
            const char after = p_[1];
            if (after == '/') {
                read_end_tag();
                return event_;
            }
            if (after != '!' && after != '?') {
                read_start_tag();
                return event_;
            }
            if (after == '!' && !at("<!--") && !at("<![CDATA[")) {
                fail(ELMX_NOT_WELL_FORMED, "XML not Well-Formed: unexpected markup in content");
                return event_;
            }
        }
        if (!read_text())
            return event_;
        if (!text_.empty()) {
            event_ = xml_event::text;
            return event_;
        }
    }
}

bool c_xml::read_start_tag()
{
    ++p_;  // '<'
    const std::string_view qname = scan_name();
    if (qname.empty())
        return fail(ELMX_NOT_WELL_FORMED, "XML not Well-Formed: bad element name");
    raw_attributes_.clear();
    attribute_scratch_.clear();
    empty_element_ = false;
    for (;;) {
        const char* before_space = p_;
        skip_space();
        if (p_ >= end_)
            return unexpected_end();
        const char c = *p_;
        if (c == '>') {
            ++p_;
            break;
        }
        if (c == '/') {
            if (p_ + 1 >= end_)
                return unexpected_end();
            if (p_[1] != '>')
                return fail(ELMX_BAD_END_TAG, "Illegal character(s) after / at end of tag -" + std::string(qname));
            p_ += 2;
            empty_element_ = true;
            break;
        }
        if (p_ == before_space)
            return fail(ELMX_NOT_WELL_FORMED, "XML not Well-Formed: attributes must be separated by white space");
        raw_attribute attribute{};
        attribute.qname = scan_name();
        if (attribute.qname.empty())
            return fail(ELMX_NOT_WELL_FORMED, "XML not Well-Formed: bad attribute name");
        skip_space();
        if (p_ >= end_)
            return unexpected_end();
        if (*p_ != '=')
            return fail(ELMX_NOT_WELL_FORMED,
                        std::string("Schema is not Well Formed (expected '=', got '") + *p_ + "')");
        ++p_;
        skip_space();
        if (p_ >= end_)
            return unexpected_end();
        if (*p_ != '"' && *p_ != '\'')
            return fail(ELMX_NOT_WELL_FORMED,
                        std::string("Schema is not Well Formed (expected '\"' or ''', got '") + *p_ + "')");
        if (!read_attribute_value(attribute))
            return false;
        raw_attributes_.push_back(attribute);
    }
    if (open_elements_.size() >= limits_.max_element_depth)
        return fail(ELMX_NOT_WELL_FORMED, "Elements nested too deeply");
    const std::size_t binding_mark = bindings_.size();
    element_.qname = qname;
    if (!resolve_namespaces())
        return false;
    open_elements_.push_back({element_, binding_mark});
    pending_end_ = empty_element_;
    event_ = xml_event::start_element;
    return true;
}

bool c_xml::read_attribute_value(raw_attribute& attribute)
{
    const char quote = *p_++;
    const char* start = p_;
    while (p_ < end_ && !has_class(*p_, class_value_stop))
        ++p_;
    if (p_ >= end_)
        return unexpected_end();
    if (*p_ == quote) {
        attribute.value_data = start;
        attribute.value_size = static_cast<std::size_t>(p_ - start);
        ++p_;
        return true;
    }
    // Slow path: references, white space to normalise or the other quote.
    attribute.value_data = nullptr;
    attribute.value_offset = attribute_scratch_.size();
    attribute_scratch_.append(start, p_);
    for (;;) {
        if (p_ >= end_)
            return unexpected_end();
        const char c = *p_;
        if (c == quote) {
            ++p_;
            break;
        }
        if (c == '<')
            return fail(ELMX_NOT_WELL_FORMED, "XML not Well-Formed: '<' in attribute value");
        if (c == '&') {
            if (!append_reference(p_, end_, attribute_scratch_, true))
                return false;
        } else if (c == '\r') {
            attribute_scratch_ += ' ';
            ++p_;
            if (p_ < end_ && *p_ == '\n')
                ++p_;
        } else if (c == '\t' || c == '\n') {
            attribute_scratch_ += ' ';
            ++p_;
        } else {
            attribute_scratch_ += c;  // the other quote character
            ++p_;
        }
        const char* run = p_;
        while (p_ < end_ && !has_class(*p_, class_value_stop))
            ++p_;
        attribute_scratch_.append(run, p_);
    }
    attribute.value_size = attribute_scratch_.size() - attribute.value_offset;
    return true;
}

bool c_xml::resolve_namespaces()
{
    auto value_of = [this](const raw_attribute& attribute) {
        return attribute.value_data ? std::string_view(attribute.value_data, attribute.value_size)
                                    : std::string_view(attribute_scratch_).substr(attribute.value_offset,
                                                                                  attribute.value_size);
    };
    declarations_.clear();
    attributes_.clear();
    bool has_plain_attributes = false;
    for (const raw_attribute& attribute : raw_attributes_) {
        const std::string_view qname = attribute.qname;
        if (qname.compare(0, 5, "xmlns") != 0 || (qname.size() > 5 && qname[5] != ':')) {
            has_plain_attributes = true;
            continue;
        }
        const std::string_view value = value_of(attribute);
        std::string_view prefix;
        if (qname.size() > 5) {
            prefix = qname.substr(6);
            if (prefix.empty() || prefix.find(':') != std::string_view::npos)
                return fail(ELMX_NOT_WELL_FORMED, "Bad namespace declaration: " + std::string(qname));
            if (prefix == "xmlns")
                return fail(ELMX_NOT_WELL_FORMED, "The prefix xmlns cannot be declared");
            if (value.empty())
                return fail(ELMX_NOT_WELL_FORMED, "Empty namespace name for prefix " + std::string(prefix));
        }
        if ((prefix == "xml") != (value == xml_namespace_uri) || value == xmlns_namespace_uri)
            return fail(ELMX_NOT_WELL_FORMED, "Reserved namespace misused in " + std::string(qname));
        const std::string_view uri = value.empty() ? std::string_view{} : repository_.intern(value);
        if (prefix != "xml")
            bindings_.push_back({prefix, uri});
        declarations_.push_back({prefix, uri});
    }

    if (!split_qname(element_.qname, element_.prefix, element_.local_name))
        return false;
    element_.namespace_uri = lookup_namespace(element_.prefix);
    if (!element_.prefix.empty() && element_.namespace_uri.empty())
        return fail(ELMX_NOT_WELL_FORMED, "Namespace prefix " + std::string(element_.prefix) + " on " +
                                              std::string(element_.local_name) + " is not defined");
    if (has_plain_attributes) {
        for (const raw_attribute& raw : raw_attributes_) {
            const std::string_view qname = raw.qname;
            if (qname.compare(0, 5, "xmlns") == 0 && (qname.size() == 5 || qname[5] == ':'))
                continue;
            c_xml_attribute attribute;
            attribute.qname = qname;
            if (!split_qname(qname, attribute.prefix, attribute.local_name))
                return false;
            if (!attribute.prefix.empty()) {
                attribute.namespace_uri = lookup_namespace(attribute.prefix);
                if (attribute.namespace_uri.empty())
                    return fail(ELMX_NOT_WELL_FORMED, "Namespace prefix " + std::string(attribute.prefix) +
                                                          " for " + std::string(attribute.local_name) +
                                                          " is not defined");
            }
            attribute.value = value_of(raw);
            attributes_.push_back(attribute);
        }
    }
    return check_duplicate_attributes();
}

bool c_xml::check_duplicate_attributes()
{
    auto duplicate = [this](std::string_view qname) {
        return fail(ELMX_NOT_WELL_FORMED, "Attribute " + std::string(qname) + " redefined");
    };
    const std::size_t raw_count = raw_attributes_.size();
    if (raw_count < 2)
        return true;
    constexpr std::size_t pairwise_limit = 16;
    if (raw_count <= pairwise_limit) {
        for (std::size_t i = 0; i < raw_count; ++i)
            for (std::size_t j = i + 1; j < raw_count; ++j)
                if (raw_attributes_[i].qname == raw_attributes_[j].qname)
                    return duplicate(raw_attributes_[j].qname);
        for (std::size_t i = 0; i < attributes_.size(); ++i)
            for (std::size_t j = i + 1; j < attributes_.size(); ++j)
                if (attributes_[i].local_name == attributes_[j].local_name &&
                    attributes_[i].namespace_uri == attributes_[j].namespace_uri)
                    return duplicate(attributes_[j].qname);
        return true;
    }
    // Many attributes: sort instead of comparing every pair.
    std::vector<std::string_view> qnames;
    qnames.reserve(raw_count);
    for (const raw_attribute& raw : raw_attributes_)
        qnames.push_back(raw.qname);
    std::sort(qnames.begin(), qnames.end());
    const auto same_qname = std::adjacent_find(qnames.begin(), qnames.end());
    if (same_qname != qnames.end())
        return duplicate(*same_qname);
    std::vector<std::pair<std::string_view, std::string_view>> expanded;
    expanded.reserve(attributes_.size());
    for (const c_xml_attribute& attribute : attributes_)
        expanded.emplace_back(attribute.namespace_uri, attribute.local_name);
    std::sort(expanded.begin(), expanded.end());
    const auto same_name = std::adjacent_find(expanded.begin(), expanded.end());
    if (same_name != expanded.end())
        return duplicate(same_name->second);
    return true;
}

bool c_xml::read_end_tag()
{
    p_ += 2;  // "</"
    const std::string_view qname = scan_name();
    skip_space();
    if (p_ >= end_)
        return unexpected_end();
    if (*p_ != '>' || qname.empty())
        return fail(ELMX_BAD_END_TAG, "Illegal character(s) in end tag </" + std::string(qname));
    const std::string_view open_name = open_elements_.back().names.qname;
    if (qname != open_name)
        return fail(ELMX_NOT_WELL_FORMED, "Element start tag (" + std::string(open_name) + ") and end tag (" +
                                              std::string(qname) + ") do not match");
    ++p_;
    finish_end_element();
    return true;
}

void c_xml::finish_end_element()
{
    const open_element& closing = open_elements_.back();
    element_ = closing.names;
    bindings_.resize(closing.binding_mark);
    open_elements_.pop_back();
    if (open_elements_.empty())
        root_closed_ = true;
    attributes_.clear();
    declarations_.clear();
    empty_element_ = false;
    event_ = xml_event::end_element;
}

bool c_xml::read_text()
{
    text_ = {};
    text_scratch_.clear();
    bool in_scratch = false;
    auto to_scratch = [&] {
        if (!in_scratch) {
            text_scratch_.assign(text_.data(), text_.size());
            in_scratch = true;
        }
    };
    auto append = [&](const char* begin, const char* end) {
        if (begin == end)
            return;
        if (!in_scratch) {
            if (text_.empty()) {
                text_ = {begin, static_cast<std::size_t>(end - begin)};
                return;
            }
            if (text_.data() + text_.size() == begin) {
                text_ = {text_.data(), text_.size() + static_cast<std::size_t>(end - begin)};
                return;
            }
            to_scratch();
        }
        text_scratch_.append(begin, end);
    };
    for (;;) {
        const char* run = p_;
        while (p_ < end_ && !has_class(*p_, class_text_stop))
            ++p_;
        append(run, p_);
        if (p_ >= end_)
            break;  // the caller reports the missing end tags
        const char c = *p_;
        if (c == '<') {
            if (at("<!--")) {
                if (!skip_comment())
                    return false;
                continue;
            }
            if (at("<?")) {
                if (!skip_processing_instruction())
                    return false;
                continue;
            }
            if (at("<![CDATA[")) {
                to_scratch();
                if (!read_cdata(text_scratch_))
                    return false;
                continue;
            }
            break;
        }
        if (c == '&') {
            to_scratch();
            if (!append_reference(p_, end_, text_scratch_, false))
                return false;
            continue;
        }
        if (c == '\r') {
            to_scratch();
            text_scratch_ += '\n';
            ++p_;
            if (p_ < end_ && *p_ == '\n')
                ++p_;
            continue;
        }
        if (at("]]>"))
            return fail(ELMX_NOT_WELL_FORMED, "XML not Well-Formed: ']]>' in content");
        ++p_;
        append(p_ - 1, p_);
    }
    if (in_scratch)
        text_ = text_scratch_;
    return true;
}

bool c_xml::read_cdata(std::string& out)
{
    p_ += 9;  // "<![CDATA["
    const std::string_view rest(p_, static_cast<std::size_t>(end_ - p_));
    const std::size_t close = rest.find("]]>");
    if (close == std::string_view::npos)
        return unexpected_end();
    const char* stop = p_ + close;
    while (p_ < stop) {
        const char* run = p_;
        while (p_ < stop && *p_ != '\r')
            ++p_;
        out.append(run, p_);
        if (p_ < stop) {
            out += '\n';
            ++p_;
            if (p_ < stop && *p_ == '\n')
                ++p_;
        }
    }
    p_ = stop + 3;
    return true;
}

bool c_xml::skip_comment()
{
    p_ += 4;  // "<!--"
    for (;;) {
        const void* dash = std::memchr(p_, '-', static_cast<std::size_t>(end_ - p_));
        if (!dash)
            return unexpected_end();
        const char* q = static_cast<const char*>(dash);
        if (end_ - q < 3)
            return unexpected_end();
        if (q[1] == '-') {
            if (q[2] != '>') {
                p_ = q;
                return fail(ELMX_BAD_COMMENT, "End of comment not Well-Formed");
            }
            p_ = q + 3;
            return true;
        }
        p_ = q + 1;
    }
}

bool c_xml::skip_processing_instruction()
{
    p_ += 2;  // "<?"
    const std::string_view target = scan_name();
    if (target.empty())
        return fail(ELMX_NOT_WELL_FORMED, "XML not Well-Formed: processing instruction without target");
    if (target.size() == 3 && (target[0] | 0x20) == 'x' && (target[1] | 0x20) == 'm' && (target[2] | 0x20) == 'l')
        return fail(ELMX_BAD_XML_DECL, "XML declaration not at start of document");
    if (p_ < end_ && !has_class(*p_, class_space) && !at("?>"))
        return fail(ELMX_NOT_WELL_FORMED, "XML not Well-Formed: bad processing instruction");
    const std::string_view rest(p_, static_cast<std::size_t>(end_ - p_));
    const std::size_t close = rest.find("?>");
    if (close == std::string_view::npos)
        return unexpected_end();
    p_ += close + 2;
    return true;
}

}  // namespace lmx
