#pragma once
// Cuts a polyline at the edges of a rectangle, for picture files that keep no clip.

#include <qcustomplot.h>

#include <QPolygonF>
#include <QRectF>
#include <vector>

namespace zel {

/// The parts of `line` inside of `box`, edges included, cut where they cross them; coordinates of
/// any size and unit. A point that is no number interrupts the line. A part has two points or more.
std::vector<QPolygonF> clipPolyline(const QPolygonF& line, const QRectF& box);

/// The points of a graph.
QPolygonF linePoints(const QCPGraph& graph);
/// Gives a graph the parts of a line that lie in the view, with the pen lifted between them.
void clipLine(QCPGraph& graph, const QPolygonF& line, const QRectF& view);

}  // namespace zel
