#include "panel/Z9SetCommands.h"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <stdexcept>
#include <string>

#include "forms/ControllerForm.h"
#include "link/CommandExchange.h"
#include "model/CodeTables.h"
#include "model/MirrorField.h"
#include "model/Numeric.h"
#include "model/ZEL3Variables.h"
#include "panel/KeyRoutines.h"
#include "panel/ModeOptions.h"
#include "panel/SoftPositions.h"
#include "panel/TriggerKey.h"
#include "panel/Z9GetCommands.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "platform/Session.h"
#include "support/NumberText.h"
#include "support/Text.h"
#include "trace/FrequencyLabels.h"

namespace zel {
namespace {

using CF = ControllerForm;
using ZV = ZEL3Variables;

constexpr double kZeroSpanCentre = 1.5e9;
constexpr int kReceiverChoice = 8;

}  // namespace

Z9SetCommands::Z9SetCommands(ControllerForm& panel, ZEL3Variables& mirror,
                             CommandExchange& exchange, const KeyRoutines& routines,
                             Z9GetCommands& queries, const Session& session)
    : panel_(panel),
      mirror_(mirror),
      exchange_(exchange),
      routines_(routines),
      queries_(queries),
      session_(session) {}

Z9SetCommands::Quirk Z9SetCommands::quirk(EntryQuirk which) {
    using Z = Z9SetCommands;
    struct Row {
        EntryQuirk which;
        Quirk does;
    };
    static constexpr Row kQuirks[] = {
        {EntryQuirk::AfterCentre, &Z::afterCentre},
        {EntryQuirk::AfterOffset, &Z::afterOffset},
        {EntryQuirk::AfterBandwidth, &Z::afterBandwidth},
        {EntryQuirk::AfterSweepTime, &Z::afterSweepTime},
        {EntryQuirk::ManualSpan, &Z::manualSpan},
        {EntryQuirk::StartFrequency, &Z::startFrequency},
        {EntryQuirk::StopFrequency, &Z::stopFrequency},
        {EntryQuirk::ZeroSpan, &Z::zeroSpan},
        {EntryQuirk::AutoSweepTime, &Z::autoSweepTime},
        {EntryQuirk::SweepMode, &Z::sweepMode},
        {EntryQuirk::TriggerSource, &Z::triggerSource},
        {EntryQuirk::TriggerValue, &Z::triggerValue},
        {EntryQuirk::Marker, &Z::marker},
        {EntryQuirk::MeasurementMode, &Z::measurementMode},
    };
    for (const Row& row : kQuirks)
        if (row.which == which) return row.does;
    return nullptr;
}

void Z9SetCommands::enter(int index) {
    // With the other option selected an Enter asks, as the key does.
    if (!panel_.SetOption.Value()) return queries_.press(index);
    for (const SoftPosition& position : softPositions()) {
        if (position.state != panel_.State || position.key != index) continue;
        if (position.source != EntrySource::None) {
            send(position);
        } else if (const Quirk does = quirk(position.onEntry)) {
            (this->*does)(index);
        }
    }
}

double Z9SetCommands::boxValue(int index) const {
    std::string prefix;
    return ParseValue(panel_.SoftTextBox(index).Text, prefix);
}

bool Z9SetCommands::valueText(const SoftPosition& position, std::string& text) const {
    const int index = position.key;
    double number = 0;
    switch (position.source) {
        case EntrySource::None:
            return false;
        case EntrySource::Value:
            number = boxValue(index);
            break;
        case EntrySource::LocaleValue:
            text = generalNumber(boxValue(index));
            return true;
        case EntrySource::Whole:
            number = std::trunc(boxValue(index));
            if (number < -2147483648.0 || number > 2147483647.0) return false;
            break;
        case EntrySource::Word:
            number = std::nearbyint(boxValue(index));
            if (number < -32768 || number > 32767) return false;
            break;
        case EntrySource::Choice:
            number = panel_.ChoiceBox(index).ListIndex();
            break;
        case EntrySource::Text:
            text = trimmed(panel_.SoftTextBox(index).Text.get());
            return true;
    }
    text = WireNumber(number);
    return true;
}

void Z9SetCommands::send(const SoftPosition& position) {
    routines_.softPanel.SetSoftButtonsColor(position.key);
    std::string text;
    if (!valueText(position, text)) {
        session_.boxes.show({BoxIcon::Plain, "Out of Range!"});
        return;
    }
    const Hourglass busy(panel_, session_.events);
    const std::string word = position.wordToSet();
    const bool accepted = exchange_.SetInstrument(word + "," + text);
    // The mirror takes the number as it was written in the command.
    storeField(mirror_, position.fieldToSet(), leadingNumber(text), text);
    if (position.fieldToSet().index() != 0) mirror_.Unsure.sent(word, accepted);
    if (const Quirk after = quirk(position.onEntry)) (this->*after)(position.key);
}

void Z9SetCommands::showEdges() {
    const double half = mirror_.Span / 2;
    panel_.SoftTextBox(3).Text = FormatValue(mirror_.CenterFrequency + half, "Hz");
    panel_.SoftTextBox(2).Text = FormatValue(mirror_.CenterFrequency - half, "Hz");
}

void Z9SetCommands::showSpan() { panel_.SpanLabel.Caption = spanLabelText(mirror_.Span); }

void Z9SetCommands::readTrace() {
    bool success{};
    routines_.traces.ReadSingleTrace2({}, success);
}

void Z9SetCommands::afterCentre(int /*index*/) {
    std::string answer;
    if (exchange_.GetInstrument("SPAN", answer) && mirror_.Unsure.answered("SPAN", answer)) {
        mirror_.Span = leadingNumber(answer);
        showSpan();
    }
    panel_.SoftTextBox(1).Text = FormatValue(mirror_.Span, "Hz");
    panel_.CFLabel.Caption = centerLabelText(mirror_.CenterFrequency);
    showEdges();
    if (panel_.InstrumentMode != CF::POWERSENSOR) readTrace();
}

void Z9SetCommands::manualSpan(int index) {
    routines_.softPanel.SetSoftButtonsColor(index);
    const std::string text = WireNumber(boxValue(index));
    const Hourglass busy(panel_, session_.events);
    panel_.LastSpan = mirror_.Span;
    const bool accepted = exchange_.SetInstrument("SPAN," + text);
    mirror_.Span = leadingNumber(text);
    mirror_.Unsure.sent("SPAN", accepted);
    showSpan();
    showEdges();
    readTrace();
}

void Z9SetCommands::edgeFrequency(double span, double centre) {
    showPointer(panel_, session_.events, kHourglass);
    if (span < 0) return;  // quietly; the pointer stays as it was set
    mirror_.Span = span;
    mirror_.CenterFrequency = centre;
    mirror_.Unsure.sent("SPAN", exchange_.SetInstrument("SPAN," + generalNumber(span)));
    mirror_.Unsure.sent("FREQ", exchange_.SetInstrument("FREQ," + generalNumber(centre)));
    panel_.CFLabel.Caption = centerLabelText(centre);
    showSpan();
    readTrace();
    showPointer(panel_, session_.events, kArrow);
}

void Z9SetCommands::startFrequency(int index) {
    routines_.softPanel.SetSoftButtonsColor(index);
    const double start = boxValue(index);
    const double span = mirror_.CenterFrequency + mirror_.Span / 2 - start;
    edgeFrequency(span, start + span / 2);
}

void Z9SetCommands::stopFrequency(int index) {
    routines_.softPanel.SetSoftButtonsColor(index);
    const double start = mirror_.CenterFrequency - mirror_.Span / 2;
    const double span = boxValue(index) - start;
    edgeFrequency(span, start + span / 2);
}

void Z9SetCommands::afterOffset(int /*index*/) {
    bool ok = false;
    routines_.labels.GetFreqForLabel(ok);
}

void Z9SetCommands::zeroSpan(int index) {
    routines_.softPanel.SetSoftButtonsColor(index);
    const Hourglass busy(panel_, session_.events);
    const bool accepted = exchange_.SetInstrument("SPAN,0");
    panel_.SpanLabel.Caption = spanLabelText(0);
    mirror_.Span = 0;
    mirror_.Unsure.sent("SPAN", accepted);
    // The centre is rewritten though nothing was sent about it: the key's way leaves it alone.
    mirror_.CenterFrequency = kZeroSpanCentre;
    if (!accepted) mirror_.Unsure.sent("FREQ", false);
    panel_.CFLabel.Caption = centerLabelText(mirror_.CenterFrequency);
    readTrace();
}

void Z9SetCommands::afterBandwidth(int index) {
    if (index == 0) routines_.softPanel.SetButtonColor(3, "green");
    const double code = index == 0 ? mirror_.ResolutionBandwidth : mirror_.VideoBandwidth;
    panel_.SoftTextBox(index + 1).Text = code == 0 ? "Auto" : "Manual";
}

void Z9SetCommands::afterSweepTime(int /*index*/) {
    panel_.ChoiceBox(1).setText(panel_.ChoiceBox(1).List(1));
}

void Z9SetCommands::autoSweepTime(int /*index*/) {
    routines_.softPanel.SetButtonColor(0, "gray");
    routines_.softPanel.SetButtonColor(1, "green");
    queries_.QueryToSoftBox("SWPTIME", 0, "s");
}

void Z9SetCommands::sweepMode(int index) {
    const int choice = panel_.ChoiceBox(index).ListIndex();
    const Hourglass busy(panel_, session_.events);
    exchange_.SetInstrument(choice != 0 ? "SWPCONT,1" : "SWPCONT,0");
    routines_.softPanel.SetButtonColor(2, "green");
    routines_.softPanel.SetButtonColor(3, "gray");
    mirror_.SweepContinuous = choice;
    panel_.SingleSweepModeActive = choice == 0;
}

void Z9SetCommands::triggerSource(int index) {
    routines_.softPanel.SetButtonColor(3, "red");
    const int choice = panel_.ChoiceBox(index).ListIndex();
    const bool external = choice == TRIGEXTRISE || choice == TRIGEXTFALL;
    mirror_.ExternalTriggerActive = external;
    if (choice == TRIGVIDEO || choice == 4) {
        showTriggerKey(panel_, true);
        routines_.scaling.showAnnotation();
    } else if (external) {
        showTriggerKey(panel_, false);
    } else if (choice == TRIGFREERUN) {
        showTriggerKey(panel_, false);
        routines_.scaling.hideAnnotation();
    }
    if (choice >= 4) {  // only the caption of the key changes
        showTriggerKey(panel_, false);
        return;
    }
    const Hourglass busy(panel_, session_.events);
    exchange_.SetInstrument("TRIGSRC," + WireNumber(choice));
    mirror_.TriggerSource = static_cast<std::int16_t>(choice);
}

void Z9SetCommands::triggerValue(int index) {
    routines_.softPanel.SetSoftButtonsColor(index);
    const double value = boxValue(index);
    const Hourglass busy(panel_, session_.events);
    exchange_.SetInstrument((panel_.TriggerKeyIsLevel ? "TRIGLVL," : "TRIGDEL,") +
                            WireNumber(value));
    routines_.scaling.SetAnnotation(value);
}

void Z9SetCommands::measurementMode(int index) {
    DeselectOptionBoxes(panel_);
    routines_.softPanel.SetButtonColor(0, "red");
    const int choice = std::max(panel_.ChoiceBox(index).ListIndex(), 0);
    mirror_.MeasModeText = std::to_string(choice);
    const Hourglass busy(panel_, session_.events);
    if (choice == kReceiverChoice) {
        if (exchange_.SetInstrument("MEAS,8")) panel_.InstrumentMode = CF::RECEIVER;
    } else {
        modeButton(panel_, choice).Click();
    }
}

void Z9SetCommands::marker(int index) {
    routines_.softPanel.SetButtonColor(index, "red");
    double value = 0;
    std::string unit;
    if (panel_.InstrumentMode == CF::DISTTOFAULTMEASURE) {
        try {
            value = ParseLength(panel_.SoftTextBox(index).Text, unit);
        } catch (const std::invalid_argument&) {
            return;
        }
    } else {
        value = boxValue(index);
    }
    const Hourglass busy(panel_, session_.events);
    exchange_.SetInstrument((index == 0 ? "MARK1," : "DELTA1,") + WireNumber(value));
    if (index == 0) {
        routines_.markers.MakeMarkerReadout();
    } else {
        routines_.markers.readDelta();
    }
}

}  // namespace zel
