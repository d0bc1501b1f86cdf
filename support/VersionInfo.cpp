#include "support/VersionInfo.h"

namespace zel {

// The build defines the three numbers for this file.
const VersionInfo kVersion{ZEL_VERSION_MAJOR, ZEL_VERSION_MINOR, ZEL_VERSION_PATCH};

std::string versionText(const VersionInfo& version) {
    std::string text = std::to_string(version.major) + "." + std::to_string(version.minor);
    if (version.revision != 0) text += "." + std::to_string(version.revision);
    return text;
}

}  // namespace zel
