#include "lmx/xml_reader.h"

#include <cstring>

namespace lmx {

c_xml_reader::c_xml_reader(std::unique_ptr<c_read> source, const c_xml_limits& limits)
    : source_(std::move(source)), scanner_(*source_, limits)
{
}

c_xml_reader_file::c_xml_reader_file(const std::string& path, const c_xml_limits& limits)
    : c_xml_reader(std::make_unique<c_read_file>(path), limits)
{
}

c_xml_reader_memory::c_xml_reader_memory(const void* data, std::size_t size, const c_xml_limits& limits)
    : c_xml_reader(std::make_unique<c_read_memory>(data, size), limits)
{
}

elmx_error c_xml_reader::scanner_failure()
{
    if (scanner_.event() == xml_event::error)
        return scanner_.error_code();
    // The document ended while an element was still expected.
    return capture_error(ELMX_UNEXPECTED_EOM, std::string(scanner_.qname()), 0);
}

elmx_error c_xml_reader::read_root()
{
    if (scanner_.event() != xml_event::none)
        return scanner_.event() == xml_event::error ? scanner_.error_code() : ELMX_OK;
    for (;;) {
        const xml_event event = scanner_.next();
        if (event == xml_event::start_element)
            return ELMX_OK;
        if (event != xml_event::text)
            return scanner_failure();
    }
}

elmx_error c_xml_reader::next_child(bool& found)
{
    found = false;
    for (;;) {
        switch (scanner_.next()) {
        case xml_event::start_element:
            found = true;
            return ELMX_OK;
        case xml_event::end_element:
            return ELMX_OK;
        case xml_event::text:
            continue;
        default:
            return scanner_failure();
        }
    }
}

elmx_error c_xml_reader::get_simple_content(std::string& value)
{
    value.clear();
    const std::string element(scanner_.qname());
    for (;;) {
        switch (scanner_.next()) {
        case xml_event::text:
            value += scanner_.text();
            continue;
        case xml_event::end_element:
            return ELMX_OK;
        case xml_event::start_element:
            return capture_error(ELMX_UNABLE_TO_READ_ELEMENT_VALUE, element, 0);
        default:
            return scanner_failure();
        }
    }
}

elmx_error c_xml_reader::skip_element()
{
    std::size_t open = 1;
    while (open > 0) {
        switch (scanner_.next()) {
        case xml_event::start_element:
            ++open;
            break;
        case xml_event::end_element:
            --open;
            break;
        case xml_event::text:
            break;
        default:
            return scanner_failure();
        }
    }
    return ELMX_OK;
}

bool c_xml_reader::is_runtime_attribute(const c_xml_attribute& attribute)
{
    if (attribute.namespace_uri != xsi_namespace_uri)
        return false;
    const std::string_view name = attribute.local_name;
    return name == "type" || name == "nil" || name == "schemaLocation" || name == "noNamespaceSchemaLocation";
}

void c_xml_reader::set_namespace_table(const c_namespace_entry* table)
{
    if (!namespace_table_)
        namespace_table_ = table;
}

int c_xml_reader::namespace_number(std::string_view namespace_uri)
{
    // Views from the scanner are interned, so the address test nearly always decides.
    for (const auto& known : namespace_numbers_)
        if (known.first.data() == namespace_uri.data() || known.first == namespace_uri)
            return known.second;
    int number = 0;
    for (const c_namespace_entry* entry = namespace_table_; entry && entry->number != 0; ++entry)
        if (entry->namespace_uri && namespace_uri == entry->namespace_uri) {
            number = entry->number;
            break;
        }
    constexpr std::size_t remembered = 64;
    if (namespace_numbers_.size() < remembered)
        namespace_numbers_.emplace_back(scanner_.repository().intern(namespace_uri), number);
    return number;
}

int c_xml_reader::tokenise(const c_token_entry* table, std::string_view namespace_uri, std::string_view local_name)
{
    if (namespace_uri == xsi_namespace_uri) {
        if (local_name == "type")
            return token_xsi_type;
        if (local_name == "nil")
            return token_xsi_nil;
        if (local_name == "schemaLocation")
            return token_xsi_schema_location;
        if (local_name == "noNamespaceSchemaLocation")
            return token_xsi_no_namespace_schema_location;
        return token_unrecognised;
    }
    if (local_name.empty() || !table)
        return token_unrecognised;
    const int number = namespace_uri.empty() ? 0 : namespace_number(namespace_uri);
    for (const c_token_entry* entry = table; entry->name; ++entry)
        if (entry->namespace_number == number && entry->name[0] == local_name[0] &&
            entry->name_length == local_name.size() &&
            std::memcmp(entry->name, local_name.data(), local_name.size()) == 0)
            return entry->token;
    return token_unrecognised;
}

elmx_error c_xml_reader::capture_error(elmx_error code, std::string item_name, int program_line)
{
    return scanner_.raise(code, {}, std::move(item_name), program_file_, program_line);
}

}  // namespace lmx
