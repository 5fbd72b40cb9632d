#include "command_support.h"

#include <exception>
#include <memory>

#include <redavudeva/redavudeva.h>

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

int TableOption(const ParsedArguments& parsed, const std::string& name) {
    if (!parsed.Has(name)) {
        return 0;
    }
    const std::string value = parsed.Value(name);
    if (value.empty() || value.size() > 6 ||
        value.find_first_not_of("0123456789") != std::string::npos || std::stoi(value) < 1) {
        throw UsageError("--" + name + " takes a table number from 1, not \"" + RepairUtf8(value) +
                         "\"");
    }
    return std::stoi(value);
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

FailureText DefaultFailureText(const std::string& outputPath) {
    return [outputPath](int code) {
        return ChartError(RepairUtf8(outputPath) + ": " + WithCode(DescribeWriteResult(code), code),
                          outputPath, code);
    };
}

FailureText DefaultFailureText(const std::string& outputPath, const Chart& source) {
    return [outputPath, name = source.Name(), path = source.Path()](int code) {
        if (code == 21 || code == 22) {
            return ChartError(name + ": " + WithCode(DescribeWriteResult(code), code), path, code);
        }
        return ChartError(RepairUtf8(outputPath) + ": " + WithCode(DescribeWriteResult(code), code),
                          outputPath, code);
    };
}

void RequirePatchCount(const std::wstring& libraryPath, std::size_t expected,
                       const std::string& problem) {
    std::unique_ptr<CSwatchlogBase> chart(
        CSwatchlogFactory::GetReaderWriter(CSwatchlogFactory::READERWRITER_IT8));
    const int code = chart ? chart->ReadChartFile(libraryPath) : -1;
    if (code != 0) {
        throw ChartError(problem + ": the written file does not read back (" +
                         WithCode(DescribeReadResult(code), code) + "); nothing was written");
    }
    const auto count = static_cast<std::size_t>(chart->GetPatchCount());
    if (count != expected) {
        throw ChartError(problem + ": it reads back with " + std::to_string(count) +
                         " patches, not " + std::to_string(expected) + "; nothing was written");
    }
}

void WriteOutputFile(const std::string& outputPath, const FailureText& failure,
                     const WriteFunction& write) {
    LibraryPath(outputPath);
    PendingOutput pending(outputPath);
    int code = 0;
    try {
        code = write(LibraryPath(pending.TemporaryPath()));
    } catch (const ChartError&) {
        throw;
    } catch (const std::exception& error) {
        // The library's exception stays attached, for callers that tell its kind apart.
        std::throw_with_nested(ChartError(
            RepairUtf8(outputPath) + ": " + DescribeLibraryException(error), outputPath, 0));
    }
    if (code != 0) {
        throw failure(code);
    }
    pending.Commit();
}

} // namespace swatchlog
