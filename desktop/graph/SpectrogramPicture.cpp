#include "desktop/graph/SpectrogramPicture.h"

#include <algorithm>
#include <cstring>

#include "desktop/graph/GraphColors.h"
#include "desktop/graph/PictureFile.h"
#include "desktop/graph/WaterfallDrawing.h"
#include "desktop/graph/WaterfallImage.h"
#include "forms/WaterfallForm.h"
#include "platform/Graph.h"
#include "support/Text.h"
#include "waterfall/AxisTicks.h"
#include "waterfall/ColourMap.h"
#include "waterfall/SpectrogramImage.h"
#include "waterfall/SweepHistory.h"

namespace zel {
namespace {

constexpr int kStyle = 4;
constexpr int kLeft = 76;
constexpr int kTop = 30;
constexpr int kRight = 96;
constexpr int kBottom = 40;
constexpr int kTick = 4;
constexpr int kTicks = 8;
constexpr double kTimeGap = 2.2;  // heights of a line of text

class Plot {
  public:
    Plot(QPainter& painter, const WaterfallForm& form, const SweepHistory& history, QSize size,
         double dots, const GraphColors& colors)
        : painter_(painter),
          form_(form),
          history_(history),
          size_(size),
          colors_(colors),
          area_(kLeft, kTop, std::max(size.width() - kLeft - kRight, 1),
                std::max(size.height() - kTop - kBottom, 1)),
          dots_(dots) {}

    void paint() {
        painter_.fillRect(QRectF(QPointF(), QSizeF(size_)), colors_.background);
        painter_.setFont(waterfallFont());
        line_ = QFontMetricsF(painter_.font(), painter_.device()).height();
        rows();
        painter_.setPen(QPen(colors_.frame, 1));
        painter_.setBrush(Qt::NoBrush);
        painter_.drawRect(area_);
        frequencies();
        times();
        title();
        const double height = std::min(area_.height(), 320.0);
        paintColourBar(painter_,
                       {area_.right() + 6, area_.center().y() - height / 2, kRight - 12.0, height},
                       ColourMap::ofStyle(kStyle), colourBarText(form_, {}, true),
                       colourBarText(form_, {}, false), colors_);
    }

  private:
    void rows() {
        const int count = history_.count();
        if (count == 0) return;
        const GraphAxis& x = form_.Graph3D.axis(1);
        const GraphAxis& level = form_.Graph3D.axis(3);
        const SpectrogramFrame frame{static_cast<int>(area_.width() * dots_),
                                     x.Minimum,
                                     x.Maximum,
                                     level.Minimum,
                                     level.Maximum,
                                     kStyle};
        QImage image(frame.width, count, QImage::Format_ARGB32);
        for (int i = 0; i < count; ++i)
            SpectrogramImage::draw(history_.row(i), frame,
                                   reinterpret_cast<Pixel*>(image.scanLine(i)));
        painter_.fillRect(area_, colors_.plotArea);
        painter_.drawImage(area_, image);
    }

    void frequencies() {
        const GraphAxis& x = form_.Graph3D.axis(1);
        const double step = tickStep(x.Minimum, x.Maximum, kTicks);
        painter_.setPen(colors_.text);
        for (const double tick : axisTicks(x.Minimum, x.Maximum, kTicks)) {
            const double place =
                area_.left() + (tick - x.Minimum) / (x.Maximum - x.Minimum) * area_.width();
            painter_.drawLine(QPointF(place, area_.bottom()),
                              QPointF(place, area_.bottom() + kTick));
            painter_.drawText(QRectF(place - 60, area_.bottom() + kTick + 2, 120, line_),
                              Qt::AlignCenter,
                              QString::fromStdString(axisNumber(tick, x.Format, step)));
        }
    }

    void times() {
        const int count = history_.count();
        if (count == 0) return;
        const double rowHeight = area_.height() / count;
        double last = -1e9;
        QString shown;
        for (int i = 0; i < count; ++i) {
            const double y = area_.top() + (i + 0.5) * rowHeight;
            if (y - last < kTimeGap * line_) continue;
            const QString time =
                QString::fromStdString(trimmed(history_.row(i).time)).left(kTimeLength);
            if (time == shown) continue;
            shown = time;
            last = y;
            painter_.drawLine(QPointF(area_.left() - kTick, y), QPointF(area_.left(), y));
            painter_.drawText(QRectF(0, y - line_ / 2, area_.left() - kTick - 3, line_),
                              Qt::AlignRight | Qt::AlignVCenter, time);
        }
    }

    void title() {
        const int count = history_.count();
        QString text = count == 0   ? "No sweeps"
                       : count == 1 ? "1 sweep"
                                    : QString("%1 sweeps").arg(count);
        if (count > 0) {
            const QString first = QString::fromStdString(trimmed(history_.row(count - 1).time));
            const QString newest = QString::fromStdString(trimmed(history_.row(0).time));
            if (!first.isEmpty()) text += ", " + first;
            if (newest != first) text += " to " + newest + ", newest at the top";
        }
        painter_.drawText(QRectF(kLeft, 4, area_.width(), kTop - 8),
                          Qt::AlignLeft | Qt::AlignVCenter, text);
    }

    static constexpr int kTimeLength = 8;
    QPainter& painter_;
    const WaterfallForm& form_;
    const SweepHistory& history_;
    QSize size_;
    const GraphColors& colors_;
    QRectF area_;
    double dots_;
    double line_ = 0;
};

}  // namespace

bool saveSpectrogramImage(const WaterfallForm& form, const SweepHistory& history,
                          const QString& path, QString* error, QSize size, bool dark) {
    return savePicture(path, size, error, [&](QPainter& painter, const PictureKind& kind) {
        Plot(painter, form, history, size, kind.dots,
             dark && !kind.paper ? darkGraph() : lightGraph())
            .paint();
    });
}

}  // namespace zel
