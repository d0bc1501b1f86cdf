#include "trace/SweepControl.h"

#include <cstdint>
#include <string>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "link/CommandExchange.h"
#include "link/WaitNotice.h"
#include "platform/Graph3D.h"
#include "platform/MessageBox.h"
#include "platform/ModalForm.h"
#include "platform/Pointer.h"
#include "platform/Session.h"
#include "trace/PowerReadout.h"
#include "trace/TraceReader.h"

namespace zel {
namespace {

using CF = ControllerForm;

constexpr int kPowerBox = 0;
constexpr const char* kLost = "connection lost";
constexpr int kStopGraceMs = 1000;  // for the answer of a sweep that is about to end
constexpr std::int32_t kLastRow = 2147483647;

/// Says that an acquisition is under way for as long as it lives.
class Running {
  public:
    explicit Running(ControllerForm& panel) : panel_(panel), before_(panel.AcquisitionRunning) {
        panel_.AcquisitionRunning = true;
    }
    ~Running() { panel_.AcquisitionRunning = before_; }
    Running(const Running&) = delete;
    Running& operator=(const Running&) = delete;

  private:
    ControllerForm& panel_;
    bool before_;
};

}  // namespace

SweepControl::SweepControl(Forms& forms, CommandExchange& exchange, TraceReader& traces,
                           PowerReadout& power, const Session& session)
    : forms_(forms),
      panel_(forms.controller),
      exchange_(exchange),
      traces_(traces),
      power_(power),
      events_(session.events),
      boxes_(session.boxes) {
    handlers_.on(panel_.PlaySingleButton.Clicked, [this] { PlaySingleButton_Click(); });
    handlers_.on(panel_.PlayContinuousButton.Clicked, [this] { PlayContinuousButton_Click(); });
    handlers_.on(panel_.StopButton.Clicked, [this] { StopButton_Click(); });
}

SweepControl::Pass SweepControl::passKind() const {
    if (panel_.State == CF::POWER || panel_.InstrumentMode == CF::POWERSENSOR)
        return Pass::PowerSensor;
    return panel_.State == CF::TDMA ? Pass::TDMAPower : Pass::Trace;
}

void SweepControl::PlaySingleButton_Click() {
    const Running running(panel_);
    if (!panel_.ContinuosLoopActive && panel_.State != CF::POWER &&
        panel_.InstrumentMode != CF::POWERSENSOR) {
        if (!forms_.time.ContinuousRecording && !forms_.specialMeas.chkWaterfall.Value())
            panel_.YVectorVal = 0;
        bool success = false;
        traces_.ReadSingleTrace(success);
        return;
    }
    const bool good = power_.readPowerSensor(kPowerBox);
    if (good && panel_.RecordDataFlag && !panel_.isSpecMeas) panel_.SaveView("power");
}

void SweepControl::PlayContinuousButton_Click() {
    panel_.RecordData.Visible = false;
    if (passKind() == Pass::PowerSensor) showModalForm(forms_.powerAndRefl, events_);
    RunContinuousView();
}

void SweepControl::RunContinuousView() {
    const Running running(panel_);
    if (!panel_.isConnected) {
        boxes_.show({BoxIcon::Information, "Please connect to the intrument first."});
        panel_.RecordData.Visible = true;
        panel_.ContinuosLoopActive = false;
        return;
    }
    panel_.Connection.Enabled = false;
    panel_.Utility.Enabled = false;
    panel_.PlayContinuousButton.Visible = false;
    panel_.StopButton.Visible = true;
    SetStopFlag(true);
    panel_.ContinuosLoopActive = true;
    // Rows of an earlier view stay, this one goes on after the last of them.
    const GraphCurve3D* last = forms_.waterfall.Graph3D.lastRow();
    if (last != nullptr && last->depth.front() >= panel_.YVectorVal) countRow();
    showLinkLost(panel_, false);
    bool good = firstPass();
    while (good && panel_.STOPFlag) {
        forms_.waterfall.styleLastRow();
        if (exchange_.ExchangeFailed()) return showLoss();  // no clean-up: Stop is the way back
        panel_.ContinuosLoopActive = true;
        exchange_.giveTurn();
        if (!panel_.STOPFlag) break;
        good = laterPass();
        if (good) panel_.ContinuosLoopActive = false;
    }
    if (!good && exchange_.ExchangeFailed()) showLoss();
    if (!panel_.STOPFlag) {  // also where Stop has left a wait
        panel_.Connection.Enabled = true;
        panel_.Utility.Enabled = true;
        forms_.waterfall.styleLastRow();
    }
    panel_.RecordData.Visible = true;
    panel_.ContinuosLoopActive = false;
}

bool SweepControl::powerPass(Pass kind) {
    const bool good = power_.ReadPowerReadings(
        kind == Pass::PowerSensor ? "PowerSensor" : "TDMAPower", kPowerBox);
    // A failed link is seen between the passes.
    return good || exchange_.ExchangeFailed();
}

bool SweepControl::firstPass() {
    const Pass kind = passKind();
    if (kind != Pass::Trace) return powerPass(kind);
    bool success = false;
    if (panel_.SingleSweepModeActive) {
        traces_.ReadSingleTrace2({true, true, true, true, true}, success);
    } else {
        traces_.ReadSingleTrace(success);
    }
    return success;
}

bool SweepControl::laterPass() {
    const Pass kind = passKind();
    if (kind != Pass::Trace) return powerPass(kind);
    nextRow();
    bool success = false;
    traces_.ReadSingleTrace2({}, success);
    return success;
}

void SweepControl::nextRow() {
    if (!forms_.waterfall.Graph3D.plots().empty())
        forms_.waterfall.Graph3D.plots().back().lineVisible = false;
    countRow();
}

void SweepControl::countRow() {
    if (panel_.YVectorVal < kLastRow) ++panel_.YVectorVal;
}

void SweepControl::showLoss() {
    showLinkLost(panel_, true);
    panel_.TimeLabel.Caption = std::string(kLost) + " " + panel_.TimeLabel.Caption.get();
}

void SweepControl::StopButton_Click() {
    exchange_.leaveWait(kStopGraceMs);
    SetStopFlag(false);
    // After a dead line no loop is left to enable them.
    panel_.Connection.Enabled = true;
    panel_.Utility.Enabled = true;
    panel_.ContinuosLoopActive = false;
    if (panel_.State == CF::POWER) forms_.powerAndRefl.unload(1);
    panel_.StopButton.Visible = false;
    panel_.RecordData.Checked = false;
    panel_.PlayContinuousButton.Visible = true;
    panel_.PlayContinuousButton.Enabled = true;
    panel_.RecordDataFlag = false;
    panel_.RecordData.Visible = true;
    panel_.MousePointer = kArrow;
    events_.pump();
}

}  // namespace zel
