#include "console/Tool.h"

#include <unistd.h>

#include <algorithm>
#include <cstddef>
#include <fstream>
#include <functional>
#include <ios>
#include <locale>
#include <memory>
#include <optional>
#include <ostream>
#include <string>
#include <vector>

#include "connection/Doctor.h"
#include "console/Address.h"
#include "console/AnalysisVerb.h"
#include "console/ConsoleDialogs.h"
#include "console/DebugWatch.h"
#include "console/Fronts.h"
#include "console/LineInput.h"
#include "console/LineOutput.h"
#include "console/Options.h"
#include "console/PanelSession.h"
#include "console/Pictures.h"
#include "console/RunScript.h"
#include "console/ServeVerb.h"
#include "console/ServingEvents.h"
#include "console/Verbs.h"
#include "desktop/platform/CrashTrace.h"
#include "desktop/platform/QtSignals.h"
#include "model/InstrumentWords.h"
#include "platform/Clock.h"
#include "platform/Controls.h"
#include "platform/Event.h"
#include "platform/Files.h"
#include "platform/LinkAddress.h"
#include "rehearsal/Rehearsal.h"
#include "shell/Logs.h"
#include "support/ErrorReport.h"
#include "support/ExitStatus.h"
#include "support/SessionLog.h"
#include "support/Text.h"

namespace zel {
namespace {

/// What both kinds of run stand on.
struct Stage {
    Stage(const Options& options, Front& front, LineOutput& boxOutput, LineOutput& errorOutput,
          const Rerun* rerun)
        : boxes(boxOutput, answers),
          dialogs(boxOutput, answers),
          events(front.events()),
          overlay(rerun == nullptr ? nullptr
                                   : rerun->files(front.platform(events, boxes, dialogs).files)),
          files(overlay ? *overlay : front.platform(events, boxes, dialogs).files),
          program(platformOf(front), options.words),
          watch(program.forms().controller) {
        events.always = [&front] { front.endSignals().deliver(); };
        // A session that runs again draws nothing.
        program.forms().controller.DrawImage.connect(
            [this, rerun](const std::string& file, std::string& problem) {
                problem = rerun == nullptr ? drawGraphImage(program, file) : "";
            });
        program.forms().waterfall.DrawImage.connect(
            [this, rerun](const std::string& file, std::string& problem) {
                problem = rerun == nullptr ? drawWaterfallImage(program, file) : "";
            });
        offerRehearsal(program, boxes, files);
        beginRecord(options);
        if (rerun == nullptr) watchFaults(errorOutput);
        if (rerun != nullptr) rerun->begun(program);
        watch.onExchange = [&boxOutput] { boxOutput.settle(); };
        if (!options.verbose) return;
        const Clock& clock = front.clock();
        watch.onLine = [&clock, &errorOutput, start = clock.micros()](const std::string& text) {
            const auto ms = (clock.micros() - start) / 1000;
            errorOutput.line("[" + std::to_string(ms) + " ms] " + text);
        };
    }

    Platform platformOf(Front& front) {
        Platform own = front.platform(events, boxes, dialogs);
        return {own.clock,     own.events,     own.boxes,        own.serialPort, own.serialPorts,
                own.tcpSocket, own.serverPort, own.serverSocket, own.settings,   own.debug,
                own.clipboard, own.launcher,   own.startup,      own.folder,     own.fileDialogs,
                files,         own.endSignals, own.machine,      own.portProbe};
    }

    void beginRecord(const Options& options) {
        SessionLog& record = program.sessionLog();
        record.simulatorPort = kSimulatorPort;
        record.arguments = options.given;
        if (!options.log.empty()) program.recordSession(options.log, options.given);
        // Of what the settings hold this alone decides what the program does by itself.
        const MenuItem& always = program.forms().controller.ReconnectAlways;
        if (options.verb == Verb::Panel && always.Checked) record.clicked(always.name());
    }

    void watchFaults(LineOutput& errors) {
        if (!program.takeCrash().empty())
            errors.line(
                "zelctl: a fault ended an earlier run; its trace is in crash.1.log beside " +
                program.crashFile());
        traceFaultsInto({program.crashFile(), program.logs().rootDebug.FileName});
    }

    /// Runs a verb; a failure that nothing catches is printed and ends it.
    int guarded(LineOutput& errors, const std::function<int()>& verb) {
        program.errorReport().print = [&errors](const std::string& report) {
            std::vector<std::string> lines = split(replaceAll(report, "\r", ""), '\n');
            if (!lines.empty() && lines.back().empty()) lines.pop_back();
            errors.lines(lines);
        };
        int status = kLinkFailed;
        try {
            status = verb();
        } catch (...) {
            program.showFailure();
        }
        errors.settle();
        return program.failed() ? kLinkFailed : status;
    }

    AnswerQueue answers;
    ConsoleBoxes boxes;
    ConsoleFileDialogs dialogs;
    ServingEvents events;
    std::unique_ptr<FileService> overlay;
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

int runPanel(const Options& options, Front& front, LineOutput& output, LineOutput& errors,
             const Rerun* rerun) {
    std::ifstream file;
    file.imbue(std::locale::classic());
    std::unique_ptr<LineInput> input;
    if (rerun != nullptr) {
        input = rerun->input(front.clock(), front.events());
    } else if (options.argument.empty()) {
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
    Stage stage(options, front, output, errors, rerun);
    std::optional<LinkAddress> address;
    if (options.address) address = options.address->link;
    PanelSession session(stage.program,
                         {front.clock(), stage.events, *input, output, errors, stage.answers,
                          options.address && options.address->simulated},
                         address);
    stage.boxes.misfit = [&session](const std::string& answer) {
        session.complain("\"" + answer + "\" answers no question: yes, no, ok or cancel does");
    };
    if (rerun != nullptr && rerun->ofWindow) {
        session.serveInPumps();
        stage.answers.await = [&] { rerun->awaitAnswer(stage.answers); };
    }
    return session.run();
}

/// Nothing is measured for a picture that cannot be drawn.
bool missesDrawing(const Options& options) {
    const bool wanted =
        !options.image.empty() || !options.waterfall.empty() || !options.spectrogram.empty();
    return wanted && findDrawingProgram().empty();
}

int runDoctor(const Options& options, Program& program, LineOutput& output, LineOutput& errors) {
    std::optional<LinkAddress> address;
    if (options.address) address = options.address->link;
    program.start();
    Handlers handlers;
    handlers.on(program.Ended, [&program] { program.doctor().stop(); });
    const bool well = program.doctor().examine(
        address, [&output](const Finding& finding) { output.line(findingLine(finding)); });
    if (!program.endedBy().empty()) errors.line("zelctl: ended by " + program.endedBy());
    return well && program.endedBy().empty() ? kDone : kLinkFailed;
}

int runOneVerb(const Options& options, Front& front, const Streams& streams, LineOutput& output,
               LineOutput& errors, const Rerun* rerun) {
    if (missesDrawing(options)) {
        errors.line(std::string("zelctl: ") + kNoDrawingProgram);
        return kLinkFailed;
    }
    Stage stage(options, front, errors, errors, rerun);
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
    return stage.guarded(errors, [&] {
        if (options.verb == Verb::Doctor) return runDoctor(options, stage.program, output, errors);
        if (options.verb == Verb::Serve) return runServer(options, verbs);
        if (options.verb == Verb::Devices) return runDevices(options, verbs);
        return runVerb(options, verbs);
    });
}

int printWords(LineOutput& output) {
    std::vector<std::string> lines;
    for (const InstrumentWord& word : instrumentWords()) lines.push_back(wordLine(word));
    output.lines(lines);
    return kDone;
}

int runAny(const Options& options, Front& front, const Streams& streams, LineOutput& output,
           LineOutput& errors, const Rerun* rerun) {
    switch (options.verb) {
        case Verb::Words:
            return printWords(output);
        case Verb::Panel:
            return runPanel(options, front, output, errors, rerun);
        default:
            return runOneVerb(options, front, streams, output, errors, rerun);
    }
}

}  // namespace

int runTool(const Options& options, Front& front, const Streams& streams, const Rerun* rerun) {
    LineOutput output(streams.out, streams.outIsTerminal);
    LineOutput errors(streams.errors, streams.errorsAreTerminal);
    const int status = runAny(options, front, streams, output, errors, rerun);
    if (output.problem().empty()) return status;
    errors.line("zelctl: the output cannot be written: " + output.problem());
    return kLinkFailed;
}

}  // namespace zel
