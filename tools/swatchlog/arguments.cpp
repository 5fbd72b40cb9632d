#include "arguments.h"

#include <algorithm>

namespace swatchlog {
namespace {

const OptionDefinition* FindLong(const std::vector<OptionDefinition>& options,
                                 const std::string& name) {
    for (const auto& option : options) {
        if (option.name == name) {
            return &option;
        }
    }
    return nullptr;
}

const OptionDefinition* FindShort(const std::vector<OptionDefinition>& options, char name) {
    for (const auto& option : options) {
        if (option.shortName != '\0' && option.shortName == name) {
            return &option;
        }
    }
    return nullptr;
}

} // namespace

std::string ParsedArguments::Value(const std::string& name, const std::string& fallback) const {
    const auto found = values_.find(name);
    return found == values_.end() ? fallback : found->second;
}

ParsedArguments ParseArguments(const std::vector<std::string>& args,
                               const std::vector<OptionDefinition>& options) {
    ParsedArguments parsed;
    bool optionsEnded = false;
    for (std::size_t i = 0; i < args.size(); ++i) {
        const std::string& word = args[i];
        if (optionsEnded || word.size() < 2 || word[0] != '-') {
            parsed.positionals.push_back(word);
            continue;
        }
        if (word == "--") {
            optionsEnded = true;
            continue;
        }
        const OptionDefinition* definition = nullptr;
        std::string shown;
        std::string inlineValue;
        bool hasInlineValue = false;
        if (word[1] == '-') {
            const std::size_t equals = word.find('=');
            const std::string name =
                word.substr(2, equals == std::string::npos ? std::string::npos : equals - 2);
            definition = FindLong(options, name);
            shown = "--" + name;
            if (equals != std::string::npos) {
                hasInlineValue = true;
                inlineValue = word.substr(equals + 1);
            }
        } else {
            definition = FindShort(options, word[1]);
            shown = word.substr(0, 2);
            if (word.size() > 2) {
                hasInlineValue = true;
                inlineValue = word.substr(2);
            }
        }
        if (definition == nullptr) {
            throw UsageError("unknown option " + shown);
        }
        if (!definition->takesValue) {
            if (hasInlineValue) {
                throw UsageError("option " + shown + " takes no value");
            }
            parsed.Set(definition->name, "");
            continue;
        }
        if (!hasInlineValue) {
            if (i + 1 >= args.size()) {
                throw UsageError("option " + shown + " needs a value");
            }
            inlineValue = args[++i];
        }
        if (parsed.Has(definition->name)) {
            throw UsageError("option " + shown + " given twice");
        }
        parsed.Set(definition->name, inlineValue);
    }
    return parsed;
}

std::vector<std::string> SplitList(const std::string& text) {
    std::vector<std::string> items;
    std::size_t start = 0;
    while (start <= text.size()) {
        const std::size_t comma = std::min(text.find(',', start), text.size());
        if (comma > start) {
            items.push_back(text.substr(start, comma - start));
        }
        start = comma + 1;
    }
    return items;
}

std::string RequireChoice(const std::string& option, const std::string& value,
                          const std::vector<std::string>& allowed) {
    if (std::find(allowed.begin(), allowed.end(), value) != allowed.end()) {
        return value;
    }
    std::string list;
    for (const auto& choice : allowed) {
        list += (list.empty() ? "" : ", ") + choice;
    }
    throw UsageError("--" + option + " must be one of " + list + ", not \"" + value + "\"");
}

} // namespace swatchlog
