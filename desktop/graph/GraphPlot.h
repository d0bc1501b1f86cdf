#pragma once
// Draws a graph with its annotations on a plot: the one look for the screen and for pictures.

#include <qcustomplot.h>

#include <array>

#include "desktop/graph/AnnotationText.h"
#include "platform/Graph.h"
#include "trace/ViewAnnotations.h"

namespace zel {

struct GraphColors {
    QColor background{0x0d, 0x12, 0x18};
    QColor plotArea{0x06, 0x09, 0x0d};
    QColor grid{0x35, 0x42, 0x50};
    QColor frame{0x7a, 0x8a, 0x9a};
    QColor text{0xd8, 0xe0, 0xe8};
    QColor trace{0xff, 0xd8, 0x4d};
    QColor trigger{0xff, 0x6b, 0x6b};
    int cursorDarkness = 100;  ///< percent: cursors are made for a dark ground
};
GraphColors darkGraph();
GraphColors lightGraph();  ///< for paper

/// Owns the items of the plot; the plot itself belongs to the caller.
class GraphPlot {
  public:
    explicit GraphPlot(QCustomPlot& plot, const GraphColors& colors = {});

    /// Takes the data and the texts over; the caller replots.
    void update(const Graph& graph, const ViewAnnotations& view);
    /// In pixels of the plot. One pixel of the device is what Qt draws fast.
    void setTraceWidth(double width) { trace_->setPen(QPen(colors_.trace, width)); }
    /// Ends the trace and all that goes with it at the edges of the graticule, for pictures whose
    /// format has no clip. Holds until the next update.
    void clipToView();
    QCPAxisRect& axisRect() { return *axisRect_; }
    /// The 1-based index of the cursor within reach of a pixel, or 0.
    int cursorAt(const QPointF& pixel) const;
    /// The point of the trace that lies nearest to x; (x, 0) where there is no trace.
    QPointF pointAt(double x) const;

  private:
    struct CursorItems {
        QCPItemStraightLine* line = nullptr;
        QCPItemTracer* point = nullptr;
        bool visible = false;
        double x = 0;
    };
    AnnotationText* addText(QCPLayoutGrid& grid, int row, int column, Qt::Alignment alignment);
    QCPItemText* addNote(double height);
    void takeTrace(const Graph& graph);
    void styleAxes();
    void setRanges(const Graph& graph);
    void strike(const ViewAnnotations& view);

    QCustomPlot& plot_;
    GraphColors colors_;
    QCPAxisRect* axisRect_ = nullptr;
    QCPGraph* trace_ = nullptr;
    std::array<AnnotationText*, 4> top_{};
    std::array<AnnotationText*, 3> bottom_{};
    std::array<CursorItems, 2> cursors_{};
    QCPItemStraightLine* trigger_ = nullptr;
    QCPItemText* triggerText_ = nullptr;
    QCPItemText* old_ = nullptr;
    QCPItemText* incomplete_ = nullptr;
    unsigned long serial_ = 0;
    bool drawn_ = false;
};

QColor colorOf(Color color);

}  // namespace zel
