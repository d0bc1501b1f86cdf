#include "desktop/graph/CursorMarks.h"

#include <algorithm>
#include <cmath>
#include <cstddef>

#include "desktop/graph/AxisText.h"
#include "desktop/graph/GraphColors.h"
#include "platform/Graph.h"

namespace zel {
namespace {

constexpr double kCursorReach = 8;  // pixels
constexpr double kLabelGap = 6;     // pixels from the point to its text
constexpr double kLineGap = 4;      // pixels from the line to its text
constexpr int kGroundAlpha = 200;   // of the ground under a text
constexpr int kFontPoints = 9;

}  // namespace

QFont plotFont() {
    QFont font;
    font.setPointSize(kFontPoints);
    return font;
}

CursorMarks::CursorMarks(QCustomPlot& plot, const GraphColors& colors)
    : plot_(plot), colors_(colors) {
    // The texts come last: no line runs through them.
    for (Items& cursor : items_) {
        cursor.line = new QCPItemStraightLine(&plot_);
        cursor.point = new QCPItemTracer(&plot_);
        cursor.point->setStyle(QCPItemTracer::tsCircle);
        cursor.point->setSize(9);
        cursor.line->setVisible(false);
        cursor.point->setVisible(false);
    }
    QColor ground = colors_.plotArea;
    ground.setAlpha(kGroundAlpha);
    for (Items& cursor : items_) {
        cursor.text = new QCPItemText(&plot_);
        cursor.text->setBrush(ground);
        cursor.text->position->setType(QCPItemPosition::ptAbsolute);
        cursor.text->setFont(plotFont());
        cursor.text->setClipToAxisRect(false);
        cursor.text->setVisible(false);
    }
}

void CursorMarks::place(const Graph& graph, const Trace& trace) {
    for (std::size_t i = 0; i < items_.size(); ++i) {
        Items& items = items_.at(i);
        const GraphCursor& cursor = graph.cursor(static_cast<int>(i) + 1);
        items.visible = cursor.Visible;
        items.x = cursor.X;
        items.line->setVisible(cursor.Visible);
        items.point->setVisible(cursor.Visible);
        items.text->setVisible(false);
        if (!cursor.Visible) continue;
        const QColor color = colorOf(cursor.color).darker(colors_.cursorDarkness);
        items.line->setPen(QPen(color, 1));
        items.line->point1->setCoords(cursor.X, 0);
        items.line->point2->setCoords(cursor.X, 1);
        items.point->setPen(QPen(color, 2));
        items.text->setColor(color);
        // On the trace as it is now: the cursor's own level is that of an earlier sweep.
        const double level = trace.levelAt(cursor.X);
        const QPointF point(cursor.X, trace.texts && std::isfinite(level) ? level : cursor.Y);
        items.point->position->setCoords(point);
        if (trace.texts && std::isfinite(level)) write(i, point, trace);
    }
}

void CursorMarks::write(std::size_t index, const QPointF& point, const Trace& trace) {
    const QPointF first = items_[0].point->position->coords();
    const bool delta = index == 1 && items_[0].visible;
    QCPItemText& label = *items_.at(index).text;
    const double x = delta ? point.x() - first.x() : point.x();
    const double y = delta ? point.y() - first.y() : point.y();
    label.setText((delta ? QString::fromUtf8("Δ1  ") : QString("1  ")) +
                  QString::fromStdString(axisText(x, trace.resolution, trace.xUnit)) + "; " +
                  QString::fromStdString(levelText(y, delta ? "dB" : trace.unit)));
    // Above its point, inside of the plot.
    const QRectF area = plot_.axisRect()->rect();
    const QPointF pixel(plot_.xAxis->coordToPixel(point.x()), plot_.yAxis->coordToPixel(point.y()));
    label.setVisible(area.adjusted(-1, -1, 1, 1).contains(pixel));
    const QFontMetricsF letters(label.font());
    const QSizeF size(letters.horizontalAdvance(label.text()) + 2, letters.height());
    QRectF place(pixel + QPointF(kLineGap, -kLabelGap - size.height()), size);
    // Left of its line where the right has no room.
    if (place.right() > area.right()) place.moveRight(pixel.x() - kLineGap);
    place.moveLeft(std::max(place.left(), area.left() + 2));
    place.moveTop(std::max(place.top(), area.top() + 2));
    // The second one goes below the first where both would stand at one place.
    if (index == 1 && items_[0].text->visible() && place.intersects(items_[0].place))
        place.moveTop(items_[0].place.bottom() + 1);
    items_.at(index).place = place;
    label.setPositionAlignment(Qt::AlignLeft | Qt::AlignTop);
    label.position->setCoords(place.topLeft());
}

int CursorMarks::at(const QPointF& pixel) const {
    for (int i = 1; i >= 0; --i) {
        const Items& cursor = items_.at(static_cast<std::size_t>(i));
        if (!cursor.visible) continue;
        if (std::fabs(plot_.xAxis->coordToPixel(cursor.x) - pixel.x()) <= kCursorReach)
            return i + 1;
    }
    return 0;
}

void CursorMarks::clipToView() {
    for (const Items& cursor : items_) {
        const QPointF at = cursor.point->position->coords();
        if (!plot_.xAxis->range().contains(at.x()) || !plot_.yAxis->range().contains(at.y()))
            cursor.point->setVisible(false);
    }
}

}  // namespace zel
