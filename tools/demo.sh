#!/usr/bin/env bash
# Builds VantorBase and runs the example programs under Wine.
set -euo pipefail
VANTORBASE_ROOT="$(cd "$(dirname "$0")/.." && pwd)"
. "$VANTORBASE_ROOT/tools/wine-env.sh"
. "$VANTORBASE_ROOT/tools/bootstrap.sh"
vantorbase_need
build="${VANTORBASE_BUILD_DIR:-$VANTORBASE_ROOT/build}/gcc"
vantorbase_build "$build" -DVANTORBASE_BUILD_EXAMPLES=ON
trap vantorbase_wineserver_stop EXIT
vantorbase_wineserver_start "$build"
for example in "$build"/bin/example_*.exe; do
    echo "=== $(basename "$example" .exe) ==="
    "$VANTORBASE_ROOT/tools/wine-run" "$example"
    echo
done
