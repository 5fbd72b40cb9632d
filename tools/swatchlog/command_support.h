// Pieces every command uses: argument checks, output formats, output files.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "arguments.h"
#include "text_table.h"
#include "tool_error.h"

namespace swatchlog {

/// UsageError unless the number of positionals lies within [minimum, maximum].
void RequirePositionals(const ParsedArguments& parsed, std::size_t minimum, std::size_t maximum,
                        const std::string& expected);

/// The -o path; UsageError when it is missing or names one of the inputs.
std::string RequireOutputPath(const ParsedArguments& parsed,
                              const std::vector<std::string>& inputs);

/// Parses --format for commands with table, tsv, csv (as allowed) and json.
struct OutputFormat {
    bool json = false;
    TableFormat table = TableFormat::Table;
};
OutputFormat ParseFormat(const ParsedArguments& parsed, const std::vector<std::string>& allowed);

using WriteFunction = std::function<int(const std::wstring& temporaryPath)>;
/// Turns a non-zero result code of a writer into the error, which names the
/// file it blames and carries the code.
using FailureText = std::function<ChartError(int code)>;

/// The usual failure: "FILE: reason [code N]", blaming `sourcePath` for the
/// codes that concern the source file (21, 22) and `outputPath` for the others.
FailureText DefaultFailureText(const std::string& outputPath, const std::string& sourcePath);

/// Writes `outputPath` whole or not at all: `write` gets a temporary path and
/// answers the library's result code; a non-zero code, an exception or a
/// failed rename throw ChartError and leave no trace of the output. A library
/// exception stays attached to the ChartError as its nested exception.
void WriteOutputFile(const std::string& outputPath, const FailureText& failure,
                     const WriteFunction& write);

} // namespace swatchlog
