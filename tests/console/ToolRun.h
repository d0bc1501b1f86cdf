#pragma once
// A run of zelctl inside the test, on the simulator in virtual time or on files of a folder.

#include <gtest/gtest.h>

#include <sstream>
#include <string>
#include <vector>

#include "console/Fronts.h"
#include "console/ReplayVerb.h"
#include "console/Tool.h"
#include "tests/files/DiskFolder.h"
#include "tests/files/FileSession.h"

namespace zel {

struct ToolRun : ::testing::Test {
    /// The exit status; what was printed stands in `out` and `errors`.
    int run(std::vector<std::string> words) {
        words.insert(words.begin(), {"zelctl", "--home", folder.file("home")});
        std::vector<const char*> list;
        list.reserve(words.size());
        for (const std::string& word : words) list.push_back(word.c_str());
        out.str("");
        errors.str("");
        Options options;
        if (const auto status =
                parseOptions(static_cast<int>(list.size()), list.data(), options, out, errors))
            return *status;
        if (options.verb == Verb::Replay) return runReplay(options, {out, errors});
        const bool simulated = options.address && options.address->simulated;
        const auto front =
            simulated ? makeSimulatorFront(options.home) : makePortFront(options.home);
        return runTool(options, *front, {out, errors});
    }
    int runConnected(std::vector<std::string> words) {
        words.insert(words.begin(), {"--connect", "sim:"});
        return run(std::move(words));
    }
    Texts printed() const {
        Texts lines;
        std::istringstream in(out.str());
        for (std::string line; std::getline(in, line);) lines.push_back(line);
        return lines;
    }
    DiskFolder folder;
    std::ostringstream out;
    std::ostringstream errors;
};

}  // namespace zel
