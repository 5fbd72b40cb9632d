// Test access to CColorPatch's private colorimetry members.
#pragma once

#include <cstdint>

#include "redavudeva/color_patch.h"

struct ColorPatchProbe {
    static void SetSpectralDataStruct(CColorPatch& p) { p.SetSpectralDataStruct(); }
    static void getXYZ(CColorPatch& p, double* xyzOut, const double* spectrum, int type) {
        p.getXYZ(xyzOut, spectrum, type);
    }
    static void computeNormWeighting(CColorPatch& p) { p.computeNormWeighting(); }
    static bool calculateXYZ(CColorPatch& p) { return p.calculateXYZ(); }
    static bool calculateDensities(CColorPatch& p) { return p.calculateDensities(); }
    static bool convertLabToXYZ(CColorPatch& p) { return p.convertLabToXYZ(); }
    static tagLAB XYZToLAB(CColorPatch& p) { return p.XYZToLAB(); }
    static tagCMYK GetCMYKfromSPECTRAL(CColorPatch& p, long filterSet, SpectralDataStruct s) {
        return p.GetCMYKfromSPECTRAL(filterSet, s);
    }
    static int GetRGBfromXYZ(CColorPatch& p, double x, double y, double z, long* r, long* g,
                             long* b, unsigned int type) {
        return p.GetRGBfromXYZ(x, y, z, r, g, b, type);
    }
    static tagRGB GetRGBFromCMYK(CColorPatch& p, tagCMYK cmyk) { return p.GetRGBFromCMYK(cmyk); }

    // Direct member access for setting up a patch's state.
    static const double* normWeighting(const CColorPatch& p) { return p.m_normWeighting; }
    static tagXYZ normLight(const CColorPatch& p) { return p.m_normLight; }
    static std::uint32_t missingMask(const CColorPatch& p) { return p.m_missingMask; }
    static void setXYZ(CColorPatch& p, tagXYZ v) { p.m_XYZ = v; }
    static void setLAB(CColorPatch& p, tagLAB v) { p.m_LAB = v; }
    static void setLABFlag(CColorPatch& p, bool v) { p.m_bLAB = v; }
    static void setSpectral(CColorPatch& p, const SpectralDataStruct& s, bool present) {
        p.m_spectral = s;
        p.m_bSpectral = present;
    }
};
