#include "support/DriverFolders.h"

#include <algorithm>
#include <string>

#include "platform/FolderFiles.h"
#include "platform/Machine.h"
#include "support/RegAccess.h"
#include "support/Text.h"
#include "support/cRegistry.h"

namespace zel {
namespace {

constexpr int kTurnMs = 5;

/// What the registry names, else the environment.
std::string folderOf(cRegistry& registry, Machine& machine, const std::string& section,
                     const std::string& name, const std::string& variable) {
    std::string folder = readRegistryText(registry, HKEY_LOCAL_MACHINE, section, name, "");
    return folder.empty() ? machine.environment(variable) : folder;
}

std::string listText(const FolderFiles& found) {
    std::string text;
    for (const std::string& name : found.names) text += name + kCrLf;
    if (found.more > 0) text += "and " + std::to_string(found.more) + " more" + kCrLf;
    return text.empty() ? "none" + std::string(kCrLf) : text;
}

}  // namespace

DriverFolders::DriverFolders(Machine& machine, cRegistry& registry) {
    std::string ivi = folderOf(registry, machine, "SOFTWARE\\Microsoft\\Windows\\CurrentVersion",
                               "ProgramFilesDir", "ProgramFilesDir");
    if (!ivi.empty()) ivi += "/IVI/Bin";
    folders_ = {{{"VXI plug and play drivers",
                  folderOf(registry, machine, "SOFTWARE\\VXIPNP_Alliance\\VXIPNP\\CurrentVersion",
                           "FrameworkPath", "FRAMEWORK_PATH"),
                  nullptr},
                 {"IVI drivers", ivi, nullptr},
                 {"USB drivers", machine.environment("USB_DRIVER_PATH"), nullptr}}};
    for (Folder& folder : folders_)
        if (!folder.path.empty()) folder.reading = machine.readFolder(folder.path);
}

bool DriverFolders::read(int ms) {
    for (Folder& folder : folders_) {
        if (folder.reading == nullptr) continue;
        // In turns, since a wait that was cut short leaves no word of how long it took.
        while (folder.reading->result(std::min(ms, kTurnMs)) == nullptr) {
            if (ms <= 0) return false;
            ms -= kTurnMs;
        }
    }
    return true;
}

std::string DriverFolders::text() {
    std::string text;
    for (Folder& folder : folders_) {
        const FolderFiles* found = folder.reading ? folder.reading->result(0) : nullptr;
        text += std::string(kCrLf) + "*** " + folder.title + " ***" + kCrLf;
        if (found == nullptr && folder.reading != nullptr)
            text += folder.path + " is still being read" + kCrLf;
        else
            text += listText(found == nullptr ? FolderFiles() : *found);
    }
    return text;
}

}  // namespace zel
