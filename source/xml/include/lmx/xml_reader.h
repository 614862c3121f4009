#pragma once
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "lmx/error.h"
#include "lmx/read_source.h"
#include "lmx/xml_scanner.h"
#include "lmx/xml_writer.h"

namespace lmx {

// One element or attribute name known to a group of generated classes; a
// table of these ends with an entry whose name is null.
struct c_token_entry {
    int namespace_number;
    const char* name;
    std::size_t name_length;
    int token;
};

enum : int {
    token_unrecognised = 1,
    token_xsi_type = 8,
    token_xsi_nil = 9,
    token_xsi_schema_location = 10,
    token_xsi_no_namespace_schema_location = 11,
};

// What generated element classes pull from: the current element with its
// attributes, its simple content, its children in turn, skipping of unknown
// subtrees, name tokens and the first error with its place.
class c_xml_reader {
public:
    virtual ~c_xml_reader() = default;
    c_xml_reader(const c_xml_reader&) = delete;
    c_xml_reader& operator=(const c_xml_reader&) = delete;

    // Moves to the document element.
    elmx_error read_root();
    // Moves to the next child start tag of the current element (found true),
    // or consumes the current element's end tag (found false). Character
    // data between children is passed over.
    elmx_error next_child(bool& found);
    // Reads the character data of the current element, whose start tag was
    // just read, up to and including its end tag. A child element is error
    // 29 "Unable to read element value".
    elmx_error get_simple_content(std::string& value);
    // Passes over the rest of the current element, children included.
    elmx_error skip_element();

    std::string_view local_name() const { return scanner_.local_name(); }
    std::string_view namespace_uri() const { return scanner_.namespace_uri(); }
    std::string_view qname() const { return scanner_.qname(); }
    const std::vector<c_xml_attribute>& attributes() const { return scanner_.attributes(); }
    // Attributes that the runtime handles itself (xsi:type, xsi:nil and the
    // schema locations) rather than the generated classes.
    static bool is_runtime_attribute(const c_xml_attribute& attribute);

    // Names as tokens: the first table given is kept.
    void set_namespace_table(const c_namespace_entry* table);
    // 0 when the namespace is not in the table.
    int namespace_number(std::string_view namespace_uri);
    int tokenise(const c_token_entry* table, std::string_view namespace_uri, std::string_view local_name);

    // Records an error (the first one only is kept) and returns its code.
    elmx_error capture_error(elmx_error code, std::string item_name, int program_line);
    void set_program_file(std::string program_file) { program_file_ = std::move(program_file); }
    const c_error& error() const { return scanner_.error(); }
    std::string error_report() const { return scanner_.error().report(); }
    int xml_line() const { return scanner_.line(); }

    c_xml& scanner() { return scanner_; }

protected:
    c_xml_reader(std::unique_ptr<c_read> source, const c_xml_limits& limits);

private:
    elmx_error scanner_failure();

    std::unique_ptr<c_read> source_;
    c_xml scanner_;
    std::string program_file_;
    const c_namespace_entry* namespace_table_ = nullptr;
    // Interned namespace views seen so far and their numbers.
    std::vector<std::pair<std::string_view, int>> namespace_numbers_;
};

class c_xml_reader_file : public c_xml_reader {
public:
    explicit c_xml_reader_file(const std::string& path, const c_xml_limits& limits = {});
};

// The buffer stays owned by the caller and must outlive the reader.
class c_xml_reader_memory : public c_xml_reader {
public:
    c_xml_reader_memory(const void* data, std::size_t size, const c_xml_limits& limits = {});
};

}  // namespace lmx
