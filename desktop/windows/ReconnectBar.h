#pragma once
// The line over the graph for a port that has gone or come back.

#include <QCoreApplication>
#include <QFrame>

#include "desktop/binders/Binder.h"
#include "forms/ControllerForm.h"

namespace zel {

class ReconnectBar : public QFrame {
    Q_DECLARE_TR_FUNCTIONS(ReconnectBar)

  public:
    ReconnectBar(ControllerForm& panel, Binder& binder, QWidget* parent = nullptr);
};

}  // namespace zel
