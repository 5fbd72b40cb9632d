#!/bin/sh
# Runs a Windows program of the build under Wine: wine_run.sh LOADER PROGRAM ARGS...
# Now and then Wine exits with an error before the program has printed a
# thing (it failed to start it; seen under load, once in some thousand runs).
# Such a run is tried once more, saying so. A program that started (every test
# program prints before it tests) and then failed is reported as it is.
loader=$1
shift
output=$(mktemp "${TMPDIR:-/tmp}/wine-run.XXXXXX") || exit 1
trap 'rm -f "$output"' EXIT
"$loader" "$@" >"$output" 2>&1
status=$?
if [ "$status" -ne 0 ] && [ ! -s "$output" ]; then
    echo "wine_run.sh: Wine ended with status $status before $1 printed anything; running it again" >&2
    "$loader" "$@" >"$output" 2>&1
    status=$?
fi
cat "$output"
exit "$status"
