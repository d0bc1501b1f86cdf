#pragma once
// One run of the tool, from its options to its exit status.

#include <iosfwd>

#include "console/Fronts.h"
#include "console/Options.h"

namespace zel {

/// Results go to `out`, all else to `errors`. Lines of a panel session without a file come from
/// standard input.
int runTool(const Options& options, Front& front, std::ostream& out, std::ostream& errors);

}  // namespace zel
