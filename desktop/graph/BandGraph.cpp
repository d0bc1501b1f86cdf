#include "desktop/graph/BandGraph.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>

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

BandGraph::BandGraph(QCPAxis* x, QCPAxis* y) : QCPGraph(x, y) { setAdaptiveSampling(false); }

QVector<QRect> BandGraph::columns(double scale) const {
    const QCPGraph* lower = channelFillGraph();
    const QCPRange seen = keyAxis()->range();
    const auto first = data()->findBegin(seen.lower);
    const auto last = data()->findEnd(seen.upper);
    if (first == last) return {};
    // From here on in pixels of the device, so that each column is a rectangle of whole pixels.
    const QRectF area(QRectF(clipRect()).topLeft() * scale, QRectF(clipRect()).size() * scale);
    const auto edgeAt = [&](QCPGraphDataContainer::const_iterator at) {
        const auto index = static_cast<int>(at - data()->constBegin());
        const auto pixel = [&](double level) {
            return std::clamp(valueAxis()->coordToPixel(level) * scale, area.top(), area.bottom());
        };
        return Edge{keyAxis()->coordToPixel(at->key) * scale, pixel(at->value),
                    index < lower->dataCount() ? pixel(lower->dataMainValue(index)) : qQNaN()};
    };
    QVector<QRect> all;
    all.reserve(static_cast<qsizetype>(area.width()) + (last - first));
    Edge left = edgeAt(first);
    for (auto at = first + 1; at != last; ++at) {
        const Edge right = edgeAt(at);
        if (left.number() && right.number()) {
            const double width = right.x - left.x;
            const int begin = qFloor(std::max(left.x, area.left()));
            const int end = qCeil(std::min(right.x, area.right()));
            for (int x = begin; x < end; ++x) {
                const double share =
                    width > 0 ? std::clamp((x + 0.5 - left.x) / width, 0.0, 1.0) : 0;
                const int high = qRound(between(left.high, right.high, share));
                const int low = qRound(between(left.low, right.low, share));
                all.push_back(QRect(x, std::min(high, low), 1, std::abs(low - high)));
            }
        }
        left = right;
    }
    return all;
}

void BandGraph::drawFill(QCPPainter* painter, QVector<QPointF>* lines) const {
    const double scale = painter->deviceTransform().m11();
    if (channelFillGraph() == nullptr || painter->modes().testFlag(QCPPainter::pmVectorized) ||
        scale <= 0)
        return QCPGraph::drawFill(painter, lines);
    painter->save();
    painter->setAntialiasing(false);
    painter->scale(1 / scale, 1 / scale);
    painter->setPen(Qt::NoPen);
    painter->setBrush(brush());
    painter->drawRects(columns(scale));
    painter->restore();
}

}  // namespace zel
