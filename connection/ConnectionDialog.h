#pragma once
// The connection dialog: the choice of the kind, the ports, and the direct link.

#include <cstdint>

#include "connection/Handshake.h"
#include "connection/Profiles.h"
#include "connection/SessionClock.h"
#include "forms/Forms.h"
#include "link/ByteLink.h"
#include "panel/SoftPanel.h"
#include "platform/Events.h"
#include "platform/SerialPort.h"
#include "trace/TraceReader.h"

namespace zel {

class ConnectionDialog {
  public:
    /// Connects the menu entries of the built kinds and the dialog's buttons.
    ConnectionDialog(Forms& forms, ByteLink& link, Handshake& handshake, Profiles& profiles,
                     SessionClock& sessionClock, SoftPanel& softPanel, TraceReader& traces,
                     SerialPortList& ports, Events& events);

    void Form_Load();
    /// The names of the platform's serial ports into `CommPorts`.
    void EnumerateComPorts();
    void SetAllFramesInvisible();
    void SetConnectionKind(std::int16_t kind);
    void Direct_Click();
    void ImmConnect_Click();
    void ZELButton_Click();
    /// Opens the port of the dialog and does the handshake; one sweep behind it with `readTrace`.
    void connectDirect(bool readTrace);

  private:
    void showModal();

    Forms& forms_;
    ControllerForm& panel_;
    MainForm& dialog_;
    ByteLink& link_;
    Handshake& handshake_;
    Profiles& profiles_;
    SessionClock& sessionClock_;
    SoftPanel& softPanel_;
    TraceReader& traces_;
    SerialPortList& ports_;
    Events& events_;
};

}  // namespace zel
