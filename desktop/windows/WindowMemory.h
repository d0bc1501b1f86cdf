#pragma once
// What the window is as the user left it: place, size, folded groups.

#include <QMainWindow>

#include "desktop/windows/PanelSide.h"
#include "platform/Services.h"

namespace zel {

class WindowMemory {
  public:
    explicit WindowMemory(SettingsStore& settings) : settings_(settings) {}

    /// As it was left, on a screen that is there; at the first start as large as the screen allows.
    void restore(QMainWindow& window, PanelSide& side);
    void keep(const QMainWindow& window);
    void keepFolded(const PanelSide& side);

  private:
    SettingsStore& settings_;
};

}  // namespace zel
