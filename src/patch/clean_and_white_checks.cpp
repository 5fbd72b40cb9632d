// CColorPatch: whether a patch is printed with a single colorant or with none.
#include <cstddef>
#include <vector>

#include "patch/n_color_lookup.h"
#include "redavudeva/color_patch.h"

namespace {

// Whether values[channel] is strictly above `threshold` and every other value
// strictly below it (a value equal to the threshold, or NaN, spoils the test).
bool IsOnlyChannelAbove(const std::vector<double>& values, std::size_t channel, double threshold) {
    if (!(values[channel] > threshold)) {
        return false;
    }
    for (std::size_t i = 0; i < values.size(); ++i) {
        if (i != channel && !(values[i] < threshold)) {
            return false;
        }
    }
    return true;
}

// Whether exactly one value is strictly above `threshold` and the others below.
bool HasSingleChannelAbove(const std::vector<double>& values, double threshold) {
    for (std::size_t i = 0; i < values.size(); ++i) {
        if (values[i] > threshold) {
            return IsOnlyChannelAbove(values, i, threshold);
        }
    }
    return false;
}

bool AllBelow(const std::vector<double>& values, double threshold) {
    for (double value : values) {
        if (!(value < threshold)) {
            return false;
        }
    }
    return true;
}

std::vector<double> ChannelsOf(const tagCMYK& cmyk) {
    return {cmyk.c, cmyk.m, cmyk.y, cmyk.k};
}

} // namespace

bool CColorPatch::IsCleanColor(int channel, double threshold) {
    if (m_bNColor) {
        const int count = static_cast<int>(m_nColors.size());
        if (channel < 0 || count <= channel) {
            return false;
        }
        if (!(n_color_lookup::ValueAt(m_nColors, channel) > threshold)) {
            return false;
        }
        for (int position = 0; position < count; ++position) {
            if (position != channel &&
                !(n_color_lookup::ValueAt(m_nColors, position) < threshold)) {
                return false;
            }
        }
        return true;
    }
    if (m_bCMYK) {
        if (channel < 0 || channel > 3) {
            return false;
        }
        return IsOnlyChannelAbove(ChannelsOf(m_CMYK), static_cast<std::size_t>(channel), threshold);
    }
    return false;
}

bool CColorPatch::IsCleanColor(double threshold) {
    if (m_bNColor) {
        return HasSingleChannelAbove(n_color_lookup::ValuesInOrder(m_nColors), threshold);
    }
    if (m_bCMYK) {
        return HasSingleChannelAbove(ChannelsOf(m_CMYK), threshold);
    }
    return false;
}

bool CColorPatch::IsWhite(double threshold) {
    if (m_bNColor) {
        return AllBelow(n_color_lookup::ValuesInOrder(m_nColors), threshold);
    }
    if (m_bCMYK) {
        return AllBelow(ChannelsOf(m_CMYK), threshold);
    }
    return false;
}
