#!/usr/bin/env python3
"""Reading the 10,000-patch benchmark chart into NumPy arrays with the Python
module, against the C++ read of the same file (Google Benchmark's
BM_Read_Redavudeva/10000: a chart object made, the file read into it with
every patch's derived colour spaces worked out, and the object let go). Both
figures are CPU time of the same steps: here the chart is read into arrays and
let go, so that neither side keeps a chart of an earlier run in memory.

The two are measured in short turns, ROUNDS times, so that both sides of a
ratio see the same load on a shared machine; the figures are the medians over
the rounds. Both run with glibc's allocator told to keep the memory it is
given back (MALLOC_TRIM_THRESHOLD_, MALLOC_MMAP_THRESHOLD_): by default the
benchmark process returns the 30 MB of one read to the system after every
iteration and faults them in again on the next, while the Python process
happens to keep them, and on a busy virtual machine those page faults alone
move the C++ figure between 50 and 110 ms.

Usage: python_read.py BUILD_DIR   (a bench build with REDAVUDEVA_PYTHON on)
"""

import json
import os
import pathlib
import statistics
import subprocess
import sys
import tempfile
import time

PATCHES = 10000
ROUNDS = 15
RUNS = 3
STEADY_ALLOCATOR = {"MALLOC_TRIM_THRESHOLD_": "4294967295", "MALLOC_MMAP_THRESHOLD_": "33554432"}


def cpp_read_ms(build):
    """CPU time of the C++ read (the mean of the iterations after a warm-up); the
    benchmark writes the same deterministic chart for itself."""
    names = f"^BM_Read_Redavudeva/{PATCHES}$"
    result = subprocess.run(
        [str(build / "bench" / "redavudeva_bench"), f"--benchmark_filter={names}",
         "--benchmark_min_warmup_time=0.2", "--benchmark_min_time=0.3", "--benchmark_format=json"],
        check=True, capture_output=True, text=True)
    entry = json.loads(result.stdout)["benchmarks"][0]
    assert entry["time_unit"] == "ms", entry["time_unit"]
    return entry["cpu_time"]


def python_read_ms(chart):
    import redavudeva

    times = []
    for _ in range(RUNS):
        start = time.process_time()
        arrays = redavudeva.read(chart)
        del arrays
        times.append((time.process_time() - start) * 1000.0)
    return statistics.median(times)


def main():
    if any(os.environ.get(name) != value for name, value in STEADY_ALLOCATOR.items()):
        # The allocator reads these when the process starts.
        os.execve(sys.executable, [sys.executable, *sys.argv], {**os.environ, **STEADY_ALLOCATOR})
    build = pathlib.Path(sys.argv[1]).resolve()
    sys.path.insert(0, str(build / "python"))
    import redavudeva

    with tempfile.TemporaryDirectory() as folder:
        chart = pathlib.Path(folder) / f"chart_{PATCHES}.it8"
        subprocess.run([str(build / "bench" / "redavudeva_peak_memory"), "generate", str(PATCHES), str(chart)],
                       check=True, stdout=subprocess.DEVNULL)
        first = redavudeva.read(chart)  # warm the file cache and the imports
        assert len(first) == PATCHES and first.spectra.shape == (PATCHES, 36)
        del first
        rounds = [(python_read_ms(chart), cpp_read_ms(build)) for _ in range(ROUNDS)]
    ours = statistics.median(python for python, _ in rounds)
    cpp = statistics.median(native for _, native in rounds)
    ratios = sorted(python / native for python, native in rounds)
    print(f"read {PATCHES} patches into arrays (Python)  {ours:8.1f} ms")
    print(f"read {PATCHES} patches (C++ ReadChartFile)    {cpp:8.1f} ms")
    print(f"ratio per round  " + " ".join(f"{ratio:.2f}" for ratio in ratios))
    print(f"ratio, median of the rounds               {statistics.median(ratios):8.2f}")


if __name__ == "__main__":
    main()
