#pragma once
// The bar under the graph that plays a loaded recording.

#include <QWidget>

#include "desktop/binders/Binder.h"
#include "forms/Forms.h"
#include "forms/ScriptForms.h"

namespace zel {

/// Shown as long as the frame is.
class PlaybackBar : public QWidget {
  public:
    PlaybackBar(Forms& forms, Binder& binder, QWidget* parent = nullptr);

  protected:
    void showEvent(QShowEvent* event) override;

  private:
    void showPace();

    SpecialMeasForm& script_;
    QLabel* pace_;
};

}  // namespace zel
