#pragma once
// What the conversion of a sweep costs beside the time that its bytes need on the line.

#include "bench/Figures.h"

namespace zelbench {

/// 602 samples of the auto peak detector, the slowest of the units and ranges, against the time of
/// their bytes at `baud`.
Figure conversionCost(int baud);

}  // namespace zelbench
