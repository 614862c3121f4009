"""Reads XML Schema files into the few structures the binding generator needs.

Only the parts of XML Schema that the Office Open XML and OPC schemas use are handled:
global and local elements, complex types with sequence/choice/all/group content,
complexContent extension and restriction, simpleContent extension, attribute groups,
attribute references, wildcards, and simple types by restriction, list and union.
"""
import os
import xml.etree.ElementTree as ET

XSD = "http://www.w3.org/2001/XMLSchema"
XML_NS = "http://www.w3.org/XML/1998/namespace"


def q(local):
    return "{%s}%s" % (XSD, local)


def occurs(node, name, default=1):
    value = node.get(name)
    if value is None:
        return default
    if value == "unbounded":
        return 1 << 30
    return int(value)


class Schema:
    """One schema file: its target namespace, prefix bindings and top-level nodes."""

    def __init__(self, path):
        self.path = path
        self.prefixes = {}
        for event, item in ET.iterparse(path, events=("start-ns",)):
            prefix, uri = item
            self.prefixes.setdefault(prefix, uri)
        self.root = ET.parse(path).getroot()
        self.target = self.root.get("targetNamespace", "")
        self.qualified_elements = self.root.get("elementFormDefault") == "qualified"
        self.qualified_attributes = self.root.get("attributeFormDefault") == "qualified"

    def resolve(self, qname):
        if ":" in qname:
            prefix, local = qname.split(":", 1)
            if prefix == "xml":
                return (XML_NS, local)
            return (self.prefixes[prefix], local)
        return (self.prefixes.get("", ""), qname)


class SchemaSet:
    """Every schema of a folder tree, with its definitions by (namespace, name)."""

    def __init__(self, folders):
        self.complex_types = {}
        self.simple_types = {}
        self.elements = {}
        self.groups = {}
        self.attribute_groups = {}
        self.attributes = {}
        for folder in folders:
            for name in sorted(os.listdir(folder)):
                if name.endswith(".xsd"):
                    self._add(Schema(os.path.join(folder, name)))
        # xml:space and friends, which the schemas reference without importing.
        self.attributes[(XML_NS, "space")] = None

    def _add(self, schema):
        tables = {
            "complexType": self.complex_types,
            "simpleType": self.simple_types,
            "element": self.elements,
            "group": self.groups,
            "attributeGroup": self.attribute_groups,
            "attribute": self.attributes,
        }
        for node in schema.root:
            kind = node.tag.split("}")[-1]
            if kind in tables and node.get("name"):
                tables[kind][(schema.target, node.get("name"))] = (schema, node)
