#pragma once
// What the pictures of the waterfall and of the spectrogram cost.

#include "bench/Figures.h"

namespace zelbench {

/// A hundred rows of 602 points, turning: pictures a second beside the wanted ones.
Figure waterfallFrames(int width, int height, int threads, double wanted);
/// A new row of the spectrogram at 900 pixels beside 0.3 ms.
Figure spectrogramRow();
/// A hundred thousand rows: memory after the first tenth and at the end.
Figure waterfallGrowth();

}  // namespace zelbench
