#include "connection/ConnectionDialog.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <utility>

#include "connection/Profiles.h"
#include "connection/SessionStart.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "link/ByteLink.h"
#include "link/RS232Ops.h"
#include "platform/ModalForm.h"
#include "platform/SerialPort.h"
#include "platform/Session.h"

namespace zel {
namespace {

using CF = ControllerForm;

constexpr std::size_t kManyPorts = 1000;
constexpr int kFallbackPorts = 10;

}  // namespace

ConnectionDialog::ConnectionDialog(Forms& forms, ByteLink& link, SessionStart& start,
                                   Profiles& profiles, SerialPortList& ports,
                                   const Session& session)
    : panel_(forms.controller),
      dialog_(forms.main),
      link_(link),
      start_(start),
      profiles_(profiles),
      ports_(ports),
      session_(session) {
    handlers_.on(dialog_.Load, [this] { Form_Load(); });
    handlers_.on(panel_.Direct.Clicked, [this] { Direct_Click(); });
    handlers_.on(panel_.ImmConnect.Clicked, [this] { ImmConnect_Click(); });
    const std::pair<MenuItem*, std::int16_t> dialled[] = {{&panel_.Modem, CF::MODEMCON},
                                                          {&panel_.GSM, CF::GSMCON},
                                                          {&panel_.ModemToGSM, CF::MODEMGSMCON},
                                                          {&panel_.GSMToModem, CF::GSMMODEMCON}};
    for (const auto& [item, kind] : dialled) {
        handlers_.on(item->Clicked, [this, chosen = kind] {
            panel_.immConnectState = false;
            SetConnectionKind(chosen);
        });
    }
    handlers_.on(dialog_.ZELButton.Clicked, [this] { ZELButton_Click(); });
    handlers_.on(dialog_.LoadSettingsButton.Clicked, [this] { profiles_.LoadSettings_Click(); });
    handlers_.on(dialog_.SaveSettingsButton.Clicked, [this] { profiles_.SaveSettings_Click(); });
    for (Button* close : {&dialog_.CancelConnButton, &dialog_.CancelConnButton1}) {
        handlers_.on(close->Clicked, [this] {
            dialog_.Hide();
            panel_.ErrorFlag = false;
        });
    }
}

void ConnectionDialog::EnumerateComPorts() {
    dialog_.CommPorts.clear();
    ReadSerialPortNames(ports_, dialog_.CommPorts);
}

void ConnectionDialog::Form_Load() {
    EnumerateComPorts();
    dialog_.COMList.Clear();
    if (dialog_.CommPorts.size() < kManyPorts) {
        for (const std::string& name : dialog_.CommPorts) dialog_.COMList.AddItem(name);
    } else {
        for (int i = 1; i <= kFallbackPorts; ++i)
            dialog_.COMList.AddItem("COM" + std::to_string(i));
    }
    dialog_.COMList.setListIndex(0);
    if (dialog_.BaudList.ListCount() == 0)
        for (const char* baud : {"19200", "38400", "57600", "115200"})
            dialog_.BaudList.AddItem(baud);
    dialog_.BaudList.setListIndex(0);
    dialog_.ModemConnected = false;
    if (panel_.ConnectionState != CF::DIRECTCON) {
        dialog_.DialButton.Visible = true;
        dialog_.CancelButton.Visible = false;
    }
}

void ConnectionDialog::SetAllFramesInvisible() {
    dialog_.DirectConnectionFrame.Visible = false;
    dialog_.ModemConnectionFrame.Visible = false;
}

void ConnectionDialog::SetConnectionKind(std::int16_t kind) {
    panel_.ConnectionState = kind;
    // Ports come and go: the list is made again while nothing is connected.
    if (!panel_.isConnected) dialog_.unload(1);
    dialog_.load();
    dialog_.AdviceLabel.Caption = "";
    dialog_.SearchRatesButton.Visible = false;
    SetAllFramesInvisible();
    dialog_.DirectConnectionFrame.Visible = true;
    const bool direct = kind == CF::DIRECTCON;
    dialog_.CancelConnButton1.Visible = direct;
    dialog_.ZELButton.Visible = direct;
    dialog_.DisconnectButton.Visible = direct;
    if (!direct) dialog_.ModemConnectionFrame.Visible = true;
    dialog_.DisconnectButton2.Visible = !direct;
    dialog_.CancelConnButton.Visible = !direct;
    if (!direct) {
        dialog_.CancelButton.Visible = false;
        dialog_.LoadSettingsButton.Visible = true;
        dialog_.SaveSettingsButton.Visible = true;
    }
    profiles_.LoadSettings_Click();
    if (!panel_.immConnectState) showModal();
}

void ConnectionDialog::showModal() { showModalForm(dialog_, session_.events); }

void ConnectionDialog::Direct_Click() {
    panel_.immConnectState = false;
    SetConnectionKind(CF::DIRECTCON);
    // The direct link stores its fields by itself.
    dialog_.LoadSettingsButton.Visible = false;
    dialog_.SaveSettingsButton.Visible = false;
    dialog_.CancelConnButton.Visible = false;
    dialog_.DisconnectButton.Visible = true;
    dialog_.CancelConnButton1.Visible = true;
    if (!panel_.isConnected) dialog_.ZELButton.Visible = true;
}

void ConnectionDialog::ImmConnect_Click() {
    panel_.immConnectState = true;
    panel_.ImmConnect.Visible = false;
    SetConnectionKind(CF::DIRECTCON);
    ZELButton_Click();
}

void ConnectionDialog::ZELButton_Click() {
    connectDirect(true);
    start_.showFirstMenu();
}

void ConnectionDialog::connectDirect(bool readTrace) {
    dialog_.AdviceLabel.Caption = "";
    dialog_.SearchRatesButton.Visible = false;
    link_.OpenPortFromDialog();
    if (panel_.ConnectionState != CF::DIRECTCON || !dialog_.IsConnectedToPort) return;
    start_.setClock("start");
    start_.connect();
    profiles_.SaveSettings_Click();
    panel_.State = CF::Freq;
    if (readTrace) start_.readFirstSweep();
}

void ConnectionDialog::connectTo(const std::string& port, int baud, bool readTrace) {
    const bool quick = panel_.immConnectState;
    panel_.immConnectState = true;
    SetConnectionKind(CF::DIRECTCON);
    panel_.immConnectState = quick;
    dialog_.COMList.setText(port);
    dialog_.BaudList.setText(std::to_string(baud));
    connectDirect(readTrace);
    start_.showFirstMenu();
}

}  // namespace zel
