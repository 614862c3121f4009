#pragma once
// Reads the rows and cells of a worksheet straight from the part's UTF-8 bytes, without the
// general XML reader: plain rows, cells, values and formulas only. Whatever else turns up
// (comments, CDATA, namespace declarations, unknown elements, entities of a DTD, bad bytes)
// makes the scan give up, and the caller reads the part the general way, which also gives the
// exact message for anything malformed.
#include <cstring>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "ooxml/binding/sheet_data.h"

namespace quire::ooxml {

// Where the content of sheetData lies in a part.
struct sheet_data_span {
    const char* content = nullptr;  // just after the start tag
    std::string_view prefix;        // "" or "x:" as the start tag spells it
};

// False when the part is not plain UTF-8 with a sheetData element holding content.
bool find_sheet_data(const char* data, std::size_t size, sheet_data_span& span);

// One start or end tag as written.
struct raw_tag {
    std::string_view name;
    bool closing = false;
    bool empty = false;
    std::vector<std::pair<std::string_view, std::string_view>> attributes;  // qualified name, raw value
};

// Reads the tag at p ('<'); null for anything but a plain start or end tag.
const char* read_raw_tag(const char* p, const char* end, raw_tag& tag);
// Text or an attribute value with its references replaced and line ends normalised; false
// when it holds anything the direct reader leaves to the general one.
bool decode_raw_text(std::string_view raw, std::string& out, bool attribute);
// True when the text has no references, line ends, control characters or non-ASCII bytes.
bool is_plain_text(std::string_view raw);
const char* skip_white_space(const char* p, const char* end);

template <class Types>
class sheet_data_scanner {
public:
    using row_type = row_t<Types>;
    using cell_type = cell_t<Types>;
    using formula_type = typename Types::formula;

    sheet_data_scanner(std::string_view prefix, int first_row, int last_row)
        : prefix_(prefix), first_row_(first_row), last_row_(last_row), row_(qualified("row")), cell_(qualified("c")),
          value_(qualified("v")), formula_(qualified("f")), sheet_data_(qualified("sheetData")) {}

    // Reads the content from p up to the end tag of sheetData; returns where that end tag
    // starts, or null when the general reader must do it.
    const char* scan(const char* p, const char* end, std::vector<row_type>& rows);

private:
    bool row_attributes(row_type& row);
    bool cell_attributes(cell_type& cell);
    bool formula_attributes(formula_type& formula);
    // Reads the text of a simple element whose start tag was just read, through its end tag.
    const char* element_text(const char* p, const char* end, const std::string& local, std::string& buffer,
                             std::string_view& text);
    bool keep_foreign(std::string_view qname, std::string_view raw, c_foreign& foreign);
    // The value of an attribute: the raw text itself when it needs no decoding.
    bool attribute_value(std::string_view raw, std::string_view& value) {
        if (is_plain_text(raw)) {
            value = raw;
            return true;
        }
        if (!decode_raw_text(raw, text_, true)) return false;
        value = text_;
        return true;
    }

    std::string qualified(const char* local) const { return std::string(prefix_) + local; }
    // Names are compared often: as the file spells them, prefix included, made once.
    static bool is(std::string_view name, const std::string& qualified_name) {
        return name.size() == qualified_name.size() && !name.empty() && name[0] == qualified_name[0] &&
               std::memcmp(name.data() + 1, qualified_name.data() + 1, name.size() - 1) == 0;
    }

    std::string_view prefix_;
    int first_row_, last_row_;
    const std::string row_, cell_, value_, formula_, sheet_data_;
    raw_tag tag_;
    std::string text_;
};

template <class Types>
bool sheet_data_scanner<Types>::keep_foreign(std::string_view qname, std::string_view raw, c_foreign& foreign) {
    if (qname.substr(0, 5) == "xmlns" || qname.find(':') == std::string_view::npos) return false;
    if (!decode_raw_text(raw, text_, true)) return false;
    lmx::c_xml_attribute attribute;
    attribute.qname = qname;
    attribute.value = text_;
    foreign.add_attribute(attribute);
    return true;
}

template <class Types>
bool sheet_data_scanner<Types>::row_attributes(row_type& row) {
    for (const auto& [name, raw] : tag_.attributes) {
        if (name.find(':') != std::string_view::npos) {
            if (!keep_foreign(name, raw, row.foreign_content())) return false;
            continue;
        }
        std::string_view text;
        if (!attribute_value(raw, text)) return false;
        std::uint32_t number = 0;
        bool flag = false;
        if (name == "r") {
            if (read_integer_as<std::uint32_t>(text, number) != lmx::ELMX_OK) return false;
            row.set_r(number);
        } else if (name == "spans") {
            row.set_spans(text);
        } else if (name == "s") {
            if (read_integer_as<std::uint32_t>(text, number) != lmx::ELMX_OK) return false;
            row.set_s(number);
        } else if (name == "ht") {
            double height = 0;
            if (read_value(text, height) != lmx::ELMX_OK) return false;
            row.set_ht(height);
        } else if (name == "outlineLevel") {
            if (read_integer_as<std::uint8_t>(text, number) != lmx::ELMX_OK) return false;
            row.set_outlineLevel(number);
        } else {
            if (read_value(text, flag) != lmx::ELMX_OK) return false;
            if (name == "customFormat") row.set_customFormat(flag);
            else if (name == "hidden") row.set_hidden(flag);
            else if (name == "customHeight") row.set_customHeight(flag);
            else if (name == "collapsed") row.set_collapsed(flag);
            else if (name == "thickTop") row.set_thickTop(flag);
            else if (name == "thickBot") row.set_thickBot(flag);
            else if (name == "ph") row.set_ph(flag);
            else return false;
        }
    }
    return true;
}

template <class Types>
bool sheet_data_scanner<Types>::cell_attributes(cell_type& cell) {
    for (const auto& [name, raw] : tag_.attributes) {
        if (name.find(':') != std::string_view::npos) {
            if (!keep_foreign(name, raw, cell.foreign_content())) return false;
            continue;
        }
        std::string_view text;
        if (!attribute_value(raw, text)) return false;
        std::uint32_t number = 0;
        if (name == "r") {
            if (!parse_cell_column(text, number)) return false;
            cell.set_ref(cell.row(), number);
        } else if (name == "s") {
            if (read_integer_as<std::uint32_t>(text, number) != lmx::ELMX_OK) return false;
            cell.set_s(number);
        } else if (name == "t") {
            int type = cell_type_default;
            if (read_enum(text, k_cell_type_names, 7, type) != lmx::ELMX_OK) return false;
            cell.set_t(type);
        } else if (name == "cm" || name == "vm") {
            if (read_integer_as<std::uint32_t>(text, number) != lmx::ELMX_OK) return false;
            if (name == "cm") cell.set_cm(number); else cell.set_vm(number);
        } else if (name == "ph") {
            bool flag = false;
            if (read_value(text, flag) != lmx::ELMX_OK) return false;
            cell.set_ph(flag);
        } else {
            return false;
        }
    }
    return true;
}

template <class Types>
bool sheet_data_scanner<Types>::formula_attributes(formula_type& formula) {
    for (const auto& [name, raw] : tag_.attributes) {
        if (!decode_raw_text(raw, text_, true)) return false;
        std::wstring wide;
        std::uint32_t number = 0;
        bool flag = false;
        if (name == "t") {
            int type = 0;
            if (read_enum(text_, k_formula_type_names, 4, type) != lmx::ELMX_OK) return false;
            formula.set_t(type);
        } else if (name == "ref" || name == "r1" || name == "r2") {
            if (read_value(text_, wide) != lmx::ELMX_OK) return false;
            if (name == "ref") formula.set_ref(wide);
            else if (name == "r1") formula.set_r1(wide);
            else formula.set_r2(wide);
        } else if (name == "si") {
            if (read_integer_as<std::uint32_t>(text_, number) != lmx::ELMX_OK) return false;
            formula.set_si(number);
        } else {
            if (read_value(text_, flag) != lmx::ELMX_OK) return false;
            if (name == "aca") formula.set_aca(flag);
            else if (name == "ca") formula.set_ca(flag);
            else if (name == "bx") formula.set_bx(flag);
            else if (name == "dt2D") formula.set_dt2D(flag);
            else if (name == "dtr") formula.set_dtr(flag);
            else if (name == "del1") formula.set_del1(flag);
            else if (name == "del2") formula.set_del2(flag);
            else return false;
        }
    }
    return true;
}

template <class Types>
const char* sheet_data_scanner<Types>::element_text(const char* p, const char* end, const std::string& local,
                                                    std::string& buffer, std::string_view& text) {
    const char* lt = static_cast<const char*>(std::memchr(p, '<', static_cast<std::size_t>(end - p)));
    if (!lt) return nullptr;
    const std::string_view raw(p, static_cast<std::size_t>(lt - p));
    if (is_plain_text(raw)) {
        text = raw;
    } else {
        if (!decode_raw_text(raw, buffer, false)) return nullptr;
        text = buffer;
    }
    const char* next = read_raw_tag(lt, end, tag_);
    if (!next || !tag_.closing || !is(tag_.name, local)) return nullptr;
    return next;
}

template <class Types>
const char* sheet_data_scanner<Types>::scan(const char* p, const char* end, std::vector<row_type>& rows) {
    std::uint32_t row_number = 0;
    std::string buffer;
    std::string_view value;
    for (;;) {
        p = skip_white_space(p, end);
        if (p >= end || *p != '<') return nullptr;
        const char* at = p;
        p = read_raw_tag(p, end, tag_);
        if (!p) return nullptr;
        if (tag_.closing) return is(tag_.name, sheet_data_) ? at : nullptr;
        if (!is(tag_.name, row_)) return nullptr;
        row_type row;
        if (!row_attributes(row)) return nullptr;
        if (!row.isset_r()) row.set_position(row_number + 1);
        row_number = row.get_r();
        const bool keep = !((first_row_ >= 0 && std::int64_t{row_number} - 1 < first_row_) ||
                            (last_row_ >= 0 && std::int64_t{row_number} - 1 > last_row_));
        if (!tag_.empty) {
            if (keep && !rows.empty()) row.cells().reserve(rows.back().size_c());
            std::uint32_t next_column = 0;
            for (;;) {
                p = skip_white_space(p, end);
                if (p >= end || *p != '<') return nullptr;
                p = read_raw_tag(p, end, tag_);
                if (!p) return nullptr;
                if (tag_.closing) {
                    if (!is(tag_.name, row_)) return nullptr;
                    break;
                }
                if (!is(tag_.name, cell_)) return nullptr;
                cell_type& cell = row.append_c();
                cell.move_to_row(row_number - 1);
                cell.set_column(next_column > 16383 ? 16383 : next_column);
                if (!cell_attributes(cell)) return nullptr;
                next_column = cell.col() + 1u;
                if (tag_.empty) continue;
                int rank = -1;
                for (;;) {
                    p = skip_white_space(p, end);
                    if (p >= end || *p != '<') return nullptr;
                    p = read_raw_tag(p, end, tag_);
                    if (!p) return nullptr;
                    if (tag_.closing) {
                        if (!is(tag_.name, cell_)) return nullptr;
                        break;
                    }
                    if (is(tag_.name, value_) && rank < 1) {
                        rank = 1;
                        bool preserve = false;
                        for (const auto& [name, raw] : tag_.attributes) {
                            if (name != "xml:space") return nullptr;
                            preserve = raw == "preserve";
                        }
                        value = std::string_view();
                        if (!tag_.empty) {
                            p = element_text(p, end, value_, buffer, value);
                            if (!p) return nullptr;
                        }
                        if (preserve) cell.set_preserved_value(value); else cell.set_v(value);
                    } else if (is(tag_.name, formula_) && rank < 0) {
                        rank = 0;
                        formula_type& formula = cell.get_f();
                        if (!formula_attributes(formula)) return nullptr;
                        if (!tag_.empty) {
                            p = element_text(p, end, formula_, buffer, value);
                            if (!p) return nullptr;
                            std::wstring wide;
                            if (read_value(value, wide) != lmx::ELMX_OK) return nullptr;
                            formula.set_value(wide);
                        }
                    } else {
                        return nullptr;
                    }
                }
            }
        }
        if (keep) rows.push_back(std::move(row));
    }
}

}  // namespace quire::ooxml
