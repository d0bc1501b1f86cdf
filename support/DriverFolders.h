#pragma once
// The folders of installed drivers that the support report lists.

#include <array>
#include <memory>
#include <string>

#include "platform/FolderFiles.h"
#include "platform/Machine.h"

namespace zel {

class cRegistry;

/// Begins to read the folders that the registry or the environment names; none of them is waited
/// for unless somebody asks for it.
class DriverFolders {
  public:
    DriverFolders(Machine& machine, cRegistry& registry);

    /// True when all are read. Waits for that, no longer than `ms` milliseconds in all.
    bool read(int ms);
    /// The lists, each under its title. A folder that is still being read is said to be.
    std::string text();

  private:
    struct Folder {
        std::string title;
        std::string path;                        ///< empty where none is named
        std::unique_ptr<FolderReading> reading;  ///< null without a path
    };
    std::array<Folder, 3> folders_;
};

}  // namespace zel
