#include "link/ByteLink.h"

#include <algorithm>
#include <cstddef>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "forms/Forms.h"
#include "link/WaitNotice.h"
#include "link/ZELBas.h"
#include "platform/LinkAddress.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "platform/SerialPort.h"
#include "platform/Services.h"
#include "platform/Session.h"
#include "platform/Socket.h"
#include "support/NumberText.h"
#include "support/StringOp.h"
#include "support/Text.h"
#include "support/Windows1252.h"

namespace zel {
namespace {

constexpr int kSocketWaitMs = 100;
constexpr int kSocketPollMs = 10;
constexpr int kInBufferSize = 12000;  // holds the largest binary transfer
constexpr int kOutBufferSize = 2048;
constexpr double kHighestPort = 32767;

}  // namespace

ByteLink::ByteLink(Forms& forms, ZELBas& state, SerialPort& ZELCommC, Socket& TCPSocket,
                   const Session& session, DebugChannel& debug)
    : panel_(forms.controller),
      dialog_(forms.main),
      state_(state),
      port_(ZELCommC),
      socket_(TCPSocket),
      events_(session.events),
      boxes_(session.boxes),
      debug_(debug),
      StopwatchB_(session.clock) {
    handlers_.on(socket_.DataArrival, [this] { state_.TCPDataArrived = true; });
}

bool ByteLink::isTcp() const { return panel_.ConnectionState == ControllerForm::TCPCON; }

bool ByteLink::OpenSerialPort(const std::string& port, long baud) {
    SerialSetup setup;
    setup.CommPort = port;
    setup.InBufferSize = kInBufferSize;
    setup.OutBufferSize = kOutBufferSize;
    setup.Settings = std::to_string(baud) + ",N,8,1";
    if (!port_.open(setup)) return false;
    dialog_.IsConnectedToPort = true;
    state_.InputBuffer.clear();
    return true;
}

void ByteLink::OpenPortFromDialog() {
    showPointer(dialog_, events_, kHourglass);
    state_.DialCancelled = false;
    const std::string device = serialDeviceName(dialog_.COMList.Text(), dialog_.CommPorts);
    if (device.empty()) {
        dialog_.MousePointer = kArrow;
        boxes_.show({BoxIcon::Plain, "Please enter a valid COM port!"});
        return;
    }
    const std::string baudText = dialog_.BaudList.Text();
    if (!IsNumericText(baudText)) {
        showPointer(dialog_, events_, kArrow);
        boxes_.show({BoxIcon::Plain, "Please enter a valid baud rate!"});
        return;
    }
    if (port_.isOpen()) {
        boxes_.show({BoxIcon::Plain, "Port is already open!"});
        showPointer(dialog_, events_, kArrow);
        return;
    }
    const double baud = leadingNumber(replaceAll(baudText, ",", ""));
    const bool opened = baud >= 1 && baud <= static_cast<double>(kFastestBaud) &&
                        OpenSerialPort(device, static_cast<long>(baud));
    if (opened) dialog_.OnPic.Visible = true;
    showPointer(dialog_, events_, kArrow);
    if (opened) return;
    std::string text = "Could not connect to the specified port!";
    if (!port_.problem().empty()) text += kCrLf + port_.problem();
    boxes_.show({BoxIcon::Warning, text});
}

bool ByteLink::usable() const {
    if (!isTcp()) return portOpen();
    return socket_.state() == SocketState::Connected || !socket_.peekData().empty();
}

void ByteLink::tellLoss() {
    showLinkLost(panel_, true);
    if (state_.LossTold) return;
    state_.LossTold = true;
    // Who lets the program connect again by itself is not asked: the bar says what happens.
    if (panel_.ReconnectAlways.Checked) return;
    const SocketState state = socket_.state();
    const char* reason = state == SocketState::PeerClosing ? "The other end closed the connection."
                         : state == SocketState::Error     ? "The connection broke."
                                                           : "The connection is closed.";
    boxes_.show({BoxIcon::Critical, std::string("TCP/IP Socket error") + kCrLf +
                                        "Please make a new connection." + kCrLf + reason});
}

void ByteLink::WriteToLink(const std::string& text) {
    const std::optional<std::string> bytes = toWindows1252(text);
    if (!bytes) return;
    state_.LateAnswerFirst = std::exchange(state_.AnswerOverdue, false);
    if (state_.LateAnswerFirst) takeBytes();
    if (isTcp()) {
        if (!socket_.sendData(*bytes)) return;
        state_.LossTold = false;
        debug_.output("-> " + text);
    } else if (dialog_.IsConnectedToPort) {
        port_.output(*bytes);
        debug_.output("-> " + text);
    }
}

std::string ByteLink::takeFromSocket() {
    StopwatchB_.Reset();
    while (socket_.peekData().empty() && StopwatchB_.Elapsed() <= kSocketWaitMs) {
        if (socket_.state() != SocketState::Connected && socket_.state() != SocketState::Connecting)
            break;  // nothing can come any more
        events_.wait(kSocketPollMs);
    }
    return socket_.getData();
}

std::string ByteLink::ReadFromLink(bool wait) {
    std::string result;
    if (isTcp()) {
        if (wait) result = takeFromSocket();
    } else if (dialog_.IsConnectedToPort && port_.isOpen()) {
        result = port_.input();
    } else if (!panel_.ErrorFlag && !saysLossInTheBar(panel_)) {
        boxes_.show({BoxIcon::Critical, "Not Connected To Port!"});
        panel_.ErrorFlag = true;
    }
    if (!result.empty()) debug_.output("<-" + result);
    state_.TCPDataArrived = false;
    return result;
}

void ByteLink::drain(int times) {
    // No event runs between the reads, so that the first empty one says all.
    for (int i = 0; i < times && !ReadFromLink(false).empty(); ++i) {
    }
}

void ByteLink::CloseComPort() { port_.close(); }

void ByteLink::CloseTCPSocket() { socket_.close(); }

void ByteLink::noteBlock(std::size_t bytes) {
    debug_.output("<-" + std::to_string(bytes) + " bytes");
}

std::string ByteLink::takeBytes() { return isTcp() ? socket_.getData() : port_.input(); }

std::string serialDeviceName(const std::string& text, const std::vector<std::string>& known) {
    std::string name = trimmed(text);
    if (name.empty()) return "";
    if (std::find(known.begin(), known.end(), name) != known.end()) return name;
    if (contains(name, "/")) return name;
    for (const std::string& path : known)
        if (path.ends_with("/" + name)) return path;
    const std::string number = trimmed(replaceAll(upperCase(name), "COM", ""));
    if (!IsNumericText(number)) return "";
    const double port = leadingNumber(number);
    if (port < 1 || port > kHighestPort || port != static_cast<double>(static_cast<int>(port)))
        return "";
    return "COM" + std::to_string(static_cast<int>(port));
}

}  // namespace zel
