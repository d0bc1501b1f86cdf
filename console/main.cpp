// zelctl, the program without a window.

#include <signal.h>
#include <unistd.h>

#include <csignal>
#include <exception>
#include <iostream>

#include "console/Fronts.h"
#include "console/Options.h"
#include "console/ReplayVerb.h"
#include "console/Tool.h"
#include "support/ExitStatus.h"

int main(int argc, char** argv) {
    zel::Options options;
    // A reader that went away is a failed write, not the end of the program.
    std::signal(SIGPIPE, SIG_IGN);
    if (const auto status = zel::parseOptions(argc, argv, options, std::cout, std::cerr))
        return std::cout.flush() ? *status : zel::kLinkFailed;
    try {
        const zel::ToolkitSession toolkit(argc, argv);
        const zel::Streams streams{std::cout, std::cerr, isatty(STDOUT_FILENO) != 0,
                                   isatty(STDERR_FILENO) != 0};
        if (options.verb == zel::Verb::Replay) return zel::runReplay(options, streams);
        const bool simulated = options.address && options.address->simulated;
        const auto front =
            simulated ? zel::makeSimulatorFront(options.home) : zel::makePortFront(options.home);
        return zel::runTool(options, *front, streams);
    } catch (const std::exception& problem) {
        std::cerr << "zelctl: " << problem.what() << '\n';
        return zel::kLinkFailed;
    }
}
