#pragma once
// Helpers shared by the scanner tests.
#include <string>
#include <string_view>

#include "lmx/xml_scanner.h"

namespace xml_test {

// Events in a compact form: "S{ns}local", "A{ns}local=value", "T text", "E",
// separated by '|', ending in "X<code>" on an error.
inline std::string events_of(std::string_view document, const lmx::c_xml_limits& limits = {})
{
    lmx::c_xml scanner(document.data(), document.size(), limits);
    std::string out;
    for (;;) {
        const lmx::xml_event event = scanner.next();
        if (event == lmx::xml_event::end_document)
            return out;
        if (!out.empty())
            out += '|';
        switch (event) {
        case lmx::xml_event::start_element:
            out += "S{" + std::string(scanner.namespace_uri()) + "}" + std::string(scanner.local_name());
            for (const lmx::c_xml_attribute& attribute : scanner.attributes())
                out += "|A{" + std::string(attribute.namespace_uri) + "}" + std::string(attribute.local_name) + "=" +
                       std::string(attribute.value);
            break;
        case lmx::xml_event::end_element:
            out += "E";
            break;
        case lmx::xml_event::text:
            out += "T " + std::string(scanner.text());
            break;
        default:
            out += "X" + std::to_string(scanner.error_code());
            return out;
        }
    }
}

// Scans the whole document and returns its error record (code 0 when none).
inline lmx::c_error error_of(std::string_view document, const lmx::c_xml_limits& limits = {})
{
    lmx::c_xml scanner(document.data(), document.size(), limits);
    lmx::xml_event event;
    do
        event = scanner.next();
    while (event != lmx::xml_event::end_document && event != lmx::xml_event::error);
    return scanner.error();
}

}  // namespace xml_test
