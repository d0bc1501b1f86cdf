#pragma once
// The end of a session, and the panel's way back to its not-connected look.

#include "connection/SessionClock.h"
#include "forms/Forms.h"
#include "link/ByteLink.h"
#include "link/CommandExchange.h"
#include "platform/Clock.h"
#include "platform/Events.h"
#include "platform/MessageBox.h"
#include "platform/Socket.h"
#include "trace/GraphInteraction.h"

namespace zel {

class Disconnection {
  public:
    /// Connects the disconnect buttons of the dialog and the menu entry.
    Disconnection(Forms& forms, ByteLink& link, CommandExchange& exchange, Socket& TCPSocket,
                  SessionClock& sessionClock, GraphInteraction& graph, const Clock& clock,
                  Events& events, MessageBoxes& boxes);

    void DisconnectButton_Click();
    /// The same without the question.
    void endSession();
    /// Two silent answers take a little over 10.5 s.
    void HangUpModem();
    void ClosePortAndClearIdentity();

  private:
    void attemptOver();
    void notConnectedLook();
    void awaitModemAnswer();
    void pointer(int shape);

    Forms& forms_;
    ControllerForm& panel_;
    MainForm& dialog_;
    ByteLink& link_;
    CommandExchange& exchange_;
    Socket& socket_;
    SessionClock& sessionClock_;
    GraphInteraction& graph_;
    Events& events_;
    MessageBoxes& boxes_;
    Stopwatch StopwatchA_;
};

}  // namespace zel
