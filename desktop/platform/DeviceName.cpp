#include "desktop/platform/DeviceName.h"

#include <filesystem>
#include <string>
#include <system_error>

#include "platform/LinkAddress.h"
#include "support/Text.h"

namespace zel {

std::string devicePath(const std::string& name) {
    namespace fs = std::filesystem;
    if (trimmed(name).empty() || name.front() == '/') return name;
    std::error_code problem;
    // A folder of that name is no device.
    const auto isDevice = [&](const fs::path& path) {
        return fs::exists(path, problem) && !fs::is_directory(path, problem);
    };
    const fs::path here = fs::absolute(name, problem).lexically_normal();
    // A name with a folder in it can be nothing else.
    if (name.find('/') != std::string::npos || isDevice(here)) return here.string();
    return startsWith(upperCase(name), "COM") ? name : "/dev/" + name;
}

void useDevicePath(LinkAddress& address) {
    if (!address.overNetwork()) address.port = devicePath(address.port);
}

}  // namespace zel
