#include "desktop/graph/PolylineClip.h"

#include <algorithm>
#include <cmath>
#include <vector>

namespace zel {
namespace {

/// The part of a segment inside, as two numbers along it from 0 to 1.
struct Stretch {
    double from = 0;
    double to = 1;

    /// Keeps what lies at `origin + t * delta <= limit`; false when nothing is left.
    bool keepBelow(double origin, double delta, double limit) {
        if (delta == 0) return origin <= limit;
        const double crossing = (limit - origin) / delta;
        if (delta > 0) {
            to = std::min(to, crossing);
        } else {
            from = std::max(from, crossing);
        }
        return from <= to;
    }
};

bool isNumber(const QPointF& point) { return std::isfinite(point.x()) && std::isfinite(point.y()); }

QPointF between(const QPointF& a, const QPointF& b, double t, const QRectF& box) {
    return {std::clamp(a.x() + t * (b.x() - a.x()), box.left(), box.right()),
            std::clamp(a.y() + t * (b.y() - a.y()), box.top(), box.bottom())};
}

}  // namespace

std::vector<QPolygonF> clipPolyline(const QPolygonF& line, const QRectF& box) {
    std::vector<QPolygonF> parts;
    bool open = false;  // the last part goes on
    for (qsizetype i = 0; i + 1 < line.size(); ++i) {
        const QPointF a = line[i];
        const QPointF b = line[i + 1];
        const double dx = b.x() - a.x();
        const double dy = b.y() - a.y();
        Stretch inside;
        const bool seen = isNumber(a) && isNumber(b) && inside.keepBelow(a.x(), dx, box.right()) &&
                          inside.keepBelow(-a.x(), -dx, -box.left()) &&
                          inside.keepBelow(a.y(), dy, box.bottom()) &&
                          inside.keepBelow(-a.y(), -dy, -box.top());
        if (!seen) {
            open = false;
            continue;
        }
        if (!open || inside.from > 0) parts.push_back({between(a, b, inside.from, box)});
        parts.back().append(between(a, b, inside.to, box));
        open = inside.to >= 1;
    }
    return parts;
}

QPolygonF linePoints(const QCPGraph& graph) {
    QPolygonF points;
    for (const QCPGraphData& point : *graph.data()) points << QPointF(point.key, point.value);
    return points;
}

void clipLine(QCPGraph& graph, const QPolygonF& line, const QRectF& view) {
    QVector<double> keys;
    QVector<double> values;
    for (const QPolygonF& part : clipPolyline(line, view)) {
        for (const QPointF& point : part) {
            keys << point.x();
            values << point.y();
        }
        keys << part.back().x();
        values << qQNaN();  // the pen is lifted
    }
    graph.setData(keys, values, true);
}

}  // namespace zel
