#!/usr/bin/env bash
# Builds VantorBase and runs its benchmark program under Wine; arguments are
# passed on (a case-name filter).
set -euo pipefail
VANTORBASE_ROOT="$(cd "$(dirname "$0")/.." && pwd)"
. "$VANTORBASE_ROOT/tools/wine-env.sh"
. "$VANTORBASE_ROOT/tools/bootstrap.sh"
vantorbase_need
build="${VANTORBASE_BUILD_DIR:-$VANTORBASE_ROOT/build}/gcc"
vantorbase_build "$build" -DVANTORBASE_BUILD_BENCH=ON
trap vantorbase_wineserver_stop EXIT
vantorbase_wineserver_start "$build"
"$VANTORBASE_ROOT/tools/wine-run" "$build/bin/vantorbase_bench.exe" "$@"
