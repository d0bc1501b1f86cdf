#pragma once
// The two-dimensional graph and the three-dimensional graph as data.

#include <array>
#include <cstddef>
#include <deque>
#include <string>
#include <utility>
#include <vector>

#include "platform/Form.h"

namespace zel {

/// An axis: its range in the unit of the data, and how its labels look.
struct GraphAxis {
    double Minimum = 0;
    double Maximum = 1;
    bool ShowLabels = true;
    std::string Format;  ///< k"Hz" scales by engineering prefix and appends the quoted text
    Color LabelColor = kWindowText;
};

struct GraphCursor {
    double X = 0;
    double Y = 0;
    Color color = 0;
    bool Visible = false;
};

/// A caption with a horizontal line at `Height`, in the unit of the y axis.
struct GraphAnnotation {
    std::string Caption;
    double Height = 0;
    bool Visible = false;
};

enum class TrackMode : int { Plain = 1, DragCursors = 2, ZoomRectangle = 7 };

/// One plot, two axes, cursors and the annotation "Trigger". Routines change the fields and call
/// the setters; the front end draws on `Changed`.
class Graph : public Control {
  public:
    Graph(Form& form, std::string name) : Control(form, std::move(name), ControlKind::Graph) {}

    const GraphAxis& xAxis() const { return x_; }
    const GraphAxis& yAxis() const { return y_; }
    void setXRange(double minimum, double maximum);
    void setYRange(double minimum, double maximum);
    void showYLabels(bool show);

    /// Replaces the plot: value i lies at x first + i * increment.
    void plotY(const std::vector<double>& values, double firstX, double increment);
    void clearPlot();
    const std::vector<double>& values() const { return values_; }
    double firstX() const { return firstX_; }
    double increment() const { return increment_; }
    /// Counts the plots made; a front end compares it to see that the data is new.
    unsigned long plotSerial() const { return plotSerial_; }

    Property<int> TrackMode{this, 1};
    /// The picture is older than it should be, and says so.
    Property<bool> Old{this, false};

    int cursorCount() const { return static_cast<int>(cursors_.size()); }
    /// 1-based as the panel counts them; an index out of range gives a cursor that nobody sees.
    const GraphCursor& cursor(int index) const;
    void removeCursors();
    void addCursor(const GraphCursor& cursor);
    void moveCursor(int index, double x, double y);
    void colorCursor(int index, Color color);
    void showCursor(int index, bool visible);

    const GraphAnnotation& trigger() const { return trigger_; }
    void setTrigger(const GraphAnnotation& annotation);

    void Refresh() { noteChange(); }

    /// A user moved a cursor: its 1-based index, x and y.
    Event<int, double, double> CursorMoved;
    Event<int, int> KeyDown;                 ///< key code, shift
    Event<double, double> PlotAreaTracking;  ///< the pointer over the plot area: x, y
    Event<> ZoomFinished;                    ///< behind a zoom rectangle, the axes already set

  private:
    GraphAxis x_;
    GraphAxis y_{-120, -20, true, "", kWindowText};
    std::vector<double> values_;
    double firstX_ = 0;
    double increment_ = 0;
    unsigned long plotSerial_ = 0;
    std::vector<GraphCursor> cursors_;
    GraphAnnotation trigger_;
};

/// A curve of the three-dimensional graph, four arrays of one length.
struct GraphCurve3D {
    std::vector<double> depth;
    std::vector<double> x;
    std::vector<double> level;
    std::vector<double> colour;  ///< 0 to 100
    bool lineVisible = true;
    int fillStyle = 0;
    int colorMapStyle = 0;
};

/// A label of an axis: a text at a value.
struct ValuePair {
    std::string Name;
    double Value = 0;
};

/// Axis 1 is depth or frequency as the waterfall sets it, axis 2 follows the x axis of the
/// two-dimensional graph, axis 3 its y axis. It always holds at least one plot.
class Graph3D : public Control {
  public:
    Graph3D(Form& form, std::string name)
        : Control(form, std::move(name), ControlKind::Graph3D), plots_(1) {
        axes_[2].Minimum = -120;
        axes_[2].Maximum = -20;
    }

    const GraphAxis& axis(int index) const { return axes_.at(static_cast<std::size_t>(index - 1)); }
    void setRange(int index, double minimum, double maximum);
    void setFormat(int index, const std::string& format);
    void setLabelColor(int index, Color color);

    std::vector<ValuePair>& valuePairs(int index) {
        return pairs_.at(static_cast<std::size_t>(index - 1));
    }
    void clearValueLabels(int index);

    int plotCount() const { return static_cast<int>(plots_.size()); }
    std::deque<GraphCurve3D>& plots() { return plots_; }
    void removePlots() {
        plots_.clear();
        noteChange();
    }
    void removePlot(int position);  ///< 1-based
    void addPlot() {
        plots_.emplace_back();
        noteChange();
    }
    /// Plots a curve into the newest plot.
    void plotCurve(const std::vector<double>& depth, const std::vector<double>& x,
                   const std::vector<double>& level, const std::vector<double>& colour);

  private:
    std::array<GraphAxis, 3> axes_;
    std::array<std::vector<ValuePair>, 3> pairs_;
    std::deque<GraphCurve3D> plots_;
};

}  // namespace zel
