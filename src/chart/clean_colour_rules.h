// Rules shared by the clean-colour selections and the channel ramps.
#pragma once

namespace clean_colour_rules {

/// Threshold below which a channel counts as unprinted and above which it
/// counts as printed, in every clean-colour and white test of the store.
constexpr double kCleanTolerance = 1e-5;

/// Channel argument that stands for every channel of the chart.
constexpr int kEveryChannel = -1;

/// Whether `channel` is kEveryChannel or one of 0 to channelCount - 1.
inline bool IsChannelArgumentValid(int channel, int channelCount) {
    return channel == kEveryChannel || (channel >= 0 && channel < channelCount);
}

/// First and one-past-last channel to visit for a valid channel argument.
inline int FirstChannel(int channel) {
    return channel == kEveryChannel ? 0 : channel;
}
inline int EndChannel(int channel, int channelCount) {
    return channel == kEveryChannel ? channelCount : channel + 1;
}

} // namespace clean_colour_rules
