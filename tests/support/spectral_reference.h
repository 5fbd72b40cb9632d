// The CIE test colour samples on several grids with their L*a*b* from an
// independent tool (tests/data/spectra/reference_lab_tcs.txt, provenance there).
#pragma once

#include <algorithm>
#include <cmath>
#include <fstream>
#include <map>
#include <sstream>
#include <string>
#include <vector>

#include "redavudeva/records.h"

namespace spectral_reference {

struct Sample {
    std::string name;
    double lab[3] = {};
    std::map<std::string, double> spectrum; ///< "SPECTRAL_NM_<nm>" to reflectance factor
};

struct Set {
    std::string name; ///< grid and range, e.g. "20nm_380_780"
    std::vector<Sample> samples;
};

inline std::vector<Set> Read() {
    std::ifstream in(std::string(REDAVUDEVA_TEST_DATA_DIR) + "/spectra/reference_lab_tcs.txt");
    std::vector<Set> sets;
    int first = 0;
    int step = 0;
    std::string line;
    while (std::getline(in, line)) {
        std::istringstream words(line);
        std::string word;
        if (line.empty() || line[0] == '#' || !(words >> word)) {
            continue;
        }
        if (word == "set") {
            int last = 0;
            sets.emplace_back();
            words >> sets.back().name >> first >> last >> step;
            continue;
        }
        Sample sample;
        sample.name = word;
        words >> sample.lab[0] >> sample.lab[1] >> sample.lab[2];
        double value = 0.0;
        for (int nm = first; words >> value; nm += step) {
            sample.spectrum["SPECTRAL_NM_" + std::to_string(nm)] = value;
        }
        sets.back().samples.push_back(sample);
    }
    return sets;
}

/// Mean and largest CIE 1976 difference between our L*a*b* (one per sample, in
/// the set's order) and the reference.
struct Agreement {
    double mean = 0.0;
    double largest = 0.0;
};

inline Agreement Compare(const Set& set, const std::vector<tagLAB>& ours) {
    Agreement agreement;
    for (std::size_t i = 0; i < ours.size() && i < set.samples.size(); ++i) {
        const double* ref = set.samples[i].lab;
        const double dE = std::sqrt((ours[i].l - ref[0]) * (ours[i].l - ref[0]) +
                                    (ours[i].a - ref[1]) * (ours[i].a - ref[1]) +
                                    (ours[i].b - ref[2]) * (ours[i].b - ref[2]));
        agreement.mean += dE / static_cast<double>(set.samples.size());
        agreement.largest = std::max(agreement.largest, dE);
    }
    return agreement;
}

} // namespace spectral_reference
