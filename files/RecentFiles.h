#pragma once
// The files that were loaded last, as entries of the file menu and in the settings.

#include <string>
#include <vector>

#include "forms/ControllerForm.h"
#include "platform/Event.h"
#include "platform/Services.h"

namespace zel {

class RecentFiles {
  public:
    /// Connects the entries; a click opens the file.
    RecentFiles(ControllerForm& panel, SettingsStore& settings);

    /// Fills the menu from the settings.
    void load();
    /// Puts a path at the top.
    void add(const std::string& path);
    const std::vector<std::string>& paths() const { return paths_; }

  private:
    void show();

    ControllerForm& panel_;
    SettingsStore& settings_;
    std::vector<std::string> paths_;
    Handlers handlers_;
};

}  // namespace zel
