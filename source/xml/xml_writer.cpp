#include "lmx/xml_writer.h"

#include <cstring>
#include <ostream>

#include "lmx/text_escaping.h"
#include "lmx/xml_scanner.h"

namespace lmx {

namespace {
constexpr std::size_t stream_chunk = std::size_t{1} << 16;
}

c_xml_writer::c_xml_writer(std::ostream& stream, int flags, std::string indent, std::string line_end,
                           std::string extra_text_1, std::string extra_text_2)
    : stream_(&stream), out_(buffer_), indent_(std::move(indent)), line_end_(std::move(line_end)),
      extra_text_1_(std::move(extra_text_1)), extra_text_2_(std::move(extra_text_2))
{
    write_declaration(flags);
}

c_xml_writer::c_xml_writer(std::string& output, int flags, std::string indent, std::string line_end,
                           std::string extra_text_1, std::string extra_text_2)
    : out_(output), indent_(std::move(indent)), line_end_(std::move(line_end)),
      extra_text_1_(std::move(extra_text_1)), extra_text_2_(std::move(extra_text_2))
{
    write_declaration(flags);
}

c_xml_writer::~c_xml_writer()
{
    flush();
}

void c_xml_writer::write_declaration(int flags)
{
    if ((flags & (flag_declaration | flag_standalone)) == 0)
        return;
    out_ += "<?xml version=\"1.0\" encoding=\"UTF-8\"";
    if (flags & flag_standalone)
        out_ += " standalone=\"yes\"";
    out_ += "?>";
    out_ += line_end_;
}

void c_xml_writer::flush()
{
    if (stream_ && !buffer_.empty()) {
        stream_->write(buffer_.data(), static_cast<std::streamsize>(buffer_.size()));
        buffer_.clear();
    }
}

void c_xml_writer::flush_if_large()
{
    if (stream_ && buffer_.size() >= stream_chunk)
        flush();
}

void c_xml_writer::write_indent(std::size_t levels)
{
    if (indent_.empty())
        return;
    for (std::size_t i = 0; i < levels; ++i)
        out_ += indent_;
}

void c_xml_writer::close_start_tag()
{
    if (start_tag_open_) {
        out_ += '>';
        start_tag_open_ = false;
    }
}

void c_xml_writer::start_element(std::string_view name)
{
    if (start_tag_open_) {
        out_ += '>';
        out_ += line_end_;
        start_tag_open_ = false;
    }
    if (!open_elements_.empty())
        open_elements_.back().has_children = true;
    write_indent(open_elements_.size());
    out_ += '<';
    out_ += name;
    open_elements_.push_back({element_names_.size(), name.size(), false});
    element_names_ += name;
    start_tag_open_ = true;
    if (!root_written_) {
        root_written_ = true;
        if (!schema_location_.empty()) {
            declare_namespace("xsi", xsi_namespace_uri);
            attribute(schema_location_no_namespace_ ? "xsi:noNamespaceSchemaLocation" : "xsi:schemaLocation",
                      std::string_view(schema_location_));
        }
    }
}

void c_xml_writer::declare_namespace(std::string_view prefix, std::string_view namespace_uri)
{
    if (!start_tag_open_)
        return;
    out_ += prefix.empty() ? " xmlns=\"" : " xmlns:";
    if (!prefix.empty()) {
        out_ += prefix;
        out_ += "=\"";
    }
    append_escaped(out_, namespace_uri, c_escape_context::attribute);
    out_ += '"';
    declared_.emplace_back(std::string(prefix), std::string(namespace_uri));
}

void c_xml_writer::attribute(std::string_view name, std::string_view utf8_value)
{
    if (!start_tag_open_)
        return;
    out_ += ' ';
    out_ += name;
    out_ += "=\"";
    append_escaped(out_, utf8_value, c_escape_context::attribute);
    out_ += '"';
}

void c_xml_writer::attribute(std::string_view name, std::wstring_view value)
{
    if (!start_tag_open_)
        return;
    out_ += ' ';
    out_ += name;
    out_ += "=\"";
    append_escaped(out_, value, c_escape_context::attribute);
    out_ += '"';
}

void c_xml_writer::text(std::string_view utf8_text)
{
    if (utf8_text.empty() || open_elements_.empty())
        return;
    close_start_tag();
    append_escaped(out_, utf8_text, c_escape_context::content);
    flush_if_large();
}

void c_xml_writer::text(std::wstring_view wide_text)
{
    if (wide_text.empty() || open_elements_.empty())
        return;
    close_start_tag();
    append_escaped(out_, wide_text, c_escape_context::content);
    flush_if_large();
}

std::string& c_xml_writer::markup_buffer()
{
    close_start_tag();
    if (!open_elements_.empty())
        open_elements_.back().has_children = true;
    return out_;
}

void c_xml_writer::end_element()
{
    if (open_elements_.empty())
        return;
    const open_element closing = open_elements_.back();
    open_elements_.pop_back();
    if (start_tag_open_) {
        out_ += "/>";
        start_tag_open_ = false;
    } else {
        if (closing.has_children)
            write_indent(open_elements_.size());
        out_ += "</";
        out_.append(element_names_, closing.name_offset, closing.name_size);
        out_ += '>';
    }
    out_ += line_end_;
    element_names_.resize(closing.name_offset);
    flush_if_large();
}

void c_xml_writer::set_namespace_table(const c_namespace_entry* table)
{
    if (!namespace_table_)
        namespace_table_ = table;
}

std::string_view c_xml_writer::namespace_prefix(int number) const
{
    for (const c_namespace_entry* entry = namespace_table_; entry && entry->number != 0; ++entry)
        if (entry->number == number)
            return entry->prefix ? entry->prefix : "";
    return {};
}

std::string_view c_xml_writer::namespace_uri(int number) const
{
    for (const c_namespace_entry* entry = namespace_table_; entry && entry->number != 0; ++entry)
        if (entry->number == number)
            return entry->namespace_uri ? entry->namespace_uri : "";
    return {};
}

const std::string* c_xml_writer::declared_prefix(std::string_view namespace_uri) const
{
    for (auto pair = declared_.rbegin(); pair != declared_.rend(); ++pair)
        if (pair->second == namespace_uri)
            return &pair->first;
    return nullptr;
}

void c_xml_writer::set_schema_location(std::string location, bool no_namespace)
{
    schema_location_ = std::move(location);
    schema_location_no_namespace_ = no_namespace;
}

}  // namespace lmx
