#include "script/Executor.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <exception>
#include <string>
#include <vector>

#include "forms/Forms.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "script/ComplexMeasurement.h"
#include "script/Language.h"
#include "script/ResultOutput.h"
#include "script/ScriptParts.h"
#include "support/Text.h"
#include "support/TimeText.h"
#include "trace/Interlock.h"

namespace zel {
namespace {

constexpr int kStepWaitMs = 100;
constexpr int kRetryMs = 10;
/// Statements that need no instrument run at full speed; after so many the run rests for one
/// event or a millisecond, so that a loop of them can be stopped.
constexpr int kRestEvery = 1000;
constexpr std::int64_t kProgressEveryMicros = 100'000;
constexpr double kDaySeconds = 86400;

bool isComment(const std::string& text) { return startsWith(trimmed(text), "#"); }

}  // namespace

Executor::Executor(Forms& forms, const InstrumentLine& line, const PanelRoutines& panel,
                   ResultOutput& results, ComplexMeasurement& complex, const Interlock& interlock)
    : forms_(forms),
      form_(forms.specialMeas),
      panel_(forms.controller),
      line_(line),
      routines_(panel),
      results_(results),
      complex_(complex),
      interlock_(interlock),
      session_(interlock.session()),
      elapsed_(session_.clock) {
    handlers_.on(form_.cmdExecute.Clicked, [this] { cmdExecute_Click(); });
    handlers_.on(form_.cmdNext.Clicked, [this] { cmdNext_Click(); });
    handlers_.on(form_.cmdStop.Clicked, [this] { cmdStop_Click(); });
    handlers_.on(form_.chkStep.Clicked, [this] { chkStep_Click(); });
    handlers_.on(form_.ReleaseWait, [this] { release(); });
    // The end of the program must not find a run that waits.
    handlers_.on(panel_.Unload, [this](int) {
        if (run_ != nullptr) cmdStop_Click();
        release();
    });
}

void Executor::cmdExecute_Click() {
    if (run_ != nullptr && !run_->stopped) return;
    if (interlock_.refuses(Interlock::Rule::NoContinuousView)) return;
    if (line_.exchange.busy()) {
        // A run that was stopped inside of an exchange has to come to its end first.
        if (startPending_) return;
        startPending_ = true;
        session_.events.schedule(kRetryMs, [this] {
            startPending_ = false;
            if (form_.cmdExecute.Enabled) cmdExecute_Click();
        });
        return;
    }
    ScriptRun run;
    run.outer = run_;
    run_ = &run;
    ++form_.RunsActive;
    try {
        begin(run);
        walk(run);
        if (!run.ended) close();
    } catch (const std::exception& failure) {
        fail(failure.what());
    }
    form_.ReachedEnd = !run.ended && !run.stopped;
    finish();
    --form_.RunsActive;
    run_ = run.outer;
}

void Executor::begin(ScriptRun& run) {
    panel_.YVectorVal = 0;
    form_.noSaveAnswered = false;
    form_.ReachedEnd = false;
    form_.nextRequested = false;
    form_.isStepMode = form_.chkStep.Value();
    form_.cmdExecute.Visible = !form_.isStepMode;
    form_.cmdNext.Visible = form_.isStepMode;
    form_.cmdStop.Visible = true;
    form_.cmdStop.Enabled = true;
    forms_.waterfall.clearGraph();
    if (forms_.std.Visible) {
        forms_.std.cmdClear.Click();
        forms_.std.cmdStop.Enabled = true;
    }
    holdPanel();
    line_.mirror.ScriptInProgress = true;
    form_.continueRun = true;
    elapsed_.Reset();
    if (!form_.chkSave.Value()) form_.DataFileNameSpec.clear();
    if (form_.chkSave.Value() && form_.DataFileNameSpec.empty() && !results_.chooseFile()) {
        form_.chkSave.setValue(false);
        panel_.RecordDataFlag = false;
    }
    form_.cmdExecute.Enabled = false;
    form_.lstCommands.ListIndex = form_.lstCommands.Items.get().empty() ? -1 : 0;
    run.lastIndex = static_cast<int>(form_.lstCommands.Items.get().size()) - 1;
}

/// The statement at the index; null beyond the list, which may have changed since the start.
const std::string* Executor::entry(int index) const {
    const std::vector<std::string>& items = form_.lstCommands.Items.get();
    const bool inside = index >= 0 && index < static_cast<int>(items.size());
    return inside ? &items[static_cast<std::size_t>(index)] : nullptr;
}

void Executor::walk(ScriptRun& run) {
    for (; run.lineIndex <= run.lastIndex; ++run.lineIndex) {
        waitForNext(run);
        form_.nextRequested = false;
        if (!run.stopped) {
            showProgress(false);
            pointer(kHourglass);
            carryOut(run);
            if (run.ended) {
                pointer(0);
                return;
            }
            if (!run.stopped) holdPanel();
        }
        followStepBox(true);
        selectCommandLine(run.lineIndex);
        pointer(0);
    }
}

/// One press of the button for each statement; a comment needs none.
void Executor::waitForNext(const ScriptRun& run) {
    if (!form_.isStepMode || run.stopped || run.released) return;
    const std::string* text = entry(run.lineIndex);
    if (text != nullptr && isComment(*text)) return;
    const bool connected = panel_.isConnected;
    showProgress(true);
    form_.WaitsForNext = true;
    while (!form_.nextRequested && !run.released) {
        if (connected && !panel_.isConnected) break;  // the session is over
        session_.events.wait(kStepWaitMs);
    }
    form_.WaitsForNext = false;
}

void Executor::carryOut(ScriptRun& run) {
    const std::string* listed = entry(run.lineIndex);
    if (listed == nullptr) return;
    const std::string text = statementText(*listed);
    const Statement* statement = findStatement(text);
    if (statement == nullptr) return;
    if (!isCommandValid(text)) return resynchronise();
    StatementBegins(run.lineIndex);
    if (run.stopped) return;
    if (statement->needsInstrument && refusedUnconnected(*statement)) {
        run.ended = true;
        return;
    }
    const bool failedBefore = line_.state.ExchangeFailed;
    (this->*statement->routine)({text, argumentOf(*statement, text)});
    // A dead line: nothing more can come of this run.
    const bool failed = line_.state.ExchangeFailed && (statement->needsInstrument || !failedBefore);
    if (failed && !run.stopped) cmdStop_Click();
}

/// The line is brought to where a new exchange can begin.
void Executor::resynchronise() {
    line_.link.WriteToLink("\r");
    line_.reader.ReadAnswer();
}

bool Executor::refusedUnconnected(const Statement& statement) {
    if (panel_.isConnected) return false;
    session_.boxes.show({BoxIcon::Information, "Please connect to the instrument first"});
    pointer(0);
    if (statement.routine == &StatementRoutines::scanStep) return true;
    cmdStop_Click();
    form_.cmdStop.Visible = false;
    return true;
}

/// What follows the list's end.
void Executor::close() {
    form_.cmdExecute.Visible = true;
    form_.cmdNext.Visible = false;
    form_.cmdStop.Visible = false;
    if (forms_.std.Visible) forms_.std.cmdStop.Enabled = false;
    if (form_.chkGetSweep.Value()) panel_.PlaySingleButton.Click();
    form_.cmdExecute.Enabled = true;
}

/// What follows every end of a run, and Stop.
void Executor::finish() {
    setScanning(false);
    line_.mirror.ScriptInProgress = false;
    freePanel();
    showProgress(true);
}

void Executor::fail(const std::string& text) {
    run_->ended = true;
    session_.boxes.show({BoxIcon::Plain, text});
    panel_.MousePointer = kArrow;
}

/// The panel's keys that would disturb a run.
void Executor::holdPanel() {
    if (!line_.mirror.ScriptInProgress) continuousWasEnabled_ = panel_.PlayContinuousButton.Enabled;
    panel_.PlayContinuousButton.Enabled = false;
    panel_.RecordData.Enabled = false;
    form_.cmdOpenCommandsFile.Enabled = false;
    form_.cmdEdit.Enabled = false;
    form_.cmdNew.Enabled = false;
    form_.cmdRehearse.Enabled = false;
    form_.cmboSpecialMeasList.Enabled = false;
    forms_.waterfall.VewClear.Enabled = false;
}

void Executor::freePanel() {
    panel_.PlayContinuousButton.Enabled = continuousWasEnabled_;
    panel_.RecordData.Enabled = panel_.isConnected;
    form_.cmdOpenCommandsFile.Enabled = true;
    form_.cmdEdit.Enabled = !form_.CurrScriptFile.empty();
    form_.cmdNew.Enabled = true;
    form_.cmdRehearse.Enabled = !form_.lstCommands.Items.get().empty();
    form_.cmboSpecialMeasList.Enabled = true;
    forms_.waterfall.VewClear.Enabled = true;
}

void Executor::cmdNext_Click() {
    if (form_.isStepMode) form_.nextRequested = true;
    followStepBox(true);
}

void Executor::cmdStop_Click() {
    for (ScriptRun* run = run_; run != nullptr; run = run->outer) run->stopped = true;
    form_.continueRun = false;
    form_.cmdExecute.Visible = true;
    form_.cmdExecute.Enabled = true;
    form_.cmdNext.Visible = false;
    form_.nextRequested = false;
    if (forms_.std.Visible) {
        forms_.std.cmdStop.Enabled = false;
        forms_.std.cmdExecute.Enabled = true;
    }
    finish();
}

void Executor::chkStep_Click() { form_.isStepMode = form_.chkStep.Value(); }

void Executor::release() {
    for (ScriptRun* run = run_; run != nullptr; run = run->outer) run->released = true;
}

void Executor::followStepBox(bool releases) {
    form_.isStepMode = form_.chkStep.Value();
    form_.cmdExecute.Visible = !form_.isStepMode;
    form_.cmdNext.Visible = form_.isStepMode;
    if (!form_.isStepMode && releases) form_.nextRequested = true;
}

void Executor::selectCommandLine(int index) {
    const int count = static_cast<int>(form_.lstCommands.Items.get().size());
    if (index < count - 1) form_.lstCommands.ListIndex = std::max(index + 1, 0);
}

void Executor::turn() {
    session_.events.pump();
    if (++statementsSinceWait_ < kRestEvery) return;
    statementsSinceWait_ = 0;
    session_.events.wait(1);
}

void Executor::pointer(int shape) {
    panel_.MousePointer = shape;
    turn();
}

/// "Line 12 of 40, pass 3, 00:01:05"; not at every statement of a fast run.
void Executor::showProgress(bool now) {
    const std::int64_t micros = session_.clock.micros();
    if (!now && micros - progressShown_ < kProgressEveryMicros) return;
    progressShown_ = micros;
    if (run_ == nullptr) return;
    const std::string time = timeOfDayText(elapsed_.Elapsed() / 1000 / kDaySeconds);
    if (!line_.mirror.ScriptInProgress) {
        form_.lblProgress.Caption =
            (run_->stopped || run_->ended ? "Stopped after " : "Finished after ") + time;
        return;
    }
    std::string text = "Line " + std::to_string(run_->lineIndex + 1) + " of " +
                       std::to_string(run_->lastIndex + 1);
    if (run_->loopCounter > 0) text += ", pass " + std::to_string(run_->loopCounter);
    form_.lblProgress.Caption = text + ", " + time;
}

}  // namespace zel
