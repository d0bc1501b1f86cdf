#include "panel/MenuFill.h"

#include <algorithm>

#include "model/Numeric.h"
#include "support/NumberText.h"
#include "support/Text.h"

namespace zel {

void MenuFill::FillTextFields(std::string_view menuWord, bool mayAsk) {
    struct Row {
        std::string_view word;
        void (MenuFill::*fill)();
    };
    static constexpr Row kRows[] = {
        {"FREQ", &MenuFill::fillFrequency},
        {"SPAN", &MenuFill::fillSpan},
        {"AMPT", &MenuFill::fillAmplitude},
        {"BW", &MenuFill::fillBandwidth},
        {"SWEEP", &MenuFill::fillSweep},
        {"TRACE", &MenuFill::fillTrace},
        {"MARKER", &MenuFill::fillMarker},
        {"MEAS", &MenuFill::fillMeasurement},
        {"CHANNELPOWER", &MenuFill::fillChannelPower},
        {"OCCBANDWIDTH", &MenuFill::fillOccupiedBandwidth},
        {"TDMAPOWER", &MenuFill::fillTDMAPower},
        {"DTF", &MenuFill::fillDistanceToFault},
    };
    // The visit counts in any case.
    const bool known = mirror_.GetLazyQuery(menuWord);
    asks_ = mayAsk && !known;
    for (const Row& row : kRows)
        if (row.word == menuWord) (this->*row.fill)();
}

bool MenuFill::answered(const char* word, std::string& answer) {
    asks_ = asks_ && exchange_.GetInstrument(word, answer);
    return asks_;
}

void MenuFill::ask(const char* word, std::string& field) {
    std::string answer;
    if (answered(word, answer)) field = answer;
}

void MenuFill::ask(const char* word, double& field) {
    std::string answer;
    if (answered(word, answer)) field = leadingNumber(answer);
}

void MenuFill::ask(const char* word, std::int16_t& field) {
    double number = field;
    ask(word, number);
    field = static_cast<std::int16_t>(std::clamp(number, -32768.0, 32767.0));
}

void MenuFill::show(int index, double value, const std::string& unit) {
    panel_.SoftTextBox(index).Text = FormatValue(value, unit);
}

void MenuFill::choose(int index, double code) {
    DropDownList& list = panel_.ChoiceBox(index);
    list.setText(list.List(static_cast<int>(std::clamp(code, -1.0, 1000.0))));
}

void MenuFill::fillFrequency() {
    const double half = mirror_.Span / 2;
    show(0, mirror_.CenterFrequency, "Hz");
    show(1, mirror_.Span, "Hz");
    show(2, mirror_.CenterFrequency - half, "Hz");
    show(3, mirror_.CenterFrequency + half, "Hz");
    if (panel_.InstrumentMode != ControllerForm::TRACKINGGENERATOR)
        ask("FREQOFFS", mirror_.FrequencyOffset);
    show(4, mirror_.FrequencyOffset, "Hz");
}

void MenuFill::fillSpan() { show(0, mirror_.Span, "Hz"); }

void MenuFill::fillAmplitude() {
    show(0, mirror_.ReferenceLevel, "dBm");
    choose(1, mirror_.ReferenceRange);
    choose(2, mirror_.ReferenceUnit);
    ask("REFLVLOFFS", mirror_.ReferenceOffset);
    show(3, mirror_.ReferenceOffset, "dB");
    ask("RFINPUT", mirror_.RFInputImpedance);
    choose(4, mirror_.RFInputImpedance);
}

void MenuFill::fillBandwidth() {
    ask("RBW", mirror_.ResolutionBandwidth);
    choose(0, mirror_.ResolutionBandwidth);
    ask("VBW", mirror_.VideoBandwidth);
    choose(2, mirror_.VideoBandwidth);
}

void MenuFill::fillSweep() {
    show(0, mirror_.SweepTime, "s");
    ask("SWPCONT", mirror_.SweepContinuous);
    choose(2, mirror_.SweepContinuous);
    ask("TRIGSRC", mirror_.TriggerSource);
    const bool video = mirror_.TriggerSource == TRIGVIDEO;
    panel_.SoftKey(4).Caption = video ? "TRIGGER\r\nLEVEL" : "TRIGGER\r\nDELAY";
    choose(3, mirror_.TriggerSource);
    mirror_.ExternalTriggerActive =
        mirror_.TriggerSource == TRIGEXTRISE || mirror_.TriggerSource == TRIGEXTFALL;
}

void MenuFill::fillTrace() {
    ask("TRACEMODE", mirror_.TraceMode);
    choose(0, mirror_.TraceMode);
    choose(1, mirror_.TraceDetector);
}

void MenuFill::fillMarker() {
    panel_.SoftTextBox(0).Text = replaceAll(panel_.MarkerLabel.Caption.get(), "Marker: ", "");
    panel_.SoftTextBox(1).Text = replaceAll(panel_.DeltaLabel.Caption.get(), "Delta: ", "");
    ask("MARKMODE", mirror_.MarkerModeText);
    double on = mirror_.MarkerOn ? 1 : 0;
    ask("MARK1ON", on);
    mirror_.MarkerOn = on != 0;
    if (!mirror_.MarkerModeText.empty()) choose(2, leadingNumber(mirror_.MarkerModeText));
}

void MenuFill::fillMeasurement() {
    ask("MEAS", mirror_.MeasModeText);
    choose(0, leadingNumber(mirror_.MeasModeText));
}

void MenuFill::fillChannelPower() {
    ask("CHPWRSTD", mirror_.ChannelPowerStandard);
    ask("CHPWR", mirror_.ChannelPowerValue);
    ask("CHPWRUNIT", mirror_.ChannelPowerUnit);
    ChannelPowerUnitName = ChannelPowerUnitText(mirror_.ChannelPowerUnit, "CHNPWR");
    ask("CHPWRBW", mirror_.ChannelPowerBandwidth);
    show(0, mirror_.ChannelPowerValue, ChannelPowerUnitName);
    choose(1, mirror_.ChannelPowerStandard);
    choose(2, mirror_.ChannelPowerUnit);
    show(3, mirror_.ChannelPowerBandwidth, "Hz");
}

void MenuFill::fillOccupiedBandwidth() {
    ask("OBWSTD", mirror_.OccBWStandard);
    ask("OBW", mirror_.OccBWValue);
    if (asks_) mirror_.OccBWValueCopy = mirror_.OccBWValue;
    ask("OBWCHBW", mirror_.OccBWChannelBandwidth);
    show(0, mirror_.OccBWValue, "Hz");
    choose(1, mirror_.OccBWStandard);
    show(2, mirror_.OccBWChannelBandwidth, "Hz");
}

void MenuFill::fillTDMAPower() {
    ask("TDMASTD", mirror_.TDMAStandard);
    ask("MEASTIME", mirror_.TDMAMeasTime);
    ask("TDMAPWR", mirror_.TDMAPowerValue);
    show(0, mirror_.TDMAPowerValue, "dBm");
    choose(1, mirror_.TDMAStandard);
    show(2, mirror_.TDMAMeasTime, "s");
}

void MenuFill::fillDistanceToFault() {
    ask("DTFMODE", mirror_.DTFMode);
    if (mirror_.DTFMode == DTFMODEDTF) ask("CABLELEN", mirror_.CableLength);
    show(0, leadingNumber(LastPowerAnswer), "");
    show(1, mirror_.CableLength, "m");
    choose(2, mirror_.DTFMode);
    panel_.SoftTextBox(3).Text = mirror_.LengthUnit;
}

}  // namespace zel
