#include "ooxml/binding/foreign_content.h"

namespace quire::ooxml {

// Fragment records, each a kind letter followed by NUL-terminated fields (XML text can
// never hold NUL): 'S' qname; 'N' prefix, URI; 'A' qname, value; 'T' text; 'E'.
namespace {

void put(std::string& events, char kind) { events += kind; }
void put(std::string& events, std::string_view field) {
    events.append(field.data(), field.size());
    events += '\0';
}

}  // namespace

void c_foreign::add_namespace(std::string_view prefix, std::string_view uri) {
    namespaces_.emplace_back(std::string(prefix), std::string(uri));
}

void c_foreign::add_attribute(const lmx::c_xml_attribute& attribute) {
    attributes_.emplace_back(std::string(attribute.qname), std::string(attribute.value));
}

lmx::elmx_error c_foreign::capture_child(lmx::c_xml_reader& reader, std::size_t position) {
    lmx::c_xml& scanner = reader.scanner();
    std::string events;
    std::size_t open = 0;
    auto start = [&] {
        put(events, 'S');
        put(events, scanner.qname());
        for (const auto& declaration : scanner.namespace_declarations()) {
            put(events, 'N');
            put(events, declaration.prefix);
            put(events, declaration.namespace_uri);
        }
        for (const auto& attribute : scanner.attributes()) {
            put(events, 'A');
            put(events, attribute.qname);
            put(events, attribute.value);
        }
        ++open;
    };
    start();
    while (open > 0) {
        switch (scanner.next()) {
        case lmx::xml_event::start_element:
            start();
            break;
        case lmx::xml_event::end_element:
            put(events, 'E');
            --open;
            break;
        case lmx::xml_event::text:
            put(events, 'T');
            put(events, scanner.text());
            break;
        case lmx::xml_event::error:
            return scanner.error_code();
        default:
            return reader.capture_error(lmx::ELMX_UNEXPECTED_EOM, std::string(scanner.qname()), __LINE__);
        }
    }
    children_.push_back({position, std::move(events)});
    return lmx::ELMX_OK;
}

void c_foreign::write_namespaces(lmx::c_xml_writer& writer, std::size_t declared_before) const {
    const auto& declared = writer.declared_namespaces();
    for (const auto& ns : namespaces_) {
        bool already = false;
        for (std::size_t i = declared_before; i < declared.size(); ++i)
            if (declared[i].first == ns.first) already = true;
        if (!already) writer.declare_namespace(ns.first, ns.second);
    }
}

void c_foreign::write_attributes(lmx::c_xml_writer& writer) const {
    for (const auto& attribute : attributes_) writer.attribute(attribute.first, std::string_view(attribute.second));
}

void c_foreign::write_children_before(lmx::c_xml_writer& writer, std::size_t position, std::size_t& next) const {
    while (next < children_.size() && children_[next].position <= position) replay(writer, children_[next++].events);
}

void c_foreign::write_remaining_children(lmx::c_xml_writer& writer, std::size_t& next) const {
    while (next < children_.size()) replay(writer, children_[next++].events);
}

void c_foreign::replay(lmx::c_xml_writer& writer, const std::string& events) {
    std::size_t at = 0;
    auto field = [&]() -> std::string_view {
        const std::size_t end = events.find('\0', at);
        std::string_view value(events.data() + at, end - at);
        at = end + 1;
        return value;
    };
    while (at < events.size()) {
        const char kind = events[at++];
        switch (kind) {
        case 'S':
            writer.start_element(field());
            break;
        case 'N': {
            const std::string_view prefix = field();
            writer.declare_namespace(prefix, field());
            break;
        }
        case 'A': {
            const std::string_view name = field();
            writer.attribute(name, field());
            break;
        }
        case 'T':
            writer.text(field());
            break;
        default:
            writer.end_element();
            break;
        }
    }
}

}  // namespace quire::ooxml
