#include "panel/ModeOptions.h"

#include "forms/ControllerForm.h"
#include "platform/Controls.h"

namespace zel {
namespace {

using CF = ControllerForm;

struct ModeControls {
    int measurement;
    Button CF::*key;
    OptionButton CF::*option;
};
const ModeControls kModes[] = {
    {CF::ANALYZER, &CF::AnalyzerButton, &CF::AnalyzerCheck},
    {CF::TRACKINGGENERATOR, &CF::TrackButton, &CF::TrackingGenCheck},
    {CF::POWERSENSOR, &CF::PwrButton, &CF::PowerSensorCheck},
    {CF::CHANNELPOWER, &CF::ChnPwrButton, &CF::ChannelPowerCheck},
    {CF::OCCBANDWIDTH, &CF::OccBWButton, &CF::OccBWCheck},
    {CF::TDMAPOWERMODE, &CF::TDMAButton, &CF::TDMAPowerCheck},
    {CF::DISTTOFAULTMEASURE, &CF::DistFaultButton, &CF::DistFaultCheck},
};

const ModeControls& controlsOf(int measurement) {
    for (const ModeControls& row : kModes)
        if (row.measurement == measurement) return row;
    return kModes[0];
}

}  // namespace

void DeselectOptionBoxes(ControllerForm& panel) {
    for (OptionButton* option : {&panel.PowerSensorCheck, &panel.ChannelPowerCheck,
                                 &panel.OccBWCheck, &panel.TDMAPowerCheck, &panel.DistFaultCheck})
        option->setValue(false);
}

Button& modeButton(ControllerForm& panel, int measurement) {
    return panel.*controlsOf(measurement).key;
}

OptionButton& modeOption(ControllerForm& panel, int measurement) {
    return panel.*controlsOf(measurement).option;
}

}  // namespace zel
