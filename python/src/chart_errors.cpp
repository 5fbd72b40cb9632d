#include "chart_errors.h"

#include <exception>
#include <new>
#include <stdexcept>
#include <string>

#include "chart_tables.h"
#include "text_conversion.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace redavudeva_python {
namespace {

constexpr const char* kChartErrorDoc =
    "A chart file could not be read or written.\n\n"
    "str(error) is the message the swatchlog tool prints for the same failure:\n"
    "the file (with the table and its lines when the file holds several), the\n"
    "reason in words and, for a result code of the library, \"[code N]\".\n\n"
    "Attributes:\n"
    "    code: the library's result code (3 cannot open, 5 unusable data format,\n"
    "        6 NUMBER_OF_SETS below 1, 7 no END_DATA, 8 row or set count, 9 no\n"
    "        data block, 21 source unreadable, 22 source not a chart, 23 output\n"
    "        cannot be written, 24 data do not fit the source ...), or None when\n"
    "        the failure is not one of the library's result codes.\n"
    "    path: the file the failure is about, or None.\n"
    "    table: the number of the table read (1 for the first) when the file\n"
    "        holds several tables, else None.\n"
    "    line: the line of the file the failure points at, or None.\n";

py::object NoneUnlessPositive(int value) {
    return value > 0 ? py::object(py::int_(value)) : py::object(py::none());
}

void Raise(const swatchlog::ChartError& error) {
    const std::string message = swatchlog::RepairUtf8(error.what());
    const auto* tableError = dynamic_cast<const swatchlog::TableReadError*>(&error);
    if (dynamic_cast<const swatchlog::NoSuchTable*>(&error) != nullptr) {
        PyErr_SetString(PyExc_IndexError, message.c_str());
        return;
    }
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
    instance.attr("table") = NoneUnlessPositive(tableError ? tableError->Table() : 0);
    instance.attr("line") = NoneUnlessPositive(tableError ? tableError->Line() : 0);
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
    chartError.attr("table") = py::none();
    chartError.attr("line") = py::none();
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
