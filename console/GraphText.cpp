#include "console/GraphText.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <functional>
#include <string>
#include <utility>
#include <vector>

#include "forms/ControllerForm.h"
#include "platform/Graph.h"
#include "support/NumberText.h"
#include "support/Text.h"
#include "trace/Sweep.h"

namespace zel {
namespace {

constexpr std::size_t kPoints = 301;

std::string rangeText(const GraphAxis& axis) {
    return generalNumber(axis.Minimum) + " to " + generalNumber(axis.Maximum);
}

const char* shownText(bool shown) { return shown ? "shown" : "hidden"; }

std::string pointText(const Graph& graph, std::size_t index) {
    const double x = graph.firstX() + static_cast<double>(index) * graph.increment();
    return generalNumber(x) + ", " + generalNumber(graph.values()[index]);
}

}  // namespace

std::vector<std::string> graphLines(const Graph& graph) {
    std::vector<std::string> lines;
    lines.push_back("x axis: " + rangeText(graph.xAxis()));
    lines.push_back("y axis: " + rangeText(graph.yAxis()) + ", labels " +
                    shownText(graph.yAxis().ShowLabels));
    lines.push_back("track mode: " + std::to_string(graph.TrackMode.get()));
    const std::size_t count = graph.values().size();
    lines.push_back("points: " + std::to_string(count));
    if (count > 0) {
        lines.push_back("first point: " + pointText(graph, 0));
        lines.push_back("last point: " + pointText(graph, count - 1));
    }
    for (int i = 1; i <= graph.cursorCount(); ++i) {
        const GraphCursor& cursor = graph.cursor(i);
        lines.push_back("cursor " + std::to_string(i) + ": " + generalNumber(cursor.X) + ", " +
                        generalNumber(cursor.Y) + ", colour " + std::to_string(cursor.color) +
                        ", " + shownText(cursor.Visible));
    }
    if (!graph.Incomplete.get().empty())
        lines.push_back("annotation Incomplete: \"" + graph.Incomplete.get() + "\"");
    const GraphAnnotation& trigger = graph.trigger();
    lines.push_back("annotation Trigger: \"" + replaceAll(trigger.Caption, kCrLf, "\\r\\n") +
                    "\" at " + generalNumber(trigger.Height) + ", " + shownText(trigger.Visible));
    return lines;
}

std::string sweepHeader(bool autoPeak) { return autoPeak ? "x,value1,value2" : "x,value"; }

namespace {

/// A row a point: the x of its first value, then its values.
std::vector<std::string> rowsOf(const std::vector<double>& values, bool autoPeak,
                                const std::function<double(std::size_t)>& xOfValue) {
    const std::size_t width = autoPeak ? 2 : 1;
    const std::size_t count = std::min(kPoints, values.size() / width);
    std::vector<std::string> rows;
    rows.reserve(count);
    for (std::size_t row = 0; row < count; ++row) {
        const std::size_t i = row * width;
        const auto missing = [](double value) { return std::isnan(value); };
        const auto first = values.begin() + static_cast<std::ptrdiff_t>(i);
        if (std::any_of(first, first + static_cast<std::ptrdiff_t>(width), missing)) continue;
        std::string text = shortestNumber(xOfValue(i));
        for (std::size_t k = 0; k < width; ++k) text += "," + shortestNumber(values[i + k]);
        rows.push_back(std::move(text));
    }
    return rows;
}

}  // namespace

std::vector<std::string> sweepRows(const Sweep& sweep) {
    return rowsOf(sweep.physical, sweep.autoPeak(), [&sweep](std::size_t i) {
        return sweep.axis.first + static_cast<double>(i) * sweep.axis.increment;
    });
}

std::vector<std::string> loadedRows(const ControllerForm& panel, bool autoPeak) {
    const std::vector<double>& xs = panel.DataXAxisArrayToLoad;
    return rowsOf(panel.DataValArrayToLoad, autoPeak, [&xs, autoPeak](std::size_t i) {
        const std::size_t row = autoPeak ? i / 2 : i;
        return row < xs.size() ? xs[row] : 0;
    });
}

}  // namespace zel
