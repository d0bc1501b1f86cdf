#pragma once
// What the command lines of the programs have in common.

#include <CLI/CLI.hpp>
#include <optional>
#include <ostream>
#include <string>

namespace zel {

struct CommonOptions {
    std::string connect;  ///< the instrument; empty for none
    std::string home;     ///< the application's folder; empty for the user's own
    std::string words;    ///< the program's command line
    std::string log;      ///< file of the session's record; empty for none
};

/// Adds --version.
void addVersionOption(CLI::App& app);

/// Adds --connect, --home, --words, --log and --version; `addresses` says what --connect takes.
void addCommonOptions(CLI::App& app, CommonOptions& options, const std::string& addresses);

/// Reads the command line. An exit status when the program is over with that: 0 after a help text
/// or a version on `out`, `kWrongUse` after the reason on `errors`.
std::optional<int> readCommandLine(CLI::App& app, int argc, const char* const* argv,
                                   std::ostream& out, std::ostream& errors);

/// Says on `errors` what --connect takes; `kWrongUse`.
int refuseAddress(const CLI::App& app, const std::string& addresses, const std::string& given,
                  std::ostream& errors);

}  // namespace zel
