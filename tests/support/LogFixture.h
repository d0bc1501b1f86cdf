#pragma once
// A disk in memory and a clock for the tests of the logs.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "platform/virtual/MemoryServices.h"
#include "platform/virtual/VirtualFiles.h"
#include "platform/virtual/VirtualTime.h"

namespace zel {

struct LogFixture : ::testing::Test {
    LogFixture() {
        clock.setDate(46000.5);  // 2025-12-09, noon
        files.putFolder("/home");
    }
    using Lines = std::vector<std::string>;
    Lines linesOf(const std::string& path) const {
        Lines lines;
        std::string rest = files.bytes(path);
        for (auto end = rest.find("\r\n"); end != std::string::npos; end = rest.find("\r\n")) {
            lines.push_back(rest.substr(0, end));
            rest.erase(0, end + 2);
        }
        if (!rest.empty()) lines.push_back("without an end: " + rest);
        return lines;
    }

    VirtualClock clock;
    VirtualFiles files{clock};
    MemoryDebugChannel debugger;
};

}  // namespace zel
