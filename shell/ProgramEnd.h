#pragma once
// The two doors out of the program.

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "platform/Event.h"
#include "platform/MessageBox.h"

namespace zel {

class ProgramEnd {
  public:
    /// Connects the menu entry, the panel's close and its unload handler.
    ProgramEnd(Forms& forms, MessageBoxes& boxes);

    void ExitObject_Click();
    /// `cancel` becomes -1 when the user stays.
    void Form_QueryUnload(int& cancel);
    bool ended() const { return ended_; }
    /// At once, without waiting for any timer or form.
    void end();
    Event<> Ended;

  private:
    bool confirmed();
    void leave(bool byMenu);

    Forms& forms_;
    ControllerForm& panel_;
    MessageBoxes& boxes_;
    bool ended_ = false;
    Handlers handlers_;
};

}  // namespace zel
