#pragma once
// The box around the rows: its far walls with their grid, and the axes with ticks and texts.

#include "platform/Graph3D.h"
#include "waterfall/Camera.h"
#include "waterfall/WaterfallPicture.h"

namespace zel {

/// Adds grid and frame to `behind`, axes to `before` and the texts. Labels of the depth axis stand
/// at their rows. `fontHeight` in pixels keeps them apart.
void addAxisBox(const Graph3D& graph, const Camera& camera, double fontHeight,
                WaterfallPicture& picture);
/// A cross and the name of each placed cursor.
void addMarkers(const Graph3D& graph, const Camera& camera, WaterfallPicture& picture);

}  // namespace zel
