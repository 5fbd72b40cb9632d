// Construction, reset and the chart-level presence flags of the chart store.
#include "redavudeva/swatchlog_base.h"

CSwatchlogBase::CSwatchlogBase() {
    ClearLists();
}

CSwatchlogBase::~CSwatchlogBase() = default;

void CSwatchlogBase::ResetChart() {
    borderPatches = 0;
    numberOfSets = 0;
    originalNumberOfSets = 0;
    numberOfFields = 0;
    numberOfStrips = 0;
    numberOfCols = 0;
    numberOfPages = 0;
    patchesPerPage = 0;
    uvCutMode = 0;
    zebraRulerMode = 0;
    device = 0;
    filePath.clear();
    patches.clear();
    referenceSampleMap.clear();
    keywordMap.clear();
    missingColorSpaces = 0;
    channelCount = 0;
    hasCMYK = false;
    hasLAB = false;
    hasXYZ = false;
    hasRGB = false;
    hasSpectral = false;
    hasCMYKO = false;
    hasCMYKOG = false;
    hasCMYKRGB = false;
    hasCMYKOGV = false;
    hasHTMLCOLOR = false;
    hasNColor = false;
    hasDensity = false;
    normLight = tagXYZ{};
}

// A set bit in the mask means the data rows did not supply that colour space.
// Flags are only ever raised here; a later step that knows the channel count
// better overrides an earlier one. No bit marks a chart as five-colour.
void CSwatchlogBase::UpdatePresenceFlags(std::uint32_t mask) {
    missingColorSpaces = mask;
    const auto supplied = [mask](std::uint32_t bit) { return (mask & bit) == 0; };

    if (supplied(MISSING_SPECTRAL)) {
        hasSpectral = true;
    }
    if (supplied(MISSING_CMYK)) {
        channelCount = 4;
        hasCMYK = true;
    } else if (hasSpectral) {
        // The patches derive CMYK densities from their spectra.
        hasCMYK = true;
    }
    if (supplied(MISSING_XYZ) || hasSpectral) {
        hasXYZ = true;
    }
    if (supplied(MISSING_LAB)) {
        hasLAB = true;
        hasXYZ = true;
    } else if (hasXYZ) {
        hasLAB = true;
    }
    if (supplied(MISSING_RGB)) {
        hasRGB = true;
        channelCount = 3;
    }
    if (supplied(MISSING_HTMLCOLOR)) {
        hasHTMLCOLOR = true;
    }
    if (supplied(MISSING_CMYKOG)) {
        hasCMYKOG = true;
        channelCount = 6;
    }
    if (supplied(MISSING_CMYKRGB)) {
        hasCMYKRGB = true;
        channelCount = 7;
    }
    if (supplied(MISSING_CMYKOGV)) {
        hasCMYKOGV = true;
        channelCount = 7;
    }
    if (supplied(MISSING_NCOLOR)) {
        hasNColor = true;
        int result = 0;
        const CColorPatch first = GetPatch(1, result);
        if (result == 0) {
            channelCount = static_cast<int>(first.GetNColorMap().size());
        }
    }
    if (supplied(MISSING_DENSITY)) {
        hasDensity = true;
    }
}

bool CSwatchlogBase::IsColorSpacePresent(int colorSpace) {
    switch (colorSpace) {
    case COLORSPACE_CMYK:
        return hasCMYK;
    case COLORSPACE_XYZ:
        return hasXYZ;
    case COLORSPACE_LAB:
        return hasLAB;
    case COLORSPACE_RGB:
        return hasRGB;
    case COLORSPACE_SPECTRAL:
        return hasSpectral;
    case COLORSPACE_CMYKOG:
        return hasCMYKOG;
    case COLORSPACE_CMYKRGB:
        return hasCMYKRGB;
    case COLORSPACE_HTMLCOLOR:
        return hasHTMLCOLOR;
    case COLORSPACE_NCOLOR:
        return hasNColor;
    case COLORSPACE_DENSITY:
        return hasDensity;
    case COLORSPACE_CMYKOGV:
        return hasCMYKOGV;
    case COLORSPACE_CMYKO:
        return hasCMYKO;
    default:
        return false;
    }
}
