// Tone ramps along each device channel: the reference values and XYZ of the
// channel's clean patches and the first white, sorted along the channel and
// thinned to distinct steps.
#include <stdexcept>

#include "chart/clean_colour_rules.h"
#include "redavudeva/swatchlog_base.h"

namespace {

// Successive ramp values closer than this (or equal) are one step.
constexpr double kRampStep = 0.01;

// Position `channel` of a patch's reference values; a patch with too few values
// for the channel ends the operation.
double ValueAt(const std::vector<double>& values, int channel) {
    if (channel < 0 || static_cast<std::size_t>(channel) >= values.size()) {
        throw std::out_of_range("invalid vector subscript");
    }
    return values[static_cast<std::size_t>(channel)];
}

using References = std::vector<std::vector<double>>;

// Exchange sort of the block [begin, end) by the value at `channel`, keeping the
// XYZ list parallel. Equal values are never exchanged; the exchange order fixes
// the order in which equal values come out.
void SortBlock(References& references, std::vector<tagXYZ>& xyz, std::size_t begin, std::size_t end,
               int channel) {
    for (std::size_t i = begin; i < end; ++i) {
        for (std::size_t j = i; j < end; ++j) {
            if (ValueAt(references[j], channel) < ValueAt(references[i], channel)) {
                std::swap(references[i], references[j]);
                std::swap(xyz[i], xyz[j]);
            }
        }
    }
}

// Removes, from the top of the sorted block down, every entry that lies no more
// than one ramp step above the entry before it.
void ThinBlock(References& references, std::vector<tagXYZ>& xyz, std::size_t begin, std::size_t end,
               int channel) {
    for (std::size_t k = end; k > begin + 1;) {
        --k;
        const double rise = ValueAt(references[k], channel) - ValueAt(references[k - 1], channel);
        if (rise <= kRampStep) {
            const auto offset = static_cast<std::ptrdiff_t>(k);
            references.erase(references.begin() + offset);
            xyz.erase(xyz.begin() + offset);
        }
    }
}

} // namespace

int CSwatchlogBase::GetChannelRamps(std::vector<std::vector<double>>& references,
                                    std::vector<tagXYZ>& xyz, int channel) {
    if (!clean_colour_rules::IsChannelArgumentValid(channel, channelCount)) {
        return 19;
    }
    references.clear();
    xyz.clear();
    std::size_t blockStart = 0;
    const int end = clean_colour_rules::EndChannel(channel, channelCount);
    for (int c = clean_colour_rules::FirstChannel(channel); c < end; ++c) {
        bool whiteTaken = false;
        for (const auto& entry : patches) {
            // The patch tests may add n-colour positions; they run on a copy.
            CColorPatch candidate = entry.second;
            if (candidate.IsCleanColor(c, clean_colour_rules::kCleanTolerance)) {
                references.push_back(candidate.GetReferenceValues());
                xyz.push_back(candidate.GetXYZ());
            } else if (!whiteTaken && candidate.IsWhite(clean_colour_rules::kCleanTolerance)) {
                const auto at = static_cast<std::ptrdiff_t>(blockStart);
                references.insert(references.begin() + at, candidate.GetReferenceValues());
                xyz.insert(xyz.begin() + at, candidate.GetXYZ());
                whiteTaken = true;
            }
        }
        const std::size_t blockEnd = references.size();
        SortBlock(references, xyz, blockStart, blockEnd, c);
        ThinBlock(references, xyz, blockStart, blockEnd, c);
        blockStart = references.size();
    }
    return 0;
}
