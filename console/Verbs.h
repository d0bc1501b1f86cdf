#pragma once
// The verbs that ask an instrument something and end: info, get, set, cmd, sweep.

#include <functional>
#include <string>

#include "console/LineOutput.h"
#include "console/Options.h"
#include "shell/Program.h"

namespace zel {

/// Draws the panel's graph into a file; what went wrong, else an empty text.
using ImageWriter = std::function<std::string(Program&, const std::string& file)>;

/// Starts the program, connects, does the verb of the options, disconnects. The exit status;
/// boxes have told of failures of the link, what the verb misses is told on `errors`.
int runVerb(const Options& options, Program& program, LineOutput& output, LineOutput& errors,
            const ImageWriter& image);

}  // namespace zel
