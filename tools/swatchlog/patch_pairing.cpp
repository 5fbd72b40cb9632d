#include "patch_pairing.h"

#include <map>

#include "arguments.h"
#include "patch_values.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace swatchlog {
namespace {

// The key of every patch by the rule, or why there is none.
bool Keys(const Chart& chart, PairBy by, std::vector<std::string>& keys, std::string& why) {
    keys.clear();
    if (by == PairBy::Id) {
        if (!chart.HasSampleIds()) {
            why = chart.Name() + " has no SAMPLE_ID";
            return false;
        }
        keys = chart.SampleIds();
    } else {
        for (const auto& patch : chart.Patches()) {
            keys.push_back(DisplayName(patch));
        }
    }
    std::map<std::string, std::size_t> seen;
    for (std::size_t i = 0; i < keys.size(); ++i) {
        if (keys[i].empty()) {
            why = "sample " + std::to_string(i + 1) + " of " + chart.Name() + " has no " +
                  (by == PairBy::Id ? "SAMPLE_ID" : "name");
            return false;
        }
        const auto [at, added] = seen.emplace(keys[i], i);
        if (!added) {
            why = std::string(by == PairBy::Id ? "SAMPLE_ID" : "the name") + " \"" +
                  RepairUtf8(keys[i]) + "\" stands on samples " + std::to_string(at->second + 1) +
                  " and " + std::to_string(i + 1) + " of " + chart.Name();
            return false;
        }
    }
    return true;
}

Pairing ByKeys(const std::vector<std::string>& first, const std::vector<std::string>& second) {
    Pairing pairing;
    std::map<std::string, std::size_t> index;
    for (std::size_t i = 0; i < second.size(); ++i) {
        index.emplace(second[i], i);
    }
    std::vector<bool> used(second.size(), false);
    for (std::size_t i = 0; i < first.size(); ++i) {
        const auto found = index.find(first[i]);
        if (found == index.end()) {
            pairing.unpairedFirst.push_back(i);
        } else {
            pairing.pairs.push_back({i, found->second});
            used[found->second] = true;
        }
    }
    for (std::size_t i = 0; i < second.size(); ++i) {
        if (!used[i]) {
            pairing.unpairedSecond.push_back(i);
        }
    }
    return pairing;
}

Pairing ByPosition(std::size_t firstCount, std::size_t secondCount) {
    Pairing pairing;
    for (std::size_t i = 0; i < firstCount; ++i) {
        if (i < secondCount) {
            pairing.pairs.push_back({i, i});
        } else {
            pairing.unpairedFirst.push_back(i);
        }
    }
    for (std::size_t i = firstCount; i < secondCount; ++i) {
        pairing.unpairedSecond.push_back(i);
    }
    return pairing;
}

} // namespace

PairBy ParsePairBy(const std::string& value) {
    const std::string choice =
        RequireChoice("by", value, {"auto", "id", "name", "position", "sample"});
    if (choice == "id") {
        return PairBy::Id;
    }
    if (choice == "name") {
        return PairBy::Name;
    }
    if (choice == "position" || choice == "sample") {
        return PairBy::Position;
    }
    return PairBy::Auto;
}

const char* PairByText(PairBy by) {
    switch (by) {
    case PairBy::Id:
        return "SAMPLE_ID";
    case PairBy::Name:
        return "sample name";
    default:
        return "position";
    }
}

const char* PairByKey(PairBy by) {
    switch (by) {
    case PairBy::Id:
        return "id";
    case PairBy::Name:
        return "name";
    default:
        return "position";
    }
}

Pairing PairPatches(const Chart& first, const Chart& second, PairBy by) {
    const std::size_t firstCount = first.Patches().size();
    const std::size_t secondCount = second.Patches().size();
    if (by == PairBy::Position) {
        Pairing pairing = ByPosition(firstCount, secondCount);
        pairing.by = PairBy::Position;
        return pairing;
    }
    std::vector<std::string> firstKeys;
    std::vector<std::string> secondKeys;
    std::string why;
    if (by != PairBy::Auto) {
        if (!Keys(first, by, firstKeys, why) || !Keys(second, by, secondKeys, why)) {
            throw ChartError("cannot pair by " + std::string(PairByText(by)) + ": " + why);
        }
        Pairing pairing = ByKeys(firstKeys, secondKeys);
        pairing.by = by;
        return pairing;
    }
    std::string noIds;
    if (!first.HasSampleIds() && !second.HasSampleIds()) {
        noIds = "neither file has SAMPLE_ID";
    } else if (Keys(first, PairBy::Id, firstKeys, why) &&
               Keys(second, PairBy::Id, secondKeys, why)) {
        Pairing pairing = ByKeys(firstKeys, secondKeys);
        pairing.by = PairBy::Id;
        return pairing;
    } else {
        noIds = why;
    }
    if (Keys(first, PairBy::Name, firstKeys, why) && Keys(second, PairBy::Name, secondKeys, why)) {
        Pairing pairing = ByKeys(firstKeys, secondKeys);
        pairing.by = PairBy::Name;
        pairing.fallback = noIds;
        return pairing;
    }
    Pairing pairing = ByPosition(firstCount, secondCount);
    pairing.by = PairBy::Position;
    pairing.fallback = noIds + ", and " + why;
    return pairing;
}

std::string SampleRanges(const std::vector<std::size_t>& indexes) {
    std::string text;
    for (std::size_t i = 0; i < indexes.size();) {
        std::size_t j = i;
        while (j + 1 < indexes.size() && indexes[j + 1] == indexes[j] + 1) {
            ++j;
        }
        text += (text.empty() ? "" : ", ") + std::to_string(indexes[i] + 1);
        if (j > i) {
            text += "-" + std::to_string(indexes[j] + 1);
        }
        i = j + 1;
    }
    return text;
}

std::string SamplesText(const std::vector<std::size_t>& indexes) {
    return (indexes.size() == 1 ? "sample " : "samples ") + SampleRanges(indexes);
}

std::string UnpairedText(const Chart& first, const Chart& second, const Pairing& pairing) {
    std::string text;
    const auto part = [&text](const Chart& chart, const std::vector<std::size_t>& unpaired) {
        if (unpaired.empty()) {
            return;
        }
        text += (text.empty() ? "" : " and ") + std::to_string(unpaired.size()) + " of " +
                std::to_string(chart.Patches().size()) + " patches of " + chart.Name() + " (" +
                SamplesText(unpaired) + ")";
    };
    part(first, pairing.unpairedFirst);
    part(second, pairing.unpairedSecond);
    return text;
}

} // namespace swatchlog
