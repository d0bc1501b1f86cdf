#include "desktop/graph/BandGraph.h"

#include <algorithm>
#include <cmath>

namespace zel {
namespace {

/// Pixels of a point of the band: where it stands, its highest and its lowest level.
struct Edge {
    double x = 0;
    double high = 0;
    double low = 0;

    bool number() const { return std::isfinite(high) && std::isfinite(low); }
};

double between(double from, double to, double share) { return from + (to - from) * share; }

}  // namespace

BandGraph::BandGraph(QCPAxis* x, QCPAxis* y) : QCPGraph(x, y) {
    setAdaptiveSampling(false);
    setAntialiasedFill(false);  // its edges lie under the lines
}

void BandGraph::drawFill(QCPPainter* painter, QVector<QPointF>* lines) const {
    const QCPGraph* lower = channelFillGraph();
    const double scale = painter->deviceTransform().m11();
    if (lower == nullptr || painter->modes().testFlag(QCPPainter::pmVectorized) || scale <= 0)
        return QCPGraph::drawFill(painter, lines);
    const QCPRange seen = keyAxis()->range();
    const auto first = data()->findBegin(seen.lower);
    const auto last = data()->findEnd(seen.upper);
    const QRectF area = clipRect();
    const double column = 1 / scale;
    const auto edgeAt = [&](QCPGraphDataContainer::const_iterator at) {
        const auto index = static_cast<int>(at - data()->constBegin());
        const auto pixel = [&](double level) {
            return std::clamp(valueAxis()->coordToPixel(level), area.top(), area.bottom());
        };
        return Edge{keyAxis()->coordToPixel(at->key), pixel(at->value),
                    index < lower->dataCount() ? pixel(lower->dataMainValue(index)) : qQNaN()};
    };
    QVector<QRectF> columns;
    if (first == last) return;
    Edge left = edgeAt(first);
    for (auto at = first + 1; at != last; ++at) {
        const Edge right = edgeAt(at);
        if (left.number() && right.number()) {
            const double width = right.x - left.x;
            const double begin = std::max(left.x, area.left());
            const double end = std::min(right.x, area.right() + column);
            for (double x = std::floor(begin * scale) / scale; x < end; x += column) {
                const double share =
                    width > 0 ? std::clamp((x + column / 2 - left.x) / width, 0.0, 1.0) : 0;
                const double top = between(left.high, right.high, share);
                const double bottom = between(left.low, right.low, share);
                columns.push_back(
                    QRectF(x, std::min(top, bottom), column, std::fabs(bottom - top)));
            }
        }
        left = right;
    }
    applyFillAntialiasingHint(painter);
    painter->setPen(Qt::NoPen);
    painter->setBrush(brush());
    painter->drawRects(columns);
}

}  // namespace zel
