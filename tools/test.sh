#!/usr/bin/env bash
# Builds VantorBase and runs its whole test suite under Wine.
set -euo pipefail
VANTORBASE_ROOT="$(cd "$(dirname "$0")/.." && pwd)"
. "$VANTORBASE_ROOT/tools/wine-env.sh"
. "$VANTORBASE_ROOT/tools/bootstrap.sh"
vantorbase_need
build="${VANTORBASE_BUILD_DIR:-$VANTORBASE_ROOT/build}"
vantorbase_build "$build"
trap vantorbase_wineserver_stop EXIT
vantorbase_wineserver_start "$build"
ctest --test-dir "$build" -j2 --output-on-failure --timeout 120
