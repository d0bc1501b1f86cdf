#include "desktop/graph/WaterfallImage.h"

#include <algorithm>
#include <cstdlib>
#include <string>

#include "desktop/graph/GraphColors.h"
#include "desktop/graph/PictureFile.h"
#include "desktop/graph/WaterfallDrawing.h"
#include "forms/WaterfallForm.h"
#include "platform/Graph3D.h"
#include "waterfall/AxisTicks.h"
#include "waterfall/RowSurface.h"
#include "waterfall/WaterfallPicture.h"

namespace zel {
namespace {

constexpr int kBarWidth = 84;
constexpr int kMargin = 12;
constexpr int kTitleHeight = 22;
constexpr int kLongestBar = 320;

/// "20 sweeps, 12:00:00 to 12:00:10".
QString titleOf(const Graph3D& graph) {
    int rows = 0;
    QString first;
    QString last;
    for (const GraphCurve3D& plot : graph.plots()) {
        if (plot.level.empty()) continue;
        last = QString::fromStdString(plot.time);
        if (rows++ == 0) first = last;
    }
    if (rows == 0) return "No sweeps";
    QString title = rows == 1 ? "1 sweep" : QString::number(rows) + " sweeps";
    if (!first.trimmed().isEmpty()) title += ", " + first;
    if (first != last && !last.trimmed().isEmpty()) title += " to " + last;
    return title;
}

void paintAll(QPainter& painter, const WaterfallForm& form, PictureStyle style, QSize size,
              double dots, const GraphColors& colors) {
    const QRectF whole{QPointF(), QSizeF(size)};
    painter.fillRect(whole, colors.background);
    painter.setFont(waterfallFont());
    const double line = QFontMetricsF(painter.font(), painter.device()).height();
    const QRectF area = whole.adjusted(0, kTitleHeight, -kBarWidth, 0);
    const QSize pixels = area.size().toSize();
    // Lines and texts in pixels of the picture, the rows in dots of the file.
    style.oversampling = 2;
    style.dots = dots;
    const WaterfallPicture picture =
        drawWaterfall(form.Graph3D, style, pixels.width(), pixels.height(), line);
    paintWaterfall(painter, area, picture, colors);
    const double height = std::min<double>(area.height() - 2 * kMargin, kLongestBar);
    paintColourBar(painter,
                   {whole.right() - kBarWidth, area.center().y() - height / 2,
                    static_cast<double>(kBarWidth), height},
                   *picture.map, colourBarText(form, style, true),
                   colourBarText(form, style, false), colors);
    painter.setPen(colors.text);
    painter.setFont(waterfallFont());
    painter.drawText(QRectF(kMargin, 4, whole.width() - 2 * kMargin, kTitleHeight),
                     Qt::AlignLeft | Qt::AlignVCenter, titleOf(form.Graph3D));
}

}  // namespace

QString colourBarText(const WaterfallForm& form, const PictureStyle& style, bool highest) {
    const std::string own = highest ? form.lblMAX.Caption : form.lblMin.Caption;
    if (own.empty()) return {};
    // The unit is the label's own: it stands after the number.
    const RowLimits limits = pictureLimits(form.Graph3D, style);
    const auto blank = own.find(' ');
    const QString unit =
        blank == std::string::npos ? QString() : QString::fromStdString(own.substr(blank));
    const double step = (limits.high - limits.low) / 100;
    return QString::fromStdString(
               axisNumber(highest ? limits.high : limits.low, "", std::abs(step))) +
           unit;
}

bool saveWaterfallImage(const WaterfallForm& form, const PictureStyle& style, const QString& path,
                        QString* error, QSize size, bool dark) {
    return savePicture(path, size, error, [&](QPainter& painter, const PictureKind& kind) {
        paintAll(painter, form, style, size, kind.dots,
                 dark && !kind.paper ? darkGraph() : lightGraph());
    });
}

QImage waterfallImage(const WaterfallForm& form, const PictureStyle& style, QSize size, bool dark) {
    constexpr double kDots = 2;
    QImage image(size * kDots, QImage::Format_RGB32);
    image.setDevicePixelRatio(kDots);
    QPainter painter(&image);
    paintAll(painter, form, style, size, kDots, dark ? darkGraph() : lightGraph());
    return image;
}

}  // namespace zel
