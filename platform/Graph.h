#pragma once
// The two-dimensional graph as data.

#include <string>
#include <utility>
#include <vector>

#include "platform/Event.h"
#include "platform/Form.h"
#include "platform/Property.h"

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

    /// Replaces the plot: value i lies at x first + i * increment. A value that is no number is a
    /// gap.
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
    /// What the trace is, where it is not the last sweep; the next plot takes it away.
    Property<std::string> Note{this, ""};
    /// Stands over a trace of which samples are missing ("INCOMPLETE 150/301"); else empty.
    Property<std::string> Incomplete{this, ""};

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
    Event<> ZoomFinished;                    ///< after a zoom rectangle, the axes already set

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

}  // namespace zel
