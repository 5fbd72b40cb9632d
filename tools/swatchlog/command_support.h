// Pieces every command uses: argument checks, output formats, output files.
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "arguments.h"
#include "text_table.h"
#include "tool_error.h"

namespace swatchlog {

class Chart;

/// UsageError unless the number of positionals lies within [minimum, maximum].
void RequirePositionals(const ParsedArguments& parsed, std::size_t minimum, std::size_t maximum,
                        const std::string& expected);

/// The -o path; UsageError when it is missing or names one of the inputs.
std::string RequireOutputPath(const ParsedArguments& parsed,
                              const std::vector<std::string>& inputs);

/// The table number given by option `name` (1 for the first table), or 0
/// (the first table with data) when it is absent; UsageError when it is not a
/// whole number from 1.
int TableOption(const ParsedArguments& parsed, const std::string& name = "table");

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

/// The usual failure of a writer without a source file: "OUT: reason [code N]".
FailureText DefaultFailureText(const std::string& outputPath);
/// The usual failure of a writer that re-reads the chart `source`: the codes
/// that concern the source (21, 22) blame it (by its name, with the table),
/// the others blame `outputPath`.
FailureText DefaultFailureText(const std::string& outputPath, const Chart& source);

/// Reads the written file at `libraryPath` back through the library and throws
/// ChartError ("`problem`: it reads as N patches, not M") unless it reads with
/// `expected` patches.
void RequirePatchCount(const std::wstring& libraryPath, std::size_t expected,
                       const std::string& problem);

/// Writes `outputPath` whole or not at all: `write` gets a temporary path and
/// answers the library's result code; a non-zero code, an exception or a
/// failed rename throw ChartError and leave no trace of the output. A
/// ChartError from `write` passes unchanged; a library exception stays
/// attached to the ChartError as its nested exception.
void WriteOutputFile(const std::string& outputPath, const FailureText& failure,
                     const WriteFunction& write);

} // namespace swatchlog
