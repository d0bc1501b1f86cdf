#pragma once
// Turns the raw samples of a sweep into what the graph draws and what a file keeps.

#include <cstddef>
#include <vector>

#include "forms/ControllerForm.h"
#include "platform/Graph3D.h"
#include "trace/Sweep.h"
#include "trace/VerticalScale.h"

namespace zel {

/// Works in the unit, range and level that the sweep was read with. A sample that did not come
/// stays none.
class TraceConversion {
  public:
    TraceConversion(ControllerForm& panel, const Graph3D& graph3D)
        : panel_(panel), graph3D_(graph3D) {}

    /// Divisor from raw sample to unit: thousandths of a dB, microvolts or nanowatts.
    static void SelectRawScale(Sweep& sweep);
    /// Fills `physical`, `shown` and `colours` from `raw`.
    void ConvertTrace(Sweep& sweep);
    /// Of the auto peak detector; values in volts are rounded to `decimals`.
    void CalculateDataAutoPeak(Sweep& sweep, int decimals);
    /// Of any other detector; keeps the extremes of the shown values.
    void CalculateDataNotAutoPeak(Sweep& sweep, int decimals);
    /// Colours of the values that the graph shows, by the range of the waterfall's axis 3.
    std::vector<double> colour(const std::vector<double>& shown) const;

  private:
    void extend(std::size_t index, double shown);

    ControllerForm& panel_;  ///< holds the extremes, which run over many traces
    const Graph3D& graph3D_;
};

/// The scale that a sweep was read with.
VerticalScale verticalScale(const Sweep& sweep);

}  // namespace zel
