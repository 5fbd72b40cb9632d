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

# Replays a target's saved crash inputs, then fuzzes it; prints what failed.
fuzz_target() {
    local name="$1"
    local binary="build/fuzz/fuzz/fuzz_$name"
    local regressions=(fuzz/regressions/"$name"/*)
    if [ -e "${regressions[0]}" ]; then
        echo "replaying ${#regressions[@]} saved crash input(s)"
        if ! "$binary" -timeout=10 -rss_limit_mb=2048 "${regressions[@]}"; then
            echo "FAILED: $name (regression)"
            return 1
        fi
    fi
    local seeds=("fuzz/corpus/$name")
    if [ "$name" != tokens ]; then
        seeds+=("$work/seeds")
    fi
    mkdir -p "$work/$name"
    if ! "$binary" -max_total_time="$seconds" -timeout=10 -rss_limit_mb=2048 -max_len=262144 \
        -print_final_stats=1 -artifact_prefix="$artifacts/$name-" \
        "$work/$name" "${seeds[@]}"; then
        echo "FAILED: $name"
        return 1
    fi
}

# One target per core at a time (each is a single process), so that every
# target gets its full time on a core of its own; each one's output is shown
# whole when it ends.
targets=(read_chart source_writers tokens)
cores=$(nproc)
for name in "${targets[@]}"; do
    while [ "$(jobs -rp | wc -l)" -ge "$cores" ]; do
        wait -n || true
    done
    (
        status=0
        fuzz_target "$name" >"$work/$name.log" 2>&1 || status=1
        {
            flock 9 # one target's output at a time
            section "fuzz: $name"
            cat "$work/$name.log"
        } 9>"$work/print.lock"
        echo "$status" >"$work/$name.status"
    ) &
done
wait
failed=()
for name in "${targets[@]}"; do
    if [ "$(cat "$work/$name.status" 2>/dev/null)" != 0 ]; then
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
