// Plain-word sentences for the library's result codes.
#pragma once

#include <exception>
#include <string>

namespace swatchlog {

/// What a result code of reading a chart means, as a sentence without a full stop.
std::string DescribeReadResult(int code);
/// What a result code of a writing operation means.
std::string DescribeWriteResult(int code);
/// A standard exception that left the library, in words.
std::string DescribeLibraryException(const std::exception& error);
/// "sentence [code N]", the form in which errors name a code.
std::string WithCode(const std::string& sentence, int code);

} // namespace swatchlog
