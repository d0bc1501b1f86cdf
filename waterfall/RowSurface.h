#pragma once
// The rows of the graph as solids in its box: what the renderer draws.

#include <vector>

#include "platform/Graph3D.h"

namespace zel {

/// What is drawn of the rows, and between which limits.
struct RowLimits {
    double firstX = 0;  ///< at the left and right end of the box
    double lastX = 1;
    double firstDepth = 0;  ///< of the first and the last row place
    double lastDepth = 1;
    double low = 0;  ///< level at the bottom and at the top
    double high = 1;
};

/// A stretch of a row without gaps: a polyline in the box, and what it is made of.
struct RowSurface {
    int plot = 0;  ///< 0-based
    /// The row's place along the depth axis, in the box.
    double nearY = 0;  ///< smaller y
    double farY = 0;
    struct Point {
        float x;     ///< 0 to 12
        float z;     ///< 0 to 10
        float part;  ///< of the colour map, 0 to 1
        int sample;  ///< 0-based, of the plot
    };
    std::vector<Point> points;  ///< two or more, x ascending
};

/// The rows inside of the limits, cut at the ends of the box. A level that is no number leaves a
/// gap; one beyond the limits stands at the limit. Axes of no height are spread or flat, never an
/// error.
std::vector<RowSurface> rowSurfaces(const Graph3D& graph, const RowLimits& limits);

}  // namespace zel
