#pragma once
// The command line of the tool.

#include <optional>
#include <ostream>
#include <string>
#include <vector>

#include "console/Address.h"
#include "console/AnalysisOptions.h"

namespace zel {

enum class Verb {
    Info,
    Get,
    Set,
    Cmd,
    Sweep,
    Record,
    Show,
    Run,
    Panel,
    Serve,
    Devices,
    Words,
    Doctor,
    Replay,
    Analyse
};

/// What the server and the devices take.
struct ServeOptions {
    std::string serial;
    int baud = 0;  ///< 0: searched, or the usual one
    std::string listen = "127.0.0.1:2277";
    std::vector<std::string> allow;
    bool keep = false;
    int group = 10;  ///< ms
    std::string tlsCertificate;
    std::string tlsKey;
    std::string tlsClients;
    std::string configure;  ///< name of a device
};

struct Options {
    std::optional<ConnectAddress> address;
    std::string home;   ///< the application's folder; empty for the user's own
    std::string words;  ///< the program's command line
    std::string log;    ///< file of the session's record; empty for none
    std::string given;  ///< all arguments as one line, as the record keeps them
    bool verbose = false;
    Verb verb = Verb::Info;
    std::string argument;     ///< keyword of get, set, cmd; file of show, run and panel
    int count = 1;            ///< sweeps, traces
    double interval = 0;      ///< of a recording, s
    std::string output;       ///< file of the saved view or the recording; empty for none
    bool rehearse = false;    ///< a script is checked and not run
    std::string image;        ///< file of the graph's picture; empty for none
    std::string waterfall;    ///< file of the rows in depth; empty for none
    std::string spectrogram;  ///< file of the rows from above; empty for none
    ServeOptions serve;
    std::vector<std::string> traceFiles;      ///< of analyse
    std::optional<AnalysisOptions> analysis;  ///< of analyse and sweep --analyse
};

/// Fills the options. An exit status when the run is over with that: 0 after a help text on
/// `out`, 2 after the reason on `errors`.
std::optional<int> parseOptions(int argc, const char* const* argv, Options& options,
                                std::ostream& out, std::ostream& errors);

}  // namespace zel
