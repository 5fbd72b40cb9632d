// The redavudeva Python module: charts as NumPy arrays, the writers, and the
// tool's colour differences.
#include <pybind11/numpy.h>
#include <pybind11/pybind11.h>
#include <pybind11/stl.h>

#include <string>

#include "chart_errors.h"
#include "chart_object.h"
#include "chart_writers.h"
#include "colour_difference.h"
#include "file_paths.h"
#include "text_conversion.h"
#include "utf8_text.h"

namespace py = pybind11;
using namespace pybind11::literals;
using redavudeva_python::ChartObject;

namespace {

constexpr const char* kModuleDoc =
    "Colour measurement charts in the IT8.7 / CGATS.17 text format as NumPy arrays.\n\n"
    "read() gives a Chart whose colour spaces are float arrays with one row per\n"
    "patch (NaN where a patch lacks a value); Chart.from_arrays() and\n"
    "Chart.write() make new chart files; merge() and write_target() run the\n"
    "writers that start from an existing file; delta_e() computes CIEDE2000 and\n"
    "CIE76 colour differences. Failures raise ChartError.\n";

constexpr const char* kReadDoc =
    "Read the chart file at `path` (str, bytes or os.PathLike).\n\n"
    "The library derives what a data row lacks where it can (XYZ and densities\n"
    "from the spectrum, L*a*b* from XYZ, XYZ from L*a*b*, RGB from XYZ or CMYK);\n"
    "Chart.derived tells those values apart. Raises ChartError when the file\n"
    "cannot be read (with the library's result code), ValueError or IndexError\n"
    "when a layout keyword or spectral field name holds no usable number.\n";

constexpr const char* kChartDoc =
    "One chart: its patches in sample-number order and its header keywords.\n\n"
    "Colour spaces are float64 arrays of shape (patches, channels) with NaN\n"
    "where a patch lacks the value: cmyk (percent), rgb (0-255), xyz (Y = 100\n"
    "for the perfect white), lab, density (red, green, blue, visual), ncolor\n"
    "(percent, one column per entry of ncolor_names) and spectra (reflectance\n"
    "factors, one column per entry of wavelengths). The arrays may be changed in\n"
    "place before write().\n";

constexpr const char* kFromArraysDoc =
    "Build a chart from arrays; every argument is optional, and all given\n"
    "arrays and names must have one row per patch.\n\n"
    "names: sample names; cmyk (n, 4), rgb (n, 3), xyz (n, 3), lab (n, 3):\n"
    "array-likes of numbers; ncolor (n, k) with ncolor_names (k names,\n"
    "default \"kCLR_1\" ...); spectra (n, w) with wavelengths (w whole\n"
    "nanometres); keywords: a mapping of keyword names to values (text is put\n"
    "in double quotes, numbers stay as they are). The arrays are copied.\n"
    "Nothing is derived: read the written file back for that. Raises ValueError\n"
    "when the shapes disagree or a keyword cannot be written, TypeError for\n"
    "values of the wrong kind.\n";

constexpr const char* kWriteDoc =
    "Write the chart as a new CGATS.17 file at `path` through the library's\n"
    "new-file writer: keywords, sample names, CMYK, RGB, XYZ, L*a*b*, n-colour\n"
    "channels and spectra, each colour space that holds any value (RGB the\n"
    "library derived is left out; densities have no columns in this format).\n"
    "CMYK, XYZ, L*a*b* and channels are written with 2 decimals, spectra with 5,\n"
    "RGB as whole numbers. The file appears whole or not at all.\n\n"
    "Raises ValueError when the chart has no patches or no values, when a\n"
    "written colour space lacks a value for some patch (NaN), or when a name,\n"
    "keyword or wavelength cannot be written; ChartError when the file cannot\n"
    "be written (code 23).\n";

constexpr const char* kMergeDoc =
    "Put the measurements of the chart file `measured` (L*a*b*, XYZ, spectra and\n"
    "the densities computed from them) into the target file `target` and write\n"
    "the result to `output`, as 'swatchlog merge' does.\n\n"
    "By default the data block is rebuilt from the target's device values and\n"
    "the measurements; with append_missing the target's rows are kept and the\n"
    "colour spaces it lacks are appended, and exact then requires the patch\n"
    "counts to agree exactly. Raises ValueError when `output` is one of the\n"
    "inputs, ChartError when a file cannot be read or written or the\n"
    "measurements do not fit the target (code 24).\n";

constexpr const char* kTargetDoc =
    "Write the chart file `chart` reduced to its clean patches (one colorant\n"
    "alone) and its first white patch to `output`, with the layout keywords set\n"
    "to the new patch count, as 'swatchlog target' does. Raises ValueError when\n"
    "`output` is `chart` itself, ChartError when a file cannot be read or\n"
    "written or the chart has no clean and no white patch (code 1).\n";

constexpr const char* kDeltaEDoc =
    "Colour differences between L*a*b* colours, with the swatchlog tool's code.\n\n"
    "lab1 and lab2 are array-likes whose last axis holds L*, a*, b*; they are\n"
    "broadcast against each other. method is \"CIE2000\" (CIEDE2000 with\n"
    "kL = kC = kH = 1) or \"CIE1976\" (Euclidean distance). Returns an array of\n"
    "the broadcast shape without the last axis (NaN where an input is NaN), or\n"
    "a float for two single colours.\n";

void RequireSeparateOutput(const std::string& output, std::initializer_list<std::string> inputs) {
    for (const auto& input : inputs) {
        if (swatchlog::SameFile(input, output)) {
            throw py::value_error("the output file " + swatchlog::RepairUtf8(output) +
                                  " is an input file; refusing to overwrite it");
        }
    }
}

py::object Fixed(const ChartObject& chart, const char* key) {
    return chart.fixed[key];
}

} // namespace

PYBIND11_MODULE(_redavudeva, module) {
    module.doc() = kModuleDoc;
    redavudeva_python::RegisterChartError(module);

    py::class_<ChartObject> chart(module, "Chart", kChartDoc);
    chart.def_property_readonly(
        "path", [](const ChartObject& c) { return c.path; },
        "The file the chart was read from (str), or None for a chart built from arrays.");
    chart.def_property_readonly(
        "sample_ids", [](const ChartObject& c) { return c.sampleIds; },
        "Sample numbers 1 ... N of the patches, in data-row order (int64 array).");
    chart.def_property_readonly(
        "names", [](const ChartObject& c) { return c.names; },
        "Sample names (list of str) without the double quotes a file may put around\n"
        "them; empty strings when the chart has none.");
    chart.def_property_readonly(
        "keywords", [](const ChartObject& c) { return c.keywords; },
        "Header keywords (dict of str to str) as the file has them, text values in\n"
        "double quotes; without the identification line, comments, KEYWORD\n"
        "declarations and PROCESSCOLOR_ID.");
    chart.def_property_readonly(
        "device", [](const ChartObject& c) { return c.device; },
        "Name of the device colour space: \"CMYK\", \"RGB\", \"n-colour\",\n"
        "\"six-colour CMYKOG\", \"CMYK+RGB\", \"HTML colour\", \"L*a*b*\" or \"none\",\n"
        "as 'swatchlog info' reports it.");
    chart.def_property_readonly(
        "cmyk", [](const ChartObject& c) { return Fixed(c, "cmyk"); },
        "CMYK tone values in percent, (patches, 4); NaN unless the file has CMYK\n"
        "fields.");
    chart.def_property_readonly(
        "rgb", [](const ChartObject& c) { return Fixed(c, "rgb"); },
        "RGB values 0-255, (patches, 3).");
    chart.def_property_readonly(
        "xyz", [](const ChartObject& c) { return Fixed(c, "xyz"); },
        "CIE XYZ with Y = 100 for the perfect white, (patches, 3).");
    chart.def_property_readonly(
        "lab", [](const ChartObject& c) { return Fixed(c, "lab"); }, "CIE L*a*b*, (patches, 3).");
    chart.def_property_readonly(
        "density", [](const ChartObject& c) { return Fixed(c, "density"); },
        "Red, green, blue and visual densities, (patches, 4).");
    chart.def_property_readonly(
        "ncolor", [](const ChartObject& c) { return c.ncolor; },
        "n-colour channel values in percent, (patches, len(ncolor_names)).");
    chart.def_property_readonly(
        "ncolor_names", [](const ChartObject& c) { return c.ncolorNames; },
        "Field names of the n-colour channels (list of str), in channel order.");
    chart.def_property_readonly(
        "wavelengths", [](const ChartObject& c) { return c.wavelengths; },
        "Wavelengths of the spectral columns in nm (float64 array, ascending).");
    chart.def_property_readonly(
        "spectra", [](const ChartObject& c) { return c.spectra; },
        "Reflectance factors (1.0 = perfect white), (patches, len(wavelengths)).");
    chart.def_property_readonly(
        "derived", [](const ChartObject& c) { return c.derived; },
        "Per colour space (\"cmyk\", \"rgb\", \"xyz\", \"lab\", \"density\",\n"
        "\"ncolor\", \"spectra\"), a bool array (patches,) that is True where the\n"
        "library worked the value out because the file did not have it.");
    chart.def("__len__", &ChartObject::Size, "The number of patches.");
    chart.def(
        "__repr__",
        [](const ChartObject& c) {
            std::string text =
                "<redavudeva.Chart " + std::to_string(c.Size()) + " patches, device " + c.device;
            if (!c.path.is_none()) {
                text += ", from " + std::string(py::repr(c.path));
            }
            return text + ">";
        },
        "A short description: patch count, device space, file.");
    chart.def_static(
        "from_arrays", &redavudeva_python::ChartFromArrays, kFromArraysDoc, py::kw_only(),
        "names"_a = py::none(), "cmyk"_a = py::none(), "rgb"_a = py::none(), "xyz"_a = py::none(),
        "lab"_a = py::none(), "ncolor"_a = py::none(), "ncolor_names"_a = py::none(),
        "spectra"_a = py::none(), "wavelengths"_a = py::none(), "keywords"_a = py::none());
    chart.def(
        "write",
        [](const ChartObject& c, const py::object& path) {
            redavudeva_python::WriteChart(c, redavudeva_python::PathArgument(path));
        },
        kWriteDoc, "path"_a);

    module.def(
        "read",
        [](const py::object& path) {
            return redavudeva_python::ReadChart(redavudeva_python::PathArgument(path));
        },
        kReadDoc, "path"_a);
    module.def(
        "merge",
        [](const py::object& target, const py::object& measured, const py::object& output,
           bool appendMissing, bool exact) {
            const std::string targetPath = redavudeva_python::PathArgument(target);
            const std::string measuredPath = redavudeva_python::PathArgument(measured);
            const std::string outputPath = redavudeva_python::PathArgument(output);
            RequireSeparateOutput(outputPath, {targetPath, measuredPath});
            py::gil_scoped_release unlocked;
            swatchlog::MergeMeasurements(targetPath, measuredPath, outputPath, appendMissing,
                                         exact);
        },
        kMergeDoc, "target"_a, "measured"_a, "output"_a, py::kw_only(), "append_missing"_a = false,
        "exact"_a = false);
    module.def(
        "write_target",
        [](const py::object& chartPath, const py::object& output) {
            const std::string input = redavudeva_python::PathArgument(chartPath);
            const std::string outputPath = redavudeva_python::PathArgument(output);
            RequireSeparateOutput(outputPath, {input});
            py::gil_scoped_release unlocked;
            swatchlog::WriteCleanTarget(input, outputPath);
        },
        kTargetDoc, "chart"_a, "output"_a);
    module.def("delta_e", &redavudeva_python::DeltaE, kDeltaEDoc, "lab1"_a, "lab2"_a,
               "method"_a = "CIE2000");
}
