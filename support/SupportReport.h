#pragma once
// What a support person wants to know of the program and the machine, as text in groups.

#include <string>

#include "platform/Clock.h"
#include "platform/Machine.h"

namespace zel {

class DriverFolders;

/// The parts that the window shows and hides one by one. Lines end with CR LF; values begin in one
/// column.
struct SupportReport {
    std::string system;   ///< setup, operating system, language, libraries
    std::string drivers;  ///< graph controls, remote control, lists of drivers
    std::string legal;

    std::string whole() const { return system + drivers + legal; }
};

struct ReportSources {
    Machine& machine;
    const Clock& clock;
    DriverFolders& folders;
};

SupportReport makeSupportReport(const ReportSources& sources);

}  // namespace zel
