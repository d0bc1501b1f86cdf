#include "panel/Z9GetCommands.h"

#include <algorithm>
#include <cmath>

#include "model/Numeric.h"
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
constexpr const char* kTriggerLevel = "TRIGGER\r\nLEVEL";

struct BandwidthKey {
    const char* word;
    const char* promptWord;
    const char* prompt;
    CodeTable table;
    double ZEL3Variables::*field;
};
constexpr BandwidthKey kBandwidths[] = {
    {"RBW", "rbw,", "Set the Resolution Bandwidth (0-9):", T::ResolutionBandwidth,
     &ZV::ResolutionBandwidth},
    {"VBW", "vbw,", "Set the Video Bandwidth (0-12):", T::VideoBandwidth, &ZV::VideoBandwidth},
};
const BandwidthKey& bandwidthKey(int index) { return kBandwidths[index / 2]; }

double wholeNumber(double value, double lowest, double highest) {
    return std::clamp(std::nearbyint(value), lowest, highest);
}

}  // namespace

Z9GetCommands::Z9GetCommands(ControllerForm& panel, ZEL3Variables& mirror,
                             CommandExchange& exchange, SoftPanel& softPanel, MenuFill& fill,
                             MarkerReadout& markers, TraceReader& traces, GraphScaling& scaling,
                             MessageBoxes& boxes)
    : panel_(panel),
      mirror_(mirror),
      exchange_(exchange),
      softPanel_(softPanel),
      fill_(fill),
      markers_(markers),
      traces_(traces),
      scaling_(scaling),
      boxes_(boxes) {}

// A row a soft key, in the order in which the operations run.
const std::vector<Z9GetCommands::Clause>& Z9GetCommands::clauses() {
    using Z = Z9GetCommands;
    static const std::vector<Clause> table = {
        {CF::Freq, 0, Query{"FREQ", "Hz", &ZV::CenterFrequency}},
        {CF::Freq, 1, Query{"SPAN", "Hz", &ZV::Span}},
        {CF::Freq, 2, &Z::startFrequency},
        {CF::Freq, 3, &Z::stopFrequency},
        {CF::Freq, 4, Query{"FREQOFFS", "Hz", &ZV::FrequencyOffset}},
        {CF::SPAN, 0, Query{"SPAN", "Hz", &ZV::Span}},
        {CF::SPAN, 1, &Z::fullSpan},
        {CF::SPAN, 2, &Z::zeroSpan},
        {CF::SPAN, 3, &Z::lastSpan},
        {CF::AMPT, 0, &Z::referenceLevel},
        {CF::AMPT, 1, Query{"RANGE", "", &ZV::ReferenceRange, T::Range}},
        {CF::AMPT, 2, Query{"UNIT", "", &ZV::ReferenceUnit, T::ReferenceUnit}},
        {CF::AMPT, 3, Query{"REFLVLOFFS", "dB", &ZV::ReferenceOffset}},
        {CF::AMPT, 4, Query{"RFINPUT", "", &ZV::RFInputImpedance, T::RFInput}},
        {CF::BW, 0, &Z::bandwidth},
        {CF::BW, 1, &Z::autoBandwidth},
        {CF::BW, 2, &Z::bandwidth},
        {CF::BW, 3, &Z::autoBandwidth},
        {CF::SWEEP, 0, Query{"SWPTIME", "s", &ZV::SweepTime}},
        {CF::SWEEP, 1, &Z::autoSweepTime},
        {CF::SWEEP, 2, Query{"SWPCONT", "", &ZV::SweepContinuous, T::SweepContinuous}},
        {CF::SWEEP, 3, &Z::triggerSource},
        {CF::SWEEP, 4, &Z::triggerValue},
        {CF::TRACE, 0, Query{"TRACEMODE", "", &ZV::TraceMode, T::TraceMode}},
        {CF::TRACE, 1, Query{"TRACEDET", "", &ZV::TraceDetector, T::Detector}},
        {CF::TRACE, 2, &Z::singleTrace},
        {CF::Marker, 0, &Z::marker},
        {CF::Marker, 1, &Z::marker},
        {CF::Marker, 2, &Z::marker},
        {CF::MEAS, 0, Query{"MEAS", "", {}, T::MeasurementMode}},
        {CF::MEAS, 1, &Z::transducerMenu},
        {CF::MEAS, 2, &Z::limitMenu},
        {CF::MEAS_TRD, 0, Query{"TRD1"}},
        {CF::MEAS_TRD, 1, Query{"TRD2"}},
        {CF::MEAS_TRD, 2, &Z::transducerOff},
        {CF::MEAS_TRD, 3, &Z::transducerOff},
        {CF::MEAS_TRD, 4, &Z::leaveSubMenu},
        {CF::MEAS_LLINES, 0, Query{"LIMLOW"}},
        {CF::MEAS_LLINES, 1, Query{"LIMUPP"}},
        {CF::MEAS_LLINES, 2, Query{"LIMPASS", "", {}, T::LimitPass}},
        {CF::MEAS_LLINES, 3, &Z::leaveSubMenu},
        {CF::TRACKINGGEN, 0, Query{"TRANSCAL", "", {}, T::Calibration}},
        {CF::TRACKINGGEN, 1, Query{"REFLCAL", "", {}, T::Calibration}},
        {CF::TRACKINGGEN, 2, Query{"TRANSVECTCAL", "", {}, T::Calibration}},
        {CF::TRACKINGGEN, 3, Query{"REFLVECTCAL", "", {}, T::Calibration}},
        {CF::TRACKINGGEN, 4, Query{"TGLVL"}},
        {CF::POWER, 0, Query{"PWR", "dBm"}},
        {CF::POWER, 1, Query{"FREQ", "Hz"}},
        {CF::POWER, 3, Query{"MEASTIME", "s", {}, T::PowerMeasTime}},
        {CF::POWER, 4, Query{"REFL"}},
        {CF::CHNPOWER, 0, &Z::channelPower},
        {CF::CHNPOWER, 1, Query{"CHPWRSTD", "", &ZV::ChannelPowerStandard, T::Standard}},
        {CF::CHNPOWER, 2, &Z::channelPowerUnit},
        {CF::CHNPOWER, 3, Query{"CHPWRBW", "Hz", &ZV::ChannelPowerBandwidth}},
        {CF::CHNPOWER, 4, &Z::levelAdjust},
        {CF::OCCBW, 0, Query{"OBW", "Hz", &ZV::OccBWValue, std::nullopt, true}},
        {CF::OCCBW, 1, Query{"OBWSTD", "", &ZV::OccBWStandard, T::Standard}},
        // The answer lands in the channel power's field, on purpose.
        {CF::OCCBW, 2, Query{"OBWCHBW", "Hz", &ZV::ChannelPowerBandwidth}},
        {CF::OCCBW, 3, &Z::levelAdjust},
        {CF::TDMA, 0, Query{"TDMAPWR", "dBm", &ZV::TDMAPowerValue}},
        {CF::TDMA, 1, Query{"TDMASTD", "", &ZV::TDMAStandard, T::TDMAStandard}},
        {CF::TDMA, 2, Query{"MEASTIME", "s", &ZV::TDMAMeasTime}},
        {CF::TDMA, 3, &Z::levelAdjust},
        {CF::DISTFAULT, 0, Query{"CABLEMOD"}},
        {CF::DISTFAULT, 1, Query{"CABLELEN", "", &ZV::CableLength}},
        {CF::DISTFAULT, 2, Query{"DTFMODE", "", &ZV::DTFMode, T::DTFMode}},
        {CF::DISTFAULT, 3, Query{"LENUNIT", "", &ZV::LengthUnit}},
    };
    return table;
}

void Z9GetCommands::press(int index) {
    for (const Clause& clause : clauses()) {
        if (clause.state != panel_.State || clause.key != index) continue;
        if (const Query* query = std::get_if<Query>(&clause.does)) {
            runQuery(*query, index);
        } else {
            (this->*std::get<1>(clause.does))(index);
        }
    }
}

bool Z9GetCommands::QueryToSoftBox(const std::string& word, int index, const std::string& unit) {
    std::string answer;
    if (!exchange_.GetInstrument(word, answer)) return false;
    if (word == "PWR") fill_.LastPowerAnswer = answer;
    if (word == "REFL") LastReflAnswer = answer;
    LastQueryAnswer = answer;
    panel_.SoftTextBox(index).Text = word == "LENUNIT" ? answer : FormatValue(answer, unit);
    return true;
}

void Z9GetCommands::store(const Field& field, double number) {
    if (const auto* real = std::get_if<double ZV::*>(&field)) {
        mirror_.*(*real) = number;
    } else if (const auto* word = std::get_if<std::int16_t ZV::*>(&field)) {
        mirror_.*(*word) = static_cast<std::int16_t>(wholeNumber(number, -32768, 32767));
    } else if (const auto* byte = std::get_if<std::uint8_t ZV::*>(&field)) {
        mirror_.*(*byte) = static_cast<std::uint8_t>(wholeNumber(number, 0, 255));
    }
}

void Z9GetCommands::decode(CodeTable table, double code, int index) {
    const CodeRow* row = findCode(table, code);
    if (row == nullptr || row->caption.empty()) return;
    panel_.SoftTextBox(index).Text = codeCaption(table, code);
    DropDownList& list = panel_.ChoiceBox(index);
    list.setText(list.List(row->code));
}

void Z9GetCommands::runQuery(const Query& query, int index) {
    TextBox& box = panel_.SoftTextBox(index);
    if (getSelected()) {
        if (!QueryToSoftBox(query.word, index, query.unit)) return;
        const double answer = leadingNumber(LastQueryAnswer);
        if (const auto* text = std::get_if<std::string ZV::*>(&query.field)) {
            mirror_.*(*text) = LastQueryAnswer;
        } else {
            std::string prefix;
            const bool whole = query.leadingNumber || query.captions;
            const double taken = whole ? answer : ParseValue(box.Text, prefix);
            store(query.field, taken);
            // A number with a unit and no prefix reads as 0: the mirror is not the instrument's.
            if (query.field.index() != 0 && taken == answer) mirror_.Unsure.known(query.word);
        }
        if (query.captions) decode(*query.captions, answer, index);
    } else if (query.captions) {
        // A caption reads as 0, so that the box shows the caption of code 0.
        std::string prefix;
        decode(*query.captions, ParseValue(box.Text, prefix), index);
    }
}

void Z9GetCommands::readTrace() {
    bool success = false;
    traces_.ReadSingleTrace2({}, success);
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

void Z9GetCommands::fullSpan(int index) {
    softPanel_.SetSoftButtonsColor(index);
    const bool accepted = exchange_.SetInstrument("SPAN," + WireNumber(kFullSpan));
    mirror_.CenterFrequency = kFullCentre;
    mirror_.Span = kFullSpan;
    mirror_.Unsure.sent("FREQ", accepted);
    mirror_.Unsure.sent("SPAN", accepted);
    panel_.CFLabel.Caption = centerLabelText(kFullCentre);
    panel_.SpanLabel.Caption = spanLabelText(kFullSpan);
    readTrace();
}

void Z9GetCommands::zeroSpan(int index) {
    softPanel_.SetSoftButtonsColor(index);
    const bool accepted = exchange_.SetInstrument("SPAN,0");
    mirror_.Span = 0;
    mirror_.Unsure.sent("SPAN", accepted);
    panel_.SpanLabel.Caption = spanLabelText(0);
    readTrace();
}

void Z9GetCommands::lastSpan(int index) {
    softPanel_.SetSoftButtonsColor(index);
    const bool accepted = exchange_.SetInstrument("SPAN," + WireNumber(panel_.LastSpan));
    mirror_.Span = panel_.LastSpan;
    mirror_.Unsure.sent("SPAN", accepted);
    panel_.SpanLabel.Caption = spanLabelText(mirror_.Span);
    readTrace();
}

void Z9GetCommands::referenceLevel(int index) {
    const std::string unit = levelUnitText(mirror_.ReferenceUnit);
    runQuery(Query{"REFLVL", unit.c_str(), &ZV::ReferenceLevel}, index);
}

void Z9GetCommands::bandwidth(int index) {
    const BandwidthKey& key = bandwidthKey(index);
    if (getSelected()) return runQuery(Query{key.word, "Hz", key.field, key.table}, index);
    softPanel_.SetSoftButtonsColor(index);
    if (index == 0) softPanel_.SetButtonColor(3, "green");
    const std::optional<std::string> reply = boxes_.prompt(key.prompt, "Enter Value", "");
    if (!reply || !IsNumericText(*reply)) return;  // nothing to convert: nothing is sent
    const double code = leadingNumber(*reply);
    exchange_.SetInstrument(key.promptWord + WireNumber(code));
    mirror_.*key.field = code;
}

void Z9GetCommands::autoBandwidth(int index) {
    const BandwidthKey& key = bandwidthKey(index);
    const int shown = index - 1;
    const bool done = exchange_.SetInstrument(std::string(key.word) + ",0");
    // The words speak of the resolution bandwidth in this case as well.
    if (!done && key.table == T::VideoBandwidth)
        boxes_.show({BoxIcon::Exclamation, "Could not set Resolution Bandwidth to Auto"});
    panel_.SoftTextBox(shown).Text = "Auto Set";
    panel_.ChoiceBox(shown).setText("Auto");
    if (getSelected()) runQuery(Query{key.word, "Hz", key.field, key.table}, shown);
}

void Z9GetCommands::autoSweepTime(int index) {
    softPanel_.SetButtonColor(0, "gray");
    softPanel_.SetButtonColor(1, "green");
    exchange_.SetInstrument("SWPTIME,0");
    std::string answer;
    if (exchange_.GetInstrument("SWPTIME", answer)) mirror_.SweepTime = leadingNumber(answer);
    const CodeRow* row = findCode(T::AutoSweepTime, mirror_.SweepTime);
    if (row != nullptr) {
        panel_.SoftTextBox(index).Text = std::string(row->choice);
        panel_.ChoiceBox(index).setText(std::string(row->choice));
    }
    QueryToSoftBox("SWPTIME", 0, "s");
}

void Z9GetCommands::triggerSource(int index) {
    runQuery(Query{"TRIGSRC", "", &ZV::TriggerSource, T::TriggerSource}, index);
    const CodeRow* row = findCode(T::TriggerSource, mirror_.TriggerSource);
    if (row != nullptr) panel_.SoftKey(4).Caption = std::string(row->text);
}

void Z9GetCommands::triggerValue(int index) {
    if (!getSelected()) return;
    if (panel_.SoftKey(4).Caption.get() == kTriggerLevel) {
        if (!QueryToSoftBox("TRIGLVL", index, "%")) return;
        scaling_.SetAnnotation(wholeNumber(leadingNumber(LastQueryAnswer), -32768, 32767));
    } else {
        runQuery(Query{"TRIGDEL", "s", &ZV::TriggerDelay}, index);
    }
}

void Z9GetCommands::singleTrace(int /*index*/) { panel_.PlaySingleButton.Click(); }

void Z9GetCommands::transducerMenu(int /*index*/) { softPanel_.layTransducerMenu(); }

void Z9GetCommands::limitMenu(int /*index*/) { softPanel_.layLimitMenu(); }

void Z9GetCommands::transducerOff(int index) {
    if (getSelected()) exchange_.SetInstrument(index == 2 ? "TRD1,NONE" : "TRD2,NONE");
}

void Z9GetCommands::leaveSubMenu(int /*index*/) { panel_.MeasButton.Click(); }

void Z9GetCommands::channelPower(int index) {
    fill_.ChannelPowerUnitName = ChannelPowerUnitText(mirror_.ChannelPowerUnit, "CHNPWR");
    runQuery(Query{"CHPWR", fill_.ChannelPowerUnitName.c_str(), &ZV::ChannelPowerValue}, index);
}

void Z9GetCommands::channelPowerUnit(int index) {
    runQuery(Query{"CHPWRUNIT", "", &ZV::ChannelPowerUnit, T::ChannelPowerUnit}, index);
    fill_.ChannelPowerUnitName = ChannelPowerUnitText(mirror_.ChannelPowerUnit, "CHNPWR");
}

void Z9GetCommands::levelAdjust(int /*index*/) {
    // The channel power's key alone looks at the option.
    if (getSelected() || panel_.State != CF::CHNPOWER) exchange_.CmdInstrument("LVLADJUST");
}

void Z9GetCommands::marker(int index) {
    if (!mirror_.MarkerOn) {
        boxes_.show({BoxIcon::Information, "Please activate a marker first."});
        return;
    }
    if (index == 2) return runQuery(Query{"MARKMODE", "", {}, T::MarkerMode}, index);
    if (!getSelected()) return;
    if (!QueryToSoftBox(index == 0 ? "MARK1" : "DELTA1", index, "Hz")) return;
    markers_.showAnswer(index == 0 ? MarkerKind::Marker : MarkerKind::Delta, LastQueryAnswer);
}

}  // namespace zel
