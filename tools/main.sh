#!/usr/bin/env bash
# The main job: install, build, then run the example programs: the one written against the C
# header, and the one that uses the host plugin through the stand-in host of its tests.
set -euo pipefail
cd "$(dirname "$0")/.."
tools/install-deps.sh
# The plugin example is built with the tests; the test options are given in full because this
# build folder is the one tools/test.sh uses too.
cmake -S . -B build -G Ninja -DCMAKE_BUILD_TYPE=RelWithDebInfo -DQUIRE_TESTS=ON -DQUIRE_TEST_DIRS= >/dev/null
targets=(quire_example)
# The stand-in host calls plugin functions the x86-64 way; elsewhere there is no plugin example.
if ninja -C build -t query plugin_example >/dev/null 2>&1; then
  targets+=(plugin_example)
fi
ninja -C build -j2 "${targets[@]}"
mkdir -p out
(cd out && ../build/examples/quire_example)
if [[ " ${targets[*]} " == *" plugin_example "* ]]; then
  (cd out && ../build/tests/plugin_host/plugin_example)
fi
