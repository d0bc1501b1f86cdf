#include "desktop/graph/GraphWidget.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QRubberBand>
#include <algorithm>

#include "desktop/platform/KeyCodes.h"

namespace zel {
namespace {

constexpr int kSmallestRectangle = 6;  // pixels

}  // namespace

GraphWidget::GraphWidget(Graph& graph, std::function<ViewAnnotations()> annotate, QWidget* parent)
    : QCustomPlot(parent),
      graph_(graph),
      annotate_(std::move(annotate)),
      band_(new QRubberBand(QRubberBand::Rectangle, this)) {
    picture_ = std::make_unique<GraphPlot>(*this);
    setMouseTracking(true);
    setFocusPolicy(Qt::StrongFocus);
    setMinimumSize(320, 220);
    refresh();
}

void GraphWidget::refresh() {
    picture_->update(graph_, annotate_());
    showPointer(mapFromGlobal(QCursor::pos()));
    replot(QCustomPlot::rpQueuedReplot);
}

void GraphWidget::drawNow() {
    picture_->update(graph_, annotate_());
    replot(QCustomPlot::rpImmediateRefresh);
}

void GraphWidget::showPointer(const QPointF& pixel) {
    const bool movable = graph_.TrackMode == static_cast<int>(TrackMode::DragCursors);
    if (zooming()) {
        setCursor(Qt::CrossCursor);
    } else if (movable && (dragged_ > 0 || picture_->cursorAt(pixel) > 0)) {
        setCursor(Qt::SplitHCursor);
    } else {
        unsetCursor();
    }
}

bool GraphWidget::zooming() const {
    return graph_.TrackMode == static_cast<int>(TrackMode::ZoomRectangle);
}

QPointF GraphWidget::clamped(const QPointF& pixel) {
    const QRect area = picture_->axisRect().rect();
    return {std::clamp<double>(pixel.x(), area.left(), area.right()),
            std::clamp<double>(pixel.y(), area.top(), area.bottom())};
}

void GraphWidget::mousePressEvent(QMouseEvent* event) {
    setFocus(Qt::MouseFocusReason);
    if (event->button() != Qt::LeftButton) return;
    if (zooming()) {
        bandStart_ = clamped(event->position()).toPoint();
        band_->setGeometry(QRect(bandStart_, QSize()));
        band_->show();
    } else if (graph_.TrackMode == static_cast<int>(TrackMode::DragCursors)) {
        dragged_ = picture_->cursorAt(event->position());
    }
}

void GraphWidget::mouseMoveEvent(QMouseEvent* event) {
    const QPointF pixel = event->position();
    if (band_->isVisible()) {
        band_->setGeometry(QRect(bandStart_, clamped(pixel).toPoint()).normalized());
        return;
    }
    showPointer(pixel);
    if (dragged_ > 0) return moveCursor(dragged_, xAxis->pixelToCoord(clamped(pixel).x()));
    if (picture_->axisRect().rect().contains(pixel.toPoint()) && !graph_.values().empty())
        graph_.PlotAreaTracking(xAxis->pixelToCoord(pixel.x()), yAxis->pixelToCoord(pixel.y()));
}

void GraphWidget::mouseReleaseEvent(QMouseEvent* event) {
    dragged_ = 0;
    if (!band_->isVisible()) return;
    band_->hide();
    finishZoom(QRect(bandStart_, clamped(event->position()).toPoint()).normalized());
}

void GraphWidget::finishZoom(const QRect& rectangle) {
    if (rectangle.width() < kSmallestRectangle || rectangle.height() < kSmallestRectangle) return;
    const double left = xAxis->pixelToCoord(rectangle.left());
    const double right = xAxis->pixelToCoord(rectangle.right());
    const double bottom = yAxis->pixelToCoord(rectangle.bottom());
    const double top = yAxis->pixelToCoord(rectangle.top());
    graph_.setXRange(left, right);
    graph_.setYRange(bottom, top);
    graph_.ZoomFinished();
}

void GraphWidget::moveCursor(int index, double x) {
    const QPointF point = picture_->pointAt(x);
    graph_.CursorMoved(index, point.x(), point.y());
}

void GraphWidget::keyPressEvent(QKeyEvent* event) {
    const int key = event->key();
    if (const int code = keyCodeOf(*event); code != 0)
        graph_.KeyDown(code, event->modifiers().testFlag(Qt::ShiftModifier) ? 1 : 0);
    const bool sideways = key == Qt::Key_Left || key == Qt::Key_Right;
    const bool movable = graph_.TrackMode == static_cast<int>(TrackMode::DragCursors);
    if (!sideways || !movable) return QCustomPlot::keyPressEvent(event);
    const int index = event->modifiers().testFlag(Qt::ShiftModifier) ? 2 : 1;
    if (!graph_.cursor(index).Visible) return;
    const double step = graph_.increment() * (key == Qt::Key_Left ? -1 : 1);
    const double x =
        std::clamp(graph_.cursor(index).X + step, xAxis->range().lower, xAxis->range().upper);
    moveCursor(index, x);
}

}  // namespace zel
