#pragma once
// The program's version, and the words of version records.

#include <cstdint>
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

// The words of a file's version record, for the support report.

/// The flags of a record, each word with a blank after it ("Debug PreRel "); empty for none.
std::string fileFlagsText(std::uint32_t flags);
/// "Application", "DLL", "Device Driver"; empty for another type.
std::string fileTypeText(std::uint32_t type);
/// "Windows 95" to "Windows XP / .NET Server" by the number of the platform (1 or 2) and of the
/// version; empty for another.
std::string windowsName(int platform, int major, int minor);

}  // namespace zel
