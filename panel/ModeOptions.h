#pragma once
// The measurement modes' keys and option buttons on the panel.

#include "forms/ControllerForm.h"
#include "platform/Controls.h"

namespace zel {

/// Clears the mode options of the panel.
void DeselectOptionBoxes(ControllerForm& panel);
/// The key of a mode by the instrument's MEAS number; the analyzer's for 0 and any unknown one.
Button& modeButton(ControllerForm& panel, int measurement);
/// The option button of a mode, likewise.
OptionButton& modeOption(ControllerForm& panel, int measurement);

}  // namespace zel
