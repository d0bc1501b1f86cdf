#pragma once
// The keys at the right of the graph, as on the instrument's front.

#include <QWidget>

#include "desktop/binders/Binder.h"
#include "desktop/windows/Terminators.h"
#include "forms/ControllerForm.h"
#include "model/ZEL3Variables.h"

class QGridLayout;
class QHBoxLayout;
class QVBoxLayout;

namespace zel {

class PanelSide : public QWidget {
  public:
    PanelSide(ControllerForm& panel, const ZEL3Variables& mirror, Binder& binder,
              QWidget* parent = nullptr);
    TerminatorRow& terminators() { return *terminators_; }

  private:
    QWidget* playKeys();
    QWidget* softPositions();
    QWidget* hardKeys();
    QWidget* modeKeys();
    QWidget* markerKeys();
    QWidget* instrumentKeys();
    QPushButton* key(Button& control, bool tall = false);
    QPushButton* fitted(QPushButton* button, Button& control, bool tall);

    ControllerForm& panel_;
    Binder& binder_;
    TerminatorRow* terminators_;
};

}  // namespace zel
