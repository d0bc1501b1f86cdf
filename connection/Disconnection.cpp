#include "connection/Disconnection.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>

#include "connection/SessionClock.h"
#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "link/InstrumentLink.h"
#include "link/WaitNotice.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "platform/Socket.h"
#include "support/CommandWord.h"
#include "trace/GraphInteraction.h"
#include "trace/Interlock.h"

namespace zel {
namespace {

using CF = ControllerForm;

constexpr int kModemAnswerMs = 5001;
constexpr int kModemPauseMs = 500;
constexpr int kModemSilenceMs = 1000;
constexpr int kPollMs = 20;
constexpr std::size_t kLongestModemAnswer = 4096;

}  // namespace

Disconnection::Disconnection(Forms& forms, const InstrumentLink& link, Socket& TCPSocket,
                             SessionClock& sessionClock, GraphInteraction& graph,
                             const Interlock& interlock)
    : forms_(forms),
      panel_(forms.controller),
      dialog_(forms.main),
      link_(link.bytes),
      exchange_(link.exchange),
      socket_(TCPSocket),
      sessionClock_(sessionClock),
      graph_(graph),
      interlock_(interlock),
      session_(interlock.session()),
      StopwatchA_(session_.clock) {
    handlers_.on(dialog_.DisconnectButton.Clicked, [this] { DisconnectButton_Click(); });
    handlers_.on(dialog_.DisconnectButton2.Clicked, [this] { DisconnectButton_Click(); });
    handlers_.on(panel_.Disconnect.Clicked, [this] { DisconnectButton_Click(); });
    handlers_.on(link.reader.AttemptAbandoned, [this] { giveAttemptBack(); });
}

void Disconnection::DisconnectButton_Click() {
    if (interlock_.refuses(panel_.Disconnect)) return;
    if (!panel_.isConnected) return attemptOver();
    const BoxAnswer answer =
        session_.boxes.show({BoxIcon::Question, "Are you sure you want to close the connection?",
                             "Disconnect", BoxButtons::OkCancel});
    if (answer != BoxAnswer::Ok) {
        showPointer(panel_, session_.events, kHourglass);
        exchange_.CmdInstrument("REMOTE");
        panel_.MousePointer = kArrow;
        return;
    }
    endSession();
}

void Disconnection::attemptOver() {
    if (!panel_.ErrorFlag && !link_.portOpen()) {
        session_.boxes.show({BoxIcon::Information, "Not Connected"});
        panel_.ErrorFlag = true;
    }
    giveAttemptBack();
}

void Disconnection::giveAttemptBack() {
    showPointer(panel_, session_.events, kArrow);
    if (link_.portOpen()) link_.CloseComPort();
    session_.DebugLine(" ");
}

void Disconnection::endSession() {
    const bool tcp = panel_.ConnectionState == CF::TCPCON;
    const bool direct = panel_.ConnectionState == CF::DIRECTCON;
    if (link_.portOpen() || tcp) {
        showPointer(panel_, session_.events, kHourglass);
        if (exchange_.busy()) {
            // What is under way is left: no exchange begins inside another.
            exchange_.leaveWait(0);
            exchange_.sayLocal();
        } else {
            exchange_.CmdInstrument("LOCAL");
        }
        socket_.close();
        showPointer(panel_, session_.events, kArrow);
    }
    if (!direct && !tcp && link_.portOpen()) HangUpModem();
    if (link_.portOpen()) ClosePortAndClearIdentity();
    if (tcp) {
        link_.CloseTCPSocket();
        forms_.tcpConnection.IDTextBox.Text = "";
    }
    notConnectedLook();
}

void Disconnection::endAtOnce() {
    const bool begun = panel_.isConnected || dialog_.IsConnecting || dialog_.IsConnectedToPort;
    const bool dialled = panel_.ConnectionState != CF::DIRECTCON && !link_.isTcp();
    if (begun && link_.usable()) {
        exchange_.sayLocal();
        if (dialled && link_.portOpen()) HangUpModem();
    }
    link_.CloseComPort();
    link_.CloseTCPSocket();
    panel_.isConnected = false;
}

void Disconnection::notConnectedLook() {
    showLinkLost(panel_, false);
    dialog_.AirBaudRateText.Text = "";
    dialog_.ModemConnected = false;
    dialog_.ZELButton.Visible = true;
    dialog_.DisconnectButton2.Visible = false;
    dialog_.DialButton.Visible = true;
    dialog_.CancelButton.Visible = false;
    panel_.Disconnect.Enabled = false;
    panel_.RecordData.Enabled = false;
    sessionClock_.InitTimer("stop");
    panel_.State = 0;
    panel_.SetDevice.Enabled = true;
    dialog_.unload(1);
    for (MenuItem* item : {&panel_.Direct, &panel_.Modem, &panel_.GSM, &panel_.GSMToModem,
                           &panel_.ModemToGSM, &panel_.TCPConnection})
        item->Enabled = true;
    panel_.ConnectedPic.Visible = false;
    panel_.Picture3.Visible = false;
    panel_.isConnected = false;
    if (link_.portOpen()) link_.CloseComPort();
    dialog_.OnPic.Visible = false;
    dialog_.AirBaudRateText.Text = "";
    if (testCommandWord(panel_, "BUTTON")) panel_.ImmConnect.Visible = true;
    panel_.Connection.Enabled = true;
    panel_.Utility.Enabled = true;
    if (panel_.StopButton.Visible) panel_.StopButton.Click();
    graph_.finishCursors();
    panel_.MousePointer = kArrow;
}

void Disconnection::HangUpModem() {
    // A modem takes "+++" for a command only with a second of silence before it and after it.
    // The answers make no difference: the hang-up goes on in any case.
    session_.events.sleep(kModemSilenceMs);
    link_.WriteToLink("+++");
    awaitModemAnswer();
    const std::int32_t silent = StopwatchA_.Elapsed();
    session_.events.sleep(std::max(kModemPauseMs, kModemSilenceMs - silent));
    link_.WriteToLink("ATH0\r");
    awaitModemAnswer();
}

void Disconnection::awaitModemAnswer() {
    std::string answer;
    StopwatchA_.Reset();
    while (StopwatchA_.Elapsed() < kModemAnswerMs && link_.portOpen()) {
        answer += link_.ReadFromLink(true);
        if (answer.find('\r') != std::string::npos || answer.size() > kLongestModemAnswer) return;
        session_.events.wait(kPollMs);
    }
}

void Disconnection::ClosePortAndClearIdentity() {
    link_.CloseComPort();
    dialog_.OnPic.Visible = false;
    dialog_.IDText.Text = "";
    dialog_.IsConnectedToPort = false;
    panel_.isConnected = false;
}

}  // namespace zel
