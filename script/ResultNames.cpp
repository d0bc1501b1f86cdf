#include "script/ResultNames.h"

#include <algorithm>
#include <filesystem>
#include <optional>
#include <string>

#include "platform/Files.h"
#include "support/CodePage.h"
#include "support/Text.h"

namespace zel {
namespace {

namespace fs = std::filesystem;

bool hasDrive(const std::string& name) {
    if (name.size() < 2 || name[1] != ':') return false;
    const char c = name[0];
    return (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
}

/// The entry of a folder that has the name, in whatever case; the name where there is none.
std::string entryOf(FileService& files, const fs::path& folder, const std::string& name) {
    if (name == "." || name == ".." || files.stat((folder / name).string()).exists()) return name;
    const std::string wanted = upperCaseText(name);
    std::string found;
    for (const std::string& entry : files.list(folder.empty() ? "." : folder.string())) {
        if (upperCaseText(entry) != wanted) continue;
        // Several spellings side by side: the same one each time.
        if (found.empty() || entry < found) found = entry;
    }
    return found.empty() ? name : found;
}

}  // namespace

std::optional<std::string> resolveName(FileService& files, const std::string& name,
                                       const std::string& folder, bool typed) {
    const bool plain = std::none_of(name.begin(), name.end(), [](char c) {
        return static_cast<unsigned char>(c) < 0x20 || c == 0x7F;
    });
    if (name.empty() || hasDrive(name) || !plain) return std::nullopt;
    const fs::path given = replaceAll(name, "\\", "/");
    if (typed) return (given.is_absolute() ? given : fs::path(folder) / given).string();
    fs::path path = given.is_absolute() ? given.root_path() : fs::path(folder);
    for (const fs::path& part : given.relative_path()) {
        if (part.empty()) continue;  // after a last separator
        path /= entryOf(files, path, part.string());
    }
    return path.string();
}

}  // namespace zel
