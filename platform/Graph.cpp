#include "platform/Graph.h"

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

void Graph3D::setRange(int index, double minimum, double maximum) {
    auto& axis = axes_.at(static_cast<std::size_t>(index - 1));
    axis.Minimum = minimum;
    axis.Maximum = maximum;
    noteChange();
}

void Graph3D::setFormat(int index, const std::string& format) {
    axes_.at(static_cast<std::size_t>(index - 1)).Format = format;
    noteChange();
}

void Graph3D::setLabelColor(int index, Color color) {
    axes_.at(static_cast<std::size_t>(index - 1)).LabelColor = color;
    noteChange();
}

void Graph3D::clearValueLabels(int index) {
    valuePairs(index).clear();
    noteChange();
}

void Graph3D::removePlot(int position) {
    if (position < 1 || position > plotCount()) return;
    plots_.erase(plots_.begin() + (position - 1));
    noteChange();
}

void Graph3D::plotCurve(const std::vector<double>& depth, const std::vector<double>& x,
                        const std::vector<double>& level, const std::vector<double>& colour) {
    if (plots_.empty()) plots_.emplace_back();
    GraphCurve3D& curve = plots_.back();
    curve.depth = depth;
    curve.x = x;
    curve.level = level;
    curve.colour = colour;
    noteChange();
}

}  // namespace zel
