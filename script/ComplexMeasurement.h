#pragma once
// The statement of the complex traces: takes them, reduces each, shows and writes the result.

#include <cstddef>
#include <vector>

#include "forms/Forms.h"
#include "forms/ScriptForms.h"
#include "script/PhaseDisplay.h"
#include "script/ResultOutput.h"
#include "script/ScriptParts.h"

namespace zel {

class ComplexMeasurement {
  public:
    ComplexMeasurement(Forms& forms, const InstrumentLine& line, ResultOutput& results,
                       PhaseDisplay& display)
        : form_(forms.specialMeas),
          statistics_(forms.std),
          line_(line),
          results_(results),
          display_(display) {}

    /// One measurement of `CTraceAverageCount` traces. It ends early when the run is stopped or
    /// the line fails. Throws `ScriptFailure` for a count of 0, after the one trace that it
    /// takes.
    void measure();
    /// Reduces the samples, which it scales in place, and writes what comes out: dBm, rad, dB, and
    /// the deviation of the phase in the selected unit.
    void measureCTrace(std::vector<double>& data, double& meanLevel, double& meanPhase,
                       double& stdLevel, double& stdPhase);

  private:
    struct Result {
        double meanLevel = 0;
        double meanPhase = 0;
        double stdLevel = 0;
        double stdPhase = 0;
    };
    bool takeTrace(bool first, std::size_t element, Result& result);

    SpecialMeasForm& form_;
    STDForm& statistics_;
    InstrumentLine line_;
    ResultOutput& results_;
    PhaseDisplay& display_;
};

}  // namespace zel
