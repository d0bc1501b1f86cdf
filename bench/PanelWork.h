#pragma once
// What the work at the panel costs beside its dialogue: a setting, a menu, the continuous view.

#include <string>

#include "bench/Figures.h"

namespace zelbench {

/// From Enter in the entry box to the new trace on the window's pixels, less what a bare loop needs
/// for the same bytes, against 5 ms.
Figure settingCost(const std::string& simulator);
/// Bytes on the line when every hard key is pressed for the second time, against the first.
Figure menusAgain(const std::string& simulator);
/// Passes of the continuous view, drawing included, against what a line of 57,600 baud allows.
Figure continuousPaced(const std::string& simulator);
/// The same on an unpaced line against a bare loop of the same words.
Figure continuousUnpaced(const std::string& simulator);

/// The continuous view with the waterfall's window and the spectrogram open, on a paced line.
Figure rowsPaced(const std::string& simulator);
/// The same on an unpaced line beside the view with both closed.
Figure rowsUnpaced(const std::string& simulator);

}  // namespace zelbench
