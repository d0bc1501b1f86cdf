#pragma once
// What the soft keys and their boxes set off, in one bundle.

#include "panel/MarkerReadout.h"
#include "panel/MenuFill.h"
#include "panel/SoftPanel.h"
#include "trace/FrequencyLabels.h"
#include "trace/GraphScaling.h"
#include "trace/TraceReader.h"

namespace zel {

/// A copy stands for the same routines.
struct KeyRoutines {
    SoftPanel& softPanel;
    MenuFill& fill;  ///< holds the readouts that the menus share
    MarkerReadout& markers;
    FrequencyLabels& labels;
    TraceReader& traces;
    GraphScaling& scaling;
};

}  // namespace zel
