#pragma once
// The trace tools beside the graph: a dock with a page a subject, and what they draw on the graph.

#include <QDockWidget>
#include <QTabWidget>
#include <array>
#include <memory>

#include "analysis/MaskWatch.h"
#include "desktop/graph/GraphWidget.h"
#include "desktop/graph/TraceOverlay.h"
#include "desktop/platform/SystemCommand.h"
#include "desktop/windows/LimitsPage.h"
#include "desktop/windows/PeaksPage.h"
#include "desktop/windows/TracesPage.h"
#include "shell/Program.h"

class QMenu;
class QMainWindow;

namespace zel {

class TraceToolsDock : public QDockWidget {
  public:
    TraceToolsDock(Program& program, GraphWidget& graph, QMainWindow& window);
    ~TraceToolsDock() override;

    TraceTools& tools() { return tools_; }
    LimitsPage& limits() { return *limits_; }
    TracesPage& traces() { return *traces_; }
    MaskWatch& watch() { return watch_; }
    /// What is drawn over the graph now.
    OverlayPicture picture() const;
    QTabWidget& pages() { return *pages_; }
    /// The entries of the menu "Trace".
    void fill(QMenu& menu);
    /// Shows everything at once, without waiting for the next turn.
    void showNow();

  protected:
    void showEvent(QShowEvent* event) override;

  private:
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
    QTabWidget* pages_;
    TracesPage* traces_;
    LimitsPage* limits_;
    MarkersPage* markers_;
    unsigned long plotSerial_ = 0;
    double lastTime_ = 0;
    bool waits_ = false;
};

/// Adds the dock, hidden, and the menu "Trace", which stands before another menu, to the window.
TraceToolsDock* addTraceTools(QMainWindow& window, Program& program, GraphWidget& graph,
                              QMenu& before);

}  // namespace zel
