#!/usr/bin/env bash
# Builds the benchmark and compares quire with xlwt (writing) and xlrd (reading) in one run.
set -euo pipefail
cd "$(dirname "$0")/.."
cmake -S . -B build-bench -G Ninja -DCMAKE_BUILD_TYPE=Release -DQUIRE_TESTS=OFF >/dev/null
ninja -C build-bench -j2 xls_cells_bench >/dev/null
dir=$(mktemp -d)
trap 'rm -rf "$dir"' EXIT
build-bench/bench/xls_cells_bench write "$dir/quire.xls"
/usr/bin/python3 bench/xls_peers.py write "$dir/xlwt.xls"
build-bench/bench/xls_cells_bench read "$dir/quire.xls"
/usr/bin/python3 bench/xls_peers.py read "$dir/quire.xls"
echo "reading the file xlwt wrote:"
build-bench/bench/xls_cells_bench read "$dir/xlwt.xls"
/usr/bin/python3 bench/xls_peers.py read "$dir/xlwt.xls"
ls -l "$dir"
