#include "platform/Graph3D.h"

#include <algorithm>
#include <cstddef>
#include <string>
#include <utility>
#include <vector>

#include "platform/Form.h"

namespace zel {
namespace {

constexpr int kFirstFill = 2;
constexpr double kDesignMaxima[] = {12, 10, 10};
/// More markers than a picture can show.
constexpr std::size_t kMostCursors = 1000;

}  // namespace

const ValuePair& ValuePairs::item(int index) const {
    static const ValuePair none;
    if (index <= dropped_ || index > count()) return none;
    return pairs_[static_cast<std::size_t>(index - 1 - dropped_)];
}

void ValuePairs::set(int index, ValuePair pair) {
    if (index <= dropped_) return;
    if (index > count() + kKept) {
        // All that was kept would be dropped on the way.
        pairs_.clear();
        dropped_ = index - kKept;
    }
    while (count() < index) pairs_.emplace_back();
    pairs_[static_cast<std::size_t>(index - 1 - dropped_)] = std::move(pair);
    for (; pairs_.size() > kKept; ++dropped_) pairs_.pop_front();
}

void ValuePairs::clear() {
    pairs_.clear();
    dropped_ = 0;
}

Graph3D::Graph3D(Form& form, std::string name)
    : Control(form, std::move(name), ControlKind::Graph3D), plots_(1) {
    plots_.back().fillStyle = kFirstFill;
    for (std::size_t i = 0; i < axes_.size(); ++i) {
        axes_.at(i).Minimum = 0;
        axes_.at(i).Maximum = kDesignMaxima[i];
    }
}

void Graph3D::setRange(int index, double minimum, double maximum) {
    auto& axis = axes_.at(static_cast<std::size_t>(index - 1));
    if (axis.Minimum == minimum && axis.Maximum == maximum) return;
    axis.Minimum = minimum;
    axis.Maximum = maximum;
    noteChange();
}

void Graph3D::setFormat(int index, const std::string& format) {
    auto& axis = axes_.at(static_cast<std::size_t>(index - 1));
    if (axis.Format == format) return;
    axis.Format = format;
    noteChange();
}

void Graph3D::setLabelColor(int index, Color color) {
    auto& axis = axes_.at(static_cast<std::size_t>(index - 1));
    if (axis.LabelColor == color) return;
    axis.LabelColor = color;
    noteChange();
}

void Graph3D::setValuePair(int index, int pair, ValuePair value) {
    pairs_.at(static_cast<std::size_t>(index - 1)).set(pair, std::move(value));
    noteChange();
}

void Graph3D::clearValueLabels(int index) {
    pairs_.at(static_cast<std::size_t>(index - 1)).clear();
    noteChange();
}

const GraphCurve3D* Graph3D::lastRow() const {
    const auto found = std::find_if(plots_.rbegin(), plots_.rend(), [](const GraphCurve3D& plot) {
        return !plot.level.empty() && !plot.depth.empty();
    });
    return found == plots_.rend() ? nullptr : &*found;
}

void Graph3D::noteRows() {
    ++rowsSerial_;
    noteChange();
}

void Graph3D::removePlots() {
    plots_.clear();
    noteRows();
}

void Graph3D::removePlot(int position) {
    if (position < 1 || position > plotCount()) return;
    plots_.erase(plots_.begin() + (position - 1));
    noteRows();
}

void Graph3D::addPlot() {
    plots_.emplace_back();
    noteRows();
}

void Graph3D::stampNext(int row, std::string time) {
    nextRow_ = row;
    nextTime_ = std::move(time);
}

void Graph3D::plotCurve(std::vector<double> depth, std::vector<double> x, std::vector<double> level,
                        std::vector<double> colour) {
    if (plots_.empty() || !plots_.back().level.empty()) plots_.emplace_back();
    GraphCurve3D& curve = plots_.back();
    curve.depth = std::move(depth);
    curve.x = std::move(x);
    curve.level = std::move(level);
    curve.colour = std::move(colour);
    curve.row = nextRow_;
    curve.time = nextTime_;
    noteRows();
    Plotted();
}

void Graph3D::setView(const GraphView3D& view) {
    if (view == view_) return;
    view_ = view;
    noteChange();
}

void Graph3D::addCursor() {
    if (cursors_.size() >= kMostCursors) return;
    cursors_.emplace_back();
    noteChange();
}

void Graph3D::removeLastCursor() {
    if (cursors_.empty()) return;
    cursors_.pop_back();
    noteChange();
}

void Graph3D::removeCursors() {
    cursors_.clear();
    noteChange();
}

void Graph3D::setCursor(std::size_t index, GraphCursor3D cursor) {
    if (index >= cursors_.size()) return;
    cursors_[index] = std::move(cursor);
    noteChange();
}

}  // namespace zel
