#pragma once
// The shared string table (sst). Written by hand rather than generated: a book may hold a
// million entries, so an entry that is one plain text is kept as that text alone, and only
// entries with runs, phonetic text or content outside the schema keep their element object.
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "lmx/lmx.h"
#include "ooxml/binding/compact_text.h"
#include "ooxml/binding/foreign_content.h"
#include "ooxml/binding/owned.h"
#include "ooxml/binding/sheet_data.h"

namespace quire::ooxml {

// Whether a text's t element carries xml:space="preserve" when we write it.
bool text_needs_preserve(std::string_view utf8);
void append_plain_string_item(std::string& out, std::string_view utf8);

template <class Types>
class string_table_t {
public:
    using rich_text_type = typename Types::rich_text;
    using extension_list_type = typename Types::extension_list;

    lmx::elmx_error unmarshal(lmx::c_xml_reader& reader, const std::string& name);
    lmx::elmx_error marshal(lmx::c_xml_writer& writer, const char* name) const;
    void reset() { *this = string_table_t(); }
    const c_foreign* foreign() const { return foreign_.get(); }

    std::uint32_t get_count() const { return count_; }
    void set_count(std::uint32_t value) { count_ = value; has_count_ = true; }
    bool isset_count() const { return has_count_; }
    std::uint32_t get_uniqueCount() const { return unique_count_; }
    void set_uniqueCount(std::uint32_t value) { unique_count_ = value; has_unique_count_ = true; }
    bool isset_uniqueCount() const { return has_unique_count_; }

    std::size_t size_si() const { return entries_.size(); }
    // A plain entry's text (UTF-8); null for an entry kept as its element.
    const rich_text_type* rich_si(std::size_t index) const { return entries_[index].rich.get(); }
    std::string_view plain_si(std::size_t index) const { return entries_[index].plain.view(); }
    void append_plain_si(std::string_view utf8) { entries_.emplace_back().plain.assign(utf8); }
    rich_text_type& append_rich_si() { return entries_.emplace_back().rich.create(); }

    extension_list_type& get_extLst() { return extLst_.create(); }
    extension_list_type* find_extLst() const { return extLst_.get(); }

private:
    struct entry {
        compact_text plain;
        c_owned<rich_text_type> rich;
    };
    // Turns an entry read as an element into plain text when that loses nothing.
    static bool plain_text_of(const rich_text_type& item, std::string& text);

    std::vector<entry> entries_;
    std::uint32_t count_ = 0, unique_count_ = 0;
    bool has_count_ = false, has_unique_count_ = false;
    c_owned<extension_list_type> extLst_;
    c_owned<c_foreign> foreign_;
};

template <class Types>
bool string_table_t<Types>::plain_text_of(const rich_text_type& item, std::string& text) {
    const auto* t = item.find_t();
    if (!t || item.foreign() || t->foreign() || item.size_r() || item.size_rPh() || item.isset_phoneticPr()) return false;
    text = write_utf8(t->get_value());
    const bool preserve = t->isset_space() && t->get_space() == L"preserve";
    if (t->isset_space() && !preserve) return false;
    return preserve == text_needs_preserve(text);
}

template <class Types>
lmx::elmx_error string_table_t<Types>::unmarshal(lmx::c_xml_reader& reader, const std::string& name) {
    lmx::c_xml& scanner = reader.scanner();
    if (scanner.depth() == 1 &&
        (scanner.local_name() != "sst" || !is_main_namespace(scanner.namespace_uri(), Types::main_namespace())))
        return sheet_data_failure(reader, lmx::ELMX_ELEMENT_NOT_FOUND, name);
    for (const auto& declaration : scanner.namespace_declarations())
        foreign_.create().add_namespace(declaration.prefix, declaration.namespace_uri);
    for (const lmx::c_xml_attribute& attribute : scanner.attributes()) {
        const std::string_view local = attribute.local_name;
        lmx::elmx_error result = lmx::ELMX_OK;
        if (attribute.namespace_uri.empty() && local == "count") {
            result = read_integer_as<std::uint32_t>(attribute.value, count_);
            has_count_ = true;
        } else if (attribute.namespace_uri.empty() && local == "uniqueCount") {
            result = read_integer_as<std::uint32_t>(attribute.value, unique_count_);
            has_unique_count_ = true;
        } else if (!lmx::c_xml_reader::is_runtime_attribute(attribute)) {
            foreign_.create().add_attribute(attribute);
        }
        if (result != lmx::ELMX_OK) return sheet_data_failure(reader, result, local);
    }
    std::size_t known = 0;
    int rank = -1;
    std::string text;
    static const std::string si_name = "si", extension_name = "extLst";
    for (;;) {
        bool found = false;
        const lmx::elmx_error next = reader.next_child(found);
        if (next != lmx::ELMX_OK) return next;
        if (!found) break;
        const int slot = is_main_namespace(scanner.namespace_uri(), Types::main_namespace())
                             ? detail::child_rank(scanner.local_name(), {"si", "extLst"})
                             : -1;
        if (slot < 0 || slot < rank || (slot == 1 && rank == 1)) {
            const lmx::elmx_error kept = foreign_.create().capture_child(reader, known);
            if (kept != lmx::ELMX_OK) return kept;
            continue;
        }
        rank = slot;
        lmx::elmx_error result = lmx::ELMX_OK;
        if (slot == 0) {
            rich_text_type item;
            result = item.unmarshal(reader, si_name);
            if (result != lmx::ELMX_OK) return result;
            entry& added = entries_.emplace_back();
            if (plain_text_of(item, text)) added.plain.assign(text);
            else added.rich.create() = std::move(item);
        } else {
            result = extLst_.create().unmarshal(reader, extension_name);
        }
        if (result != lmx::ELMX_OK) return result;
        ++known;
    }
    return lmx::ELMX_OK;
}

template <class Types>
lmx::elmx_error string_table_t<Types>::marshal(lmx::c_xml_writer& writer, const char* name) const {
    const std::size_t declared = writer.declared_namespaces().size();
    const bool root = writer.depth() == 0;
    writer.start_element(name);
    if (root) Types::declare(writer);
    if (foreign_) foreign_->write_namespaces(writer, declared);
    writer_attribute_sink sink{writer};
    if (has_count_) sink.number("count", count_);
    if (has_unique_count_) sink.number("uniqueCount", unique_count_);
    sink.foreign(foreign_.get());
    c_foreign_cursor cursor(foreign_.get(), writer);
    for (const entry& item : entries_) {
        cursor.next_known();
        if (item.rich) {
            const lmx::elmx_error result = item.rich->marshal(writer, "si");
            if (result != lmx::ELMX_OK) return result;
        } else {
            append_plain_string_item(writer.markup_buffer(), item.plain.view());
            writer.markup_done();
        }
    }
    if (extLst_) {
        cursor.next_known();
        const lmx::elmx_error result = extLst_->marshal(writer, "extLst");
        if (result != lmx::ELMX_OK) return result;
    }
    cursor.finish();
    writer.end_element();
    return lmx::ELMX_OK;
}

}  // namespace quire::ooxml
