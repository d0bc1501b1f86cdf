// zelctl, the program without a window.

#include <exception>
#include <iostream>

#include "console/Fronts.h"
#include "console/Options.h"
#include "console/PanelSession.h"
#include "console/Tool.h"

int main(int argc, char** argv) {
    zel::Options options;
    if (const auto status = zel::parseOptions(argc, argv, options, std::cout, std::cerr))
        return *status;
    try {
        // In a session each menu can be used, that of the picture too.
        const bool pictures = !options.image.empty() || options.verb == zel::Verb::Panel;
        const zel::ToolkitSession toolkit(argc, argv, pictures);
        const bool simulated = options.address && options.address->simulated;
        const auto front =
            simulated ? zel::makeSimulatorFront(options.home) : zel::makePortFront(options.home);
        return zel::runTool(options, *front, std::cout, std::cerr);
    } catch (const std::exception& problem) {
        std::cerr << "zelctl: " << problem.what() << '\n';
        return zel::kLinkFailed;
    }
}
