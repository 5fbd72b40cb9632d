// The program's arguments as UTF-8 words, on every platform.
#pragma once

#include <string>
#include <vector>

namespace swatchlog {

/// The words after the program name. On Windows they are taken from the wide
/// command line and encoded as UTF-8; elsewhere they are the bytes given.
std::vector<std::string> CommandLineWords(int argc, char** argv);
/// Lets a Windows console show UTF-8 output; does nothing elsewhere.
void PrepareConsole();

} // namespace swatchlog
