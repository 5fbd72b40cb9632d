// Plain colour records exchanged by the library, and the missing-space mask.
#pragma once

#include <cstdint>
#include <string>

/// Device tone values in percent (file fields CMYK_C ... CMYK_K). When a patch
/// derives CMYK from its spectrum the fields hold red, green, blue and visual
/// densities; c = -1 with the rest 0 marks a spectrum off the 380/10/36 grid.
struct tagCMYK {
    double c = 0.0;
    double m = 0.0;
    double y = 0.0;
    double k = 0.0;
};

/// CIE tristimulus values on the scale where the perfect white has y = 100.
struct tagXYZ {
    double x = 0.0;
    double y = 0.0;
    double z = 0.0;
};

/// CIE 1976 L*, a*, b*.
struct tagLAB {
    double l = 0.0;
    double a = 0.0;
    double b = 0.0;
};

/// 8-bit RGB; -1 in every component means "never set".
struct tagRGB {
    int r = -1;
    int g = -1;
    int b = -1;
};

/// Six-colour tone values in percent: cyan, magenta, yellow, black, orange, green.
struct tagCMYKOG {
    double c = 0.0;
    double m = 0.0;
    double y = 0.0;
    double k = 0.0;
    double o = 0.0;
    double g = 0.0;
};

/// Seven-colour tone values in percent: CMYK with orange, green, violet.
struct tagCMYKOGV {
    double c = 0.0;
    double m = 0.0;
    double y = 0.0;
    double k = 0.0;
    double o = 0.0;
    double g = 0.0;
    double v = 0.0;
};

/// Seven-colour tone values in percent: CMYK with red, green, blue.
struct tagCMYKRGB {
    double c = 0.0;
    double m = 0.0;
    double y = 0.0;
    double k = 0.0;
    double r = 0.0;
    double g = 0.0;
    double b = 0.0;
};

/// Five-colour tone values in percent: CMYK with orange.
struct SWL_CMYKO {
    double c = 0.0;
    double m = 0.0;
    double y = 0.0;
    double k = 0.0;
    double o = 0.0;
};

/// The three bytes of an HTML colour text "#RRGGBB".
struct tagHTMLCOLOR {
    std::uint32_t r = 0;
    std::uint32_t g = 0;
    std::uint32_t b = 0;
};

/// Optical densities (file fields D_RED, D_GREEN, D_BLUE, D_VIS, D_MAJOR_FILTER).
struct tagDENSITY {
    double red = 0.0;
    double green = 0.0;
    double blue = 0.0;
    double visual = 0.0;
    double majorFilter = 0.0;
};

/// One channel of an n-colour patch.
struct tagNCLR {
    int colorantCount = 0; ///< the number the field name begins with ("6CLR_2" -> 6), else 0
    int channel = 0;       ///< zero-based channel position
    std::string name;      ///< the field name
    double value = 0.0;    ///< tone value
};

/// A spectrum on a regular grid: values[i] is the reflectance factor (1.0 =
/// perfect white) at startNm + i * stepNm for i < count.
struct SpectralDataStruct {
    double values[50] = {};
    int startNm = 0;
    int stepNm = 0;
    int count = 0;
};

// Missing-space mask: a set bit means the data row did not supply that space.
constexpr std::uint32_t MISSING_CMYK = 0x10;
constexpr std::uint32_t MISSING_XYZ = 0x20;
constexpr std::uint32_t MISSING_LAB = 0x40;
constexpr std::uint32_t MISSING_RGB = 0x80;
constexpr std::uint32_t MISSING_SPECTRAL = 0x100;
constexpr std::uint32_t MISSING_CMYKOG = 0x200;
constexpr std::uint32_t MISSING_CMYKRGB = 0x400;
constexpr std::uint32_t MISSING_HTMLCOLOR = 0x800;
constexpr std::uint32_t MISSING_NCOLOR = 0x1000;
constexpr std::uint32_t MISSING_CMYKOGV = 0x2000;
constexpr std::uint32_t MISSING_DENSITY = 0x4000;
