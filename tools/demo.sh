#!/usr/bin/env bash
# Builds VantorBase and runs the example programs under Wine.
set -euo pipefail
VANTORBASE_ROOT="$(cd "$(dirname "$0")/.." && pwd)"
. "$VANTORBASE_ROOT/tools/wine-env.sh"
. "$VANTORBASE_ROOT/tools/bootstrap.sh"
vantorbase_prepare_gcc_build -DVANTORBASE_BUILD_EXAMPLES=ON
for example in "$build"/bin/example_*.exe; do
    echo "=== $(basename "$example" .exe) ==="
    "$VANTORBASE_ROOT/tools/wine-run" "$example"
    echo
done
