// A patch's spectral map as the colour engine takes it.
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <utility>

#include "patch/engine_spectrum.h"
#include "patch/field_wavelength.h"

namespace engine_spectrum {
namespace {

bool StartsWith(const std::string& name, std::string_view marker) {
    return name.compare(0, marker.size(), marker) == 0;
}

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

// The usual spectrum: names that start with the marker and end in the digits
// of wavelengths 10 nm apart within 380..780 nm, with finite values. Its values
// go to the engine unchanged. Any other spectrum answers false and goes the
// long way, which reads every name in full.
//
// Only the first and the last name are read as numbers. The names lie in byte
// order, so when both start with the marker every name between them does; when
// every name is the marker followed by as many digits as the first, byte order
// is numeric order, and when each ends in the first one's last digit, the n
// distinct wavelengths from start to start + 10 (n - 1) can only be those
// 10 nm apart.
bool TakeAsItIs(const std::map<std::string, double>& spectral, std::string_view marker,
                EngineSpectrum& out) {
    const auto count = static_cast<int>(spectral.size());
    const std::string& first = spectral.begin()->first;
    const std::string& last = spectral.rbegin()->first;
    if (count > kMaxCount || !StartsWith(first, marker) || !StartsWith(last, marker) ||
        last.size() != first.size()) {
        return false;
    }
    const int startNm = DigitsAfter(first, marker.size());
    if (startNm < kLowestNm || startNm > kHighestNm - kStepNm * (count - 1) ||
        DigitsAfter(last, marker.size()) != startNm + kStepNm * (count - 1)) {
        return false;
    }
    const std::size_t size = first.size();
    const char lastDigit = first.back();
    std::size_t i = 0;
    for (const auto& [name, value] : spectral) {
        if (name.size() != size || name.back() != lastDigit || !IsUsableValue(value)) {
            return false;
        }
        const char* const end = name.data() + size - 1;
        for (const char* c = name.data() + marker.size(); c < end; ++c) {
            if (static_cast<unsigned char>(*c - '0') > 9) {
                return false;
            }
        }
        out.values[i++] = static_cast<float>(value);
    }
    out.startNm = startNm;
    out.count = count;
    return true;
}

} // namespace

bool FromPatchSpectrum(const std::map<std::string, double>& spectral, EngineSpectrum& out) {
    if (spectral.size() < 2) {
        return false;
    }
    const char* marker = field_wavelength::MarkerIn(spectral.rbegin()->first);
    if (marker == nullptr) {
        return false;
    }
    if (TakeAsItIs(spectral, marker, out)) {
        return true;
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
