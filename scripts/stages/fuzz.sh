#!/usr/bin/env bash
# Fuzzing stage: builds the libFuzzer targets with Clang under AddressSanitizer
# and UndefinedBehaviorSanitizer, replays every saved crash input, then fuzzes
# each target for a bounded time starting from its seed corpus, the example and
# test charts, and the chart files of the installed Debian packages.
#
#   scripts/stages/fuzz.sh [SECONDS]   seconds per target (default
#                                      REDAVUDEVA_FUZZ_SECONDS, else 60)
#
# Inputs may be up to 256 KiB, enough for a chart whose field names would need
# gigabytes if the reader copied them without bound, and a run may use at most
# 2 GiB of memory.
# Fails on any crash, leak, per-input timeout or sanitizer report; the inputs
# that failed are kept in build/fuzz/artifacts/ and printed in base64.
set -euo pipefail
cd "$(dirname "$0")/../.."
source scripts/lib/common.sh

ensure_packages cmake ninja-build clang libclang-rt-14-dev argyll-ref colord-data
seconds="${1:-${REDAVUDEVA_FUZZ_SECONDS:-60}}"
case "$seconds" in
'' | *[!0-9]*)
    echo "usage: $0 [SECONDS per target]" >&2
    exit 2
    ;;
esac

cmake --preset fuzz >/dev/null
cmake --build --preset fuzz -j "$(nproc)" --target fuzz_targets

# The targets write a scratch file per input: keep those in memory when
# possible, inside the stage's own folder so that nothing is left behind.
scratch_root=/tmp
if [ -d /dev/shm ] && [ -w /dev/shm ]; then
    scratch_root=/dev/shm
fi
artifacts="$PWD/build/fuzz/artifacts"
work="$(mktemp -d "$scratch_root/redavudeva-fuzz-stage.XXXXXX")"
trap 'rm -rf "$work"' EXIT
mkdir -p "$work/tmp"
export TMPDIR="$work/tmp"
rm -rf "$artifacts"
mkdir -p "$artifacts" "$work/seeds"

# The example and test charts, and real-world chart files, as extra read-only seeds.
for dir in examples tests/data /usr/share/color/argyll/ref /usr/share/colord/ti1 \
    /usr/share/colord/illuminant; do
    [ -d "$dir" ] || continue
    find "$dir" -type f \( -name '*.it8' -o -name '*.ti1' -o -name '*.ti2' -o -name '*.ti3' \
        -o -name '*.cie' -o -name '*.sp' \) -size -64k -exec cp --backup=numbered {} "$work/seeds/" \;
done

failed=()
for target in fuzz_read_chart fuzz_source_writers fuzz_tokens; do
    name="${target#fuzz_}"
    binary="build/fuzz/fuzz/$target"
    section "fuzz: $name"

    regressions=(fuzz/regressions/"$name"/*)
    if [ -e "${regressions[0]}" ]; then
        echo "replaying ${#regressions[@]} saved crash input(s)"
        if ! "$binary" -timeout=10 -rss_limit_mb=2048 "${regressions[@]}"; then
            failed+=("$name (regression)")
            continue
        fi
    fi

    seeds=("fuzz/corpus/$name")
    if [ "$name" != tokens ]; then
        seeds+=("$work/seeds")
    fi
    mkdir -p "$work/$name"
    if ! "$binary" -max_total_time="$seconds" -timeout=10 -rss_limit_mb=2048 -max_len=262144 \
        -print_final_stats=1 -artifact_prefix="$artifacts/$name-" \
        "$work/$name" "${seeds[@]}"; then
        failed+=("$name")
    fi
done

if [ ${#failed[@]} -ne 0 ]; then
    echo
    echo "fuzzing failed: ${failed[*]}"
    for artifact in "$artifacts"/*; do
        [ -e "$artifact" ] || continue
        echo "--- $artifact (base64)"
        base64 "$artifact"
    done
    exit 1
fi
echo "fuzzing passed"
