// CColorPatch: default construction, copying, accessors and presence flags.
#include "redavudeva/color_patch.h"

// The default members already describe the placeholder patch: empty label,
// zero records, RGB -1, zero norm light and weighting, empty maps, no flags.
CColorPatch::CColorPatch() = default;

CColorPatch::CColorPatch(const CColorPatch& other) = default;

CColorPatch& CColorPatch::operator=(const CColorPatch& other) = default;

CColorPatch::CColorPatch(CColorPatch&& other) noexcept = default;

CColorPatch& CColorPatch::operator=(CColorPatch&& other) noexcept = default;

CColorPatch::~CColorPatch() = default;

tagCMYK CColorPatch::GetCMYK() const {
    return m_CMYK;
}
tagXYZ CColorPatch::GetXYZ() const {
    return m_XYZ;
}
tagLAB CColorPatch::GetLAB() const {
    return m_LAB;
}
tagRGB CColorPatch::GetRGB() const {
    return m_RGB;
}
tagCMYKOG CColorPatch::GetCMYKOG() const {
    return m_CMYKOG;
}
tagCMYKOGV CColorPatch::GetCMYKOGV() const {
    return m_CMYKOGV;
}
tagCMYKRGB CColorPatch::GetCMYKRGB() const {
    return m_CMYKRGB;
}
tagHTMLCOLOR CColorPatch::GetHTMLCOLOR() const {
    return m_HTMLCOLOR;
}
tagDENSITY CColorPatch::GetDensity() const {
    return m_density;
}
SWL_CMYKO CColorPatch::GetCMYKO() const {
    return m_CMYKO;
}
std::string CColorPatch::GetLabel() const {
    return m_label;
}
std::map<std::string, double> CColorPatch::GetSpectralData() const {
    return m_spectralData;
}
SpectralDataStruct CColorPatch::GetSpectralDataStruct() const {
    return m_spectral;
}
std::map<int, tagNCLR> CColorPatch::GetNColorMap() const {
    return m_nColors;
}

// Kept for callers of the exported interface; a patch has no text form of its own.
std::string CColorPatch::GetFormattedPatchString() const {
    return std::string();
}

bool CColorPatch::IsCMYKPresent() const {
    return m_bCMYK;
}
bool CColorPatch::IsLABPresent() const {
    return m_bLAB;
}
bool CColorPatch::IsXYZPresent() const {
    return m_bXYZ;
}
bool CColorPatch::IsRGBPresent() const {
    return m_bRGB;
}
bool CColorPatch::IsSpectralPresent() const {
    return m_bSpectral;
}
bool CColorPatch::IsCMYKOGPresent() const {
    return m_bCMYKOG;
}
bool CColorPatch::IsCMYKRGBPresent() const {
    return m_bCMYKRGB;
}
bool CColorPatch::IsCMYKOGVPresent() const {
    return m_bCMYKOGV;
}
bool CColorPatch::IsHTMLCOLORPresent() const {
    return m_bHTMLCOLOR;
}
bool CColorPatch::IsNColorPresent() const {
    return m_bNColor;
}
bool CColorPatch::IsDensityAvailable() const {
    return m_bDensity;
}

// Only later Lab and media-relative XYZ computations see the new white.
void CColorPatch::SetNormLight(tagXYZ white) {
    m_normLight = white;
}
