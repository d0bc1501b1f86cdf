#pragma once
// The server's window: its fields, its buttons, what it keeps, and what it shows of the bridge.

#include <string>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "forms/ServerForm.h"
#include "platform/Event.h"
#include "platform/Events.h"
#include "platform/SerialPort.h"
#include "platform/ServerSocket.h"
#include "platform/Services.h"
#include "platform/Session.h"
#include "server/ServerBridge.h"
#include "support/RootDebug.h"

namespace zel {

class ServerDialog {
  public:
    /// What the window needs of the platform beside the bundle.
    struct Services {
        SerialPortList& ports;
        SettingsStore& settings;
        Clipboard& clipboard;
    };
    /// Connects the form's events and buttons.
    ServerDialog(Forms& forms, ServerBridge& bridge, const ServerSocket& TCPSocket,
                 const Services& means, const Session& services, RootDebug& log);
    ~ServerDialog();
    ServerDialog(const ServerDialog&) = delete;
    ServerDialog& operator=(const ServerDialog&) = delete;

    void cmdConnect_Click();
    void cmdCancel_Click();
    /// Fills the lists and the fields; without the attempt that start-up mode makes.
    void fillFields();

  private:
    void Form_Load();
    void Form_QueryUnload(int& cancel);
    void loadSettings();
    void saveSettings();
    void saveKeep();
    void lost();
    void tryAgain();
    void showRetry();
    void note(const std::string& text);
    void bridgingLook(bool bridging);
    bool serverWord() const;

    ControllerForm& panel_;
    ServerForm& form_;
    ServerBridge& bridge_;
    const ServerSocket& socket_;
    Services means_;
    Session services_;
    RootDebug& log_;
    TaskId retry_ = 0;
    Handlers handlers_;
};

}  // namespace zel
