#pragma once
// A folder that a thread of its own reads.

#include <memory>
#include <string>

#include "platform/FolderFiles.h"

namespace zel {

/// The thread ends by itself; where the disk never answers it stays until the program ends, which
/// does not wait for it.
std::unique_ptr<FolderReading> readInThread(const std::string& folder);

}  // namespace zel
