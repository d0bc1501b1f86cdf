#pragma once
// What the trace tools cost: a sweep with all of them on, and a recording read and analysed.

#include "bench/Figures.h"

namespace zelbench {

/// 602 samples with every hold, all markers, a mask, corrections, statistics and all measurements,
/// against half a millisecond.
Figure traceToolsCost();
/// A recording of 100 MB through the reader and the analysis, against 100 MB a second.
Figure recordingAnalysis();

}  // namespace zelbench
