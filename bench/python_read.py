#!/usr/bin/env python3
"""Reading the 10,000-patch benchmark chart into NumPy arrays with the Python
module, against the C++ read of the same file (Google Benchmark's
BM_Read_Redavudeva/10000, the store filled and every patch's derived colour
spaces worked out). Both figures are CPU time, medians of 5 runs.

Usage: python_read.py BUILD_DIR   (a bench build with REDAVUDEVA_PYTHON on)
"""

import json
import pathlib
import statistics
import subprocess
import sys
import tempfile
import time

PATCHES = 10000
RUNS = 5


def cpp_read_ms(build):
    """Median CPU time of the C++ read; the benchmark writes the same
    deterministic chart for itself."""
    names = f"^BM_Read_Redavudeva/{PATCHES}$"
    result = subprocess.run(
        [str(build / "bench" / "redavudeva_bench"), f"--benchmark_filter={names}",
         f"--benchmark_repetitions={RUNS}", "--benchmark_report_aggregates_only=true",
         "--benchmark_format=json"], check=True, capture_output=True, text=True)
    for entry in json.loads(result.stdout)["benchmarks"]:
        if entry.get("aggregate_name") == "median":
            assert entry["time_unit"] == "ms", entry["time_unit"]
            return entry["cpu_time"]
    raise SystemExit("no median in the benchmark's output")


def python_read_ms(chart):
    import redavudeva

    redavudeva.read(chart)  # warm the file cache and the imports
    times = []
    for _ in range(RUNS):
        start = time.process_time()
        chart_arrays = redavudeva.read(chart)
        times.append((time.process_time() - start) * 1000.0)
        assert len(chart_arrays) == PATCHES and chart_arrays.spectra.shape == (PATCHES, 36)
    return statistics.median(times)


def main():
    build = pathlib.Path(sys.argv[1]).resolve()
    sys.path.insert(0, str(build / "python"))
    with tempfile.TemporaryDirectory() as folder:
        chart = pathlib.Path(folder) / f"chart_{PATCHES}.it8"
        subprocess.run([str(build / "bench" / "redavudeva_peak_memory"), "generate", str(PATCHES), str(chart)],
                       check=True, stdout=subprocess.DEVNULL)
        ours = python_read_ms(chart)
        cpp = cpp_read_ms(build)
    print(f"read {PATCHES} patches into arrays (Python)  {ours:8.1f} ms")
    print(f"read {PATCHES} patches (C++ ReadChartFile)    {cpp:8.1f} ms")
    print(f"ratio                                     {ours / cpp:8.2f}")


if __name__ == "__main__":
    main()
