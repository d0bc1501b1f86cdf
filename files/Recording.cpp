#include "files/Recording.h"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <filesystem>
#include <limits>
#include <string>

#include "files/OutputFile.h"
#include "files/ViewFormat.h"
#include "files/ViewWriter.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "link/InstrumentLink.h"
#include "link/ZELBas.h"
#include "model/CodeTables.h"
#include "model/ZEL3Variables.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "platform/Session.h"
#include "support/AtEnd.h"
#include "support/FileText.h"
#include "support/NumberText.h"
#include "support/TimeText.h"
#include "trace/Sweep.h"
#include "trace/SweepControl.h"

namespace zel {
namespace {

using CF = ControllerForm;

constexpr int kResyncMs = 300;
constexpr int kRetryMs = 10;
constexpr double kDaySeconds = 86400;

template <class Whole>
Whole wholeNumber(double value) {
    constexpr double kMost = std::numeric_limits<Whole>::max();
    return static_cast<Whole>(std::clamp(std::nearbyint(value), 0.0, kMost));
}

}  // namespace

Recording::Recording(Forms& forms, ZEL3Variables& mirror, const InstrumentLink& link,
                     SweepControl& sweeps, ViewWriter& writer, const Session& session)
    : forms_(forms),
      panel_(forms.controller),
      dialog_(forms.time),
      mirror_(mirror),
      link_(link),
      exchange_(link.exchange),
      sweeps_(sweeps),
      writer_(writer),
      session_(session),
      running_(session.clock) {
    handlers_.on(panel_.RecordData.Clicked, [this] { RecordData_Click(); });
    handlers_.on(dialog_.Load, [this] { loadForm(); });
    handlers_.on(dialog_.SubmitTimeButton.Clicked, [this] { SubmitTimeButton_Click(); });
    handlers_.on(dialog_.CancelTimeButton.Clicked, [this] { dialog_.unload(1); });
    handlers_.on(dialog_.X.Tick, [this] { X_Timer(); });
    handlers_.on(panel_.UpNow.Tick, [this] { showProgress(); });
    // Stop need not wait for the next tick, which may be hours away.
    handlers_.on(panel_.StopButton.Clicked, [this] {
        if (dialog_.X.Enabled && !inTick_) windUp();
    });
}

void Recording::ReadTriggerSource() {
    if (panel_.InstrumentMode == CF::POWERSENSOR) return;
    std::string answer;
    if (exchange_.GetInstrument("TRIGSRC", answer))
        mirror_.TriggerSource =
            static_cast<std::int16_t>(std::clamp(leadingNumber(answer), -1.0, 32767.0));
    mirror_.ExternalTriggerActive =
        mirror_.TriggerSource == TRIGEXTRISE || mirror_.TriggerSource == TRIGEXTFALL;
}

void Recording::RecordData_Click() {
    ReadTriggerSource();
    if (!panel_.RecordData.Checked) {
        loadForm();
        dialog_.Show();
        return;
    }
    panel_.RecordDataFlag = false;
    panel_.RecordData.Checked = false;
}

void Recording::loadForm() {
    dialog_.lblRecText.Caption =
        mirror_.ExternalTriggerActive ? "Timeout (ExtTrigger): " : "Record data every";
    dialog_.RecordedCount = 0;
}

void Recording::abandon() {
    panel_.RecordData.Checked = false;
    panel_.RecordDataFlag = false;
    dialog_.Hide();
}

bool Recording::chooseFile() {
    panel_.DataFileName = writer_.files().ShowSaveDataDialog(FileOps::kCsvFilter);
    if (panel_.DataFileName.empty()) return false;
    // Emptied once; each trace is then appended to it.
    OutputFile file(writer_.files().service(), panel_.DataFileName, OutputFile::Mode::Output);
    const std::string problem = file.close();
    if (!problem.empty()) {
        session_.boxes.show({BoxIcon::Critical, problem});
        return false;
    }
    const std::string warning = oldLogWarning(panel_.DataFileName);
    if (!warning.empty()) session_.boxes.show({BoxIcon::Exclamation, warning});
    return true;
}

void Recording::SubmitTimeButton_Click() {
    if (panel_.RecordData.Checked) return;
    const double entered = leadingNumber(dialog_.TimeIntervalBox.Text.get());
    panel_.RecordTimeValue = entered;
    panel_.RecordData.Checked = true;
    panel_.RecordDataFlag = true;
    if (!chooseFile()) {
        abandon();
        return;
    }
    writer_.RecordingFileName = panel_.DataFileName;
    panel_.PlayContinuousButton.Visible = false;
    panel_.StopButton.Visible = true;
    dialog_.Hide();
    clearCounts();
    running_.Reset();
    lastTick_ = session_.clock.micros();
    if (mirror_.ExternalTriggerActive) {
        RecordExtTrigger(wholeNumber<std::int16_t>(entered));
        return;
    }
    dialog_.X.Enabled = false;
    dialog_.X.Interval = wholeNumber<int>(entered * 1000);
    dialog_.X.Enabled = true;
    panel_.PlayContinuousButton.Enabled = false;
    showProgress();
}

void Recording::windUp() {
    dialog_.ContinuousRecording = false;
    panel_.PlayContinuousButton.Enabled = true;
    dialog_.X.Enabled = false;
    dialog_.RecordedCount = 0;
    writer_.RecordingFileName.clear();
    panel_.FileLabel.Caption = "";
}

void Recording::clearCounts() {
    dialog_.RecordedCount = dialog_.TickCount = 0;
    dialog_.IncompleteCount = dialog_.FailedCount = 0;
}

bool Recording::countTrace() {
    const Sweep& sweep = sweeps_.traces().lastSweep();
    ++dialog_.TickCount;
    if (sweep.whole())
        ++dialog_.RecordedCount;
    else if (sweep.incomplete())
        ++dialog_.IncompleteCount;
    else
        ++dialog_.FailedCount;
    return sweep.whole();
}

bool Recording::takeTrace() {
    const bool power = panel_.State == CF::POWER || panel_.InstrumentMode == CF::POWERSENSOR;
    if (dialog_.RecordedCount == 0 || power) {
        sweeps_.PlaySingleButton_Click();
    } else {
        sweeps_.nextRow();
        bool success{};
        sweeps_.traces().ReadSingleTrace2({}, success);
    }
    if (!power) return countTrace();
    ++dialog_.TickCount;
    ++dialog_.RecordedCount;
    return true;
}

void Recording::X_Timer() {
    if (exchange_.busy()) {
        // The line is in the middle of a dialogue that lets events run: this tick comes after it.
        session_.events.schedule(kRetryMs, [this] {
            if (dialog_.X.Enabled && !inTick_) X_Timer();
        });
        return;
    }
    lastTick_ = session_.clock.micros();
    dialog_.ContinuousRecording = true;
    if (!panel_.RecordData.Checked) {
        windUp();
        return;
    }
    bool taken = true;
    {
        inTick_ = true;
        const AtEnd over([this] {
            inTick_ = false;
            panel_.MousePointer = kArrow;
        });
        // What a user does meanwhile waits for the end of the cycle.
        const DialogueScope cycle = exchange_.hold();
        showPointer(panel_, session_.events, kHourglass);
        if (!mirror_.ExternalTriggerActive) {
            exchange_.forgetFailure();
            taken = takeTrace();
        }
    }
    dialog_.Ticked();
    if (!panel_.RecordData.Checked) {
        windUp();
        return;
    }
    if (taken) session_.events.pump();
    showProgress();
}

void Recording::resynchronise() {
    link_.state.BareCrFirst = false;  // it is done here
    session_.events.sleep(kResyncMs);
    link_.bytes.WriteToLink("\r");
    link_.reader.ReadAnswer();
    session_.events.sleep(kResyncMs);
    session_.events.pump();
    link_.bytes.WriteToLink("\r");
    link_.reader.ReadAnswer();
}

void Recording::RecordExtTrigger(std::int32_t timeout) {
    dialog_.ContinuousRecording = true;
    bool good = true;
    panel_.STOPFlag = true;
    session_.events.pump();
    for (bool recording = true; recording;) {
        showPointer(panel_, session_.events, kHourglass);
        if (!good) {
            resynchronise();
            if (panel_.isSpecMeas) {
                forms_.specialMeas.cmdStop.Click();
            } else {
                panel_.StopButton.Click();
                dialog_.ContinuousRecording = false;
            }
        } else {
            if (panel_.isSpecMeas) exchange_.CmdInstrument("INIT");
            good = exchange_.CmdInstrumentTriggered("WAIT", timeout);
            if (good) {
                const bool again = dialog_.RecordedCount != 0 && panel_.State != CF::POWER;
                bool success = true;
                if (again) {
                    sweeps_.traces().ReadSingleTrace2({}, success);
                } else {
                    sweeps_.PlaySingleButton_Click();
                }
                countTrace();
                dialog_.Ticked();
                if (!success) {
                    panel_.MousePointer = kArrow;
                    break;
                }
                showProgress();
            } else if (panel_.isSpecMeas) {
                forms_.specialMeas.cmdStop.Click();
                resynchronise();
            }
        }
        exchange_.giveTurn();
        if (!panel_.STOPFlag || panel_.isSpecMeas) {
            dialog_.ContinuousRecording = false;
            showPointer(panel_, session_.events, kArrow);
            recording = false;
        }
    }
    if (panel_.isSpecMeas) return;
    // A trace that failed leaves the loop as well: the panel goes back to what it was.
    if (panel_.RecordData.Checked) panel_.StopButton.Click();
    windUp();
}

/// "2 incomplete, 1 failed, "; empty while every attempt brought a whole trace.
std::string Recording::missedText() const {
    std::string text;
    if (dialog_.IncompleteCount > 0)
        text += generalNumber(dialog_.IncompleteCount) + " incomplete, ";
    if (dialog_.FailedCount > 0) text += generalNumber(dialog_.FailedCount) + " failed, ";
    return text;
}

std::string Recording::progressText() const {
    if (writer_.RecordingFileName.empty() || !panel_.RecordData.Checked) return {};
    const std::uint64_t bytes = writer_.files().service().stat(writer_.RecordingFileName).size;
    const double count = dialog_.RecordedCount;
    std::string text = std::filesystem::path(writer_.RecordingFileName).filename().string() + ": " +
                       generalNumber(count) + (count == 1 ? " trace, " : " traces, ") +
                       missedText() + sizeText(bytes) + ", " +
                       timeOfDayText(std::nearbyint(running_.Elapsed() / 1000.0) / kDaySeconds);
    if (mirror_.ExternalTriggerActive) return text + ", waits for the trigger";
    if (dialog_.X.Interval == 0) return text + ", the interval of 0 s takes no trace";
    const double left = dialog_.X.Interval / 1000.0 -
                        static_cast<double>(session_.clock.micros() - lastTick_) / 1e6;
    return text + ", next in " + generalNumber(std::max(0.0, std::nearbyint(left))) + " s";
}

void Recording::showProgress() {
    const std::string text = progressText();
    if (!text.empty()) panel_.FileLabel.Caption = text;
}

}  // namespace zel
