# Sourced by the Wine scripts: one place for the Wine prefix and the settings
# every Windows program of this project runs with.
: "${WINEPREFIX:=${HOME:-/root}/.cache/vantorbase/wineprefix}"
export WINEPREFIX
export WINEARCH=win64
# Quiet Wine unless the caller asked for its channels.
: "${WINEDEBUG:=-all}"
export WINEDEBUG
# Pin the locale so that Wine's ANSI code page is 1252 on every machine.
export LC_ALL=C.UTF-8
# No Mono/Gecko installers, and no crash debugger: a crashing test exits.
export WINEDLLOVERRIDES="mscoree,mshtml=;winedbg.exe=d"

vantorbase_wine_loader() {
    if command -v wine64 >/dev/null 2>&1; then echo wine64
    elif [ -x /usr/lib/wine/wine64 ]; then echo /usr/lib/wine/wine64
    else echo wine
    fi
}

# Creates the prefix on first use: boot it, then select the null graphics
# driver so that windows exist without a display.
vantorbase_wine_prefix() {
    if [ -f "$WINEPREFIX/.vantorbase-ready" ]; then return 0; fi
    mkdir -p "$WINEPREFIX"
    local loader; loader=$(vantorbase_wine_loader)
    "$loader" wineboot -i >"$WINEPREFIX/../wineboot.log" 2>&1 || return 1
    "$loader" reg add 'HKCU\Software\Wine\Drivers' /v Graphics /d null /f \
        >>"$WINEPREFIX/../wineboot.log" 2>&1 || return 1
    wineserver -w
    touch "$WINEPREFIX/.vantorbase-ready"
}
