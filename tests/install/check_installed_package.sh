#!/usr/bin/env bash
# Usage: check_installed_package.sh BUILD_DIR HOST_SOURCE WORK_DIR CXX MAKE_PROGRAM
set -euo pipefail
build_dir=$1 host_source=$2 work=$3 cxx=$4 make_program=$5

rm -rf "$work"
mkdir -p "$work"
cmake --install "$build_dir" --prefix "$work/prefix" >/dev/null
cmake -S "$host_source" -B "$work/host-build" -G Ninja -DCMAKE_MAKE_PROGRAM="$make_program" \
      -DCMAKE_CXX_COMPILER="$cxx" -DCMAKE_PREFIX_PATH="$work/prefix" >/dev/null
cmake --build "$work/host-build" >/dev/null

# Two patches: CMYK with Lab, so the host can print what it read.
printf 'CGATS.17\nNUMBER_OF_SETS\t2\nBEGIN_DATA_FORMAT\nSAMPLE_ID\tSAMPLE_NAME\tCMYK_C\tCMYK_M\tCMYK_Y\tCMYK_K\tLAB_L\tLAB_A\tLAB_B\nEND_DATA_FORMAT\nBEGIN_DATA\n1\tA1\t100\t0\t0\t0\t55\t-37\t-50\n2\tA2\t0\t100\t0\t0\t48\t74\t-3\nEND_DATA\n' > "$work/chart.txt"

output=$("$work/host-build/host" "$work/chart.txt")
echo "$output"
expected=$'patches: 2\nsample 2: A2 L*=48.00 a*=74.00 b*=-3.00'
if [ "$output" != "$expected" ]; then
    echo "unexpected host output; expected:" >&2
    echo "$expected" >&2
    exit 1
fi
