// A patch's spectral map as the colour engine takes it.
#include <cstddef>
#include <utility>

#include "patch/engine_spectrum.h"
#include "patch/field_wavelength.h"

namespace engine_spectrum {
namespace {

// The wavelength spelt by the digits after a leading marker of `markerSize`
// characters; -1 unless they are 1 to 9 decimal digits and nothing else.
int DigitsAfter(const std::string& name, std::size_t markerSize) {
    const std::size_t size = name.size();
    if (size <= markerSize || size > markerSize + 9) {
        return -1;
    }
    int nm = 0;
    for (std::size_t i = markerSize; i < size; ++i) {
        const char c = name[i];
        if (c < '0' || c > '9') {
            return -1;
        }
        nm = nm * 10 + (c - '0');
    }
    return nm;
}

} // namespace

// Only the first and the last name are read as numbers. The names lie in byte
// order, so when both start with the marker every name between them does; when
// every name is as long as the first, holds digits wherever the first does after
// the marker, and ends in the first one's last digit, byte order is numeric
// order and all wavelengths share their last digit, so `count` distinct ones
// from start to start + 10 (count - 1) can only be those 10 nm apart.
bool NamesOnEngineGrid(const std::string& first, const std::string& last, std::string_view marker,
                       int count) {
    if (count < 2 || count > kMaxCount || first.compare(0, marker.size(), marker) != 0 ||
        last.compare(0, marker.size(), marker) != 0) {
        return false;
    }
    const int startNm = DigitsAfter(first, marker.size());
    return startNm >= kLowestNm && startNm <= kHighestNm - kStepNm * (count - 1) &&
           DigitsAfter(last, marker.size()) == startNm + kStepNm * (count - 1);
}

bool FromPatchSpectrum(const std::map<std::string, double>& spectral,
                       const SpectralDataStruct& grid, bool onEngineGrid, EngineSpectrum& out) {
    if (onEngineGrid) {
        out.startNm = grid.startNm;
        out.count = grid.count;
        for (std::size_t i = 0; i < static_cast<std::size_t>(grid.count); ++i) {
            out.values[i] = static_cast<float>(grid.values[i]);
        }
        return true;
    }
    if (spectral.size() < 2) {
        return false;
    }
    const char* marker = field_wavelength::MarkerIn(spectral.rbegin()->first);
    if (marker == nullptr) {
        return false;
    }
    std::vector<Sample> samples;
    samples.reserve(spectral.size());
    for (const auto& [name, value] : spectral) {
        const auto nm = field_wavelength::WavelengthIn(name, marker);
        if (!nm) {
            return false;
        }
        samples.push_back(Sample{*nm, value});
    }
    return Resample(std::move(samples), out);
}

} // namespace engine_spectrum
