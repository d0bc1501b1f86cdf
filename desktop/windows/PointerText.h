#pragma once
// The pointer over the graph: its own readout, and a delta readout that it does not wipe.

#include <optional>
#include <string>

#include "desktop/graph/GraphWidget.h"
#include "desktop/windows/Readouts.h"
#include "forms/ControllerForm.h"
#include "platform/Form.h"

namespace zel {

/// While the pointer is over the plot the delta's label has the text of the cursor; what stood
/// there before comes back when the pointer leaves.
class PointerText {
  public:
    PointerText(GraphWidget& graph, Readouts& readouts, ControllerForm& panel);

    /// Writes what the trace has under the pointer and at the markers, as after each sweep.
    void show();

  private:
    void track(bool before);
    void leave();
    QString levelAt(double x) const;

    GraphWidget& graph_;
    Readouts& readouts_;
    ControllerForm& panel_;
    std::optional<double> at_;
    bool lent_ = false;    ///< the label has the cursor's text
    std::string written_;  ///< by the pointer, last
    std::string caption_;
    Color ink_ = 0;
};

}  // namespace zel
