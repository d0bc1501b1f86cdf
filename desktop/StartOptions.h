#pragma once
// The command line of the desktop program.

#include <QSize>
#include <optional>
#include <ostream>
#include <string>

#include "desktop/windows/Theme.h"
#include "platform/LinkAddress.h"

namespace zel {

struct StartOptions {
    std::optional<LinkAddress> address;
    std::string home;                  ///< the application's folder; empty for the user's own
    std::string words;                 ///< the program's command line
    std::string file;                  ///< saved view or recording to show; empty for none
    std::string log;                   ///< file of the session's record; empty for none
    std::string given;                 ///< all arguments as one line
    std::string screenshot;            ///< file of a picture of the window; empty for none
    std::string language;              ///< "en", "de"; empty: as it was chosen last
    QSize size;                        ///< of the window; none where it is not valid
    std::optional<ThemeChoice> theme;  ///< none: as it was chosen last
};

/// Fills the options. An exit status when the program is over with that: 0 after a help text or a
/// version on `out`, 2 after the reason on `errors`. Needs no display.
std::optional<int> parseStartOptions(int argc, const char* const* argv, StartOptions& options,
                                     std::ostream& out, std::ostream& errors);
/// True when the command line only asks for the help text or the version.
bool asksForHelp(int argc, const char* const* argv);

}  // namespace zel
