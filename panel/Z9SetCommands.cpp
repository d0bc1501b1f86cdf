#include "panel/Z9SetCommands.h"

#include <algorithm>
#include <cmath>
#include <stdexcept>

#include "model/CodeTables.h"
#include "model/Numeric.h"
#include "panel/ModeOptions.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {
namespace {

using CF = ControllerForm;
using ZV = ZEL3Variables;

constexpr double kZeroSpanCentre = 1.5e9;
constexpr const char* kTriggerLevel = "TRIGGER\r\nLEVEL";
constexpr const char* kTriggerDelay = "TRIGGER\r\nDELAY";
constexpr int kReceiverChoice = 8;

}  // namespace

Z9SetCommands::Z9SetCommands(Forms& forms, ZEL3Variables& mirror, CommandExchange& exchange,
                             SoftPanel& softPanel, Z9GetCommands& queries, MarkerReadout& markers,
                             FrequencyLabels& labels, TraceReader& traces, GraphScaling& scaling,
                             const Session& session)
    : forms_(forms),
      panel_(forms.controller),
      mirror_(mirror),
      exchange_(exchange),
      softPanel_(softPanel),
      queries_(queries),
      markers_(markers),
      labels_(labels),
      traces_(traces),
      scaling_(scaling),
      session_(session) {}

// A row a soft position, in the order in which the operations run.
const std::vector<Z9SetCommands::Clause>& Z9SetCommands::clauses() {
    using Z = Z9SetCommands;
    using S = Source;
    static const std::vector<Clause> table = {
        {CF::Freq, 0, Setting{"FREQ,", S::Value, &ZV::CenterFrequency, &Z::afterCentre}},
        {CF::Freq, 1, &Z::manualSpan},
        {CF::Freq, 2, &Z::startFrequency},
        {CF::Freq, 3, &Z::stopFrequency},
        {CF::Freq, 4, Setting{"FREQOFFS,", S::Value, &ZV::FrequencyOffset, &Z::afterOffset}},
        {CF::SPAN, 0, &Z::manualSpan},
        {CF::SPAN, 2, &Z::zeroSpan},
        {CF::AMPT, 0, Setting{"REFLVL,", S::Value, &ZV::ReferenceLevel}},
        {CF::AMPT, 1, Setting{"RANGE,", S::Choice, &ZV::ReferenceRange}},
        {CF::AMPT, 2, Setting{"UNIT,", S::Choice, &ZV::ReferenceUnit}},
        {CF::AMPT, 3, Setting{"REFLVLOFFS,", S::Value, &ZV::ReferenceOffset}},
        {CF::AMPT, 4, Setting{"RFINPUT,", S::Choice, &ZV::RFInputImpedance}},
        {CF::BW, 0, Setting{"RBW,", S::Choice, &ZV::ResolutionBandwidth, &Z::afterBandwidth}},
        {CF::BW, 2, Setting{"VBW,", S::Choice, &ZV::VideoBandwidth, &Z::afterBandwidth}},
        {CF::SWEEP, 0, Setting{"SWPTIME,", S::Value, &ZV::SweepTime, &Z::afterSweepTime}},
        {CF::SWEEP, 1, &Z::autoSweepTime},
        {CF::SWEEP, 2, &Z::sweepMode},
        {CF::SWEEP, 3, &Z::triggerSource},
        {CF::SWEEP, 4, &Z::triggerValue},
        {CF::TRACE, 0, Setting{"TRACEMODE,", S::Choice, &ZV::TraceMode}},
        {CF::TRACE, 1, Setting{"TRACEDET,", S::Choice, &ZV::TraceDetector}},
        {CF::Marker, 0, &Z::marker},
        {CF::Marker, 1, &Z::marker},
        {CF::Marker, 2, Setting{"MARKMODE,", S::Choice}},
        {CF::MEAS, 0, &Z::measurementMode},
        {CF::MEAS_TRD, 0, Setting{"TRD1,", S::Text}},
        {CF::MEAS_TRD, 1, Setting{"TRD2,", S::Text}},
        {CF::MEAS_LLINES, 0, Setting{"LIMLOW,", S::Text}},
        {CF::MEAS_LLINES, 1, Setting{"LIMUPP,", S::Text}},
        {CF::TRACKINGGEN, 4, Setting{"TGLVL,", S::Whole}},
        {CF::POWER, 1, Setting{"FREQ,", S::Value}},
        {CF::POWER, 3, Setting{"MEASTIME,", S::Choice}},
        {CF::CHNPOWER, 1, Setting{"CHPWRSTD,", S::Choice, &ZV::ChannelPowerStandard}},
        {CF::CHNPOWER, 2, Setting{"CHPWRUNIT,", S::Choice, &ZV::ChannelPowerUnit}},
        {CF::CHNPOWER, 0, Setting{"CHPWRSTD,", S::Word}},
        // The channel bandwidth has no word of its own: its entry goes out under the unit's.
        {CF::CHNPOWER, 3, Setting{"CHPWRUNIT,", S::Word}},
        {CF::OCCBW, 1, Setting{"OBWSTD,", S::Choice, &ZV::OccBWStandard}},
        {CF::OCCBW, 2, Setting{"OBWCHBW,", S::Whole, &ZV::OccBWChannelBandwidth}},
        {CF::TDMA, 1, Setting{"TDMASTD,", S::Choice, &ZV::TDMAStandard}},
        {CF::TDMA, 2, Setting{"MEASTIME,", S::Whole, &ZV::TDMAMeasTime}},
        {CF::DISTFAULT, 0, Setting{"CABLEMOD,", S::Text}},
        {CF::DISTFAULT, 1, Setting{"CABLELEN,", S::LocaleValue, &ZV::CableLength}},
        {CF::DISTFAULT, 2, Setting{"DTFMODE,", S::Choice, &ZV::DTFMode}},
        {CF::DISTFAULT, 3, Setting{"LENUNIT,", S::Text, &ZV::LengthUnit}},
    };
    return table;
}

void Z9SetCommands::enter(int index) {
    // With the other option selected an Enter asks, as the key does.
    if (!panel_.SetOption.Value()) return queries_.press(index);
    for (const Clause& clause : clauses()) {
        if (clause.state != panel_.State || clause.key != index) continue;
        if (const Setting* setting = std::get_if<Setting>(&clause.does)) {
            send(*setting, index);
        } else {
            (this->*std::get<Action>(clause.does))(index);
        }
    }
}

void Z9SetCommands::pointer(int shape) {
    panel_.MousePointer = shape;
    session_.events.pump();
}

double Z9SetCommands::boxValue(int index) const {
    std::string prefix;
    return ParseValue(panel_.SoftTextBox(index).Text, prefix);
}

bool Z9SetCommands::valueText(Source source, int index, std::string& text) const {
    double number = 0;
    switch (source) {
        case Source::Value:
            number = boxValue(index);
            break;
        case Source::LocaleValue:
            text = generalNumber(boxValue(index));
            return true;
        case Source::Whole:
            number = std::trunc(boxValue(index));
            if (number < -2147483648.0 || number > 2147483647.0) return false;
            break;
        case Source::Word:
            number = std::nearbyint(boxValue(index));
            if (number < -32768 || number > 32767) return false;
            break;
        case Source::Choice:
            number = panel_.ChoiceBox(index).ListIndex();
            break;
        case Source::Text:
            text = trimmed(panel_.SoftTextBox(index).Text.get());
            return true;
    }
    text = WireNumber(number);
    return true;
}

void Z9SetCommands::store(const Field& field, double number, const std::string& text) {
    if (const auto* real = std::get_if<double ZV::*>(&field)) {
        mirror_.*(*real) = number;
    } else if (const auto* word = std::get_if<std::int16_t ZV::*>(&field)) {
        mirror_.*(*word) = static_cast<std::int16_t>(number);
    } else if (const auto* byte = std::get_if<std::uint8_t ZV::*>(&field)) {
        mirror_.*(*byte) = static_cast<std::uint8_t>(std::max(number, 0.0));
    } else if (const auto* string = std::get_if<std::string ZV::*>(&field)) {
        mirror_.*(*string) = text;
    }
}

void Z9SetCommands::send(const Setting& setting, int index) {
    softPanel_.SetSoftButtonsColor(index);
    std::string text;
    if (!valueText(setting.source, index, text)) {
        session_.boxes.show({BoxIcon::Plain, "Out of Range!"});
        return;
    }
    pointer(11);
    const bool accepted = exchange_.SetInstrument(setting.word + text);
    // The mirror takes the number as it was written in the command.
    store(setting.field, leadingNumber(text), text);
    if (setting.field.index() != 0) {
        std::string_view word = setting.word;
        word.remove_suffix(1);
        mirror_.Unsure.sent(word, accepted);
    }
    if (setting.after != nullptr) (this->*setting.after)(index);
    pointer(0);
}

void Z9SetCommands::showEdges() {
    const double half = mirror_.Span / 2;
    panel_.SoftTextBox(3).Text = FormatValue(mirror_.CenterFrequency + half, "Hz");
    panel_.SoftTextBox(2).Text = FormatValue(mirror_.CenterFrequency - half, "Hz");
}

void Z9SetCommands::showSpan() { panel_.SpanLabel.Caption = spanLabelText(mirror_.Span); }

void Z9SetCommands::readTrace() {
    bool success = false;
    traces_.ReadSingleTrace2({}, success);
}

void Z9SetCommands::afterCentre(int /*index*/) {
    std::string answer;
    if (exchange_.GetInstrument("SPAN", answer)) {
        mirror_.Span = leadingNumber(answer);
        mirror_.Unsure.known("SPAN");
    }
    panel_.SoftTextBox(1).Text = FormatValue(mirror_.Span, "Hz");
    panel_.CFLabel.Caption = centerLabelText(mirror_.CenterFrequency);
    showEdges();
    if (panel_.InstrumentMode != CF::POWERSENSOR) readTrace();
}

void Z9SetCommands::manualSpan(int index) {
    softPanel_.SetSoftButtonsColor(index);
    const std::string text = WireNumber(boxValue(index));
    pointer(11);
    panel_.LastSpan = mirror_.Span;
    const bool accepted = exchange_.SetInstrument("SPAN," + text);
    mirror_.Span = leadingNumber(text);
    mirror_.Unsure.sent("SPAN", accepted);
    showSpan();
    showEdges();
    readTrace();
    pointer(0);
}

void Z9SetCommands::edgeFrequency(double span, double centre) {
    pointer(11);
    if (span < 0) return;  // quietly; the pointer stays as it was set
    mirror_.Span = span;
    mirror_.CenterFrequency = centre;
    mirror_.Unsure.sent("SPAN", exchange_.SetInstrument("SPAN," + generalNumber(span)));
    mirror_.Unsure.sent("FREQ", exchange_.SetInstrument("FREQ," + generalNumber(centre)));
    panel_.CFLabel.Caption = centerLabelText(centre);
    showSpan();
    readTrace();
    pointer(0);
}

void Z9SetCommands::startFrequency(int index) {
    softPanel_.SetSoftButtonsColor(index);
    const double start = boxValue(index);
    const double span = mirror_.CenterFrequency + mirror_.Span / 2 - start;
    edgeFrequency(span, start + span / 2);
}

void Z9SetCommands::stopFrequency(int index) {
    softPanel_.SetSoftButtonsColor(index);
    const double start = mirror_.CenterFrequency - mirror_.Span / 2;
    const double span = boxValue(index) - start;
    edgeFrequency(span, start + span / 2);
}

void Z9SetCommands::afterOffset(int /*index*/) {
    bool ok = false;
    labels_.GetFreqForLabel(ok);
}

void Z9SetCommands::zeroSpan(int index) {
    softPanel_.SetSoftButtonsColor(index);
    pointer(11);
    const bool accepted = exchange_.SetInstrument("SPAN,0");
    panel_.SpanLabel.Caption = spanLabelText(0);
    mirror_.Span = 0;
    mirror_.Unsure.sent("SPAN", accepted);
    // The centre is rewritten though nothing was sent about it: the key's way leaves it alone.
    mirror_.CenterFrequency = kZeroSpanCentre;
    if (!accepted) mirror_.Unsure.sent("FREQ", false);
    panel_.CFLabel.Caption = centerLabelText(mirror_.CenterFrequency);
    readTrace();
    pointer(0);
}

void Z9SetCommands::afterBandwidth(int index) {
    if (index == 0) softPanel_.SetButtonColor(3, "green");
    const double code = index == 0 ? mirror_.ResolutionBandwidth : mirror_.VideoBandwidth;
    panel_.SoftTextBox(index + 1).Text = code == 0 ? "Auto" : "Manual";
}

void Z9SetCommands::afterSweepTime(int /*index*/) {
    panel_.ChoiceBox(1).setText(panel_.ChoiceBox(1).List(1));
}

void Z9SetCommands::autoSweepTime(int /*index*/) {
    softPanel_.SetButtonColor(0, "gray");
    softPanel_.SetButtonColor(1, "green");
    queries_.QueryToSoftBox("SWPTIME", 0, "s");
}

void Z9SetCommands::sweepMode(int index) {
    const int choice = panel_.ChoiceBox(index).ListIndex();
    pointer(11);
    exchange_.SetInstrument(choice != 0 ? "SWPCONT,1" : "SWPCONT,0");
    softPanel_.SetButtonColor(2, "green");
    softPanel_.SetButtonColor(3, "gray");
    mirror_.SweepContinuous = choice;
    panel_.SingleSweepModeActive = choice == 0;
    pointer(0);
}

void Z9SetCommands::triggerSource(int index) {
    softPanel_.SetButtonColor(3, "red");
    const int choice = panel_.ChoiceBox(index).ListIndex();
    const bool external = choice == TRIGEXTRISE || choice == TRIGEXTFALL;
    mirror_.ExternalTriggerActive = external;
    if (choice == TRIGVIDEO || choice == 4) {
        panel_.SoftKey(4).Caption = kTriggerLevel;
        scaling_.showAnnotation();
    } else if (external) {
        panel_.SoftKey(4).Caption = kTriggerDelay;
    } else if (choice == TRIGFREERUN) {
        panel_.SoftKey(4).Caption = kTriggerDelay;
        scaling_.hideAnnotation();
    }
    if (choice >= 4) {  // only the caption of the key changes
        panel_.SoftKey(4).Caption = kTriggerDelay;
        return;
    }
    pointer(11);
    exchange_.SetInstrument("TRIGSRC," + WireNumber(choice));
    mirror_.TriggerSource = static_cast<std::int16_t>(choice);
    pointer(0);
}

void Z9SetCommands::triggerValue(int index) {
    softPanel_.SetSoftButtonsColor(index);
    const double value = boxValue(index);
    pointer(11);
    const bool delay = panel_.SoftKey(4).Caption.get() == kTriggerDelay;
    exchange_.SetInstrument((delay ? "TRIGDEL," : "TRIGLVL,") + WireNumber(value));
    scaling_.SetAnnotation(value);
    pointer(0);
}

void Z9SetCommands::measurementMode(int index) {
    DeselectOptionBoxes(panel_);
    softPanel_.SetButtonColor(0, "red");
    const int choice = std::max(panel_.ChoiceBox(index).ListIndex(), 0);
    mirror_.MeasModeText = std::to_string(choice);
    pointer(11);
    if (choice == kReceiverChoice) {
        if (exchange_.SetInstrument("MEAS,8")) panel_.InstrumentMode = CF::RECEIVER;
    } else {
        modeButton(panel_, choice).Click();
    }
    pointer(0);
}

void Z9SetCommands::marker(int index) {
    softPanel_.SetButtonColor(index, "red");
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
    pointer(11);
    exchange_.SetInstrument((index == 0 ? "MARK1," : "DELTA1,") + WireNumber(value));
    if (index == 0) {
        markers_.MakeMarkerReadout();
    } else {
        markers_.readDelta();
    }
    pointer(0);
}

}  // namespace zel
