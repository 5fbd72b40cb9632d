// Where a writer's diagnostic lines go.
#pragma once

#include <functional>
#include <string>

namespace it8 {

/// Passes diagnostic text on unchanged: to the process's standard output by
/// default, or to a function given by the caller (a test, a logging facility).
class DiagnosticSink {
public:
    using Writer = std::function<void(const std::string&)>;

    /// A sink that writes to standard output.
    DiagnosticSink();
    explicit DiagnosticSink(Writer writer);

    void Print(const std::string& text) const;

private:
    Writer writer_;
};

} // namespace it8
