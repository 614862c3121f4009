#pragma once
#include <cstddef>
#include <iosfwd>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace lmx {

// A namespace known to generated code by number; a table of these ends with
// an entry whose number is 0.
struct c_namespace_entry {
    int number;
    const char* prefix;
    const char* namespace_uri;
};

// Streams UTF-8 XML text to a string or an output stream. Start tags are kept
// open until content arrives, so an element without content ends in "/>".
class c_xml_writer {
public:
    enum : int {
        flag_declaration = 1,  // write <?xml version="1.0" encoding="UTF-8"?>
        flag_standalone = 2,   // ... with standalone="yes"
    };

    // indent: written once per nesting level before a start tag; line_end:
    // after each tag line; the two further texts are kept for callers that
    // want them.
    c_xml_writer(std::ostream& stream, int flags = 0, std::string indent = {}, std::string line_end = {},
                 std::string extra_text_1 = {}, std::string extra_text_2 = {});
    c_xml_writer(std::string& output, int flags = 0, std::string indent = {}, std::string line_end = {},
                 std::string extra_text_1 = {}, std::string extra_text_2 = {});
    c_xml_writer(const c_xml_writer&) = delete;
    c_xml_writer& operator=(const c_xml_writer&) = delete;
    ~c_xml_writer();

    void start_element(std::string_view name);
    // xmlns or xmlns:prefix on the open start tag; the pair is remembered.
    void declare_namespace(std::string_view prefix, std::string_view namespace_uri);
    // Attributes belong to the open start tag; once content has been written
    // they are ignored.
    void attribute(std::string_view name, std::string_view utf8_value);
    void attribute(std::string_view name, std::wstring_view value);
    void text(std::string_view utf8_text);
    void text(std::wstring_view text);
    void end_element();
    // For callers that write well-formed markup of their own inside the current element:
    // closes an open start tag and returns the output to append to; markup_done() afterwards.
    std::string& markup_buffer();
    void markup_done() { flush_if_large(); }
    // Hands buffered text to the stream (a no-op when writing to a string).
    void flush();

    std::size_t depth() const { return open_elements_.size(); }
    const std::string& indent() const { return indent_; }
    const std::string& line_end() const { return line_end_; }
    const std::string& extra_text_1() const { return extra_text_1_; }
    const std::string& extra_text_2() const { return extra_text_2_; }

    // The first table given is kept; later ones are ignored.
    void set_namespace_table(const c_namespace_entry* table);
    const c_namespace_entry* namespace_table() const { return namespace_table_; }
    // Prefix and URI of a numbered namespace; empty when unknown.
    std::string_view namespace_prefix(int number) const;
    std::string_view namespace_uri(int number) const;
    const std::vector<std::pair<std::string, std::string>>& declared_namespaces() const { return declared_; }
    // The prefix declared for a namespace so far, or null.
    const std::string* declared_prefix(std::string_view namespace_uri) const;

    // Makes the root element declare the xsi namespace and carry
    // xsi:schemaLocation (or xsi:noNamespaceSchemaLocation) with this value.
    void set_schema_location(std::string location, bool no_namespace = false);

private:
    struct open_element {
        std::size_t name_offset;
        std::size_t name_size;
        bool has_children;
    };

    void write_declaration(int flags);
    void close_start_tag();
    void write_indent(std::size_t levels);
    void flush_if_large();

    std::ostream* stream_ = nullptr;
    std::string buffer_;   // used with a stream
    std::string& out_;
    std::string indent_, line_end_, extra_text_1_, extra_text_2_;
    std::vector<open_element> open_elements_;
    std::string element_names_;  // names of the open elements, end to end
    bool start_tag_open_ = false;
    bool root_written_ = false;
    const c_namespace_entry* namespace_table_ = nullptr;
    std::vector<std::pair<std::string, std::string>> declared_;
    std::string schema_location_;
    bool schema_location_no_namespace_ = false;
};

}  // namespace lmx
