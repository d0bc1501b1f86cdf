#pragma once
// The program's version.

#include <string>

namespace zel {

struct VersionInfo {
    int major = 1;
    int minor = 0;
    int revision = 0;
};

inline constexpr VersionInfo kVersion{};

/// "1.0", or "1.0.2" for a revision that is not 0.
inline std::string versionText(const VersionInfo& version) {
    std::string text = std::to_string(version.major) + "." + std::to_string(version.minor);
    if (version.revision != 0) text += "." + std::to_string(version.revision);
    return text;
}

}  // namespace zel
