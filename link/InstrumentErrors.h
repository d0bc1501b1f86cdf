#pragma once
// The boxes that show a user why the instrument refused a line.

#include <string>

#include "link/ZELBas.h"
#include "platform/MessageBox.h"

namespace zel {

/// Shows the box "ZEL3 Error" for the status digits 1 to 5 and 7; `keyword` is the whole refused
/// line. Silent before REMOTE was accepted and while a script scans.
void ReportInstrumentError(const ZELBas& state, MessageBoxes& boxes, int status,
                           const std::string& keyword);

}  // namespace zel
