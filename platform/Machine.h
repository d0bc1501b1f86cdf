#pragma once
// What the machine says of itself: system, user, language, what is installed.

#include <memory>
#include <string>

#include "platform/FolderFiles.h"

namespace zel {

struct MachineFacts {
    std::string operatingSystem;  ///< name of the system and its kernel
    double installed = 0;         ///< as `Clock::date`; 0 where that is unknown
    bool adminRights = false;
    // Empty where there is none.
    std::string country;
    std::string language;
    std::string locale;
    std::string codeset;
    std::string runtimeName;     ///< of the library that the program runs on
    std::string runtimeVersion;  ///< of that
    std::string ieeeDriver;      ///< device of an IEEE bus
    std::string visa;            ///< file of a VISA library
};

/// A group of settings of this machine as the support report shows them. Nothing of it takes long.
class Machine {
  public:
    virtual ~Machine() = default;
    virtual MachineFacts facts() = 0;
    /// A variable of the environment; empty where it is not set.
    virtual std::string environment(const std::string& name) = 0;
    /// Begins to read a folder; comes back at once.
    virtual std::unique_ptr<FolderReading> readFolder(const std::string& folder) = 0;
};

}  // namespace zel
