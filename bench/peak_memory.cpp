// Peak resident memory of reading a chart file, in a process of its own so
// that nothing else raises the high-water mark.
//
//   redavudeva_peak_memory generate <patches> <file>    writes the benchmark chart
//   redavudeva_peak_memory long-names <patches> <file>  the same chart with every
//                                                       spectral name 1023 characters long
//   redavudeva_peak_memory worst <rows> <file>          one spectral field of 1023
//                                                       characters, rows of one value "0"
//   redavudeva_peak_memory redavudeva <file>            reads it with our reader
//   redavudeva_peak_memory lcms <file>                  loads it with Little CMS
//
// Prints the file's size, the peak resident set before and after the read in
// KiB, and the growth of the peak divided by the file's size.
#include <lcms2.h>
#include <sys/resource.h>

#include <cstdio>
#include <cstdlib>
#include <filesystem>
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
    std::fprintf(stderr, "usage: redavudeva_peak_memory generate|long-names|worst <count> <file> | "
                         "redavudeva <file> | lcms <file>\n");
    return 2;
}

// The longest field name the reader takes: each patch carries a copy of it.
std::string LongSpectralName(const std::string& wavelength) {
    return "SPECTRAL_NM_" + std::string(1023 - 12 - wavelength.size(), '0') + wavelength;
}

// The benchmark chart with every spectral field name padded to 1023 characters;
// the leading zeros leave the wavelength as it was.
std::string LongNameChart(int patches) {
    std::string text = bench::ChartText(bench::GenerateTable(patches));
    const std::string lead = "SPECTRAL_NM_";
    for (std::size_t at = text.find(lead);
         at != std::string::npos && at < text.find("END_DATA_FORMAT");
         at = text.find(lead, at + 1)) {
        const std::size_t end = text.find_first_of("\t\n", at);
        const std::string name =
            LongSpectralName(text.substr(at + lead.size(), end - at - lead.size()));
        text.replace(at, end - at, name);
        at += name.size() - 1;
    }
    return text;
}

// The costliest chart per byte: every two-byte row becomes a patch with a copy
// of the longest name.
std::string WorstChart(int rows) {
    std::string text = "NUMBER_OF_SETS " + std::to_string(rows) + "\nBEGIN_DATA_FORMAT\n" +
                       LongSpectralName("380") + "\nEND_DATA_FORMAT\nBEGIN_DATA\n";
    for (int i = 0; i < rows; ++i) {
        text += "0\n";
    }
    return text + "END_DATA\n";
}

} // namespace

int main(int argc, char** argv) {
    if (argc < 3) {
        return Usage();
    }
    const std::string mode = argv[1];
    if ((mode == "generate" || mode == "long-names" || mode == "worst") && argc == 4) {
        const int count = std::atoi(argv[2]);
        std::ofstream out(argv[3], std::ios::binary | std::ios::trunc);
        out << (mode == "generate"     ? bench::ChartText(bench::GenerateTable(count))
                : mode == "long-names" ? LongNameChart(count)
                                       : WorstChart(count));
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
    const long after = PeakKiB();
    const auto bytes = static_cast<double>(std::filesystem::file_size(path));
    std::printf("%s patches=%d file_bytes=%.0f peak_before_kib=%ld peak_after_kib=%ld "
                "growth_per_file_byte=%.1f\n",
                mode.c_str(), patches, bytes, before, after,
                static_cast<double>(after - before) * 1024.0 / bytes);
    return 0;
}
