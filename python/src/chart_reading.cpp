// One table of a chart file, read through the tool's chart_tables module and
// turned into arrays straight from the chart object's patches.
#include <algorithm>
#include <cctype>
#include <cmath>
#include <limits>
#include <map>
#include <numeric>
#include <optional>
#include <string>
#include <vector>

#include "chart_model.h"
#include "chart_object.h"
#include "chart_tables.h"
#include "device_space.h"
#include "patch_values.h"
#include "store_access.h"
#include "text_conversion.h"

namespace redavudeva_python {
namespace {

using namespace pybind11::literals;
using swatchlog::Space;
using PatchMap = std::map<int, CColorPatch>;

constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();

bool FileHasField(const swatchlog::LoadedTable& table, const char* field) {
    return field != nullptr && swatchlog::FieldColumn(table.Text(), field) >= 0;
}

py::array_t<bool> FalseMask(std::size_t count) {
    py::array_t<bool> mask(static_cast<py::ssize_t>(count));
    std::fill_n(mask.mutable_data(), count, false);
    return mask;
}

// The values of a space of fixed width, in the order of its columns.
template <std::size_t N> using Values = std::array<double, N>;
Values<4> CmykOf(const CColorPatch& p) {
    const tagCMYK v = p.GetCMYK();
    return {v.c, v.m, v.y, v.k};
}
Values<3> RgbOf(const CColorPatch& p) {
    const tagRGB v = p.GetRGB();
    return {static_cast<double>(v.r), static_cast<double>(v.g), static_cast<double>(v.b)};
}
Values<3> XyzOf(const CColorPatch& p) {
    const tagXYZ v = p.GetXYZ();
    return {v.x, v.y, v.z};
}
Values<3> LabOf(const CColorPatch& p) {
    const tagLAB v = p.GetLAB();
    return {v.l, v.a, v.b};
}
Values<4> DensityOf(const CColorPatch& p) {
    const tagDENSITY v = p.GetDensity();
    return {v.red, v.green, v.blue, v.visual};
}

// The rows of one space: a patch that carries it gets its values, the others
// keep NaN. `derived` is the same for every patch of a table: the library
// works a space out for every patch when the data format lacks it.
template <std::size_t N, typename Get>
void FillSpace(const PatchMap& patches, Space space, bool carried, bool derived, Get get,
               ChartObject& out, const char* key) {
    FloatArray values = NanArray(patches.size(), N);
    py::array_t<bool> mask = FalseMask(patches.size());
    if (carried) {
        double* row = values.mutable_data();
        bool* marks = mask.mutable_data();
        for (const auto& [number, patch] : patches) {
            if (swatchlog::Chart::PatchHas(patch, space)) {
                const Values<N> numbers = get(patch);
                std::copy(numbers.begin(), numbers.end(), row);
                *marks = derived;
            }
            row += N;
            ++marks;
        }
    }
    out.fixed[key] = values;
    out.derived[key] = mask;
}

// The wavelength of a spectral field name: the number after its lead-in
// (SPECTRAL_NM_380, SPECTRAL_380, NM380); NaN when it names none.
double WavelengthOf(const std::string& field) {
    for (const char* marker : {"SPECTRAL_NM_", "SPECTRAL_", "NM"}) {
        const std::size_t at = field.find(marker);
        if (at == std::string::npos) {
            continue;
        }
        std::size_t i = at + std::char_traits<char>::length(marker);
        const std::size_t first = i;
        double nm = 0.0;
        for (; i < field.size() && std::isdigit(static_cast<unsigned char>(field[i])); ++i) {
            nm = nm * 10.0 + (field[i] - '0');
        }
        return i > first ? nm : kNaN;
    }
    return kNaN;
}

// Spectral field names of the first patch with a spectrum, in name order (all
// patches of a table have the same names).
std::vector<std::string> SpectralFields(const PatchMap& patches) {
    std::vector<std::string> names;
    for (const auto& [number, patch] : patches) {
        if (patch.IsSpectralPresent()) {
            for (const auto& entry : patch.GetSpectralData()) {
                names.push_back(entry.first);
            }
            break;
        }
    }
    return names;
}

// Spectra in wavelength order. A patch keeps its spectrum's values on a grid in
// field-name order as well as in its map; the grid is read when it holds them
// all, the map otherwise.
void FillSpectra(const PatchMap& patches, ChartObject& out) {
    const std::vector<std::string> fields = SpectralFields(patches);
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

    out.spectra = NanArray(patches.size(), fields.size());
    double* row = out.spectra.mutable_data();
    for (const auto& [number, patch] : patches) {
        if (patch.IsSpectralPresent()) {
            const SpectralDataStruct grid = patch.GetSpectralDataStruct();
            if (static_cast<std::size_t>(grid.count) == fields.size()) {
                for (std::size_t c = 0; c < order.size(); ++c) {
                    row[c] = grid.values[order[c]];
                }
            } else {
                const std::vector<double> values =
                    swatchlog::SpaceNumbers(patch, Space::Spectral, fields.size());
                for (std::size_t c = 0; c < order.size(); ++c) {
                    row[c] = values[order[c]];
                }
            }
        }
        row += fields.size();
    }
    out.derived["spectra"] = FalseMask(patches.size());
}

// n-colour channels by position, named as the first patch with channels names them.
void FillNColor(const PatchMap& patches, ChartObject& out) {
    std::vector<std::string> names;
    for (const auto& [number, patch] : patches) {
        if (patch.IsNColorPresent()) {
            for (const auto& entry : patch.GetNColorMap()) {
                names.push_back(entry.second.name);
            }
            break;
        }
    }
    for (const auto& name : names) {
        out.ncolorNames.append(TextFromBytes(name));
    }
    out.ncolor = NanArray(patches.size(), names.size());
    double* row = out.ncolor.mutable_data();
    for (const auto& [number, patch] : patches) {
        if (patch.IsNColorPresent()) {
            const std::vector<double> values =
                swatchlog::SpaceNumbers(patch, Space::NColor, names.size());
            std::copy(values.begin(), values.end(), row);
        }
        row += names.size();
    }
    out.derived["ncolor"] = FalseMask(patches.size());
}

std::vector<TableInfo> TablesOf(const swatchlog::LoadedTable& table) {
    std::vector<TableInfo> tables;
    for (const auto& extent : table.Tables()) {
        TableInfo info;
        info.number = extent.number;
        info.firstLine = extent.firstLine;
        info.lastLine = extent.lastLine;
        info.dataLine = extent.dataLine;
        info.rows = extent.rowCount;
        py::list fields;
        for (const auto& field : extent.fields) {
            fields.append(TextFromBytes(field));
        }
        info.fields = py::tuple(fields);
        info.identification = TextFromBytes(extent.identification);
        tables.push_back(std::move(info));
    }
    return tables;
}

// The file's SAMPLE_ID text of every patch, or the sample numbers as text when
// the file has no SAMPLE_ID (or not one per patch).
py::array SampleIdsOf(const swatchlog::LoadedTable& table, std::size_t count) {
    const std::vector<std::string> ids = table.ColumnText("SAMPLE_ID");
    if (ids.size() != count || count == 0) {
        return NumbersAsIds(count);
    }
    py::list texts;
    for (const auto& id : ids) {
        texts.append(TextFromBytes(id));
    }
    return py::module_::import("numpy").attr("array")(texts, "dtype"_a = "str");
}

ChartObject ChartFromTable(const swatchlog::LoadedTable& table) {
    CSwatchlogBase& store = table.Chart();
    const PatchMap& patches = PatchesInPlace(store);
    const std::size_t count = patches.size();
    ChartObject out;
    out.path = TextFromBytes(table.Path());
    out.tables = TablesOf(table);
    out.table = table.Table().number;
    out.sampleNumbers = SampleNumbers(count);
    out.sampleIds = SampleIdsOf(table, count);
    bool anyHtml = false;
    for (const auto& [number, patch] : patches) {
        out.names.append(TextFromBytes(swatchlog::DisplayName(patch)));
        anyHtml = anyHtml || patch.IsHTMLCOLORPresent();
    }
    for (const auto& [key, value] : swatchlog::TableKeywords(table)) {
        out.keywords[TextFromBytes(key)] = TextFromBytes(value);
    }
    const bool fileHasCmyk = FileHasField(table, "CMYK_C");
    out.device = swatchlog::DescribeDevice(store, fileHasCmyk, anyHtml).name;

    // What the tool's Chart::Has and Chart::Derived tell, patch by patch: CMYK
    // a patch works out from its spectrum (as densities) is no device CMYK.
    const auto derived = [&table](Space space) {
        return !FileHasField(table, swatchlog::SupplyingField(space));
    };
    FillSpace<4>(patches, Space::Cmyk, fileHasCmyk, false, CmykOf, out, "cmyk");
    FillSpace<3>(patches, Space::Rgb, true, derived(Space::Rgb), RgbOf, out, "rgb");
    FillSpace<3>(patches, Space::Xyz, true, derived(Space::Xyz), XyzOf, out, "xyz");
    FillSpace<3>(patches, Space::Lab, true, derived(Space::Lab), LabOf, out, "lab");
    FillSpace<4>(patches, Space::Density, true, derived(Space::Density), DensityOf, out, "density");
    FillNColor(patches, out);
    FillSpectra(patches, out);
    return out;
}

} // namespace

FloatArray NanArray(std::size_t rows, std::size_t columns) {
    FloatArray array({static_cast<py::ssize_t>(rows), static_cast<py::ssize_t>(columns)});
    std::fill_n(array.mutable_data(), rows * columns, kNaN);
    return array;
}

py::array_t<std::int64_t> SampleNumbers(std::size_t count) {
    py::array_t<std::int64_t> numbers(static_cast<py::ssize_t>(count));
    std::iota(numbers.mutable_data(), numbers.mutable_data() + count, std::int64_t{1});
    return numbers;
}

py::array NumbersAsIds(std::size_t count) {
    py::list texts;
    for (std::size_t i = 1; i <= count; ++i) {
        texts.append(py::str(std::to_string(i)));
    }
    return py::module_::import("numpy").attr("array")(texts, "dtype"_a = "str");
}

ChartObject ReadChart(const std::string& utf8Path, int table) {
    std::optional<swatchlog::LoadedTable> loaded;
    {
        py::gil_scoped_release unlocked;
        loaded.emplace(swatchlog::LoadTable(utf8Path, table));
    }
    return ChartFromTable(*loaded);
}

} // namespace redavudeva_python
