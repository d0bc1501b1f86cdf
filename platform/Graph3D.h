#pragma once
// The three-dimensional graph as data: rows of levels, three axes, cursors and a camera.

#include <array>
#include <cstddef>
#include <deque>
#include <string>
#include <vector>

#include "platform/Event.h"
#include "platform/Form.h"
#include "platform/Graph.h"
#include "platform/Property.h"

namespace zel {

/// A curve of the graph, four arrays of one length; it has no points until it is plotted.
struct GraphCurve3D {
    std::vector<double> depth;
    std::vector<double> x;
    std::vector<double> level;
    std::vector<double> colour;  ///< 0 to 100
    bool lineVisible = true;
    int fillStyle = 0;
    int colorMapStyle = 0;
    int row = 0;       ///< number of the row as it was stamped, from 1; 0 without a stamp
    std::string time;  ///< as it was stamped: "12:30:05"
};

/// A label of an axis: a text at a value.
struct ValuePair {
    std::string Name;
    double Value = 0;
};

/// The value pairs of an axis, counted from 1. The newest `kKept` are kept; of the older ones
/// nothing is left but their number.
class ValuePairs {
  public:
    static constexpr int kKept = 4096;

    int count() const { return dropped_ + static_cast<int>(pairs_.size()); }
    bool empty() const { return count() == 0; }
    int first() const { return dropped_ + 1; }  ///< the oldest that is kept
    /// A pair without a name where there is none.
    const ValuePair& item(int index) const;
    /// Lengthens the list with empty pairs up to `index`.
    void set(int index, ValuePair pair);
    void clear();

  private:
    std::deque<ValuePair> pairs_;
    int dropped_ = 0;
};

/// A point of a plot that the user marked. It is free until it was placed.
struct GraphCursor3D {
    double X = 0;  ///< frequency, in the unit of axis 1
    double Y = 0;  ///< depth
    double Z = 0;  ///< level
    int row = 0;   ///< of the plot that it sits on
    bool placed = false;
    std::string Name;
    bool NameVisible = false;
    Color PointColor = 0;
    Color CrosshairColor = 0;
    int PointStyle = 0;
    int CrosshairStyle = 0;
};

/// Where the graph is seen from. Angles in degrees, latitude from the vertical and longitude
/// around it; the translation is the point at the picture's centre, in a box of 12 x 10 x 10.
struct GraphView3D {
    double Latitude = 58;
    double Longitude = -325;
    double Distance = 2.8;
    double TransX = 6.6149042722513;
    double TransY = 5.32275199885264;
    double TransZ = 3.29047348804768;

    bool operator==(const GraphView3D&) const = default;
};

enum class MouseMode3D : int { PlaceCursor = 1, MoveView = 20 };
enum class Projection3D : int { Perspective = 0, Orthographic = 1 };

/// Axis 1 is frequency, axis 2 depth, which carries rows, axis 3 level. It always holds at least
/// one plot, and the first one is empty.
class Graph3D : public Control {
  public:
    Graph3D(Form& form, std::string name);

    const GraphAxis& axis(int index) const { return axes_.at(static_cast<std::size_t>(index - 1)); }
    void setRange(int index, double minimum, double maximum);
    void setFormat(int index, const std::string& format);
    void setLabelColor(int index, Color color);
    /// Of the level axis: ticks with their numbers, the grid.
    Property<bool> LevelTicks{this, true};
    Property<bool> LevelGrid{this, true};

    const ValuePairs& valuePairs(int index) const {
        return pairs_.at(static_cast<std::size_t>(index - 1));
    }
    void setValuePair(int index, int pair, ValuePair value);
    void clearValueLabels(int index);

    int plotCount() const { return static_cast<int>(plots_.size()); }
    const std::deque<GraphCurve3D>& plots() const { return plots_; }
    std::deque<GraphCurve3D>& plots() { return plots_; }
    /// Whether any plot has points.
    bool hasRows() const { return lastRow() != nullptr; }
    /// The newest plot that has points; null without any.
    const GraphCurve3D* lastRow() const;
    void removePlots();
    void removePlot(int position);  ///< 1-based
    void addPlot();
    /// The stamp that the next curve takes.
    void stampNext(int row, std::string time);
    /// Plots a curve into the last plot if that is empty, else into a new one after it.
    void plotCurve(std::vector<double> depth, std::vector<double> x, std::vector<double> level,
                   std::vector<double> colour);
    /// A curve was plotted: the last plot holds it.
    Event<> Plotted;
    /// Counts what changes the rows; a front compares it to see that they are new.
    unsigned long rowsSerial() const { return rowsSerial_; }
    /// A plot was changed in place.
    void noteRows();

    const GraphView3D& view() const { return view_; }
    void setView(const GraphView3D& view);
    Property<Projection3D> Projection{this, Projection3D::Perspective};
    Property<double> PerspectiveFactor{this, 1.0};
    Property<MouseMode3D> MouseMode{this, MouseMode3D::MoveView};

    const std::vector<GraphCursor3D>& cursors() const { return cursors_; }
    void addCursor();
    void removeLastCursor();
    void removeCursors();
    /// 0-based.
    void setCursor(std::size_t index, GraphCursor3D cursor);

    Event<> Clicked;
    /// The mouse ended such a movement; the view is set already.
    Event<> TranslationEnded;
    Event<> RotationEnded;
    Event<> ZoomEnded;
    /// The free cursor landed on that point of that plot, both counted from 1.
    Event<int, int> CursorPlaced;

  private:
    std::array<GraphAxis, 3> axes_;
    std::array<ValuePairs, 3> pairs_;
    std::deque<GraphCurve3D> plots_;
    std::vector<GraphCursor3D> cursors_;
    GraphView3D view_;
    int nextRow_ = 0;
    std::string nextTime_;
    unsigned long rowsSerial_ = 0;
};

}  // namespace zel
