// The colour engine behind the four HUEKIT functions.
//
// What it computes:
// - Tristimulus values: CIE illuminant D50 with the CIE 1931 2 degree observer,
//   summed over 380..780 nm in 5 nm steps. The reflectance spectrum is taken on
//   a 10 nm grid from its first wavelength; between two supplied points it is
//   interpolated with a cubic (Catmull-Rom) curve, and beyond the supplied
//   range it keeps its first or last value (the usual practice for instruments
//   that stop at 730 nm; it amounts to adding the missing tails' weights to the
//   end points). The sums are normalised so that the illuminant itself (a
//   perfect white) has Y = 100, whatever range was supplied; its white point is
//   about (96.41, 100, 82.50).
// - CIE 1976 L*a*b* from XYZ (white Y = 1) and back, relative to that same D50
//   white point, with the CIE constants epsilon = 216/24389, kappa = 24389/27.
// - Densities (option 0, the only one): red, green and blue through density
//   filter set 0 of the library's tables and visual through the photopic
//   luminous efficiency, each -log10 of the weighted mean reflectance over the
//   supplied points. A wavelength beyond the tables' 730 nm has filter entry 0
//   (weight 1) and visual weight 0; between table points the weights are
//   interpolated linearly.
// Spectra whose points leave 380..780 nm, empty spectra, null pointers and
// non-finite values are refused, as is a density that does not exist (a
// weighted reflectance that is not positive).
#pragma once

namespace huekit {

/// Lowest and highest wavelength a supplied spectrum may reach, and its step.
inline constexpr int kLowestNm = 380;
inline constexpr int kHighestNm = 780;
inline constexpr int kSpectrumStepNm = 10;

/// Whether `count` values from `startNm` in 10 nm steps stay within 380..780 nm
/// and are all finite (the spectrum pointer must not be null).
bool IsAcceptableSpectrum(const float* spectrum, int startNm, int count);

/// X, Y, Z (perfect white Y = 100) of an acceptable spectrum.
void SpectrumToXYZ(const float* spectrum, int startNm, int count, double xyz[3]);

/// The D50 white point of the tristimulus weights, scaled to Y = 1.
void WhitePoint(double white[3]);

/// Red, green, blue and visual density of an acceptable spectrum; false when a
/// density does not exist.
bool SpectrumToDensity(const float* spectrum, int startNm, int count, double density[4]);

/// L*, a*, b* of XYZ (white Y = 1) against the D50 white point.
void XYZToLab(const double xyz[3], double lab[3]);
/// XYZ (white Y = 1) of L*, a*, b* against the D50 white point.
void LabToXYZ(const double lab[3], double xyz[3]);

} // namespace huekit
