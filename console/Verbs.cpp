#include "console/Verbs.h"

#include <cstdint>
#include <memory>
#include <stdexcept>
#include <string>
#include <utility>

#include "analysis/LiveTrace.h"
#include "analysis/Mask.h"
#include "analysis/MaskWatch.h"
#include "console/GraphText.h"
#include "console/LineOutput.h"
#include "console/Options.h"
#include "desktop/platform/SystemCommand.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "forms/WaterfallForm.h"
#include "link/CommandExchange.h"
#include "model/ZEL3Variables.h"
#include "shell/Program.h"
#include "support/ExitStatus.h"
#include "support/NumberText.h"
#include "trace/Sweep.h"
#include "trace/TraceReader.h"

namespace zel {
namespace {

struct Run {
    const Options& options;
    const VerbStage& stage;

    Program& program() const { return stage.program; }
    LineOutput& output() const { return stage.output; }
    ControllerForm& panel() const { return stage.program.forms().controller; }
    int fail(const std::string& what) const {
        if (!program().endedBy().empty()) return kLinkFailed;  // that is reported once, at the end
        stage.errors.line("zelctl: " + what);
        return kLinkFailed;
    }
    /// Draws the pictures that were asked for.
    int drawImage() const {
        std::string problem;
        if (!options.image.empty()) problem = stage.image(program(), options.image);
        if (problem.empty() && !options.waterfall.empty())
            problem = stage.rows(program(), options.waterfall, false);
        if (problem.empty() && !options.spectrogram.empty())
            problem = stage.rows(program(), options.spectrogram, true);
        return problem.empty() ? kDone : fail(problem);
    }
    bool wantsRows() const { return !options.waterfall.empty() || !options.spectrogram.empty(); }
};

int info(const Run& run) {
    Forms& forms = run.program().forms();
    const ZEL3Variables& mirror = run.program().variables();
    const bool tcp = run.options.address->link.overNetwork();
    const std::pair<const char*, std::string> lines[] = {
        {"Identity", tcp ? forms.tcpConnection.IDTextBox.Text : forms.main.IDText.Text},
        {"Model", std::to_string(mirror.InstrumentModel)},
        {"Serial", generalNumber(mirror.InstrumentSerial)},
        {"Mode", std::to_string(forms.controller.InstrumentMode)},
        {"Center", generalNumber(mirror.CenterFrequency)},
        {"Span", generalNumber(mirror.Span)},
        {"RefLevel", generalNumber(mirror.ReferenceLevel)},
        {"Unit", generalNumber(mirror.ReferenceUnit)},
        {"Range", generalNumber(mirror.ReferenceRange)},
        {"SweepTime", generalNumber(mirror.SweepTime)},
        {"Detector", std::to_string(mirror.TraceDetector)},
    };
    for (const auto& [name, value] : lines) run.output().line(std::string(name) + ": " + value);
    return kDone;
}

int get(const Run& run) {
    std::string value;
    if (!run.program().exchange().GetInstrument(run.options.argument, value))
        return run.fail("no answer to GET " + run.options.argument);
    run.output().line(value);
    return kDone;
}

int set(const Run& run) {
    if (run.program().exchange().SetInstrument(run.options.argument)) return kDone;
    return run.fail("the instrument did not take " + run.options.argument);
}

int cmd(const Run& run) {
    if (run.program().exchange().CmdInstrument(run.options.argument)) return kDone;
    return run.fail("the instrument did not carry out " + run.options.argument);
}

/// Reports each incomplete trace on the error output from now on; the result counts them.
std::shared_ptr<int> tellIncompleteTraces(const Run& run) {
    auto count = std::make_shared<int>(0);
    LineOutput& errors = run.stage.errors;
    run.program().traces().CutShort.connect([count, &errors](const Sweep& sweep) {
        ++*count;
        errors.line(incompleteText(sweep));
    });
    return count;
}

/// What happens to sweeps that fail the mask.
class Watch {
  public:
    explicit Watch(const Run& run)
        : run_(run), watch_(run.program().files(), command_, run.program().clock()) {
        if (run.stage.analysis != nullptr) watch_.set(run.stage.analysis->options().watch);
        watch_.Problem = [this](const std::string& problem) {
            failed_ = true;
            run_.stage.errors.line("zelctl: " + problem);
        };
    }
    void take(const Sweep& sweep, const MaskVerdict& verdict) { watch_.take(sweep, verdict); }
    /// Waits for the last command, which goes on by itself where it takes too long. False when
    /// something could not be done.
    bool finish() {
        constexpr int kLongestMs = 10'000;
        command_.waitForEnd(kLongestMs);
        watch_.follow();
        return !failed_;
    }

  private:
    const Run& run_;
    SystemCommand command_;
    MaskWatch watch_;
    bool failed_ = false;
};

/// Hands a sweep to the analysis. False, with the reason on the error output, where it cannot be
/// analysed; an incomplete one was reported before.
bool analyse(const Run& run, Watch& watch, const Sweep& sweep, std::uint64_t number) {
    if (!sweep.whole()) return true;
    try {
        const auto verdict = run.stage.analysis->add(spectrumOf(sweep), {}, number);
        watch.take(sweep, verdict.value_or(MaskVerdict{}));
    } catch (const std::runtime_error& wrong) {
        run.fail(wrong.what());
        return false;
    }
    return true;
}

int sweep(const Run& run) {
    ControllerForm& panel = run.panel();
    WaterfallForm& waterfall = run.program().forms().waterfall;
    const auto incomplete = tellIncompleteTraces(run);
    Watch watch(run);
    for (int i = 0; i < run.options.count && run.output().problem().empty(); ++i) {
        bool success = false;
        // As passes of one view the sweeps stand one after the other in the waterfall.
        panel.ContinuosLoopActive = run.wantsRows();
        panel.YVectorVal = i;
        run.program().traces().ReadSingleTrace(success);
        panel.ContinuosLoopActive = false;
        if (run.wantsRows()) waterfall.styleLastRow();
        const Sweep& sweep = run.program().traces().lastSweep();
        if (run.stage.analysis != nullptr) {
            if (!analyse(run, watch, sweep, static_cast<std::uint64_t>(i) + 1)) return kLinkFailed;
        } else if (sweep.wanted > 0) {
            run.output().line(i == 0 ? sweepHeader(sweep.autoPeak()) : std::string());
            run.output().lines(sweepRows(sweep));
        }
        if (!success) return run.fail("sweep " + std::to_string(i + 1) + " could not be read");
    }
    if (!run.options.output.empty()) {
        run.stage.answers.add(run.options.output);
        run.panel().SaveCurrentView.Click();
        if (run.stage.boxes.failures() > 0) return kLinkFailed;
    }
    const int verdict = run.stage.analysis != nullptr ? run.stage.analysis->finish() : kDone;
    const int drawn = run.drawImage();
    if (!watch.finish() || *incomplete > 0 || drawn != kDone) return kLinkFailed;
    return verdict;
}

/// How far a recording is; its tick handler outlives the verb.
struct RecordingWatch {
    int ticks = 0;
    bool broken = false;  ///< it ended by itself: the file cannot be written
};

int record(const Run& run) {
    constexpr int kWaitMs = 100;
    ControllerForm& panel = run.panel();
    TimeForm& dialog = run.program().forms().time;
    const auto incomplete = tellIncompleteTraces(run);
    const auto watch = std::make_shared<RecordingWatch>();
    const int wanted = run.options.count;
    dialog.Ticked.connect([watch, wanted, &panel, progress = run.stage.progress] {
        watch->broken = watch->broken || !panel.RecordData.Checked;
        if (watch->broken || watch->ticks >= wanted) return;
        ++watch->ticks;
        if (progress) progress(watch->ticks, wanted);
        if (watch->ticks == wanted) panel.StopButton.Click();
    });
    panel.RecordData.Click();
    dialog.TimeIntervalBox.Text = generalNumber(run.options.interval);
    run.stage.answers.add(run.options.output);
    dialog.SubmitTimeButton.Click();
    while (!run.program().ended() && panel.RecordData.Checked && watch->ticks < wanted)
        run.stage.events.wait(kWaitMs);
    if (panel.RecordData.Checked) panel.StopButton.Click();
    if (watch->ticks < wanted)
        return run.fail("the recording ended after " + std::to_string(watch->ticks) + " traces");
    if (dialog.FailedCount > 0)
        return run.fail(generalNumber(dialog.FailedCount) + " of " + std::to_string(wanted) +
                        " traces could not be read");
    return *incomplete > 0 ? kLinkFailed : kDone;
}

int show(const Run& run) {
    ControllerForm& panel = run.panel();
    const ZEL3Variables& mirror = run.program().variables();
    int traces = 0;
    panel.TraceLoaded.connect([&] {
        const bool autoPeak = mirror.TraceDetector == 0;
        run.output().line(traces++ == 0 ? sweepHeader(autoPeak) : std::string());
        run.output().lines(loadedRows(panel, autoPeak));
    });
    panel.OpenFile(run.options.argument);
    if (run.stage.boxes.failures() > 0) return kLinkFailed;
    if (traces == 0) return run.fail(run.options.argument + " holds no rows");
    return run.drawImage();
}

int runList(const Run& run) { return run.stage.script(run.options); }

using Routine = int (*)(const Run&);
struct VerbRow {
    Verb verb;
    Routine routine;
};
constexpr VerbRow kVerbs[] = {
    {Verb::Info, info},   {Verb::Get, get},       {Verb::Set, set},   {Verb::Cmd, cmd},
    {Verb::Sweep, sweep}, {Verb::Record, record}, {Verb::Show, show}, {Verb::Run, runList},
};

int tellEnd(const Run& run, int status) {
    const std::string& signal = run.program().endedBy();
    if (signal.empty()) return status;
    run.stage.errors.line("zelctl: ended by " + signal);
    return kLinkFailed;
}

}  // namespace

int runVerb(const Options& options, const VerbStage& stage) {
    const Run run{options, stage};
    const bool needsInstrument =
        options.verb == Verb::Run ? options.address.has_value() : options.verb != Verb::Show;
    stage.program.start();
    if (needsInstrument && !stage.program.connect(options.address->link, false)) {
        stage.errors.settle();
        run.fail("no instrument was connected");
        if (const std::string advice = stage.program.connectionAdvice(); !advice.empty())
            stage.errors.line("zelctl: " + advice);
        return tellEnd(run, kLinkFailed);
    }
    int status = kWrongUse;
    for (const VerbRow& row : kVerbs)
        if (row.verb == options.verb) status = row.routine(run);
    if (needsInstrument && !stage.program.ended()) stage.program.disconnect();
    stage.errors.settle();
    return tellEnd(run, status);
}

}  // namespace zel
