// CColorPatch: the full constructors used for patches read from a chart.
#include <utility>

#include "redavudeva/color_patch.h"

namespace {

// White point of the D50 / 2 degree weighting set to two decimal places: the
// reference white of every patch until SetNormLight replaces it.
constexpr tagXYZ kD50TwoDegreeWhite{96.38, 100.0, 82.45};

} // namespace

CColorPatch::CColorPatch(tagCMYK cmyk, tagXYZ xyz, tagLAB lab, tagRGB rgb, tagCMYKOG cmykog,
                         tagCMYKOGV cmykogv, tagCMYKRGB cmykrgb,
                         std::map<std::string, double> spectral, tagHTMLCOLOR html,
                         std::string label)
    : CColorPatch(cmyk, xyz, lab, rgb, cmykog, cmykrgb, cmykogv, std::move(spectral),
                  std::map<int, tagNCLR>(), html, tagDENSITY(), std::move(label)) {}

CColorPatch::CColorPatch(tagCMYK cmyk, tagXYZ xyz, tagLAB lab, tagRGB rgb, tagCMYKOG cmykog,
                         tagCMYKOGV cmykogv, tagCMYKRGB cmykrgb,
                         std::map<std::string, double> spectral, std::map<int, tagNCLR> nColors,
                         tagHTMLCOLOR html, std::string label)
    : CColorPatch(cmyk, xyz, lab, rgb, cmykog, cmykrgb, cmykogv, std::move(spectral),
                  std::move(nColors), html, tagDENSITY(), std::move(label)) {}

// The chart reader's constructor; CMYKRGB comes before CMYKOGV here. The maps and
// the label are moved in, so building a patch per data row copies nothing large.
// Every presence flag starts false (the spectral one is raised by the grid
// derivation when a spectrum was given); SetMissingColorSpace raises the rest.
CColorPatch::CColorPatch(tagCMYK cmyk, tagXYZ xyz, tagLAB lab, tagRGB rgb, tagCMYKOG cmykog,
                         tagCMYKRGB cmykrgb, tagCMYKOGV cmykogv,
                         std::map<std::string, double> spectral, std::map<int, tagNCLR> nColors,
                         tagHTMLCOLOR html, tagDENSITY density, std::string label)
    : m_label(std::move(label)), m_CMYK(cmyk), m_XYZ(xyz), m_normLight(kD50TwoDegreeWhite),
      m_LAB(lab), m_RGB(rgb), m_CMYKOG(cmykog), m_CMYKRGB(cmykrgb), m_CMYKOGV(cmykogv),
      m_HTMLCOLOR(html), m_density(density), m_spectralData(std::move(spectral)),
      m_nColors(std::move(nColors)) {
    computeNormWeighting();
    SetSpectralDataStruct();
}
