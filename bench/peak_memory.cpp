// Peak resident memory of reading a chart file, in a process of its own so
// that nothing else raises the high-water mark.
//
//   redavudeva_peak_memory generate <patches> <file>   writes the benchmark chart
//   redavudeva_peak_memory redavudeva <file>           reads it with our reader
//   redavudeva_peak_memory lcms <file>                 loads it with Little CMS
//
// Prints the peak resident set before and after the read, in KiB.
#include <lcms2.h>
#include <sys/resource.h>

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <string>

#include "generated_chart.h"
#include "it8/it8_reader_writer.h"

namespace {

long PeakKiB() {
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    return usage.ru_maxrss; // KiB on Linux
}

int Usage() {
    std::fprintf(stderr, "usage: redavudeva_peak_memory generate <patches> <file> | "
                         "redavudeva <file> | lcms <file>\n");
    return 2;
}

} // namespace

int main(int argc, char** argv) {
    if (argc < 3) {
        return Usage();
    }
    const std::string mode = argv[1];
    if (mode == "generate" && argc == 4) {
        std::ofstream out(argv[3], std::ios::binary | std::ios::trunc);
        out << bench::ChartText(bench::GenerateTable(std::atoi(argv[2])));
        return out ? 0 : 1;
    }
    const std::string path = argv[2];
    const long before = PeakKiB();
    int patches = -1;
    if (mode == "redavudeva") {
        CIT8ReaderWriter chart;
        if (chart.ReadChartFile(std::wstring(path.begin(), path.end())) != 0) {
            std::fprintf(stderr, "the chart did not read\n");
            return 1;
        }
        patches = chart.GetPatchCount();
    } else if (mode == "lcms") {
        cmsHANDLE it8 = cmsIT8LoadFromFile(nullptr, path.c_str());
        if (it8 == nullptr) {
            std::fprintf(stderr, "Little CMS did not load the chart\n");
            return 1;
        }
        patches = static_cast<int>(cmsIT8GetPropertyDbl(it8, "NUMBER_OF_SETS"));
        cmsIT8Free(it8);
    } else {
        return Usage();
    }
    std::printf("%s patches=%d peak_before_kib=%ld peak_after_kib=%ld\n", mode.c_str(), patches,
                before, PeakKiB());
    return 0;
}
