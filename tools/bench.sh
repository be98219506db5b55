#!/usr/bin/env bash
# Builds VantorBase and runs its benchmark program under Wine; an argument
# selects the groups whose name contains it.
set -euo pipefail
VANTORBASE_ROOT="$(cd "$(dirname "$0")/.." && pwd)"
. "$VANTORBASE_ROOT/tools/wine-env.sh"
. "$VANTORBASE_ROOT/tools/bootstrap.sh"
vantorbase_prepare_gcc_build -DVANTORBASE_BUILD_BENCH=ON
"$VANTORBASE_ROOT/tools/wine-run" "$build/bin/vantorbase_bench.exe" "$@"
