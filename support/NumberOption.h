#pragma once
// A number among the options of a command line.

#include <optional>
#include <string>

#include "support/NumberText.h"

namespace zel {

/// Adds an option with a number from `lowest` to `highest` to a parser of the type CLI::App. The
/// parser's own numbers follow the language of the machine.
template <class App>
auto* numberOption(App& app, const std::string& name, double& target, double lowest, double highest,
                   const std::string& what) {
    const auto problem = [lowest, highest](const std::string& text) {
        const std::optional<double> value = parseNumber(text);
        if (value && *value >= lowest && *value <= highest) return std::string();
        return "takes a number from " + generalNumber(lowest) + " to " + generalNumber(highest) +
               ", not " + text;
    };
    const auto take = [&target](const std::string& text) { target = *parseNumber(text); };
    return app.template add_option_function<std::string>(name, take, what)->check(problem, "");
}

}  // namespace zel
