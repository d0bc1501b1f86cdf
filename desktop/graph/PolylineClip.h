#pragma once
// Cuts a polyline at the edges of a rectangle, for picture files that keep no clip.

#include <QPolygonF>
#include <QRectF>
#include <vector>

namespace zel {

/// The parts of `line` inside of `box`, edges included, cut where they cross them; coordinates of
/// any size and unit. A point that is no number interrupts the line. A part has two points or more.
std::vector<QPolygonF> clipPolyline(const QPolygonF& line, const QRectF& box);

}  // namespace zel
