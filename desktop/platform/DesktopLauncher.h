#pragma once
// Starts programs, and opens documents by what the desktop has for them.

#include "desktop/platform/QtServices.h"

namespace zel {

class DesktopLauncher : public QtLauncher {
  public:
    bool start(const std::string& path, const std::vector<std::string>& arguments) override;
};

}  // namespace zel
