#include "trace/PowerReadout.h"

#include <string>
#include <string_view>

#include "forms/Forms.h"
#include "link/CommandExchange.h"
#include "model/Numeric.h"
#include "platform/Events.h"
#include "platform/Pointer.h"

namespace zel {
namespace {

constexpr int kReflectionBox = 4;
constexpr const char* kUnit = "dBm";  // of every reading: the answers name none

}  // namespace

PowerReadout::PowerReadout(Forms& forms, CommandExchange& exchange, Events& events)
    : forms_(forms), panel_(forms.controller), exchange_(exchange), events_(events) {
    PowerAndReflForm& dialog = forms_.powerAndRefl;
    handlers_.on(dialog.Load, [&dialog] {
        dialog.ReadPowerOnly = true;
        dialog.ReadPowerAndRefl = false;
        dialog.PowerOnlyOption.setValue(true);
    });
    handlers_.on(dialog.PowerOnlyOption.Clicked, [&dialog] {
        dialog.ReadPowerOnly = true;
        dialog.ReadPowerAndRefl = false;
    });
    handlers_.on(dialog.PowerAndLeflOption.Clicked, [&dialog] {
        dialog.ReadPowerOnly = false;
        dialog.ReadPowerAndRefl = true;
    });
    handlers_.on(dialog.ClosePwrForm.Clicked, [&dialog] { dialog.unload(1); });
}

bool PowerReadout::ReadPowerValue(const std::string& query, int boxIndex, const std::string& unit) {
    events_.pump();
    std::string answer;
    if (!exchange_.GetInstrument(query, answer)) return false;
    if (query == "PWR") panel_.LastPowerText = answer;
    if (query == "REFL") panel_.LastReflectionText = answer;
    events_.pump();
    panel_.LastReadingText = answer;
    panel_.SoftTextBox(boxIndex).Text = FormatValue(answer, unit);
    return true;
}

bool PowerReadout::readPowerSensor(int boxIndex) {
    if (!ReadPowerValue("PWR", boxIndex, kUnit)) return false;
    return !forms_.powerAndRefl.ReadPowerAndRefl || ReadPowerValue("REFL", kReflectionBox, kUnit);
}

bool PowerReadout::ReadPowerReadings(std::string_view modeName, int boxIndex) {
    const Hourglass busy(panel_, events_);
    panel_.PlaySingleButton.Enabled = false;
    bool good = true;
    if (modeName == "PowerSensor") good = readPowerSensor(boxIndex);
    if (modeName == "TDMAPower") good = ReadPowerValue("TDMAPWR", boxIndex, kUnit);
    panel_.PlaySingleButton.Enabled = true;
    return good;
}

}  // namespace zel
