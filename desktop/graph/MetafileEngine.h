#pragma once
// A paint device whose painter writes a Windows metafile.

#include <QBrush>
#include <QFont>
#include <QPaintDevice>
#include <QPaintEngine>
#include <QPen>
#include <QTransform>
#include <vector>

#include "desktop/graph/MetafileWriter.h"

namespace zel {

/// Lines, polylines, polygons, rectangles, ellipses, text and rectangular clips; a clip of another
/// form counts as the rectangle around it. Fills are plain, pixmaps are left out. Lines end at the
/// clip and at the edge of the picture, dashes are drawn one by one: a pen with a pattern is one
/// dot of the reader's device wide at most.
class MetafileEngine : public QPaintEngine {
  public:
    /// `unitsPerPixel`: the file's units in a pixel of a picture of that size.
    MetafileEngine(MetafileWriter& writer, QSize size, double unitsPerPixel);

    bool begin(QPaintDevice*) override { return true; }
    bool end() override { return true; }
    Type type() const override { return User; }
    void updateState(const QPaintEngineState& now) override;
    using QPaintEngine::drawEllipse;
    using QPaintEngine::drawLines;
    using QPaintEngine::drawPolygon;
    using QPaintEngine::drawRects;
    void drawRects(const QRectF* rects, int count) override;
    void drawLines(const QLineF* lines, int count) override;
    void drawEllipse(const QRectF& rect) override;
    void drawPath(const QPainterPath& path) override;
    void drawPolygon(const QPointF* points, int count, PolygonDrawMode mode) override;
    void drawTextItem(const QPointF& origin, const QTextItem& item) override;
    void drawPixmap(const QRectF&, const QPixmap&, const QRectF&) override {}

  private:
    void takeClip(const QPaintEngineState& now);
    QRectF seen() const;
    double scale() const;
    MetafilePoint unitsOf(const QPointF& pixel) const;
    MetafileRect unitsOf(const QRectF& pixels) const;
    std::vector<MetafilePoint> unitsOf(const QPolygonF& pixels) const;
    bool useClip();
    bool useStroke();
    bool useFill();
    void stroke(const QPolygonF& line);
    void fill(const QPolygonF& outline);

    MetafileWriter& writer_;
    QRectF picture_;
    double unitsPerPixel_;
    QPen pen_;
    QBrush brush_;
    QFont font_;
    QTransform transform_;
    bool clipped_ = false;
    QRectF clip_;  ///< in pixels of the picture
};

/// A picture of that size in pixels, of which `dotsPerInch` make an inch.
class MetafileDevice : public QPaintDevice {
  public:
    MetafileDevice(QSize size, int dotsPerInch);

    QPaintEngine* paintEngine() const override { return &engine_; }
    /// The file, when the painter has ended.
    QByteArray finish() { return writer_.finish(); }

  protected:
    int metric(PaintDeviceMetric metric) const override;

  private:
    QSize size_;
    int dotsPerInch_;
    MetafileWriter writer_;
    mutable MetafileEngine engine_;
};

}  // namespace zel
