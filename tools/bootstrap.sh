# Sourced by the entry scripts (after wine-env.sh, with VANTORBASE_ROOT set):
# installs what a bare Debian machine lacks, builds, and keeps a wineserver.

# Installs the build and run tools that are missing, plus any Debian
# packages named as arguments.
vantorbase_need() {
    local missing=()
    command -v cmake >/dev/null 2>&1 || missing+=(cmake)
    command -v x86_64-w64-mingw32-g++-posix >/dev/null 2>&1 || missing+=(g++-mingw-w64-x86-64-posix)
    { command -v wine64 >/dev/null 2>&1 || [ -x /usr/lib/wine/wine64 ]; } || missing+=(wine64 wine)
    [ -f /usr/src/googletest/CMakeLists.txt ] || missing+=(googletest)
    for extra in "$@"; do
        dpkg -s "$extra" >/dev/null 2>&1 || missing+=("$extra")
    done
    if [ ${#missing[@]} -gt 0 ]; then
        echo "Installing: ${missing[*]}"
        local sudo=""; [ "$(id -u)" -eq 0 ] || sudo=sudo
        $sudo apt-get update -qq
        DEBIAN_FRONTEND=noninteractive $sudo apt-get install -y -qq --no-install-recommends "${missing[@]}"
    fi
}

# Configures and builds one tree: vantorbase_build DIR [cmake args...]
vantorbase_build() {
    local dir=$1; shift
    cmake -S "$VANTORBASE_ROOT" -B "$dir" \
        -DCMAKE_TOOLCHAIN_FILE="$VANTORBASE_ROOT/cmake/mingw-w64-x86_64.cmake" \
        -DCMAKE_BUILD_TYPE=Release "$@"
    cmake --build "$dir" -j2
}

# A persistent wineserver makes each Windows process start in milliseconds.
# One first process, with no terminal or pipe attached, starts Wine's own
# background services; later programs would otherwise start them and pass
# them their output pipe, which then never closes.
vantorbase_wineserver_start() {
    vantorbase_wine_prefix
    mkdir -p "$1"
    wineserver -p >"$1/wineserver.log" 2>&1 || true
    "$(vantorbase_wine_loader)" cmd /c exit </dev/null >>"$1/wineserver.log" 2>&1 || true
}
vantorbase_wineserver_stop() {
    wineserver -k >/dev/null 2>&1 || true
}

# What demo.sh and bench.sh share: install, build the GCC tree with the given
# CMake options, and keep a wineserver until the script exits. Sets $build.
vantorbase_prepare_gcc_build() {
    vantorbase_need
    build="${VANTORBASE_BUILD_DIR:-$VANTORBASE_ROOT/build}/gcc"
    vantorbase_build "$build" "$@"
    trap vantorbase_wineserver_stop EXIT
    vantorbase_wineserver_start "$build"
}
