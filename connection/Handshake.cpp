#include "connection/Handshake.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstdint>
#include <vector>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "link/InstrumentLink.h"
#include "link/WaitNotice.h"
#include "link/ZELBas.h"
#include "model/ZEL3Variables.h"
#include "panel/MenuFill.h"
#include "panel/ModeOptions.h"
#include "panel/SoftPanel.h"
#include "platform/Controls.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "platform/Session.h"
#include "support/CommandWord.h"
#include "support/NumberText.h"
#include "support/Text.h"
#include "trace/FrequencyLabels.h"

namespace zel {
namespace {

using CF = ControllerForm;

constexpr int kRadioSettleMs = 3000;
constexpr int kBeforeFirstCrMs = 500;
constexpr std::size_t kIdentityShown = 13;  // characters

}  // namespace

Handshake::Handshake(Forms& forms, ZEL3Variables& mirror, const InstrumentLink& link,
                     FrequencyLabels& labels, const MenuRoutines& menus, const Session& session)
    : forms_(forms),
      panel_(forms.controller),
      dialog_(forms.main),
      mirror_(mirror),
      state_(link.state),
      link_(link.bytes),
      reader_(link.reader),
      exchange_(link.exchange),
      labels_(labels),
      softPanel_(menus.softPanel),
      fill_(menus.fill),
      session_(session) {
    for (Button* cancel :
         {&dialog_.CancelButton, &dialog_.CancelConnButton, &dialog_.CancelConnButton1})
        handlers_.on(cancel->Clicked, [this] { exchange_.leaveWait(0); });
}

void Handshake::InitConnection() {
    const DialogueScope scope(state_);
    const bool dialled = panel_.ConnectionState != CF::DIRECTCON && !link_.isTcp();
    if (!dialled) state_.DialCancelled = false;
    state_.BareCrFirst = false;
    state_.SweepTimeTold = 0;
    // For as long as the handshake lasts, the keys that close the dialog leave it.
    for (Button* close : {&dialog_.CancelConnButton, &dialog_.CancelConnButton1})
        close->Caption = "Cancel";
    dialog_.Attempting = true;
    dialog_.SearchRatesButton.Visible = false;
    connect();
    dialog_.Attempting = false;
    for (Button* close : {&dialog_.CancelConnButton, &dialog_.CancelConnButton1})
        close->Caption = "Close";
    const bool failed = !panel_.isConnected && !state_.DialCancelled;
    if (failed && panel_.ConnectionState == CF::DIRECTCON) dialog_.SearchRatesButton.Visible = true;
    showConnectingStep(forms_, failed ? connectionAdvice(forms_) : std::string());
}

void Handshake::connect() {
    showPointer(dialog_, session_.events, kHourglass);
    DeselectOptionBoxes(panel_);
    dialog_.IsConnecting = true;
    if (!wakeInstrument()) return noInstrument(reader_.absenceTold());
    acceptRemote();
    if (!identify()) return;
    mirror_.Unsure.clear();
    if (!readDetector()) return;
    readMode();
    if (!instrumentAnswers()) return;
    bool ok = false;
    labels_.GetFreqForLabel(ok);
    if (!ok) return;
    if (panel_.InstrumentMode != CF::POWERSENSOR && !readState()) return;
    dialog_.IsConnecting = false;
    panel_.isConnected = true;
    connectedLook();
    fill_.FillTextFields("FREQ");
    showPointer(dialog_, session_.events, kArrow);
}

bool Handshake::wakeInstrument() {
    const std::int16_t kind = panel_.ConnectionState;
    if (kind == CF::GSMCON || kind == CF::MODEMGSMCON || kind == CF::GSMMODEMCON) {
        session_.DebugLine("...");
        session_.events.sleep(kRadioSettleMs);
    }
    const std::int16_t way = panel_.ConnectionState;
    showConnectingStep(forms_, std::string(way == CF::DIRECTCON ? "Port open"
                                           : way == CF::TCPCON  ? "Server reached"
                                                                : "Line up") +
                                   ", waiting for the instrument");
    session_.DebugLine("Sending initializing <CR> ...");
    session_.events.sleep(kBeforeFirstCrMs);
    link_.WriteToLink("\r");
    session_.DebugLine("Reading the first response...");
    if (reader_.ReadAnswer().empty()) return false;
    session_.DebugLine("Successful");
    showConnectingStep(forms_, "The instrument answers, reading its settings");
    showPointer(dialog_, session_.events, kHourglass);
    return true;
}

bool Handshake::instrumentAnswers() const { return link_.usable() && reader_.answered(); }

void Handshake::acceptRemote() {
    // While REMOTE is not accepted, the exchange shows no box of the instrument.
    state_.RemoteAccepted = false;
    state_.RemoteAccepted = exchange_.CmdInstrument("REMOTE");
    if (state_.RemoteAccepted || !instrumentAnswers()) return;
    exchange_.SetInstrument("MEAS,1");
    if (instrumentAnswers()) state_.RemoteAccepted = exchange_.CmdInstrument("REMOTE");
}

bool Handshake::identify() {
    std::string id;
    if (!instrumentAnswers() || !exchange_.GetInstrument("IDN?", id)) return false;
    const std::string head = id.substr(0, kIdentityShown);
    session_.DebugLine(head);
    const std::vector<std::string> fields = split(id, ',');
    if (fields.size() > 1)
        mirror_.InstrumentModel =
            static_cast<std::int16_t>(std::clamp(leadingNumber(fields[1]), -32768.0, 32767.0));
    if (fields.size() > 2) mirror_.InstrumentSerial = leadingNumber(fields[2]);
    if (trimmed(head).find("Marlow") == std::string::npos) {
        noInstrument(panel_.ErrorFlag);
        return false;
    }
    const bool tcp = panel_.ConnectionState == CF::TCPCON;
    (tcp ? forms_.tcpConnection.IDTextBox : dialog_.IDText).Text = id;
    showPointer(dialog_, session_.events, kArrow);
    return true;
}

bool Handshake::readDetector() {
    std::string answer;
    if (!exchange_.GetInstrument("TRACEDET", answer)) return false;
    if (answer == "-2") {  // a mode without a trace
        if (!exchange_.SetInstrument("MEAS,1")) return false;
        if (!exchange_.GetInstrument("TRACEDET", answer)) return false;
    }
    if (!mirror_.Unsure.answered("TRACEDET", answer)) return true;
    const auto number = static_cast<int>(std::clamp(leadingNumber(answer), -255.0, 255.0));
    mirror_.TraceDetector = static_cast<std::uint8_t>(number);
    return true;
}

void Handshake::readMode() {
    std::string answer;
    if (!exchange_.GetInstrument("MEAS", answer)) return;
    const double number = leadingNumber(answer);
    // Any number but those of the other modes stands for the analyzer.
    const bool other = number >= CF::TRACKINGGENERATOR && number <= CF::DISTTOFAULTMEASURE &&
                       number == std::floor(number);
    panel_.InstrumentMode = other ? static_cast<std::int16_t>(number) : CF::ANALYZER;
    modeOption(panel_, panel_.InstrumentMode).setValue(true);
}

bool Handshake::query(const char* word, double& field) {
    std::string answer;
    if (!exchange_.GetInstrument(word, answer)) return false;
    // No number: it was spoiled on its way.
    if (!mirror_.Unsure.answered(word, answer) && !exchange_.GetInstrument(word, answer))
        return false;
    if (mirror_.Unsure.answered(word, answer)) field = leadingNumber(answer);
    return true;
}

bool Handshake::readState() {
    bool ok = false;
    labels_.GetSpanForLabel(ok);
    double dynamicRange = 0;
    if (!ok || !query("UNIT", mirror_.ReferenceUnit) || !query("REFLVL", mirror_.ReferenceLevel) ||
        !query("RANGE", mirror_.ReferenceRange) || !query("DYNRANGE", dynamicRange))
        return false;
    mirror_.DynamicRangeMode = static_cast<std::uint8_t>(std::clamp(dynamicRange, 0.0, 255.0));
    if (!query("SWPTIME", mirror_.SweepTime) || !query("SWPCONT", mirror_.SweepContinuous))
        return false;
    if (mirror_.SweepContinuous != 0) {
        if (!exchange_.CmdInstrument("INIT")) return false;
    } else {
        panel_.SingleSweepModeActive = true;
    }
    return query("RBW", mirror_.ResolutionBandwidth) && query("VBW", mirror_.VideoBandwidth);
}

void Handshake::connectedLook() {
    panel_.SetDevice.Enabled = false;
    panel_.ConnectedPic.Visible = true;
    softPanel_.setKeyCaptions(CF::Freq);
    softPanel_.SetTextFieldsAndFrames(CF::Freq);
    panel_.State = CF::Freq;
    panel_.Picture3.Visible = true;
    if (testCommandWord(panel_, "BUTTON")) panel_.ImmConnect.Visible = false;
    dialog_.CancelButton.Visible = false;
    dialog_.Hide();
    panel_.Disconnect.Enabled = true;
    dialog_.ZELButton.Visible = false;
    dialog_.DisconnectButton.Visible = true;
    panel_.SaveCurrentView.Enabled = true;
    for (MenuItem* item : {&panel_.Direct, &panel_.Modem, &panel_.GSM, &panel_.GSMToModem,
                           &panel_.ModemToGSM, &panel_.TCPConnection})
        item->Enabled = false;
    panel_.RecordData.Enabled = true;
}

void Handshake::noInstrument(bool told) {
    dialog_.MousePointer = kArrow;
    panel_.isConnected = false;
    panel_.Picture3.Visible = false;
    if (!told) {
        if (!state_.DialCancelled)
            session_.boxes.show({BoxIcon::Critical, "No ZEL3 found at the specified address!"});
        panel_.ErrorFlag = false;
    }
    // What was opened for this attempt is given back, so that the next one can begin.
    if (panel_.ConnectionState == CF::DIRECTCON) {
        link_.CloseComPort();
        dialog_.IsConnectedToPort = false;
        dialog_.OnPic.Visible = false;
    }
    dialog_.DialButton.Visible = true;
    dialog_.CancelButton.Visible = false;
}

}  // namespace zel
