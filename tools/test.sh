#!/usr/bin/env bash
# Builds and runs the whole test suite, then again under AddressSanitizer and UBSan.
set -euo pipefail
cd "$(dirname "$0")/.."
tools/install-deps.sh
export ASAN_OPTIONS=detect_leaks=1:abort_on_error=1
export UBSAN_OPTIONS=print_stacktrace=1:halt_on_error=1
export LSAN_OPTIONS="suppressions=$PWD/tools/lsan.supp"

run_suite() {
  local dir=$1; shift
  cmake -S . -B "$dir" -G Ninja "$@" >/dev/null
  ninja -C "$dir" -j2
  (cd "$dir" && ctest --output-on-failure -j2 --timeout 900)
}

run_suite build -DCMAKE_BUILD_TYPE=RelWithDebInfo
if [ "${QUIRE_SKIP_SANITIZERS:-0}" != 1 ]; then
  run_suite build-sanitize -DCMAKE_BUILD_TYPE=Debug -DQUIRE_SANITIZE=ON
fi
