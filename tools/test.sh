#!/usr/bin/env bash
# Builds VantorBase with GCC and with Clang (both cross-compiling with
# MinGW-w64) and runs the whole test suite of each build under Wine; then runs
# the GCC build's suite once more under Wine's heap checking, failing on any
# heap error Wine reports.
set -euo pipefail
VANTORBASE_ROOT="$(cd "$(dirname "$0")/.." && pwd)"
. "$VANTORBASE_ROOT/tools/wine-env.sh"
. "$VANTORBASE_ROOT/tools/bootstrap.sh"
vantorbase_need clang lld
build="${VANTORBASE_BUILD_DIR:-$VANTORBASE_ROOT/build}"
start=$(date +%s)

vantorbase_build "$build/gcc" -DVANTORBASE_BUILD_TESTS=ON
vantorbase_build "$build/clang" -DVANTORBASE_BUILD_TESTS=ON \
    -DCMAKE_TOOLCHAIN_FILE="$VANTORBASE_ROOT/cmake/clang-mingw-w64-x86_64.cmake"

trap vantorbase_wineserver_stop EXIT
vantorbase_wineserver_start "$build"

echo "=== Test suite, GCC build"
ctest --test-dir "$build/gcc" -j2 --output-on-failure --timeout 300
echo "=== Test suite, Clang build"
ctest --test-dir "$build/clang" -j2 --output-on-failure --timeout 300

echo "=== Test suite under Wine's heap checking, GCC build"
heaplog="$build/heap-check.log"
if ! WINEDEBUG=-all,warn+heap ctest --test-dir "$build/gcc" -j2 -V --timeout 600 >"$heaplog" 2>&1; then
    grep -E 'Failed|\*\*\*' "$heaplog" | head -40
    echo "heap check: the suite failed under heap checking (log: $heaplog)"
    exit 1
fi
if grep -E ':(warn|err):heap' "$heaplog" | head -20 | grep .; then
    echo "heap check: Wine reported heap errors (log: $heaplog)"
    exit 1
fi
tail -n 3 "$heaplog"
echo "heap check: no heap error reported"
echo "Whole suite took $(( $(date +%s) - start )) s"
