#pragma once
// The cells of a worksheet: sheetData, its rows and their cells. Written by hand rather than
// generated because a sheet holds millions of them: a cell keeps its reference as numbers and
// its value as compact text, and everything a cell rarely has (formula, inline string,
// extensions, content outside the schema) behind one pointer. Rows and cells are written
// straight into the output; the elements a cell rarely has go through the writer.
#include <cstdint>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "lmx/lmx.h"
#include "ooxml/binding/compact_text.h"
#include "ooxml/binding/foreign_content.h"
#include "ooxml/binding/owned.h"
#include "ooxml/binding/value_bridge.h"

namespace quire::ooxml {

// The cell types of the t attribute, in the order of their numbers.
extern const char* const k_cell_type_names[7];
extern const char* const k_formula_type_names[4];
enum : int { cell_type_default = 1 };  // "n"

// The column of a reference such as "B7" (0-based); false when it is not a reference.
bool parse_cell_column(std::string_view reference, std::uint32_t& column);
// Writes "B7" for column 1, row 7; returns the length (at most 10).
std::size_t format_cell_reference(char* out, std::uint32_t column, std::uint32_t row_number);
void append_decimal(std::string& out, std::uint64_t value);
lmx::elmx_error sheet_data_failure(lmx::c_xml_reader& reader, lmx::elmx_error code, std::string_view item);
bool is_main_namespace(std::string_view uri, const char* main_namespace);

// Attributes written into raw markup, escaped.
struct raw_attribute_sink {
    std::string& out;
    void text(const char* name, std::string_view value);
    void number(const char* name, std::uint64_t value) {
        out += ' ';
        out += name;
        out += "=\"";
        append_decimal(out, value);
        out += '"';
    }
    void flag(const char* name, bool value) { text(name, write_bool(value)); }
    void real(const char* name, double value) { text(name, write_double(value)); }
    void foreign(const c_foreign* foreign) {
        if (foreign)
            for (const auto& attribute : foreign->attributes()) text(attribute.first.c_str(), attribute.second);
    }
};

// Attributes handed to the writer, for elements written through it.
struct writer_attribute_sink {
    lmx::c_xml_writer& writer;
    void text(const char* name, std::string_view value) { writer.attribute(name, value); }
    void number(const char* name, std::uint64_t value) { writer.attribute(name, std::string_view(lmx::write_integer(value))); }
    void flag(const char* name, bool value) { writer.attribute(name, write_bool(value)); }
    void real(const char* name, double value) { writer.attribute(name, std::string_view(write_double(value))); }
    void foreign(const c_foreign* foreign) {
        if (foreign) foreign->write_attributes(writer);
    }
};

// What a cell rarely carries.
template <class Types>
struct cell_extra {
    c_owned<typename Types::formula> f;
    c_owned<typename Types::rich_text> is;
    c_owned<typename Types::extension_list> extLst;
    c_owned<c_foreign> foreign;
    std::uint32_t cm = 0, vm = 0;
    bool has_cm = false, has_vm = false;
};

template <class Types>
class cell_t {
public:
    using formula_type = typename Types::formula;
    using rich_text_type = typename Types::rich_text;
    using extension_list_type = typename Types::extension_list;

    // A cell read on its own takes its column from r, or column 0.
    lmx::elmx_error unmarshal(lmx::c_xml_reader& reader, const std::string&) { return unmarshal_at(reader, 0, 0); }
    // A cell of a row: without r it stands at `column`.
    lmx::elmx_error unmarshal_at(lmx::c_xml_reader& reader, std::uint32_t row, std::uint32_t column);
    lmx::elmx_error marshal(lmx::c_xml_writer& writer, const char* name) const {
        return marshal_in_row(writer, name, col_);
    }
    // Written inside a row whose previous cell makes `expected` the column a cell without r has.
    lmx::elmx_error marshal_in_row(lmx::c_xml_writer& writer, const char* name, std::uint32_t expected) const;
    // Appends the markup of a cell that has nothing the writer must handle (see needs_writer).
    void append_markup(std::string& out, std::uint32_t expected) const;
    bool needs_writer() const { return static_cast<bool>(extra_) && !attributes_only(); }
    void reset() { *this = cell_t(); }
    const c_foreign* foreign() const { return extra_ ? extra_->foreign.get() : nullptr; }
    c_foreign& foreign_content() { return extra().foreign.create(); }

    // Reference: 0-based row and column. isset_r tells whether the file gave r (a cell read
    // without it is written without it while it stays where its position puts it).
    std::uint32_t row() const { return row_; }
    std::uint32_t col() const { return col_; }
    void set_ref(std::uint32_t row, std::uint32_t col) {
        row_ = row;
        col_ = static_cast<std::uint16_t>(col);
        flags_ |= has_r_flag;
    }
    void move_to_row(std::uint32_t row) { row_ = row; }
    bool isset_r() const { return flags_ & has_r_flag; }
    void unset_r() { flags_ &= static_cast<std::uint8_t>(~has_r_flag); }

    std::uint32_t get_s() const { return s_; }
    void set_s(std::uint32_t value) { s_ = value; flags_ |= has_s_flag; }
    bool isset_s() const { return flags_ & has_s_flag; }
    void unset_s() { s_ = 0; flags_ &= static_cast<std::uint8_t>(~has_s_flag); }

    int get_t() const { return t_; }
    void set_t(int value) { t_ = static_cast<std::uint8_t>(value); flags_ |= has_t_flag; }
    bool isset_t() const { return flags_ & has_t_flag; }
    void unset_t() { t_ = cell_type_default; flags_ &= static_cast<std::uint8_t>(~has_t_flag); }

    std::uint32_t get_cm() const { return extra_ ? extra_->cm : 0; }
    void set_cm(std::uint32_t value) { extra().cm = value; extra().has_cm = true; }
    bool isset_cm() const { return extra_ && extra_->has_cm; }
    std::uint32_t get_vm() const { return extra_ ? extra_->vm : 0; }
    void set_vm(std::uint32_t value) { extra().vm = value; extra().has_vm = true; }
    bool isset_vm() const { return extra_ && extra_->has_vm; }
    bool get_ph() const { return flags_ & ph_flag; }
    void set_ph(bool value) {
        flags_ = static_cast<std::uint8_t>(value ? flags_ | ph_flag : flags_ & ~ph_flag) | has_ph_flag;
    }
    bool isset_ph() const { return flags_ & has_ph_flag; }

    // The value's text as UTF-8.
    std::string_view get_v() const { return v_.view(); }
    void set_v(std::string_view value) {
        v_.assign(value);
        flags_ = static_cast<std::uint8_t>((flags_ | has_v_flag) & ~v_preserve_flag);
    }
    bool isset_v() const { return flags_ & has_v_flag; }
    void unset_v() {
        v_.clear();
        flags_ &= static_cast<std::uint8_t>(~(has_v_flag | v_preserve_flag));
    }

    formula_type& get_f() { return extra().f.create(); }
    formula_type* find_f() const { return extra_ ? extra_->f.get() : nullptr; }
    bool isset_f() const { return extra_ && extra_->f; }
    void unset_f() {
        if (extra_) extra_->f.reset();
    }
    rich_text_type& get_is() { return extra().is.create(); }
    rich_text_type* find_is() const { return extra_ ? extra_->is.get() : nullptr; }
    bool isset_is() const { return extra_ && extra_->is; }
    void unset_is() {
        if (extra_) extra_->is.reset();
    }
    extension_list_type& get_extLst() { return extra().extLst.create(); }
    extension_list_type* find_extLst() const { return extra_ ? extra_->extLst.get() : nullptr; }
    bool isset_extLst() const { return extra_ && extra_->extLst; }
    void unset_extLst() {
        if (extra_) extra_->extLst.reset();
    }

    // Used by the direct reader.
    void set_column(std::uint32_t col) { col_ = static_cast<std::uint16_t>(col); }
    void set_preserved_value(std::string_view value) {
        set_v(value);
        flags_ |= v_preserve_flag;
    }

private:
    enum : std::uint8_t {
        has_r_flag = 1, has_s_flag = 2, has_t_flag = 4, has_v_flag = 8, ph_flag = 16, has_ph_flag = 32,
        v_preserve_flag = 64,
    };
    cell_extra<Types>& extra() { return extra_.create(); }
    bool attributes_only() const {
        const c_foreign* kept = extra_->foreign.get();
        return !extra_->f && !extra_->is && !extra_->extLst &&
               (!kept || (kept->namespaces().empty() && kept->child_count() == 0));
    }
    template <class Sink>
    void put_attributes(Sink& sink, std::uint32_t expected) const;

    std::uint32_t row_ = 0;
    std::uint32_t s_ = 0;
    std::uint16_t col_ = 0;
    std::uint8_t t_ = cell_type_default;
    std::uint8_t flags_ = 0;
    compact_text v_;
    c_owned<cell_extra<Types>> extra_;
};

template <class Types>
struct row_extra {
    c_owned<typename Types::extension_list> extLst;
    c_owned<c_foreign> foreign;
};

template <class Types>
class row_t {
public:
    using cell_type = cell_t<Types>;
    using extension_list_type = typename Types::extension_list;

    lmx::elmx_error unmarshal(lmx::c_xml_reader& reader, const std::string&) { return unmarshal_at(reader, 1); }
    // Without r the row is number `number` (1-based).
    lmx::elmx_error unmarshal_at(lmx::c_xml_reader& reader, std::uint32_t number);
    lmx::elmx_error marshal(lmx::c_xml_writer& writer, const char* name) const {
        return marshal_in_sheet(writer, name, r_ - 1);
    }
    // `previous` is the number of the row before; a row without r that follows it is written without r.
    lmx::elmx_error marshal_in_sheet(lmx::c_xml_writer& writer, const char* name, std::uint32_t previous) const;
    void reset() { *this = row_t(); }
    const c_foreign* foreign() const { return extra_ ? extra_->foreign.get() : nullptr; }
    c_foreign& foreign_content() { return extra_.create().foreign.create(); }

    // 1-based row number; isset_r tells whether the file gave r.
    std::uint32_t get_r() const { return r_; }
    void set_r(std::uint32_t value) { r_ = value; flags_ |= has_r_flag; }
    bool isset_r() const { return flags_ & has_r_flag; }
    void unset_r() { flags_ &= ~has_r_flag; }
    void set_position(std::uint32_t value) { r_ = value; }

    std::string_view get_spans() const { return spans_.view(); }
    void set_spans(std::string_view value) { spans_.assign(value); flags_ |= has_spans_flag; }
    bool isset_spans() const { return flags_ & has_spans_flag; }
    void unset_spans() { spans_.clear(); flags_ &= ~has_spans_flag; }

    std::uint32_t get_s() const { return s_; }
    void set_s(std::uint32_t value) { s_ = value; flags_ |= has_s_flag; }
    bool isset_s() const { return flags_ & has_s_flag; }
    void unset_s() { s_ = 0; flags_ &= ~has_s_flag; }

    double get_ht() const { return ht_; }
    void set_ht(double value) { ht_ = value; flags_ |= has_ht_flag; }
    bool isset_ht() const { return flags_ & has_ht_flag; }
    void unset_ht() { ht_ = 0; flags_ &= ~has_ht_flag; }

    std::uint32_t get_outlineLevel() const { return outline_level_; }
    void set_outlineLevel(std::uint32_t value) { outline_level_ = static_cast<std::uint8_t>(value); flags_ |= has_outline_flag; }
    bool isset_outlineLevel() const { return flags_ & has_outline_flag; }
    void unset_outlineLevel() { outline_level_ = 0; flags_ &= ~has_outline_flag; }

#define QUIRE_ROW_FLAG(name, bit)                                                        \
    bool get_##name() const { return (booleans_ >> (2 * (bit))) & 1u; }                 \
    void set_##name(bool value) {                                                        \
        booleans_ = static_cast<std::uint16_t>((booleans_ & ~(3u << (2 * (bit)))) |      \
                                               ((value ? 3u : 2u) << (2 * (bit))));      \
    }                                                                                    \
    bool isset_##name() const { return (booleans_ >> (2 * (bit) + 1)) & 1u; }            \
    void unset_##name() { booleans_ = static_cast<std::uint16_t>(booleans_ & ~(3u << (2 * (bit)))); }
    QUIRE_ROW_FLAG(customFormat, 0)
    QUIRE_ROW_FLAG(hidden, 1)
    QUIRE_ROW_FLAG(customHeight, 2)
    QUIRE_ROW_FLAG(collapsed, 3)
    QUIRE_ROW_FLAG(thickTop, 4)
    QUIRE_ROW_FLAG(thickBot, 5)
    QUIRE_ROW_FLAG(ph, 6)
#undef QUIRE_ROW_FLAG

    std::size_t size_c() const { return cells_.size(); }
    cell_type& get_c(std::size_t index) { return cells_[index]; }
    const cell_type& get_c(std::size_t index) const { return cells_[index]; }
    cell_type& append_c() { return cells_.emplace_back(); }
    cell_type& insert_c(std::size_t index) { return *cells_.emplace(cells_.begin() + static_cast<std::ptrdiff_t>(index)); }
    void delete_c(std::size_t index) { cells_.erase(cells_.begin() + static_cast<std::ptrdiff_t>(index)); }
    void clear_c() { cells_.clear(); }
    std::vector<cell_type>& cells() { return cells_; }
    const std::vector<cell_type>& cells() const { return cells_; }

    extension_list_type& get_extLst() { return extra_.create().extLst.create(); }
    extension_list_type* find_extLst() const { return extra_ ? extra_->extLst.get() : nullptr; }
    bool isset_extLst() const { return extra_ && extra_->extLst; }
    void unset_extLst() {
        if (extra_) extra_->extLst.reset();
    }

private:
    enum : std::uint8_t { has_r_flag = 1, has_spans_flag = 2, has_s_flag = 4, has_ht_flag = 8, has_outline_flag = 16 };
    bool needs_writer() const;
    template <class Sink>
    void put_attributes(Sink& sink, std::uint32_t previous) const;

    std::vector<cell_type> cells_;
    compact_text spans_;
    double ht_ = 0;
    std::uint32_t r_ = 0;
    std::uint32_t s_ = 0;
    std::uint16_t booleans_ = 0;  // two bits per attribute: value, present
    std::uint8_t outline_level_ = 0;
    std::uint8_t flags_ = 0;
    c_owned<row_extra<Types>> extra_;
};

// Receives rows one at a time instead of keeping them; the row object is reused.
template <class Types>
class row_handler_t {
public:
    virtual ~row_handler_t() = default;
    virtual lmx::elmx_error row(row_t<Types>& row) = 0;
};

template <class Types>
class sheet_data_t {
public:
    using types = Types;
    using row_type = row_t<Types>;
    using handler_type = row_handler_t<Types>;

    lmx::elmx_error unmarshal(lmx::c_xml_reader& reader, const std::string& name) {
        return unmarshal(reader, name, -1, -1, nullptr);
    }
    // Rows outside first_row..last_row (0-based, -1: no bound) are passed over; with a handler
    // the rows go to it instead of into the sheet data.
    lmx::elmx_error unmarshal(lmx::c_xml_reader& reader, const std::string& name, int first_row, int last_row,
                              handler_type* handler = nullptr);
    lmx::elmx_error marshal(lmx::c_xml_writer& writer, const char* name) const;
    void reset() { *this = sheet_data_t(); }
    const c_foreign* foreign() const { return foreign_.get(); }

    std::size_t size_row() const { return rows_.size(); }
    row_type& get_row(std::size_t index) { return rows_[index]; }
    const row_type& get_row(std::size_t index) const { return rows_[index]; }
    row_type& append_row() { return rows_.emplace_back(); }
    row_type& insert_row(std::size_t index) { return *rows_.emplace(rows_.begin() + static_cast<std::ptrdiff_t>(index)); }
    void delete_row(std::size_t index) { rows_.erase(rows_.begin() + static_cast<std::ptrdiff_t>(index)); }
    void clear_row() { rows_.clear(); }
    std::vector<row_type>& rows() { return rows_; }
    const std::vector<row_type>& rows() const { return rows_; }

private:
    std::vector<row_type> rows_;
    c_owned<c_foreign> foreign_;
};

// ---- reading through the reader ----

namespace detail {

// The rank of a known child, or -1; children out of rank order are kept as foreign content.
inline int child_rank(std::string_view name, std::initializer_list<const char*> names) {
    int rank = 0;
    for (const char* known : names) {
        if (name == known) return rank;
        ++rank;
    }
    return -1;
}

template <class Object>
void keep_foreign_attribute(Object& object, const lmx::c_xml_attribute& attribute) {
    if (!lmx::c_xml_reader::is_runtime_attribute(attribute)) object.foreign_content().add_attribute(attribute);
}

}  // namespace detail

template <class Types>
lmx::elmx_error cell_t<Types>::unmarshal_at(lmx::c_xml_reader& reader, std::uint32_t row, std::uint32_t column) {
    lmx::c_xml& scanner = reader.scanner();
    row_ = row;
    col_ = static_cast<std::uint16_t>(column > 16383 ? 16383 : column);
    for (const auto& declaration : scanner.namespace_declarations())
        foreign_content().add_namespace(declaration.prefix, declaration.namespace_uri);
    for (const lmx::c_xml_attribute& attribute : scanner.attributes()) {
        if (!attribute.namespace_uri.empty()) {
            detail::keep_foreign_attribute(*this, attribute);
            continue;
        }
        const std::string_view name = attribute.local_name;
        lmx::elmx_error result = lmx::ELMX_OK;
        if (name == "r") {
            std::uint32_t parsed = 0;
            if (parse_cell_column(attribute.value, parsed)) {
                col_ = static_cast<std::uint16_t>(parsed);
                flags_ |= has_r_flag;
            }
        } else if (name == "s") {
            result = read_integer_as<std::uint32_t>(attribute.value, s_);
            flags_ |= has_s_flag;
        } else if (name == "t") {
            int type = cell_type_default;
            result = read_enum(attribute.value, k_cell_type_names, 7, type);
            set_t(type);
        } else if (name == "cm" || name == "vm") {
            std::uint32_t value = 0;
            result = read_integer_as<std::uint32_t>(attribute.value, value);
            if (name == "cm") set_cm(value); else set_vm(value);
        } else if (name == "ph") {
            bool value = false;
            result = read_value(attribute.value, value);
            set_ph(value);
        } else {
            detail::keep_foreign_attribute(*this, attribute);
        }
        if (result != lmx::ELMX_OK) return sheet_data_failure(reader, result, name);
    }
    std::size_t known = 0;
    int rank = -1;
    for (;;) {
        bool found = false;
        const lmx::elmx_error next = reader.next_child(found);
        if (next != lmx::ELMX_OK) return next;
        if (!found) break;
        const int slot = is_main_namespace(scanner.namespace_uri(), Types::main_namespace())
                             ? detail::child_rank(scanner.local_name(), {"f", "v", "is", "extLst"})
                             : -1;
        bool plain_value = slot == 1;
        if (slot == 1)
            for (const auto& attribute : scanner.attributes())
                if (attribute.namespace_uri != lmx::xml_namespace_uri || attribute.local_name != "space")
                    plain_value = false;
        if (slot < 0 || slot < rank || (slot == 1 && !plain_value)) {
            const lmx::elmx_error kept = foreign_content().capture_child(reader, known);
            if (kept != lmx::ELMX_OK) return kept;
            continue;
        }
        const bool repeated = slot == rank;
        rank = slot;
        lmx::elmx_error result = lmx::ELMX_OK;
        static const std::string names[] = {"f", "v", "is", "extLst"};
        if (repeated) return sheet_data_failure(reader, lmx::ELMX_OCCURRENCE_ERROR, names[slot]);
        switch (slot) {
        case 0: result = get_f().unmarshal(reader, names[0]); break;
        case 1: {
            bool preserve = false;
            for (const auto& attribute : scanner.attributes()) preserve = attribute.value == "preserve";
            std::string text;
            result = reader.get_simple_content(text);
            if (preserve) set_preserved_value(text); else set_v(text);
            break;
        }
        case 2: result = get_is().unmarshal(reader, names[2]); break;
        default: result = get_extLst().unmarshal(reader, names[3]); break;
        }
        if (result != lmx::ELMX_OK) return result;
        ++known;
    }
    return lmx::ELMX_OK;
}

template <class Types>
lmx::elmx_error row_t<Types>::unmarshal_at(lmx::c_xml_reader& reader, std::uint32_t number) {
    lmx::c_xml& scanner = reader.scanner();
    r_ = number;
    for (const auto& declaration : scanner.namespace_declarations())
        foreign_content().add_namespace(declaration.prefix, declaration.namespace_uri);
    for (const lmx::c_xml_attribute& attribute : scanner.attributes()) {
        if (!attribute.namespace_uri.empty()) {
            detail::keep_foreign_attribute(*this, attribute);
            continue;
        }
        const std::string_view name = attribute.local_name;
        const std::string_view text = attribute.value;
        lmx::elmx_error result = lmx::ELMX_OK;
        std::uint32_t number_value = 0;
        bool flag = false;
        if (name == "r") {
            result = read_integer_as<std::uint32_t>(text, number_value);
            set_r(number_value);
        } else if (name == "spans") {
            set_spans(text);
        } else if (name == "s") {
            result = read_integer_as<std::uint32_t>(text, number_value);
            set_s(number_value);
        } else if (name == "ht") {
            double height = 0;
            result = read_value(text, height);
            set_ht(height);
        } else if (name == "outlineLevel") {
            result = read_integer_as<std::uint8_t>(text, number_value);
            set_outlineLevel(number_value);
        } else if (name == "customFormat") {
            result = read_value(text, flag);
            set_customFormat(flag);
        } else if (name == "hidden") {
            result = read_value(text, flag);
            set_hidden(flag);
        } else if (name == "customHeight") {
            result = read_value(text, flag);
            set_customHeight(flag);
        } else if (name == "collapsed") {
            result = read_value(text, flag);
            set_collapsed(flag);
        } else if (name == "thickTop") {
            result = read_value(text, flag);
            set_thickTop(flag);
        } else if (name == "thickBot") {
            result = read_value(text, flag);
            set_thickBot(flag);
        } else if (name == "ph") {
            result = read_value(text, flag);
            set_ph(flag);
        } else {
            detail::keep_foreign_attribute(*this, attribute);
        }
        if (result != lmx::ELMX_OK) return sheet_data_failure(reader, result, name);
    }
    std::size_t known = 0;
    int rank = -1;
    std::uint32_t next_column = 0;
    for (;;) {
        bool found = false;
        const lmx::elmx_error next = reader.next_child(found);
        if (next != lmx::ELMX_OK) return next;
        if (!found) break;
        const int slot = is_main_namespace(scanner.namespace_uri(), Types::main_namespace())
                             ? detail::child_rank(scanner.local_name(), {"c", "extLst"})
                             : -1;
        if (slot < 0 || slot < rank || (slot == 1 && rank == 1)) {
            const lmx::elmx_error kept = foreign_content().capture_child(reader, known);
            if (kept != lmx::ELMX_OK) return kept;
            continue;
        }
        rank = slot;
        lmx::elmx_error result = lmx::ELMX_OK;
        if (slot == 0) {
            cell_type& cell = cells_.emplace_back();
            result = cell.unmarshal_at(reader, r_ - 1, next_column);
            next_column = cell.col() + 1u;
        } else {
            static const std::string name = "extLst";
            result = get_extLst().unmarshal(reader, name);
        }
        if (result != lmx::ELMX_OK) return result;
        ++known;
    }
    return lmx::ELMX_OK;
}

template <class Types>
lmx::elmx_error sheet_data_t<Types>::unmarshal(lmx::c_xml_reader& reader, const std::string&, int first_row,
                                               int last_row, handler_type* handler) {
    lmx::c_xml& scanner = reader.scanner();
    for (const auto& declaration : scanner.namespace_declarations())
        foreign_.create().add_namespace(declaration.prefix, declaration.namespace_uri);
    for (const lmx::c_xml_attribute& attribute : scanner.attributes())
        if (!lmx::c_xml_reader::is_runtime_attribute(attribute)) foreign_.create().add_attribute(attribute);
    std::size_t known = 0;
    std::uint32_t row_number = 0;
    row_type worker;
    for (;;) {
        bool found = false;
        const lmx::elmx_error next = reader.next_child(found);
        if (next != lmx::ELMX_OK) return next;
        if (!found) break;
        if (!is_main_namespace(scanner.namespace_uri(), Types::main_namespace()) || scanner.local_name() != "row") {
            const lmx::elmx_error kept = foreign_.create().capture_child(reader, known);
            if (kept != lmx::ELMX_OK) return kept;
            continue;
        }
        std::uint32_t number = row_number + 1;
        if (const lmx::c_xml_attribute* r = scanner.find_attribute("r"))
            if (read_integer_as<std::uint32_t>(r->value, number) != lmx::ELMX_OK) number = row_number + 1;
        row_number = number;
        if ((first_row >= 0 && std::int64_t{number} - 1 < first_row) ||
            (last_row >= 0 && std::int64_t{number} - 1 > last_row)) {
            const lmx::elmx_error skipped = reader.skip_element();
            if (skipped != lmx::ELMX_OK) return skipped;
            continue;
        }
        row_type& row = handler ? worker : rows_.emplace_back();
        if (handler) row.reset();
        lmx::elmx_error result = row.unmarshal_at(reader, number);
        if (result == lmx::ELMX_OK && handler) result = handler->row(row);
        if (result != lmx::ELMX_OK) return result;
        if (!handler) ++known;
    }
    return lmx::ELMX_OK;
}

// ---- writing ----

template <class Types>
template <class Sink>
void cell_t<Types>::put_attributes(Sink& sink, std::uint32_t expected) const {
    if ((flags_ & has_r_flag) || col_ != expected) {
        char reference[16];
        sink.text("r", std::string_view(reference, format_cell_reference(reference, col_, row_ + 1)));
    }
    if (flags_ & has_s_flag) sink.number("s", s_);
    if (flags_ & has_t_flag) sink.text("t", t_ < 7 ? k_cell_type_names[t_] : "");
    if (extra_ && extra_->has_cm) sink.number("cm", extra_->cm);
    if (extra_ && extra_->has_vm) sink.number("vm", extra_->vm);
    if (flags_ & has_ph_flag) sink.flag("ph", get_ph());
    sink.foreign(foreign());
}

template <class Types>
void cell_t<Types>::append_markup(std::string& out, std::uint32_t expected) const {
    out += "<c";
    raw_attribute_sink sink{out};
    put_attributes(sink, expected);
    if (!(flags_ & has_v_flag)) {
        out += "/>";
        return;
    }
    out += (flags_ & v_preserve_flag) ? "><v xml:space=\"preserve\">" : "><v>";
    lmx::append_escaped(out, v_.view(), lmx::c_escape_context::content);
    out += "</v></c>";
}

template <class Types>
lmx::elmx_error cell_t<Types>::marshal_in_row(lmx::c_xml_writer& writer, const char* name, std::uint32_t expected) const {
    const std::size_t declared = writer.declared_namespaces().size();
    const bool root = writer.depth() == 0;
    writer.start_element(name);
    if (root) Types::declare(writer);
    const c_foreign* kept = foreign();
    if (kept) kept->write_namespaces(writer, declared);
    writer_attribute_sink sink{writer};
    put_attributes(sink, expected);
    c_foreign_cursor cursor(kept, writer);
    lmx::elmx_error result = lmx::ELMX_OK;
    if (const formula_type* f = find_f()) {
        cursor.next_known();
        result = f->marshal(writer, "f");
        if (result != lmx::ELMX_OK) return result;
    }
    if (flags_ & has_v_flag) {
        cursor.next_known();
        writer.start_element("v");
        if (flags_ & v_preserve_flag) writer.attribute("xml:space", std::string_view("preserve"));
        writer.text(v_.view());
        writer.end_element();
    }
    if (const rich_text_type* is = find_is()) {
        cursor.next_known();
        result = is->marshal(writer, "is");
        if (result != lmx::ELMX_OK) return result;
    }
    if (const extension_list_type* extensions = find_extLst()) {
        cursor.next_known();
        result = extensions->marshal(writer, "extLst");
        if (result != lmx::ELMX_OK) return result;
    }
    cursor.finish();
    writer.end_element();
    return lmx::ELMX_OK;
}

template <class Types>
template <class Sink>
void row_t<Types>::put_attributes(Sink& sink, std::uint32_t previous) const {
    if ((flags_ & has_r_flag) || r_ != previous + 1) sink.number("r", r_);
    if (flags_ & has_spans_flag) sink.text("spans", spans_.view());
    if (flags_ & has_s_flag) sink.number("s", s_);
    if (isset_customFormat()) sink.flag("customFormat", get_customFormat());
    if (flags_ & has_ht_flag) sink.real("ht", ht_);
    if (isset_hidden()) sink.flag("hidden", get_hidden());
    if (isset_customHeight()) sink.flag("customHeight", get_customHeight());
    if (flags_ & has_outline_flag) sink.number("outlineLevel", outline_level_);
    if (isset_collapsed()) sink.flag("collapsed", get_collapsed());
    if (isset_thickTop()) sink.flag("thickTop", get_thickTop());
    if (isset_thickBot()) sink.flag("thickBot", get_thickBot());
    if (isset_ph()) sink.flag("ph", get_ph());
    sink.foreign(foreign());
}

template <class Types>
bool row_t<Types>::needs_writer() const {
    if (!extra_) return false;
    const c_foreign* kept = extra_->foreign.get();
    return extra_->extLst || (kept && (!kept->namespaces().empty() || kept->child_count() != 0));
}

template <class Types>
lmx::elmx_error row_t<Types>::marshal_in_sheet(lmx::c_xml_writer& writer, const char* name,
                                               std::uint32_t previous) const {
    const bool root = writer.depth() == 0;
    if (!root && !needs_writer()) {
        std::string* out = &writer.markup_buffer();
        *out += '<';
        *out += name;
        raw_attribute_sink sink{*out};
        put_attributes(sink, previous);
        if (cells_.empty()) {
            *out += "/>";
        } else {
            *out += '>';
            std::uint32_t expected = 0;
            for (const cell_type& cell : cells_) {
                if (cell.needs_writer()) {
                    const lmx::elmx_error result = cell.marshal_in_row(writer, "c", expected);
                    if (result != lmx::ELMX_OK) return result;
                    out = &writer.markup_buffer();
                } else {
                    cell.append_markup(*out, expected);
                }
                expected = cell.col() + 1u;
            }
            *out += "</";
            *out += name;
            *out += '>';
        }
        writer.markup_done();
        return lmx::ELMX_OK;
    }
    const std::size_t declared = writer.declared_namespaces().size();
    writer.start_element(name);
    if (root) Types::declare(writer);
    const c_foreign* kept = foreign();
    if (kept) kept->write_namespaces(writer, declared);
    writer_attribute_sink sink{writer};
    put_attributes(sink, previous);
    c_foreign_cursor cursor(kept, writer);
    std::uint32_t expected = 0;
    for (const cell_type& cell : cells_) {
        cursor.next_known();
        const lmx::elmx_error result = cell.marshal_in_row(writer, "c", expected);
        if (result != lmx::ELMX_OK) return result;
        expected = cell.col() + 1u;
    }
    if (const extension_list_type* extensions = find_extLst()) {
        cursor.next_known();
        const lmx::elmx_error result = extensions->marshal(writer, "extLst");
        if (result != lmx::ELMX_OK) return result;
    }
    cursor.finish();
    writer.end_element();
    return lmx::ELMX_OK;
}

template <class Types>
lmx::elmx_error sheet_data_t<Types>::marshal(lmx::c_xml_writer& writer, const char* name) const {
    const std::size_t declared = writer.declared_namespaces().size();
    const bool root = writer.depth() == 0;
    writer.start_element(name);
    if (root) Types::declare(writer);
    if (foreign_) {
        foreign_->write_namespaces(writer, declared);
        foreign_->write_attributes(writer);
    }
    c_foreign_cursor cursor(foreign_.get(), writer);
    std::uint32_t previous = 0;
    for (const row_type& row : rows_) {
        cursor.next_known();
        const lmx::elmx_error result = row.marshal_in_sheet(writer, "row", previous);
        if (result != lmx::ELMX_OK) return result;
        previous = row.get_r();
    }
    cursor.finish();
    writer.end_element();
    return lmx::ELMX_OK;
}

}  // namespace quire::ooxml
