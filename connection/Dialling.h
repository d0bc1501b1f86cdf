#pragma once
// Calls the instrument over modems or mobile phones, up to the handshake.

#include <string>

#include "connection/ConnectionDialog.h"
#include "connection/Disconnection.h"
#include "connection/SessionStart.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "forms/MainForm.h"
#include "link/InstrumentLink.h"
#include "platform/Event.h"
#include "platform/Session.h"

namespace zel {

/// What a modem says of a call, in the order in which its words are looked for. Null for a call
/// that stands: none of the words was found.
const char* callProblem(const std::string& answer);

/// What came after the dial command, without its echo and without the "OK" of the commands ahead
/// of it, which a slow modem sends late.
std::string callAnswer(std::string text, const std::string& dialled);

class Dialling {
  public:
    /// Connects the dialog's dial and cancel buttons.
    Dialling(Forms& forms, const InstrumentLink& link, ConnectionDialog& dialog,
             SessionStart& start, Disconnection& disconnection, const Session& session);

    void DialButton_Click();
    void CancelButton_Click();
    /// The number of the dialog is dialled; one sweep after the handshake with `readTrace`.
    void dial(bool readTrace);
    /// Sends "ATQ0" and looks for "OK".
    void ConfirmModemMode(bool& ok);
    /// Reports why there is no connection and closes the port; `ok` when there is one.
    void CheckAnswer(const std::string& text, bool& ok);

  private:
    bool call(const std::string& number);
    bool wakeModem();
    bool awaitCall(const std::string& dialled, std::string& answer);
    void collectRest(const std::string& dialled, std::string& answer);
    void session(const std::string& answer, bool readTrace);
    void send(const std::string& command);
    void awaitOk();
    bool pause(int ms);
    void portLost();
    void failed(const std::string& text);
    void closePort();
    void dialOver();
    double seconds() const;

    ControllerForm& panel_;
    MainForm& form_;
    InstrumentLink link_;
    ConnectionDialog& dialog_;
    SessionStart& start_;
    Disconnection& disconnection_;
    Session session_;
    std::string collected_;
    bool told_ = false;  ///< why there is no connection
    /// In seconds of the monotonic clock; long ago while nothing was dialled.
    double DialStartTime_ = -1e9;
    Handlers handlers_;
};

}  // namespace zel
