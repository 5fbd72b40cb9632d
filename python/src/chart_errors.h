// ChartError: the tool's chart and file failures as a Python exception with the
// library's result code and the file it blames; the library's own standard
// exceptions as ValueError and IndexError.
#pragma once

#include <pybind11/pybind11.h>

namespace redavudeva_python {

namespace py = pybind11;

/// Creates ChartError in `module` and installs the translation of the tool's
/// ChartError into it.
void RegisterChartError(py::module_& module);

} // namespace redavudeva_python
