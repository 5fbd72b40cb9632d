// The colour engine's four conversions, imported by name.
//
// Each answers 0 on success (the output array is then filled) and non-zero on
// failure (callers use nothing of the output).
#pragma once

// Callers declare the functions undecorated: a plain declaration links against
// the engine's import library and against a statically linked test double alike.
#if defined(_WIN32)
#if defined(HUEKIT_BUILDING)
#define HUEKIT_API __declspec(dllexport)
#else
#define HUEKIT_API
#endif
#else
#define HUEKIT_API __attribute__((visibility("default")))
#endif

#ifdef __cplusplus
extern "C" {
#endif

/// Spectrum of `count` reflectance factors from `startNm` in 10 nm steps to XYZ
/// (white Y = 100).
HUEKIT_API int HUEKIT_fromSpectralToCIEXYZ(const float* spectrum, int startNm, int count,
                                           float* xyz);
/// Same spectrum to red, green, blue and visual density; `option` is 0.
HUEKIT_API int HUEKIT_fromSpectralToDensity(const float* spectrum, int startNm, int count,
                                            float* density, int option);
/// XYZ with white Y = 1 to L*, a*, b*.
HUEKIT_API int HUEKIT_fromCIEXYZToCIELAB(const float* xyz, float* lab);
/// L*, a*, b* to XYZ with white Y = 1.
HUEKIT_API int HUEKIT_fromCIELABToCIEXYZ(const float* lab, float* xyz);

#ifdef __cplusplus
}
#endif
