// The failure of a command on a chart or a file; the tool answers it with exit status 1.
#pragma once

#include <stdexcept>
#include <string>

namespace swatchlog {

class ChartError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// Exit statuses of the tool.
constexpr int kExitSuccess = 0;
constexpr int kExitChartError = 1;
constexpr int kExitUsageError = 2;

} // namespace swatchlog
