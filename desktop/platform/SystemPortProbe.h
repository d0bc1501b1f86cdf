#pragma once
// The serial ports of this machine: their makers, their rights, who holds them.

#include <optional>
#include <string>
#include <vector>

#include "platform/PortProbe.h"

namespace zel {

class SystemPortProbe : public PortProbe {
  public:
    std::vector<SerialDevice> devices() override;
    PortAccess access(const std::string& path) override;
    PortHolders holders(const std::string& path) override;
    std::vector<std::string> modemManagers() override;
    std::optional<ModemLines> modemLines(const std::string& path) override;
};

}  // namespace zel
