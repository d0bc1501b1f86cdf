#pragma once
// What happens each second: the server's socket is looked at, the session's time is shown.

#include "connection/SessionClock.h"
#include "forms/Forms.h"
#include "platform/Socket.h"

namespace zel {

/// A server whose socket is in error goes back to listening.
class SecondTimer {
  public:
    SecondTimer(Forms& forms, Socket& serverSocket, SessionClock& sessionClock);
    void UpNow_Timer();

  private:
    Forms& forms_;
    Socket& socket_;
    SessionClock& sessionClock_;
};

}  // namespace zel
