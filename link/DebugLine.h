#pragma once
// The panel's one line that shows the last step of the exchange.

#include <string>

#include "forms/ControllerForm.h"

namespace zel {

/// Replaces the text of the line.
inline void DebugLine(ControllerForm& panel, const std::string& text) {
    panel.DebugTextBox.Text = text;
}

}  // namespace zel
