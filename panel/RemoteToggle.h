#pragma once
// The panel's REMOTE and LOCAL keys.

#include "forms/ControllerForm.h"
#include "link/CommandExchange.h"
#include "platform/Events.h"
#include "platform/MessageBox.h"

namespace zel {

class RemoteToggle {
  public:
    RemoteToggle(ControllerForm& panel, CommandExchange& exchange, Events& events,
                 MessageBoxes& boxes);

    /// The caption holds the state to go to: "R" sends REMOTE, any other LOCAL.
    void OnOffButton_Click();
    void LocalButton_Click();

  private:
    bool mayAct();

    ControllerForm& panel_;
    CommandExchange& exchange_;
    Events& events_;
    MessageBoxes& boxes_;
};

}  // namespace zel
