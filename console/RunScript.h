#pragma once
// The verb that runs a measurement script, with its boxes and dialogs on the console.

#include <functional>
#include <string>

#include "console/ConsoleDialogs.h"
#include "console/LineInput.h"
#include "console/LineOutput.h"
#include "console/Options.h"
#include "console/ServingEvents.h"
#include "platform/Files.h"
#include "platform/Signals.h"
#include "shell/Program.h"

namespace zel {

struct ScriptStage {
    Program& program;
    FileService& files;
    ServingEvents& events;
    LineInput& input;  ///< answers of the boxes, presses of the step mode
    bool virtualTime;  ///< no time passes while a line is awaited
    ConsoleBoxes& boxes;
    ConsoleFileDialogs& dialogs;
    AnswerQueue& answers;
    LineOutput& errors;
    Signals& signals;  ///< SIGINT is the Stop button while the script runs
    std::function<void(const std::string&)> progress;  ///< a line that is overwritten; may be empty
};

/// Opens the script and executes it to its end, connected or not. 0 when the run reached the end
/// of the list, 1 when it ended before, 2 for a script that cannot be read.
int runScript(const Options& options, const ScriptStage& stage);

/// Prints how the run would go. 0 when all is well, 2 for a script that cannot be read, 3 when
/// something is wrong.
int rehearseScript(const Options& options, FileService& files, LineOutput& output,
                   LineOutput& errors);

}  // namespace zel
