#include "chart_errors.h"

#include <exception>
#include <new>
#include <stdexcept>
#include <string>

#include "text_conversion.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace redavudeva_python {
namespace {

constexpr const char* kChartErrorDoc =
    "A chart file could not be read or written.\n\n"
    "str(error) is the message the swatchlog tool prints for the same failure:\n"
    "the file, the reason in words and, for a result code of the library,\n"
    "\"[code N]\".\n\n"
    "Attributes:\n"
    "    code: the library's result code (3 cannot open, 5 unusable data format,\n"
    "        7 no END_DATA, 8 row or set count, 9 no data block, 21 source\n"
    "        unreadable, 22 source not a chart, 23 output cannot be written,\n"
    "        24 data do not fit the source ...), or None when the failure is not\n"
    "        one of the library's result codes.\n"
    "    path: the file the failure is about, or None.\n";

void Raise(const swatchlog::ChartError& error) {
    const std::string message = swatchlog::RepairUtf8(error.what());
    try {
        std::rethrow_if_nested(error);
    } catch (const std::invalid_argument&) {
        PyErr_SetString(PyExc_ValueError, message.c_str());
        return;
    } catch (const std::out_of_range&) {
        PyErr_SetString(PyExc_IndexError, message.c_str());
        return;
    } catch (const std::bad_alloc&) {
        PyErr_NoMemory();
        return;
    } catch (...) {
        // any other library exception is reported as the chart failure it caused
    }
    const py::object type = py::module_::import("redavudeva._redavudeva").attr("ChartError");
    py::object instance = type(message);
    instance.attr("code") = error.Code() != 0 ? py::object(py::int_(error.Code())) : py::none();
    instance.attr("path") =
        error.Path().empty() ? py::object(py::none()) : py::object(TextFromBytes(error.Path()));
    PyErr_SetObject(type.ptr(), instance.ptr());
}

} // namespace

void RegisterChartError(py::module_& module) {
    PyObject* type = PyErr_NewExceptionWithDoc("redavudeva.ChartError", kChartErrorDoc,
                                               PyExc_Exception, nullptr);
    if (type == nullptr) {
        throw py::error_already_set();
    }
    auto chartError = py::reinterpret_steal<py::object>(type);
    chartError.attr("code") = py::none();
    chartError.attr("path") = py::none();
    module.attr("ChartError") = chartError;

    py::register_exception_translator([](std::exception_ptr thrown) {
        try {
            if (thrown) {
                std::rethrow_exception(thrown);
            }
        } catch (const swatchlog::ChartError& error) {
            Raise(error);
        }
    });
}

} // namespace redavudeva_python
