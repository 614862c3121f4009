#pragma once
#include <cstddef>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "lmx/xml_reader.h"
#include "lmx/xml_writer.h"

namespace quire::ooxml {

// What an element carries beyond its schema type: namespace declarations, attributes of
// other namespaces or newer versions, and whole child elements the type does not know
// (extension content, markup compatibility, later additions). Kept so that a document
// is written back with nothing lost and everything in its place.
class c_foreign {
public:
    void add_namespace(std::string_view prefix, std::string_view uri);
    void add_attribute(const lmx::c_xml_attribute& attribute);
    // Records the element the reader stands on, through its end tag, to be written before
    // the known child number `position` (counted from 0) of its parent.
    lmx::elmx_error capture_child(lmx::c_xml_reader& reader, std::size_t position);

    bool empty() const { return namespaces_.empty() && attributes_.empty() && children_.empty(); }
    const std::vector<std::pair<std::string, std::string>>& namespaces() const { return namespaces_; }
    const std::vector<std::pair<std::string, std::string>>& attributes() const { return attributes_; }
    std::size_t child_count() const { return children_.size(); }

    // Declarations whose prefix the writer has not yet declared on this start tag.
    void write_namespaces(lmx::c_xml_writer& writer, std::size_t declared_before) const;
    void write_attributes(lmx::c_xml_writer& writer) const;
    // Writes the kept children that belong before known child `position`; `next` is the
    // index of the first kept child not yet written.
    void write_children_before(lmx::c_xml_writer& writer, std::size_t position, std::size_t& next) const;
    void write_remaining_children(lmx::c_xml_writer& writer, std::size_t& next) const;

private:
    struct fragment {
        std::size_t position;
        std::string events;  // start, namespace, attribute, text and end records, see .cpp
    };
    static void replay(lmx::c_xml_writer& writer, const std::string& events);

    std::vector<std::pair<std::string, std::string>> namespaces_;  // prefix, URI
    std::vector<std::pair<std::string, std::string>> attributes_;  // qualified name, value
    std::vector<fragment> children_;
};

// Walks the kept children of one element while its known children are written.
class c_foreign_cursor {
public:
    c_foreign_cursor(const c_foreign* foreign, lmx::c_xml_writer& writer) : foreign_(foreign), writer_(writer) {}
    // Called before each known child is written.
    void next_known() {
        if (foreign_) foreign_->write_children_before(writer_, known_, next_);
        ++known_;
    }
    void finish() {
        if (foreign_) foreign_->write_remaining_children(writer_, next_);
    }

private:
    const c_foreign* foreign_;
    lmx::c_xml_writer& writer_;
    std::size_t known_ = 0;
    std::size_t next_ = 0;
};

}  // namespace quire::ooxml
