#include "waterfall/Graph3dOps.h"

#include <string>

#include "forms/WaterfallForm.h"
#include "platform/Graph3D.h"

namespace zel {
namespace {

constexpr int kDepthAxis = 2;
constexpr int kFilled = 2;
constexpr int kRowsBetweenLabels = 2;
constexpr const char* kBehindTime = "     ";

}  // namespace

Graph3dOps::Graph3dOps(WaterfallForm& form) : form_(form) {
    zel::Graph3D& graph = form_.Graph3D;
    handlers_.on(form_.resetRowCount, [this] { resetRowCount(); });
    handlers_.on(form_.limitRows, [this, &graph](int depth) { limitRows(graph, depth); });
    handlers_.on(form_.stampRow,
                 [this, &graph](const std::string& text) { stampRow(graph, text); });
    handlers_.on(form_.styleLastRow, [this, &graph] { styleLastRow(graph); });
    handlers_.on(form_.saveGraphView, [this, &graph] { saveGraphView(graph, false); });
    handlers_.on(form_.clearGraph, [this, &graph] { clearGraph(graph); });
}

void Graph3dOps::resetRowCount() { form_.RowCount = 0; }

void Graph3dOps::limitRows(Graph3D& graph, int depth) {
    const auto rowsWithNext = [&graph] {
        const bool lastIsEmpty = !graph.plots().empty() && graph.plots().back().level.empty();
        return graph.plotCount() + (lastIsEmpty ? 0 : 1);
    };
    if (rowsWithNext() > depth) {
        while (rowsWithNext() > depth && graph.plotCount() > 0) {
            graph.removePlot(1);
            ++form_.DepthAxisMin;
            ++form_.DepthAxisMax;
        }
    } else {
        form_.DepthAxisMin = 0;
        form_.DepthAxisMax = depth - 1;
    }
    graph.setRange(kDepthAxis, form_.DepthAxisMin, form_.DepthAxisMax);
}

void Graph3dOps::stampRow(Graph3D& graph, const std::string& timeText) {
    ++form_.RowCount;
    if (graph.plotCount() == 1) form_.StampPending = true;
    if (form_.StampPending) {
        form_.LastStampText = timeText;
        form_.LastStampRow = form_.RowCount;
    }
    const bool first = form_.RowCount == 1;
    const bool tooEarly = timeText == form_.LastStampText ||
                          form_.RowCount <= form_.LastStampRow + kRowsBetweenLabels;
    if (!first && tooEarly) {
        addRowLabel(graph, false, "");
    } else {
        addRowLabel(graph, true, timeText);
    }
    graph.stampNext(form_.RowCount, timeText);
}

void Graph3dOps::addRowLabel(Graph3D& graph, bool show, const std::string& text) {
    graph.setValuePair(kDepthAxis, form_.RowCount,
                       {show ? text + kBehindTime : "", static_cast<double>(form_.RowCount)});
    form_.StampPending = show;
}

void Graph3dOps::setProjection(Graph3D& graph, bool isOrthographic) {
    if (isOrthographic) {
        graph.Projection = Projection3D::Orthographic;
    } else {
        graph.Projection = Projection3D::Perspective;
        graph.PerspectiveFactor = 1.0;
    }
    graph.LevelTicks = true;
}

void Graph3dOps::styleLastRow(Graph3D& graph) {
    if (graph.plots().empty()) return;
    GraphCurve3D& newest = graph.plots().back();
    newest.lineVisible = false;
    newest.fillStyle = kFilled;
    newest.colorMapStyle = form_.IsSpectrogram ? kSpectrogramMap : kWaterfallMap;
    graph.noteRows();
}

void Graph3dOps::saveGraphView(Graph3D& graph, bool bothSets) {
    const GraphView3D& view = graph.view();
    (form_.IsSpectrogram ? form_.SpectrogramView : form_.WaterfallView) = view;
    if (!bothSets) return;
    for (GraphView3D* set : {&form_.SpectrogramView, &form_.WaterfallView}) {
        set->TransX = view.TransX;
        set->TransY = view.TransY;
        set->TransZ = view.TransZ;
    }
}

void Graph3dOps::clearGraph(Graph3D& graph) {
    graph.removePlots();
    graph.addPlot();
    graph.clearValueLabels(kDepthAxis);
    resetRowCount();
    graph.plots().back().fillStyle = kFilled;
    graph.noteRows();
}

}  // namespace zel
