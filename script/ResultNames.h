#pragma once
// File names that come out of a script: in capitals, relative, with backslashes between folders.

#include <optional>
#include <string>

#include "platform/Files.h"

namespace zel {

/// The path that a name stands for: a backslash parts folders, a relative name stands below
/// `folder`. Of a name that is `typed` nothing else changes; of one out of a script each part is
/// looked up as it stands, then regardless of case, and a part that is not there stays. Nothing
/// for an empty name and for one that cannot be a file here: a drive letter, a control character.
std::optional<std::string> resolveName(FileService& files, const std::string& name,
                                       const std::string& folder, bool typed);

}  // namespace zel
