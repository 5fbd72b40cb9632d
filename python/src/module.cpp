// The redavudeva Python module: charts as NumPy arrays, the writers, and the
// tool's colour differences.
#include <pybind11/numpy.h>
#include <pybind11/pybind11.h>
#include <pybind11/stl.h>

#include <string>
#include <utility>
#include <vector>

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
using swatchlog::TableExtent;

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
    "A file may hold several tables one after another, each with its own\n"
    "header, data format and data block (a profiling tool's measurement file,\n"
    "calibration curves ...). `table` picks one by its number, 1 for the first,\n"
    "as 'swatchlog --table N' does; by default the first table with data rows\n"
    "is read. Chart.tables lists them all.\n\n"
    "The library derives what a data row lacks where it can (XYZ and densities\n"
    "from the spectrum, L*a*b* from XYZ, XYZ from L*a*b*, RGB from XYZ or CMYK);\n"
    "Chart.derived tells those values apart. Raises ChartError when the file\n"
    "or the table cannot be read (with the library's result code, the table and\n"
    "the line), IndexError when the file has no table of that number,\n"
    "ValueError for a table number below 1, and ValueError or IndexError when\n"
    "a layout keyword or spectral field name holds no usable number.\n";

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
    "RGB as whole numbers; the rows are numbered 1 ... N as SAMPLE_ID. The file\n"
    "appears whole or not at all, and an existing file keeps its identity\n"
    "(permissions, links), as with the swatchlog tool's outputs.\n\n"
    "Raises ValueError when the chart has no patches or no values, when a\n"
    "written colour space lacks a value for some patch (NaN), or when a name,\n"
    "keyword or wavelength cannot be written; ChartError when the file cannot\n"
    "be written (code 23 when the library's writer cannot open it, None when\n"
    "it is refused before: a missing folder, a folder in its place ...).\n";

constexpr const char* kMergeDoc =
    "Put the measurements of the chart file `measured` (L*a*b*, XYZ, spectra and\n"
    "the densities computed from the spectra) into the target file `target` and\n"
    "write the result to `output`, as 'swatchlog merge' does.\n\n"
    "Each target patch takes the measurement of its partner in `measured`: by\n"
    "SAMPLE_ID when both files carry it, else by sample name, else by position;\n"
    "`by` (\"auto\", \"id\", \"name\", \"position\") chooses one rule. Every\n"
    "target patch needs a partner; measured patches without one are an error\n"
    "unless allow_unpaired. Where both files carry device values (CMYK, RGB or\n"
    "n-colour channels) every pair must agree within device_tolerance (percent\n"
    "or RGB levels), so that measurements of another chart are not merged.\n\n"
    "By default the data block is rebuilt from the target's device values and\n"
    "the measurements; with append_missing the target's rows are kept and the\n"
    "colour spaces it lacks are appended, and exact then works the larger of\n"
    "ORIGINAL_NUMBER_OF_SETS and NUMBER_OF_SETS rather than the smaller.\n"
    "target_table and measured_table pick a table of a file of several (1 for\n"
    "the first; default: the first with data rows); `output` holds the\n"
    "target's table alone. The notes the tool prints (the pairing rule used,\n"
    "patches left out, device values not compared) are issued as UserWarning.\n\n"
    "The output appears whole or not at all. Raises ValueError when `output` is\n"
    "one of the inputs or an option is out of range, ChartError when a file\n"
    "cannot be read or written, the pairing or the device values refuse the\n"
    "merge, or the measurements do not fit the target (code 24); its message is\n"
    "the tool's, which names the command-line options (--allow-unpaired,\n"
    "--by, --device-tolerance) for the arguments of the same names.\n";

constexpr const char* kTargetDoc =
    "Write the chart file `chart` reduced to its clean patches (one colorant\n"
    "alone) and its first white patch to `output`, with the layout keywords set\n"
    "to the new patch count, as 'swatchlog target' does. The library's writer\n"
    "stops at the first white patch, so clean patches after it would be lost:\n"
    "then nothing is written unless force, which writes the file and issues\n"
    "the loss as a UserWarning. `table` picks a table of a file of several (1\n"
    "for the first; default: the first with data rows). Raises ValueError when\n"
    "`output` is `chart` itself, ChartError when a file cannot be read or\n"
    "written, clean patches would be lost, or the chart has no clean and no\n"
    "white patch (code 1).\n";

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

// The table number argument as the tool's functions take it (0: the default).
int TableArgument(const py::object& table, const char* name) {
    if (table.is_none()) {
        return 0;
    }
    const auto number = table.cast<long long>();
    if (number < 1 || number > 1000000) {
        throw py::value_error(std::string(name) + " is a table number from 1, not " +
                              std::to_string(number));
    }
    return static_cast<int>(number);
}

swatchlog::PairBy PairByArgument(const std::string& by) {
    const std::pair<const char*, swatchlog::PairBy> rules[] = {
        {"auto", swatchlog::PairBy::Auto},
        {"id", swatchlog::PairBy::Id},
        {"name", swatchlog::PairBy::Name},
        {"position", swatchlog::PairBy::Position}};
    for (const auto& [key, rule] : rules) {
        if (by == key) {
            return rule;
        }
    }
    throw py::value_error("by must be \"auto\", \"id\", \"name\" or \"position\", not \"" + by +
                          "\"");
}

// Runs a writer without the interpreter lock and issues the remarks it made
// as UserWarnings once it has finished.
template <typename Run> void WithRemarks(Run run) {
    std::vector<std::string> remarks;
    {
        py::gil_scoped_release unlocked;
        run([&remarks](const std::string& text) { remarks.push_back(text); });
    }
    const py::object warn = py::module_::import("warnings").attr("warn");
    for (const auto& text : remarks) {
        warn(redavudeva_python::TextFromBytes(text), py::handle(PyExc_UserWarning), 2);
    }
}

py::tuple Tables(const ChartObject& chart) {
    py::list tables;
    for (const auto& table : chart.tables) {
        tables.append(py::cast(table));
    }
    return py::tuple(tables);
}

} // namespace

PYBIND11_MODULE(_redavudeva, module) {
    module.doc() = kModuleDoc;
    redavudeva_python::RegisterChartError(module);

    py::class_<TableExtent> table(module, "Table",
                                  "One table of a chart file: a header, a data format and a data "
                                  "block,\nended by its END_DATA. Chart.tables lists them.");
    table.def_readonly("number", &TableExtent::number,
                       "The table's number in its file, 1 for the first (read(table=...)).");
    table.def_readonly("first_line", &TableExtent::firstLine,
                       "The table's first line in the file (counted from 1).");
    table.def_readonly("last_line", &TableExtent::lastLine,
                       "The table's last line in the file, its END_DATA line or the file's "
                       "end.");
    table.def_property_readonly(
        "data_line",
        [](const TableExtent& t) {
            return t.dataLine > 0 ? py::object(py::int_(t.dataLine)) : py::object(py::none());
        },
        "The line of its BEGIN_DATA, or None when it has no data block.");
    table.def_readonly("rows", &TableExtent::rowCount,
                       "The number of data rows in its data block.");
    table.def_property_readonly(
        "fields",
        [](const TableExtent& t) {
            py::list fields;
            for (const auto& field : t.fields) {
                fields.append(redavudeva_python::TextFromBytes(field));
            }
            return py::tuple(fields);
        },
        "The data format's field names (tuple of str), upper case, in column order.");
    table.def_property_readonly(
        "identification",
        [](const TableExtent& t) { return redavudeva_python::TextFromBytes(t.identification); },
        "The word alone on the table's first line (\"CGATS.17\", \"CTI3\", \"IT8.7/2\" ...),\n"
        "or \"\" when that line holds anything else.");
    table.def(
        "__repr__",
        [](const TableExtent& t) {
            return "<redavudeva.Table " + std::to_string(t.number) + ": lines " +
                   std::to_string(t.firstLine) + "-" + std::to_string(t.lastLine) + ", " +
                   std::to_string(t.rowCount) + (t.rowCount == 1 ? " row" : " rows") + ", " +
                   std::to_string(t.fields.size()) + " fields>";
        },
        "Number, lines, rows and field count.");

    py::class_<ChartObject> chart(module, "Chart", kChartDoc);
    chart.def_property_readonly(
        "path", [](const ChartObject& c) { return c.path; },
        "The file the chart was read from (str), or None for a chart built from arrays.");
    chart.def_property_readonly(
        "tables", Tables,
        "Every table of the file read (tuple of Table), one for a file of one table;\n"
        "empty for a chart built from arrays.");
    chart.def_property_readonly(
        "table",
        [](const ChartObject& c) {
            return c.table > 0 ? py::object(py::int_(c.table)) : py::object(py::none());
        },
        "The number of the table this chart holds (1 for the first), None for a\n"
        "chart built from arrays.");
    chart.def_property_readonly(
        "sample_numbers", [](const ChartObject& c) { return c.sampleNumbers; },
        "Sample numbers 1 ... N of the patches, in data-row order (int64 array):\n"
        "the numbers the library and the tool count patches by.");
    chart.def_property_readonly(
        "sample_ids", [](const ChartObject& c) { return c.sampleIds; },
        "The file's SAMPLE_ID of each patch as text (NumPy str array), without\n"
        "the double quotes a file may put around it: ids such as \"A01\" stay\n"
        "as they are, numbers keep the digits the file has (\"007\"). When the\n"
        "file has no SAMPLE_ID field, and for a chart built from arrays, the\n"
        "sample numbers as text (\"1\", \"2\" ...), which is what write() writes.\n"
        "int(...) or .astype(int) turns numeric ids into numbers.");
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
            if (c.tables.size() > 1) {
                text +=
                    ", table " + std::to_string(c.table) + " of " + std::to_string(c.tables.size());
            }
            return text + ">";
        },
        "A short description: patch count, device space, file and table.");
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
        [](const py::object& path, const py::object& table) {
            const int number = TableArgument(table, "table");
            return redavudeva_python::ReadChart(redavudeva_python::PathArgument(path), number);
        },
        kReadDoc, "path"_a, "table"_a = py::none());
    module.def(
        "merge",
        [](const py::object& target, const py::object& measured, const py::object& output,
           bool appendMissing, bool exact, const std::string& by, bool allowUnpaired,
           double deviceTolerance, const py::object& targetTable, const py::object& measuredTable) {
            swatchlog::MergeOptions options;
            if (exact && !appendMissing) {
                throw py::value_error("exact goes with append_missing");
            }
            if (!(deviceTolerance >= 0.0 && deviceTolerance <= 1e6)) {
                throw py::value_error("device_tolerance is a number from 0, not " +
                                      std::string(py::str(py::float_(deviceTolerance))));
            }
            options.appendMissing = appendMissing;
            options.exact = exact;
            options.by = PairByArgument(by);
            options.allowUnpaired = allowUnpaired;
            options.deviceTolerance = deviceTolerance;
            options.targetTable = TableArgument(targetTable, "target_table");
            options.measuredTable = TableArgument(measuredTable, "measured_table");
            const std::string targetPath = redavudeva_python::PathArgument(target);
            const std::string measuredPath = redavudeva_python::PathArgument(measured);
            const std::string outputPath = redavudeva_python::PathArgument(output);
            RequireSeparateOutput(outputPath, {targetPath, measuredPath});
            WithRemarks([&](const swatchlog::Remark& note) {
                swatchlog::MergeMeasurements(targetPath, measuredPath, outputPath, options, note);
            });
        },
        kMergeDoc, "target"_a, "measured"_a, "output"_a, py::kw_only(), "append_missing"_a = false,
        "exact"_a = false, "by"_a = "auto", "allow_unpaired"_a = false, "device_tolerance"_a = 1.0,
        "target_table"_a = py::none(), "measured_table"_a = py::none());
    module.def(
        "write_target",
        [](const py::object& chartPath, const py::object& output, const py::object& table,
           bool force) {
            const int number = TableArgument(table, "table");
            const std::string input = redavudeva_python::PathArgument(chartPath);
            const std::string outputPath = redavudeva_python::PathArgument(output);
            RequireSeparateOutput(outputPath, {input});
            WithRemarks([&](const swatchlog::Remark& warning) {
                swatchlog::WriteCleanTarget(input, outputPath, number, force, warning);
            });
        },
        kTargetDoc, "chart"_a, "output"_a, py::kw_only(), "table"_a = py::none(),
        "force"_a = false);
    module.def("delta_e", &redavudeva_python::DeltaE, kDeltaEDoc, "lab1"_a, "lab2"_a,
               "method"_a = "CIE2000");
}
