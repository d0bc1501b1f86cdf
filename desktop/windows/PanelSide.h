#pragma once
// The keys at the right of the graph, as on the instrument's front.

#include <QWidget>

#include "desktop/binders/Binder.h"
#include "forms/ControllerForm.h"

class QGridLayout;
class QHBoxLayout;
class QVBoxLayout;

namespace zel {

class PanelSide : public QWidget {
  public:
    PanelSide(ControllerForm& panel, Binder& binder, QWidget* parent = nullptr);

  private:
    QWidget* playKeys();
    QWidget* softPositions();
    QWidget* hardKeys();
    QWidget* modeKeys();
    QWidget* markerKeys();
    QWidget* instrumentKeys();
    QPushButton* key(Button& control, bool tall = false);

    ControllerForm& panel_;
    Binder& binder_;
};

}  // namespace zel
