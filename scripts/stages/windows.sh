#!/usr/bin/env bash
# Cross-builds the 64-bit Windows DLLs (Redavudeva.dll, HUEKIT.dll), the tools
# and the whole test suite with MinGW-w64, then runs the tests under Wine.
# Fails when the build or any test fails.
set -euo pipefail
cd "$(dirname "$0")/../.."
source scripts/lib/common.sh

# Wine with its recommended packages, the set these tests were run with.
REDAVUDEVA_APT_RECOMMENDS=1 ensure_packages cmake ninja-build googletest \
    g++-mingw-w64-x86-64-posix binutils-mingw-w64-x86-64 wine wine64

export LANG=C.UTF-8
# A Wine configuration of our own, thrown away afterwards; no prompts to install
# Wine's .NET and HTML engines, no debug chatter in the test output.
WINEPREFIX=$(mktemp -d "${TMPDIR:-/tmp}/redavudeva-wine.XXXXXX")
export WINEPREFIX
export WINEDLLOVERRIDES="mscoree,mshtml="
export WINEDEBUG=-all

stop_wine() {
    wineserver -k >/dev/null 2>&1 || true
    timeout 60 wineserver -w >/dev/null 2>&1 || true
    # Wine's server leaves its socket folder, named after the prefix's device
    # and inode, under /tmp/wine-*/.
    local server
    server=$(printf 'server-%x-%x' "$(stat -c %d "$WINEPREFIX")" "$(stat -c %i "$WINEPREFIX")")
    rm -rf "$WINEPREFIX" /tmp/wine-*/"$server"
    rmdir /tmp/wine-* 2>/dev/null || true
}
trap stop_wine EXIT

section "windows: build"
cmake --preset windows >/dev/null
cmake --build --preset windows -j "$(nproc)"

section "windows: test under Wine"
# Start Wine once and keep it running: otherwise every test waits for Wine's
# services to start. Its output goes to /dev/null so that no Wine process holds
# on to this script's output pipe.
wineserver -p >/dev/null 2>&1 </dev/null
wine64_loader=/usr/lib/wine/wine64
[ -x "$wine64_loader" ] || wine64_loader=wine
timeout 300 "$wine64_loader" wineboot.exe -i >/dev/null 2>&1 </dev/null
ctest --preset windows -j "$(nproc)"
