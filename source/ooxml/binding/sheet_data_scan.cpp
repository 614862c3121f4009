#include "ooxml/binding/sheet_data_scan.h"

#include <cstring>
#include <iterator>

#include <utf8.h>

#include "xml/character_encoding.h"

namespace quire::ooxml {

namespace {

bool white(char ch) { return ch == ' ' || ch == '\t' || ch == '\n' || ch == '\r'; }

struct name_table {
    bool allowed[256];
    name_table() {
        for (int i = 0; i < 256; ++i) {
            const char ch = static_cast<char>(i);
            allowed[i] = !white(ch) && ch != '/' && ch != '>' && ch != '<' && ch != '=' && ch != '"' &&
                         ch != '\'' && ch != '&';
        }
    }
};
const name_table k_name_chars;

bool name_char(char ch) { return k_name_chars.allowed[static_cast<unsigned char>(ch)]; }

bool xml_char(std::uint32_t code) {
    return code == 0x9 || code == 0xA || code == 0xD || (code >= 0x20 && code <= 0xD7FF) ||
           (code >= 0xE000 && code <= 0xFFFD) || (code >= 0x10000 && code <= 0x10FFFF);
}

bool reference(std::string_view name, std::string& out) {
    if (name == "lt") out += '<';
    else if (name == "gt") out += '>';
    else if (name == "amp") out += '&';
    else if (name == "quot") out += '"';
    else if (name == "apos") out += '\'';
    else if (name.size() > 1 && name[0] == '#') {
        std::uint32_t code = 0;
        const bool hex = name[1] == 'x';
        const std::size_t first = hex ? 2 : 1;
        if (first >= name.size() || name.size() - first > 8) return false;
        for (std::size_t i = first; i < name.size(); ++i) {
            const char ch = name[i];
            std::uint32_t digit;
            if (ch >= '0' && ch <= '9') digit = static_cast<std::uint32_t>(ch - '0');
            else if (hex && ch >= 'a' && ch <= 'f') digit = static_cast<std::uint32_t>(ch - 'a' + 10);
            else if (hex && ch >= 'A' && ch <= 'F') digit = static_cast<std::uint32_t>(ch - 'A' + 10);
            else return false;
            code = code * (hex ? 16 : 10) + digit;
        }
        if (!xml_char(code)) return false;
        utf8::unchecked::append(code, std::back_inserter(out));
    } else {
        return false;
    }
    return true;
}

}  // namespace

const char* skip_white_space(const char* p, const char* end) {
    while (p < end && white(*p)) ++p;
    return p;
}

const char* read_raw_tag(const char* p, const char* end, raw_tag& tag) {
    tag.attributes.clear();
    tag.closing = tag.empty = false;
    if (end - p < 3 || *p != '<') return nullptr;
    ++p;
    if (*p == '/') {
        tag.closing = true;
        ++p;
    }
    const char* name = p;
    while (p < end && name_char(*p)) ++p;
    if (p == name || p >= end) return nullptr;
    tag.name = std::string_view(name, static_cast<std::size_t>(p - name));
    if (tag.closing) {
        p = skip_white_space(p, end);
        return p < end && *p == '>' ? p + 1 : nullptr;
    }
    for (;;) {
        const char* before = p;
        p = skip_white_space(p, end);
        if (p >= end) return nullptr;
        if (*p == '>') return p + 1;
        if (*p == '/') {
            if (end - p < 2 || p[1] != '>') return nullptr;
            tag.empty = true;
            return p + 2;
        }
        if (p == before) return nullptr;  // attributes are separated by white space
        const char* attribute = p;
        while (p < end && name_char(*p)) ++p;
        if (p == attribute) return nullptr;
        const std::string_view attribute_name(attribute, static_cast<std::size_t>(p - attribute));
        p = skip_white_space(p, end);
        if (p >= end || *p != '=') return nullptr;
        p = skip_white_space(p + 1, end);
        if (p >= end || (*p != '"' && *p != '\'')) return nullptr;
        const char quote = *p++;
        const char* value = p;
        while (p < end && *p != quote && *p != '<') ++p;
        if (p >= end || *p != quote) return nullptr;
        tag.attributes.emplace_back(attribute_name, std::string_view(value, static_cast<std::size_t>(p - value)));
        ++p;
    }
}

namespace {

// The length of the start of a text that needs no decoding.
std::size_t plain_prefix(std::string_view raw) {
    std::size_t plain = 0;
    while (plain < raw.size()) {
        const auto byte = static_cast<unsigned char>(raw[plain]);
        if (byte < 0x20 || byte >= 0x80 || byte == '&' || byte == '<') break;
        ++plain;
    }
    return plain;
}

}  // namespace

bool is_plain_text(std::string_view raw) { return plain_prefix(raw) == raw.size(); }

bool decode_raw_text(std::string_view raw, std::string& out, bool attribute) {
    out.clear();
    const std::size_t plain = plain_prefix(raw);
    if (plain == raw.size()) {
        out.assign(raw);
        return true;
    }
    // Broken UTF-8, and characters XML cannot carry, are left to the general reader.
    if (lmx::find_invalid_xml_utf8(raw.data() + plain, raw.data() + raw.size()) != raw.data() + raw.size())
        return false;
    out.assign(raw.data(), plain);
    const auto* p = reinterpret_cast<const unsigned char*>(raw.data()) + plain;
    const auto* end = reinterpret_cast<const unsigned char*>(raw.data()) + raw.size();
    while (p < end) {
        const unsigned ch = *p;
        if (ch == '&') {
            const auto* semicolon = static_cast<const unsigned char*>(std::memchr(p, ';', static_cast<std::size_t>(end - p)));
            if (!semicolon || semicolon - p > 12) return false;
            if (!reference(std::string_view(reinterpret_cast<const char*>(p + 1), static_cast<std::size_t>(semicolon - p - 1)), out))
                return false;
            p = semicolon + 1;
        } else if (ch == '\r') {
            out += attribute ? ' ' : '\n';
            p += (p + 1 < end && p[1] == '\n') ? 2 : 1;
        } else if (ch == '\n' || ch == '\t') {
            out += attribute ? ' ' : static_cast<char>(ch);
            ++p;
        } else if (ch == '<') {
            return false;
        } else {
            out += static_cast<char>(ch);
            ++p;
        }
    }
    return true;
}

bool find_sheet_data(const char* data, std::size_t size, sheet_data_span& span) {
    const char* end = data + size;
    const char* p = data;
    if (size < 4) return false;
    const auto first = static_cast<unsigned char>(data[0]);
    if (first == 0xFF || first == 0xFE || first == 0x00 || data[1] == '\0') return false;
    if (size >= 3 && std::memcmp(p, "\xEF\xBB\xBF", 3) == 0) p += 3;
    if (end - p > 5 && std::memcmp(p, "<?xml", 5) == 0) {
        const char* close = static_cast<const char*>(memmem(p, static_cast<std::size_t>(end - p), "?>", 2));
        if (!close) return false;
        const std::string_view declaration(p, static_cast<std::size_t>(close - p));
        const std::size_t at = declaration.find("encoding");
        if (at != std::string_view::npos) {
            std::size_t q = declaration.find_first_of("\"'", at);
            if (q == std::string_view::npos) return false;
            const std::size_t e = declaration.find(declaration[q], q + 1);
            if (e == std::string_view::npos) return false;
            std::string name(declaration.substr(q + 1, e - q - 1));
            for (char& ch : name) ch = static_cast<char>(ch >= 'A' && ch <= 'Z' ? ch - 'A' + 'a' : ch);
            if (name != "utf-8" && name != "utf8") return false;
        }
    }
    for (const char* search = p;;) {
        const char* hit = static_cast<const char*>(memmem(search, static_cast<std::size_t>(end - search), "sheetData", 9));
        if (!hit) return false;
        search = hit + 9;
        const char* lt = hit - 1;
        if (lt < p) continue;
        if (*lt == ':') {
            while (lt > p && name_char(lt[-1])) --lt;
            --lt;
        }
        if (lt < p || *lt != '<' || lt[1] == '/') continue;
        if (search >= end || !(white(*search) || *search == '>' || *search == '/')) continue;
        // Comments, CDATA or a DTD before the element: left to the general reader.
        if (memmem(p, static_cast<std::size_t>(lt - p), "<!", 2)) return false;
        const char* q = search;
        while (q < end && *q != '>') {
            if (*q == '"' || *q == '\'') {
                const char* close = static_cast<const char*>(std::memchr(q + 1, *q, static_cast<std::size_t>(end - q - 1)));
                if (!close) return false;
                q = close;
            }
            ++q;
        }
        if (q >= end || q[-1] == '/') return false;
        span.content = q + 1;
        span.prefix = std::string_view(lt + 1, static_cast<std::size_t>(hit - lt - 1));
        return true;
    }
}

}  // namespace quire::ooxml
