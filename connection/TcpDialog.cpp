#include "connection/TcpDialog.h"

#include "connection/Profiles.h"
#include "platform/ModalForm.h"
#include "support/NumberText.h"
#include "support/StringOp.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr const char* kSection = "TCPCON";
constexpr int kPollMs = 50;
constexpr int kProbeMs = 5000;
constexpr double kHighestPort = 65535;

struct StateText {
    SocketState state;
    const char* text;
};
constexpr StateText kStateTexts[] = {
    {SocketState::Connecting, "CONNECTING..."},
    {SocketState::Connected, "CONNECTED"},
    {SocketState::PeerClosing, "Remote host is closing the connection."},
    {SocketState::Error, "TCP Socket Error."},
};

}  // namespace

TcpDialog::TcpDialog(Forms& forms, ByteLink& link, Handshake& handshake, SessionClock& sessionClock,
                     TraceReader& traces, Socket& TCPSocket, SettingsStore& settings,
                     const Clock& clock, Events& events, MessageBoxes& boxes)
    : forms_(forms),
      panel_(forms.controller),
      dialog_(forms.tcpConnection),
      link_(link),
      handshake_(handshake),
      sessionClock_(sessionClock),
      traces_(traces),
      socket_(TCPSocket),
      settings_(settings),
      events_(events),
      boxes_(boxes),
      StopwatchA_(clock) {
    dialog_.Load.connect([this] { Form_Load(); });
    panel_.TCPConnection.Clicked.connect([this] { TCPConnection_Click(); });
    dialog_.ConnectTCPButton.Clicked.connect([this] { ConnectTCPButton_Click(); });
    dialog_.QuitTCPButton.Clicked.connect([this] { QuitTCPButton_Click(); });
}

void TcpDialog::Form_Load() {
    dialog_.IPAdressTextBox.Text = settings_.get(kProgramName, kSection, "RemoteIP", "");
    dialog_.RemotePortTextBox.Text = settings_.get(kProgramName, kSection, "RemotePort", "");
}

void TcpDialog::TCPConnection_Click() {
    panel_.ConnectionState = ControllerForm::TCPCON;
    showModalForm(dialog_, events_);
}

void TcpDialog::ConnectTCPButton_Click() { connect(true); }

void TcpDialog::connect(bool readTrace) {
    const std::string portText = trimmed(dialog_.RemotePortTextBox.Text.get());
    const double port = leadingNumber(portText);
    if (!IsNumericText(portText) || port < 1 || port > kHighestPort) {
        dialog_.MousePointer = 0;
        boxes_.show({BoxIcon::Plain, "Please enter a valid TCP port!"});
        return;
    }
    settings_.set(kProgramName, kSection, "RemoteIP", dialog_.IPAdressTextBox.Text);
    settings_.set(kProgramName, kSection, "RemotePort", dialog_.RemotePortTextBox.Text);
    sessionClock_.InitTimer("start");
    if (socket_.state() != SocketState::Closed) socket_.close();
    const std::string host = trimmed(dialog_.IPAdressTextBox.Text.get());
    socket_.connectTo(host, static_cast<int>(port));
    if (!awaitConnection()) return;
    dialog_.IDTextBox.Text = "CONNECTED to " + host + ":" + portText;
    if (!probe()) {
        boxes_.show(
            {BoxIcon::Information, "No M&T ZEL3 found at the specified adress!", "No ZEL3 found"});
        sessionClock_.InitTimer("stop");
        return;
    }
    socket_.getData();
    handshake_.InitConnection();
    dialog_.Hide();
    if (!readTrace || !panel_.isConnected || panel_.InstrumentMode == ControllerForm::POWERSENSOR)
        return;
    bool success = false;
    traces_.ReadSingleTrace2({}, success);
}

bool TcpDialog::awaitConnection() {
    for (;;) {
        const SocketState state = socket_.state();
        for (const StateText& row : kStateTexts)
            if (row.state == state) dialog_.IDTextBox.Text = row.text;
        if (state == SocketState::Connected) return true;
        // A socket that the user closed meanwhile will not connect any more.
        if (state == SocketState::Error || state == SocketState::Closed) return false;
        events_.wait(kPollMs);
    }
}

bool TcpDialog::probe() {
    StopwatchA_.Reset();
    link_.WriteToLink("\r");
    while (socket_.peekData().empty()) {
        if (StopwatchA_.Elapsed() > kProbeMs) return false;
        events_.wait(kPollMs);
    }
    return true;
}

void TcpDialog::QuitTCPButton_Click() {
    if (socket_.state() == SocketState::Open || socket_.state() == SocketState::Connecting)
        socket_.close();
    dialog_.IDTextBox.Text = "";
    dialog_.unload(1);
}

}  // namespace zel
