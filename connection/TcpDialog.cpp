#include "connection/TcpDialog.h"

#include "connection/Profiles.h"
#include "link/WaitNotice.h"
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

TcpDialog::TcpDialog(Forms& forms, const InstrumentLink& link, SessionStart& start,
                     Socket& TCPSocket, SettingsStore& settings, const Session& session)
    : forms_(forms),
      panel_(forms.controller),
      dialog_(forms.tcpConnection),
      link_(link),
      start_(start),
      socket_(TCPSocket),
      settings_(settings),
      session_(session),
      StopwatchA_(session.clock) {
    handlers_.on(dialog_.Load, [this] { Form_Load(); });
    handlers_.on(panel_.TCPConnection.Clicked, [this] { TCPConnection_Click(); });
    handlers_.on(dialog_.ConnectTCPButton.Clicked, [this] { ConnectTCPButton_Click(); });
    handlers_.on(dialog_.QuitTCPButton.Clicked, [this] { QuitTCPButton_Click(); });
}

void TcpDialog::Form_Load() {
    dialog_.IPAdressTextBox.Text = settings_.get(kProgramName, kSection, "RemoteIP", "");
    dialog_.RemotePortTextBox.Text = settings_.get(kProgramName, kSection, "RemotePort", "");
}

void TcpDialog::TCPConnection_Click() {
    panel_.ConnectionState = ControllerForm::TCPCON;
    showModalForm(dialog_, session_.events);
}

void TcpDialog::ConnectTCPButton_Click() { connect(true); }

void TcpDialog::connect(bool readTrace) {
    const std::string portText = trimmed(dialog_.RemotePortTextBox.Text.get());
    const double port = leadingNumber(portText);
    if (!IsNumericText(portText) || port < 1 || port > kHighestPort) {
        dialog_.MousePointer = 0;
        session_.boxes.show({BoxIcon::Plain, "Please enter a valid TCP port!"});
        return;
    }
    settings_.set(kProgramName, kSection, "RemoteIP", dialog_.IPAdressTextBox.Text);
    settings_.set(kProgramName, kSection, "RemotePort", dialog_.RemotePortTextBox.Text);
    const DialogueScope scope(link_.state);
    dialog_.AdviceLabel.Caption = "";
    start_.setClock("start");
    if (socket_.state() != SocketState::Closed) socket_.close();
    const std::string host = trimmed(dialog_.IPAdressTextBox.Text.get());
    socket_.connectTo(host, static_cast<int>(port));
    const std::string where = host + ":" + portText;
    if (!awaitConnection(where)) return;
    dialog_.IDTextBox.Text = "CONNECTED to " + where;
    if (!probe()) {
        if (left()) return giveUp();
        dialog_.AdviceLabel.Caption = connectionAdvice(forms_);
        session_.boxes.show(
            {BoxIcon::Information, "No M&T ZEL3 found at the specified adress!", "No ZEL3 found"});
        start_.setClock("stop");
        return;
    }
    socket_.getData();
    start_.connect();
    dialog_.Hide();
    if (readTrace) start_.readFirstSweep();
}

bool TcpDialog::left() const { return link_.state.mustLeave(session_.clock.micros()); }

void TcpDialog::giveUp() {
    socket_.close();
    dialog_.IDTextBox.Text = "";
    start_.setClock("stop");
}

bool TcpDialog::awaitConnection(const std::string& where) {
    for (;;) {
        if (left()) {
            giveUp();
            return false;
        }
        const SocketState state = socket_.state();
        for (const StateText& row : kStateTexts)
            if (row.state == state) dialog_.IDTextBox.Text = row.text;
        if (state == SocketState::Connected) return true;
        // A socket that the user closed meanwhile will not connect any more.
        if (state == SocketState::Closed) return false;
        if (state == SocketState::Error) {
            if (!socket_.problem().empty())
                session_.boxes.show({BoxIcon::Critical, "The connection to " + where +
                                                            " failed: " + socket_.problem()});
            return false;
        }
        session_.events.wait(kPollMs);
    }
}

bool TcpDialog::probe() {
    StopwatchA_.Reset();
    link_.bytes.WriteToLink("\r");
    while (socket_.peekData().empty()) {
        if (StopwatchA_.Elapsed() > kProbeMs || left()) return false;
        session_.events.wait(kPollMs);
    }
    return true;
}

void TcpDialog::QuitTCPButton_Click() {
    link_.exchange.leaveWait(0);
    if (socket_.state() == SocketState::Open || socket_.state() == SocketState::Connecting)
        socket_.close();
    dialog_.IDTextBox.Text = "";
    dialog_.unload(1);
}

}  // namespace zel
