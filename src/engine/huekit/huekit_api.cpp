// The four exported conversions: argument checks, float conversion and the
// all-or-nothing output. What the engine computes is described in huekit_engine.h.
#include <cmath>

#include "huekit.h"
#include "huekit_engine.h"

namespace {

constexpr int kSuccess = 0;
constexpr int kRefused = 1;

bool AllFinite(const float* values, int count) {
    for (int i = 0; i < count; ++i) {
        if (!std::isfinite(values[i])) {
            return false;
        }
    }
    return true;
}

// Writes `count` results as floats only when every one of them is finite.
int Deliver(const double* results, int count, float* out) {
    float converted[4] = {};
    for (int i = 0; i < count; ++i) {
        converted[i] = static_cast<float>(results[i]);
        if (!std::isfinite(converted[i])) {
            return kRefused;
        }
    }
    for (int i = 0; i < count; ++i) {
        out[i] = converted[i];
    }
    return kSuccess;
}

} // namespace

extern "C" HUEKIT_API int HUEKIT_fromSpectralToCIEXYZ(const float* spectrum, int startNm, int count,
                                                      float* xyz) {
    if (xyz == nullptr || !huekit::IsAcceptableSpectrum(spectrum, startNm, count)) {
        return kRefused;
    }
    double result[3];
    huekit::SpectrumToXYZ(spectrum, startNm, count, result);
    return Deliver(result, 3, xyz);
}

extern "C" HUEKIT_API int HUEKIT_fromSpectralToDensity(const float* spectrum, int startNm,
                                                       int count, float* density, int option) {
    if (density == nullptr || option != 0 ||
        !huekit::IsAcceptableSpectrum(spectrum, startNm, count)) {
        return kRefused;
    }
    double result[4];
    if (!huekit::SpectrumToDensity(spectrum, startNm, count, result)) {
        return kRefused;
    }
    return Deliver(result, 4, density);
}

extern "C" HUEKIT_API int HUEKIT_fromCIEXYZToCIELAB(const float* xyz, float* lab) {
    if (xyz == nullptr || lab == nullptr || !AllFinite(xyz, 3)) {
        return kRefused;
    }
    const double in[3] = {xyz[0], xyz[1], xyz[2]};
    double result[3];
    huekit::XYZToLab(in, result);
    return Deliver(result, 3, lab);
}

extern "C" HUEKIT_API int HUEKIT_fromCIELABToCIEXYZ(const float* lab, float* xyz) {
    if (lab == nullptr || xyz == nullptr || !AllFinite(lab, 3)) {
        return kRefused;
    }
    const double in[3] = {lab[0], lab[1], lab[2]};
    double result[3];
    huekit::LabToXYZ(in, result);
    return Deliver(result, 3, xyz);
}
