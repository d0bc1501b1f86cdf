#pragma once
// Starts programs, and opens documents by what the desktop has for them.

#include <functional>
#include <string>
#include <vector>

#include "desktop/platform/QtServices.h"

namespace zel {

class DesktopLauncher : public QtLauncher {
  public:
    bool start(const std::string& path, const std::vector<std::string>& arguments) override;
    bool showHelp(int context) override { return help && help(context); }

    /// The viewer of the help book.
    std::function<bool(int context)> help;
};

}  // namespace zel
