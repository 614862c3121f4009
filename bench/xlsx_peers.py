#!/usr/bin/python3
"""The same 1,000,000 cells read by openpyxl in read-only mode, with seconds and peak memory."""
import resource, sys, time

ROWS, COLS, POOL = 100000, 10, 5000


def cpu_seconds():
    usage = resource.getrusage(resource.RUSAGE_SELF)
    return usage.ru_utime + usage.ru_stime


def peak_mb():
    return resource.getrusage(resource.RUSAGE_SELF).ru_maxrss / 1024.0


def read(path):
    import openpyxl
    book = openpyxl.load_workbook(path, read_only=True)
    sheet = book.worksheets[0]
    total, chars, cells = 0.0, 0, 0
    for row in sheet.iter_rows(min_row=1, max_row=ROWS, max_col=COLS, values_only=True):
        for c, v in enumerate(row):
            cells += 1
            if c % 2 == 0:
                total += v
            else:
                chars += len(v)
    book.close()
    if cells != ROWS * COLS:
        sys.stderr.write("read %d cells, expected %d\n" % (cells, ROWS * COLS))
    sys.stderr.write("checksum %.1f %d\n" % (total, chars))


if __name__ == "__main__":
    mode, path = sys.argv[1], sys.argv[2]
    if mode != "read":
        sys.exit("usage: xlsx_peers.py read FILE")
    start = time.monotonic()
    read(path)
    print("openpyxl read: %.3f s (cpu %.3f s), peak %.1f MB" % (time.monotonic() - start, cpu_seconds(), peak_mb()))
