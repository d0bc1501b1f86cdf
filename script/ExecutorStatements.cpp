// The statements of a run that steer it, write results and talk to the instrument.

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <limits>
#include <string>

#include "model/Numeric.h"
#include "platform/MessageBox.h"
#include "script/Executor.h"
#include "script/Language.h"
#include "script/ScriptFailure.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr const char* kLoopToken = " I ";
constexpr double kLongestPauseMs = 3.6e6;  // of one wait; a pause has as many as it needs

/// Points become commas first, so that "1.234,5" counts as 1.234.
double commaNumber(const std::string& text) {
    return ParseNumberInvariant(replaceAll(text, ".", ","));
}

}  // namespace

// Exchanges, with word of what the instrument refuses.

bool Executor::cmd(const std::string& keyword) {
    const bool done = line_.exchange.CmdInstrument(keyword);
    if (!done && !line_.state.ExchangeFailed) Refused(keyword);
    return done;
}

bool Executor::set(const std::string& keywordAndValue) {
    const bool done = line_.exchange.SetInstrument(keywordAndValue);
    if (!done && !line_.state.ExchangeFailed) Refused(keywordAndValue);
    return done;
}

bool Executor::get(const std::string& keyword, std::string& answer) {
    answer.clear();
    const bool done = line_.exchange.GetInstrument(keyword, answer);
    if (!done && !line_.state.ExchangeFailed) Refused(keyword);
    return done;
}

// Statements.

void Executor::comment(const Line&) {}  // step mode passes over it by itself

void Executor::noSave(const Line&) {
    panel_.RecordDataFlag = false;
    form_.noSaveAnswered = true;
    form_.DataFileNameSpec.clear();
}

void Executor::saveResults(const Line& line) {
    form_.chkSave.setValue(true);
    panel_.RecordDataFlag = false;
    form_.noSaveAnswered = true;
    form_.DataFileNameSpec = trimmed(line.argument);
    form_.DataFileNameTyped = false;
    form_.fileNameIsIndexed = contains(form_.DataFileNameSpec, "*");
    panel_.CommonDialog1FileName = form_.DataFileNameSpec;
}

void Executor::stepMode(const Line&) {
    form_.chkStep.setValue(true);
    form_.isStepMode = true;
    form_.cmdNext.Visible = true;
    form_.cmdExecute.Visible = false;
}

void Executor::command(const Line& line) { cmd(trimmed(line.argument)); }

void Executor::setting(const Line& line) {
    const std::string text = trimmed(line.argument);
    const auto comma = text.find(',');
    const std::size_t kept = comma == std::string::npos ? 0 : comma + 1;
    // Without a comma there is nothing to replace either.
    set(text.substr(0, kept) + replaceAll(text.substr(kept), ",", "."));
}

void Executor::query(const Line& line) {
    const std::string* listed = entry(run_->lineIndex);
    std::string name = listed != nullptr ? *listed : line.text;
    std::string answer;
    if (!get(trimmed(line.argument), answer)) return;
    results_.saveValue(name, replaceAll(answer, ",", ";"));
}

void Executor::complexTrace(const Line&) { complex_.measure(); }

void Executor::showDialog(const Line& line) {
    const std::string text = trimmed(replaceAll(trimmed(line.argument), "CRLF", kCrLf));
    session_.boxes.show({BoxIcon::Plain, text});
}

void Executor::waterfallOn(const Line&) {
    form_.chkWaterfall.setValue(true);
    forms_.waterfall.Show();
}

void Executor::waterfallOff(const Line&) {
    form_.chkWaterfall.setValue(false);
    forms_.waterfall.Hide();
}

void Executor::autoRecall(const Line& line) {
    if (!form_.insideLoop) {
        session_.boxes.show(
            {BoxIcon::Plain,
             "The filenames can only be genarated automatically within a loop.\r\n"
             "The last character of your file name will then be replaced with the current index\r\n"
             "Otherwise it is obsolete",
             "Erroneous usage of a statement"});
        return;
    }
    cmd("recall," + trimmed(line.argument) + "." + formatPattern(run_->loopCounter, "000"));
}

void Executor::writeComment(const Line& line) {
    if (!contains(line.argument, kLoopToken)) {
        results_.saveValue("comment", trimmed(line.argument));
        return;
    }
    // The blanks of the token go with it, so its neighbours join.
    const std::string text = trimmed(replaceAll(line.argument, kLoopToken, ""));
    results_.saveValue("loopcount", trimmed(numberText(run_->loopCounter) + "; " + text));
}

void Executor::pause(const Line& line) {
    const double seconds = commaNumber(line.argument);
    if (seconds == 0) {
        session_.boxes.show({BoxIcon::Information, "Press OK to continue"});
        return;
    }
    const std::int64_t start = session_.clock.micros();
    const ScriptRun& run = *run_;
    for (;;) {
        showProgress(false);
        const double passed = static_cast<double>(session_.clock.micros() - start) / 1000;
        const double left = seconds * 1000 - passed;
        if (left < 0 || run.stopped) return;
        // Wakes for every event, a press of Stop among them.
        session_.events.wait(static_cast<int>(std::clamp(std::ceil(left), 1.0, kLongestPauseMs)));
    }
}

void Executor::beginLoop(const Line&) {
    if (run_->loopCounter == std::numeric_limits<std::int16_t>::max())
        throw ScriptFailure(kOverflow);
    form_.insideLoop = true;
    run_->loopStartIndex = run_->lineIndex;
    ++run_->loopCounter;
}

/// False when a watcher wants the run to go on instead.
bool Executor::goBack(int index) {
    bool stay = false;
    GoesBack(*run_, stay);
    if (stay) return false;
    run_->lineIndex = index;
    selectCommandLine(index);
    return true;
}

void Executor::endLoop(const Line& line) {
    const int passes = wholeNumber(ParseNumberInvariant(line.argument));
    if (passes < 0) {
        goBack(run_->loopStartIndex);
    } else if (run_->loopCounter >= passes) {
        form_.insideLoop = false;
        run_->loopCounter = 0;
        form_.fileNameIsIndexed = false;
    } else if (goBack(run_->loopStartIndex)) {
        ++run_->loopCounter;
    }
}

void Executor::upperLimit(const Line& line) {
    run_->upperLimit = ParseNumberInvariant(line.argument);
    run_->upperLimitArmed = true;
}

void Executor::lowerLimit(const Line& line) {
    run_->lowerLimit = ParseNumberInvariant(line.argument);
    run_->lowerLimitArmed = true;
}

void Executor::averageCount(const Line& line) {
    line_.mirror.CTraceAverageCount = wholeNumber(ParseNumberInvariant(line.argument));
}

void Executor::setScanning(bool scanning) {
    line_.mirror.ScanInProgress = scanning;
    line_.state.ScanInProgress = scanning;  // the line's own, which keeps its error boxes back
}

void Executor::scanStart(const Line& line) {
    run_->scanFrequency = ParseNumberInvariant(line.argument);
    set("FREQ," + numberText(run_->scanFrequency));
    line_.mirror.CenterFrequency = run_->scanFrequency;
}

void Executor::scanStep(const Line& line) {
    run_->scanStep = ParseNumberInvariant(line.argument);
    run_->scanReturnIndex = run_->lineIndex;
    std::string answer;
    if (!get("FREQ", answer)) return;
    run_->scanFrequency = leadingNumber(answer);
    line_.mirror.CenterFrequency = run_->scanFrequency;
}

void Executor::scanStop(const Line& line) {
    constexpr int kSettlingMs = 50;
    const double frequency = line_.mirror.CenterFrequency;
    setScanning(true);
    session_.events.sleep(kSettlingMs);
    std::string answer;
    if (get("LEVEL", answer)) {
        const double level = leadingNumber(answer);
        const auto save = [&] {
            std::string name = numberText(frequency);
            results_.saveValue(name, answer);
        };
        if (run_->upperLimitArmed && level > run_->upperLimit) save();
        if (run_->lowerLimitArmed && level < run_->lowerLimit) save();
    }
    if (line_.state.ExchangeFailed || run_->stopped) return;
    const double stop = ParseNumberInvariant(line.argument);
    const double next = frequency + run_->scanStep;
    if (next <= stop && goBack(run_->scanReturnIndex)) {
        set("FREQ," + numberText(next));
        line_.mirror.CenterFrequency = next;
        return;
    }
    setScanning(false);
    run_->upperLimitArmed = false;
    run_->lowerLimitArmed = false;
}

}  // namespace zel
