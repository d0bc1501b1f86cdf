#pragma once
// The graph with all that stands on it and under it.

#include <QWidget>
#include <cstdint>
#include <functional>
#include <memory>

#include "desktop/binders/Binder.h"
#include "desktop/graph/GraphNavigator.h"
#include "desktop/graph/GraphWidget.h"
#include "desktop/windows/ConnectCard.h"
#include "desktop/windows/EmptyScreen.h"
#include "desktop/windows/PointerText.h"
#include "desktop/windows/PowerDisplay.h"
#include "desktop/windows/Readouts.h"
#include "forms/ControllerForm.h"
#include "platform/Event.h"
#include "shell/Program.h"
#include "trace/ViewAnnotations.h"

namespace zel {

class GraphSide : public QWidget {
  public:
    GraphSide(Program& program, Binder& binder, EmptyScreen::Ways ways, QWidget* parent = nullptr);

    GraphWidget& graph() { return *graph_; }
    EmptyScreen& empty() { return *empty_; }
    /// The texts around the trace, as they are drawn.
    ViewAnnotations annotations() const;
    /// For the menu of the graph.
    std::function<void()> copyPicture;
    /// The ways to begin, while there is neither a connection nor a trace.
    void showEmpty();
    /// The power sensor's display, while that mode is on.
    void showPower();

  protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

  private:
    QWidget* spectrogram();
    void place();
    void refreshGraph();
    void showSource();
    void showChannel();
    bool showsPower() const;
    void showReadouts();

    Program& program_;
    ControllerForm& panel_;
    Binder& binder_;
    GraphWidget* graph_;
    EmptyScreen* empty_;
    ConnectCard* connecting_;
    PowerDisplay* power_;
    Readouts* readouts_;
    GraphNavigator navigator_;
    std::int16_t shownMode_ = 0;
    std::unique_ptr<PointerText> pointer_;
    Handlers readings_;
};

}  // namespace zel
