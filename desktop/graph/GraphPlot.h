#pragma once
// Draws a graph with its annotations on a plot: the one look for the screen and for pictures.

#include <qcustomplot.h>

#include <array>
#include <memory>
#include <utility>

#include "desktop/graph/AnnotationText.h"
#include "desktop/graph/CursorMarks.h"
#include "desktop/graph/GraphColors.h"
#include "platform/Graph.h"
#include "trace/ViewAnnotations.h"

namespace zel {

/// Owns the items of the plot; the plot itself belongs to the caller. Pairs of the auto peak
/// detector are a band from the lowest to the highest level of each point.
class GraphPlot {
  public:
    explicit GraphPlot(QCustomPlot& plot, const GraphColors& colors = {});

    /// Takes the data and the texts over; the caller replots.
    void update(const Graph& graph, const ViewAnnotations& view);
    /// In pixels of the plot. One pixel of the device is what Qt draws fast.
    void setTraceWidth(double width) { width_ = width; }
    /// What the trace was loaded from, for a line of its own over the graticule; empty for a sweep
    /// of the instrument.
    void setSource(const QString& name);
    /// Shades a stretch of the x axis; nothing where both ends are the same.
    void setChannel(double left, double right);
    /// Writes number and value at the markers that are shown.
    void setMarkerTexts(bool shown) { markerTexts_ = shown; }
    /// Ends the trace and all that goes with it at the edges of the graticule, for pictures whose
    /// format has no clip. Holds until the next update.
    void clipToView();
    QCPAxisRect& axisRect() { return *axisRect_; }
    /// The 1-based index of the cursor within reach of a pixel, or 0.
    int cursorAt(const QPointF& pixel) const { return cursors_->at(pixel); }
    /// The point of the trace that lies nearest to x; (x, 0) where there is no trace.
    QPointF pointAt(double x) const;
    /// The samples at x: the nearest one, of a pair its minimum and maximum. NaN where there is
    /// none.
    std::pair<double, double> levelsAt(double x) const;
    /// Distance of two points of the trace, in the unit of the x axis.
    double resolution() const { return resolution_; }
    const ViewAnnotations& view() const { return view_; }

  private:
    AnnotationText* addText(QCPLayoutGrid& grid, int row, int column, Qt::Alignment alignment);
    QCPItemText* addNote(double height);
    void takeTrace(const Graph& graph);
    void styleAxes();
    void setRanges(const Graph& graph);
    void strike(const ViewAnnotations& view);
    void fillWithin(const QRectF& view);
    QColor bandInk(const QColor& line) const;
    void fitSource();

    QCustomPlot& plot_;
    GraphColors colors_;
    QCPAxisRect* axisRect_ = nullptr;
    QCPGraph* trace_ = nullptr;
    std::array<AnnotationText*, 4> top_{};
    std::array<AnnotationText*, 3> bottom_{};
    std::unique_ptr<CursorMarks> cursors_;
    QCPItemStraightLine* trigger_ = nullptr;
    QCPItemText* triggerText_ = nullptr;
    QCPItemText* old_ = nullptr;
    QCPItemText* incomplete_ = nullptr;
    QCPGraph* low_ = nullptr;  ///< the lower edge of the band
    AnnotationText* source_ = nullptr;
    QString sourceName_;
    QCPItemRect* channel_ = nullptr;
    QList<QPointF> points_;  ///< of the trace, each value for itself
    ViewAnnotations view_;
    double resolution_ = 0;
    double width_ = 1;
    bool paired_ = false;
    bool markerTexts_ = false;
    unsigned long serial_ = 0;
    bool drawn_ = false;
};

}  // namespace zel
