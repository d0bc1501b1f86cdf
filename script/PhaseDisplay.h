#pragma once
// The window of the complex measurements: the figures of the newest one, the rows of all, the unit.

#include "forms/ScriptForms.h"
#include "platform/Event.h"
#include "platform/Events.h"

namespace zel {

class PhaseDisplay {
  public:
    /// Connects the window's buttons and options; the run's own buttons are clicked.
    PhaseDisplay(STDForm& form, SpecialMeasForm& script, Events& events);

    /// Shows one measurement: dBm, dB, radians, and the deviation in the selected unit. The first
    /// one is the reference of all that follow.
    void displayPhaseMeasurement(double level, double stdLevel, double phase, double stdPhase);

    void cmdExecute_Click();
    void cmdStop_Click();
    void cmdClear_Click();
    void optDegrees_Click();
    void optRadians_Click();

  private:
    void convert(double factor, double divisor, const char* format);

    STDForm& form_;
    SpecialMeasForm& script_;
    Events& events_;
    Handlers handlers_;
};

}  // namespace zel
