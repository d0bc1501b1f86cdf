#pragma once
// One run of the tool, from its options to its exit status.

#include <functional>
#include <iosfwd>
#include <memory>

#include "console/Fronts.h"
#include "console/LineInput.h"
#include "console/Options.h"
#include "platform/Clock.h"
#include "platform/Events.h"
#include "platform/Files.h"
#include "shell/Program.h"

namespace zel {

/// Where a run writes.
struct Streams {
    std::ostream& out;     ///< results
    std::ostream& errors;  ///< all else
    bool outIsTerminal = false;
    bool errorsAreTerminal = false;
};

class AnswerQueue;

/// What takes the place of the user and of the disk when a recorded session runs again.
struct Rerun {
    std::function<void(Program&)> begun;  ///< before the program starts
    std::function<std::unique_ptr<FileService>(FileService& disk)> files;
    std::function<std::unique_ptr<LineInput>(const Clock&, Events&)> input;
    /// A question waits for its answer of the record; empty where the answers come first.
    std::function<void(AnswerQueue&)> awaitAnswer;
    bool ofWindow = false;  ///< where pending events run, its clicks came as well
};

/// The exit status. Results that cannot be written end the run with 1. Lines of a panel session
/// without a file come from standard input.
int runTool(const Options& options, Front& front, const Streams& streams,
            const Rerun* rerun = nullptr);

}  // namespace zel
