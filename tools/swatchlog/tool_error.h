// The failure of a command on a chart or a file; the tool answers it with exit status 1.
#pragma once

#include <stdexcept>
#include <string>
#include <utility>

namespace swatchlog {

class ChartError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
    /// A failure about the file `path`; `code` is the library's result code that
    /// reported it, 0 when the failure is not a result code of the library.
    ChartError(const std::string& message, std::string path, int code)
        : std::runtime_error(message), path_(std::move(path)), code_(code) {}

    /// The file the failure is about (as given, UTF-8); empty when unknown.
    const std::string& Path() const { return path_; }
    /// The library's result code, 0 when there is none.
    int Code() const { return code_; }

private:
    std::string path_;
    int code_ = 0;
};

/// Exit statuses of the tool.
constexpr int kExitSuccess = 0;
constexpr int kExitChartError = 1;
constexpr int kExitUsageError = 2;

} // namespace swatchlog
