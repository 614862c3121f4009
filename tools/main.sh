#!/usr/bin/env bash
# The main job: install, build, then run the example program.
set -euo pipefail
cd "$(dirname "$0")/.."
tools/install-deps.sh
cmake -S . -B build -G Ninja -DCMAKE_BUILD_TYPE=RelWithDebInfo -DQUIRE_TESTS=OFF >/dev/null
ninja -C build -j2 quire_example
mkdir -p out
(cd out && ../build/examples/quire_example)
