#pragma once
// The panel's REMOTE and LOCAL keys.

#include "forms/ControllerForm.h"
#include "link/CommandExchange.h"
#include "platform/Event.h"
#include "trace/Interlock.h"

namespace zel {

class RemoteToggle {
  public:
    RemoteToggle(ControllerForm& panel, CommandExchange& exchange, const Interlock& interlock);

    /// The caption holds the state to go to: "R" sends REMOTE, any other LOCAL.
    void OnOffButton_Click();
    void LocalButton_Click();

  private:
    ControllerForm& panel_;
    CommandExchange& exchange_;
    const Interlock& interlock_;
    Handlers handlers_;
};

}  // namespace zel
