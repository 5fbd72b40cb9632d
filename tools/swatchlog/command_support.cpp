#include "command_support.h"

#include <exception>

#include "chart_model.h"
#include "file_paths.h"
#include "result_messages.h"
#include "tool_error.h"
#include "utf8_text.h"

namespace swatchlog {

void RequirePositionals(const ParsedArguments& parsed, std::size_t minimum, std::size_t maximum,
                        const std::string& expected) {
    const std::size_t count = parsed.positionals.size();
    if (count < minimum) {
        throw UsageError("missing " + expected);
    }
    if (count > maximum) {
        throw UsageError("unexpected argument \"" + RepairUtf8(parsed.positionals[maximum]) + "\"");
    }
}

std::string RequireOutputPath(const ParsedArguments& parsed,
                              const std::vector<std::string>& inputs) {
    if (!parsed.Has("output") || parsed.Value("output").empty()) {
        throw UsageError("missing the output file (-o OUT)");
    }
    const std::string output = parsed.Value("output");
    for (const auto& input : inputs) {
        if (SameFile(input, output)) {
            throw UsageError("the output file " + RepairUtf8(output) +
                             " is an input file; refusing to overwrite it");
        }
    }
    return output;
}

OutputFormat ParseFormat(const ParsedArguments& parsed, const std::vector<std::string>& allowed) {
    const std::string value = RequireChoice("format", parsed.Value("format", allowed[0]), allowed);
    OutputFormat format;
    if (value == "json") {
        format.json = true;
    } else if (value == "tsv") {
        format.table = TableFormat::Tsv;
    } else if (value == "csv") {
        format.table = TableFormat::Csv;
    }
    return format;
}

FailureText DefaultFailureText(const std::string& outputPath, const std::string& sourcePath) {
    return [outputPath, sourcePath](int code) {
        const bool sourceFault = (code == 21 || code == 22) && !sourcePath.empty();
        const std::string& blamed = sourceFault ? sourcePath : outputPath;
        return ChartError(RepairUtf8(blamed) + ": " + WithCode(DescribeWriteResult(code), code),
                          blamed, code);
    };
}

void WriteOutputFile(const std::string& outputPath, const FailureText& failure,
                     const WriteFunction& write) {
    LibraryPath(outputPath);
    PendingOutput pending(outputPath);
    int code = 0;
    try {
        code = write(LibraryPath(pending.TemporaryPath()));
    } catch (const std::exception& error) {
        std::throw_with_nested(ChartError(
            RepairUtf8(outputPath) + ": " + DescribeLibraryException(error), outputPath, 0));
    }
    if (code != 0) {
        throw failure(code);
    }
    pending.Commit();
}

} // namespace swatchlog
