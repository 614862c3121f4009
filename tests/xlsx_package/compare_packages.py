"""Compares packages before and after a load and save.

    compare_packages.py LIST

LIST holds one "original<TAB>saved" pair a line. For each pair the saved package must have
the original's parts less the calculation chain; parts that are byte-identical pass, other
parts must be the same XML: elements, attributes, text and order. Namespace declarations,
prefixes, comments and white space between elements do not count, nor calcPr of the
workbook; values equal as numbers, as booleans (true/1, false/0) or as hex digits in another
case are equal; white space alone counts only under xml:space="preserve". Prints "OK <saved>" or "FAIL <saved>: <reason>" per pair.
"""
import sys
import zipfile

from lxml import etree

PARSER = etree.XMLParser(huge_tree=True, remove_comments=True, remove_pis=True, resolve_entities=False)


def same_value(a, b):
    if a == b:
        return True
    booleans = {"true": "1", "1": "1", "false": "0", "0": "0"}
    if a in booleans and b in booleans:
        return booleans[a] == booleans[b]
    try:
        return float(a) == float(b)
    except ValueError:
        pass
    hexdigits = set("0123456789abcdefABCDEF")
    if a and set(a) <= hexdigits and set(b) <= hexdigits:
        return a.lower() == b.lower()
    return False


def text_of(value):
    return value if value is not None else ""


def dropped(element, in_workbook):
    """What a save leaves out on purpose: calcPr is rewritten, the calculation chain dropped."""
    if in_workbook and element.tag.endswith("}calcPr"):
        return True
    if element.tag.endswith("}Override") and element.get("PartName", "").lower() == "/xl/calcchain.xml":
        return True
    if element.tag.endswith("}Relationship") and element.get("Target", "") in ("calcChain.xml", "/xl/calcChain.xml"):
        return True
    return False


def compare(a, b, path, skip_calc):
    if a.tag != b.tag:
        return "%s: element %s became %s" % (path, a.tag, b.tag)
    if set(a.attrib) != set(b.attrib):
        return "%s/%s: attributes %s became %s" % (path, a.tag, sorted(a.attrib), sorted(b.attrib))
    for name in a.attrib:
        if not same_value(a.attrib[name], b.attrib[name]):
            return "%s/%s: @%s %r became %r" % (path, a.tag, name, a.attrib[name], b.attrib[name])
    ca = [c for c in a if isinstance(c.tag, str) and not dropped(c, skip_calc)]
    cb = [c for c in b if isinstance(c.tag, str) and not dropped(c, skip_calc)]
    ta, tb = text_of(a.text), text_of(b.text)
    if ca or cb:
        ta, tb = ta.strip(), tb.strip()
    if not ta.strip() and not tb.strip() and a.get("{http://www.w3.org/XML/1998/namespace}space") != "preserve":
        ta, tb = "", ""  # white space alone in an element without preserved space
    if ta != tb and not same_value(ta, tb):
        return "%s/%s: text %r became %r" % (path, a.tag, ta[:40], tb[:40])
    if len(ca) != len(cb):
        return "%s/%s: %d children became %d (%s / %s)" % (
            path, a.tag, len(ca), len(cb), [c.tag.split('}')[-1] for c in ca][:8], [c.tag.split('}')[-1] for c in cb][:8])
    for x, y in zip(ca, cb):
        if text_of(x.tail).strip() != text_of(y.tail).strip():
            return "%s/%s: tail text differs" % (path, x.tag)
        problem = compare(x, y, path + "/" + a.tag.split("}")[-1], False)
        if problem:
            return problem
    return None


def compare_packages(original, saved):
    with zipfile.ZipFile(original) as za, zipfile.ZipFile(saved) as zb:
        names_a = {n for n in za.namelist() if not n.endswith("/")}
        names_b = set(zb.namelist())
        # Parts that the original lists without a content type are not parts of the package.
        types = etree.fromstring(next(za.read(n) for n in names_a if n.lower() == "[content_types].xml"), PARSER)
        expected = set()
        overrides = {e.get("PartName").lower() for e in types if e.tag.endswith("Override")}
        defaults = {e.get("Extension").lower() for e in types if e.tag.endswith("Default")}
        for n in names_a:
            if n.lower() == "[content_types].xml" or ("/" + n).lower() in overrides or \
                    ("." in n.rsplit("/", 1)[-1] and n.rsplit(".", 1)[-1].lower() in defaults):
                expected.add(n)
        expected.discard("xl/calcChain.xml")
        if expected != names_b:
            return "parts differ: missing %s, extra %s" % (sorted(expected - names_b)[:5], sorted(names_b - expected)[:5])
        for n in sorted(expected):
            a, b = za.read(n), zb.read(n)
            if a == b:
                continue
            try:
                ea, eb = etree.fromstring(a, PARSER), etree.fromstring(b, PARSER)
            except etree.XMLSyntaxError as error:
                return "%s: not the same bytes and not XML (%s)" % (n, error)
            problem = compare(ea, eb, n, n == "xl/workbook.xml" or n.endswith("workbook.xml"))
            if problem:
                return problem
    return None


def main():
    with open(sys.argv[1], encoding="utf-8") as pairs:
        for line in pairs:
            original, saved = line.rstrip("\n").split("\t")
            try:
                problem = compare_packages(original, saved)
            except Exception as error:  # a broken original is reported, not fatal
                problem = "comparison failed: %r" % (error,)
            print(("FAIL %s: %s" % (saved, problem)) if problem else ("OK %s" % saved), flush=True)


if __name__ == "__main__":
    main()
