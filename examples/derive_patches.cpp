// Builds a few patches from reflectance spectra and prints what each derives:
// XYZ and densities from the spectrum (through the colour engine), L*a*b* from
// XYZ, RGB from XYZ, and the density-based CMYK.
#include <cmath>
#include <cstdio>
#include <map>
#include <string>

#include <redavudeva/redavudeva.h>

namespace {

// A smooth reflectance curve: a base level plus a bump (or dip) around a centre.
std::map<std::string, double> Spectrum(double base, double peak, double centreNm, double widthNm) {
    std::map<std::string, double> spectrum;
    for (int nm = 380; nm <= 730; nm += 10) {
        const double t = (nm - centreNm) / widthNm;
        spectrum["SPECTRAL_NM_" + std::to_string(nm)] = base + peak * std::exp(-t * t);
    }
    return spectrum;
}

void Show(const char* name, std::map<std::string, double> spectrum) {
    CColorPatch patch(tagCMYK{}, tagXYZ{}, tagLAB{}, tagRGB{}, tagCMYKOG{}, tagCMYKRGB{},
                      tagCMYKOGV{}, std::move(spectrum), {}, tagHTMLCOLOR{}, tagDENSITY{}, name);
    // Only the spectrum was supplied: every other space is missing.
    patch.SetMissingColorSpace(MISSING_CMYK | MISSING_XYZ | MISSING_LAB | MISSING_RGB |
                               MISSING_CMYKOG | MISSING_CMYKRGB | MISSING_HTMLCOLOR |
                               MISSING_NCOLOR | MISSING_CMYKOGV | MISSING_DENSITY);
    const tagXYZ xyz = patch.GetXYZ();
    const tagLAB lab = patch.GetLAB();
    const tagRGB rgb = patch.GetRGB();
    const tagDENSITY d = patch.GetDensity();
    std::printf("%-8s XYZ %6.2f %6.2f %6.2f  L*a*b* %6.2f %7.2f %7.2f  RGB %3d %3d %3d  "
                "D(R,G,B,V) %.2f %.2f %.2f %.2f\n",
                name, xyz.x, xyz.y, xyz.z, lab.l, lab.a, lab.b, rgb.r, rgb.g, rgb.b, d.red, d.green,
                d.blue, d.visual);
}

} // namespace

int main() {
    Show("white", Spectrum(0.90, 0.0, 550, 100));
    Show("cyan", Spectrum(0.05, 0.55, 480, 60));
    Show("magenta", Spectrum(0.45, -0.40, 550, 45));
    Show("yellow", Spectrum(0.85, -0.78, 430, 40));
    Show("grey", Spectrum(0.20, 0.0, 550, 100));
    return 0;
}
