#pragma once
// What a redraw of the graph costs.

#include "bench/Figures.h"

namespace zelbench {

/// The graph's widget with 602 new points at 900x500, the median of many redraws. Needs a
/// QApplication.
Figure graphRedraw();

}  // namespace zelbench
