#!/usr/bin/python3
"""The same 1,000,000 cells written by xlwt and read by xlrd, with seconds and peak memory."""
import resource, sys, time

ROWS, COLS, POOL = 65536, 16, 5000


def cpu_seconds():
    usage = resource.getrusage(resource.RUSAGE_SELF)
    return usage.ru_utime + usage.ru_stime


def peak_mb():
    return resource.getrusage(resource.RUSAGE_SELF).ru_maxrss / 1024.0


def write(path):
    import xlwt
    pool = ["string value %d" % i for i in range(POOL)]
    book = xlwt.Workbook()
    sheet = book.add_sheet("Data")
    for r in range(ROWS):
        row = sheet.row(r)
        for c in range(COLS):
            row.write(c, r * 0.5 + c if c % 2 == 0 else pool[(r * COLS + c) % POOL])
    book.save(path)


def read(path):
    import xlrd
    book = xlrd.open_workbook(path)
    sheet = book.sheet_by_index(0)
    total, chars = 0.0, 0
    for r in range(ROWS):
        for c in range(COLS):
            v = sheet.cell_value(r, c)
            if c % 2 == 0:
                total += v
            else:
                chars += len(v)
    sys.stderr.write("checksum %.1f %d\n" % (total, chars))


if __name__ == "__main__":
    mode, path = sys.argv[1], sys.argv[2]
    start = time.monotonic()
    (write if mode == "write" else read)(path)
    name = "xlwt" if mode == "write" else "xlrd"
    print("%s %s: %.3f s (cpu %.3f s), peak %.1f MB" % (name, mode, time.monotonic() - start, cpu_seconds(), peak_mb()))
