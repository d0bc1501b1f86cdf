#pragma once
// The services that a handler works with, as one bundle: time, events, boxes, the debug line.

#include <string>

#include "platform/Clock.h"
#include "platform/Controls.h"
#include "platform/Events.h"
#include "platform/MessageBox.h"

namespace zel {

/// A module that needs two of these or more takes the bundle; its members are references, so that
/// a copy stands for the same services.
struct Session {
    const Clock& clock;
    Events& events;
    MessageBoxes& boxes;
    TextBox& debugBox;  ///< the panel's one line that shows the last step of the exchange

    /// Replaces the text of the debug line.
    void DebugLine(const std::string& text) const { debugBox.Text = text; }
};

}  // namespace zel
