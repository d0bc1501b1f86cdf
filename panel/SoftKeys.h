#pragma once
// The five soft positions: keys, boxes and lists.

#include "forms/ControllerForm.h"
#include "panel/Z9GetCommands.h"
#include "panel/Z9SetCommands.h"
#include "platform/Event.h"
#include "trace/Interlock.h"

namespace zel {

class SoftKeys {
  public:
    /// Connects keys, boxes and lists.
    SoftKeys(ControllerForm& panel, Z9GetCommands& queries, Z9SetCommands& settings,
             const Interlock& interlock);

    void SoftKey_Click(int index);
    /// Enter sets the value of the position; other characters go into the box.
    void SoftTextBox_KeyPress(int index, int key);
    /// Arrows, backspace and clear keep the text for editing.
    void SoftTextBox_KeyDown(int key);
    /// A pick is an Enter on the position, with no need of text.
    void ChoiceBox_Click(int index);

  private:
    ControllerForm& panel_;
    Z9GetCommands& queries_;
    Z9SetCommands& settings_;
    const Interlock& interlock_;
    Handlers handlers_;
};

}  // namespace zel
