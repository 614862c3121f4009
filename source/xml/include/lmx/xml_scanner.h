#pragma once
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "lmx/error.h"
#include "lmx/read_source.h"
#include "lmx/repository.h"

namespace lmx {

enum class c_byte_format;

inline constexpr std::string_view xml_namespace_uri = "http://www.w3.org/XML/1998/namespace";
inline constexpr std::string_view xmlns_namespace_uri = "http://www.w3.org/2000/xmlns/";
inline constexpr std::string_view xsi_namespace_uri = "http://www.w3.org/2001/XMLSchema-instance";

enum class xml_event {
    none,            // nothing read yet
    start_element,
    end_element,
    text,            // character data up to the next tag (references replaced, CDATA included)
    end_document,
    error,
};

// One attribute of the current start tag. Namespace declarations are not
// attributes here; see c_xml::namespace_declarations().
struct c_xml_attribute {
    std::string_view qname;
    std::string_view prefix;
    std::string_view local_name;
    std::string_view namespace_uri;  // empty: no namespace
    std::string_view value;          // references replaced, white space normalised
};

struct c_namespace_declaration {
    std::string_view prefix;         // empty: the default namespace
    std::string_view namespace_uri;  // empty: default namespace undeclared
};

// Bounds that keep hostile documents from running away.
struct c_xml_limits {
    // Entity references inside entity values, nested at most this deep.
    std::size_t max_entity_depth = 16;
    // Total bytes that entity references may produce in one document.
    std::size_t max_entity_expansion = std::size_t{8} << 20;
    // References to declared entities, counted through all nesting levels.
    std::size_t max_entity_references = 1000000;
    // Open elements at one time.
    std::size_t max_element_depth = 1024;
};

// Pull scanner over one XML document held contiguously in memory. UTF-8 input
// is scanned in place; other encodings are first converted to UTF-8. Views
// returned for names, attribute values and text stay valid until the next
// call of next(); namespace URIs stay valid for the scanner's life.
class c_xml {
public:
    // The source (and its buffer) must outlive the scanner.
    explicit c_xml(const c_read& source, const c_xml_limits& limits = {});
    c_xml(const void* data, std::size_t size, const c_xml_limits& limits = {});
    c_xml(const c_xml&) = delete;
    c_xml& operator=(const c_xml&) = delete;

    xml_event next();
    xml_event event() const { return event_; }

    // The element of the current start_element or end_element event.
    std::string_view qname() const { return element_.qname; }
    std::string_view prefix() const { return element_.prefix; }
    std::string_view local_name() const { return element_.local_name; }
    std::string_view namespace_uri() const { return element_.namespace_uri; }
    const std::vector<c_xml_attribute>& attributes() const { return attributes_; }
    const std::vector<c_namespace_declaration>& namespace_declarations() const { return declarations_; }
    // Value of the named attribute (no namespace) of the current start tag, or null.
    const c_xml_attribute* find_attribute(std::string_view local_name,
                                          std::string_view namespace_uri = {}) const;
    // The start tag ended with "/>"; its end_element event follows at once.
    bool is_empty_element() const { return empty_element_; }
    // Open elements, counting the current start element.
    std::size_t depth() const { return open_elements_.size(); }

    std::string_view text() const { return text_; }

    // Namespace bound to a prefix where the scanner stands; empty when unbound.
    std::string_view lookup_namespace(std::string_view prefix) const;

    // From the XML declaration (empty when absent).
    std::string_view version() const { return version_; }
    std::string_view declared_encoding() const { return declared_encoding_; }

    // Line of the scan position (1-based).
    int line() const;

    // First error of the document; later reports are counted but ignored.
    const c_error& error() const { return error_; }
    elmx_error error_code() const { return error_.code; }
    int error_count() const { return error_count_; }
    elmx_error raise(elmx_error code, std::string detail);
    // Like raise(), with the item name and program place of the caller.
    elmx_error raise(elmx_error code, std::string detail, std::string item_name,
                     std::string program_file, int program_line);

    // Interned names shared with the layers above.
    c_repository& repository() { return repository_; }

private:
    struct element_names {
        std::string_view qname, prefix, local_name, namespace_uri;
    };
    struct open_element {
        element_names names;
        std::size_t binding_mark;  // bindings_ size before this element's declarations
    };
    struct namespace_binding {
        std::string_view prefix, namespace_uri;
    };
    struct raw_attribute {
        std::string_view qname;
        const char* value_data;  // null: the value is in attribute_scratch_
        std::size_t value_offset, value_size;
    };

    void prepare(const char* data, std::size_t size);
    bool read_xml_declaration();
    bool apply_declared_encoding(const char* body, std::size_t body_size, c_byte_format detected);
    void use_decoded_text(std::size_t position);
    bool fail(elmx_error code, std::string detail);

    // Markup.
    bool read_start_tag();
    bool read_end_tag();
    void finish_end_element();
    bool read_attribute_value(raw_attribute& attribute);
    bool resolve_namespaces();
    bool check_duplicate_attributes();
    bool read_text();
    bool skip_comment();
    bool skip_processing_instruction();
    bool read_cdata(std::string& out);
    bool read_doctype();
    bool read_internal_subset();
    bool read_entity_declaration();
    bool read_entity_literal(std::string& value);
    bool skip_markup_declaration();

    // References: p stands on '&'; the replacement is appended to out.
    bool append_reference(const char*& p, const char* end, std::string& out, bool in_attribute);
    bool append_entity(std::string_view name, std::string& out, bool in_attribute);
    bool check_expansion(std::string_view name, const std::string& out);
    bool parse_character_reference(const char*& p, const char* end, std::uint32_t& code_point);

    std::string_view scan_name();
    bool split_qname(std::string_view qname, std::string_view& prefix, std::string_view& local);
    void skip_space();
    bool at(std::string_view literal) const;
    bool unexpected_end();

    c_xml_limits limits_;
    const char* document_begin_ = nullptr;
    const char* p_ = nullptr;
    const char* end_ = nullptr;
    std::string decoded_;  // the document as UTF-8 when it had to be converted

    xml_event event_ = xml_event::none;
    bool root_seen_ = false;
    bool root_closed_ = false;
    bool doctype_seen_ = false;
    bool pending_end_ = false;
    bool empty_element_ = false;
    bool xml11_ = false;
    std::string version_;
    std::string declared_encoding_;

    element_names element_;
    std::vector<open_element> open_elements_;
    std::vector<namespace_binding> bindings_;
    std::vector<c_namespace_declaration> declarations_;
    std::vector<raw_attribute> raw_attributes_;
    std::vector<c_xml_attribute> attributes_;
    std::string attribute_scratch_;
    std::string text_scratch_;
    std::string_view text_;

    std::unordered_map<std::string, std::string> entities_;
    std::vector<std::string_view> entity_stack_;
    std::size_t expanded_bytes_ = 0;      // entity output of the finished references
    std::size_t expansion_start_ = 0;     // size of the output when the outermost one began
    std::size_t entity_references_ = 0;

    c_repository repository_;
    c_error error_;
    int error_count_ = 0;

    // Lines are counted lazily from the last place asked about.
    mutable const char* counted_up_to_ = nullptr;
    mutable int counted_lines_ = 1;
};

}  // namespace lmx
