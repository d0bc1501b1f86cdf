#pragma once
// What the system knows of its serial ports, without a byte on any line.

#include <optional>
#include <string>
#include <vector>

namespace zel {

struct SerialDevice {
    std::string path;
    std::string maker;
    std::string product;
    std::string serialNumber;
};

/// What this user may do with a device file.
struct PortAccess {
    bool exists = false;
    bool terminal = false;  ///< it is a serial port or a terminal
    bool usable = false;    ///< it may be read and written
    std::string group;      ///< that has the rights; empty where no group has
    bool member = false;    ///< the user is in that group by the system's list
    bool active = false;    ///< this program runs with that group
};

struct PortHolder {
    long process = 0;
    std::string name;
    bool self = false;  ///< this program
};

/// The processes with the port open. Who holds the far side of a pseudo terminal is none of them.
struct PortHolders {
    std::vector<PortHolder> found;
    bool complete = true;  ///< false: processes of other users could not be looked at
};

struct ModemLines {
    bool cts = false;
    bool dsr = false;
    bool dcd = false;
    bool ri = false;
};

class PortProbe {
  public:
    virtual ~PortProbe() = default;
    virtual std::vector<SerialDevice> devices() = 0;
    virtual PortAccess access(const std::string& path) = 0;
    virtual PortHolders holders(const std::string& path) = 0;
    /// Running programs that open serial ports to look for modems.
    virtual std::vector<std::string> modemManagers() = 0;
    /// The lines as the far end has set them; nothing for a port that has none.
    virtual std::optional<ModemLines> modemLines(const std::string& path) = 0;
};

}  // namespace zel
