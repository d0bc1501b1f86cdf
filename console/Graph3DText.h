#pragma once
// The three-dimensional graph as lines of text.

#include <string>
#include <vector>

#include "platform/Graph3D.h"

namespace zel {

/// Plots with their styles, axes, labels of the depth axis, camera, mouse mode, cursors.
std::vector<std::string> graph3DLines(const Graph3D& graph);

}  // namespace zel
