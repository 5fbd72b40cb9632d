// Small builders shared by the colorimetry tests.
#pragma once

#include "color_patch_probe.h"
#include "redavudeva/color_patch.h"

namespace colorimetry_test {

/// A placeholder patch given the norm weighting and the D50 / 2 degree norm
/// light (96.38, 100, 82.45) that every full constructor sets.
inline CColorPatch PatchWithNorms() {
    CColorPatch patch;
    ColorPatchProbe::computeNormWeighting(patch);
    patch.SetNormLight(tagXYZ{96.38, 100.0, 82.45});
    return patch;
}

/// A spectrum of `count` equal values on the grid startNm + i * stepNm.
inline SpectralDataStruct FlatSpectrum(int startNm, int stepNm, int count, double value) {
    SpectralDataStruct s;
    s.startNm = startNm;
    s.stepNm = stepNm;
    s.count = count;
    for (int i = 0; i < count && i < 50; ++i) {
        s.values[i] = value;
    }
    return s;
}

} // namespace colorimetry_test
