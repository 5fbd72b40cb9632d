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

/// Follows a patch's spectral names and values in name order, as the patch lays
/// them out on its grid, to tell whether they can reach the engine as they are:
/// names 10 nm apart within 380..780 nm, values a float holds. Cheap enough to
/// run on every name of every patch; only the first and last name are read as
/// numbers (see OnEngineGrid).
class NameWatch {
public:
    void See(const std::string& name, double value) {
        if (seen_++ == 0) {
            First(name);
        } else if (!alike_ || name.size() != size_ || name.back() != lastChar_) {
            alike_ = false;
            return;
        } else {
            for (std::size_t i = digitsFrom_; i + 1 < size_; ++i) {
                if (name[i] < '0' || name[i] > '9') {
                    alike_ = false;
                    return;
                }
            }
        }
        alike_ = alike_ && IsUsableValue(value);
    }

    /// Whether the names seen, `first` and `last` among them, are the marker
    /// followed by the digits of wavelengths 10 nm apart within 380..780 nm.
    bool OnEngineGrid(const std::string& first, const std::string& last,
                      std::string_view marker) const;

private:
    // The first name sets what every other one must look like: its length, its
    // last character and where its trailing digits begin.
    void First(const std::string& name);

    std::size_t seen_ = 0;
    std::size_t size_ = 0;
    std::size_t digitsFrom_ = 0;
    char lastChar_ = '\0';
    bool alike_ = true;
};

/// A patch's spectrum for the engine. `onEngineGrid` (from NameWatch) lets the
/// grid's values pass unchanged; otherwise every name is read (marker chosen
/// from the greatest name, as the patch reads its grid) and the points are
/// resampled. A name whose wavelength cannot be read makes the spectrum
/// unusable (false).
bool FromPatchSpectrum(const std::map<std::string, double>& spectral,
                       const SpectralDataStruct& grid, bool onEngineGrid, EngineSpectrum& out);

/// X, Y, Z (white Y = 100) through the colour engine; `xyz` changes only on success.
bool ToXYZ(const EngineSpectrum& spectrum, tagXYZ& xyz);

/// Red, green, blue and visual density through the colour engine; only those four
/// change, and only on success.
bool ToDensities(const EngineSpectrum& spectrum, tagDENSITY& density);

} // namespace engine_spectrum
