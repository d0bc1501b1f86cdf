#include "support/VersionInfo.h"

#include <cstdint>
#include <string>

namespace zel {
namespace {

struct Word {
    std::uint32_t code;
    const char* text;
};
constexpr Word kFlags[] = {{0x01, "Debug "},   {0x02, "PreRel "}, {0x04, "Patched "},
                           {0x08, "Private "}, {0x10, "Info "},   {0x20, "Special "}};
constexpr Word kTypes[] = {{1, "Application"}, {2, "DLL"}, {3, "Device Driver"}};

struct Release {
    int platform;
    int major;
    int minor;
    const char* name;
};
/// The last one stands for all later ones of its platform and major number.
constexpr Release kReleases[] = {
    {1, 4, 0, "Windows 95"},
    {1, 4, 10, "Windows 98"},
    {1, 4, 90, "Windows Me"},
    {2, 3, 51, "Windows NT 3.51"},
    {2, 4, 0, "Windows NT 4.0"},
    {2, 5, 0, "Windows 2000"},
    {2, 5, 1, "Windows XP / .NET Server"},
};

}  // namespace

// The build defines the three numbers for this file.
const VersionInfo kVersion{ZEL_VERSION_MAJOR, ZEL_VERSION_MINOR, ZEL_VERSION_PATCH};

std::string versionText(const VersionInfo& version) {
    std::string text = std::to_string(version.major) + "." + std::to_string(version.minor);
    if (version.revision != 0) text += "." + std::to_string(version.revision);
    return text;
}

std::string fileFlagsText(std::uint32_t flags) {
    std::string text;
    for (const Word& row : kFlags)
        if ((flags & row.code) != 0) text += row.text;
    return text;
}

std::string fileTypeText(std::uint32_t type) {
    for (const Word& row : kTypes)
        if (row.code == type) return row.text;
    return {};
}

std::string windowsName(int platform, int major, int minor) {
    std::string name;
    for (const Release& row : kReleases)
        if (row.platform == platform && row.major == major && row.minor <= minor) name = row.name;
    return name;
}

}  // namespace zel
