#include "panel/Z9GetCommands.h"

#include <algorithm>
#include <cmath>
#include <optional>
#include <string>

#include "forms/ControllerForm.h"
#include "link/CommandExchange.h"
#include "model/CodeTables.h"
#include "model/MirrorField.h"
#include "model/Numeric.h"
#include "model/ZEL3Variables.h"
#include "panel/KeyRoutines.h"
#include "panel/MarkerReadout.h"
#include "panel/SoftPositions.h"
#include "panel/TriggerKey.h"
#include "platform/Controls.h"
#include "platform/MessageBox.h"
#include "support/NumberText.h"
#include "support/StringOp.h"
#include "trace/FrequencyLabels.h"

namespace zel {
namespace {

using CF = ControllerForm;
using ZV = ZEL3Variables;
using T = CodeTable;

constexpr double kFullCentre = 1.5e9;  // fixed numbers of the instrument family
constexpr double kFullSpan = 3e9;

struct BandwidthPrompt {
    const char* word;
    const char* text;
};
constexpr BandwidthPrompt kResolutionPrompt = {"rbw,", "Set the Resolution Bandwidth (0-9):"};
constexpr BandwidthPrompt kVideoPrompt = {"vbw,", "Set the Video Bandwidth (0-12):"};

double wholeNumber(double value, double lowest, double highest) {
    return std::clamp(std::nearbyint(value), lowest, highest);
}

}  // namespace

Z9GetCommands::Z9GetCommands(ControllerForm& panel, ZEL3Variables& mirror,
                             CommandExchange& exchange, const KeyRoutines& routines,
                             MessageBoxes& boxes)
    : panel_(panel), mirror_(mirror), exchange_(exchange), routines_(routines), boxes_(boxes) {}

Z9GetCommands::Quirk Z9GetCommands::quirk(KeyQuirk which) {
    using Z = Z9GetCommands;
    struct Row {
        KeyQuirk which;
        Quirk does;
    };
    static constexpr Row kQuirks[] = {
        {KeyQuirk::StartFrequency, &Z::startFrequency},
        {KeyQuirk::StopFrequency, &Z::stopFrequency},
        {KeyQuirk::FullSpan, &Z::fullSpan},
        {KeyQuirk::ZeroSpan, &Z::zeroSpan},
        {KeyQuirk::LastSpan, &Z::lastSpan},
        {KeyQuirk::ReferenceLevel, &Z::referenceLevel},
        {KeyQuirk::Bandwidth, &Z::bandwidth},
        {KeyQuirk::AutoBandwidth, &Z::autoBandwidth},
        {KeyQuirk::AutoSweepTime, &Z::autoSweepTime},
        {KeyQuirk::TriggerSource, &Z::triggerSource},
        {KeyQuirk::TriggerValue, &Z::triggerValue},
        {KeyQuirk::SingleTrace, &Z::singleTrace},
        {KeyQuirk::Marker, &Z::marker},
        {KeyQuirk::TransducerMenu, &Z::transducerMenu},
        {KeyQuirk::LimitMenu, &Z::limitMenu},
        {KeyQuirk::TransducerOff, &Z::transducerOff},
        {KeyQuirk::LeaveSubMenu, &Z::leaveSubMenu},
        {KeyQuirk::ChannelPower, &Z::channelPower},
        {KeyQuirk::ChannelPowerUnit, &Z::channelPowerUnit},
        {KeyQuirk::LevelAdjust, &Z::levelAdjust},
    };
    for (const Row& row : kQuirks)
        if (row.which == which) return row.does;
    return nullptr;
}

void Z9GetCommands::press(int index) {
    routines_.softPanel.SetSoftButtonsColor(index);
    for (const SoftPosition& position : softPositions()) {
        if (position.state != panel_.State || position.key != index) continue;
        if (const Quirk does = quirk(position.onKey)) {
            (this->*does)(index);
        } else if (position.onKey == KeyQuirk::Asks) {
            runQuery(position);
        }
    }
}

bool Z9GetCommands::QueryToSoftBox(const std::string& word, int index, const std::string& unit) {
    std::string answer;
    if (!exchange_.GetInstrument(word, answer)) return false;
    if (word == "PWR") routines_.fill.LastPowerAnswer = answer;
    if (word == "REFL") LastReflAnswer = answer;
    LastQueryAnswer = answer;
    panel_.SoftTextBox(index).Text = word == "LENUNIT" ? answer : FormatValue(answer, unit);
    return true;
}

void Z9GetCommands::decode(CodeTable table, double code, int index) {
    const CodeRow* row = findCode(table, code);
    if (row == nullptr || row->caption.empty()) return;
    panel_.SoftTextBox(index).Text = codeCaption(table, code);
    DropDownList& list = panel_.ChoiceBox(index);
    list.setText(list.List(row->code));
}

void Z9GetCommands::runQuery(const SoftPosition& query) {
    TextBox& box = panel_.SoftTextBox(query.key);
    std::string prefix;
    if (getSelected()) {
        if (!QueryToSoftBox(query.word, query.key, query.unit)) return;
        const double answer = leadingNumber(LastQueryAnswer);
        const bool whole = query.leadingNumber || query.codes;
        const double taken = whole ? answer : ParseValue(box.Text, prefix);
        storeField(mirror_, query.field, taken, LastQueryAnswer);
        // A number with a unit and no prefix reads as 0: the mirror is not the instrument's.
        if (query.field.index() != 0 && (taken == answer || !startsWithNumber(LastQueryAnswer)))
            mirror_.Unsure.answered(query.word, LastQueryAnswer);
        if (query.codes) decode(*query.codes, answer, query.key);
    } else if (query.codes) {
        // A caption reads as 0, so that the box shows the caption of code 0.
        decode(*query.codes, ParseValue(box.Text, prefix), query.key);
    }
}

void Z9GetCommands::readTrace() {
    bool success{};
    routines_.traces.ReadSingleTrace2({}, success);
}

void Z9GetCommands::edgeFrequency(int index, double direction) {
    if (!getSelected()) return;
    std::string centre;
    std::string span;
    if (!exchange_.GetInstrument("FREQ", centre) || !exchange_.GetInstrument("SPAN", span)) return;
    LastQueryAnswer = span;
    const double edge = leadingNumber(centre) + direction * leadingNumber(span) / 2;
    panel_.SoftTextBox(index).Text = FormatValue(edge, "Hz");
}

void Z9GetCommands::startFrequency(int index) { edgeFrequency(index, -1); }
void Z9GetCommands::stopFrequency(int index) { edgeFrequency(index, 1); }

void Z9GetCommands::fullSpan(int /*index*/) {
    const bool accepted = exchange_.SetInstrument("SPAN," + WireNumber(kFullSpan));
    mirror_.CenterFrequency = kFullCentre;
    mirror_.Span = kFullSpan;
    mirror_.Unsure.sent("FREQ", accepted);
    mirror_.Unsure.sent("SPAN", accepted);
    panel_.CFLabel.Caption = centerLabelText(kFullCentre);
    panel_.SpanLabel.Caption = spanLabelText(kFullSpan);
    readTrace();
}

void Z9GetCommands::zeroSpan(int /*index*/) {
    const bool accepted = exchange_.SetInstrument("SPAN,0");
    mirror_.Span = 0;
    mirror_.Unsure.sent("SPAN", accepted);
    panel_.SpanLabel.Caption = spanLabelText(0);
    readTrace();
}

void Z9GetCommands::lastSpan(int /*index*/) {
    const bool accepted = exchange_.SetInstrument("SPAN," + WireNumber(panel_.LastSpan));
    mirror_.Span = panel_.LastSpan;
    mirror_.Unsure.sent("SPAN", accepted);
    panel_.SpanLabel.Caption = spanLabelText(mirror_.Span);
    readTrace();
}

void Z9GetCommands::referenceLevel(int index) {
    const std::string unit = levelUnitText(mirror_.ReferenceUnit);
    SoftPosition query = *row(index);
    query.unit = unit.c_str();
    runQuery(query);
}

void Z9GetCommands::bandwidth(int index) {
    const SoftPosition& position = *row(index);
    if (getSelected()) return runQuery(position);
    if (index == 0) routines_.softPanel.SetButtonColor(3, "green");
    const BandwidthPrompt& prompt = index == 0 ? kResolutionPrompt : kVideoPrompt;
    const std::optional<std::string> reply = boxes_.prompt(prompt.text, "Enter Value", "");
    if (!reply || !IsNumericText(*reply)) return;  // nothing to convert: nothing is sent
    const double code = leadingNumber(*reply);
    exchange_.SetInstrument(prompt.word + WireNumber(code));
    storeField(mirror_, position.field, code, *reply);
}

void Z9GetCommands::autoBandwidth(int index) {
    const int shown = index - 1;
    const SoftPosition& position = *row(shown);
    const bool done = exchange_.SetInstrument(std::string(position.word) + ",0");
    // The words speak of the resolution bandwidth in this case as well.
    if (!done && position.codes == T::VideoBandwidth)
        boxes_.show({BoxIcon::Exclamation, "Could not set Resolution Bandwidth to Auto"});
    panel_.SoftTextBox(shown).Text = "Auto Set";
    panel_.ChoiceBox(shown).setText("Auto");
    if (getSelected()) runQuery(position);
}

void Z9GetCommands::autoSweepTime(int index) {
    routines_.softPanel.SetButtonColor(0, "gray");
    routines_.softPanel.SetButtonColor(1, "green");
    exchange_.SetInstrument("SWPTIME,0");
    std::string answer;
    if (exchange_.GetInstrument("SWPTIME", answer) && startsWithNumber(answer))
        mirror_.SweepTime = leadingNumber(answer);
    const CodeRow* code = findCode(T::AutoSweepTime, mirror_.SweepTime);
    if (code != nullptr) {
        panel_.SoftTextBox(index).Text = std::string(code->choice);
        panel_.ChoiceBox(index).setText(std::string(code->choice));
    }
    QueryToSoftBox("SWPTIME", 0, "s");
}

void Z9GetCommands::triggerSource(int index) {
    runQuery(*row(index));
    if (findCode(T::TriggerSource, mirror_.TriggerSource) != nullptr)
        showTriggerKey(panel_, mirror_.TriggerSource == TRIGVIDEO);
}

void Z9GetCommands::triggerValue(int index) {
    if (!getSelected()) return;
    if (panel_.TriggerKeyIsLevel) {
        if (!QueryToSoftBox("TRIGLVL", index, "%")) return;
        routines_.scaling.SetAnnotation(wholeNumber(leadingNumber(LastQueryAnswer), -32768, 32767));
    } else {
        SoftPosition query = *row(index);
        query.word = "TRIGDEL";
        query.unit = "s";
        query.field = &ZV::TriggerDelay;
        runQuery(query);
    }
}

void Z9GetCommands::singleTrace(int /*index*/) { panel_.PlaySingleButton.Click(); }

void Z9GetCommands::transducerMenu(int /*index*/) { routines_.softPanel.layTransducerMenu(); }

void Z9GetCommands::limitMenu(int /*index*/) { routines_.softPanel.layLimitMenu(); }

void Z9GetCommands::transducerOff(int index) {
    if (getSelected()) exchange_.SetInstrument(index == 2 ? "TRD1,NONE" : "TRD2,NONE");
}

void Z9GetCommands::leaveSubMenu(int /*index*/) { panel_.MeasButton.Click(); }

void Z9GetCommands::channelPower(int index) {
    routines_.fill.ChannelPowerUnitName = ChannelPowerUnitText(mirror_.ChannelPowerUnit, "CHNPWR");
    SoftPosition query = *row(index);
    query.unit = routines_.fill.ChannelPowerUnitName.c_str();
    runQuery(query);
}

void Z9GetCommands::channelPowerUnit(int index) {
    runQuery(*row(index));
    routines_.fill.ChannelPowerUnitName = ChannelPowerUnitText(mirror_.ChannelPowerUnit, "CHNPWR");
}

void Z9GetCommands::levelAdjust(int index) {
    // The channel power's key alone looks at the option.
    if (getSelected() || panel_.State != CF::CHNPOWER) exchange_.CmdInstrument(row(index)->word);
}

void Z9GetCommands::marker(int index) {
    if (!mirror_.MarkerOn) {
        boxes_.show({BoxIcon::Information, "Please activate a marker first."});
        return;
    }
    const SoftPosition& position = *row(index);
    if (index == 2) return runQuery(position);
    if (!getSelected()) return;
    if (!QueryToSoftBox(position.word, index, position.unit)) return;
    routines_.markers.showAnswer(index == 0 ? MarkerKind::Marker : MarkerKind::Delta,
                                 LastQueryAnswer);
}

}  // namespace zel
