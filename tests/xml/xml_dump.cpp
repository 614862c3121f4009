// Prints the events of XML files in a canonical form, one line each, for
// comparison with another parser:
//   F path | S {ns}local | A {ns}local=value | T text | E | X code detail
// Consecutive character data is printed as one T line; values escape
// backslash, control characters and non-ASCII bytes are kept as UTF-8.
// With --rewrite DIR each file is also written again through the writer to
// DIR/<n>.xml, n counting the files from 0. With --bench each file is only
// scanned, and the scan speed printed.
#include <chrono>
#include <cstdio>
#include <fstream>
#include <iostream>
#include <string>
#include <vector>

#include "lmx/xml_scanner.h"
#include "lmx/xml_writer.h"

namespace {

void append_canonical(std::string& out, std::string_view text)
{
    for (const char c : text) {
        switch (c) {
        case '\\': out += "\\\\"; break;
        case '\n': out += "\\n"; break;
        case '\r': out += "\\r"; break;
        case '\t': out += "\\t"; break;
        default:
            if (static_cast<unsigned char>(c) < 0x20) {
                char hex[8];
                std::snprintf(hex, sizeof hex, "\\x%02x", static_cast<unsigned char>(c));
                out += hex;
            } else {
                out += c;
            }
        }
    }
}

void append_name(std::string& out, std::string_view ns, std::string_view local)
{
    out += '{';
    out += ns;
    out += '}';
    out += local;
}

bool dump_file(const std::string& path, std::string& out, const std::string& rewrite_path)
{
    lmx::c_read_file source(path);
    lmx::c_xml scanner(source);
    std::string rewritten;
    lmx::c_xml_writer writer(rewritten, lmx::c_xml_writer::flag_declaration);
    std::string pending_text;
    auto flush_text = [&] {
        if (!pending_text.empty()) {
            out += "T ";
            append_canonical(out, pending_text);
            out += '\n';
            pending_text.clear();
        }
    };
    out += "F " + path + '\n';
    for (;;) {
        const lmx::xml_event event = scanner.next();
        if (event == lmx::xml_event::start_element) {
            flush_text();
            out += "S ";
            append_name(out, scanner.namespace_uri(), scanner.local_name());
            out += '\n';
            writer.start_element(scanner.qname());
            for (const lmx::c_namespace_declaration& declaration : scanner.namespace_declarations())
                writer.declare_namespace(declaration.prefix, declaration.namespace_uri);
            for (const lmx::c_xml_attribute& attribute : scanner.attributes()) {
                out += "A ";
                append_name(out, attribute.namespace_uri, attribute.local_name);
                out += '=';
                append_canonical(out, attribute.value);
                out += '\n';
                writer.attribute(attribute.qname, attribute.value);
            }
        } else if (event == lmx::xml_event::end_element) {
            flush_text();
            out += "E\n";
            writer.end_element();
        } else if (event == lmx::xml_event::text) {
            pending_text += scanner.text();
            writer.text(scanner.text());
        } else if (event == lmx::xml_event::end_document) {
            break;
        } else {
            flush_text();
            out += "X " + std::to_string(scanner.error_code()) + ' ';
            append_canonical(out, scanner.error().detail);
            out += '\n';
            return false;
        }
    }
    if (!rewrite_path.empty()) {
        std::ofstream file(rewrite_path, std::ios::binary);
        file << rewritten;
    }
    return true;
}

// Scans a file held in memory and prints the speed in MB/s.
bool bench_file(const std::string& path)
{
    lmx::c_read_file source(path);
    const auto start = std::chrono::steady_clock::now();
    lmx::c_xml scanner(source);
    std::size_t elements = 0, attributes = 0, text_bytes = 0;
    lmx::xml_event event;
    while ((event = scanner.next()) != lmx::xml_event::end_document && event != lmx::xml_event::error) {
        if (event == lmx::xml_event::start_element) {
            ++elements;
            attributes += scanner.attributes().size();
        } else if (event == lmx::xml_event::text) {
            text_bytes += scanner.text().size();
        }
    }
    const double seconds = std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
    std::printf("%s: %zu bytes, %zu elements, %zu attributes, %zu text bytes, %.3f s, %.0f MB/s%s\n", path.c_str(),
                source.size(), elements, attributes, text_bytes, seconds, source.size() / seconds / 1e6,
                event == lmx::xml_event::error ? " (error)" : "");
    return event != lmx::xml_event::error;
}

}  // namespace

int main(int argc, char** argv)
{
    std::string rewrite_dir;
    bool bench = false;
    std::vector<std::string> paths;
    for (int i = 1; i < argc; ++i) {
        const std::string argument = argv[i];
        if (argument == "--bench")
            bench = true;
        else if (argument == "--rewrite" && i + 1 < argc)
            rewrite_dir = argv[++i];
        else if (argument == "--list" && i + 1 < argc) {
            std::ifstream list(argv[++i]);
            for (std::string line; std::getline(list, line);)
                if (!line.empty())
                    paths.push_back(line);
        } else {
            paths.push_back(argument);
        }
    }
    if (paths.empty()) {
        std::cerr << "usage: xml_dump [--bench] [--rewrite DIR] [--list FILE] FILE...\n";
        return 2;
    }
    if (bench) {
        bool all_read = true;
        for (const std::string& path : paths)
            all_read = bench_file(path) && all_read;
        return all_read ? 0 : 1;
    }
    int failures = 0;
    std::string out;
    for (std::size_t i = 0; i < paths.size(); ++i) {
        out.clear();
        const std::string rewrite_path = rewrite_dir.empty() ? "" : rewrite_dir + "/" + std::to_string(i) + ".xml";
        if (!dump_file(paths[i], out, rewrite_path))
            ++failures;
        std::fwrite(out.data(), 1, out.size(), stdout);
    }
    return failures == 0 ? 0 : 1;
}
