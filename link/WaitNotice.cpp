#include "link/WaitNotice.h"

#include <cstdint>
#include <string>

#include "forms/Forms.h"
#include "platform/Controls.h"

namespace zel {
namespace {

constexpr std::int64_t kSilentMs = 1000;
constexpr std::int64_t kMinuteS = 60;

std::string lengthText(std::int64_t seconds) {
    if (seconds < 2 * kMinuteS) return std::to_string(seconds) + " s";
    return std::to_string((seconds + kMinuteS - 1) / kMinuteS) + " min";
}

}  // namespace

WaitNotice::WaitNotice(Forms& forms) : forms_(forms), panel_(forms.controller) {}

Label& WaitNotice::dialogLabel() const {
    const bool tcp = panel_.ConnectionState == ControllerForm::TCPCON;
    return tcp ? forms_.tcpConnection.AdviceLabel : forms_.main.AdviceLabel;
}

void WaitNotice::tell(std::int64_t elapsedMs, std::int64_t timeoutMs) {
    if (!panel_.isConnected) showStep(elapsedMs, timeoutMs);
    if (elapsedMs < kSilentMs) return;
    const std::int64_t left = (timeoutMs - elapsedMs + 999) / 1000;
    if (left == shownSeconds_) return;
    if (shownSeconds_ < 0 && !panel_.StopButton.Visible) {
        panel_.StopButton.Visible = true;
        lentStop_ = true;
    }
    shownSeconds_ = left;
    const std::string text = "Waiting for the instrument, at most " + lengthText(left) + " more";
    panel_.WaitLabel.Caption = text;
}

void WaitNotice::showStep(std::int64_t elapsedMs, std::int64_t timeoutMs) {
    Label& label = dialogLabel();
    if (!stepShown_) step_ = label.Caption;
    stepShown_ = true;
    const std::string what = step_.empty() ? "Waiting for the instrument" : step_;
    // A wait is not over before the last second that is named.
    const std::string text = what + ", " + std::to_string(elapsedMs / 1000) + " of " +
                             lengthText((timeoutMs + 999) / 1000);
    if (label.Caption.get() != text) label.Caption = text;
}

void WaitNotice::clear() {
    if (stepShown_) dialogLabel().Caption = step_;
    stepShown_ = false;
    if (shownSeconds_ < 0) return;
    shownSeconds_ = -1;
    panel_.WaitLabel.Caption = "";
    if (lentStop_) panel_.StopButton.Visible = false;
    lentStop_ = false;
}

void showLinkLost(ControllerForm& panel, bool lost) {
    panel.LinkLost = lost;
    if (lost) panel.CWGraph1.Old = true;  // until the next trace is drawn
    panel.ConnectedPic.Image = lost ? "lost" : "connected";
}

bool saysLossInTheBar(const ControllerForm& panel) {
    return panel.isConnected && panel.ReconnectAlways.Checked;
}

void showConnectingStep(Forms& forms, const std::string& step) {
    const bool tcp = forms.controller.ConnectionState == ControllerForm::TCPCON;
    (tcp ? forms.tcpConnection.AdviceLabel : forms.main.AdviceLabel).Caption = step;
}

std::string connectionAdvice(const Forms& forms) {
    if (forms.controller.ConnectionState == ControllerForm::TCPCON) {
        return forms.tcpConnection.IPAdressTextBox.Text.get() + ":" +
               forms.tcpConnection.RemotePortTextBox.Text.get() +
               ": check that the server runs there, that its instrument is on and connected, and "
               "that no firewall is between";
    }
    const std::string baud = forms.main.BaudList.Text();
    return forms.main.COMList.Text() + " at " + baud +
           " baud: check that the instrument is on, that its cable is at this port, and that it "
           "is set to " +
           baud + " baud";
}

}  // namespace zel
