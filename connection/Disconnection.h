#pragma once
// The end of a session, and the panel's way back to its not-connected look.

#include "connection/SessionClock.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "forms/MainForm.h"
#include "link/ByteLink.h"
#include "link/CommandExchange.h"
#include "link/InstrumentLink.h"
#include "platform/Clock.h"
#include "platform/Event.h"
#include "platform/Session.h"
#include "platform/Socket.h"
#include "trace/GraphInteraction.h"
#include "trace/Interlock.h"

namespace zel {

class Disconnection {
  public:
    /// Connects the disconnect buttons of the dialog and the menu entry.
    Disconnection(Forms& forms, const InstrumentLink& link, Socket& TCPSocket,
                  SessionClock& sessionClock, GraphInteraction& graph, const Interlock& interlock);

    void DisconnectButton_Click();
    /// The same without the question.
    void endSession();
    /// The program ends at once: LOCAL, the hang-up of a dialled line, the close. Nothing is asked
    /// or reported.
    void endAtOnce();
    /// Two silent answers take a little over 10.5 s.
    void HangUpModem();
    void ClosePortAndClearIdentity();

  private:
    void attemptOver();
    void giveAttemptBack();
    void notConnectedLook();
    void awaitModemAnswer();

    Forms& forms_;
    ControllerForm& panel_;
    MainForm& dialog_;
    ByteLink& link_;
    CommandExchange& exchange_;
    Socket& socket_;
    SessionClock& sessionClock_;
    GraphInteraction& graph_;
    const Interlock& interlock_;
    Session session_;
    Stopwatch StopwatchA_;
    Handlers handlers_;
};

}  // namespace zel
