#include "console/Graph3DText.h"

#include <string>
#include <vector>

#include "platform/Graph3D.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr int kDepthAxis = 2;
constexpr int kLevelAxis = 3;

std::string flag(bool value) { return value ? "true" : "false"; }

std::string three(double a, double b, double c) {
    return generalNumber(a) + ", " + generalNumber(b) + ", " + generalNumber(c);
}

std::string plotText(int number, const GraphCurve3D& plot) {
    return "plot " + std::to_string(number) + ": depth " +
           generalNumber(plot.depth.empty() ? 0 : plot.depth.front()) + ", points " +
           std::to_string(plot.level.size()) + ", line " + (plot.lineVisible ? "on" : "off") +
           ", fill " + std::to_string(plot.fillStyle) + ", map " +
           std::to_string(plot.colorMapStyle);
}

std::string withoutTrailingBlanks(const std::string& text) {
    const auto end = text.find_last_not_of(' ');
    return end == std::string::npos ? "" : text.substr(0, end + 1);
}

}  // namespace

std::vector<std::string> graph3DLines(const Graph3D& graph) {
    std::vector<std::string> lines;
    lines.push_back("plots: " + std::to_string(graph.plotCount()));
    int number = 0;
    for (const GraphCurve3D& plot : graph.plots()) lines.push_back(plotText(++number, plot));
    for (int i = 1; i <= kLevelAxis; ++i)
        lines.push_back("axis " + std::to_string(i) + ": " + generalNumber(graph.axis(i).Minimum) +
                        " to " + generalNumber(graph.axis(i).Maximum));
    lines.push_back("format 3: " + graph.axis(kLevelAxis).Format);
    lines.push_back("ticks 3: " + flag(graph.LevelTicks) + ", " + flag(graph.LevelGrid));
    const ValuePairs& labels = graph.valuePairs(kDepthAxis);
    lines.push_back("labels: " + std::to_string(labels.count()));
    for (int row = labels.first(); row <= labels.count(); ++row)
        if (!labels.item(row).Name.empty())
            lines.push_back("label " + std::to_string(row) + ": " +
                            withoutTrailingBlanks(labels.item(row).Name));
    const GraphView3D& view = graph.view();
    lines.push_back("projection: " + std::to_string(static_cast<int>(graph.Projection.get())));
    lines.push_back("latitude: " + generalNumber(view.Latitude));
    lines.push_back("longitude: " + generalNumber(view.Longitude));
    lines.push_back("distance: " + generalNumber(view.Distance));
    lines.push_back("translation: " + three(view.TransX, view.TransY, view.TransZ));
    lines.push_back("mouse mode: " + std::to_string(static_cast<int>(graph.MouseMode.get())));
    lines.push_back("cursors: " + std::to_string(graph.cursors().size()));
    number = 0;
    for (const GraphCursor3D& cursor : graph.cursors())
        lines.push_back("cursor " + std::to_string(++number) + ": " +
                        three(cursor.X, cursor.Y, cursor.Z) + ", \"" + cursor.Name + "\"" +
                        (cursor.placed ? "" : ", free"));
    return lines;
}

}  // namespace zel
