#pragma once
// Keeps the rows of the waterfall in order: their number, their time labels, their styles.

#include <string>

#include "forms/WaterfallForm.h"
#include "platform/Event.h"
#include "platform/Graph3D.h"

namespace zel {

/// The graph's own list of plots is the buffer; there is no store behind it.
class Graph3dOps {
  public:
    /// Answers the form's row calls.
    explicit Graph3dOps(WaterfallForm& form);

    void resetRowCount();
    /// Makes room for the row about to come: at most `depth` plots, and the depth axis moves on.
    void limitRows(Graph3D& graph, int depth);
    /// Counts a row and puts its label on the depth axis: the first row bears one, others when the
    /// text has changed, at most every fourth.
    void stampRow(Graph3D& graph, const std::string& timeText);
    /// Adds the value pair of the row at hand.
    void addRowLabel(Graph3D& graph, bool show, const std::string& text);
    void setProjection(Graph3D& graph, bool isOrthographic);
    void styleLastRow(Graph3D& graph);
    /// Takes the camera over into the set of the mode; the translations into both with `bothSets`.
    void saveGraphView(Graph3D& graph, bool bothSets);
    void clearGraph(Graph3D& graph);

    static constexpr int kWaterfallMap = 1;
    static constexpr int kSpectrogramMap = 4;

  private:
    WaterfallForm& form_;
    Handlers handlers_;
};

}  // namespace zel
