#include "platform/Graph.h"

#include <cstddef>
#include <vector>

#include "platform/Form.h"

namespace zel {

void Graph::setXRange(double minimum, double maximum) {
    if (x_.Minimum == minimum && x_.Maximum == maximum) return;
    x_.Minimum = minimum;
    x_.Maximum = maximum;
    noteChange();
}

void Graph::setYRange(double minimum, double maximum) {
    if (y_.Minimum == minimum && y_.Maximum == maximum) return;
    y_.Minimum = minimum;
    y_.Maximum = maximum;
    noteChange();
}

void Graph::showYLabels(bool show) {
    if (y_.ShowLabels == show) return;
    y_.ShowLabels = show;
    noteChange();
}

void Graph::plotY(const std::vector<double>& values, double firstX, double increment) {
    values_ = values;
    firstX_ = firstX;
    increment_ = increment;
    ++plotSerial_;
    Note = "";
    noteChange();
}

void Graph::clearPlot() { plotY({}, 0, 0); }

const GraphCursor& Graph::cursor(int index) const {
    static const GraphCursor none;
    if (index < 1 || index > cursorCount()) return none;
    return cursors_[static_cast<std::size_t>(index - 1)];
}

void Graph::removeCursors() {
    cursors_.clear();
    noteChange();
}

void Graph::addCursor(const GraphCursor& cursor) {
    cursors_.push_back(cursor);
    noteChange();
}

void Graph::moveCursor(int index, double x, double y) {
    if (index < 1 || index > cursorCount()) return;
    auto& cursor = cursors_[static_cast<std::size_t>(index - 1)];
    cursor.X = x;
    cursor.Y = y;
    noteChange();
}

void Graph::colorCursor(int index, Color color) {
    if (index < 1 || index > cursorCount()) return;
    cursors_[static_cast<std::size_t>(index - 1)].color = color;
    noteChange();
}

void Graph::showCursor(int index, bool visible) {
    if (index < 1 || index > cursorCount()) return;
    cursors_[static_cast<std::size_t>(index - 1)].Visible = visible;
    noteChange();
}

void Graph::setTrigger(const GraphAnnotation& annotation) {
    trigger_ = annotation;
    noteChange();
}

}  // namespace zel
