#include "platform/FolderFiles.h"

#include <algorithm>
#include <cstddef>
#include <string>
#include <utility>
#include <vector>

#include "platform/Files.h"

namespace zel {
namespace {

constexpr std::size_t kMostLooked = 1000;

}  // namespace

FolderFiles filesOf(FileService& files, const std::string& folder) {
    std::vector<std::string> entries = files.list(folder);
    const std::size_t looked = std::min(entries.size(), kMostLooked);
    std::partial_sort(entries.begin(), entries.begin() + static_cast<std::ptrdiff_t>(looked),
                      entries.end());
    FolderFiles found;
    found.more = entries.size() - looked;
    entries.resize(looked);
    for (std::string& entry : entries)
        if (entry.front() != '.' && files.stat(folder + "/" + entry).isRegular())
            found.names.push_back(std::move(entry));
    return found;
}

}  // namespace zel
