// Command-line arguments of one command: positional values and named options.
#pragma once

#include <map>
#include <stdexcept>
#include <string>
#include <vector>

namespace swatchlog {

/// A wrong command line; the tool answers it with exit status 2.
class UsageError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// An option a command accepts: "--name" (or "-x") with or without a value.
struct OptionDefinition {
    std::string name;      ///< long name without the dashes, e.g. "format"
    char shortName = '\0'; ///< e.g. 'o' for -o, or '\0'
    bool takesValue = false;
};

class ParsedArguments {
public:
    std::vector<std::string> positionals;

    bool Has(const std::string& name) const { return values_.count(name) != 0; }
    /// The option's value, or `fallback` when it was not given.
    std::string Value(const std::string& name, const std::string& fallback = "") const;
    void Set(const std::string& name, std::string value) { values_[name] = std::move(value); }

private:
    std::map<std::string, std::string> values_;
};

/// Parses `args` (the words after the command name). "--name value",
/// "--name=value", "-x value" and "-xvalue" are accepted; "--" ends the options;
/// a lone "-" is a positional. Unknown options and missing values throw UsageError.
ParsedArguments ParseArguments(const std::vector<std::string>& args,
                               const std::vector<OptionDefinition>& options);

/// Splits "a,b,c" at commas; empty items are dropped.
std::vector<std::string> SplitList(const std::string& text);

/// `value` if it is one of `allowed`, else UsageError naming the option.
std::string RequireChoice(const std::string& option, const std::string& value,
                          const std::vector<std::string>& allowed);

} // namespace swatchlog
