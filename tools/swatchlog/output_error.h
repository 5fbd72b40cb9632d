// The messages for an output file that cannot be written.
#pragma once

#include <string>
#include <system_error>

#include "it8/files/write_result.h"
#include "tool_error.h"

namespace swatchlog {

/// The system's words for `error`, without a closing full stop.
std::string Reason(const std::error_code& error);

/// "OUTPUT: the output file cannot be written (REASON)", then "; " and `state`
/// when that is not empty.
ChartError OutputError(const std::string& output, const std::string& reason,
                       const std::string& state = "");

/// Throws the OutputError that says why `output` was not written and which
/// state it was left in; nothing when `result` says it was written.
void ThrowUnlessWritten(const std::string& output, const it8::files::WriteResult& result);

} // namespace swatchlog
