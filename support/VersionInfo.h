#pragma once
// The program's version.

#include <string>

namespace zel {

struct VersionInfo {
    int major = 1;
    int minor = 0;
    int revision = 0;
};

/// As the build names it.
extern const VersionInfo kVersion;

/// "1.0", or "1.0.2" for a revision that is not 0.
std::string versionText(const VersionInfo& version);

}  // namespace zel
