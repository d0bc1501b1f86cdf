#pragma once
// One run of the tool, from its options to its exit status.

#include <iosfwd>

#include "console/Fronts.h"
#include "console/Options.h"

namespace zel {

/// Where a run writes.
struct Streams {
    std::ostream& out;     ///< results
    std::ostream& errors;  ///< all else
    bool outIsTerminal = false;
    bool errorsAreTerminal = false;
};

/// The exit status. Results that cannot be written end the run with 1. Lines of a panel session
/// without a file come from standard input.
int runTool(const Options& options, Front& front, const Streams& streams);

}  // namespace zel
