// CColorPatch: marking the colour spaces a data row supplied and deriving the rest.
#include "redavudeva/color_patch.h"

namespace {

bool IsMissing(std::uint32_t mask, std::uint32_t bit) {
    return (mask & bit) != 0;
}

// Density filter set used for a CMYK record derived from the spectrum.
constexpr long kDefaultDensityFilterSet = 0;

// RGB conversion type used when RGB is derived from XYZ.
constexpr unsigned int kDefaultRgbConversion = 0;

} // namespace

// A clear bit raises the space's flag and keeps the record as the row gave it; a
// set bit derives the space where the patch holds its source. The steps run in
// this order because each one may use what the previous ones produced.
void CColorPatch::SetMissingColorSpace(std::uint32_t mask) {
    m_missingMask = mask;

    // CMYK (holding red, green, blue and visual density) from the spectrum; an
    // off-grid spectrum still counts, its record then reads -1, 0, 0, 0.
    if (!IsMissing(mask, MISSING_CMYK)) {
        m_bCMYK = true;
    } else if (m_bSpectral) {
        m_CMYK = GetCMYKfromSPECTRAL(kDefaultDensityFilterSet, m_spectral);
        m_bCMYK = true;
    }

    if (!IsMissing(mask, MISSING_XYZ)) {
        m_bXYZ = true;
    } else if (m_bSpectral) {
        m_bXYZ = calculateXYZ();
    }

    if (!IsMissing(mask, MISSING_LAB)) {
        m_bLAB = true;
    } else if (m_bXYZ) {
        m_LAB = XYZToLAB();
        m_bLAB = true;
    }

    if (m_bLAB && !m_bXYZ) {
        m_bXYZ = convertLabToXYZ();
    }

    if (!IsMissing(mask, MISSING_RGB)) {
        m_bRGB = true;
    } else if (m_bXYZ) {
        long r = 0;
        long g = 0;
        long b = 0;
        GetRGBfromXYZ(m_XYZ.x, m_XYZ.y, m_XYZ.z, &r, &g, &b, kDefaultRgbConversion);
        // The components are clamped to 0..255, so they fit an int.
        m_RGB = tagRGB{static_cast<int>(r), static_cast<int>(g), static_cast<int>(b)};
        m_bRGB = true;
    } else if (m_bCMYK) {
        m_RGB = GetRGBFromCMYK(m_CMYK);
        m_bRGB = true;
    }

    // Device records cannot be derived; only their presence is recorded.
    if (!IsMissing(mask, MISSING_CMYKOG)) {
        m_bCMYKOG = true;
    }
    if (!IsMissing(mask, MISSING_CMYKRGB)) {
        m_bCMYKRGB = true;
    }
    if (!IsMissing(mask, MISSING_CMYKOGV)) {
        m_bCMYKOGV = true;
    }
    if (!IsMissing(mask, MISSING_NCOLOR)) {
        m_bNColor = true;
    }
    if (!IsMissing(mask, MISSING_HTMLCOLOR)) {
        m_bHTMLCOLOR = true;
    }

    // Red, green, blue and visual density from the spectrum; the major-filter
    // density is left as the row gave it.
    if (!IsMissing(mask, MISSING_DENSITY)) {
        m_bDensity = true;
    } else if (m_bSpectral) {
        m_bDensity = calculateDensities();
    }
}
