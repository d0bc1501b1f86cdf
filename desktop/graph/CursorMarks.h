#pragma once
// The two cursors of a graph: a line, a point on the trace, number and value beside it.

#include <qcustomplot.h>

#include <array>
#include <cstddef>
#include <functional>
#include <string>

#include "desktop/graph/GraphColors.h"
#include "platform/Graph.h"

namespace zel {

/// The text on a plot, all of it.
QFont plotFont();

class CursorMarks {
  public:
    /// The trace that the cursors stand on.
    struct Trace {
        bool texts = false;     ///< number and value are written, and points stand on the trace
        double resolution = 0;  ///< distance of two points, in the unit of the x axis
        std::string xUnit;
        std::string unit;                       ///< of the levels
        std::function<double(double)> levelAt;  ///< NaN where there is none
    };
    /// The items belong to the plot.
    CursorMarks(QCustomPlot& plot, const GraphColors& colors);

    void place(const Graph& graph, const Trace& trace);
    /// The 1-based index of the cursor within reach of a pixel, or 0.
    int at(const QPointF& pixel) const;
    /// Hides the points outside of the axes.
    void clipToView();

  private:
    struct Items {
        QCPItemStraightLine* line = nullptr;
        QCPItemTracer* point = nullptr;
        QCPItemText* text = nullptr;
        QRectF place;  ///< of the text, in pixels
        bool visible = false;
        double x = 0;
    };
    void write(std::size_t index, const QPointF& point, const Trace& trace);

    QCustomPlot& plot_;
    GraphColors colors_;
    std::array<Items, 2> items_{};
};

}  // namespace zel
