#include "panel/ModeKeys.h"

#include <cstdint>
#include <string>
#include <string_view>

#include "forms/ControllerForm.h"
#include "forms/Forms.h"
#include "link/CommandExchange.h"
#include "model/Numeric.h"
#include "model/ZEL3Variables.h"
#include "panel/MenuFill.h"
#include "panel/ModeOptions.h"
#include "panel/SoftPositions.h"
#include "platform/Controls.h"
#include "platform/MessageBox.h"
#include "platform/Pointer.h"
#include "trace/FrequencyLabels.h"
#include "trace/GraphScaling.h"
#include "trace/Interlock.h"
#include "trace/ViewAnnotations.h"

namespace zel {
namespace {

using CF = ControllerForm;

struct ModeRow {
    std::int16_t mode = 0;
    std::int16_t menu = 0;
    int waitMs = 0;  // the instrument needs it to change its mode
    const char* failure = nullptr;
    bool whileConnecting = false;  // works while the handshake runs
    bool alwaysTakesOver = false;  // scale and option also when the mode is on already
};
const ModeRow kModes[] = {
    {CF::TRACKINGGENERATOR, CF::TRACKINGGEN, 0, "Tracking Generator Mode unsuccessful"},
    {CF::POWERSENSOR, CF::POWER, 2500, "Power Sensor Mode unsuccessful"},
    {CF::CHANNELPOWER, CF::CHNPOWER, 0, "Channer Power Mode unsuccessful", true, true},
    {CF::OCCBANDWIDTH, CF::OCCBW, 2000, "Occupied Bandwidth Mode unsuccessful", true, true},
    {CF::TDMAPOWERMODE, CF::TDMA, 0, "TDMA Power unsuccessful", true, true},
    {CF::DISTTOFAULTMEASURE, CF::DISTFAULT, 0, "Distance to Fault Mode unsuccessful", true, true},
};

}  // namespace

ModeKeys::ModeKeys(Forms& forms, ZEL3Variables& mirror, CommandExchange& exchange,
                   const MenuRoutines& menus, GraphScaling& scaling, const Interlock& interlock)
    : panel_(forms.controller),
      dialog_(forms.main),
      mirror_(mirror),
      exchange_(exchange),
      softPanel_(menus.softPanel),
      fill_(menus.fill),
      scaling_(scaling),
      interlock_(interlock),
      events_(interlock.session().events),
      boxes_(interlock.session().boxes) {
    handlers_.on(panel_.AnalyzerButton.Clicked, [this] { AnalyzerButton_Click(); });
    handlers_.on(panel_.ResetButton.Clicked, [this] { ResetButton_Click(); });
    for (const ModeRow& row : kModes)
        handlers_.on(modeButton(panel_, row.mode).Clicked,
                     [this, mode = row.mode] { enterMode(mode); });
    for (std::int16_t mode = CF::ANALYZER; mode <= CF::DISTTOFAULTMEASURE; ++mode) {
        OptionButton& option = modeOption(panel_, mode);
        handlers_.on(option.Clicked, [this, &option, mode] {
            if (option.Value()) modeButton(panel_, mode).Click();
        });
    }
}

void ModeKeys::enterMode(std::int16_t mode) {
    const ModeRow* row = nullptr;
    for (const ModeRow& candidate : kModes)
        if (candidate.mode == mode) row = &candidate;
    if (row == nullptr || interlock_.refuses(Interlock::Rule::NoContinuousView)) return;
    softPanel_.InitForm(row->menu);
    softPanel_.setKeyCaptions(row->menu);
    softPanel_.SetTextFieldsAndFrames(row->menu);
    const bool on = panel_.InstrumentMode == mode;
    if (!on || row->alwaysTakesOver) {
        const bool connecting = row->whileConnecting && dialog_.IsConnecting;
        if (!connecting && interlock_.refuses(Interlock::Rule::Connected)) return;
        const Hourglass busy(panel_, events_);
        if (!on) {
            if (!exchange_.SetInstrument("MEAS," + std::to_string(mode))) {
                boxes_.show({BoxIcon::Exclamation, row->failure});
                return;
            }
            if (row->waitMs > 0) events_.sleep(row->waitMs);
        }
        panel_.InstrumentMode = mode;
        showPictureIsOld();
        mirror_.ReferenceRange = 0;
        mirror_.ReferenceUnit = 0;
        modeOption(panel_, mode).setValue(true);
        const std::string_view word = menuWord(row->menu);
        if (!word.empty() && panel_.isConnected) fill_.FillTextFields(word);
    }
}

/// The trace on the graph belongs to the mode before, until the next one is drawn.
void ModeKeys::showPictureIsOld() {
    if (ofAnotherMode(panel_)) panel_.CWGraph1.Old = true;
}

void ModeKeys::AnalyzerButton_Click() {
    if (panel_.InstrumentMode == CF::ANALYZER ||
        interlock_.refuses(Interlock::Rule::NoContinuousView))
        return;
    mirror_.PowerSensorExitRequested = true;
    panel_.FrequencyButton.Click();
    if (interlock_.refuses(Interlock::Rule::Connected)) {
        panel_.State = 0;
        return;
    }
    const Hourglass busy(panel_, events_);
    if (exchange_.SetInstrument("MEAS,1")) {
        panel_.InstrumentMode = CF::ANALYZER;
        showPictureIsOld();
        panel_.AnalyzerCheck.setValue(true);
    } else {
        boxes_.show({BoxIcon::Exclamation, "Analyzer Mode unsuccessful"});
    }
}

void ModeKeys::presetMirror() {
    mirror_.CenterFrequency = 1.5e9;
    mirror_.Span = 3e9;
    mirror_.FrequencyOffset = 0.1;  // the box shows 0 Hz: both are meant
    mirror_.MarkerModeText = "0";
    mirror_.MeasModeText = "0";
    mirror_.ReferenceOffset = 0;
    mirror_.RFInputImpedance = 0;
    mirror_.ResolutionBandwidth = 0;
    mirror_.VideoBandwidth = 0;
    mirror_.SweepContinuous = 1;
    mirror_.TraceMode = 0;
    mirror_.TriggerSource = 0;
    mirror_.TraceDetector = 0;
    mirror_.ReferenceLevel = -20;
    mirror_.ReferenceRange = 0;
    mirror_.ReferenceUnit = 0;
    panel_.SingleSweepModeActive = false;
}

void ModeKeys::ResetButton_Click() {
    if (interlock_.refuses(Interlock::Rule::NoContinuousView)) return;
    const Hourglass busy(panel_, events_);
    const bool preset = exchange_.CmdInstrument("PRESET");
    presetMirror();
    if (preset) mirror_.Unsure.clear();
    panel_.MarkerCheckBox.setValue(false);
    panel_.DeltaCheckBox.setValue(false);
    panel_.PowerSensorCheck.setValue(false);
    panel_.ChannelPowerCheck.setValue(false);
    scaling_.hideAnnotation();
    AnalyzerButton_Click();
    panel_.FrequencyButton.Click();
    const double half = mirror_.Span / 2;
    const double shown[] = {mirror_.CenterFrequency, mirror_.Span, mirror_.CenterFrequency - half,
                            mirror_.CenterFrequency + half, 0};
    for (int i = 0; i < panel_.SoftTextBox.count(); ++i)
        panel_.SoftTextBox(i).Text = FormatValue(shown[i], "Hz");
    panel_.CFLabel.Caption = centerLabelText(mirror_.CenterFrequency);
    panel_.SpanLabel.Caption = spanLabelText(mirror_.Span);
}

}  // namespace zel
