#pragma once
// The graph on the screen: drawing, zoom rectangle, pointer readout, movable cursors.

#include <qcustomplot.h>

#include <functional>
#include <memory>

#include "desktop/graph/GraphPlot.h"
#include "platform/Graph.h"
#include "trace/ViewAnnotations.h"

namespace zel {

class GraphWidget : public QCustomPlot {
  public:
    GraphWidget(Graph& graph, std::function<ViewAnnotations()> annotate, QWidget* parent = nullptr);

    /// Takes the graph's state over and draws it with the next frame.
    void refresh();
    /// Draws at once.
    void drawNow();
    /// Both axes as they were before the user looked closer.
    void wholeView() {}
    /// Where the trace is drawn, in pixels of the widget.
    QRect plotArea() const { return picture_->axisRect().rect(); }

  protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

  private:
    bool zooming() const;
    /// The pointer's shape: a cross while a rectangle is awaited, arrows over a cursor to drag.
    void showPointer(const QPointF& pixel);
    void moveCursor(int index, double x);
    void finishZoom(const QRect& rectangle);
    QPointF clamped(const QPointF& pixel);

    Graph& graph_;
    std::function<ViewAnnotations()> annotate_;
    std::unique_ptr<GraphPlot> picture_;
    QRubberBand* band_;
    QPoint bandStart_;
    int dragged_ = 0;
};

}  // namespace zel
