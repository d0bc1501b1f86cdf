#include "trace/GraphInteraction.h"

#include <string>

#include "forms/ControllerForm.h"
#include "model/Numeric.h"
#include "model/ZEL3Variables.h"
#include "platform/Form.h"
#include "platform/Graph.h"
#include "support/NumberText.h"
#include "trace/GraphScaling.h"

namespace zel {
namespace {

constexpr Color kCursor1 = 16776960;  // cyan
constexpr Color kCursor2 = 65280;     // green
constexpr Color kZoomedButton = 65280;
constexpr Color kPlainButton = 14737632;
constexpr int kReadoutDigits = 2;
constexpr int kCursorDigits = 3;

}  // namespace

GraphInteraction::GraphInteraction(ControllerForm& panel, ZEL3Variables& mirror)
    : panel_(panel), mirror_(mirror) {
    handlers_.on(panel_.cmdZoom.Clicked, [this] { cmdZoom_Click(); });
    handlers_.on(panel_.CWGraph1.ZoomFinished, [this] { zoomFinished(); });
    handlers_.on(panel_.CWGraph1.PlotAreaTracking,
                 [this](double x, double y) { plotAreaTracking(x, y); });
    handlers_.on(panel_.CWGraph1.CursorMoved,
                 [this](int index, double x, double y) { ShowCursorLabels(index, x, y); });
}

void GraphInteraction::setUpCursors() {
    Graph& graph = panel_.CWGraph1;
    graph.removeCursors();
    graph.addCursor({0, 0, kCursor1, false});
    graph.addCursor({0, 0, kCursor2, false});
    graph.TrackMode = static_cast<int>(TrackMode::Plain);
}

void GraphInteraction::finishCursors() {
    Graph& graph = panel_.CWGraph1;
    for (int index = 1; index <= graph.cursorCount(); ++index) {
        const double middle = (graph.xAxis().Minimum + graph.xAxis().Maximum) / 2;
        graph.moveCursor(index, middle, graph.yAxis().Minimum);
        graph.showCursor(index, false);
    }
    graph.TrackMode = static_cast<int>(TrackMode::Plain);
}

int GraphInteraction::restingTrackMode() const {
    return static_cast<int>(mirror_.MarkerOn ? TrackMode::DragCursors : TrackMode::Plain);
}

void GraphInteraction::cmdZoom_Click() {
    Graph& graph = panel_.CWGraph1;
    if (panel_.cmdZoom.Caption.get() == "Zoom") {
        graph.TrackMode = static_cast<int>(TrackMode::ZoomRectangle);
        panel_.cmdZoom.Caption = "Out";
        panel_.cmdZoom.BackColor = kZoomedButton;
        panel_.GraphZoomed = true;
    } else {
        graph.TrackMode = restingTrackMode();
        if (GetDimension(panel_, mirror_) == "Hz") {
            graph.setXRange(mirror_.CenterFrequency - mirror_.Span / 2,
                            mirror_.CenterFrequency + mirror_.Span / 2);
        } else {
            graph.setXRange(panel_.ViewStart, panel_.ViewStop);  // seconds or metres
        }
        panel_.cmdZoom.Caption = "Zoom";
        panel_.cmdZoom.BackColor = kPlainButton;
        panel_.GraphZoomed = false;
    }
    graph.Refresh();
}

void GraphInteraction::zoomFinished() {
    Graph& graph = panel_.CWGraph1;
    if (graph.TrackMode == static_cast<int>(TrackMode::ZoomRectangle))
        graph.TrackMode = restingTrackMode();
}

std::string GraphInteraction::readout(const char* head, double x, double y) const {
    // The unit of y is dBm for every reference unit, on purpose.
    return head + FormatValue(x, GetDimension(panel_, mirror_), "", true, true, kReadoutDigits) +
           "; " + FormatValue(y, "dBm", "", true, true, kReadoutDigits);
}

void GraphInteraction::plotAreaTracking(double x, double y) {
    panel_.DeltaLabel.Caption = readout("Cursor:", x, y);
    panel_.DeltaLabel.ForeColor = kCursor1;
}

void GraphInteraction::ShowCursorLabels(int cursorIndex, double x, double y) {
    Graph& graph = panel_.CWGraph1;
    if (graph.cursorCount() == 0) return;
    graph.moveCursor(cursorIndex, x, y);
    graph.colorCursor(cursorIndex, cursorIndex == 1 ? kCursor1 : kCursor2);
    if (cursorIndex != 1) return showCursor2(x, y);
    panel_.MarkerValue = x;
    panel_.MarkerLevel = y;
    panel_.MarkerLabel.Caption =
        readout("Marker:", roundHalfEven(x, kCursorDigits), roundHalfEven(y, kCursorDigits));
    if (mirror_.DeltaOn) showCursor2(graph.cursor(2).X, graph.cursor(2).Y);
}

void GraphInteraction::showCursor2(double x, double y) {
    if (mirror_.DeltaOn) {
        panel_.DeltaLabel.Caption =
            readout("Delta:", x - panel_.MarkerValue, y - panel_.MarkerLevel);
    } else {
        panel_.DeltaLabel.Caption = readout("Cursor:", x, y);
        panel_.DeltaLabel.ForeColor = kCursor1;
    }
}

}  // namespace zel
