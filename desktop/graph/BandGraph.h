#pragma once
// The line of the maxima over the band down to the line of the minima.

#include <qcustomplot.h>

namespace zel {

/// On the screen the band is filled column by column of pixels, which costs a tenth of one filled
/// polygon. Both lines have the same keys; the lower one is the channel fill graph.
class BandGraph : public QCPGraph {
  public:
    BandGraph(QCPAxis* x, QCPAxis* y);

    /// The columns of the fill that are seen, in pixels of a device that has `scale` pixels a pixel
    /// of the widget; none beside a point that did not come. Needs the channel fill graph.
    QVector<QRect> columns(double scale) const;

  protected:
    void drawFill(QCPPainter* painter, QVector<QPointF>* lines) const override;
};

}  // namespace zel
