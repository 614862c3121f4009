"""Turns schema definitions into class descriptions for the C++ emitter.

A class has attributes (with a value kind and a default), an optional simple content
value, and child slots in schema order. Choice alternatives become optional slots; a
repeated compositor holding several elements becomes an ordered set, whose document
order is kept in a list of slot numbers next to the per-slot lists.
"""
import re

from xsd_model import XSD, XML_NS, occurs, q

MANY = 1 << 30

# XML Schema built-in types and the value kind that holds them.
BUILTIN_KINDS = {
    "boolean": "bool",
    "unsignedInt": "u32", "unsignedShort": "u16", "unsignedByte": "u8",
    "int": "i32", "short": "i16", "byte": "i8",
    "long": "i64", "integer": "i64", "nonNegativeInteger": "i64", "positiveInteger": "i64",
    "negativeInteger": "i64", "nonPositiveInteger": "i64",
    "unsignedLong": "u64",
    "double": "double", "float": "double", "decimal": "double",
    "hexBinary": "hex", "base64Binary": "base64",
}


# Values that later editions of the standard added to enumerations of these schemas and that
# real files use (the date cell type of ISO/IEC 29500).
ENUM_ADDITIONS = {"ST_CellType": ["d"]}


class ValueType:
    """A simple type as the generated code holds it."""

    def __init__(self, kind, name=None, values=None):
        self.kind = kind          # string, bool, u32, ..., double, hex, base64, enum
        self.name = name          # simple type name for enums
        self.values = values or []

    def key(self):
        return (self.kind, self.name)


class Attribute:
    def __init__(self, ns, name, vtype, required, default):
        self.ns, self.name, self.vtype, self.required, self.default = ns, name, vtype, required, default


class Slot:
    def __init__(self, ns, name, kind, target, required, many, ordered_set):
        self.ns, self.name = ns, name
        self.kind = kind              # complex, simple
        self.target = target          # class key for complex, ValueType for simple
        self.required = required
        self.many = many
        self.ordered_set = ordered_set  # None or set number


class ClassInfo:
    def __init__(self, key, name):
        self.key = key
        self.name = name              # C++ class name
        self.attributes = []
        self.slots = []
        self.simple_content = None    # ValueType
        self.ordered_sets = 0
        self.wildcard = False
        self.row_limits = False       # passes row bounds down (sheet data)


class Resolver:
    def __init__(self, schemas, namespace_map=None):
        self.s = schemas
        self.namespace_map = namespace_map or {}
        self.classes = {}
        self.enums = {}

    def ns(self, uri):
        return self.namespace_map.get(uri, uri)

    # ---- simple types ----
    def value_type(self, schema, qname):
        ns, local = schema.resolve(qname)
        return self.value_type_of(ns, local)

    def value_type_of(self, ns, local):
        if ns == XSD:
            return ValueType(BUILTIN_KINDS.get(local, "string"))
        found = self.s.simple_types.get((ns, local))
        if found is None:
            return ValueType("string")
        schema, node = found
        return self.simple_node(schema, node, local)

    def simple_node(self, schema, node, name):
        restriction = node.find(q("restriction"))
        if restriction is None:
            return ValueType("string")   # list or union
        values = [e.get("value") for e in restriction.findall(q("enumeration"))]
        base = restriction.get("base")
        if base is None:
            inner = restriction.find(q("simpleType"))
            base_type = self.simple_node(schema, inner, name) if inner is not None else ValueType("string")
        else:
            base_type = self.value_type(schema, base)
        values = values + [v for v in ENUM_ADDITIONS.get(name, []) if v not in values]
        if values and base_type.kind in ("string", "enum"):
            vt = ValueType("enum", name, values)
            self.enums[name] = vt
            return vt
        return base_type

    # ---- complex types ----
    def class_for(self, key):
        if key in self.classes:
            return self.classes[key]
        schema, node = self.s.complex_types[key]
        info = ClassInfo(key, "c_" + key[1])
        self.classes[key] = info
        self.fill(info, schema, node)
        return info

    def fill(self, info, schema, node):
        particles = []
        content = node
        simple = node.find(q("simpleContent"))
        complex_content = node.find(q("complexContent"))
        if simple is not None:
            ext = simple.find(q("extension"))
            if ext is None:
                ext = simple.find(q("restriction"))
            info.simple_content = self.value_type(schema, ext.get("base"))
            content = ext
        elif complex_content is not None:
            ext = complex_content.find(q("extension"))
            if ext is not None:
                base = self.class_for(schema.resolve(ext.get("base")))
                info.attributes.extend(base.attributes)
                particles.append(("base", base))
                content = ext
            else:
                content = complex_content.find(q("restriction"))
        self.attributes(info, schema, content)
        for child in content:
            tag = child.tag.split("}")[-1]
            if tag in ("sequence", "choice", "all", "group"):
                particles.append(self.particle(schema, child))
        self.flatten(info, particles)

    def attributes(self, info, schema, node):
        for child in node:
            tag = child.tag.split("}")[-1]
            if tag == "attribute":
                if child.get("ref"):
                    ns, local = schema.resolve(child.get("ref"))
                    found = self.s.attributes.get((ns, local))
                    if found is None:
                        vt = ValueType("string")
                    else:
                        a_schema, a_node = found
                        vt = self.attribute_type(a_schema, a_node)
                    info.attributes.append(Attribute(self.ns(ns), local, vt, child.get("use") == "required",
                                                     child.get("default")))
                else:
                    vt = self.attribute_type(schema, child)
                    ns = schema.target if schema.qualified_attributes else ""
                    info.attributes.append(Attribute(self.ns(ns), child.get("name"), vt,
                                                     child.get("use") == "required", child.get("default")))
            elif tag == "attributeGroup":
                g_schema, g_node = self.s.attribute_groups[schema.resolve(child.get("ref"))]
                self.attributes(info, g_schema, g_node)

    def attribute_type(self, schema, node):
        if node.get("type"):
            return self.value_type(schema, node.get("type"))
        inner = node.find(q("simpleType"))
        if inner is not None:
            return self.simple_node(schema, inner, "ST_" + node.get("name"))
        return ValueType("string")

    def particle(self, schema, node):
        tag = node.tag.split("}")[-1]
        lo, hi = occurs(node, "minOccurs"), occurs(node, "maxOccurs")
        if tag == "element":
            if node.get("ref"):
                ns, local = schema.resolve(node.get("ref"))
                e_schema, e_node = self.s.elements[(ns, local)]
                return ("element", ns, local, e_schema, e_node.get("type"), lo, hi)
            ns = schema.target if schema.qualified_elements else ""
            return ("element", ns, node.get("name"), schema, node.get("type"), lo, hi)
        if tag == "group":
            g_schema, g_node = self.s.groups[schema.resolve(node.get("ref"))]
            inner = [c for c in g_node if c.tag.split("}")[-1] in ("sequence", "choice", "all")][0]
            compositor = self.particle(g_schema, inner)
            return (compositor[0], compositor[1], lo * compositor[2], hi if hi > 1 else compositor[3])
        if tag == "any":
            return ("any", lo, hi)
        children = [self.particle(schema, c) for c in node
                    if c.tag.split("}")[-1] in ("element", "sequence", "choice", "all", "group", "any")]
        return (tag, children, lo, hi)

    def flatten(self, info, particles):
        names = {}

        def count_elements(p):
            if p[0] == "element":
                return 1
            if p[0] in ("sequence", "choice", "all"):
                return sum(count_elements(c) for c in p[1])
            return 0

        def walk(p, required, many, ordered):
            kind = p[0]
            if kind == "base":
                for slot in p[1].slots:
                    info.slots.append(slot)
                    names[(slot.ns, slot.name)] = slot
                info.ordered_sets = max(info.ordered_sets, p[1].ordered_sets)
                info.wildcard = info.wildcard or p[1].wildcard
                return
            if kind == "any":
                info.wildcard = True
                return
            if kind == "element":
                _, ns, local, e_schema, type_name, lo, hi = p
                slot_ns = self.ns(ns)
                if (slot_ns, local) in names:
                    names[(slot_ns, local)].many = True
                    return
                if type_name is None:
                    target, skind = ValueType("string"), "simple"
                else:
                    t_ns, t_local = e_schema.resolve(type_name)
                    if (t_ns, t_local) in self.s.complex_types:
                        target, skind = (t_ns, t_local), "complex"
                    elif local == "t" and t_local == "ST_Xstring":
                        target, skind = ("", "ST_Xstring_space"), "complex"
                    else:
                        target, skind = self.value_type_of(t_ns, t_local), "simple"
                slot = Slot(slot_ns, local, skind, target, required and lo >= 1, many or hi > 1, ordered)
                names[(slot_ns, local)] = slot
                info.slots.append(slot)
                return
            _, children, lo, hi = p
            inner_ordered = ordered
            if ordered is None and hi > 1 and count_elements(p) > 1:
                inner_ordered = info.ordered_sets
                info.ordered_sets += 1
            for c in children:
                walk(c, required and lo >= 1 and kind != "choice", many or hi > 1, inner_ordered)

        for p in particles:
            walk(p, True, False, None)


def identifier(text):
    result = re.sub(r"[^0-9A-Za-z_]", "_", text)
    return result
