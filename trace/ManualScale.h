#pragma once
// The dialog that scales the y axis by hand, until the next trace scales it again.

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "platform/Event.h"
#include "platform/MessageBox.h"

namespace zel {

class ManualScale {
  public:
    /// Connects the menu entry and the dialog's buttons.
    ManualScale(ControllerForm& panel, ManualScaleForm& dialog, MessageBoxes& boxes);

    void Form_Load();
    void cmdAccept_Click();

  private:
    ControllerForm& panel_;
    ManualScaleForm& dialog_;
    MessageBoxes& boxes_;
    Handlers handlers_;
};

}  // namespace zel
