#pragma once
// The trace tools beside the graph: a dock with a page a subject, and what they draw on the graph.

#include <QDockWidget>
#include <QTabWidget>
#include <QTimer>
#include <optional>

#include "analysis/MaskWatch.h"
#include "analysis/SpectrumTrace.h"
#include "analysis/TraceTools.h"
#include "desktop/graph/GraphWidget.h"
#include "desktop/graph/TraceOverlay.h"
#include "desktop/platform/SystemCommand.h"
#include "desktop/windows/LimitsPage.h"
#include "desktop/windows/PeaksPage.h"
#include "desktop/windows/TracesPage.h"
#include "forms/ControllerForm.h"
#include "shell/Program.h"

class QMenu;
class QMainWindow;

namespace zel {

/// The pages are built when the dock is shown or used for the first time: most sessions begin
/// without it, and the window is to be there at once.
class TraceToolsDock : public QDockWidget {
  public:
    TraceToolsDock(Program& program, GraphWidget& graph, QMainWindow& window);
    ~TraceToolsDock() override;

    TraceTools& tools() { return tools_; }
    LimitsPage& limits() {
        build();
        return *limits_;
    }
    TracesPage& traces() {
        build();
        return *traces_;
    }
    MaskWatch& watch() { return watch_; }
    /// What is drawn over the graph now.
    OverlayPicture picture() const;
    QTabWidget& pages() {
        build();
        return *pages_;
    }
    /// The entries of the menu "Trace".
    void fill(QMenu& menu);
    /// Shows everything at once, without waiting for the next turn.
    void showNow();
    void setVisible(bool visible) override;

  protected:
    void showEvent(QShowEvent* event) override;

  private:
    void build();
    void follow();
    void takeSweep(bool loaded);
    void showLater();
    void letMarkersMove();
    double traceX(double graphX) const;
    void addCurve(OverlayPicture& picture, const SpectrumTrace& trace, const QColor& color) const;
    double graphX(double x) const;
    std::optional<double> graphY(double level) const;
    void scaleLevelAxis();

    Program& program_;
    ControllerForm& panel_;
    GraphWidget& graph_;
    TraceTools tools_;
    SystemCommand command_;
    MaskWatch watch_;
    TraceOverlay overlay_;
    QTabWidget* pages_ = nullptr;
    TracesPage* traces_ = nullptr;
    LimitsPage* limits_ = nullptr;
    MarkersPage* markers_ = nullptr;
    unsigned long plotSerial_ = 0;
    double lastTime_ = 0;
    bool placed_ = false;  ///< it was shown once
    QTimer turn_;
    bool drawn_ = false;  ///< something stands on the graph
};

/// Adds the dock, hidden, and the menu "Trace", which stands before another menu, to the window.
TraceToolsDock* addTraceTools(QMainWindow& window, Program& program, GraphWidget& graph,
                              QMenu& before);

}  // namespace zel
