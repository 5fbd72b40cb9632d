// CColorPatch: one measured or device colour patch of a chart.
#pragma once

#include <cstdint>
#include <map>
#include <string>
#include <vector>

#include "redavudeva/export.h"
#include "redavudeva/records.h"

struct ColorPatchProbe; // test access to the private colorimetry members

/// A patch with its label, every colour record the library knows, its spectrum
/// (as a name-to-value map and on its wavelength grid), its n-colour channels
/// and one presence flag per colour space.
class REDAVUDEVA_API CColorPatch {
public:
    /// Placeholder patch: empty label, zero records, RGB -1, all flags false.
    CColorPatch();
    /// Full patch without n-colour channels and densities.
    CColorPatch(tagCMYK cmyk, tagXYZ xyz, tagLAB lab, tagRGB rgb, tagCMYKOG cmykog,
                tagCMYKOGV cmykogv, tagCMYKRGB cmykrgb, std::map<std::string, double> spectral,
                tagHTMLCOLOR html, std::string label);
    /// Full patch with n-colour channels.
    CColorPatch(tagCMYK cmyk, tagXYZ xyz, tagLAB lab, tagRGB rgb, tagCMYKOG cmykog,
                tagCMYKOGV cmykogv, tagCMYKRGB cmykrgb, std::map<std::string, double> spectral,
                std::map<int, tagNCLR> nColors, tagHTMLCOLOR html, std::string label);
    /// Full patch with n-colour channels and densities (note: CMYKRGB before CMYKOGV).
    /// Throws std::out_of_range("invalid string position"), std::invalid_argument("invalid
    /// stol argument") or std::out_of_range("stol argument out of range") for unreadable
    /// spectral field names.
    CColorPatch(tagCMYK cmyk, tagXYZ xyz, tagLAB lab, tagRGB rgb, tagCMYKOG cmykog,
                tagCMYKRGB cmykrgb, tagCMYKOGV cmykogv, std::map<std::string, double> spectral,
                std::map<int, tagNCLR> nColors, tagHTMLCOLOR html, tagDENSITY density,
                std::string label);
    CColorPatch(const CColorPatch& other);
    CColorPatch& operator=(const CColorPatch& other);
    /// Moves take over the label and both maps instead of copying them.
    CColorPatch(CColorPatch&& other) noexcept;
    CColorPatch& operator=(CColorPatch&& other) noexcept;
    ~CColorPatch();

    // Record accessors; each returns a copy.
    tagCMYK GetCMYK() const;
    tagXYZ GetXYZ() const;
    tagLAB GetLAB() const;
    tagRGB GetRGB() const;
    tagCMYKOG GetCMYKOG() const;
    tagCMYKOGV GetCMYKOGV() const;
    tagCMYKRGB GetCMYKRGB() const;
    tagHTMLCOLOR GetHTMLCOLOR() const;
    tagDENSITY GetDensity() const;
    SWL_CMYKO GetCMYKO() const;
    std::string GetLabel() const;
    std::map<std::string, double> GetSpectralData() const;
    SpectralDataStruct GetSpectralDataStruct() const;
    std::map<int, tagNCLR> GetNColorMap() const;
    /// Always the empty string.
    std::string GetFormattedPatchString() const;

    /// Value of device channel `channel`: n-colour channel when n-colour is present,
    /// else c, m, y, k for channels 0..3 when CMYK is present, else 0.0.
    double GetChannelValue(int channel);
    /// Device values: n-colour, else CMYKRGB, else CMYKOG, else CMYK, else empty.
    std::vector<double> GetReferenceValues();

    // Presence flags.
    bool IsCMYKPresent() const;
    bool IsLABPresent() const;
    bool IsXYZPresent() const;
    bool IsRGBPresent() const;
    bool IsSpectralPresent() const;
    bool IsCMYKOGPresent() const;
    bool IsCMYKRGBPresent() const;
    bool IsCMYKOGVPresent() const;
    bool IsHTMLCOLORPresent() const;
    bool IsNColorPresent() const;
    bool IsDensityAvailable() const;

    /// Marks the spaces whose bit is clear as present and derives the missing ones
    /// it can (CMYK, XYZ, densities from the spectrum; Lab from XYZ; XYZ from Lab;
    /// RGB from XYZ or from CMYK the row supplied).
    /// The spectrum reaches the colour engine as 10 nm values within 380..780 nm:
    /// names 10 nm apart there pass unchanged; any other step, range or uneven
    /// spacing is resampled (a cubic curve through the points, or a least-squares
    /// fit where they are closer than 10 nm), and points outside 380..780 nm are
    /// left out. A spectrum that cannot give colour (fewer than two values, a
    /// non-finite value, two values at one wavelength, an unreadable field name,
    /// nothing within 380..780 nm) derives nothing and raises no flag. CMYK derived
    /// from an off-grid spectrum is the marker -1, 0, 0, 0 and never yields RGB.
    void SetMissingColorSpace(std::uint32_t mask);
    /// Sets the reference white used by later Lab and relative-XYZ computations.
    void SetNormLight(tagXYZ white);

    /// Lab of the patch's XYZ, optionally media-relative to `white`; `type` 0, 1, 4
    /// or 5 divides by the norm light, any other type takes XYZ as already relative.
    tagLAB XYZToLAB(bool relative, tagXYZ white, int type);
    /// The patch's XYZ scaled so that the media white `white` maps onto the norm light.
    tagXYZ XYZAbsoluteToRelative(tagXYZ white);
    /// Largest spectral density over `reference` between 430 and 680 nm; writes
    /// the wavelength of the maximum to `peakNm` (left alone when none exceeds 0).
    double CalculateDensity(SpectralDataStruct& reference, int& peakNm);

    /// Euclidean distances between `target` and the patch's record of the same kind.
    double GetCMYKPatchDistanceTo(const tagCMYK& target);
    double GetCMYKOGPatchDistanceTo(const tagCMYKOG& target);
    double GetCMYKOGVPatchDistanceTo(const tagCMYKOGV& target);
    double GetCMYKRGBPatchDistanceTo(const tagCMYKRGB& target);

    /// Whether the patch's record lies on origin + t * direction within tolerance / 1e7.
    bool IsCMYKOnGradient(const tagCMYK& origin, const tagCMYK& direction, double tolerance);
    bool IsCMYKOGOnGradient(const tagCMYKOG& origin, const tagCMYKOG& direction, double tolerance);
    bool IsCMYKOGVOnGradient(const tagCMYKOGV& origin, const tagCMYKOGV& direction,
                             double tolerance);
    bool IsCMYKRGBOnGradient(const tagCMYKRGB& origin, const tagCMYKRGB& direction,
                             double tolerance);

    /// Whether `channel` is the only channel strictly above `threshold` (all others
    /// strictly below it).
    bool IsCleanColor(int channel, double threshold);
    /// Whether exactly one channel is strictly above `threshold`, the others below.
    bool IsCleanColor(double threshold);
    /// Whether every channel is strictly below `threshold`.
    bool IsWhite(double threshold);

private:
    friend struct ::ColorPatchProbe;

    void SetSpectralDataStruct();
    void getXYZ(double* xyzOut, const double* spectrum, int type);
    void computeNormWeighting();
    bool calculateXYZ();
    bool calculateDensities();
    bool convertLabToXYZ();
    tagLAB XYZToLAB();
    tagCMYK GetCMYKfromSPECTRAL(long filterSet, SpectralDataStruct spectrum);
    int GetRGBfromXYZ(double x, double y, double z, long* r, long* g, long* b, unsigned int type);
    tagRGB GetRGBFromCMYK(tagCMYK cmyk);

    bool m_bCMYK = false;
    bool m_bLAB = false;
    bool m_bXYZ = false;
    bool m_bRGB = false;
    bool m_bSpectral = false;
    bool m_bCMYKOG = false;
    bool m_bCMYKRGB = false;
    bool m_bCMYKOGV = false;
    bool m_bHTMLCOLOR = false;
    bool m_bNColor = false;
    bool m_bDensity = false;
    /// The spectral names lie 10 nm apart within 380..780 nm and every value fits a
    /// float: m_spectral reaches the colour engine as it is. Set with m_spectral;
    /// it sits in what was padding before m_missingMask, so the object's size and
    /// the other members' places are as before.
    bool m_bSpectralOnEngineGrid = false;
    std::uint32_t m_missingMask = 0;
    double m_normWeighting[4] = {};
    std::string m_label;
    tagCMYK m_CMYK;
    tagXYZ m_XYZ;
    tagXYZ m_normLight;
    tagLAB m_LAB;
    tagRGB m_RGB;
    tagCMYKOG m_CMYKOG;
    tagCMYKRGB m_CMYKRGB;
    tagCMYKOGV m_CMYKOGV;
    SWL_CMYKO m_CMYKO;
    tagHTMLCOLOR m_HTMLCOLOR;
    tagDENSITY m_density;
    std::map<std::string, double> m_spectralData;
    SpectralDataStruct m_spectral;
    std::map<int, tagNCLR> m_nColors;
};
