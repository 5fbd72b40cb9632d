// Small text edits shared by the chart writers.
#pragma once

#include <cstddef>
#include <string>
#include <vector>

namespace it8 {

bool Contains(const std::string& text, const std::string& part);
bool StartsWith(const std::string& text, const std::string& lead);

/// Replaces every occurrence of `from` (not empty) by `to`, left to right.
std::string ReplaceAll(std::string text, const std::string& from, const std::string& to);

/// A line without a double quote gets every space turned into a tab; a line with
/// one keeps its spaces, so quoted values stay whole.
std::string SpacesToTabsUnlessQuoted(std::string line);

/// True when a first line already identifies the file ("CGATS.17" or "IT8.7/3"),
/// so that no "CGATS.17" line has to be put before it.
bool HasIdentification(const std::string& firstLine);

/// Index of the first line that begins with `lead`; `lines.size()` when none does.
std::size_t FindLineStartingWith(const std::vector<std::string>& lines, const std::string& lead);

/// Index of the first line that contains `part`; `lines.size()` when none does.
std::size_t FindLineContaining(const std::vector<std::string>& lines, const std::string& part);

} // namespace it8
