#include "server/ServerBridge.h"

#include <cstdint>
#include <string>

#include "forms/ControllerForm.h"
#include "forms/ServerForm.h"
#include "link/TCPIPOps.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "platform/SerialPort.h"
#include "platform/ServerSocket.h"
#include "platform/Session.h"
#include "platform/Socket.h"
#include "server/Networks.h"
#include "support/NumberText.h"
#include "support/RootDebug.h"
#include "support/StringOp.h"
#include "support/Text.h"

namespace zel {
namespace {

constexpr const char* kComponent = "ServerForm";
constexpr const char* kClass = "ServerBridge";
// Levels of the log.
constexpr int kInfo = 1;
constexpr int kRefused = 4;
constexpr std::int64_t kRefusedPauseMicros = 60'000'000;  // of one address
constexpr int kWatchMs = 1000;
constexpr double kHighestPort = 65535;

}  // namespace

ServerBridge::ServerBridge(ControllerForm& panel, ServerForm& form, SerialPort& SystemCommPort,
                           ServerSocket& TCPSocket, const Session& services, RootDebug& log)
    : panel_(panel),
      form_(form),
      port_(SystemCommPort),
      socket_(TCPSocket),
      services_(services),
      log_(log),
      relay_(form, SystemCommPort, TCPSocket.client(), services, log),
      search_(form, SystemCommPort, services, log) {
    handlers_.on(socket_.ConnectionRequest, [this](int id) { knocked(id); });
    handlers_.on(socket_.ProofFailed,
                 [this](int id, const std::string& reason) { refused(socket_.peer(id), reason); });
    handlers_.on(socket_.client().PeerClosed, [this] { clientGone(); });
    handlers_.on(relay_.ClientTooSlow, [this] { disconnectClient(); });
}

ServerBridge::~ServerBridge() { services_.events.cancel(watchTask_); }

/// An event for the user and the log.
void ServerBridge::report(int level, const char* routine, const std::string& text) {
    log_.LogMessage(level, routine, text);
    Happened(text);
}

void ServerBridge::captions(const std::string& text) {
    panel_.Caption = text;
    form_.Caption = text;
}

std::string ServerBridge::listenText() const {
    const std::string& at = form_.ListenAddress;
    const std::string address = at.empty() ? socket_.localIP() : at;
    const bool newKind = address.find(':') != std::string::npos;
    return (newKind ? "[" + address + "]" : address) + ":" + std::to_string(socket_.port());
}

void ServerBridge::StartListening(bool& ok) {
    const CallScope call(log_, kComponent, kClass, "StartListening");
    ok = false;
    const std::string portText = trimmed(form_.localPortTextBox.Text.get());
    const double port = leadingNumber(portText);
    if (!IsNumericText(portText) || port < 0 || port > kHighestPort) {
        form_.MousePointer = kArrow;
        problem_ = "Please enter a valid TCP port!";
        services_.boxes.show({BoxIcon::Plain, problem_});
        return;
    }
    ListenOnPort(socket_, portText, form_.ListenAddress);
    if (socket_.state() != SocketState::Listening) {
        problem_ = "The TCP port cannot be used!";
        if (!socket_.problem().empty()) problem_ += kCrLf + socket_.problem();
        log_.LogMessage(kRefused, "StartListening", replaceAll(problem_, kCrLf, " "));
        services_.boxes.show({BoxIcon::Warning, problem_});
        return;
    }
    form_.localPortTextBox.Text = std::to_string(socket_.port());
    const std::string at = form_.ListenAddress.empty() ? socket_.localIP() : form_.ListenAddress;
    captions("ZELRemote Server TCP/IP: " + at + ": " + std::to_string(socket_.port()));
    report(kInfo, "StartListening", "listening " + listenText());
    ok = true;
}

bool ServerBridge::connect(bool quiet) {
    const CallScope call(log_, kComponent, kClass, "connect");
    if (bridging_ || connecting_) return bridging_;
    problem_.clear();
    const auto networks = networksOf(form_.txtAllowed.Text.get());
    if (!networks) {
        problem_ = "Please enter valid networks, such as 192.168.1.0/24!";
        if (!quiet) services_.boxes.show({BoxIcon::Plain, problem_});
        return false;
    }
    allowed_ = *networks;
    connecting_ = true;
    relay_.restart();
    bool ok = false;
    StartListening(ok);
    showState();
    if (ok) {
        search_.setQuiet(quiet);
        search_.ConnectInstrument(ok);
        if (!ok) problem_ = search_.problem();
    }
    connecting_ = false;
    if (!ok) {
        disconnect();
        return false;
    }
    captions(form_.Caption.get() + " | ZEL: " + form_.COMList.Text() + ", " +
             form_.BaudList.Text());
    bridging_ = true;
    report(kInfo, "connect", "instrument " + form_.COMList.Text() + " " + form_.BaudList.Text());
    relay_.restart();
    watchTask_ = services_.events.schedule(kWatchMs, [this] { watchInstrument(); });
    showState();
    return true;
}

void ServerBridge::CloseCommPort() {
    const CallScope call(log_, kComponent, kClass, "CloseCommPort");
    if (port_.isOpen()) port_.close();
}

void ServerBridge::disconnect() {
    const CallScope call(log_, kComponent, kClass, "disconnect");
    search_.stop();
    services_.events.cancel(watchTask_);
    watchTask_ = 0;
    const bool was = bridging_ || socket_.state() != SocketState::Closed;
    bridging_ = false;
    relay_.restart();
    CloseCommPort();
    socket_.close();
    disconnectClient();
    showState();
    if (was) report(kInfo, "disconnect", "closed");
}

void ServerBridge::disconnectClient() {
    const CallScope call(log_, kComponent, kClass, "disconnectClient");
    CloseIfNotClosed(socket_.client());
    clientGone();
}

void ServerBridge::clientGone() {
    const CallScope call(log_, kComponent, kClass, "clientGone");
    relay_.restart();
    CloseIfNotClosed(socket_.client());
    if (hasClient_) {
        hasClient_ = false;
        clientAddress_.clear();
        report(kInfo, "clientGone", "client gone");
    }
    showState();
}

void ServerBridge::knocked(int requestId) {
    const CallScope call(log_, kComponent, kClass, "knocked");
    const std::string address = socket_.peer(requestId);
    const bool taken = hasClient_ && form_.chkKeep.Value();
    if (taken || !mayConnect(allowed_, address)) {
        socket_.refuse(requestId);
        return refused(address, taken ? "A client is at work." : "Not on the list.");
    }
    // The client at work stays until a newcomer has proved who he is.
    if (socket_.prove(requestId)) return;
    if (hasClient_) clientGone();
    AcceptRequest(socket_, requestId);
    relay_.restart();
    hasClient_ = true;
    clientAddress_ = address;
    report(kInfo, "knocked", "client " + address);
    showState();
}

// Somebody who knocks without end must not fill the log.
void ServerBridge::refused(const std::string& address, const std::string& reason) {
    const CallScope call(log_, kComponent, kClass, "refused");
    const std::int64_t now = services_.clock.micros();
    if (address != refusedAddress_ || now > refusedAt_ + kRefusedPauseMicros) {
        log_.LogMessage(kRefused, "refused", "refused " + address + ": " + reason);
        refusedAddress_ = address;
        refusedAt_ = now;
    }
    Happened("refused " + address);
}

void ServerBridge::watchInstrument() {
    const CallScope call(log_, kComponent, kClass, "watchInstrument");
    watchTask_ = 0;
    if (port_.isOpen()) {
        repair();
        // A client whose connection broke without a word is noticed here.
        const SocketState state = socket_.client().state();
        if (hasClient_ && state != SocketState::Connected && state != SocketState::Connecting)
            clientGone();
        showState();
        watchTask_ = services_.events.schedule(kWatchMs, [this] { watchInstrument(); });
        return;
    }
    problem_ = "Could not connect to the specified COM port!";
    const std::string why = port_.problem();
    if (!why.empty()) problem_ += kCrLf + why;
    report(kRefused, "watchInstrument",
           "error " + (why.empty() ? std::string("the instrument's port has gone") : why));
    disconnect();
    Lost();
}

void ServerBridge::repair() {
    const CallScope call(log_, kComponent, kClass, "repair");
    if (socket_.state() != SocketState::Error) return;
    socket_.close();
    ListenOnPort(socket_, form_.localPortTextBox.Text, form_.ListenAddress);
    log_.LogMessage(kRefused, "repair", "Connection broken");
    form_.txtDebug.Text = "Connection broken";
    showState();
}

void ServerBridge::showState() {
    const CallScope call(log_, kComponent, kClass, "showState");
    form_.ListenState = static_cast<std::int16_t>(socket_.state());
    form_.ClientState = hasClient_ ? static_cast<std::int16_t>(socket_.client().state()) : 0;
    form_.txtClientIP.Visible = hasClient_;
    form_.lblClient.Visible = hasClient_;
    form_.txtClientIP.Text = clientAddress_;
    form_.cmdDisconnectClient.Enabled = hasClient_;
    form_.picConnected.Visible = bridging_;
    const char* state = "Not listening";
    if (form_.ServerConnecting) {
        state = "Looking for the instrument";
    } else if (bridging_ && hasClient_) {
        state = "A client is connected";
    } else if (bridging_) {
        state = "Waiting for a client";
    } else if (connecting_) {
        state = "Looking for the instrument";
    }
    form_.lblState.Caption = state;
    const std::string sweeps =
        std::to_string(relay_.sweeps()) + (relay_.sweeps() == 1 ? " sweep" : " sweeps");
    form_.lblToInstrument.Caption = std::to_string(relay_.bytesToInstrument()) + " bytes";
    form_.lblToClient.Caption = std::to_string(relay_.bytesToClient()) + " bytes, " + sweeps;
}

}  // namespace zel
