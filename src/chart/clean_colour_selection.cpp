// Clean-colour patches (one channel printed alone) and the paper white.
//
// The patch tests may add missing n-colour positions to the patch they look at,
// so they run on a copy: the store's patches stay exactly as they were read.
#include "chart/clean_colour_rules.h"
#include "redavudeva/swatchlog_base.h"

using clean_colour_rules::kCleanTolerance;

std::vector<CColorPatch> CSwatchlogBase::SelectCleanColorPatches() {
    std::vector<CColorPatch> selected;
    for (const auto& entry : patches) {
        CColorPatch candidate = entry.second;
        if (candidate.IsCleanColor(kCleanTolerance)) {
            selected.push_back(std::move(candidate));
        }
    }
    return selected;
}

// Answers true when nothing was found.
bool CSwatchlogBase::SelectCleanAndWhitePatches(std::vector<CColorPatch>& patchesOut,
                                                bool stopAtFirstWhite) {
    patchesOut.clear();
    for (const auto& entry : patches) {
        CColorPatch candidate = entry.second;
        if (candidate.IsCleanColor(kCleanTolerance)) {
            patchesOut.push_back(std::move(candidate));
        } else if (candidate.IsWhite(kCleanTolerance)) {
            patchesOut.push_back(std::move(candidate));
            if (stopAtFirstWhite) {
                break;
            }
        }
    }
    return patchesOut.empty();
}

// Each channel's clean patches in sample order, led by the chart's first white
// patch when it has one.
int CSwatchlogBase::GroupCleanColorPatches(std::map<int, std::vector<CColorPatch>>& groups,
                                           int channel) {
    if (!clean_colour_rules::IsChannelArgumentValid(channel, channelCount)) {
        return 19;
    }
    groups.clear();
    const int end = clean_colour_rules::EndChannel(channel, channelCount);
    for (int c = clean_colour_rules::FirstChannel(channel); c < end; ++c) {
        std::vector<CColorPatch> group;
        bool whiteTaken = false;
        for (const auto& entry : patches) {
            CColorPatch candidate = entry.second;
            if (candidate.IsCleanColor(c, kCleanTolerance)) {
                group.push_back(std::move(candidate));
            } else if (!whiteTaken && candidate.IsWhite(kCleanTolerance)) {
                group.insert(group.begin(), std::move(candidate));
                whiteTaken = true;
            }
        }
        groups[c] = std::move(group);
    }
    return 0;
}
