// The conditions a chart's colorimetry was measured or computed under, as its
// header states them: illuminant, observer, measurement condition (M0 to M3)
// and filter. Colour differences between charts of different conditions are
// not colour differences of the prints.
#pragma once

#include <string>
#include <vector>

#include "chart_model.h"

namespace swatchlog {

struct StatedCondition {
    std::string value;  ///< normalised ("D50", "2°", "M1", "UV-CUT"); empty when not stated
    std::string source; ///< "ILLUMINANT on line 4"
};

struct MeasurementConditions {
    StatedCondition illuminant;
    StatedCondition observer;
    StatedCondition mode;   ///< measurement condition M0 to M3
    StatedCondition filter; ///< the filter of MEASUREMENT_SOURCE
};

/// What the table's header states, from the keywords ILLUMINANT, OBSERVER,
/// MEASUREMENT_CONDITION, WEIGHTING_FUNCTION ("ILLUMINANT, D50", "OBSERVER,
/// 2 degree") and MEASUREMENT_SOURCE ("Illumination=D50 ObserverAngle=2
/// Filter=No"); the last statement of each wins.
MeasurementConditions ReadConditions(const Chart& chart);

struct ConditionCheck {
    std::vector<std::string> conflicts; ///< conditions both charts state differently
    std::vector<std::string> oneSided;  ///< conditions only one chart states
};

/// Compares the conditions of two charts, in sentences naming the charts.
ConditionCheck CompareConditions(const Chart& first, const Chart& second);

} // namespace swatchlog
