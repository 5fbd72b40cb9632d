// A chart read by the tool's chart model, turned into arrays.
#include <algorithm>
#include <cctype>
#include <cmath>
#include <limits>
#include <numeric>
#include <optional>
#include <string>
#include <vector>

#include "chart_model.h"
#include "chart_object.h"
#include "device_space.h"
#include "patch_values.h"
#include "text_conversion.h"

namespace redavudeva_python {
namespace {

using swatchlog::Space;

constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();

Space SpaceOfKey(const std::string& key) {
    Space space = Space::Cmyk;
    swatchlog::SpaceFromKey(key, space);
    return space;
}

// Rows of a space: each patch that carries it gets its values, the others keep
// NaN; `derived` marks the patches whose values the library worked out.
void FillRows(const swatchlog::Chart& chart, Space space, FloatArray& values,
              py::array_t<bool>& derived) {
    auto rows = values.mutable_unchecked<2>();
    auto mask = derived.mutable_unchecked<1>();
    const bool worked = chart.Derived(space);
    const auto columns = static_cast<std::size_t>(values.shape(1));
    const auto& patches = chart.Patches();
    for (std::size_t i = 0; i < patches.size(); ++i) {
        if (!swatchlog::Chart::PatchHas(patches[i], space)) {
            continue;
        }
        const std::vector<double> numbers = swatchlog::SpaceNumbers(patches[i], space, columns);
        for (std::size_t c = 0; c < columns && c < numbers.size(); ++c) {
            rows(i, c) = numbers[c];
        }
        mask(i) = worked;
    }
}

// The wavelength of a spectral field name: the number after its lead-in
// (SPECTRAL_NM_380, SPECTRAL_380, NM380); NaN when it names none.
double WavelengthOf(const std::string& field) {
    for (const char* marker : {"SPECTRAL_NM_", "SPECTRAL_", "NM"}) {
        const std::size_t at = field.find(marker);
        if (at == std::string::npos) {
            continue;
        }
        std::string rest = field;
        rest.erase(at, std::char_traits<char>::length(marker));
        std::size_t i = 0;
        double nm = 0.0;
        for (; i < rest.size() && std::isdigit(static_cast<unsigned char>(rest[i])); ++i) {
            nm = nm * 10.0 + (rest[i] - '0');
        }
        return i > 0 ? nm : kNaN;
    }
    return kNaN;
}

// Spectra in wavelength order. A patch keeps its values on its wavelength grid
// in field-name order; the map is only copied when the grid could not hold
// them all.
void FillSpectra(const swatchlog::Chart& chart, ChartObject& out) {
    const std::vector<std::string> fields = chart.SpectralFields();
    std::vector<double> nm(fields.size());
    std::transform(fields.begin(), fields.end(), nm.begin(), WavelengthOf);
    std::vector<std::size_t> order(fields.size());
    std::iota(order.begin(), order.end(), 0);
    std::stable_sort(order.begin(), order.end(), [&nm](std::size_t a, std::size_t b) {
        return nm[a] < nm[b] || (!std::isnan(nm[a]) && std::isnan(nm[b]));
    });
    out.wavelengths = FloatArray(static_cast<py::ssize_t>(fields.size()));
    for (std::size_t c = 0; c < order.size(); ++c) {
        out.wavelengths.mutable_at(c) = nm[order[c]];
    }

    const auto& patches = chart.Patches();
    out.spectra = NanArray(patches.size(), fields.size());
    auto rows = out.spectra.mutable_unchecked<2>();
    for (std::size_t i = 0; i < patches.size(); ++i) {
        if (!patches[i].IsSpectralPresent()) {
            continue;
        }
        const SpectralDataStruct grid = patches[i].GetSpectralDataStruct();
        if (static_cast<std::size_t>(grid.count) == fields.size()) {
            for (std::size_t c = 0; c < order.size(); ++c) {
                rows(i, c) = grid.values[order[c]];
            }
            continue;
        }
        const std::vector<double> values =
            swatchlog::SpaceNumbers(patches[i], Space::Spectral, fields.size());
        for (std::size_t c = 0; c < order.size(); ++c) {
            rows(i, c) = values[order[c]];
        }
    }
}

} // namespace

FloatArray NanArray(std::size_t rows, std::size_t columns) {
    FloatArray array({static_cast<py::ssize_t>(rows), static_cast<py::ssize_t>(columns)});
    std::fill_n(array.mutable_data(), rows * columns, kNaN);
    return array;
}

ChartObject ChartFromToolChart(const swatchlog::Chart& chart) {
    const auto& patches = chart.Patches();
    const std::size_t count = patches.size();
    ChartObject out;
    out.path = TextFromBytes(chart.Path());
    out.sampleIds = py::array_t<std::int64_t>(static_cast<py::ssize_t>(count));
    for (std::size_t i = 0; i < count; ++i) {
        out.sampleIds.mutable_at(i) = static_cast<std::int64_t>(i + 1);
        out.names.append(TextFromBytes(swatchlog::DisplayName(patches[i])));
    }
    for (const auto& [key, value] : chart.Keywords()) {
        out.keywords[TextFromBytes(key)] = TextFromBytes(value);
    }
    out.device = swatchlog::DescribeDevice(chart).name;

    auto newMask = [count] {
        py::array_t<bool> mask(static_cast<py::ssize_t>(count));
        std::fill_n(mask.mutable_data(), count, false);
        return mask;
    };
    for (const FixedSpace& fixed : kFixedSpaces) {
        FloatArray values = NanArray(count, fixed.channels);
        py::array_t<bool> derived = newMask();
        const Space space = SpaceOfKey(fixed.key);
        if (chart.Has(space)) {
            FillRows(chart, space, values, derived);
        }
        out.fixed[fixed.key] = values;
        out.derived[fixed.key] = derived;
    }

    const std::vector<std::string> channelNames = chart.NColorNames();
    for (const auto& name : channelNames) {
        out.ncolorNames.append(TextFromBytes(name));
    }
    out.ncolor = NanArray(count, channelNames.size());
    py::array_t<bool> ncolorDerived = newMask();
    if (chart.Has(Space::NColor)) {
        FillRows(chart, Space::NColor, out.ncolor, ncolorDerived);
    }
    out.derived["ncolor"] = ncolorDerived;

    FillSpectra(chart, out);
    out.derived["spectra"] = newMask();
    return out;
}

ChartObject ReadChart(const std::string& utf8Path) {
    std::optional<swatchlog::Chart> chart;
    {
        py::gil_scoped_release unlocked;
        chart.emplace(swatchlog::Chart::Load(utf8Path));
    }
    return ChartFromToolChart(*chart);
}

} // namespace redavudeva_python
