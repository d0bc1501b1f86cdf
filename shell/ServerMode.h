#pragma once
// The menu entries around server mode: its window, and running it at the user's start-up.

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "platform/Services.h"

namespace zel {

class ServerMode {
  public:
    /// Connects the menu entries.
    ServerMode(Forms& forms, StartupFolder& startup, Events& events);

    /// Shows the server's window and comes back when it is closed.
    void UtilityServer_Click();
    /// Makes or deletes the link in the user's start-up folder; errors are ignored.
    void UtilityStartup_Click();

  private:
    Forms& forms_;
    ControllerForm& panel_;
    StartupFolder& startup_;
    Events& events_;
    Handlers handlers_;
};

}  // namespace zel
