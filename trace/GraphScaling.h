#pragma once
// Which range and format the axes take, and how a trace comes onto the graphs.

#include <string>

#include "forms/ControllerForm.h"
#include "forms/WaterfallForm.h"
#include "model/LevelRange.h"
#include "model/ZEL3Variables.h"
#include "platform/Clock.h"
#include "trace/Sweep.h"

namespace zel {

/// Unit of the x axis: "m" in distance to fault, else "s" at zero span, else "Hz".
std::string GetDimension(const ControllerForm& panel, const ZEL3Variables& mirror);

class GraphScaling {
  public:
    GraphScaling(ControllerForm& panel, WaterfallForm& waterfall, ZEL3Variables& mirror,
                 const Clock& clock)
        : panel_(panel), waterfall_(waterfall), mirror_(mirror), clock_(clock) {}

    /// Scales both graphs and stamps a row of the waterfall. `level` is in the reference unit.
    void setGraphAxes(double xStart, double xStop, double level, const LevelRange& range);
    /// Leaves the x axis alone while the user's zoom is on.
    void setGraphXAxis(double xStart, double xStop);
    void setGraphYAxis(double level, const LevelRange& range);
    void SetYAxisFormat();
    void addWaterfallRowLimit();
    /// Plots a sweep; only a whole one goes into the waterfall.
    void DisplayDataOnGraph(const Sweep& sweep);
    /// The trigger line at `percent` of the display's height.
    void SetAnnotation(double percent);
    /// Switches the trigger line on where it last stood, or off.
    void showAnnotation();
    void hideAnnotation();

    /// Resizes the waterfall's vectors to the indices 0 to `count`.
    void SizeXYVectors(int count);
    /// 602 x values from `ViewStart` on, `step` apart, and the row number for each.
    void BuildXYVectors(double step);

  private:
    void setLevelRange(double minimum, double maximum);

    ControllerForm& panel_;
    WaterfallForm& waterfall_;
    ZEL3Variables& mirror_;
    const Clock& clock_;
};

}  // namespace zel
