#include "desktop/graph/MetafileEngine.h"

#include <QFontInfo>
#include <QFontMetricsF>
#include <QPainterPath>
#include <QtMath>
#include <algorithm>
#include <cmath>
#include <cstddef>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "desktop/graph/MetafileWriter.h"
#include "desktop/graph/PolylineClip.h"
#include "support/Windows1252.h"

namespace zel {
namespace {

constexpr double kUnitsPerPixel = 20;
constexpr double kLargestExtent = 32000;
constexpr double kPointsPerInch = 72;
constexpr double kMillimetresPerInch = 25.4;

/// Families that Windows knows, in place of those with the same widths.
constexpr std::pair<const char*, const char*> kFaces[] = {
    {"DejaVu Sans", "Verdana"},   {"Bitstream Vera Sans", "Verdana"},
    {"Liberation Sans", "Arial"}, {"Nimbus Sans", "Arial"},
    {"Helvetica", "Arial"},
};

std::string faceOf(const QFont& font) {
    const QString family = QFontInfo(font).family();
    for (const auto& [known, face] : kFaces)
        if (family.compare(QLatin1String(known), Qt::CaseInsensitive) == 0) return face;
    return metafileText(family);
}

MetafileColor colorOf(const QColor& color) {
    return static_cast<MetafileColor>(color.red() | color.green() << 8 | color.blue() << 16);
}

double unitsFor(QSize size) {
    return std::min(kUnitsPerPixel, kLargestExtent / std::max({size.width(), size.height(), 1}));
}

/// The drawn pieces of a line; `pattern` holds the lengths of dash and gap in turn, in pixels.
std::vector<QPolygonF> dashesOf(const QPolygonF& line, const QList<double>& pattern,
                                double offset) {
    std::vector<QPolygonF> pieces;
    double total = 0;
    for (const double length : pattern) total += length;
    if (total <= 0 || pattern.size() % 2 != 0 || line.isEmpty()) return {line};
    qsizetype at = 0;
    double left = std::fmod(offset, total);
    if (left < 0) left += total;
    while (left >= pattern[at]) {
        left -= pattern[at];
        at = (at + 1) % pattern.size();
    }
    left = pattern[at] - left;
    if (at % 2 == 0) pieces.push_back({line.front()});
    for (qsizetype i = 0; i + 1 < line.size(); ++i) {
        const QLineF way(line[i], line[i + 1]);
        const double length = way.length();
        double done = 0;
        while (length - done > left) {
            done += left;
            const QPointF turn = way.pointAt(done / length);
            if (at % 2 == 0) {
                pieces.back().append(turn);
            } else {
                pieces.push_back({turn});
            }
            at = (at + 1) % pattern.size();
            left = pattern[at];
        }
        left -= length - done;
        if (at % 2 == 0) pieces.back().append(line[i + 1]);
    }
    return pieces;
}

}  // namespace

MetafileEngine::MetafileEngine(MetafileWriter& writer, QSize size, double unitsPerPixel)
    : QPaintEngine(AllFeatures),
      writer_(writer),
      picture_(QPointF(), size),
      unitsPerPixel_(unitsPerPixel) {}

void MetafileEngine::updateState(const QPaintEngineState& now) {
    const DirtyFlags dirty = now.state();
    if (dirty & DirtyPen) pen_ = now.pen();
    if (dirty & DirtyBrush) brush_ = now.brush();
    if (dirty & DirtyFont) font_ = now.font();
    if (dirty & DirtyTransform) transform_ = now.transform();
    if (dirty & (DirtyClipRegion | DirtyClipPath)) takeClip(now);
    if (dirty & DirtyClipEnabled) clipped_ = now.isClipEnabled();
}

void MetafileEngine::takeClip(const QPaintEngineState& now) {
    const bool region = now.state().testFlag(DirtyClipRegion);
    const QRectF box =
        region ? QRectF(now.clipRegion().boundingRect()) : now.clipPath().boundingRect();
    const QRectF clip = now.transform().mapRect(box);
    const bool on = now.clipOperation() != Qt::NoClip;
    if (on && clipped_ && now.clipOperation() == Qt::IntersectClip) {
        clip_ &= clip;
    } else {
        clip_ = clip;
    }
    clipped_ = on;
}

/// Where ink can be.
QRectF MetafileEngine::seen() const { return clipped_ ? clip_ & picture_ : picture_; }

/// Pixels of the picture in a unit of the painter.
double MetafileEngine::scale() const { return std::sqrt(std::fabs(transform_.determinant())); }

MetafilePoint MetafileEngine::unitsOf(const QPointF& pixel) const {
    const auto units = [this](double value) {
        return static_cast<int>(std::lround(std::clamp(value * unitsPerPixel_, -32768.0, 32767.0)));
    };
    return {units(pixel.x()), units(pixel.y())};
}

MetafileRect MetafileEngine::unitsOf(const QRectF& pixels) const {
    const MetafilePoint first = unitsOf(pixels.topLeft());
    const MetafilePoint last = unitsOf(pixels.bottomRight());
    return {first.x, first.y, last.x, last.y};
}

std::vector<MetafilePoint> MetafileEngine::unitsOf(const QPolygonF& pixels) const {
    std::vector<MetafilePoint> points;
    points.reserve(static_cast<std::size_t>(pixels.size()));
    for (const QPointF& pixel : pixels) points.push_back(unitsOf(pixel));
    return points;
}

/// False when nothing can be seen.
bool MetafileEngine::useClip() {
    if (seen().isEmpty()) return false;
    writer_.setClip(clipped_ ? std::optional(unitsOf(seen())) : std::nullopt);
    return true;
}

bool MetafileEngine::useStroke() {
    if (pen_.style() == Qt::NoPen || pen_.color().alpha() == 0 || !useClip()) return false;
    const double width =
        std::max(pen_.widthF(), pen_.widthF() > 0 ? 0.0 : 1.0) * (pen_.isCosmetic() ? 1 : scale());
    writer_.selectPen({MetafilePen::Solid,
                       std::max(1, static_cast<int>(std::lround(width * unitsPerPixel_))),
                       colorOf(pen_.color())});
    return true;
}

bool MetafileEngine::useFill() {
    if (brush_.style() == Qt::NoBrush || brush_.color().alpha() == 0 || !useClip()) return false;
    writer_.selectPen({MetafilePen::Null, 0, 0});
    writer_.selectBrush(colorOf(brush_.color()));
    return true;
}

/// `line` in pixels of the picture.
void MetafileEngine::stroke(const QPolygonF& line) {
    if (!useStroke()) return;
    const double width = std::max(1.0, pen_.widthF()) * (pen_.isCosmetic() ? 1 : scale());
    QList<double> pattern;
    if (pen_.style() != Qt::SolidLine)
        for (const double length : pen_.dashPattern()) pattern << length * width;
    for (const QPolygonF& part : clipPolyline(line, seen())) {
        if (pattern.isEmpty()) {
            writer_.polyline(unitsOf(part));
            continue;
        }
        for (const QPolygonF& dash : dashesOf(part, pattern, pen_.dashOffset() * width))
            writer_.polyline(unitsOf(dash));
    }
}

void MetafileEngine::fill(const QPolygonF& outline) {
    if (!useFill()) return;
    const QPolygonF inside = outline.intersected(seen());
    if (inside.size() > 2) writer_.polygon(unitsOf(inside));
}

void MetafileEngine::drawRects(const QRectF* rects, int count) {
    for (int i = 0; i < count; ++i) {
        const QPolygonF corners = transform_.map(QPolygonF(rects[i]));
        if (transform_.type() > QTransform::TxScale) {
            fill(corners);
        } else if (const QRectF inside = corners.boundingRect() & seen();
                   !inside.isEmpty() && useFill()) {
            writer_.rectangle(unitsOf(inside));
        }
        stroke(corners);
    }
}

void MetafileEngine::drawLines(const QLineF* lines, int count) {
    for (int i = 0; i < count; ++i)
        stroke({transform_.map(lines[i].p1()), transform_.map(lines[i].p2())});
}

void MetafileEngine::drawEllipse(const QRectF& rect) {
    const QRectF box = transform_.mapRect(rect);
    const bool plain = transform_.type() <= QTransform::TxScale && picture_.contains(box) &&
                       pen_.style() <= Qt::SolidLine;
    if (!plain) {
        QPainterPath path;
        path.addEllipse(rect);
        return drawPath(path);
    }
    if (!box.intersects(seen())) return;
    if (useFill()) writer_.ellipse(unitsOf(box));
    if (!useStroke()) return;
    writer_.selectBrush({});
    writer_.ellipse(unitsOf(box));
}

void MetafileEngine::drawPath(const QPainterPath& path) {
    for (const QPolygonF& outline : path.toFillPolygons(transform_)) fill(outline);
    for (const QPolygonF& line : path.toSubpathPolygons(transform_)) stroke(line);
}

void MetafileEngine::drawPolygon(const QPointF* points, int count, PolygonDrawMode mode) {
    QPolygonF line(QList<QPointF>(points, points + count));
    line = transform_.map(line);
    if (mode != PolylineMode) {
        fill(line);
        if (!line.isEmpty()) line.append(line.front());
    }
    stroke(line);
}

void MetafileEngine::drawTextItem(const QPointF& origin, const QTextItem& item) {
    const std::string bytes = metafileText(item.text());
    if (bytes.empty() || pen_.style() == Qt::NoPen || !useClip()) return;
    const QFont font = item.font();
    const double pixels = font.pixelSize() > 0
                              ? font.pixelSize()
                              : font.pointSizeF() * paintDevice()->logicalDpiY() / kPointsPerInch;
    const double factor = scale() * unitsPerPixel_;
    const double turn = qRadiansToDegrees(std::atan2(-transform_.m12(), transform_.m11()));
    writer_.selectFont({static_cast<int>(std::lround(pixels * factor)),
                        static_cast<int>(std::lround(turn * 10)), static_cast<int>(font.weight()),
                        font.italic(), font.underline(), font.strikeOut(), faceOf(font)});
    writer_.setTextColor(colorOf(pen_.color()));
    // The place of each character is given, so that the text has its width with any font. Readers
    // differ in what that means in a turned line.
    const QFontMetricsF metrics(font, paintDevice());
    const QString written = QString::fromStdString(fromWindows1252(bytes));
    std::vector<int> advances;
    long before = 0;
    for (qsizetype i = 1; i <= written.size() && transform_.type() <= QTransform::TxScale; ++i) {
        const long end = std::lround(metrics.horizontalAdvance(written.left(i)) * factor);
        advances.push_back(static_cast<int>(end - before));
        before = end;
    }
    writer_.text(unitsOf(transform_.map(origin)), bytes, advances);
}

MetafileDevice::MetafileDevice(QSize size, int dotsPerInch)
    : size_(size),
      dotsPerInch_(dotsPerInch),
      writer_(static_cast<int>(std::lround(size.width() * unitsFor(size))),
              static_cast<int>(std::lround(size.height() * unitsFor(size))),
              static_cast<int>(std::lround(dotsPerInch * unitsFor(size)))),
      engine_(writer_, size, unitsFor(size)) {}

int MetafileDevice::metric(PaintDeviceMetric metric) const {
    const auto millimetres = [this](int pixels) {
        return static_cast<int>(std::lround(pixels * kMillimetresPerInch / dotsPerInch_));
    };
    switch (metric) {
        case PdmWidth:
            return size_.width();
        case PdmHeight:
            return size_.height();
        case PdmWidthMM:
            return millimetres(size_.width());
        case PdmHeightMM:
            return millimetres(size_.height());
        case PdmDpiX:
        case PdmDpiY:
        case PdmPhysicalDpiX:
        case PdmPhysicalDpiY:
            return dotsPerInch_;
        case PdmDepth:
            return 24;
        case PdmNumColors:
            return 1 << 24;
        case PdmDevicePixelRatio:
            return 1;
        case PdmDevicePixelRatioScaled:
            return static_cast<int>(devicePixelRatioFScale());
        default:
            return QPaintDevice::metric(metric);
    }
}

}  // namespace zel
