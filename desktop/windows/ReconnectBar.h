#pragma once
// The line over the graph for a port that has gone or come back.

#include <QFrame>

#include "desktop/binders/Binder.h"
#include "forms/ControllerForm.h"

namespace zel {

class ReconnectBar : public QFrame {
  public:
    ReconnectBar(ControllerForm& panel, Binder& binder, QWidget* parent = nullptr);
};

}  // namespace zel
