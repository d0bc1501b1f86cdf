#include "panel/HardKeys.h"

#include <cstdint>
#include <string>

#include "forms/ControllerForm.h"
#include "link/CommandExchange.h"
#include "model/ZEL3Variables.h"
#include "panel/MenuFill.h"
#include "panel/SoftPositions.h"
#include "platform/Controls.h"
#include "support/NumberText.h"
#include "trace/Interlock.h"

namespace zel {
namespace {

using CF = ControllerForm;

struct HardKey {
    Button CF::*key;
    std::int16_t menu;
};
const HardKey kHardKeys[] = {
    {&CF::FrequencyButton, CF::Freq}, {&CF::SpanButton, CF::SPAN},
    {&CF::AmplitudeButton, CF::AMPT}, {&CF::BWButton, CF::BW},
    {&CF::SweepButton, CF::SWEEP},    {&CF::TraceButton, CF::TRACE},
    {&CF::MeasButton, CF::MEAS},      {&CF::MarkerButton, CF::Marker},
};

}  // namespace

HardKeys::HardKeys(ControllerForm& panel, ZEL3Variables& mirror, CommandExchange& exchange,
                   const MenuRoutines& menus, const Interlock& interlock)
    : panel_(panel),
      mirror_(mirror),
      exchange_(exchange),
      softPanel_(menus.softPanel),
      fill_(menus.fill),
      interlock_(interlock) {
    for (const HardKey& row : kHardKeys)
        handlers_.on((panel_.*row.key).Clicked, [this, menu = row.menu] { press(menu); });
    // The tracking generator has a key in both rows.
    handlers_.on(panel_.TrackButton1.Clicked, [this] { panel_.TrackButton.Click(); });
}

void HardKeys::press(std::int16_t menu) {
    const bool leaving = menu == CF::Freq && mirror_.PowerSensorExitRequested;
    if (!leaving && interlock_.refuses(Interlock::Rule::NoPowerSensor)) return;
    if (menu == CF::Freq) mirror_.PowerSensorExitRequested = false;
    if (menu == CF::Marker && interlock_.refuses(Interlock::Rule::NoContinuousView)) return;
    softPanel_.InitForm(menu);
    softPanel_.setKeyCaptions(menu);
    softPanel_.SetTextFieldsAndFrames(panel_.State);
    softPanel_.SetButtonsStatus(panel_.State);
    if (panel_.ContinuosLoopActive || !panel_.isConnected) return;
    bool answers = true;
    if (menu == CF::Marker) answers = readMarkers();
    if (menu == CF::SWEEP) answers = readSweepTime();
    fill_.FillTextFields(menuWord(menu), answers);
}

bool HardKeys::readMarkers() {
    std::string answer;
    if (!exchange_.GetInstrument("MARK1ON", answer)) return false;
    panel_.MarkerCheckBox.setValue(leadingNumber(answer) != 0);
    if (!exchange_.GetInstrument("DELTA1ON", answer)) return false;
    panel_.DeltaCheckBox.setValue(leadingNumber(answer) != 0);
    return true;
}

bool HardKeys::readSweepTime() {
    std::string answer;
    if (!exchange_.GetInstrument("SWPTIME", answer)) return false;
    if (startsWithNumber(answer)) mirror_.SweepTime = leadingNumber(answer);
    return true;
}

}  // namespace zel
