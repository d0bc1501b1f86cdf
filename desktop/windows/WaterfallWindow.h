#pragma once
// The window of the waterfall: menus, the graph with its colour bar, how the picture looks.

#include <QMenuBar>

#include "desktop/binders/Binder.h"
#include "desktop/graph/WaterfallCanvas.h"
#include "desktop/windows/FormWindow.h"
#include "forms/Forms.h"
#include "forms/WaterfallForm.h"

namespace zel {

class WaterfallWindow : public FormWindow {
  public:
    WaterfallWindow(Forms& forms, Binder& binder, QWidget* parent);
    WaterfallCanvas& canvas() { return *canvas_; }

  protected:
    void focusFirst() override { canvas_->setFocus(); }
    void reject() override;
    /// Another theme has other colours for the graph as well.
    void changeEvent(QEvent* event) override;

  private:
    QMenuBar* menus();
    QWidget* colourBar();
    QWidget* options();
    void showScreen();

    WaterfallForm& waterfall_;
    WaterfallCanvas* canvas_;
};

}  // namespace zel
