#include "desktop/graph/WaterfallDrawing.h"

#include <QFontMetricsF>
#include <algorithm>
#include <vector>

#include "desktop/graph/GraphColors.h"
#include "waterfall/ColourMap.h"
#include "waterfall/SurfaceRenderer.h"
#include "waterfall/WaterfallPicture.h"

namespace zel {
namespace {

constexpr int kFontPoints = 9;

QPen penOf(PictureLine::Kind kind, const GraphColors& colors) {
    switch (kind) {
        case PictureLine::Kind::Grid:
            return {colors.grid, 1};
        case PictureLine::Kind::Frame:
        case PictureLine::Kind::Tick:
            return {colors.frame, 1};
        case PictureLine::Kind::Marker:
            break;
    }
    return {colors.text, 2};
}

void paintLines(QPainter& painter, const std::vector<PictureLine>& lines,
                const GraphColors& colors) {
    for (const PictureLine& line : lines) {
        painter.setPen(penOf(line.kind, colors));
        painter.drawLine(QPointF(line.from.x, line.from.y), QPointF(line.to.x, line.to.y));
    }
}

void paintText(QPainter& painter, const PictureText& text, const GraphColors& colors) {
    const QString words = QString::fromStdString(text.text);
    const QFontMetricsF metrics(painter.font(), painter.device());
    const double width = metrics.horizontalAdvance(words);
    const double height = metrics.height();
    const QRectF place(text.at.x - width * (1 - text.right) / 2,
                       text.at.y - height * (1 - text.down) / 2, width, height);
    if (text.marker) {
        // On the rows, whose colours may be any.
        QColor ground = colors.background;
        ground.setAlphaF(0.75F);
        painter.fillRect(place.adjusted(-3, 0, 3, 0), ground);
    }
    painter.setPen(colors.text);
    painter.drawText(place.adjusted(-2, 0, 2, 0), Qt::AlignCenter | Qt::TextDontClip, words);
}

}  // namespace

QFont waterfallFont() {
    QFont font;
    font.setPointSize(kFontPoints);
    return font;
}

void paintWaterfall(QPainter& painter, const QRectF& area, const WaterfallPicture& picture,
                    const GraphColors& colors) {
    painter.save();
    painter.setClipRect(area);
    painter.translate(area.topLeft());
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setFont(waterfallFont());
    paintLines(painter, picture.behind, colors);
    const SurfaceImage& rows = picture.rows;
    const QImage image(reinterpret_cast<const uchar*>(rows.pixels.data()), rows.width, rows.height,
                       rows.width * static_cast<int>(sizeof(Pixel)),
                       QImage::Format_ARGB32_Premultiplied);
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    painter.drawImage(QRectF(QPointF(), area.size()), image);
    paintLines(painter, picture.before, colors);
    for (const PictureText& text : picture.texts) paintText(painter, text, colors);
    painter.restore();
}

void paintColourBar(QPainter& painter, const QRectF& area, const ColourMap& map,
                    const QString& highest, const QString& lowest, const GraphColors& colors) {
    QImage strip(1, ColourMap::kColours, QImage::Format_RGB32);
    for (int i = 0; i < ColourMap::kColours; ++i)
        strip.setPixel(0, ColourMap::kColours - 1 - i, map.colour(i));
    painter.save();
    painter.setFont(waterfallFont());
    const double line = QFontMetricsF(painter.font(), painter.device()).height();
    const QRectF bar(area.center().x() - 8, area.top() + line + 4, 16,
                     std::max(area.height() - 2 * (line + 4), 1.0));
    painter.drawImage(bar, strip);
    painter.setPen(QPen(colors.frame, 1));
    painter.setBrush(Qt::NoBrush);
    painter.drawRect(bar);
    painter.setPen(colors.text);
    const auto flags = Qt::AlignHCenter | Qt::AlignVCenter | Qt::TextDontClip;
    painter.drawText(QRectF(area.left(), area.top(), area.width(), line), flags, highest);
    painter.drawText(QRectF(area.left(), area.bottom() - line, area.width(), line), flags, lowest);
    painter.restore();
}

}  // namespace zel
