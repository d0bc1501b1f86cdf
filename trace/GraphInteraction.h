#pragma once
// What a user does on the graph: zoom, pointer readout, moved cursors.

#include <string>

#include "forms/ControllerForm.h"
#include "model/ZEL3Variables.h"
#include "platform/Event.h"

namespace zel {

class GraphInteraction {
  public:
    /// Connects the graph's events and the zoom button.
    GraphInteraction(ControllerForm& panel, ZEL3Variables& mirror);

    /// The first half of the cursors' set-up at start-up: colours, hidden, plain track mode.
    void setUpCursors();
    /// The second half: where they stand until a marker is read.
    void finishCursors();

    void cmdZoom_Click();
    void zoomFinished();
    /// The readout of the pointer over the plot.
    void plotAreaTracking(double x, double y);
    /// A cursor was moved, by a user or by code.
    void ShowCursorLabels(int cursorIndex, double x, double y);

  private:
    int restingTrackMode() const;
    std::string readout(const char* head, double x, double y) const;
    void showCursor2(double x, double y);

    ControllerForm& panel_;
    ZEL3Variables& mirror_;
    Handlers handlers_;
};

}  // namespace zel
