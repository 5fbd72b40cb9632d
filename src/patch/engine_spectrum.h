// Spectra as the colour engine takes them: reflectance factors 10 nm apart
// within 380..780 nm, brought there from measured points on any grid.
#pragma once

#include <array>
#include <cmath>
#include <limits>
#include <map>
#include <string>
#include <string_view>
#include <vector>

#include "redavudeva/records.h"

namespace engine_spectrum {

inline constexpr int kLowestNm = 380;
inline constexpr int kHighestNm = 780;
inline constexpr int kStepNm = 10;
inline constexpr int kMaxCount = (kHighestNm - kLowestNm) / kStepNm + 1;

/// Whether a reflectance factor can reach the engine: finite, also as a float.
inline bool IsUsableValue(double value) {
    return std::fabs(value) <= std::numeric_limits<float>::max();
}

/// One measured point: wavelength in nm and reflectance factor.
struct Sample {
    int nm = 0;
    double value = 0.0;
};

/// `count` values at startNm, startNm + 10, ... nm, all within 380..780 nm.
struct EngineSpectrum {
    int startNm = 0;
    int count = 0;
    std::array<float, kMaxCount> values{};
};

/// Brings measured points, in any order, onto 10 nm steps from the first
/// measured wavelength at or above 380 nm (380 nm itself when the points start
/// below it) up to the last one at or below 780 nm. Points outside 380..780 nm
/// are not passed on; the engine's own handling covers a range that stops short.
/// - Points 10 nm or more apart: the 10 nm values are read off a cubic curve
///   through the points (Hermite, the slope at a point from the parabola through
///   it and its neighbours, so that even steps give the Catmull-Rom curve the
///   engine draws between its 10 nm values). At a measured wavelength the value
///   is the measured one.
/// - Points closer than 10 nm all over the range: the 10 nm values are those
///   whose Catmull-Rom curve comes closest to every measured point (least
///   squares), so that no measurement is skipped.
/// False, leaving `out` unspecified, when the points cannot give colour: fewer
/// than two, a value that is not finite (as a float), two at the same
/// wavelength, or none within 380..780 nm.
bool Resample(std::vector<Sample> samples, EngineSpectrum& out);

/// Whether names `first` .. `last` in byte order, `count` of them, each as long
/// as `first` and holding digits where it does after `marker`, and all ending in
/// its last character, name wavelengths 10 nm apart within 380..780 nm.
bool NamesOnEngineGrid(const std::string& first, const std::string& last, std::string_view marker,
                       int count);

/// Follows a patch's spectral names in name order, as the patch lays them out
/// on its grid, to tell whether its values can reach the engine as they are:
/// names 10 nm apart within 380..780 nm, values a float holds. Cheap enough to
/// run on every name of every patch; only the first and last name are read as
/// numbers (see NamesOnEngineGrid).
class NameWatch {
public:
    /// Every name must look like `first`: as long, ending in the same character,
    /// with digits wherever `first` has its trailing digits.
    explicit NameWatch(const std::string& first)
        : size_(first.size()), digitsFrom_(first.size()),
          lastChar_(first.empty() ? '\0' : first.back()) {
        while (digitsFrom_ > 0 && first[digitsFrom_ - 1] >= '0' && first[digitsFrom_ - 1] <= '9') {
            --digitsFrom_;
        }
    }

    void See(const std::string& name) {
        if (!alike_) {
            return;
        }
        alike_ = name.size() == size_ && name.back() == lastChar_;
        for (std::size_t i = digitsFrom_; alike_ && i + 1 < size_; ++i) {
            alike_ = name[i] >= '0' && name[i] <= '9';
        }
    }

    /// Whether the `count` names seen, from `first` to `last`, and their values
    /// can go to the engine as they are.
    bool OnEngineGrid(const std::string& first, const std::string& last, std::string_view marker,
                      const double* values, int count) const {
        if (!alike_ || digitsFrom_ > marker.size()) {
            return false;
        }
        for (int i = 0; i < count; ++i) {
            if (!IsUsableValue(values[i])) {
                return false;
            }
        }
        return NamesOnEngineGrid(first, last, marker, count);
    }

private:
    std::size_t size_;
    std::size_t digitsFrom_;
    char lastChar_;
    bool alike_ = true;
};

/// A patch's spectrum for the engine. `onEngineGrid` (from NameWatch) lets the
/// grid's values pass unchanged; otherwise every name is read (marker
/// chosen from the greatest name, as the patch reads its grid) and the points are resampled. A name
/// whose wavelength cannot be read makes the spectrum unusable (false).
bool FromPatchSpectrum(const std::map<std::string, double>& spectral,
                       const SpectralDataStruct& grid, bool onEngineGrid, EngineSpectrum& out);

/// X, Y, Z (white Y = 100) through the colour engine; `xyz` changes only on success.
bool ToXYZ(const EngineSpectrum& spectrum, tagXYZ& xyz);

/// Red, green, blue and visual density through the colour engine; only those four
/// change, and only on success.
bool ToDensities(const EngineSpectrum& spectrum, tagDENSITY& density);

} // namespace engine_spectrum
