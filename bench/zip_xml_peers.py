#!/usr/bin/python3
"""Peers for zip_xml_scan_bench.

  write PATH        writes the 1,000,000-cell workbook with xlsxwriter: 100,000 rows by
                    10 columns, even columns numbers, odd columns strings from a pool of 5,000
  scan PATH [RUNS]  inflates xl/worksheets/sheet1.xml with zipfile and scans the inflated
                    bytes with lxml.etree.iterparse (counting as the C++ scan does, and bare),
                    best of RUNS (3); MB/s = 10^6 bytes of inflated XML per second
"""
import io, sys, time, zipfile

ROWS, COLS, POOL = 100000, 10, 5000
SHEET_PART = "xl/worksheets/sheet1.xml"


def write(path):
    import xlsxwriter
    pool = ["string value %d" % i for i in range(POOL)]
    book = xlsxwriter.Workbook(path)
    sheet = book.add_worksheet("Data")
    for r in range(ROWS):
        for c in range(COLS):
            if c % 2 == 0:
                sheet.write_number(r, c, r * 0.5 + c)
            else:
                sheet.write_string(r, c, pool[(r * COLS + c) % POOL])
    book.close()


def best_of(runs, action):
    best, result = None, None
    for _ in range(runs):
        start = time.perf_counter()
        result = action()
        seconds = time.perf_counter() - start
        best = seconds if best is None or seconds < best else best
    return best, result


def iterparse_counts(data):
    # The counts of the C++ scan: elements, attributes with their value bytes,
    # and character data (text and tails). Finished elements are cleared and
    # dropped from their parent, as a streaming reader of a large sheet would.
    from lxml import etree
    elements = attributes = attribute_bytes = text_bytes = 0
    for _, element in etree.iterparse(io.BytesIO(data), events=("end",)):
        elements += 1
        attrib = element.attrib
        attributes += len(attrib)
        for value in attrib.values():
            attribute_bytes += len(value)
        if element.text:
            text_bytes += len(element.text)
        if element.tail:
            text_bytes += len(element.tail)
        element.clear(keep_tail=True)
        while element.getprevious() is not None:
            del element.getparent()[0]
    return elements, attributes, attribute_bytes, text_bytes


def iterparse_bare(data):
    # lxml's own floor: the events with no work per element.
    from lxml import etree
    for _ in etree.iterparse(io.BytesIO(data), events=("end",)):
        pass


def scan(path, runs):
    with zipfile.ZipFile(path) as archive:
        info = archive.getinfo(SHEET_PART)
        inflate_seconds, data = best_of(runs, lambda: archive.read(SHEET_PART))
    size = len(data)
    assert size == info.file_size
    scan_seconds, counts = best_of(runs, lambda: iterparse_counts(data))
    print("lxml counts: %d elements, %d attributes (%d value bytes), %d text bytes" % counts)
    print("RESULT zipfile-inflate %.1f MB/s %.4f s" % (size / 1e6 / inflate_seconds, inflate_seconds))
    bare_seconds, _ = best_of(runs, lambda: iterparse_bare(data))
    print("RESULT lxml-iterparse %.1f MB/s %.4f s" % (size / 1e6 / scan_seconds, scan_seconds))
    print("RESULT lxml-iterparse-bare %.1f MB/s %.4f s" % (size / 1e6 / bare_seconds, bare_seconds))


if __name__ == "__main__":
    mode, target = sys.argv[1], sys.argv[2]
    if mode == "write":
        start = time.perf_counter()
        write(target)
        print("xlsxwriter wrote %d cells in %.1f s" % (ROWS * COLS, time.perf_counter() - start))
    else:
        scan(target, int(sys.argv[3]) if len(sys.argv) > 3 else 3)
