#pragma once
// The files of a folder, read in the background: a slow disk or a dead mount holds nobody up.

#include <cstddef>
#include <string>
#include <vector>

#include "platform/Files.h"

namespace zel {

struct FolderFiles {
    std::vector<std::string> names;  ///< regular files that are not hidden, by name
    std::size_t more = 0;            ///< entries beyond those that were looked at
};

/// Lists a folder here and now, up to a thousand of its entries. A folder that cannot be read has
/// none.
FolderFiles filesOf(FileService& files, const std::string& folder);

/// A folder that is being read while the program goes on.
class FolderReading {
  public:
    virtual ~FolderReading() = default;
    /// What was found; null while the folder is still being read. Waits for the end of that, but
    /// no longer than `ms` milliseconds, and runs no events meanwhile.
    virtual const FolderFiles* result(int ms) = 0;
};

}  // namespace zel
