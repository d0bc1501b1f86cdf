#pragma once
// What a measurement script costs beside its exchanges.

#include <string>

#include "bench/Figures.h"

namespace zelbench {

/// 10,000 statements without the instrument, with the windows open.
Figure statementRate();
/// The points of a scan beside a bare loop of the same exchanges; `simulator` is the program.
Figure scanCost(const std::string& simulator);
/// Means and deviations of one complex trace.
Figure traceStatistics();
/// 200,000 characters by the slow road.
Figure slowRoad();
/// What the check of a night's script takes.
Figure rehearsalOfANight();

}  // namespace zelbench
