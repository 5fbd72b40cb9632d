// CColorPatch: marking the colour spaces a data row supplied and deriving the rest.
#include "patch/engine_spectrum.h"
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

    // The spectrum on the colour engine's grid, worked out once for the steps
    // that derive from it. A spectrum that cannot give colour (one value, a
    // non-finite value, nothing within 380..780 nm, an unreadable name) derives
    // nothing at all.
    engine_spectrum::EngineSpectrum spectrum;
    const bool spectrumUsable =
        m_bSpectral && (mask & (MISSING_CMYK | MISSING_XYZ | MISSING_DENSITY)) != 0 &&
        engine_spectrum::FromPatchSpectrum(m_spectralData, m_spectral, m_bSpectralOnEngineGrid,
                                           spectrum);

    // CMYK (holding red, green, blue and visual density) from the spectrum; an
    // off-grid spectrum still counts, its record then reads -1, 0, 0, 0.
    if (!IsMissing(mask, MISSING_CMYK)) {
        m_bCMYK = true;
    } else if (spectrumUsable) {
        m_CMYK = GetCMYKfromSPECTRAL(kDefaultDensityFilterSet, m_spectral);
        m_bCMYK = true;
    }

    if (!IsMissing(mask, MISSING_XYZ)) {
        m_bXYZ = true;
    } else if (m_bSpectral) {
        m_bXYZ = spectrumUsable && engine_spectrum::ToXYZ(spectrum, m_XYZ);
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
    } else if (m_bCMYK && !IsMissing(mask, MISSING_CMYK)) {
        // Only CMYK the row supplied is a device value; CMYK derived from the
        // spectrum holds densities or the off-grid marker.
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
        m_bDensity = spectrumUsable && engine_spectrum::ToDensities(spectrum, m_density);
    }
}
