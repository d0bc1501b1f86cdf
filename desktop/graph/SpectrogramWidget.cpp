#include "desktop/graph/SpectrogramWidget.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QWheelEvent>
#include <algorithm>
#include <cstring>
#include <functional>
#include <utility>

#include "desktop/graph/GraphColors.h"
#include "desktop/graph/WaterfallDrawing.h"
#include "forms/Forms.h"
#include "platform/Graph.h"
#include "support/Text.h"
#include "waterfall/ColourMap.h"
#include "waterfall/SweepHistory.h"

namespace zel {
namespace {

constexpr int kRowHeight = 2;  // pixels
constexpr int kMargin = 6;
constexpr int kWheelRows = 10;
constexpr int kLabelGap = 3;  // heights of a line of text

}  // namespace

SpectrogramWidget::SpectrogramWidget(Forms& forms, SweepHistory& history,
                                     std::function<std::pair<int, int>()> plotArea, QWidget* parent)
    : QWidget(parent),
      forms_(forms),
      history_(history),
      image_(history),
      plotArea_(std::move(plotArea)) {
    setFocusPolicy(Qt::StrongFocus);
    setMinimumHeight(90);
    setAttribute(Qt::WA_OpaquePaintEvent);
    setAccessibleName(QObject::tr("Spectrogram"));
    setToolTip(
        QObject::tr("Earlier sweeps; the wheel goes back, a click shows a sweep as the trace"));
    history_.Cleared.connect([self = QPointer<SpectrogramWidget>(this)] {
        if (!self) return;
        self->follows_ = true;
        self->refresh();
    });
    history_.Added.connect([self = QPointer<SpectrogramWidget>(this)] {
        if (self) self->refresh();
    });
}

void SpectrogramWidget::refresh() {
    const bool paused = forms_.controller.SpectrogramPause.Checked;
    if (paused && !paused_ && follows_) {
        follows_ = false;
        top_ = history_.added();
    } else if (!paused && paused_) {
        follows_ = true;
    }
    paused_ = paused;
    if (isVisible()) update();
}

int SpectrogramWidget::scrolled() const {
    if (follows_) return 0;
    const auto back = static_cast<long>(history_.added() - std::min(top_, history_.added()));
    return static_cast<int>(std::clamp<long>(back, 0, std::max(history_.count() - 1, 0)));
}

QRect SpectrogramWidget::area() const {
    const auto [left, right] = plotArea_();
    return {left, kMargin, std::max(right - left, 1), std::max(height() - 2 * kMargin, 1)};
}

int SpectrogramWidget::rowsShown() const { return area().height() / kRowHeight; }

void SpectrogramWidget::paintEvent(QPaintEvent*) {
    const GraphColors colors = darkGraph();
    QPainter painter(this);
    painter.fillRect(rect(), colors.background);
    const QRect place = area();
    painter.fillRect(place, colors.plotArea);
    painter.setFont(waterfallFont());
    const GraphAxis& x = forms_.controller.CWGraph1.xAxis();
    const GraphAxis& level = forms_.waterfall.Graph3D.axis(3);
    image_.update({place.width(), x.Minimum, x.Maximum, level.Minimum, level.Maximum, 4});

    const int first = scrolled();
    const int shown = std::clamp(image_.rows() - first, 0, rowsShown());
    if (shown > 0) {
        QImage lines(image_.frame().width, shown, QImage::Format_ARGB32);
        for (int i = 0; i < shown; ++i)
            std::memcpy(lines.scanLine(i), image_.line(first + i),
                        static_cast<std::size_t>(image_.frame().width) * sizeof(Pixel));
        painter.drawImage(QRect(place.left(), place.top(), place.width(), shown * kRowHeight),
                          lines);
    }
    painter.setPen(QPen(colors.frame, 1));
    painter.setBrush(Qt::NoBrush);
    painter.drawRect(place.adjusted(0, 0, -1, -1));

    painter.setPen(colors.text);
    const int line = painter.fontMetrics().height();
    QString last;
    for (int y = 0; y + line <= place.height(); y += kLabelGap * line) {
        const int back = first + y / kRowHeight;
        if (back >= image_.rows()) break;
        const QString time = QString::fromStdString(trimmed(history_.row(back).time)).left(8);
        if (time == last) continue;  // quick sweeps: many in a second
        last = time;
        painter.drawText(QRect(0, place.top() + y, place.left() - 4, line),
                         Qt::AlignRight | Qt::AlignTop, time);
    }
    QString note;
    if (forms_.controller.SpectrogramPause.Checked) note = "PAUSED";
    if (first > 0) note += (note.isEmpty() ? "" : "   ") + QObject::tr("%1 sweeps back").arg(first);
    if (image_.rows() == 0) note = QObject::tr("No sweeps yet");
    if (!note.isEmpty()) {
        const QRect box = painter.fontMetrics().boundingRect(note).adjusted(-6, -2, 6, 2);
        const QRect at(place.right() - box.width() - 4, place.top() + 4, box.width(), box.height());
        QColor ground = colors.background;
        ground.setAlphaF(0.8F);
        painter.fillRect(at, ground);
        painter.drawText(at, Qt::AlignCenter, note);
    }
    if (hasFocus()) {
        painter.setPen(QPen(palette().color(QPalette::Highlight), 1));
        painter.drawRect(rect().adjusted(0, 0, -1, -1));
    }
}

void SpectrogramWidget::mousePressEvent(QMouseEvent* event) {
    setFocus(Qt::MouseFocusReason);
    if (event->button() != Qt::LeftButton) return;
    const int y = event->position().toPoint().y() - area().top();
    if (y < 0) return;
    const int back = scrolled() + y / kRowHeight;
    if (back < history_.count()) forms_.controller.SpectrogramRow(back);
}

void SpectrogramWidget::scrollTo(long back) {
    const long most = std::max(history_.count() - 1, 0);
    back = std::clamp<long>(back, 0, most);
    follows_ = back == 0 && !forms_.controller.SpectrogramPause.Checked;
    top_ = history_.added() - static_cast<unsigned long>(back);
    update();
}

void SpectrogramWidget::wheelEvent(QWheelEvent* event) {
    scrollTo(scrolled() - event->angleDelta().y() * kWheelRows / 120);
    event->accept();
}

void SpectrogramWidget::keyPressEvent(QKeyEvent* event) {
    switch (event->key()) {
        case Qt::Key_Down:
            return scrollTo(scrolled() + 1);
        case Qt::Key_Up:
            return scrollTo(scrolled() - 1);
        case Qt::Key_PageDown:
            return scrollTo(scrolled() + rowsShown());
        case Qt::Key_PageUp:
            return scrollTo(scrolled() - rowsShown());
        case Qt::Key_Home:
            return scrollTo(0);
        case Qt::Key_End:
            return scrollTo(history_.count());
        case Qt::Key_Return:
        case Qt::Key_Enter:
            if (history_.count() > 0) forms_.controller.SpectrogramRow(scrolled());
            return;
        default:
            QWidget::keyPressEvent(event);
    }
}

}  // namespace zel
