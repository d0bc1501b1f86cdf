#include "connection/TcpDialog.h"

#include <algorithm>
#include <cstddef>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "connection/Profiles.h"
#include "connection/SessionStart.h"
#include "forms/Forms.h"
#include "link/InstrumentLink.h"
#include "link/WaitNotice.h"
#include "link/ZELBas.h"
#include "platform/MessageBox.h"
#include "platform/ModalForm.h"
#include "platform/Pointer.h"
#include "platform/Services.h"
#include "platform/Session.h"
#include "platform/Socket.h"
#include "support/AtEnd.h"
#include "support/NumberText.h"
#include "support/StringOp.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr const char* kSection = "TCPCON";
constexpr std::string_view kTlsOf = "Tls of ";  // and the server: "0", or "1 " and the fingerprint
constexpr int kPollMs = 50;
constexpr int kProbeMs = 5000;
constexpr int kConnectMs = 30'000;
constexpr int kAnswerRestMs = 250;
constexpr double kHighestPort = 65535;
constexpr std::size_t kMostRecent = 8;
constexpr std::size_t kMostStale = 1U << 20;  // bytes that a server may have waiting

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
    handlers_.on(dialog_.RecentServersList.Clicked, [this] { chooseRecent(); });
    handlers_.on(panel_.TCPConnection.Clicked, [this] { TCPConnection_Click(); });
    handlers_.on(dialog_.ConnectTCPButton.Clicked, [this] { ConnectTCPButton_Click(); });
    handlers_.on(dialog_.QuitTCPButton.Clicked, [this] { QuitTCPButton_Click(); });
}

void TcpDialog::Form_Load() {
    const auto get = [this](const char* key) {
        return settings_.get(kProgramName, kSection, key, "");
    };
    dialog_.IPAdressTextBox.Text = get("RemoteIP");
    dialog_.RemotePortTextBox.Text = get("RemotePort");
    dialog_.chkTls.setValue(get("Tls") == "1");
    dialog_.FingerprintTextBox.Text = get("Fingerprint");
    dialog_.lblReason.Caption = "";
    loadRecent();
}

void TcpDialog::loadRecent() {
    std::vector<std::string> servers;
    for (std::size_t i = 1; i <= kMostRecent; ++i) {
        std::string server =
            settings_.get(kProgramName, kSection, "Recent" + std::to_string(i), "");
        if (!server.empty()) servers.push_back(std::move(server));
    }
    dialog_.RecentServersList.setItems(std::move(servers));
}

/// "HOST:PORT" comes first in the list of recent servers.
void TcpDialog::rememberServer(const std::string& server) {
    std::vector<std::string> servers = dialog_.RecentServersList.items();
    servers.erase(std::remove(servers.begin(), servers.end(), server), servers.end());
    servers.insert(servers.begin(), server);
    if (servers.size() > kMostRecent) servers.resize(kMostRecent);
    for (std::size_t i = 0; i < servers.size(); ++i)
        settings_.set(kProgramName, kSection, "Recent" + std::to_string(i + 1), servers[i]);
    dialog_.RecentServersList.setItems(std::move(servers));
    settings_.set(kProgramName, kSection, std::string(kTlsOf) + server,
                  dialog_.chkTls.Value() ? "1 " + dialog_.FingerprintTextBox.Text.get() : "0");
}

void TcpDialog::chooseRecent() {
    const std::string server = dialog_.RecentServersList.Text();
    const auto colon = server.rfind(':');
    if (colon == std::string::npos) return;
    dialog_.IPAdressTextBox.Text = server.substr(0, colon);
    dialog_.RemotePortTextBox.Text = server.substr(colon + 1);
    const std::string tls =
        settings_.get(kProgramName, kSection, std::string(kTlsOf) + server, "0");
    dialog_.chkTls.setValue(startsWith(tls, "1"));
    dialog_.FingerprintTextBox.Text = startsWith(tls, "1 ") ? tls.substr(2) : std::string();
}

void TcpDialog::saveSettings() {
    const auto set = [this](const char* key, const std::string& value) {
        settings_.set(kProgramName, kSection, key, value);
    };
    set("RemoteIP", dialog_.IPAdressTextBox.Text);
    set("RemotePort", dialog_.RemotePortTextBox.Text);
    set("Tls", dialog_.chkTls.Value() ? "1" : "0");
    set("Fingerprint", dialog_.FingerprintTextBox.Text);
}

void TcpDialog::TCPConnection_Click() {
    panel_.ConnectionState = ControllerForm::TCPCON;
    showModalForm(dialog_, session_.events);
}

void TcpDialog::ConnectTCPButton_Click() { connect(true); }

void TcpDialog::connectQuietly(bool readTrace) {
    quiet_ = true;
    const AtEnd over([this] { quiet_ = false; });
    connect(readTrace);
}

void TcpDialog::connect(bool readTrace) {
    if (dialog_.Connecting) return;
    failure_.clear();
    const std::string portText = trimmed(dialog_.RemotePortTextBox.Text.get());
    const double port = leadingNumber(portText);
    if (!IsNumericText(portText) || port < 1 || port > kHighestPort) {
        dialog_.MousePointer = kArrow;
        session_.boxes.show({BoxIcon::Plain, "Please enter a valid TCP port!"});
        return;
    }
    saveSettings();
    const DialogueScope scope(link_.state);
    dialog_.AdviceLabel.Caption = "";
    start_.setClock("start");
    quit_ = false;
    dialog_.lblReason.Caption = "";
    dialog_.Connecting = true;
    const std::string host = trimmed(dialog_.IPAdressTextBox.Text.get());
    const std::string step = "Connecting to " + host + ":" + portText;
    dialog_.AdviceLabel.Caption = step;
    const bool found = open(host, portText);
    dialog_.Connecting = false;
    if (dialog_.AdviceLabel.Caption.get() == step) dialog_.AdviceLabel.Caption = "";
    if (!found) return stopClock();
    start_.connect();
    if (!panel_.isConnected) stopClock();
    dialog_.Hide();
    if (readTrace) start_.readFirstSweep();
}

/// Connects and looks whether the server has an instrument.
bool TcpDialog::open(const std::string& host, const std::string& portText) {
    if (socket_.state() != SocketState::Closed) socket_.close();
    const int port = static_cast<int>(leadingNumber(portText));
    if (dialog_.chkTls.Value()) {
        std::string pinned = lowerCase(trimmed(dialog_.FingerprintTextBox.Text.get()));
        pinned = replaceAll(replaceAll(pinned, ":", ""), " ", "");
        socket_.connectTls(host, port, pinned);
    } else {
        socket_.connectTo(host, port);
    }
    const std::string where = host + ":" + portText;
    if (!awaitConnection(where)) return false;
    dialog_.IDTextBox.Text = "CONNECTED to " + where;
    rememberServer(host + ":" + portText);
    if (probe()) return true;
    if (quit_) return false;
    if (left()) {
        giveUp();
        return false;
    }
    const bool lives = socket_.state() == SocketState::Connected;
    dialog_.AdviceLabel.Caption = lives ? connectionAdvice(forms_) : endOfServer();
    failure_ = lives ? "The server is there, but no instrument answers." : endOfServer();
    if (!quiet_)
        session_.boxes.show(
            {BoxIcon::Information, "No M&T ZEL3 found at the specified adress!", "No ZEL3 found"});
    return false;
}

/// The reason stands in the dialog; where that is not on show a box says it.
void TcpDialog::failed(const std::string& where, const std::string& reason) {
    dialog_.lblReason.Caption = reason;
    failure_ = reason;
    if (dialog_.Visible || reason.empty() || quiet_) return;
    session_.boxes.show({BoxIcon::Critical, "The connection to " + where + " failed: " + reason});
}

/// Why a server has closed the connection that it had taken.
std::string TcpDialog::endOfServer() const {
    if (socket_.state() == SocketState::Error && !socket_.problem().empty())
        return socket_.problem();
    return "The server closed the connection. It may be at work for another client, or not let "
           "this computer in.";
}

bool TcpDialog::left() const { return link_.state.mustLeave(session_.clock.micros()); }

void TcpDialog::giveUp() {
    socket_.close();
    dialog_.IDTextBox.Text = "";
}

/// The next attempt of its own is due when the clock says so.
void TcpDialog::stopClock() {
    if (!quiet_) start_.setClock("stop");
}

bool TcpDialog::awaitConnection(const std::string& where) {
    StopwatchA_.Reset();
    for (;;) {
        if (left()) {
            giveUp();
            return false;
        }
        const SocketState state = socket_.state();
        if (!quit_)
            for (const StateText& row : kStateTexts)
                if (row.state == state) dialog_.IDTextBox.Text = row.text;
        if (state == SocketState::Connected) return true;
        if (state == SocketState::Error) {
            failed(where, socket_.problem());
            return false;
        }
        // A socket that the user closed meanwhile will not connect any more.
        if (quit_ || state == SocketState::Closed) return false;
        if (StopwatchA_.Elapsed() > kConnectMs) {
            socket_.close();
            dialog_.IDTextBox.Text = "TCP Socket Error.";
            failed(where, "The server did not answer within 30 seconds.");
            return false;
        }
        session_.events.wait(kPollMs);
    }
}

bool TcpDialog::probe() {
    StopwatchA_.Reset();
    link_.bytes.WriteToLink("\r");
    const auto lives = [this] { return !quit_ && socket_.state() == SocketState::Connected; };
    while (socket_.peekData().empty()) {
        if (StopwatchA_.Elapsed() > kProbeMs || !lives() || left()) return false;
        session_.events.wait(kPollMs);
    }
    // The rest of the line may come in another packet.
    StopwatchA_.Reset();
    std::string answer = socket_.getData();
    while (answer.find('\r') == std::string::npos && StopwatchA_.Elapsed() < kAnswerRestMs &&
           lives()) {
        session_.events.wait(kAnswerRestMs - StopwatchA_.Elapsed());
        answer += socket_.getData();
        if (answer.size() > kMostStale) break;
    }
    emptySocket();
    return !quit_;
}

/// What a server had waiting for this client is no answer to what will be asked.
void TcpDialog::emptySocket() {
    std::size_t taken = 0;
    for (;;) {
        const std::size_t size = socket_.getData().size();
        taken += size;
        if (size == 0 || taken > kMostStale) return;
    }
}

void TcpDialog::QuitTCPButton_Click() {
    quit_ = true;
    link_.exchange.leaveWait(0);
    const SocketState state = socket_.state();
    if (state == SocketState::Open || state == SocketState::Connecting || dialog_.Connecting)
        socket_.close();
    dialog_.IDTextBox.Text = "";
    dialog_.unload(1);
}

}  // namespace zel
