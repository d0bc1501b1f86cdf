#include "desktop/graph/GraphWidget.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QRubberBand>
#include <algorithm>
#include <cmath>
#include <functional>
#include <initializer_list>
#include <memory>
#include <optional>
#include <string>
#include <utility>

#include "desktop/graph/GraphPlot.h"
#include "desktop/platform/KeyCodes.h"
#include "platform/Graph.h"
#include "support/NumberText.h"
#include "trace/ViewAnnotations.h"

namespace zel {
namespace {

constexpr int kSmallestRectangle = 6;  // pixels
constexpr double kWheelStep = 1.25;    // a notch
constexpr int kNotch = 120;            // an eighth of a degree
constexpr double kSharpScreen = 1.5;   // device pixels a pixel

}  // namespace

GraphWidget::GraphWidget(Graph& graph, std::function<ViewAnnotations()> annotate, QWidget* parent)
    : QCustomPlot(parent),
      graph_(graph),
      annotate_(std::move(annotate)),
      band_(new QRubberBand(QRubberBand::Rectangle, this)) {
    // Nothing is drawn there: a picture of its own would be 2 MB, laid over each frame.
    layer("overlay")->setMode(QCPLayer::lmLogical);
    picture_ = std::make_unique<GraphPlot>(*this);
    picture_->setMarkerTexts(true);
    setAccessibleName(QObject::tr("Graph"));
    setMouseTracking(true);
    setFocusPolicy(Qt::WheelFocus);  // Space and Home then mean the view
    setMinimumSize(320, 220);
    refresh();
}

void GraphWidget::refresh() {
    picture_->setTraceWidth(devicePixelRatioF() >= kSharpScreen ? 1.5 : 1);
    takeGraph();
    showPointer(mapFromGlobal(QCursor::pos()));
    replot(QCustomPlot::rpQueuedReplot);
}

void GraphWidget::takeGraph() {
    if (navigator_ != nullptr) navigator_->keepView();
    const QCPRange x = xAxis->range();
    const QCPRange y = yAxis->range();
    picture_->update(graph_, annotate_());
    // The pointer rests, and the axes move under it.
    if (pointer_ && (x != xAxis->range() || y != yAxis->range())) track(*pointer_);
}

void GraphWidget::drawNow() {
    takeGraph();
    replot(QCustomPlot::rpImmediateRefresh);
}

void GraphWidget::showPointer(const QPointF& pixel) {
    const bool movable = graph_.TrackMode == static_cast<int>(TrackMode::DragCursors);
    if (panFrom_ || spaceHeld_) {
        setCursor(panFrom_ ? Qt::ClosedHandCursor : Qt::OpenHandCursor);
    } else if (zooming()) {
        setCursor(Qt::CrossCursor);
    } else if (hostDragged_ > 0 || (hostMarkerAt && hostMarkerAt(pixel) > 0)) {
        setCursor(Qt::SizeHorCursor);
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
    const bool pans =
        event->button() == Qt::MiddleButton || (event->button() == Qt::LeftButton && spaceHeld_);
    if (pans && navigator_ != nullptr && !graph_.values().empty()) {
        navigator_->endStep();
        panFrom_ = event->position();
        return showPointer(event->position());
    }
    if (event->button() != Qt::LeftButton) return;
    hostDragged_ = zooming() || !hostMarkerAt ? 0 : hostMarkerAt(event->position());
    if (hostDragged_ > 0) return showPointer(event->position());
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
    if (panFrom_) return panTo(pixel);
    if (hostDragged_ > 0)
        return hostMarkerMoved(hostDragged_, xAxis->pixelToCoord(clamped(pixel).x()));
    showPointer(pixel);
    if (dragged_ > 0) return moveCursor(dragged_, xAxis->pixelToCoord(clamped(pixel).x()));
    track(pixel);
}

void GraphWidget::track(const QPointF& pixel) {
    pointer_.reset();
    if (!picture_->axisRect().rect().contains(pixel.toPoint()) || graph_.values().empty()) {
        if (pointed) pointed(std::nullopt);
        return;
    }
    pointer_ = pixel;
    if (tracking) tracking(true);
    graph_.PlotAreaTracking(xAxis->pixelToCoord(pixel.x()), yAxis->pixelToCoord(pixel.y()));
    if (tracking) tracking(false);
    if (pointed) pointed(xAxis->pixelToCoord(pixel.x()));
}

void GraphWidget::panTo(const QPointF& pixel) {
    navigator_->pan(xAxis->pixelToCoord(panFrom_->x()) - xAxis->pixelToCoord(pixel.x()),
                    yAxis->pixelToCoord(panFrom_->y()) - yAxis->pixelToCoord(pixel.y()));
    panFrom_ = pixel;
    drawNow();
}

void GraphWidget::leaveEvent(QEvent* event) {
    QCustomPlot::leaveEvent(event);
    pointer_.reset();
    if (pointed) pointed(std::nullopt);
}

void GraphWidget::mouseDoubleClickEvent(QMouseEvent* event) {
    if (event->button() == Qt::LeftButton && !zooming() && navigator_ != nullptr)
        return wholeView();
    mousePressEvent(event);
}

void GraphWidget::wholeView() {
    if (navigator_ != nullptr) navigator_->whole();
}

void GraphWidget::showLevels(double bottom, double top) {
    const GraphAxis& x = graph_.xAxis();
    if (navigator_ != nullptr)
        return navigator_->showRectangle({x.Minimum, x.Maximum, bottom, top});
    graph_.setYRange(bottom, top);
}

void GraphWidget::wheelEvent(QWheelEvent* event) {
    const QPoint turned = event->angleDelta();
    const int notches = turned.y() != 0 ? turned.y() : turned.x();
    if (navigator_ == nullptr || notches == 0 || graph_.values().empty() ||
        !picture_->axisRect().rect().contains(event->position().toPoint()))
        return event->ignore();
    const double factor = std::pow(kWheelStep, -static_cast<double>(notches) / kNotch);
    if (event->modifiers().testFlag(Qt::ShiftModifier)) {
        navigator_->zoomY(yAxis->pixelToCoord(event->position().y()), factor);
    } else {
        navigator_->zoomX(xAxis->pixelToCoord(event->position().x()), factor);
    }
    event->accept();
}

void GraphWidget::contextMenuEvent(QContextMenuEvent* event) {
    if (menuAsked) menuAsked(event->globalPos(), xAxis->pixelToCoord(clamped(event->pos()).x()));
}

void GraphWidget::mouseReleaseEvent(QMouseEvent* event) {
    dragged_ = hostDragged_ = 0;
    if (panFrom_) {
        panFrom_.reset();
        return showPointer(event->position());
    }
    if (!band_->isVisible()) return;
    band_->hide();
    finishZoom(QRect(bandStart_, clamped(event->position()).toPoint()).normalized());
}

void GraphWidget::tell(const char* word, std::initializer_list<double> numbers) {
    if (!told) return;
    std::string line = word;
    for (const double number : numbers) line.append(1, ' ').append(shortestNumber(number));
    told(line);
}

void GraphWidget::finishZoom(const QRect& rectangle) {
    if (rectangle.width() < kSmallestRectangle || rectangle.height() < kSmallestRectangle) return;
    const double left = xAxis->pixelToCoord(rectangle.left());
    const double right = xAxis->pixelToCoord(rectangle.right());
    const double bottom = yAxis->pixelToCoord(rectangle.bottom());
    const double top = yAxis->pixelToCoord(rectangle.top());
    tell("zoom2d", {left, right, bottom, top});
    if (navigator_ != nullptr) {
        navigator_->showRectangle({left, right, bottom, top});
    } else {
        graph_.setXRange(left, right);
        graph_.setYRange(bottom, top);
    }
    graph_.ZoomFinished();
}

void GraphWidget::moveCursor(int index, double x) {
    const QPointF point = picture_->pointAt(x);
    tell("move2d", {static_cast<double>(index), point.x(), point.y()});
    graph_.CursorMoved(index, point.x(), point.y());
}

bool GraphWidget::navigate(const QKeyEvent& event) {
    if (navigator_ == nullptr) return false;
    const bool alt = event.modifiers() == Qt::AltModifier;
    if (alt && event.key() == Qt::Key_Left) {
        navigator_->back();
    } else if (alt && event.key() == Qt::Key_Right) {
        navigator_->forward();
    } else if (event.key() == Qt::Key_Home) {
        navigator_->whole();
    } else if (event.key() == Qt::Key_Space) {
        spaceHeld_ = true;
        showPointer(mapFromGlobal(QCursor::pos()));
    } else {
        return false;
    }
    return true;
}

void GraphWidget::keyReleaseEvent(QKeyEvent* event) {
    if (event->key() == Qt::Key_Space && !event->isAutoRepeat()) {
        spaceHeld_ = false;
        showPointer(mapFromGlobal(QCursor::pos()));
    }
    QCustomPlot::keyReleaseEvent(event);
}

void GraphWidget::keyPressEvent(QKeyEvent* event) {
    if (navigate(*event)) return;
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
