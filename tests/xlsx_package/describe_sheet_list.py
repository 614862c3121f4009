"""Describes the sheet list of saved packages as openpyxl reads it, and checks the package
bookkeeping behind it.

Usage: describe_sheet_list.py ORIGINAL SAVED [SAVED ...]

For each saved package prints a block that starts with "== SAVED" and has, one a line:
  sheets NAME|NAME|...                    sheet order as openpyxl reads it
  content NAME=SOURCE                     the sheet of ORIGINAL whose cells the sheet holds ("new" when empty)
  area NAME=REFERENCE                     print area of a sheet
  name NAME@SCOPE=VALUE                   a defined name other than print areas; SCOPE is a sheet or "book"
  problem TEXT                            a fault in relationships, content types or sheet ids
"""
import posixpath
import sys
import zipfile
import xml.etree.ElementTree as ET

import openpyxl

MAIN = "{http://schemas.openxmlformats.org/spreadsheetml/2006/main}"
REL = "{http://schemas.openxmlformats.org/officeDocument/2006/relationships}"
PKG_REL = "{http://schemas.openxmlformats.org/package/2006/relationships}"
TYPES = "{http://schemas.openxmlformats.org/package/2006/content-types}"
WORKSHEET_REL = "http://schemas.openxmlformats.org/officeDocument/2006/relationships/worksheet"
WORKSHEET_TYPE = "application/vnd.openxmlformats-officedocument.spreadsheetml.worksheet+xml"


def fingerprint(sheet):
    cells = tuple(row for row in sheet.iter_rows(values_only=True) if any(v is not None for v in row))
    return cells


def rels_name(part):
    folder, base = posixpath.split(part)
    return posixpath.join(folder, "_rels", base + ".rels")


def package_problems(path):
    problems = []
    with zipfile.ZipFile(path) as archive:
        entries = set(archive.namelist())
        types = ET.fromstring(archive.read("[Content_Types].xml"))
        overrides = {o.get("PartName").lstrip("/"): o.get("ContentType") for o in types.iter(TYPES + "Override")}
        defaults = {d.get("Extension").lower(): d.get("ContentType") for d in types.iter(TYPES + "Default")}
        for part in sorted(overrides):
            if part not in entries:
                problems.append("override for missing part /" + part)
        workbook = ET.fromstring(archive.read("xl/workbook.xml"))
        rels = ET.fromstring(archive.read("xl/_rels/workbook.xml.rels"))
        targets = {}
        for rel in rels.iter(PKG_REL + "Relationship"):
            if rel.get("TargetMode") == "External":
                continue
            target = posixpath.normpath(posixpath.join("xl", rel.get("Target"))).lstrip("/")
            if rel.get("Target").startswith("/"):
                target = rel.get("Target").lstrip("/")
            targets[rel.get("Id")] = (rel.get("Type"), target)
            if target not in entries:
                problems.append("relationship %s to missing part /%s" % (rel.get("Id"), target))
        worksheet_targets = {t for k, t in targets.values() if k == WORKSHEET_REL}
        sheets = list(workbook.iter(MAIN + "sheet"))
        ids, rids, used_targets = set(), set(), set()
        for sheet in sheets:
            name, sheet_id, rid = sheet.get("name"), sheet.get("sheetId"), sheet.get(REL + "id")
            if sheet_id in ids:
                problems.append("sheetId %s twice" % sheet_id)
            ids.add(sheet_id)
            if rid in rids:
                problems.append("r:id %s twice" % rid)
            rids.add(rid)
            if rid not in targets:
                problems.append("sheet %s: no relationship %s" % (name, rid))
                continue
            kind, target = targets[rid]
            used_targets.add(target)
            content_type = overrides.get(target, defaults.get(target.rsplit(".", 1)[-1].lower()))
            if kind == WORKSHEET_REL and content_type != WORKSHEET_TYPE:
                problems.append("sheet %s: part /%s has content type %s" % (name, target, content_type))
        for target in sorted(worksheet_targets - used_targets):
            problems.append("worksheet relationship to /%s without a sheet" % target)
        for part, content_type in overrides.items():
            if content_type == WORKSHEET_TYPE and part not in worksheet_targets:
                problems.append("worksheet part /%s not related to the workbook" % part)
        for entry in sorted(entries):
            if entry.startswith("xl/worksheets/_rels/"):
                owner = posixpath.join("xl/worksheets", posixpath.basename(entry)[: -len(".rels")])
                if owner not in entries:
                    problems.append("relationships /%s of a missing part" % entry)
            if entry.startswith("xl/worksheets/") and entry.endswith(".xml") and entry not in worksheet_targets:
                problems.append("part /%s left behind" % entry)
        for target in worksheet_targets:
            if rels_name(target) not in entries:
                continue
            sheet_rels = ET.fromstring(archive.read(rels_name(target)))
            for rel in sheet_rels.iter(PKG_REL + "Relationship"):
                if rel.get("TargetMode") == "External":
                    continue
                resolved = posixpath.normpath(posixpath.join(posixpath.dirname(target), rel.get("Target")))
                if resolved not in entries:
                    problems.append("/%s: relationship to missing part /%s" % (target, resolved))
        for name in workbook.iter(MAIN + "definedName"):
            scope = name.get("localSheetId")
            if scope is not None and not 0 <= int(scope) < len(sheets):
                problems.append("name %s: localSheetId %s out of range" % (name.get("name"), scope))
    return problems


def dangling_sheet_ids(path):
    """r:id attributes of a worksheet that its relationships part does not define."""
    problems = []
    with zipfile.ZipFile(path) as archive:
        entries = set(archive.namelist())
        for entry in sorted(entries):
            if not (entry.startswith("xl/worksheets/") and entry.endswith(".xml") and "/_rels/" not in entry):
                continue
            known = set()
            if rels_name(entry) in entries:
                known = {r.get("Id") for r in ET.fromstring(archive.read(rels_name(entry))).iter(PKG_REL + "Relationship")}
            for element in ET.fromstring(archive.read(entry)).iter():
                rid = element.get(REL + "id")
                if rid is not None and rid not in known:
                    problems.append("/%s: %s r:id=%s has no relationship" % (entry, element.tag.split("}")[-1], rid))
    return problems


def main():
    original = openpyxl.load_workbook(sys.argv[1])
    sources = {}
    for sheet in original.worksheets:
        sources.setdefault(fingerprint(sheet), sheet.title)
    for path in sys.argv[2:]:
        print("== SAVED " + path)
        book = openpyxl.load_workbook(path)
        print("sheets " + "|".join(book.sheetnames))
        for sheet in book.worksheets:
            cells = fingerprint(sheet)
            print("content %s=%s" % (sheet.title, "new" if not cells else sources.get(cells, "unknown")))
        for sheet in book.worksheets:
            if sheet.print_area:
                area = sheet.print_area if isinstance(sheet.print_area, str) else ",".join(sheet.print_area)
                print("area %s=%s" % (sheet.title, area))
        for name in book.defined_names.definedName:
            scope = "book" if name.localSheetId is None else book.sheetnames[int(name.localSheetId)]
            print("name %s@%s=%s" % (name.name, scope, name.attr_text))
        for problem in package_problems(path) + dangling_sheet_ids(path):
            print("problem " + problem)


if __name__ == "__main__":
    main()
