#include "console/Tool.h"

#include <unistd.h>

#include <algorithm>
#include <fstream>
#include <locale>
#include <memory>

#include "console/AnalysisVerb.h"
#include "console/ConsoleDialogs.h"
#include "console/DebugWatch.h"
#include "console/LineInput.h"
#include "console/LineOutput.h"
#include "console/PanelSession.h"
#include "console/Pictures.h"
#include "console/RunScript.h"
#include "console/ServeVerb.h"
#include "console/ServingEvents.h"
#include "console/Verbs.h"
#include "desktop/platform/QtSignals.h"
#include "rehearsal/Rehearsal.h"

namespace zel {
namespace {

/// What both kinds of run stand on.
struct Stage {
    Stage(const Options& options, Front& front, LineOutput& boxOutput, LineOutput& errorOutput)
        : boxes(boxOutput, answers),
          dialogs(boxOutput, answers),
          events(front.events()),
          files(front.platform(events, boxes, dialogs).files),
          program(front.platform(events, boxes, dialogs), options.words),
          watch(program.forms().controller) {
        events.always = [&front] { front.endSignals().deliver(); };
        program.forms().controller.DrawImage.connect(
            [this](const std::string& file, std::string& problem) {
                problem = drawGraphImage(program, file);
            });
        program.forms().waterfall.DrawImage.connect(
            [this](const std::string& file, std::string& problem) {
                problem = drawWaterfallImage(program, file);
            });
        offerRehearsal(program, boxes, files);
        watch.onExchange = [&boxOutput] { boxOutput.settle(); };
        if (!options.verbose) return;
        const Clock& clock = front.clock();
        watch.onLine = [&clock, &errorOutput, start = clock.micros()](const std::string& text) {
            const auto ms = (clock.micros() - start) / 1000;
            errorOutput.line("[" + std::to_string(ms) + " ms] " + text);
        };
    }

    AnswerQueue answers;
    ConsoleBoxes boxes;
    ConsoleFileDialogs dialogs;
    ServingEvents events;
    FileService& files;
    Program program;
    DebugWatch watch;
};

/// "[#####-----] 12 of 24", over what stood there.
void drawBar(std::ostream& stream, int done, int wanted) {
    constexpr int kWidth = 40;
    const int filled = static_cast<int>(static_cast<long long>(kWidth) * done / wanted);
    stream << "\r[" << std::string(static_cast<std::size_t>(filled), '#')
           << std::string(static_cast<std::size_t>(kWidth - filled), '-') << "] " << done << " of "
           << wanted << (done == wanted ? "\n" : "") << std::flush;
}

/// A line over the one before; an empty one ends it.
void drawLine(std::ostream& stream, const std::string& text) {
    constexpr std::size_t kWidth = 60;
    if (text.empty()) {
        stream << std::endl;
        return;
    }
    stream << '\r' << text << std::string(kWidth - std::min(text.size(), kWidth), ' ')
           << std::flush;
}

int runPanel(const Options& options, Front& front, LineOutput& output, LineOutput& errors) {
    std::ifstream file;
    file.imbue(std::locale::classic());
    std::unique_ptr<LineInput> input;
    if (options.argument.empty()) {
        input = std::make_unique<DescriptorLines>(STDIN_FILENO, front.endSignals().descriptor());
    } else {
        file.open(options.argument, std::ios::binary);
        if (!file || file.peek() == std::ifstream::traits_type::eof()) {
            if (!file.eof()) {
                errors.line("zelctl: " + options.argument + " cannot be read");
                return kWrongUse;
            }
        }
        input = std::make_unique<StreamLines>(file);
    }
    Stage stage(options, front, output, errors);
    std::optional<LinkAddress> address;
    if (options.address) address = options.address->link;
    PanelSession session(stage.program,
                         {front.clock(), stage.events, *input, output, errors, stage.answers,
                          options.address && options.address->simulated},
                         address);
    stage.boxes.misfit = [&session](const std::string& answer) {
        session.complain("\"" + answer + "\" answers no question: yes, no, ok or cancel does");
    };
    return session.run();
}

/// Nothing is measured for a picture that cannot be drawn.
bool missesDrawing(const Options& options) {
    const bool wanted =
        !options.image.empty() || !options.waterfall.empty() || !options.spectrogram.empty();
    return wanted && findDrawingProgram().empty();
}

int runOneVerb(const Options& options, Front& front, const Streams& streams, LineOutput& output,
               LineOutput& errors) {
    if (missesDrawing(options)) {
        errors.line(std::string("zelctl: ") + kNoDrawingProgram);
        return kLinkFailed;
    }
    Stage stage(options, front, errors, errors);
    if (options.verb == Verb::Analyse)
        return analyseFiles(options.traceFiles, *options.analysis, stage.files, front.clock(),
                            output, errors);
    std::optional<AnalysisPrinter> analysis;
    if (options.analysis) {
        analysis.emplace(*options.analysis, output, errors);
        if (const std::string problem = analysis->readMaskFile(stage.files); !problem.empty()) {
            errors.line("zelctl: " + problem);
            return kWrongUse;
        }
    }
    if (options.verb == Verb::Run && options.rehearse)
        return rehearseScript(options, stage.files, output, errors);
    ProgressBar progress;
    if (streams.errorsAreTerminal)
        progress = [&streams](int done, int wanted) { drawBar(streams.errors, done, wanted); };
    DescriptorLines input(STDIN_FILENO, front.endSignals().descriptor());
    std::function<void(const std::string&)> progressLine;
    if (streams.errorsAreTerminal)
        progressLine = [&streams](const std::string& text) { drawLine(streams.errors, text); };
    const bool virtualTime = options.address && options.address->simulated;
    const auto script = [&](const Options& given) {
        return runScript(given,
                         {stage.program, stage.files, stage.events, input, virtualTime, stage.boxes,
                          stage.dialogs, stage.answers, errors, front.endSignals(), progressLine});
    };
    const VerbStage verbs{stage.program,
                          stage.events,
                          stage.answers,
                          stage.boxes,
                          output,
                          errors,
                          writeGraphImage,
                          writeRowsImage,
                          progress,
                          script,
                          analysis ? &*analysis : nullptr};
    if (options.verb == Verb::Serve) return runServer(options, verbs);
    if (options.verb == Verb::Devices) return runDevices(options, verbs);
    return runVerb(options, verbs);
}

}  // namespace

int runTool(const Options& options, Front& front, const Streams& streams) {
    LineOutput output(streams.out, streams.outIsTerminal);
    LineOutput errors(streams.errors, streams.errorsAreTerminal);
    const int status = options.verb == Verb::Panel
                           ? runPanel(options, front, output, errors)
                           : runOneVerb(options, front, streams, output, errors);
    if (output.problem().empty()) return status;
    errors.line("zelctl: the output cannot be written: " + output.problem());
    return kLinkFailed;
}

}  // namespace zel
