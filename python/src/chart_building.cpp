// A chart built from arrays, and the shape rules every chart keeps.
#include <cmath>
#include <string>

#include "chart_object.h"
#include "keyword_names.h"
#include "text_conversion.h"

namespace redavudeva_python {
namespace {

using namespace pybind11::literals;

std::string ShapeText(const py::array& array) {
    std::string text = "(";
    for (py::ssize_t d = 0; d < array.ndim(); ++d) {
        text += (d > 0 ? ", " : "") + std::to_string(array.shape(d));
    }
    return text + (array.ndim() == 1 ? ",)" : ")");
}

// The argument as a new C-ordered float64 array (a copy, so that the chart
// does not share memory with the caller's array).
FloatArray FloatCopy(const py::object& value, const char* name, py::ssize_t dimensions) {
    py::object array;
    try {
        array = py::module_::import("numpy").attr("array")(value, "dtype"_a = "float64",
                                                           "copy"_a = true, "order"_a = "C");
    } catch (const py::error_already_set&) {
        throw py::type_error(std::string(name) + " must be an array of numbers");
    }
    FloatArray result = array.cast<FloatArray>();
    if (result.ndim() != dimensions) {
        throw py::value_error(std::string(name) + " must have " + std::to_string(dimensions) +
                              (dimensions == 1 ? " dimension" : " dimensions") + ", not shape " +
                              ShapeText(result));
    }
    return result;
}

// The patch count the arguments agree on so far (-1 before the first).
void AgreeOnCount(py::ssize_t rows, const char* name, py::ssize_t& count, std::string& first) {
    if (count < 0) {
        count = rows;
        first = name;
    } else if (rows != count) {
        throw py::value_error(std::string(name) + " has " + std::to_string(rows) + " patches but " +
                              first + " has " + std::to_string(count));
    }
}

void CheckRows(const py::handle& array, const char* name, std::size_t patches,
               py::ssize_t channels) {
    const auto values = py::reinterpret_borrow<py::object>(array).cast<py::array>();
    if (values.ndim() != 2 || values.shape(0) != static_cast<py::ssize_t>(patches) ||
        (channels >= 0 && values.shape(1) != channels)) {
        throw py::value_error(std::string(name) + " must have shape (" + std::to_string(patches) +
                              ", " + (channels >= 0 ? std::to_string(channels) : "n") + "), not " +
                              ShapeText(values));
    }
}

py::dict KeywordsInFileForm(const py::object& keywords) {
    py::dict out;
    if (keywords.is_none()) {
        return out;
    }
    for (const auto item : py::dict(keywords)) {
        const std::string key = BytesFromText(item.first, "a keyword name");
        if (!swatchlog::IsValidKeywordName(key)) {
            throw py::value_error("keyword \"" + key +
                                  "\" is not a keyword name (letters, digits and underscores, "
                                  "beginning with a letter)");
        }
        const py::handle raw = item.second;
        const std::string value = PyUnicode_Check(raw.ptr()) ? BytesFromText(raw, "a keyword value")
                                                             : std::string(py::str(raw));
        bool ok = false;
        const std::string text = swatchlog::KeywordValueText(value, ok);
        if (!ok) {
            throw py::value_error("the value of keyword " + key +
                                  " cannot be written (line breaks, or double quotes inside)");
        }
        out[item.first] = TextFromBytes(text);
    }
    return out;
}

} // namespace

ChartObject ChartFromArrays(py::object names, py::object cmyk, py::object rgb, py::object xyz,
                            py::object lab, py::object ncolor, py::object ncolorNames,
                            py::object spectra, py::object wavelengths, py::object keywords) {
    py::ssize_t count = -1;
    std::string first;
    py::list nameList;
    if (!names.is_none()) {
        for (const auto name : py::iterable(names)) {
            BytesFromText(name, "every name");
            nameList.append(name);
        }
        AgreeOnCount(static_cast<py::ssize_t>(nameList.size()), "names", count, first);
    }
    const py::object given[] = {cmyk, rgb, xyz, lab};
    py::dict fixed;
    for (std::size_t s = 0; s < 4; ++s) {
        if (!given[s].is_none()) {
            const FixedSpace& space = kFixedSpaces[s];
            FloatArray values = FloatCopy(given[s], space.key, 2);
            AgreeOnCount(values.shape(0), space.key, count, first);
            CheckRows(values, space.key, static_cast<std::size_t>(count),
                      static_cast<py::ssize_t>(space.channels));
            fixed[space.key] = values;
        }
    }
    FloatArray ncolorValues;
    if (!ncolor.is_none()) {
        ncolorValues = FloatCopy(ncolor, "ncolor", 2);
        AgreeOnCount(ncolorValues.shape(0), "ncolor", count, first);
    } else if (!ncolorNames.is_none()) {
        throw py::value_error("ncolor_names given without ncolor");
    }
    FloatArray spectraValues;
    if (!spectra.is_none()) {
        spectraValues = FloatCopy(spectra, "spectra", 2);
        AgreeOnCount(spectraValues.shape(0), "spectra", count, first);
        if (wavelengths.is_none()) {
            throw py::value_error("spectra need their wavelengths");
        }
    } else if (!wavelengths.is_none()) {
        throw py::value_error("wavelengths given without spectra");
    }

    ChartObject chart;
    const auto patches = static_cast<std::size_t>(count < 0 ? 0 : count);
    chart.sampleNumbers = SampleNumbers(patches);
    chart.sampleIds = NumbersAsIds(patches);
    chart.names = nameList;
    for (std::size_t i = nameList.size(); i < patches; ++i) {
        chart.names.append(py::str(""));
    }
    chart.keywords = KeywordsInFileForm(keywords);
    for (const FixedSpace& space : kFixedSpaces) {
        chart.fixed[space.key] = fixed.contains(space.key)
                                     ? py::object(fixed[space.key])
                                     : py::object(NanArray(patches, space.channels));
    }
    chart.ncolor = ncolor.is_none() ? NanArray(patches, 0) : ncolorValues;
    const auto channels = static_cast<std::size_t>(chart.ncolor.shape(1));
    if (ncolorNames.is_none()) {
        for (std::size_t c = 0; c < channels; ++c) {
            chart.ncolorNames.append(std::to_string(channels) + "CLR_" + std::to_string(c + 1));
        }
    } else {
        for (const auto name : py::iterable(ncolorNames)) {
            BytesFromText(name, "every n-colour channel name");
            chart.ncolorNames.append(name);
        }
    }
    chart.spectra = spectra.is_none() ? NanArray(patches, 0) : spectraValues;
    chart.wavelengths =
        wavelengths.is_none() ? FloatArray(0) : FloatCopy(wavelengths, "wavelengths", 1);
    for (const char* key : {"cmyk", "rgb", "xyz", "lab", "density", "ncolor", "spectra"}) {
        py::array_t<bool> mask(static_cast<py::ssize_t>(patches));
        std::fill_n(mask.mutable_data(), patches, false);
        chart.derived[key] = mask;
    }
    chart.device = channels > 0             ? "n-colour"
                   : fixed.contains("rgb")  ? "RGB"
                   : fixed.contains("cmyk") ? "CMYK"
                   : fixed.contains("lab")  ? "L*a*b*"
                                            : "none";
    CheckShapes(chart);
    return chart;
}

void CheckShapes(const ChartObject& chart) {
    const std::size_t patches = chart.Size();
    if (chart.names.size() != patches) {
        throw py::value_error("names has " + std::to_string(chart.names.size()) + " entries for " +
                              std::to_string(patches) + " patches");
    }
    for (const FixedSpace& space : kFixedSpaces) {
        CheckRows(chart.fixed[space.key], space.key, patches,
                  static_cast<py::ssize_t>(space.channels));
    }
    CheckRows(chart.ncolor, "ncolor", patches, static_cast<py::ssize_t>(chart.ncolorNames.size()));
    CheckRows(chart.spectra, "spectra", patches, chart.wavelengths.size());
}

} // namespace redavudeva_python
