#pragma once
// The graph on the screen: drawing, zoom rectangle, pointer readout, movable cursors, looking
// closer with wheel and keys.

#include <qcustomplot.h>

#include <functional>
#include <memory>
#include <optional>
#include <string>

#include "desktop/graph/GraphNavigator.h"
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
    /// With a navigator wheel, middle button and keys change the view.
    void setNavigator(GraphNavigator* navigator) { navigator_ = navigator; }
    /// Both axes as they were before the user looked closer.
    void wholeView();
    /// The level axis from `bottom` to `top`, as a step of the history.
    void showLevels(double bottom, double top);
    /// Where the trace is drawn, in pixels of the widget.
    QRect plotArea() const { return picture_->axisRect().rect(); }
    const GraphPlot& picture() const { return *picture_; }
    void setSource(const QString& name) { picture_->setSource(name); }
    void setChannel(double left, double right) { picture_->setChannel(left, right); }

    /// The pointer is over the plot at that x (in the axis' unit), or has left it.
    std::function<void(std::optional<double>)> pointed;
    /// Before and after the text of the pointer is written.
    std::function<void(bool before)> tracking;
    /// The number of the host's marker within reach of a pixel, 0 for none; it is dragged to an x.
    std::function<int(const QPointF&)> hostMarkerAt;
    std::function<void(int number, double x)> hostMarkerMoved;
    /// What the user does to the graph, as a line of a panel session: "move2d 1 9e8 -30".
    std::function<void(const std::string&)> told;
    /// A menu is asked for at a place of the screen; x is where the pointer is on the axis.
    std::function<void(QPoint, double)> menuAsked;

  protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void contextMenuEvent(QContextMenuEvent* event) override;
    void leaveEvent(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void keyReleaseEvent(QKeyEvent* event) override;

  private:
    /// The graph's state into the picture.
    void takeGraph();
    /// Position and level under a pixel, or that the pointer is elsewhere.
    void track(const QPointF& pixel);
    bool zooming() const;
    bool navigate(const QKeyEvent& event);
    void panTo(const QPointF& pixel);
    /// The pointer's shape: a cross while a rectangle is awaited, arrows over a cursor to drag.
    void showPointer(const QPointF& pixel);
    void moveCursor(int index, double x);
    void tell(const char* word, std::initializer_list<double> numbers);
    void finishZoom(const QRect& rectangle);
    QPointF clamped(const QPointF& pixel);

    Graph& graph_;
    std::function<ViewAnnotations()> annotate_;
    std::unique_ptr<GraphPlot> picture_;
    GraphNavigator* navigator_ = nullptr;
    QRubberBand* band_;
    QPoint bandStart_;
    int dragged_ = 0;
    int hostDragged_ = 0;  ///< marker of the host
    bool spaceHeld_ = false;
    std::optional<QPointF> pointer_;  ///< pixel of the pointer over the plot
    std::optional<QPointF> panFrom_;  ///< pixel where the pan has got to
};

}  // namespace zel
