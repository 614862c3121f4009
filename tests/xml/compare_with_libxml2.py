#!/usr/bin/python3
"""Compares the events of our XML reader with libxml2 (lxml) over the XML
parts of the corpus workbooks marked ok, and checks that what our writer
writes back reads in libxml2 as the same events.

usage: compare_with_libxml2.py XML_DUMP WORK_DIR --corpus CORPUS_DIR
       compare_with_libxml2.py XML_DUMP WORK_DIR --files FILE...
Exit status 0 when everything agrees, 1 otherwise."""
import os
import re
import shutil
import subprocess
import sys
import zipfile

from lxml import etree

ARCHIVE = re.compile(r'\.(xlsx|xlsm|xltx)$', re.IGNORECASE)
XML_PART = re.compile(r'\.(xml|rels|vml)$', re.IGNORECASE)


def escape(text):
    out = []
    for c in text:
        if c == '\\':
            out.append('\\\\')
        elif c == '\n':
            out.append('\\n')
        elif c == '\r':
            out.append('\\r')
        elif c == '\t':
            out.append('\\t')
        elif ord(c) < 0x20:
            out.append('\\x%02x' % ord(c))
        else:
            out.append(c)
    return ''.join(out)


def name(tag):
    return tag if tag.startswith('{') else '{}' + tag


def lxml_events(path):
    """Canonical event lines as the dump tool prints them, or None when
    libxml2 refuses the document."""
    parser = etree.XMLParser(resolve_entities=True, huge_tree=True, load_dtd=False, no_network=True)
    try:
        root = etree.parse(path, parser).getroot()
    except etree.XMLSyntaxError:
        return None
    lines = []

    def walk(element):
        lines.append('S ' + name(element.tag))
        for key, value in element.attrib.items():
            lines.append('A ' + name(key) + '=' + escape(value))
        text = element.text or ''
        for child in element:
            if isinstance(child.tag, str):
                if text:
                    lines.append('T ' + escape(text))
                    text = ''
                walk(child)
            text += child.tail or ''
        if text:
            lines.append('T ' + escape(text))
        lines.append('E')

    walk(root)
    return lines


def split_dump(output):
    """Our tool's output as {path: [event lines]}."""
    files = {}
    current = None
    for line in output.split('\n'):
        if line.startswith('F '):
            current = files.setdefault(line[2:], [])
        elif line and current is not None:
            current.append(line)
    return files


def first_difference(expected, actual):
    for i, (e, a) in enumerate(zip(expected, actual)):
        if e != a:
            return 'event %d: libxml2 %r, ours %r' % (i, e[:200], a[:200])
    return 'lengths %d (libxml2) and %d (ours); next: %r' % (
        len(expected), len(actual), (expected[len(actual):] or actual[len(expected):])[:1])


def main():
    sys.setrecursionlimit(20000)
    dump_tool, work, mode = sys.argv[1:4]
    parts_dir = os.path.join(work, 'parts')
    rewritten_dir = os.path.join(work, 'rewritten')
    for folder in (parts_dir, rewritten_dir):
        shutil.rmtree(folder, ignore_errors=True)
        os.makedirs(folder)

    paths = []
    if mode == '--files':
        for origin in sys.argv[4:]:
            path = os.path.join(parts_dir, '%d.xml' % len(paths))
            shutil.copyfile(origin, path)
            paths.append((path, origin))
    else:
        extract_corpus_parts(sys.argv[4], parts_dir, paths)
    run_comparison(dump_tool, work, parts_dir, rewritten_dir, paths)


def extract_corpus_parts(corpus, parts_dir, paths):
    with open(os.path.join(corpus, 'MANIFEST.tsv'), encoding='utf-8') as manifest:
        for line in manifest:
            status, _, archive = line.rstrip('\n').partition('\t')
            if status != 'ok' or not ARCHIVE.search(archive):
                continue
            with zipfile.ZipFile(os.path.join(corpus, archive)) as package:
                for entry in package.infolist():
                    if not XML_PART.search(entry.filename):
                        continue
                    path = os.path.join(parts_dir, '%d.xml' % len(paths))
                    with open(path, 'wb') as part:
                        part.write(package.read(entry))
                    paths.append((path, archive + ':' + entry.filename))


def run_comparison(dump_tool, work, parts_dir, rewritten_dir, paths):
    list_file = os.path.join(work, 'parts.txt')
    with open(list_file, 'w', encoding='utf-8') as listing:
        listing.write(''.join(path + '\n' for path, _ in paths))
    result = subprocess.run([dump_tool, '--rewrite', rewritten_dir, '--list', list_file],
                            stdout=subprocess.PIPE, check=False)
    ours = split_dump(result.stdout.decode('utf-8', errors='replace'))

    problems = []
    compared = 0
    for index, (path, origin) in enumerate(paths):
        expected = lxml_events(path)
        actual = ours.get(path)
        if actual is None:
            problems.append('%s: no output from the dump tool' % origin)
            continue
        refused = bool(actual) and actual[-1].startswith('X ')
        if expected is None:
            if not refused:
                problems.append('%s: libxml2 refuses it, we accept it' % origin)
            continue
        if refused:
            problems.append('%s: we refuse it: %s' % (origin, actual[-1]))
            continue
        if expected != actual:
            problems.append('%s: %s' % (origin, first_difference(expected, actual)))
            continue
        rewritten = lxml_events(os.path.join(rewritten_dir, '%d.xml' % index))
        if rewritten != expected:
            problems.append('%s: written back, libxml2 reads %s' % (
                origin, 'an error' if rewritten is None else first_difference(expected, rewritten)))
            continue
        compared += 1

    print('%d XML parts, %d agree with libxml2 when read and when written back' % (len(paths), compared))
    for problem in problems[:30]:
        print('MISMATCH ' + problem)
    if len(problems) > 30:
        print('... and %d more' % (len(problems) - 30))
    sys.exit(0 if not problems and paths else 1)


if __name__ == '__main__':
    main()
