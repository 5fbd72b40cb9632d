// CColorPatch: device channel values for the chart-level channel queries.
#include <vector>

#include "patch/n_color_lookup.h"
#include "redavudeva/color_patch.h"

// N-colour channels take precedence over CMYK; a channel the patch does not
// hold reads 0.0.
double CColorPatch::GetChannelValue(int channel) {
    if (m_bNColor) {
        if (channel < 0 || static_cast<int>(m_nColors.size()) <= channel) {
            return 0.0;
        }
        return n_color_lookup::ValueAt(m_nColors, channel);
    }
    if (m_bCMYK) {
        switch (channel) {
        case 0:
            return m_CMYK.c;
        case 1:
            return m_CMYK.m;
        case 2:
            return m_CMYK.y;
        case 3:
            return m_CMYK.k;
        default:
            return 0.0;
        }
    }
    return 0.0;
}

// The device values of the richest device space the patch holds, in the order
// n-colour, CMYKRGB, CMYKOG, CMYK. CMYKOGV is not a reference space.
std::vector<double> CColorPatch::GetReferenceValues() {
    if (m_bNColor) {
        return n_color_lookup::ValuesInOrder(m_nColors);
    }
    if (m_bCMYKRGB) {
        const tagCMYKRGB& v = m_CMYKRGB;
        return {v.c, v.m, v.y, v.k, v.r, v.g, v.b};
    }
    if (m_bCMYKOG) {
        const tagCMYKOG& v = m_CMYKOG;
        return {v.c, v.m, v.y, v.k, v.o, v.g};
    }
    if (m_bCMYK) {
        return {m_CMYK.c, m_CMYK.m, m_CMYK.y, m_CMYK.k};
    }
    return {};
}
