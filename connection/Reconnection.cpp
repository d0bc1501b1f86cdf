#include "connection/Reconnection.h"

#include "connection/Profiles.h"
#include "link/ByteLink.h"
#include "link/WaitNotice.h"
#include "platform/LinkAddress.h"
#include "support/AtEnd.h"
#include "support/NumberText.h"

namespace zel {
namespace {

using CF = ControllerForm;

constexpr const char* kSection = "Properties";
constexpr const char* kKey = "ReconnectByItself";
constexpr std::int64_t kAskAgainMicros = 5'000'000;

}  // namespace

Reconnection::Reconnection(Forms& forms, ZEL3Variables& mirror, const Services& services,
                           ConnectionDialog& dialog, Disconnection& disconnection,
                           const Interlock& interlock)
    : forms_(forms),
      panel_(forms.controller),
      mirror_(mirror),
      s_(services),
      dialog_(dialog),
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

void Reconnection::look() {
    if (busy_) return;
    const bool open = panel_.ConnectionState != CF::DIRECTCON || s_.port.isOpen();
    if (panel_.isConnected && !open && state_ == State::Quiet) lost();
    if (state_ == State::Gone || state_ == State::Back) lookForPort();
}

void Reconnection::lost() {
    const auto baud = wholeNumber(forms_.main.BaudList.Text(), 1, kFastestBaud);
    port_ = forms_.main.COMList.Text();
    if (!baud || port_.empty()) return;
    baud_ = *baud;
    before_ = keepSettingsOf(panel_, mirror_);
    viewRan_ = panel_.STOPFlag && panel_.StopButton.Visible && !panel_.RecordDataFlag;
    recorded_ = panel_.RecordDataFlag || forms_.time.ContinuousRecording;
    state_ = State::Gone;
    askAt_ = 0;
    showLinkLost(panel_, true);
    offer(port_ + " has gone. Plug it in again; what is shown stays until then.", false);
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
        if (panel_.isConnected) disconnection_.endSession();
        panel_.ReconnectLabel.Caption = "Connecting to " + port_ + " again";
        dialog_.connectTo(port_, baud_, panel_.InstrumentMode != CF::POWERSENSOR);
    }
    if (panel_.isConnected) return report();
    state_ = State::Closed;
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
