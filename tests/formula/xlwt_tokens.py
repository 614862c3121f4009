#!/usr/bin/python3
"""Writes formulas with xlwt (an independent .xls writer) and prints the
token bytes it stored: one formula text per line on stdin; output lines
"F <row> <rgce hex>" per Formula record and "X <index> <iSupBook> <first>
<last>" per ExternSheet entry."""
import struct
import sys
import tempfile

import xlwt
from xlrd import compdoc


def main():
    formulas = [line.rstrip("\n") for line in sys.stdin if line.strip()]
    book = xlwt.Workbook()
    sheets = [book.add_sheet(name) for name in ("Sheet1", "Sheet2", "Sheet3")]
    for row, text in enumerate(formulas):
        sheets[0].write(row, 0, xlwt.Formula(text))
    with tempfile.NamedTemporaryFile(suffix=".xls") as f:
        book.save(f.name)
        data = open(f.name, "rb").read()
    stream = compdoc.CompDoc(data, logfile=sys.stderr).get_named_stream("Workbook")
    pos = 0
    while pos + 4 <= len(stream):
        rtype, length = struct.unpack_from("<HH", stream, pos)
        body = stream[pos + 4:pos + 4 + length]
        pos += 4 + length
        if rtype == 0x0006:
            row = struct.unpack_from("<H", body, 0)[0]
            cce = struct.unpack_from("<H", body, 20)[0]
            print("F", row, body[22:22 + cce].hex())
        elif rtype == 0x0017:
            count = struct.unpack_from("<H", body, 0)[0]
            for i in range(count):
                sup, first, last = struct.unpack_from("<HHH", body, 2 + 6 * i)
                print("X", i, sup, first, last)


if __name__ == "__main__":
    main()
