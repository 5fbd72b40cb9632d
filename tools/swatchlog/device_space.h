// The device colour space of a chart in words, as the tool reports it.
#pragma once

#include <string>

#include "chart_model.h"

namespace swatchlog {

struct DeviceSpace {
    std::string name; ///< "CMYK", "RGB", "n-colour", "HTML colour", "none" ...
    int channels = 0; ///< device channels; 0 when the chart has no device values
};

/// The chart's device colour space and channel count. The library reports CMYK
/// for a chart of spectra alone (its patches keep their densities as CMYK) and
/// for one with HTML colours; those are told apart here.
DeviceSpace DescribeDevice(const Chart& chart);
/// The same for a chart object whose file has CMYK fields or not
/// (`fileHasCmyk`) and of which any patch has an HTML colour or not.
DeviceSpace DescribeDevice(CSwatchlogBase& store, bool fileHasCmyk, bool anyHtml);

} // namespace swatchlog
