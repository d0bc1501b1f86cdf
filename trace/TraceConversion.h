#pragma once
// Turns the raw samples of a sweep into what the graph draws and what a file keeps.

#include <vector>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "model/ZEL3Variables.h"

namespace zel {

/// Reads and writes the trace arrays of the panel, in the unit, range and level of the mirror.
class TraceConversion {
  public:
    TraceConversion(ControllerForm& panel, const ZEL3Variables& mirror, const Graph3D& graph3D)
        : panel_(panel), mirror_(mirror), graph3D_(graph3D) {}

    /// Divisor from raw sample to unit: thousandths of a dB, microvolts or nanowatts.
    void SelectRawScale();
    void ConvertTrace();
    /// `PeakTraceData` of the auto peak detector; values in volts are rounded to `decimals`.
    void CalculateDataAutoPeak(int decimals);
    /// `TraceData` of any other detector.
    void CalculateDataNotAutoPeak(int decimals);
    /// Lowers the value itself to the reference level, and returns it.
    double ClipToReferenceLevel(double& value) const;
    /// Lifts a value to the bottom of the display, ten divisions below the top. With
    /// `useRangeCode` the range is a code, without it dB a division.
    double ClipToBottom(double value, bool useRangeCode) const;
    /// `TraceColours` of the values that the graph shows, by the range of the waterfall's axis 3.
    void colour(const std::vector<double>& shown) const;

  private:
    bool isLogarithmicUnit() const;
    double linearDisplayValue(double value, bool clearOtherUnits) const;

    ControllerForm& panel_;
    const ZEL3Variables& mirror_;
    const Graph3D& graph3D_;
};

}  // namespace zel
