#pragma once
// The verbs that do one thing and end: info, get, set, cmd, sweep, record, show.

#include <functional>
#include <string>

#include "console/AnalysisVerb.h"
#include "console/ConsoleDialogs.h"
#include "console/LineOutput.h"
#include "console/Options.h"
#include "platform/Events.h"
#include "shell/Program.h"

namespace zel {

/// Draws the panel's graph into a file; what went wrong, else an empty text.
using ImageWriter = std::function<std::string(Program&, const std::string& file)>;

/// Draws the rows of the waterfall, in depth or as a spectrogram.
using RowsWriter = std::function<std::string(Program&, const std::string& file, bool spectrogram)>;

/// Shows how far a recording has come: traces taken, traces wanted.
using ProgressBar = std::function<void(int done, int wanted)>;

struct VerbStage {
    Program& program;
    Events& events;
    AnswerQueue& answers;       ///< of the file dialogs
    const ConsoleBoxes& boxes;  ///< reported what went wrong with a file
    LineOutput& output;
    LineOutput& errors;
    ImageWriter image;
    RowsWriter rows;
    ProgressBar progress;                       ///< may be empty
    std::function<int(const Options&)> script;  ///< runs a script; gives the exit status
    AnalysisPrinter* analysis = nullptr;        ///< prints results in place of a sweep's rows
};

/// Starts the program, connects, does the verb of the options, disconnects; `show` needs no
/// instrument. The exit status; boxes have reported failures of the link, what the verb misses is
/// reported on `errors`.
int runVerb(const Options& options, const VerbStage& stage);

}  // namespace zel
