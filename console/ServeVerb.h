#pragma once
// The verbs beside the instrument's: the server, and the commands of communication devices.

#include "console/Options.h"
#include "console/Verbs.h"

namespace zel {

/// Serves the instrument until the run is asked to end; each event is a line of output.
int runServer(const Options& options, const VerbStage& stage);
/// Prints the names of the devices, or sends one of them its commands.
int runDevices(const Options& options, const VerbStage& stage);

}  // namespace zel
