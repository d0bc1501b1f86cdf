#pragma once
// What the program's window costs: at rest, and until it is seen for the first time.

#include <string>

#include "bench/Figures.h"

namespace zelbench {

/// CPU time of the idle program, connected to the simulator, as a share of one core.
Figure idleShare(const std::string& panel, const std::string& simulator);

/// Start of the process to first paint of the panel, beside a program with an empty window, in
/// rounds that take turns. Both are files of programs.
Figure firstPaint(const std::string& panel, const std::string& empty);

}  // namespace zelbench
