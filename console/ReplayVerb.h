#pragma once
// Runs a recorded session again and compares what the program sends.

#include "console/Options.h"
#include "console/Tool.h"

namespace zel {

/// Without an address in the options the record itself answers, in virtual time. No file but those
/// of a home of its own is written. The first line of the record in which the program differs goes
/// to the output. Status 1 then, and for a log that is damaged or cannot be read.
int runReplay(const Options& options, const Streams& streams);

}  // namespace zel
