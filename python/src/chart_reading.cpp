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

// An array of `rows` x `columns` whose values are still to be set.
FloatArray RowsOf(std::size_t rows, std::size_t columns) {
    return FloatArray({static_cast<py::ssize_t>(rows), static_cast<py::ssize_t>(columns)});
}

py::array_t<bool> FalseMask(std::size_t count) {
    py::array_t<bool> mask(static_cast<py::ssize_t>(count));
    std::fill_n(mask.mutable_data(), count, false);
    return mask;
}

// One colour space of fixed width being filled row by row: a patch that
// carries it gets its values, the others NaN. `derived` is the same for every
// patch of a table: the library works a space out for every patch when the
// data format lacks it.
template <std::size_t N> class SpaceRows {
public:
    SpaceRows(std::size_t count, Space space, bool carried, bool derived)
        : values_(RowsOf(count, N)), marks_(FalseMask(count)), space_(space), carried_(carried),
          derived_(derived), row_(values_.mutable_data()), mark_(marks_.mutable_data()) {}

    /// Fills the next row from `patch`; `get` answers the space's N values.
    template <typename Get> void Next(const CColorPatch& patch, Get get) {
        if (carried_ && swatchlog::Chart::PatchHas(patch, space_)) {
            const std::array<double, N> numbers = get(patch);
            std::copy(numbers.begin(), numbers.end(), row_);
            *mark_ = derived_;
        } else {
            std::fill_n(row_, N, kNaN);
        }
        row_ += N;
        ++mark_;
    }

    void Store(ChartObject& out, const char* key) {
        out.fixed[key] = values_;
        out.derived[key] = marks_;
    }

private:
    FloatArray values_;
    py::array_t<bool> marks_;
    Space space_;
    bool carried_;
    bool derived_;
    double* row_;
    bool* mark_;
};

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

// Spectral columns in wavelength order: the wavelengths, and for each column
// the position of its field in name order.
struct SpectralColumns {
    std::size_t fieldCount = 0;
    std::vector<std::size_t> order;
};

SpectralColumns SortSpectralColumns(const PatchMap& patches, ChartObject& out) {
    const std::vector<std::string> fields = SpectralFields(patches);
    std::vector<double> nm(fields.size());
    std::transform(fields.begin(), fields.end(), nm.begin(), WavelengthOf);
    SpectralColumns columns;
    columns.fieldCount = fields.size();
    columns.order.resize(fields.size());
    std::iota(columns.order.begin(), columns.order.end(), 0);
    std::stable_sort(columns.order.begin(), columns.order.end(),
                     [&nm](std::size_t a, std::size_t b) {
                         return nm[a] < nm[b] || (!std::isnan(nm[a]) && std::isnan(nm[b]));
                     });
    out.wavelengths = FloatArray(static_cast<py::ssize_t>(fields.size()));
    for (std::size_t c = 0; c < columns.order.size(); ++c) {
        out.wavelengths.mutable_at(c) = nm[columns.order[c]];
    }
    return columns;
}

// A patch's spectrum in wavelength order, NaN when it has none. A patch keeps
// its spectrum's values on a grid in field-name order as well as in its map;
// the grid is read when it holds them all, the map otherwise.
void PutSpectrum(const CColorPatch& patch, const SpectralColumns& columns, double* row) {
    const std::size_t count = columns.fieldCount;
    if (!patch.IsSpectralPresent()) {
        std::fill_n(row, count, kNaN);
        return;
    }
    const SpectralDataStruct grid = patch.GetSpectralDataStruct();
    if (static_cast<std::size_t>(grid.count) == count) {
        for (std::size_t c = 0; c < count; ++c) {
            row[c] = grid.values[columns.order[c]];
        }
        return;
    }
    const std::vector<double> values = swatchlog::SpaceNumbers(patch, Space::Spectral, count);
    for (std::size_t c = 0; c < count; ++c) {
        row[c] = values[columns.order[c]];
    }
}

// n-colour channel names by position, as the first patch with channels names them.
std::vector<std::string> NColorNames(const PatchMap& patches) {
    std::vector<std::string> names;
    for (const auto& [number, patch] : patches) {
        if (patch.IsNColorPresent()) {
            for (const auto& entry : patch.GetNColorMap()) {
                names.push_back(entry.second.name);
            }
            break;
        }
    }
    return names;
}

void PutChannels(const CColorPatch& patch, std::size_t count, double* row) {
    if (count == 0) {
        return;
    }
    if (!patch.IsNColorPresent()) {
        std::fill_n(row, count, kNaN);
        return;
    }
    const std::vector<double> values = swatchlog::SpaceNumbers(patch, Space::NColor, count);
    std::copy(values.begin(), values.end(), row);
}

// The file's SAMPLE_ID text of every patch, or the sample numbers as text when
// the file has no SAMPLE_ID (or not one per patch).
py::array SampleIdsOf(const swatchlog::LoadedTable& table, std::size_t count) {
    const std::vector<std::string> ids = table.ColumnText("SAMPLE_ID");
    if (ids.size() != count || count == 0) {
        return NumbersAsIds(count);
    }
    return TextArray(ids);
}

ChartObject ChartFromTable(const swatchlog::LoadedTable& table) {
    CSwatchlogBase& store = table.Chart();
    const PatchMap& patches = PatchesInPlace(store);
    const std::size_t count = patches.size();
    ChartObject out;
    out.path = TextFromBytes(table.Path());
    out.tables = table.Tables();
    out.table = table.Table().number;
    out.sampleNumbers = SampleNumbers(count);
    out.sampleIds = SampleIdsOf(table, count);
    for (const auto& [key, value] : swatchlog::TableKeywords(table)) {
        out.keywords[TextFromBytes(key)] = TextFromBytes(value);
    }

    // What the tool's Chart::Has and Chart::Derived tell, patch by patch: CMYK
    // a patch works out from its spectrum (as densities) is no device CMYK.
    const bool fileHasCmyk = FileHasField(table, "CMYK_C");
    const auto derived = [&table](Space space) {
        return !FileHasField(table, swatchlog::SupplyingField(space));
    };
    SpaceRows<4> cmyk(count, Space::Cmyk, fileHasCmyk, false);
    SpaceRows<3> rgb(count, Space::Rgb, true, derived(Space::Rgb));
    SpaceRows<3> xyz(count, Space::Xyz, true, derived(Space::Xyz));
    SpaceRows<3> lab(count, Space::Lab, true, derived(Space::Lab));
    SpaceRows<4> density(count, Space::Density, true, derived(Space::Density));
    const std::vector<std::string> channelNames = NColorNames(patches);
    const std::size_t channels = channelNames.size();
    out.ncolor = RowsOf(count, channels);
    const SpectralColumns spectral = SortSpectralColumns(patches, out);
    out.spectra = RowsOf(count, spectral.fieldCount);

    // One walk over the patches fills every array: each patch is visited once,
    // while it is in the cache.
    double* channelRow = out.ncolor.mutable_data();
    double* spectrumRow = out.spectra.mutable_data();
    bool anyHtml = false;
    for (const auto& [number, patch] : patches) {
        out.names.append(TextFromBytes(swatchlog::DisplayName(patch)));
        anyHtml = anyHtml || patch.IsHTMLCOLORPresent();
        cmyk.Next(patch, [](const CColorPatch& p) {
            const tagCMYK v = p.GetCMYK();
            return std::array<double, 4>{v.c, v.m, v.y, v.k};
        });
        rgb.Next(patch, [](const CColorPatch& p) {
            const tagRGB v = p.GetRGB();
            return std::array<double, 3>{static_cast<double>(v.r), static_cast<double>(v.g),
                                         static_cast<double>(v.b)};
        });
        xyz.Next(patch, [](const CColorPatch& p) {
            const tagXYZ v = p.GetXYZ();
            return std::array<double, 3>{v.x, v.y, v.z};
        });
        lab.Next(patch, [](const CColorPatch& p) {
            const tagLAB v = p.GetLAB();
            return std::array<double, 3>{v.l, v.a, v.b};
        });
        density.Next(patch, [](const CColorPatch& p) {
            const tagDENSITY v = p.GetDensity();
            return std::array<double, 4>{v.red, v.green, v.blue, v.visual};
        });
        PutChannels(patch, channels, channelRow);
        channelRow += channels;
        PutSpectrum(patch, spectral, spectrumRow);
        spectrumRow += spectral.fieldCount;
    }
    cmyk.Store(out, "cmyk");
    rgb.Store(out, "rgb");
    xyz.Store(out, "xyz");
    lab.Store(out, "lab");
    density.Store(out, "density");
    for (const auto& name : channelNames) {
        out.ncolorNames.append(TextFromBytes(name));
    }
    out.derived["ncolor"] = FalseMask(count);
    out.derived["spectra"] = FalseMask(count);
    out.device = swatchlog::DescribeDevice(store, fileHasCmyk, anyHtml).name;
    return out;
}

} // namespace

FloatArray NanArray(std::size_t rows, std::size_t columns) {
    FloatArray array = RowsOf(rows, columns);
    std::fill_n(array.mutable_data(), rows * columns, kNaN);
    return array;
}

py::array_t<std::int64_t> SampleNumbers(std::size_t count) {
    py::array_t<std::int64_t> numbers(static_cast<py::ssize_t>(count));
    std::iota(numbers.mutable_data(), numbers.mutable_data() + count, std::int64_t{1});
    return numbers;
}

py::array NumbersAsIds(std::size_t count) {
    std::vector<std::string> numbers;
    numbers.reserve(count);
    for (std::size_t i = 1; i <= count; ++i) {
        numbers.push_back(std::to_string(i));
    }
    return TextArray(numbers);
}

py::array TextArray(const std::vector<std::string>& texts) {
    std::size_t width = 1;
    bool ascii = true;
    for (const auto& text : texts) {
        width = std::max(width, text.size());
        ascii = ascii && std::all_of(text.begin(), text.end(),
                                     [](char c) { return static_cast<unsigned char>(c) < 0x80; });
    }
    if (!ascii) {
        py::list list;
        for (const auto& text : texts) {
            list.append(TextFromBytes(text));
        }
        return py::module_::import("numpy").attr("array")(list, "dtype"_a = "str");
    }
    // ASCII text goes straight into NumPy's fixed-width str array: one 32-bit
    // code point per character, padded with zeros.
    py::array array(py::dtype("U" + std::to_string(width)),
                    std::vector<py::ssize_t>{static_cast<py::ssize_t>(texts.size())});
    auto* points = static_cast<std::uint32_t*>(array.mutable_data());
    std::fill_n(points, texts.size() * width, 0u);
    for (std::size_t i = 0; i < texts.size(); ++i) {
        std::transform(texts[i].begin(), texts[i].end(), points + i * width,
                       [](char c) { return static_cast<std::uint32_t>(c); });
    }
    return array;
}

ChartObject ReadChart(const std::string& utf8Path, int table) {
    std::optional<swatchlog::LoadedTable> loaded;
    {
        py::gil_scoped_release unlocked;
        loaded.emplace(swatchlog::LoadTable(utf8Path, table));
    }
    ChartObject chart = ChartFromTable(*loaded);
    // Letting go of the chart object's patches takes a while; other threads may run meanwhile.
    py::gil_scoped_release unlocked;
    loaded.reset();
    return chart;
}

} // namespace redavudeva_python
