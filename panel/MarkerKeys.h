#pragma once
// The marker keys and check boxes.

#include "forms/ControllerForm.h"
#include "link/CommandExchange.h"
#include "model/ZEL3Variables.h"
#include "panel/MarkerReadout.h"
#include "platform/Controls.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "platform/MessageBox.h"
#include "trace/Interlock.h"
#include "trace/TraceReader.h"

namespace zel {

class MarkerKeys {
  public:
    /// Connects keys and check boxes.
    MarkerKeys(ControllerForm& panel, ZEL3Variables& mirror, CommandExchange& exchange,
               MarkerReadout& readout, TraceReader& traces, const Interlock& interlock);

    /// A peak key by its command: MARKPK, MARKNXTPK, MARKMIN.
    void peak(const char* word);
    void MarkToCentButton_Click();
    void MarkToRefButton_Click();
    void MarkerCheckBox_Click();
    void DeltaCheckBox_Click();

  private:
    void paint(const char* command);
    bool command(const char* word);
    bool checkRefused(CheckBox& box);
    void markerOff();
    void deltaOff();

    ControllerForm& panel_;
    ZEL3Variables& mirror_;
    CommandExchange& exchange_;
    MarkerReadout& readout_;
    TraceReader& traces_;
    const Interlock& interlock_;
    Events& events_;
    MessageBoxes& boxes_;
    Handlers handlers_;
};

}  // namespace zel
