// Document set-up: byte format, the XML declaration and the declared encoding.
#include <algorithm>
#include <array>
#include <cstring>

#include "character_classes.h"
#include "character_encoding.h"
#include "lmx/xml_scanner.h"

namespace lmx {

namespace {

// Encoding names are matched without regard to case, as XML asks.
bool same_encoding_name(std::string_view a, std::string_view b)
{
    return a.size() == b.size() && std::equal(a.begin(), a.end(), b.begin(), [](char x, char y) {
               auto lower = [](char c) { return (c >= 'A' && c <= 'Z') ? static_cast<char>(c + 32) : c; };
               return lower(x) == lower(y);
           });
}

constexpr std::array<std::string_view, 4> single_byte_encodings{"ISO-8859-1", "Windows-1252", "cp-1252",
                                                                 "US-ASCII"};

bool is_encoding_name(std::string_view name)
{
    if (name.empty() || !((name[0] >= 'a' && name[0] <= 'z') || (name[0] >= 'A' && name[0] <= 'Z')))
        return false;
    return std::all_of(name.begin(), name.end(), [](char c) {
        return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || (c >= '0' && c <= '9') || c == '.' ||
               c == '_' || c == '-';
    });
}

}  // namespace

void c_xml::use_decoded_text(std::size_t position)
{
    document_begin_ = decoded_.data();
    end_ = document_begin_ + decoded_.size();
    p_ = document_begin_ + std::min(position, decoded_.size());
    counted_up_to_ = nullptr;
}

void c_xml::prepare(const char* data, std::size_t size)
{
    document_begin_ = p_ = data;
    end_ = data + size;
    if (size == 0) {
        fail(ELMX_UNEXPECTED_EOM, "Premature end of file encountered: empty document");
        return;
    }
    const c_detected_format detected = detect_byte_format(data, size);
    if (detected.format == c_byte_format::undecided) {
        fail(ELMX_BAD_CHAR_ENCODING, "Unrecognised character encoding");
        return;
    }
    const char* body = data + detected.mark_length;
    const std::size_t body_size = size - detected.mark_length;
    const bool bytes_are_utf16 = is_utf16(detected.format);
    if (bytes_are_utf16) {
        if (!utf16_to_utf8(body, body_size, detected.format, decoded_)) {
            fail(ELMX_ENCODING_MISMATCH, "Invalid UTF-16 byte sequence");
            return;
        }
        use_decoded_text(0);
    } else {
        document_begin_ = p_ = body;
    }
    if (!read_xml_declaration())
        return;
    if (!declared_encoding_.empty() && !apply_declared_encoding(body, body_size, detected.format))
        return;
    if (xml11_) {
        const std::size_t position = static_cast<std::size_t>(p_ - document_begin_);
        if (document_begin_ != decoded_.data())
            decoded_.assign(document_begin_, end_);
        fold_xml11_line_ends(decoded_);
        use_decoded_text(position);
    }
    const char* invalid = find_invalid_xml_utf8(document_begin_, end_);
    if (invalid != end_) {
        p_ = invalid;
        const auto byte = static_cast<unsigned char>(*invalid);
        const bool valid_sequence = byte < 0x80 || (byte == 0xEF && end_ - invalid >= 3);
        if (valid_sequence)
            fail(ELMX_NOT_WELL_FORMED, "XML not Well-Formed: character not allowed in XML");
        else
            fail(ELMX_ENCODING_MISMATCH, "Mis-match between specfied encoding and byte format");
    }
}

bool c_xml::apply_declared_encoding(const char* body, std::size_t body_size, c_byte_format detected)
{
    const bool bytes_are_utf16 = is_utf16(detected);
    const std::string_view name = declared_encoding_;
    auto mismatch = [this] {
        return fail(ELMX_ENCODING_MISMATCH, "Mis-match between specfied encoding and byte format");
    };
    if (same_encoding_name(name, "UTF-8"))
        return bytes_are_utf16 ? mismatch() : true;
    if (same_encoding_name(name, "UTF-16"))
        return bytes_are_utf16 ? true : mismatch();
    if (same_encoding_name(name, "ISO-10646-UCS-2")) {
        if (!bytes_are_utf16)
            return mismatch();
        // UCS-2 has no surrogates: convert again in that stricter form.
        const std::size_t position = static_cast<std::size_t>(p_ - document_begin_);
        const c_byte_format strict_format = is_big_endian(detected) ? c_byte_format::ucs2_big_endian
                                                                     : c_byte_format::ucs2_little_endian;
        std::string strict;
        if (!utf16_to_utf8(body, body_size, strict_format, strict))
            return mismatch();
        decoded_ = std::move(strict);
        use_decoded_text(position);
        return true;
    }
    for (std::string_view single_byte : single_byte_encodings) {
        if (!same_encoding_name(name, single_byte))
            continue;
        if (bytes_are_utf16)
            return mismatch();
        // The declaration is ASCII, so the scan position survives the conversion.
        const std::size_t position = static_cast<std::size_t>(p_ - document_begin_);
        const bool windows_1252 = same_encoding_name(name, "Windows-1252") || same_encoding_name(name, "cp-1252");
        single_byte_to_utf8(body, body_size, windows_1252, decoded_);
        use_decoded_text(position);
        return true;
    }
    return fail(ELMX_BAD_CHAR_ENCODING, "Unknown character encoding specified");
}

bool c_xml::read_xml_declaration()
{
    if (!at("<?xml"))
        return true;
    if (end_ - p_ > 5 && !has_class(p_[5], class_space))
        return true;  // a processing instruction such as <?xml-stylesheet?>
    p_ += 5;
    auto bad = [this](std::string detail) { return fail(ELMX_BAD_XML_DECL, std::move(detail)); };
    // Reads  name = "value"  after required white space; 0 absent, 1 read, -1 failed.
    auto pseudo_attribute = [&](std::string_view name, std::string& value) -> int {
        const char* start = p_;
        skip_space();
        if (p_ == start || !at(name)) {
            p_ = start;
            return 0;
        }
        p_ += name.size();
        skip_space();
        if (p_ >= end_ || *p_ != '=')
            return bad("Malformed XML declaration: expected '=' after " + std::string(name)), -1;
        ++p_;
        skip_space();
        if (p_ >= end_ || (*p_ != '"' && *p_ != '\''))
            return bad("Malformed XML declaration: expected a quoted value for " + std::string(name)), -1;
        const char quote = *p_++;
        const char* value_start = p_;
        while (p_ < end_ && *p_ != quote && *p_ != '<' && *p_ != '>')
            ++p_;
        if (p_ >= end_ || *p_ != quote)
            return bad("Malformed XML declaration: unterminated value for " + std::string(name)), -1;
        value.assign(value_start, p_);
        ++p_;
        return 1;
    };
    const int has_version = pseudo_attribute("version", version_);
    if (has_version < 0)
        return false;
    if (has_version == 0)
        return bad("Version not present in XML Decl");
    if (version_ != "1.0" && version_ != "1.1")
        return fail(ELMX_BAD_XML_VERSION, "XML version " + version_ + " not understood");
    xml11_ = version_ == "1.1";
    const int has_encoding = pseudo_attribute("encoding", declared_encoding_);
    if (has_encoding < 0)
        return false;
    if (has_encoding > 0 && !is_encoding_name(declared_encoding_))
        return fail(ELMX_BAD_CHAR_ENCODING, "Unknown character encoding specified");
    std::string standalone;
    const int has_standalone = pseudo_attribute("standalone", standalone);
    if (has_standalone < 0)
        return false;
    if (has_standalone > 0 && standalone != "yes" && standalone != "no")
        return bad("Malformed XML declaration: standalone must be yes or no");
    skip_space();
    if (p_ >= end_)
        return unexpected_end();
    if (!at("?>"))
        return bad("Malformed XML declaration: expected '?>'");
    p_ += 2;
    return true;
}

}  // namespace lmx
