#pragma once
// The three play keys: one sweep, sweep after sweep, stop.

#include "forms/Forms.h"
#include "link/CommandExchange.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "platform/MessageBox.h"
#include "platform/Session.h"
#include "trace/PowerReadout.h"
#include "trace/TraceReader.h"

namespace zel {

class SweepControl {
  public:
    /// Connects the keys.
    SweepControl(Forms& forms, CommandExchange& exchange, TraceReader& traces, PowerReadout& power,
                 const Session& session);

    void PlaySingleButton_Click();
    void PlayContinuousButton_Click();
    void StopButton_Click();
    /// Sweep after sweep until `STOPFlag` is cleared or a pass fails; the sweep and the transfer
    /// set the pace.
    void RunContinuousView();
    /// The newest plot of the waterfall is done, and the next trace has a row of its own.
    void nextRow();
    void countRow();
    TraceReader& traces() { return traces_; }
    void SetStopFlag(bool value) { panel_.STOPFlag = value; }

  private:
    enum class Pass { Trace, PowerSensor, TDMAPower };
    Pass passKind() const;
    bool powerPass(Pass kind);
    bool firstPass();
    bool laterPass();
    void showLoss();

    Forms& forms_;
    ControllerForm& panel_;
    CommandExchange& exchange_;
    TraceReader& traces_;
    PowerReadout& power_;
    Events& events_;
    MessageBoxes& boxes_;
    Handlers handlers_;
};

}  // namespace zel
