#include "desktop/platform/CommonOptions.h"

#include <optional>
#include <ostream>

#include "support/ExitStatus.h"
#include "support/VersionInfo.h"

namespace zel {

void addVersionOption(CLI::App& app) {
    app.set_version_flag("-v,--version", app.get_name() + " " + versionText(kVersion));
}

void addCommonOptions(CLI::App& app, CommonOptions& options, const std::string& addresses) {
    addVersionOption(app);
    app.add_option("--connect", options.connect, "The instrument: " + addresses)->type_name("URL");
    app.add_option("--home", options.home, "Folder of the program's files and settings")
        ->type_name("DIR");
    app.add_option("--words", options.words, "Words of the program's command line")
        ->type_name("TEXT");
    app.add_option("--log", options.log,
                   "Writes the session down: each byte each way, the port's events, the clicks")
        ->type_name("FILE");
}

std::optional<int> readCommandLine(CLI::App& app, int argc, const char* const* argv,
                                   std::ostream& out, std::ostream& errors) {
    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& problem) {
        return app.exit(problem, out, errors) == 0 ? kDone : kWrongUse;
    }
    return std::nullopt;
}

int refuseAddress(const CLI::App& app, const std::string& addresses, const std::string& given,
                  std::ostream& errors) {
    errors << app.get_name() << ": --connect takes " << addresses << ", not \"" << given << "\"\n";
    return kWrongUse;
}

}  // namespace zel
