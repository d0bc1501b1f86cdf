#pragma once
// The connection dialog: the choice of the kind, the ports, and the direct link.

#include <cstdint>
#include <string>

#include "connection/Profiles.h"
#include "connection/SessionStart.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "forms/MainForm.h"
#include "link/ByteLink.h"
#include "platform/Event.h"
#include "platform/SerialPort.h"
#include "platform/Session.h"

namespace zel {

class ConnectionDialog {
  public:
    /// Connects the menu entries of the built kinds and the dialog's buttons.
    ConnectionDialog(Forms& forms, ByteLink& link, SessionStart& start, Profiles& profiles,
                     SerialPortList& ports, const Session& session);

    void Form_Load();
    /// The names of the platform's serial ports into `CommPorts`.
    void EnumerateComPorts();
    void SetAllFramesInvisible();
    void SetConnectionKind(std::int16_t kind);
    void Direct_Click();
    void ImmConnect_Click();
    void ZELButton_Click();
    /// Opens the port of the dialog and does the handshake; one sweep after it with `readTrace`.
    void connectDirect(bool readTrace);
    /// The same with that port and that baud rate in the dialog's fields, which stays hidden.
    void connectTo(const std::string& port, int baud, bool readTrace);

  private:
    void showModal();

    ControllerForm& panel_;
    MainForm& dialog_;
    ByteLink& link_;
    SessionStart& start_;
    Profiles& profiles_;
    SerialPortList& ports_;
    Session session_;
    Handlers handlers_;
};

}  // namespace zel
