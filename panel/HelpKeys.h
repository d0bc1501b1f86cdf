#pragma once
// F1 on the panel's keys, boxes and graph opens the help.

#include "forms/ControllerForm.h"

namespace zel {

/// Help topics by the window that asks for them.
inline constexpr int kPanelTopic = 2111;
inline constexpr int kContentsTopic = 1110;

class HelpKeys {
  public:
    /// Connects the hard keys, soft keys, entry boxes, the send button, the graph and the entry of
    /// the help menu.
    explicit HelpKeys(ControllerForm& panel);

  private:
    void keyDown(int key);

    ControllerForm& panel_;
};

}  // namespace zel
