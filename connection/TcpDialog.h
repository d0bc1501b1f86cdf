#pragma once
// The dialog that connects to a copy of the program in server mode.

#include <string>

#include "connection/Handshake.h"
#include "connection/SessionClock.h"
#include "forms/Forms.h"
#include "link/ByteLink.h"
#include "platform/Clock.h"
#include "platform/Events.h"
#include "platform/MessageBox.h"
#include "platform/Services.h"
#include "platform/Socket.h"
#include "trace/TraceReader.h"

namespace zel {

class TcpDialog {
  public:
    /// Connects the menu entry and the dialog's buttons.
    TcpDialog(Forms& forms, ByteLink& link, Handshake& handshake, SessionClock& sessionClock,
              TraceReader& traces, Socket& TCPSocket, SettingsStore& settings, const Clock& clock,
              Events& events, MessageBoxes& boxes);

    void Form_Load();
    void TCPConnection_Click();
    void ConnectTCPButton_Click();
    void QuitTCPButton_Click();
    /// Connects the socket and does the handshake; one sweep behind it with `readTrace`.
    void connect(bool readTrace);

  private:
    bool awaitConnection();
    bool open(const std::string& host, const std::string& portText);
    bool probe();
    void emptySocket();
    void saveSettings();
    void loadRecent();
    void rememberServer(const std::string& server);
    void chooseRecent();

    Forms& forms_;
    ControllerForm& panel_;
    TCPConnectionForm& dialog_;
    ByteLink& link_;
    Handshake& handshake_;
    SessionClock& sessionClock_;
    TraceReader& traces_;
    Socket& socket_;
    SettingsStore& settings_;
    Events& events_;
    MessageBoxes& boxes_;
    Stopwatch StopwatchA_;
    bool quit_ = false;  ///< the user has given up
};

}  // namespace zel
