#include "connection/Reconnection.h"

#include <cstdint>
#include <string>

#include "connection/Disconnection.h"
#include "connection/KeptSettings.h"
#include "connection/Profiles.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "link/ByteLink.h"
#include "link/WaitNotice.h"
#include "model/ZEL3Variables.h"
#include "platform/Form.h"
#include "platform/LinkAddress.h"
#include "platform/PortProbe.h"
#include "platform/Socket.h"
#include "support/AtEnd.h"
#include "support/NumberText.h"
#include "support/Text.h"
#include "trace/Interlock.h"

namespace zel {
namespace {

using CF = ControllerForm;

constexpr const char* kSection = "Properties";
constexpr const char* kKey = "ReconnectByItself";
constexpr std::int64_t kAskAgainMicros = 5'000'000;
constexpr int kHighestPort = 65535;

}  // namespace

Reconnection::Reconnection(Forms& forms, ZEL3Variables& mirror, const Services& services,
                           const Dialogs& dialogs, Disconnection& disconnection,
                           const Interlock& interlock)
    : forms_(forms),
      panel_(forms.controller),
      mirror_(mirror),
      s_(services),
      dialogs_(dialogs),
      disconnection_(disconnection),
      interlock_(interlock) {
    putAway();
    panel_.ReconnectAlways.Checked = s_.settings.get(kProgramName, kSection, kKey, "0") == "1";
    handlers_.on(panel_.UpNow.Tick, [this] { look(); });
    handlers_.on(panel_.ReconnectAlways.Clicked,
                 [this] { setAlways(!panel_.ReconnectAlways.Checked); });
    handlers_.on(panel_.ReconnectButton.Clicked, [this] { reconnect(); });
    handlers_.on(panel_.ReconnectCloseButton.Clicked, [this] { putAway(); });
    // Who ends the session or begins another one needs the offer no more.
    handlers_.on(panel_.ConnectedPic.Changed, [this] {
        if (!busy_ && state_ != State::Quiet && state_ != State::Closed &&
            !panel_.ConnectedPic.Visible)
            putAway();
        if (!busy_ && state_ == State::Closed && panel_.ConnectedPic.Visible) putAway();
    });
}

Reconnection::~Reconnection() {
    if (view_ != 0) interlock_.session().events.cancel(view_);
}

void Reconnection::setAlways(bool always) {
    panel_.ReconnectAlways.Checked = always;
    s_.settings.set(kProgramName, kSection, kKey, always ? "1" : "0");
}

void Reconnection::putAway() {
    state_ = State::Quiet;
    for (Control* part : {static_cast<Control*>(&panel_.ReconnectFrame),
                          static_cast<Control*>(&panel_.ReconnectLabel),
                          static_cast<Control*>(&panel_.ReconnectButton),
                          static_cast<Control*>(&panel_.ReconnectCloseButton)})
        part->Visible = false;
}

void Reconnection::offer(const std::string& text, bool button) {
    panel_.ReconnectLabel.Caption = text;
    panel_.ReconnectLabel.Visible = true;
    panel_.ReconnectButton.Visible = button;
    panel_.ReconnectCloseButton.Visible = true;
    panel_.ReconnectFrame.Visible = true;
}

bool Reconnection::overTcp() const { return panel_.ConnectionState == CF::TCPCON; }

bool Reconnection::lineIsThere() const {
    if (overTcp()) {
        const SocketState state = s_.socket.state();
        return state == SocketState::Connected || state == SocketState::Connecting;
    }
    return panel_.ConnectionState != CF::DIRECTCON || s_.port.isOpen();
}

void Reconnection::look() {
    if (busy_) return;
    if (panel_.isConnected && !lineIsThere() && state_ == State::Quiet) lost();
    if (tcp_ && (state_ == State::Back || state_ == State::Closed)) return tryServerAgain();
    if (state_ == State::Gone || state_ == State::Back) lookForPort();
}

void Reconnection::lost() {
    tcp_ = overTcp();
    if (tcp_) {
        if (!keepServer()) return;
    } else {
        const auto baud = wholeNumber(forms_.main.BaudList.Text(), 1, kFastestBaud);
        port_ = forms_.main.COMList.Text();
        if (!baud || port_.empty()) return;
        baud_ = *baud;
    }
    before_ = keepSettingsOf(panel_, mirror_);
    viewRan_ = panel_.STOPFlag && panel_.StopButton.Visible && !panel_.RecordDataFlag;
    recorded_ = panel_.RecordDataFlag || forms_.time.ContinuousRecording;
    state_ = tcp_ ? State::Back : State::Gone;
    askAt_ = 0;
    paused_ = false;
    showLinkLost(panel_, true);
    if (tcp_) {
        offer("The connection to " + port_ + " was lost. What is shown stays until it is back.",
              true);
    } else {
        offer(port_ + " has gone. Plug it in again; what is shown stays until then.", false);
    }
}

/// The fields of the dialog may hold another address by the time of the next attempt.
bool Reconnection::keepServer() {
    const TCPConnectionForm& form = forms_.tcpConnection;
    const auto number = wholeNumber(trimmed(form.RemotePortTextBox.Text.get()), 1, kHighestPort);
    server_.port = trimmed(form.IPAdressTextBox.Text.get());
    if (!number || server_.port.empty()) return false;
    server_.number = *number;
    server_.kind = form.chkTls.Value() ? LinkAddress::Kind::Tls : LinkAddress::Kind::Tcp;
    server_.pinned = form.FingerprintTextBox.Text;
    port_ = server_.port + ":" + std::to_string(server_.number);
    return true;
}

void Reconnection::tryServerAgain() {
    if (!panel_.ReconnectAlways.Checked || paused_ || forms_.specialMeas.RunsActive > 0 ||
        forms_.tcpConnection.Visible || forms_.main.Visible ||
        interlock_.turnOf(panel_.ReconnectButton) != Interlock::Turn::Now ||
        interlock_.session().clock.micros() < askAt_)
        return;
    reconnect();
    paused_ = !panel_.isConnected && dialogs_.tcp.wasLeft();
    if (panel_.isConnected || paused_ || state_ == State::Quiet) return;
    askAt_ = interlock_.session().clock.micros() + kAskAgainMicros;
    offer("No connection to " + port_ + " yet: " + dialogs_.tcp.failure() +
              " It is tried again each 5 s.",
          true);
}

/// The dead socket takes no farewell, and that it is dead was reported.
void Reconnection::connectServer() {
    s_.line.LossTold = true;
    if (panel_.isConnected) disconnection_.endSession();
    panel_.ReconnectLabel.Caption = "Connecting to " + port_ + " again";
    panel_.ConnectionState = CF::TCPCON;
    TCPConnectionForm& form = forms_.tcpConnection;
    form.IPAdressTextBox.Text = server_.port;
    form.RemotePortTextBox.Text = std::to_string(server_.number);
    form.chkTls.setValue(server_.kind == LinkAddress::Kind::Tls);
    form.FingerprintTextBox.Text = server_.pinned;
    dialogs_.tcp.connectQuietly(panel_.InstrumentMode != CF::POWERSENSOR);
}

void Reconnection::lookForPort() {
    const std::string device = serialDeviceName(port_, forms_.main.CommPorts);
    const PortAccess access = s_.probe.access(device);
    if (!access.exists) {
        if (state_ == State::Back)
            offer(port_ + " has gone again. Plug it in; what is shown stays until then.", false);
        state_ = State::Gone;
        return;
    }
    if (state_ == State::Gone) {
        // The system gives the rights a moment after the name: the next look goes on.
        state_ = State::Back;
        offer(port_ + " is back.", true);
        return;
    }
    if (!panel_.ReconnectAlways.Checked || forms_.specialMeas.RunsActive > 0 ||
        interlock_.turnOf(panel_.ReconnectButton) != Interlock::Turn::Now)
        return;
    const Session& session = interlock_.session();
    if (!access.usable || session.clock.micros() < askAt_) return;
    // Without a box: the instrument may need its time to start.
    bool there = false;
    {
        busy_ = true;
        const AtEnd over([this] { busy_ = false; });
        there = s_.doctor.findRate(device, {baud_}, [](int) {}).has_value();
    }
    if (state_ != State::Back) return;
    if (there) return reconnect();
    askAt_ = session.clock.micros() + kAskAgainMicros;
    offer(port_ + " is back, but no instrument answers at " + std::to_string(baud_) +
              " baud yet. It is asked again each 5 s.",
          true);
}

void Reconnection::reconnect() {
    if (busy_ || state_ == State::Quiet) return;
    {
        busy_ = true;
        const AtEnd over([this] { busy_ = false; });
        panel_.ReconnectButton.Visible = false;
        if (tcp_) {
            connectServer();
        } else {
            if (panel_.isConnected) disconnection_.endSession();
            panel_.ReconnectLabel.Caption = "Connecting to " + port_ + " again";
            dialogs_.serial.connectTo(port_, baud_, panel_.InstrumentMode != CF::POWERSENSOR);
        }
    }
    if (panel_.isConnected) return report();
    state_ = State::Closed;
    showLinkLost(panel_, true);  // what is shown is old still
    if (tcp_) {
        const std::string why =
            dialogs_.tcp.wasLeft() ? "The attempt was left." : dialogs_.tcp.failure();
        return offer("No connection to " + port_ + ". " + why, true);
    }
    offer("No instrument answers on " + port_ + " at " + std::to_string(baud_) +
              " baud. Check that it is on, then try again.",
          true);
}

void Reconnection::report() {
    const std::string difference = differenceOf(before_, keepSettingsOf(panel_, mirror_));
    std::string text = "Connected to " + port_ + " again. ";
    text += difference.empty() ? "All settings are as before." : "Changed: " + difference + ".";
    if (recorded_) text += " The recording has ended; begin it again.";
    state_ = State::Quiet;
    offer(text, false);
    if (!viewRan_) return;
    viewRan_ = false;
    // The view is a loop: it is not to run inside of this tick.
    view_ = interlock_.session().events.schedule(0, [this] {
        view_ = 0;
        if (panel_.isConnected && panel_.PlayContinuousButton.Visible)
            panel_.PlayContinuousButton.Click();
    });
}

}  // namespace zel
