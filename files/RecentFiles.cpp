#include "files/RecentFiles.h"

#include <algorithm>
#include <cstddef>
#include <filesystem>
#include <string>
#include <system_error>

#include "forms/ControllerForm.h"
#include "platform/Services.h"

namespace zel {
namespace {

constexpr const char* kApplication = "ZELRemote";
constexpr const char* kSection = "RecentFiles";

std::string keyOf(int index) { return "File" + std::to_string(index); }

}  // namespace

RecentFiles::RecentFiles(ControllerForm& panel, SettingsStore& settings)
    : panel_(panel), settings_(settings) {
    for (int i = 0; i < panel_.RecentFile.count(); ++i) {
        handlers_.on(panel_.RecentFile(i).Clicked, [this, i] {
            if (i >= static_cast<int>(paths_.size())) return;
            const std::string path = paths_[static_cast<std::size_t>(i)];
            panel_.OpenFile(path);
        });
    }
    show();
}

void RecentFiles::load() {
    paths_.clear();
    for (int i = 0; i < panel_.RecentFile.count(); ++i) {
        const std::string path = settings_.get(kApplication, kSection, keyOf(i), "");
        if (!path.empty()) paths_.push_back(path);
    }
    show();
}

void RecentFiles::add(const std::string& path) {
    std::error_code problem;
    const std::filesystem::path whole = std::filesystem::absolute(path, problem);
    const std::string name = problem ? path : whole.lexically_normal().string();
    paths_.erase(std::remove(paths_.begin(), paths_.end(), name), paths_.end());
    paths_.insert(paths_.begin(), name);
    const auto most = static_cast<std::size_t>(panel_.RecentFile.count());
    if (paths_.size() > most) paths_.resize(most);
    for (std::size_t i = 0; i < paths_.size(); ++i)
        settings_.set(kApplication, kSection, keyOf(static_cast<int>(i)), paths_[i]);
    show();
}

void RecentFiles::show() {
    for (int i = 0; i < panel_.RecentFile.count(); ++i) {
        MenuItem& entry = panel_.RecentFile(i);
        const bool used = i < static_cast<int>(paths_.size());
        entry.Visible = used;
        if (!used) continue;
        const std::string& path = paths_[static_cast<std::size_t>(i)];
        entry.Caption = std::filesystem::path(path).filename().string();
        entry.ToolTip = path;
    }
    panel_.RecentMenu.Enabled = !paths_.empty();
}

}  // namespace zel
