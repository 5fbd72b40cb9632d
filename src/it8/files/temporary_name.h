// Names for temporary files beside a target.
#pragma once

#include <string>

namespace it8::files {

/// `prefix`, a random number and ".tmp": a name no other writer is likely to
/// pick at the same moment. It does not grow with the target's name, so a
/// target whose name is near the file system's limit still gets one.
std::string TemporaryName(const std::string& prefix);

/// How many names a writer tries before it gives up making a temporary file.
constexpr int kTemporaryNameAttempts = 8;

/// The prefix of the temporary files the writers make beside their targets.
constexpr char kWriterPrefix[] = ".rdv";

} // namespace it8::files
