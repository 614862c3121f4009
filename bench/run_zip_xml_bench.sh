#!/usr/bin/env bash
# Builds zip_xml_scan_bench and compares inflating and scanning the sheet part of a
# 1,000,000-cell workbook with zlib itself, zipfile and lxml iterparse, in one run.
#   bench/run_zip_xml_bench.sh [book.xlsx]   (without a book, xlsxwriter writes one)
set -euo pipefail
cd "$(dirname "$0")/.."
runs=${RUNS:-3}
cmake -S . -B build-bench -G Ninja -DCMAKE_BUILD_TYPE=Release -DQUIRE_TESTS=OFF >/dev/null
ninja -C build-bench -j2 zip_xml_scan_bench >/dev/null
dir=$(mktemp -d)
trap 'rm -rf "$dir"' EXIT
book=${1:-}
if [ -z "$book" ]; then
    book="$dir/cells.xlsx"
    /usr/bin/python3 bench/zip_xml_peers.py write "$book"
fi
build-bench/bench/zip_xml_scan_bench "$book" "$runs" | tee "$dir/quire.txt"
/usr/bin/python3 bench/zip_xml_peers.py scan "$book" "$runs" | tee "$dir/peers.txt"
echo
printf '%-26s %10s %10s\n' "step (sheet1.xml)" "MB/s" "seconds"
grep -h '^RESULT' "$dir/quire.txt" "$dir/peers.txt" | while read -r _ name rate _ seconds _; do
    printf '%-26s %10s %10s\n' "$name" "$rate" "$seconds"
done
