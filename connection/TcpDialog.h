#pragma once
// The dialog that connects to a copy of the program in server mode.

#include <string>

#include "connection/SessionStart.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "link/InstrumentLink.h"
#include "platform/Clock.h"
#include "platform/Event.h"
#include "platform/Services.h"
#include "platform/Session.h"
#include "platform/Socket.h"

namespace zel {

class TcpDialog {
  public:
    /// Connects the menu entry and the dialog's buttons.
    TcpDialog(Forms& forms, const InstrumentLink& link, SessionStart& start, Socket& TCPSocket,
              SettingsStore& settings, const Session& session);

    void Form_Load();
    void TCPConnection_Click();
    void ConnectTCPButton_Click();
    void QuitTCPButton_Click();
    /// Connects the socket and does the handshake; one sweep after it with `readTrace`.
    void connect(bool readTrace);
    /// The same without a box when it fails; `failure` says why then.
    void connectQuietly(bool readTrace);
    /// Why the last attempt failed, for a user; empty where the words are in the advice.
    const std::string& failure() const { return failure_; }
    /// Whether the user has left the last attempt.
    bool wasLeft() const { return quit_; }

  private:
    bool awaitConnection(const std::string& where);
    void failed(const std::string& where, const std::string& reason);
    std::string endOfServer() const;
    bool left() const;
    void giveUp();
    void stopClock();
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
    InstrumentLink link_;
    SessionStart& start_;
    Socket& socket_;
    SettingsStore& settings_;
    Session session_;
    Stopwatch StopwatchA_;
    bool quit_ = false;   ///< the user has given up
    bool quiet_ = false;  ///< no boxes
    std::string failure_;
    Handlers handlers_;
};

}  // namespace zel
