#include "desktop/graph/WaterfallCanvas.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QWheelEvent>
#include <algorithm>
#include <cmath>

#include "desktop/graph/GraphColors.h"
#include "desktop/graph/WaterfallDrawing.h"
#include "forms/WaterfallForm.h"
#include "platform/Graph3D.h"
#include "waterfall/Camera.h"
#include "waterfall/PictureOptions.h"
#include "waterfall/WaterfallPicture.h"

namespace zel {
namespace {

constexpr double kDegreesPerPixel = 0.4;
constexpr double kKeyPixels = 12;
constexpr double kZoomStep = 0.9;
constexpr double kNearestZoom = 0.1;
constexpr double kFarthestZoom = 100;
constexpr int kPointerMs = 40;
constexpr int kWheelEndMs = 250;
constexpr int kRestMs = 80;
/// Longer than a sweep takes on a line of 57,600 baud: sweeps that follow each other are not kept
/// waiting for finer pictures.
constexpr int kStillMs = 800;
constexpr double kMostFineDots = 4e6;
constexpr double kHighestLatitude = 180;

/// The graph's own angles may be any; those that the mouse makes stay within a turn.
double withinTurn(double degrees) { return std::remainder(degrees, 360.0); }

}  // namespace

WaterfallCanvas::WaterfallCanvas(WaterfallForm& form, QWidget* parent)
    : QWidget(parent), form_(form) {
    setFocusPolicy(Qt::StrongFocus);
    setMouseTracking(true);
    setMinimumSize(240, 180);
    setAttribute(Qt::WA_OpaquePaintEvent);
    pointerRead_.setSingleShot(true);
    connect(&pointerRead_, &QTimer::timeout, this, [this] { readPointer(); });
    wheelEnd_.setSingleShot(true);
    connect(&wheelEnd_, &QTimer::timeout, this, [this] { form_.Graph3D.ZoomEnded(); });
    rest_.setSingleShot(true);
    connect(&rest_, &QTimer::timeout, this, [this] {
        if (waits_) update();
    });
    still_.setSingleShot(true);
    still_.setInterval(kStillMs);
    connect(&still_, &QTimer::timeout, this, [this] {
        const double dots = devicePixelRatioF();
        fine_ =
            !changed_ && drag_ == Drag::None && width() * dots * height() * dots < kMostFineDots;
        if (fine_ && isVisible()) update();
    });
}

void WaterfallCanvas::refresh() {
    // A hand that moves the picture sees it move at once.
    const bool atOnce = drag_ != Drag::None || wheelEnd_.isActive() || !rest_.isActive();
    waits_ = !atOnce;
    changed_ = true;
    fine_ = false;
    if (atOnce && isVisible()) update();
    setCursor(placesCursors() ? Qt::CrossCursor : Qt::ArrowCursor);
}

void WaterfallCanvas::setColors(const GraphColors& colors) {
    colors_ = colors;
    update();
}

bool WaterfallCanvas::placesCursors() const {
    return form_.Graph3D.MouseMode == MouseMode3D::PlaceCursor;
}

/// The same one as long as nothing changed: a window that comes to the front costs no drawing.
const WaterfallPicture& WaterfallCanvas::picture(double fontHeight) {
    PictureStyle style = pictureStyle(form_);
    style.dots = devicePixelRatioF();
    if (size() != pictureSize_) fine_ = false;
    style.oversampling = fine_ ? 2 : 1;
    // A paint for another reason leaves new rows to the end of the rest.
    const bool due = changed_ && !(waits_ && rest_.isActive());
    if (due || style != pictureStyle_ || size() != pictureSize_) {
        picture_ = drawWaterfall(form_.Graph3D, style, width(), height(), fontHeight);
        pictureStyle_ = style;
        pictureSize_ = size();
        changed_ = false;
        ++drawings_;
        rest_.start(kRestMs);
        if (!fine_) still_.start();
    }
    return picture_;
}

void WaterfallCanvas::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    painter.fillRect(rect(), colors_.background);
    painter.setFont(waterfallFont());
    const WaterfallPicture& seen = picture(painter.fontMetrics().height());
    waits_ = waits_ && rest_.isActive() && changed_;
    if (form_.Graph3D.hasRows()) return paintWaterfall(painter, rect(), seen, colors_);
    // The numbers along the axes mean nothing yet.
    WaterfallPicture box = seen;
    box.texts.clear();
    paintWaterfall(painter, rect(), box, colors_);
    const QString words =
        QObject::tr("No sweeps yet: start the continuous view\nor load a recording");
    constexpr int kAround = 6;
    const QRect place = painter.fontMetrics()
                            .boundingRect(rect(), Qt::AlignCenter, words)
                            .adjusted(-kAround, -kAround, kAround, kAround);
    painter.fillRect(place, colors_.background);
    painter.setPen(colors_.text);
    painter.drawText(rect(), Qt::AlignCenter, words);
}

void WaterfallCanvas::rotate(double right, double down) {
    GraphView3D view = form_.Graph3D.view();
    view.Longitude = withinTurn(view.Longitude - right * kDegreesPerPixel);
    view.Latitude =
        std::clamp(withinTurn(view.Latitude) - down * kDegreesPerPixel, 0.0, kHighestLatitude);
    form_.Graph3D.setView(view);
}

void WaterfallCanvas::move(double right, double down) {
    GraphView3D view = form_.Graph3D.view();
    const Camera camera(view, form_.Graph3D.Projection == Projection3D::Perspective, width(),
                        height());
    const double x = -right / camera.scale();
    const double y = down / camera.scale();
    const auto along = [&camera](const BoxPoint& way) { return camera.step(way); };
    // The picture's own right and up, in the box.
    const SeenPoint ways[] = {along({1, 0, 0}), along({0, 1, 0}), along({0, 0, 1})};
    view.TransX += ways[0].right * x + ways[0].up * y;
    view.TransY += ways[1].right * x + ways[1].up * y;
    view.TransZ += ways[2].right * x + ways[2].up * y;
    form_.Graph3D.setView(view);
}

void WaterfallCanvas::zoom(double factor) {
    GraphView3D view = form_.Graph3D.view();
    view.Distance =
        std::clamp(std::max(view.Distance, kNearestZoom) * factor, kNearestZoom, kFarthestZoom);
    form_.Graph3D.setView(view);
}

void WaterfallCanvas::mousePressEvent(QMouseEvent* event) {
    setFocus(Qt::MouseFocusReason);
    last_ = event->position();
    moved_ = false;
    if (placesCursors() && event->button() == Qt::LeftButton) {
        const auto hit =
            pointAt(form_.Graph3D, pictureStyle(form_), width(), height(), {last_.x(), last_.y()});
        if (!hit) return;
        form_.Graph3D.CursorPlaced(hit->plot + 1, hit->sample + 1);
        form_.Graph3D.Clicked();
        return;
    }
    if (event->button() == Qt::RightButton || (event->modifiers() & Qt::ShiftModifier) != 0) {
        drag_ = Drag::Move;
    } else if (event->button() == Qt::LeftButton) {
        drag_ = Drag::Rotate;
    }
}

void WaterfallCanvas::mouseMoveEvent(QMouseEvent* event) {
    const QPointF way = event->position() - last_;
    pointer_ = event->position();
    if (drag_ == Drag::None) {
        if (!pointerRead_.isActive()) pointerRead_.start(kPointerMs);
        return;
    }
    last_ = event->position();
    moved_ = true;
    if (drag_ == Drag::Rotate) {
        rotate(way.x(), way.y());
    } else {
        move(way.x(), way.y());
    }
}

void WaterfallCanvas::mouseReleaseEvent(QMouseEvent*) {
    const Drag ended = drag_;
    drag_ = Drag::None;
    if (!moved_) return;
    if (ended == Drag::Rotate) form_.Graph3D.RotationEnded();
    if (ended == Drag::Move) form_.Graph3D.TranslationEnded();
}

void WaterfallCanvas::mouseDoubleClickEvent(QMouseEvent*) {
    if (!placesCursors()) form_.ViewReset.Click();
}

void WaterfallCanvas::wheelEvent(QWheelEvent* event) {
    zoom(std::pow(kZoomStep, event->angleDelta().y() / 120.0));
    wheelEnd_.start(kWheelEndMs);
    event->accept();
}

void WaterfallCanvas::keyPressEvent(QKeyEvent* event) {
    struct Way {
        int key;
        double right;
        double down;
    };
    constexpr Way kWays[] = {{Qt::Key_Left, -kKeyPixels, 0},
                             {Qt::Key_Right, kKeyPixels, 0},
                             {Qt::Key_Up, 0, -kKeyPixels},
                             {Qt::Key_Down, 0, kKeyPixels}};
    for (const Way& way : kWays) {
        if (event->key() != way.key) continue;
        if ((event->modifiers() & Qt::ShiftModifier) != 0) {
            move(way.right, way.down);
            form_.Graph3D.TranslationEnded();
        } else {
            rotate(way.right, way.down);
            form_.Graph3D.RotationEnded();
        }
        return;
    }
    switch (event->key()) {
        case Qt::Key_Plus:
        case Qt::Key_Equal:
            zoom(kZoomStep);
            form_.Graph3D.ZoomEnded();
            return;
        case Qt::Key_Minus:
            zoom(1 / kZoomStep);
            form_.Graph3D.ZoomEnded();
            return;
        case Qt::Key_Home:
            form_.ViewReset.Click();
            return;
        default:
            QWidget::keyPressEvent(event);
    }
}

void WaterfallCanvas::leaveEvent(QEvent*) {
    pointerRead_.stop();
    form_.lblPointer.Caption = "";
}

void WaterfallCanvas::readPointer() {
    const auto hit = pointAt(form_.Graph3D, pictureStyle(form_), width(), height(),
                             {pointer_.x(), pointer_.y()});
    form_.lblPointer.Caption = hit ? sampleText(form_.Graph3D, *hit) : "";
}

}  // namespace zel
