#include "device_agreement.h"

#include <cmath>

#include "number_format.h"
#include "patch_values.h"

namespace swatchlog {
namespace {

bool FileDevice(const Chart& chart, Space space) {
    return chart.Has(space) && !chart.Derived(space);
}

std::string Values(const std::vector<double>& values, Space space) {
    std::string text;
    for (const double value : values) {
        text += (text.empty() ? "" : " ") + FormatShortest(RoundToDecimals(value, 4));
    }
    return std::string(NameOf(space).title) + " " + text;
}

std::string Sample(const Chart& chart, std::size_t index) {
    std::string text = "sample " + std::to_string(index + 1);
    if (chart.HasSampleIds()) {
        text += " (SAMPLE_ID " + chart.SampleId(index) + ")";
    }
    return text + " of " + chart.Name();
}

} // namespace

DeviceAgreement CheckDeviceValues(const Chart& first, const Chart& second, const Pairing& pairing,
                                  double tolerance) {
    DeviceAgreement result;
    Space space = Space::Cmyk;
    std::size_t channels = 0;
    if (FileDevice(first, Space::Cmyk) && FileDevice(second, Space::Cmyk)) {
        space = Space::Cmyk;
        channels = 4;
    } else if (FileDevice(first, Space::Rgb) && FileDevice(second, Space::Rgb)) {
        space = Space::Rgb;
        channels = 3;
    } else if (first.Has(Space::NColor) && second.Has(Space::NColor) &&
               first.NColorNames().size() == second.NColorNames().size()) {
        space = Space::NColor;
        channels = first.NColorNames().size();
    } else {
        return result;
    }
    result.space = NameOf(space).title;
    for (const PatchPair& pair : pairing.pairs) {
        const CColorPatch& a = first.Patches()[pair.first];
        const CColorPatch& b = second.Patches()[pair.second];
        if (!Chart::PatchHas(a, space) || !Chart::PatchHas(b, space)) {
            continue;
        }
        const std::vector<double> va = SpaceNumbers(a, space, channels);
        const std::vector<double> vb = SpaceNumbers(b, space, channels);
        ++result.checked;
        for (std::size_t c = 0; c < channels && c < va.size() && c < vb.size(); ++c) {
            // A NaN compares false, so it counts as a disagreement too.
            if (!(std::fabs(va[c] - vb[c]) <= tolerance)) {
                result.disagreements.push_back(
                    Sample(first, pair.first) + " has " + Values(va, space) + ", " +
                    Sample(second, pair.second) + " has " + Values(vb, space));
                break;
            }
        }
    }
    return result;
}

} // namespace swatchlog
