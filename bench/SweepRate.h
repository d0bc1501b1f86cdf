#pragma once
// How many full sweeps a second come through the core, beside what the line could carry.

#include <string>

#include "bench/Figures.h"

namespace zelbench {

/// Sweeps a second over an unpaced pseudo terminal, beside a bare loop on the same simulator, in
/// rounds that take turns. The ratio is the median of the rounds' ratios: a machine that is busy
/// with something else slows both halves of a round alike.
Figure unpacedSweeps(const std::string& simulator);

/// Time of a sweep at 57,600 baud, paced by the simulator, beside the time of its bytes (both
/// ways, 10 bits a byte) and of the simulated sweep. With `realSweeps` the sweep takes the
/// instrument's own time, else a millionth of it.
Figure pacedSweeps(const std::string& simulator, bool realSweeps);

}  // namespace zelbench
