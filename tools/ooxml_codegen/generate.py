#!/usr/bin/env python3
"""Generates the C++ element classes of the Open XML parts from the published schemas.

    python3 tools/ooxml_codegen/generate.py [output folder]

The output folder defaults to source/ooxml/generated. Every group of classes (one per
kind of part, transitional and Strict) gets a header and one or more source files; the
Strict groups are the same schemas read with the Strict namespaces.
"""
import os
import sys

sys.path.insert(0, os.path.dirname(os.path.abspath(__file__)))

from xsd_model import SchemaSet, XML_NS  # noqa: E402
from model import Resolver, ValueType, ClassInfo, Attribute, identifier  # noqa: E402

HERE = os.path.dirname(os.path.abspath(__file__))
REPO = os.path.normpath(os.path.join(HERE, "..", ".."))

SML = "http://schemas.openxmlformats.org/spreadsheetml/2006/main"
REL = "http://schemas.openxmlformats.org/officeDocument/2006/relationships"
XDR = "http://schemas.openxmlformats.org/drawingml/2006/spreadsheetDrawing"
DML = "http://schemas.openxmlformats.org/drawingml/2006/main"
CT = "http://schemas.openxmlformats.org/package/2006/content-types"
PR = "http://schemas.openxmlformats.org/package/2006/relationships"

# The ISO/IEC 29500 Strict namespaces of the transitional ones.
STRICT = {
    SML: "http://purl.oclc.org/ooxml/spreadsheetml/main",
    REL: "http://purl.oclc.org/ooxml/officeDocument/relationships",
    XDR: "http://purl.oclc.org/ooxml/drawingml/spreadsheetDrawing",
    DML: "http://purl.oclc.org/ooxml/drawingml/main",
    "http://schemas.openxmlformats.org/officeDocument/2006/sharedTypes":
        "http://purl.oclc.org/ooxml/officeDocument/sharedTypes",
    "http://schemas.openxmlformats.org/drawingml/2006/chart": "http://purl.oclc.org/ooxml/drawingml/chart",
    "http://schemas.openxmlformats.org/drawingml/2006/picture": "http://purl.oclc.org/ooxml/drawingml/picture",
}

PREFIXES = {SML: "", REL: "r", XDR: "xdr", DML: "a", CT: "", PR: "", XML_NS: "xml"}
for t, s in STRICT.items():
    if t in PREFIXES:
        PREFIXES[s] = PREFIXES[t]


class Group:
    def __init__(self, namespace, files, roots, strict=False, main=SML):
        self.namespace = namespace      # C++ namespace
        self.files = files              # source file stems, the first also names the header
        self.roots = roots              # (element namespace, element name, type name)
        self.strict = strict
        self.main = STRICT.get(main, main) if strict else main


def sml_roots(*names):
    return [(SML, element, type_name) for element, type_name in names]


GROUPS = [
    Group("workbook", ["sml-workbook"], sml_roots(("workbook", "CT_Workbook"))),
    Group("sheet", ["sml-sheet", "sml-sheet2", "sml-sheet3"], sml_roots(("worksheet", "CT_Worksheet"))),
    Group("styles", ["sml-styles"], sml_roots(("styleSheet", "CT_Stylesheet"))),
    Group("sharedStringTable", ["sml-sharedStringTable"], sml_roots(("sst", "CT_Sst"))),
    Group("comments", ["sml-comments"], sml_roots(("comments", "CT_Comments"))),
    Group("table", ["sml-table"], sml_roots(("table", "CT_Table"))),
    Group("drawing", ["dml-spreadsheetDrawing", "dml-spreadsheetDrawing2", "dml-spreadsheetDrawing3"],
          [(XDR, "wsDr", "CT_Drawing")], main=XDR),
    Group("contentypes", ["opc-contentTypes"], [(CT, "Types", "CT_Types")], main=CT),
    Group("relationships", ["opc-relationships"], [(PR, "Relationships", "CT_Relationships")], main=PR),
    Group("strict", ["sml", "sml2", "sml3", "sml4", "sml5"],
          sml_roots(("workbook", "CT_Workbook"), ("worksheet", "CT_Worksheet"), ("styleSheet", "CT_Stylesheet"),
                    ("sst", "CT_Sst"), ("table", "CT_Table"), ("comments", "CT_Comments")), strict=True),
    Group("strictdrawing", ["strictDrawing", "strictDrawing2", "strictDrawing3"],
          [(XDR, "wsDr", "CT_Drawing")], strict=True, main=XDR),
]

# Classes written by hand (ooxml/binding/sheet_data.h, string_table.h): a sheet holds millions of
# rows and cells and a book as many shared strings, so they are kept compact and read and written
# by their own code.
HAND_WRITTEN = {"c_CT_SheetData": "sheet_data_t", "c_CT_Row": "row_t", "c_CT_Cell": "cell_t",
                "c_CT_Sst": "string_table_t"}

CPP_TYPES = {
    "string": "std::wstring", "bool": "bool", "double": "double",
    "u8": "std::uint32_t", "u16": "std::uint32_t", "u32": "std::uint32_t", "u64": "std::uint64_t",
    "i8": "std::int32_t", "i16": "std::int32_t", "i32": "std::int32_t", "i64": "std::int64_t",
    "hex": "lmx::c_binary", "base64": "lmx::c_binary", "enum": "int",
}
NARROW = {"u8": "std::uint8_t", "u16": "std::uint16_t", "u32": "std::uint32_t", "u64": "std::uint64_t",
          "i8": "std::int8_t", "i16": "std::int16_t", "i32": "std::int32_t", "i64": "std::int64_t"}


def cpp_string(text):
    out = []
    for ch in text:
        if ch in '\\"':
            out.append("\\" + ch)
        elif 32 <= ord(ch) < 127:
            out.append(ch)
        else:
            out.append("\\x%x" % ord(ch))
    return '"' + "".join(out) + '"'


class Emitter:
    def __init__(self, group, schemas):
        self.g = group
        mapping = STRICT if group.strict else {}
        self.r = Resolver(schemas, mapping)
        self.classes = []
        for ns, element, type_name in group.roots:
            self.r.class_for((ns, type_name))
        # Walk every class reachable from the roots.
        queue = list(self.r.classes.values())
        seen = set()
        while queue:
            info = queue.pop(0)
            if info.key in seen:
                continue
            seen.add(info.key)
            self.classes.append(info)
            for slot in info.slots:
                if slot.kind == "complex":
                    if slot.target == ("", "ST_Xstring_space"):
                        queue.append(self.xstring_class())
                    else:
                        queue.append(self.r.class_for(slot.target))
        self.classes.sort(key=lambda c: c.name)
        names = [c.name for c in self.classes]
        if len(names) != len(set(names)):
            raise SystemExit("class name clash in group " + group.namespace)
        for info in self.classes:
            if info.name == "c_CT_SheetData":
                info.row_limits = True
        self.namespaces = self.collect_namespaces()
        self.tokens = {}
        for info in self.classes:
            for a in info.attributes:
                self.token(a.ns, a.name)
            for s in info.slots:
                self.token(s.ns, s.name)
        for ns, element, type_name in group.roots:
            self.token(self.r.ns(ns), element)

    @staticmethod
    def hand_written(info):
        return info.name in HAND_WRITTEN

    def hand_written_include(self):
        names = {c.name for c in self.classes}
        if "c_CT_Sst" in names:
            return "#include \"ooxml/binding/string_table.h\"\n"
        if "c_CT_Cell" in names:
            return "#include \"ooxml/binding/sheet_data.h\"\n"
        return ""

    def xstring_class(self):
        key = ("", "ST_Xstring_space")
        if key not in self.r.classes:
            info = ClassInfo(key, "c_ST_Xstring_space")
            info.simple_content = ValueType("string")
            info.attributes.append(Attribute(XML_NS, "space", ValueType("string"), False, None))
            self.r.classes[key] = info
        return self.r.classes[key]

    def collect_namespaces(self):
        found = [self.g.main]
        for info in self.classes:
            for a in info.attributes:
                if a.ns and a.ns not in found:
                    found.append(a.ns)
            for s in info.slots:
                if s.ns not in found:
                    found.append(s.ns)
        return {uri: number + 1 for number, uri in enumerate(found)}

    def token(self, ns, name):
        key = (self.namespaces.get(ns, 0) if ns else 0, name)
        if key not in self.tokens:
            self.tokens[key] = 12 + len(self.tokens)
        return self.tokens[key]

    def tok(self, ns, name):
        return self.tokens[(self.namespaces.get(ns, 0) if ns else 0, name)]

    def qname(self, ns, name):
        prefix = PREFIXES.get(ns, "ns%d" % self.namespaces.get(ns, 0)) if ns else ""
        if ns == self.g.main and ns not in (XDR, STRICT[XDR]):
            prefix = ""
        return prefix + ":" + name if prefix else name

    # ---- naming ----
    @staticmethod
    def accessor_names(info):
        names = {}
        used = set()
        for a in info.attributes:
            base = identifier(a.name)
            if base in used:
                base = base + "_" + identifier(a.ns.split("/")[-1]) if a.ns else base + "_attr"
            used.add(base)
            names[("a", a.ns, a.name)] = base
        for s in info.slots:
            base = identifier(s.name)
            while base in used:
                base = base + "_elem"
            used.add(base)
            names[("s", s.ns, s.name)] = base
        return names

    def enum_name(self, vt):
        return "k_enum_" + identifier(vt.name)

    # ---- value helpers ----
    def default_literal(self, vt, default):
        kind = vt.kind
        if kind == "string":
            return "L" + cpp_string(default) if default is not None else ""
        if kind == "bool":
            return "true" if default in ("true", "1") else "false"
        if kind == "enum":
            if default is not None and default in vt.values:
                return str(vt.values.index(default))
            return "0"
        if kind in ("hex", "base64"):
            return ""
        if kind == "double":
            if default is None:
                return "0.0"
            value = default
            if value in ("INF", "-INF", "NaN"):
                return "0.0"
            return repr(float(value))
        if default is None:
            return "0"
        suffix = "u" if kind.startswith("u") else ""
        if kind in ("i64", "u64"):
            suffix += "LL" if kind == "i64" else "LL"
        return str(int(default)) + suffix

    def read_call(self, vt, text, field):
        kind = vt.kind
        if kind in ("string", "bool", "double"):
            return "read_value(%s, %s)" % (text, field)
        if kind == "hex":
            return "read_hex(%s, %s)" % (text, field)
        if kind == "base64":
            return "read_base64(%s, %s)" % (text, field)
        if kind == "enum":
            return "read_enum(%s, %s, %d, %s)" % (text, self.enum_name(vt), len(vt.values), field)
        return "read_integer_as<%s>(%s, %s)" % (NARROW[kind], text, field)

    def attribute_write(self, vt, qname, field):
        kind = vt.kind
        if kind in ("string", "bool", "double"):
            return "put_attribute(writer, %s, %s);" % (cpp_string(qname), field)
        if kind == "hex":
            return "writer.attribute(%s, std::string_view(%s.to_hex()));" % (cpp_string(qname), field)
        if kind == "base64":
            return "writer.attribute(%s, std::string_view(%s.to_base64()));" % (cpp_string(qname), field)
        if kind == "enum":
            return "writer.attribute(%s, std::string_view(enum_text(%s, %d, %s)));" % (
                cpp_string(qname), self.enum_name(vt), len(vt.values), field)
        return "put_integer_attribute(writer, %s, %s);" % (cpp_string(qname), field)

    def text_write(self, vt, field):
        kind = vt.kind
        if kind in ("string", "bool", "double"):
            return "put_text(writer, %s);" % field
        if kind == "hex":
            return "writer.text(std::string_view(%s.to_hex()));" % field
        if kind == "base64":
            return "writer.text(std::string_view(%s.to_base64()));" % field
        if kind == "enum":
            return "writer.text(std::string_view(enum_text(%s, %d, %s)));" % (
                self.enum_name(vt), len(vt.values), field)
        return "put_integer_text(writer, %s);" % field

    def cpp_type(self, vt):
        return CPP_TYPES[vt.kind]

    # ---- output ----
    def header_name(self):
        return self.g.files[0] + ".h"

    def emit(self, folder):
        enums = {}
        for info in self.classes:
            for a in info.attributes:
                if a.vtype.kind == "enum":
                    enums[a.vtype.name] = a.vtype
            for s in info.slots:
                if s.kind == "simple" and s.target.kind == "enum":
                    enums[s.target.name] = s.target
            if info.simple_content is not None and info.simple_content.kind == "enum":
                enums[info.simple_content.name] = info.simple_content
        self.enums = dict(sorted(enums.items()))
        files = {}
        files[self.header_name()] = self.emit_header()
        chunks = [[] for _ in self.g.files]
        for i, info in enumerate(self.classes):
            chunks[i * len(self.g.files) // len(self.classes)].append(info)
        for n, stem in enumerate(self.g.files):
            files[stem + ".cpp"] = self.emit_source(stem, chunks[n], n == 0)
        for name, text in files.items():
            with open(os.path.join(folder, name), "w") as out:
                out.write(text)
        return len(self.classes)

    def banner(self):
        return ("// Generated by tools/ooxml_codegen/generate.py from the schemas in tools/ooxml_codegen/schemas.\n"
                "// Do not edit: change the generator and run python3 tools/ooxml_codegen/generate.py.\n")

    def emit_header(self):
        ns = self.g.namespace
        out = [self.banner(), "#pragma once\n#include <cstddef>\n#include <cstdint>\n#include <string>\n"
               "#include <vector>\n\n#include \"lmx/lmx.h\"\n#include \"ooxml/binding/foreign_content.h\"\n"
               "#include \"ooxml/binding/ordered_set.h\"\n#include \"ooxml/binding/owned.h\"\n%s\n"
               "namespace %s {\n\n" % (
                   self.hand_written_include(),
                   ns)]
        out.append("extern const lmx::c_namespace_entry k_namespaces[];\nextern const lmx::c_token_entry k_tokens[];\n")
        out.append("// The namespace declarations written on the document element of a part.\n"
                   "void declare_namespaces(lmx::c_xml_writer& writer);\n\n")
        for name, vt in self.enums.items():
            ident = identifier(name)
            out.append("extern const char* const %s[%d];\n" % (self.enum_name(vt), len(vt.values)))
            members = []
            used = set()
            for i, value in enumerate(vt.values):
                member = "%s_%s" % (ident, identifier(value) or "empty")
                while member in used:
                    member += "_"
                used.add(member)
                members.append("    %s = %d," % (member, i))
            out.append("enum %s : int {\n%s\n};\n" % (ident, "\n".join(members)))
        out.append("\n")
        for info in self.classes:
            if not self.hand_written(info):
                out.append("class %s;\n" % info.name)
        if any(self.hand_written(c) for c in self.classes):
            names = {c.name for c in self.classes}
            out.append("\n// The hand-written classes of this group, over its element types.\n"
                       "struct c_part_types {\n%s"
                       "    using rich_text = c_CT_Rst;\n"
                       "    using extension_list = c_CT_ExtensionList;\n"
                       "    static const char* main_namespace() { return %s; }\n"
                       "    static void declare(lmx::c_xml_writer& writer) { declare_namespaces(writer); }\n};\n"
                       % ("    using formula = c_CT_CellFormula;\n" if "c_CT_CellFormula" in names else "",
                          cpp_string(self.g.main)))
            for name, template in sorted(HAND_WRITTEN.items()):
                if name in names:
                    out.append("using %s = quire::ooxml::%s<c_part_types>;\n" % (name, template))
            if "c_CT_Cell" in names:
                out.append("// Receives the rows of sheet data one at a time instead of keeping them.\n"
                           "using c_row_handler = quire::ooxml::row_handler_t<c_part_types>;\n")
        out.append("\n")
        inline_defs = []
        for info in self.classes:
            if not self.hand_written(info):
                out.append(self.class_declaration(info, inline_defs))
        out.extend(inline_defs)
        out.append("}  // namespace %s\n" % ns)
        return "".join(out)

    def class_declaration(self, info, inline_defs):
        names = self.accessor_names(info)
        pub, priv = [], []
        pub.append("    lmx::elmx_error unmarshal(lmx::c_xml_reader& reader, const std::string& name);\n")
        if info.name == "c_CT_Worksheet" or info.row_limits:
            pub.append("    // Rows outside first_row..last_row (0-based, -1: no bound) are passed over; with a\n"
                       "    // handler the rows go to it instead of into the sheet data.\n"
                       "    lmx::elmx_error unmarshal(lmx::c_xml_reader& reader, const std::string& name, int first_row,\n"
                       "                              int last_row, c_row_handler* handler = nullptr);\n")
        pub.append("    lmx::elmx_error marshal(lmx::c_xml_writer& writer, const char* name) const;\n")
        pub.append("    // Back to the state of a new object.\n    void reset() { *this = %s(); }\n" % info.name)
        pub.append("    // Content outside the schema, kept for writing back; null when there is none.\n"
                   "    const quire::ooxml::c_foreign* foreign() const { return m_foreign_.get(); }\n")
        for a in info.attributes:
            n = names[("a", a.ns, a.name)]
            t = self.cpp_type(a.vtype)
            d = self.default_literal(a.vtype, a.default)
            priv.append("    %s m_%s%s;\n" % (t, n, "{" + d + "}" if d else "{}"))
            priv.append("    bool m_has_%s = false;\n" % n)
            pub.append("    // %s attribute %s%s\n" % ("required" if a.required else "optional", a.name,
                                                        (" (default " + a.default + ")") if a.default else ""))
            pub.append("    const %s& get_%s() const { return m_%s; }\n" % (t, n, n))
            pub.append("    void set_%s(const %s& value) { m_%s = value; m_has_%s = true; }\n" % (n, t, n, n))
            pub.append("    bool isset_%s() const { return m_has_%s; }\n" % (n, n))
            pub.append("    void unset_%s() { m_%s = %s{%s}; m_has_%s = false; }\n" % (n, n, t, d, n))
        if info.simple_content is not None:
            vt = info.simple_content
            t = self.cpp_type(vt)
            priv.append("    %s m_value{};\n" % t)
            pub.append("    const %s& get_value() const { return m_value; }\n" % t)
            pub.append("    void set_value(const %s& value) { m_value = value; }\n" % t)
        for k in range(info.ordered_sets):
            priv.append("    quire::ooxml::c_order m_order_%d;\n" % k)
        for index, s in enumerate(info.slots):
            n = names[("s", s.ns, s.name)]
            order = "m_order_%d" % s.ordered_set if s.ordered_set is not None else None
            pub.append("    // %s element %s%s\n" % ("required" if s.required else "optional", s.name,
                                                      ", repeated" if s.many else ""))
            if s.kind == "complex":
                ct = self.target_name(s)
                if s.many:
                    priv.append("    std::vector<quire::ooxml::c_owned<%s>> m_%s;\n" % (ct, n))
                    pub.append("    std::size_t size_%s() const { return m_%s.size(); }\n" % (n, n))
                    pub.append("    %s& get_%s(std::size_t index) const { return *m_%s[index]; }\n" % (ct, n, n))
                    pub.append("    %s& append_%s();\n" % (ct, n))
                    pub.append("    %s& insert_%s(std::size_t index);\n" % (ct, n))
                    pub.append("    void delete_%s(std::size_t index);\n" % n)
                    pub.append("    void clear_%s();\n" % n)
                    cls = info.name
                    push = ("    %s.push_back(%d);\n" % (order, index)) if order else ""
                    ins = ("    quire::ooxml::order_insert(%s, %d, index);\n" % (order, index)) if order else ""
                    era = ("    quire::ooxml::order_erase(%s, %d, index);\n" % (order, index)) if order else ""
                    clr = ("    quire::ooxml::order_clear(%s, %d);\n" % (order, index)) if order else ""
                    inline_defs.append(
                        "inline %s& %s::append_%s() {\n    m_%s.emplace_back();\n%s    return m_%s.back().create();\n}\n"
                        % (ct, cls, n, n, push, n))
                    inline_defs.append(
                        "inline %s& %s::insert_%s(std::size_t index) {\n%s    return m_%s.emplace(m_%s.begin() + "
                        "static_cast<std::ptrdiff_t>(index))->create();\n}\n" % (ct, cls, n, ins, n, n))
                    inline_defs.append(
                        "inline void %s::delete_%s(std::size_t index) {\n%s    m_%s.erase(m_%s.begin() + "
                        "static_cast<std::ptrdiff_t>(index));\n}\n" % (cls, n, era, n, n))
                    inline_defs.append("inline void %s::clear_%s() {\n%s    m_%s.clear();\n}\n" % (cls, n, clr, n))
                else:
                    priv.append("    quire::ooxml::c_owned<%s> m_%s;\n" % (ct, n))
                    pub.append("    // Created when absent.\n    %s& get_%s() { return m_%s.create(); }\n" % (ct, n, n))
                    pub.append("    %s* find_%s() const { return m_%s.get(); }\n" % (ct, n, n))
                    pub.append("    bool isset_%s() const { return static_cast<bool>(m_%s); }\n" % (n, n))
                    pub.append("    void unset_%s() { m_%s.reset(); }\n" % (n, n))
            else:
                t = self.cpp_type(s.target)
                if s.many:
                    priv.append("    std::vector<%s> m_%s;\n" % (t, n))
                    pub.append("    std::size_t size_%s() const { return m_%s.size(); }\n" % (n, n))
                    pub.append("    const %s& get_%s(std::size_t index) const { return m_%s[index]; }\n" % (t, n, n))
                    push = ("%s.push_back(%d); " % (order, index)) if order else ""
                    pub.append("    void append_%s(const %s& value) { m_%s.push_back(value); %s}\n" % (n, t, n, push))
                    clr = ("quire::ooxml::order_clear(%s, %d); " % (order, index)) if order else ""
                    pub.append("    void clear_%s() { m_%s.clear(); %s}\n" % (n, n, clr))
                else:
                    priv.append("    %s m_%s{};\n    bool m_has_%s = false;\n" % (t, n, n))
                    pub.append("    const %s& get_%s() const { return m_%s; }\n" % (t, n, n))
                    pub.append("    void set_%s(const %s& value) { m_%s = value; m_has_%s = true; }\n" % (n, t, n, n))
                    pub.append("    bool isset_%s() const { return m_has_%s; }\n" % (n, n))
                    pub.append("    void unset_%s() { m_%s = %s{}; m_has_%s = false; }\n" % (n, n, t, n))
        priv.append("    quire::ooxml::c_owned<quire::ooxml::c_foreign> m_foreign_;\n")
        return "class %s {\npublic:\n%sprivate:\n%s};\n\n" % (info.name, "".join(pub), "".join(priv))

    def target_name(self, slot):
        if slot.target == ("", "ST_Xstring_space"):
            return "c_ST_Xstring_space"
        return self.r.classes[slot.target].name

    def emit_source(self, stem, infos, first):
        ns = self.g.namespace
        out = [self.banner(), "#include \"ooxml/generated/%s\"\n\n#include \"ooxml/binding/value_bridge.h\"\n\n"
               % self.header_name(), "namespace %s {\n\nusing namespace quire::ooxml;\n\nnamespace {\n\n" % ns,
               "constexpr const char* k_program_file = \"source/ooxml/%s\";\n\n" % stem,
               "lmx::elmx_error fail(lmx::c_xml_reader& reader, lmx::elmx_error code, std::string_view item, int line) {\n"
               "    reader.set_program_file(k_program_file);\n"
               "    return reader.capture_error(code, std::string(item), line);\n}\n\n",
               "[[maybe_unused]] const char* enum_text(const char* const* names, int count, int value) {\n"
               "    return value >= 0 && value < count ? names[value] : \"\";\n}\n\n",
               "// Text of simple elements, read and converted at once.\nthread_local std::string t_text;\n\n"
               "}  // namespace\n\n"]
        if first:
            out.append(self.tables())
        for info in infos:
            if self.hand_written(info):
                continue
            out.append(self.unmarshal_code(info))
            out.append(self.marshal_code(info))
        out.append("}  // namespace %s\n" % ns)
        return "".join(out)

    def tables(self):
        out = ["const lmx::c_namespace_entry k_namespaces[] = {\n"]
        for uri, number in sorted(self.namespaces.items(), key=lambda x: x[1]):
            out.append("    {%d, %s, %s},\n" % (number, cpp_string(PREFIXES.get(uri, "ns%d" % number)), cpp_string(uri)))
        out.append("    {0, nullptr, nullptr},\n};\n\n")
        out.append("const lmx::c_token_entry k_tokens[] = {\n")
        for (number, name), token in sorted(self.tokens.items(), key=lambda x: x[1]):
            out.append("    {%d, %s, %d, %d},\n" % (number, cpp_string(name), len(name), token))
        out.append("    {0, nullptr, 0, 0},\n};\n\n")
        out.append("void declare_namespaces(lmx::c_xml_writer& writer) {\n")
        for uri, number in sorted(self.namespaces.items(), key=lambda x: x[1]):
            if uri == XML_NS:
                continue
            prefix = PREFIXES.get(uri, "ns%d" % number)
            if uri == self.g.main and uri not in (XDR, STRICT[XDR]):
                prefix = ""
            out.append("    writer.declare_namespace(%s, %s);\n" % (cpp_string(prefix), cpp_string(uri)))
        out.append("}\n\n")
        for name, vt in self.enums.items():
            out.append("const char* const %s[%d] = {%s};\n" % (
                self.enum_name(vt), len(vt.values), ", ".join(cpp_string(v) for v in vt.values)))
        out.append("\n")
        return "".join(out)

    def root_check(self, info):
        roots = [(self.r.ns(ns), element) for ns, element, type_name in self.g.roots
                 if self.r.classes.get((ns, type_name)) is info]
        if not roots:
            return ""
        tests = " || ".join("token == %d" % self.tok(ns, element) for ns, element in roots)
        return ("    if (scanner.depth() == 1) {\n"
                "        const int token = reader.tokenise(k_tokens, scanner.namespace_uri(), scanner.local_name());\n"
                "        if (!(%s)) return fail(reader, lmx::ELMX_ELEMENT_NOT_FOUND, name, __LINE__);\n    }\n" % tests)

    def unmarshal_code(self, info):
        names = self.accessor_names(info)
        cls = info.name
        limited = info.name == "c_CT_Worksheet" or info.row_limits
        out = []
        if limited:
            out.append("lmx::elmx_error %s::unmarshal(lmx::c_xml_reader& reader, const std::string& name) {\n"
                       "    return unmarshal(reader, name, -1, -1, nullptr);\n}\n\n" % cls)
            out.append("lmx::elmx_error %s::unmarshal(lmx::c_xml_reader& reader, const std::string& name, int first_row,\n"
                       "                                int last_row, c_row_handler* handler) {\n" % cls)
        else:
            out.append("lmx::elmx_error %s::unmarshal(lmx::c_xml_reader& reader, const std::string& name) {\n" % cls)
        out.append("    reader.set_namespace_table(k_namespaces);\n    lmx::c_xml& scanner = reader.scanner();\n")
        out.append(self.root_check(info))
        out.append("    for (const auto& declaration : scanner.namespace_declarations())\n"
                   "        m_foreign_.create().add_namespace(declaration.prefix, declaration.namespace_uri);\n")
        out.append("    for (const lmx::c_xml_attribute& attribute : scanner.attributes()) {\n"
                   "        lmx::elmx_error result = lmx::ELMX_OK;\n        int line = 0;\n"
                   "        switch (reader.tokenise(k_tokens, attribute.namespace_uri, attribute.local_name)) {\n")
        for a in info.attributes:
            n = names[("a", a.ns, a.name)]
            out.append("        case %d:\n            line = __LINE__;\n            result = %s;\n"
                       "            m_has_%s = true;\n            break;\n"
                       % (self.tok(a.ns, a.name), self.read_call(a.vtype, "attribute.value", "m_" + n), n))
        out.append("        default:\n            if (!lmx::c_xml_reader::is_runtime_attribute(attribute))\n"
                   "                m_foreign_.create().add_attribute(attribute);\n            continue;\n        }\n"
                   "        if (result != lmx::ELMX_OK) return fail(reader, result, attribute.local_name, line);\n    }\n")
        for a in info.attributes:
            if a.required:
                n = names[("a", a.ns, a.name)]
                out.append("    if (!m_has_%s) return fail(reader, lmx::ELMX_REQUIRED_ATTRIBUTES_MISSING, %s, __LINE__);\n"
                           % (n, cpp_string(a.name)))
        if info.simple_content is not None:
            out.append("    {\n        const lmx::elmx_error result = reader.get_simple_content(t_text);\n"
                       "        if (result != lmx::ELMX_OK) return result;\n"
                       "        const lmx::elmx_error converted = %s;\n"
                       "        if (converted != lmx::ELMX_OK) return fail(reader, converted, name, __LINE__);\n"
                       "    }\n    return lmx::ELMX_OK;\n}\n\n" % self.read_call(info.simple_content, "t_text", "m_value"))
            return "".join(out)
        # Children.
        ranks = []
        for index, s in enumerate(info.slots):
            if s.ordered_set is None:
                ranks.append(index)
            else:
                ranks.append(next(i for i, t in enumerate(info.slots) if t.ordered_set == s.ordered_set))
        out.append("    std::size_t known = 0;\n")
        if info.slots:
            out.append("    int rank = -1;\n")
        if limited and info.row_limits:
            out.append("    std::int64_t row_number = 0;\n    c_CT_Row* worker = handler ? new c_CT_Row() : nullptr;\n"
                       "    const quire::ooxml::c_owned<c_CT_Row> worker_owner = [&] {\n"
                       "        quire::ooxml::c_owned<c_CT_Row> owner;\n        if (worker) { delete worker; worker = &owner.create(); }\n"
                       "        return owner;\n    }();\n")
        out.append("    for (;;) {\n        bool found = false;\n"
                   "        const lmx::elmx_error next = reader.next_child(found);\n"
                   "        if (next != lmx::ELMX_OK) return next;\n        if (!found) break;\n"
                   "        int slot = -1;\n"
                   "        switch (reader.tokenise(k_tokens, scanner.namespace_uri(), scanner.local_name())) {\n")
        for index, s in enumerate(info.slots):
            out.append("        case %d: slot = %d; break;\n" % (self.tok(s.ns, s.name), index))
        out.append("        default: break;\n        }\n")
        if info.slots:
            out.append("        static const int k_rank[] = {%s};\n" % ", ".join(str(r) for r in ranks))
            out.append("        if (slot < 0 || k_rank[slot] < rank) {\n")
        else:
            out.append("        if (slot < 0) {\n")
        out.append("            const lmx::elmx_error kept = m_foreign_.create().capture_child(reader, known);\n"
                   "            if (kept != lmx::ELMX_OK) return kept;\n            continue;\n        }\n")
        if info.slots:
            out.append("        rank = k_rank[slot];\n        lmx::elmx_error result = lmx::ELMX_OK;\n        switch (slot) {\n")
        for index, s in enumerate(info.slots):
            n = names[("s", s.ns, s.name)]
            order = "m_order_%d" % s.ordered_set if s.ordered_set is not None else None
            push = ("            %s.push_back(%d);\n" % (order, index)) if order else ""
            out.append("        case %d: {\n" % index)
            child_name = "k_name_%s_%d" % (identifier(cls), index)
            if s.kind == "complex":
                ct = self.target_name(s)
                out.append("            static const std::string %s(%s);\n" % (child_name, cpp_string(s.name)))
                if info.row_limits and s.name == "row":
                    out.append(
                        "            const lmx::c_xml_attribute* r = scanner.find_attribute(\"r\");\n"
                        "            std::int64_t number = row_number + 1;\n"
                        "            if (r && lmx::read_integer(r->value, number) != lmx::ELMX_OK) number = row_number + 1;\n"
                        "            row_number = number;\n"
                        "            if ((first_row >= 0 && number - 1 < first_row) || (last_row >= 0 && number - 1 > last_row)) {\n"
                        "                result = reader.skip_element();\n"
                        "                if (result != lmx::ELMX_OK) return result;\n                continue;\n            }\n"
                        "            if (worker) {\n                worker->reset();\n"
                        "                result = worker->unmarshal(reader, %s);\n"
                        "                if (result == lmx::ELMX_OK) result = handler->row(*worker);\n"
                        "                if (result != lmx::ELMX_OK) return result;\n                continue;\n            }\n"
                        % child_name)
                if s.many:
                    out.append("            m_%s.emplace_back();\n%s" % (n, push))
                    call = "m_%s.back().create().unmarshal(reader, %s" % (n, child_name)
                else:
                    out.append("            if (m_%s) return fail(reader, lmx::ELMX_OCCURRENCE_ERROR, %s, __LINE__);\n"
                               % (n, cpp_string(s.name)))
                    call = "m_%s.create().unmarshal(reader, %s" % (n, child_name)
                if limited and ct == "c_CT_SheetData":
                    call += ", first_row, last_row, handler"
                out.append("            result = %s);\n            if (result != lmx::ELMX_OK) return result;\n" % call)
            else:
                out.append("            if (!scanner.attributes().empty()) {\n"
                           "                const lmx::elmx_error kept = m_foreign_.create().capture_child(reader, known);\n"
                           "                if (kept != lmx::ELMX_OK) return kept;\n                continue;\n            }\n")
                if not s.many:
                    out.append("            if (m_has_%s) return fail(reader, lmx::ELMX_OCCURRENCE_ERROR, %s, __LINE__);\n"
                               % (n, cpp_string(s.name)))
                out.append("            result = reader.get_simple_content(t_text);\n"
                           "            if (result != lmx::ELMX_OK) return result;\n")
                if s.many:
                    out.append("            m_%s.emplace_back();\n%s" % (n, push))
                    field = "m_%s.back()" % n
                else:
                    out.append("            m_has_%s = true;\n" % n)
                    field = "m_%s" % n
                out.append("            result = %s;\n"
                           "            if (result != lmx::ELMX_OK) return fail(reader, result, %s, __LINE__);\n"
                           % (self.read_call(s.target, "t_text", field), cpp_string(s.name)))
            out.append("            break;\n        }\n")
        if info.slots:
            out.append("        default: break;\n        }\n")
        out.append("        ++known;\n    }\n")
        for s in info.slots:
            if s.required:
                n = names[("s", s.ns, s.name)]
                if s.kind == "complex":
                    test = "m_%s.empty()" % n if s.many else "!m_%s" % n
                else:
                    test = "m_%s.empty()" % n if s.many else "!m_has_%s" % n
                # A required child may stand inside markup-compatibility content kept as foreign.
                out.append("    if (%s && (!m_foreign_ || m_foreign_->child_count() == 0))\n"
                           "        return fail(reader, lmx::ELMX_MANDATORY_ELEMENT_MISSING, %s, __LINE__);\n"
                           % (test, cpp_string(s.name)))
        out.append("    return lmx::ELMX_OK;\n}\n\n")
        return "".join(out)

    def marshal_code(self, info):
        names = self.accessor_names(info)
        out = ["lmx::elmx_error %s::marshal(lmx::c_xml_writer& writer, const char* name) const {\n" % info.name,
               "    const std::size_t declared = writer.declared_namespaces().size();\n"
               "    const bool root = writer.depth() == 0;\n    writer.start_element(name);\n"
               "    if (root) declare_namespaces(writer);\n"
               "    if (m_foreign_) m_foreign_->write_namespaces(writer, declared);\n"]
        for a in info.attributes:
            n = names[("a", a.ns, a.name)]
            line = self.attribute_write(a.vtype, self.qname(a.ns, a.name), "m_" + n)
            if a.required:
                out.append("    %s\n" % line)
            else:
                out.append("    if (m_has_%s) %s\n" % (n, line))
        out.append("    if (m_foreign_) m_foreign_->write_attributes(writer);\n")
        if info.simple_content is not None:
            out.append("    %s\n" % self.text_write(info.simple_content, "m_value"))
        # Only complex children hand back a result from their own marshal.
        if any(s.kind == "complex" for s in info.slots):
            out.append("    lmx::elmx_error result = lmx::ELMX_OK;\n")
        out.append("    c_foreign_cursor cursor(m_foreign_.get(), writer);\n")
        done_sets = set()
        for index, s in enumerate(info.slots):
            if s.ordered_set is not None:
                if s.ordered_set in done_sets:
                    continue
                done_sets.add(s.ordered_set)
                members = [(i, t) for i, t in enumerate(info.slots) if t.ordered_set == s.ordered_set]
                out.append("    {\n")
                for i, t in members:
                    out.append("        std::size_t next_%d = 0;\n" % i)
                out.append("        for (unsigned short slot : m_order_%d) {\n            switch (slot) {\n" % s.ordered_set)
                for i, t in members:
                    n = names[("s", t.ns, t.name)]
                    out.append("            case %d:\n                if (next_%d < m_%s.size()) {\n"
                               "                    cursor.next_known();\n%s                }\n                break;\n"
                               % (i, i, n, self.write_item(t, "m_%s[next_%d++]" % (n, i), "                    ")))
                out.append("            default: break;\n            }\n        }\n")
                for i, t in members:
                    n = names[("s", t.ns, t.name)]
                    out.append("        while (next_%d < m_%s.size()) {\n            cursor.next_known();\n%s        }\n"
                               % (i, n, self.write_item(t, "m_%s[next_%d++]" % (n, i), "            ")))
                out.append("    }\n")
                continue
            n = names[("s", s.ns, s.name)]
            if s.many:
                out.append("    for (const auto& item : m_%s) {\n        cursor.next_known();\n%s    }\n"
                           % (n, self.write_item(s, "item", "        ")))
            elif s.kind == "complex":
                out.append("    if (m_%s) {\n        cursor.next_known();\n%s    }\n"
                           % (n, self.write_item(s, "m_%s" % n, "        ")))
            else:
                out.append("    if (m_has_%s) {\n        cursor.next_known();\n%s    }\n"
                           % (n, self.write_item(s, "m_%s" % n, "        ")))
        out.append("    cursor.finish();\n    writer.end_element();\n    return lmx::ELMX_OK;\n}\n\n")
        return "".join(out)

    def write_item(self, s, expr, indent):
        qname = cpp_string(self.qname(s.ns, s.name))
        if s.kind == "complex":
            return ("%sresult = %s->marshal(writer, %s);\n%sif (result != lmx::ELMX_OK) return result;\n"
                    % (indent, expr, qname, indent))
        return ("%swriter.start_element(%s);\n%s%s\n%swriter.end_element();\n"
                % (indent, qname, indent, self.text_write(s.target, expr), indent))


def main():
    folder = sys.argv[1] if len(sys.argv) > 1 else os.path.join(REPO, "source", "ooxml", "generated")
    os.makedirs(folder, exist_ok=True)
    schemas = SchemaSet([os.path.join(HERE, "schemas", "transitional"), os.path.join(HERE, "schemas", "opc")])
    counts = []
    for group in GROUPS:
        count = Emitter(group, schemas).emit(folder)
        counts.append((group.namespace, count))
    with open(os.path.join(folder, "CLASSES.txt"), "w") as out:
        out.write("# Generated by tools/ooxml_codegen/generate.py: classes per group.\n")
        for name, count in counts:
            out.write("%s\t%d\n" % (name, count))
    for name, count in counts:
        print("%-20s %d" % (name, count))


if __name__ == "__main__":
    main()
