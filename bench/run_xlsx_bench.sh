#!/usr/bin/env bash
# Builds the benchmark and compares quire with the C xlsx writer (writing, its default mode) and
# openpyxl in read-only mode (reading) in one run.
set -euo pipefail
cd "$(dirname "$0")/.."
cmake -S . -B build-bench -G Ninja -DCMAKE_BUILD_TYPE=Release -DQUIRE_TESTS=OFF >/dev/null
ninja -C build-bench -j2 xlsx_cells_bench >/dev/null
peer=build-bench/bench/xlsx_peer_writer
if ninja -C build-bench -t targets all | grep -q '^bench/xlsx_peer_writer:'; then
    ninja -C build-bench -j2 bench/xlsx_peer_writer >/dev/null
else
    peer=
    echo "the C xlsx writer is not installed: its writing figure is skipped"
fi
dir=$(mktemp -d)
trap 'rm -rf "$dir"' EXIT
build-bench/bench/xlsx_cells_bench write "$dir/quire.xlsx"
if [ -n "$peer" ]; then "$peer" "$dir/peer.xlsx"; fi
build-bench/bench/xlsx_cells_bench read "$dir/quire.xlsx"
/usr/bin/python3 bench/xlsx_peers.py read "$dir/quire.xlsx"
if [ -n "$peer" ]; then
    echo "reading the file the C xlsx writer wrote:"
    build-bench/bench/xlsx_cells_bench read "$dir/peer.xlsx"
    /usr/bin/python3 bench/xlsx_peers.py read "$dir/peer.xlsx"
fi
ls -l "$dir"
