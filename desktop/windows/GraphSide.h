#pragma once
// The graph with all that stands on it and under it.

#include <QWidget>

#include "desktop/binders/Binder.h"
#include "desktop/graph/GraphWidget.h"
#include "desktop/windows/EmptyScreen.h"
#include "desktop/windows/Readouts.h"
#include "shell/Program.h"

namespace zel {

class GraphSide : public QWidget {
  public:
    GraphSide(Program& program, Binder& binder, EmptyScreen::Ways ways, QWidget* parent = nullptr);

    GraphWidget& graph() { return *graph_; }
    EmptyScreen& empty() { return *empty_; }
    /// The ways to begin, while there is neither a connection nor a trace.
    void showEmpty();

  protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

  private:
    QWidget* spectrogram();
    void place();

    Program& program_;
    ControllerForm& panel_;
    Binder& binder_;
    GraphWidget* graph_;
    EmptyScreen* empty_;
    Readouts* readouts_;
};

}  // namespace zel
