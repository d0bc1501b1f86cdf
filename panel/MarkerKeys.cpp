#include "panel/MarkerKeys.h"

#include <string_view>
#include <vector>

#include "forms/ControllerForm.h"
#include "link/CommandExchange.h"
#include "model/ZEL3Variables.h"
#include "panel/MarkerReadout.h"
#include "platform/Controls.h"
#include "platform/Form.h"
#include "platform/Graph.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "support/NumberText.h"
#include "support/Text.h"
#include "trace/FrequencyLabels.h"
#include "trace/Interlock.h"
#include "trace/TraceReader.h"

namespace zel {
namespace {

using CF = ControllerForm;

constexpr int kMoveMs = 700;  // the instrument needs it before the marker can be read
constexpr int kSwitchMs = 1000;

struct MarkerKeyRow {
    const char* command;
    Button CF::*key;
    const char* failure;
};
const MarkerKeyRow kKeys[] = {
    {"MARKPK", &CF::MarkPkButton, "Could not set marker to peak!"},
    {"MARKNXTPK", &CF::NextPeakButton, "Could not set marker to the next peak!"},
    {"MARKTOCENT", &CF::MarkToCentButton, "Could not set the current marker as center frequency!"},
    {"MARKTOLVL", &CF::MarkToRefButton, "Could not set the current marker to the Reference Level!"},
    {"MARKMIN", &CF::MinPeakButton, "Could not set marker to minimum!"},
};

const MarkerKeyRow& rowOf(const char* command) {
    for (const MarkerKeyRow& row : kKeys)
        if (std::string_view(row.command) == command) return row;
    return kKeys[0];
}

}  // namespace

MarkerKeys::MarkerKeys(ControllerForm& panel, ZEL3Variables& mirror, CommandExchange& exchange,
                       MarkerReadout& readout, TraceReader& traces, const Interlock& interlock)
    : panel_(panel),
      mirror_(mirror),
      exchange_(exchange),
      readout_(readout),
      traces_(traces),
      interlock_(interlock),
      events_(interlock.session().events),
      boxes_(interlock.session().boxes) {
    handlers_.on(panel_.MarkPkButton.Clicked, [this] { peak("MARKPK"); });
    handlers_.on(panel_.NextPeakButton.Clicked, [this] { peak("MARKNXTPK"); });
    handlers_.on(panel_.MinPeakButton.Clicked, [this] { peak("MARKMIN"); });
    handlers_.on(panel_.MarkToCentButton.Clicked, [this] { MarkToCentButton_Click(); });
    handlers_.on(panel_.MarkToRefButton.Clicked, [this] { MarkToRefButton_Click(); });
    handlers_.on(panel_.MarkerCheckBox.Clicked, [this] { MarkerCheckBox_Click(); });
    handlers_.on(panel_.DeltaCheckBox.Clicked, [this] { DeltaCheckBox_Click(); });
}

void MarkerKeys::paint(const char* command) {
    Button& pressed = panel_.*rowOf(command).key;
    const bool minimum = &pressed == &panel_.MinPeakButton;
    for (const MarkerKeyRow& row : kKeys) {
        Button& key = panel_.*row.key;
        if (&key == &pressed) {
            key.BackColor = kRed;
            continue;
        }
        // The minimum key is painted by itself alone, and leaves the peak key as it is.
        const bool left =
            &key == &panel_.MinPeakButton || (minimum && &key == &panel_.MarkPkButton);
        if (!left) key.BackColor = kButtonFace;
    }
}

bool MarkerKeys::command(const char* word) {
    if (exchange_.CmdInstrument(word)) {
        paint(word);
        return true;
    }
    boxes_.show({BoxIcon::Exclamation, rowOf(word).failure});
    return false;
}

void MarkerKeys::peak(const char* word) {
    if (interlock_.refuses(panel_.*rowOf(word).key)) return;
    const Hourglass busy(panel_, events_);
    if (command(word)) readout_.MakeMarkerReadout();
}

void MarkerKeys::MarkToCentButton_Click() {
    if (interlock_.refuses(panel_.MarkToCentButton)) return;
    const Hourglass busy(panel_, events_);
    if (!command("MARKTOCENT")) return;
    mirror_.Unsure.sent("FREQ", false);  // until the new one is known
    events_.sleep(kMoveMs);
    std::string answer;
    if (exchange_.GetInstrument("MARK1", answer) &&
        mirror_.Unsure.answered("FREQ", split(answer, ',').front())) {
        panel_.CFLabel.Caption = centerLabelText(split(answer, ',').front());
        mirror_.CenterFrequency = leadingNumber(answer);
    }
    readout_.MakeMarkerReadout();
    bool success{};
    traces_.ReadSingleTrace2({}, success);
}

void MarkerKeys::MarkToRefButton_Click() {
    if (interlock_.refuses(panel_.MarkToRefButton)) return;
    const Hourglass busy(panel_, events_);
    if (!command("MARKTOLVL")) return;
    mirror_.Unsure.sent("REFLVL", false);
    events_.sleep(kMoveMs);
    std::string answer;
    if (exchange_.GetInstrument("MARK1", answer)) {
        panel_.MarkerValue = leadingNumber(answer);
        const std::vector<std::string> pieces = split(answer, ',');
        // The centre did not move: the label takes the marker's x all the same.
        panel_.CFLabel.Caption = centerLabelText(pieces.front());
        if (pieces.size() > 1 && mirror_.Unsure.answered("REFLVL", pieces[1]))
            mirror_.ReferenceLevel =
                leadingNumber(replaceAll(formatPattern(leadingNumber(pieces[1]), "00,0"), ",", ""));
    }
    readout_.MakeMarkerReadout();
    bool success{};
    traces_.ReadSingleTrace2({}, success);
}

bool MarkerKeys::checkRefused(CheckBox& box) {
    if (interlock_.refuses(Interlock::Rule::NoPowerSensor)) return true;
    if (!panel_.isConnected) {
        if (!box.Value()) return true;
        interlock_.refuses(Interlock::Rule::ConnectedBySend);
        box.setValue(false);
        return true;
    }
    return interlock_.refuses(Interlock::Rule::NoContinuousView);
}

void MarkerKeys::deltaOff() {
    mirror_.DeltaOn = false;
    readout_.clear(MarkerKind::Delta);
}

void MarkerKeys::markerOff() {
    exchange_.SetInstrument("MARK1ON,0");
    mirror_.MarkerOn = false;
    readout_.clear(MarkerKind::Marker);
    if (panel_.CWGraph1.TrackMode == static_cast<int>(TrackMode::DragCursors))
        panel_.CWGraph1.TrackMode = static_cast<int>(TrackMode::Plain);
    if (!mirror_.DeltaOn) return;
    // The delta goes off in the program; nothing is sent about it.
    deltaOff();
    panel_.DeltaCheckBox.setValue(false);
}

void MarkerKeys::MarkerCheckBox_Click() {
    if (checkRefused(panel_.MarkerCheckBox)) return;
    const Hourglass busy(panel_, events_);
    if (!panel_.MarkerCheckBox.Value()) return markerOff();
    exchange_.SetInstrument("MARK1ON,1");
    mirror_.MarkerOn = true;
    events_.sleep(kSwitchMs);
    bool success{};
    traces_.ReadSingleTrace2({}, success);
    if (!success) return;
    readout_.MakeMarkerReadout();
    readout_.showCursor(MarkerKind::Marker, true);
    panel_.CWGraph1.TrackMode = static_cast<int>(TrackMode::DragCursors);
}

void MarkerKeys::DeltaCheckBox_Click() {
    // Switched off together with the marker, the box has nothing left to do.
    if (!panel_.DeltaCheckBox.Value() && panel_.isConnected && !mirror_.DeltaOn) return;
    if (checkRefused(panel_.DeltaCheckBox)) return;
    const Hourglass busy(panel_, events_);
    if (!panel_.DeltaCheckBox.Value()) {
        exchange_.SetInstrument("DELTA1ON,0");
        return deltaOff();
    }
    exchange_.SetInstrument("DELTA1ON,1");
    mirror_.DeltaOn = true;
    events_.sleep(kSwitchMs);
    readout_.readDelta();
    readout_.showCursor(MarkerKind::Delta, true);
}

}  // namespace zel
