#pragma once
// What happens each second: the server's socket is looked at, the session's time is shown.

#include "connection/SessionClock.h"
#include "forms/ControllerForm.h"
#include "platform/Event.h"
#include "server/ServerBridge.h"

namespace zel {

/// A server whose socket is in error goes back to listening.
class SecondTimer {
  public:
    SecondTimer(ControllerForm& panel, ServerBridge& server, SessionClock& sessionClock);
    void UpNow_Timer();

  private:
    ServerBridge& server_;
    SessionClock& sessionClock_;
    Handlers handlers_;
};

}  // namespace zel
