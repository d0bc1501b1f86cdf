#include "script/PhaseDisplay.h"

#include <string>

#include "forms/ScriptForms.h"
#include "model/Numeric.h"
#include "platform/Controls.h"
#include "platform/Events.h"
#include "script/Statistics.h"
#include "support/RTFBoxManager.h"

namespace zel {
namespace {

constexpr const char* kCoarse = "#.0#";
constexpr const char* kFine = "#.00#";
constexpr double kHalfTurn = 180;

std::string shown(double value, const char* unit, const char* format) {
    return FormatValue(value, unit, format, false);
}

/// The name and two tabs, then the value on the same line.
void addValue(RichText& box, const std::string& name, const std::string& value) {
    appendRichText(box, name + "\t\t", false, false, 0, false);
    appendRichText(box, value, false, false, 0, true);
}

}  // namespace

PhaseDisplay::PhaseDisplay(STDForm& form, SpecialMeasForm& script, Events& events)
    : form_(form), script_(script), events_(events) {
    handlers_.on(form_.cmdExecute.Clicked, [this] { cmdExecute_Click(); });
    handlers_.on(form_.cmdStop.Clicked, [this] { cmdStop_Click(); });
    handlers_.on(form_.cmdClear.Clicked, [this] { cmdClear_Click(); });
    handlers_.on(form_.optDegrees.Clicked, [this] { optDegrees_Click(); });
    handlers_.on(form_.optRadians.Clicked, [this] { optRadians_Click(); });
    handlers_.on(form_.Unload, [this](int) { cmdClear_Click(); });
}

void PhaseDisplay::cmdExecute_Click() {
    form_.cmdExecute.Enabled = false;
    events_.pump();
    script_.cmdExecute.Click();
    form_.cmdExecute.Enabled = true;
}

void PhaseDisplay::cmdStop_Click() {
    script_.cmdStop.Click();
    form_.cmdStop.Enabled = false;
}

void PhaseDisplay::cmdClear_Click() {
    form_.rtfReceive.Clear();
    form_.refMeasBox.Clear();
}

void PhaseDisplay::displayPhaseMeasurement(double level, double stdLevel, double phase,
                                           double stdPhase) {
    const int number = script_.ctraceMeasurementNo;
    const bool first = number == 1;
    const bool radians = form_.optRadians.Value();
    RichText& box = first ? form_.refMeasBox : form_.rtfReceive;
    if (number > 1) {
        const std::string row = std::to_string(number - 1) + "] ";
        // One blank fewer for two digits: the columns line up.
        appendRichText(box, (number >= 11 ? "[" : "[ ") + row, false, false, 0, false);
    }
    form_.lblMeanLevel.Caption = shown(level, "dBm", kCoarse);
    addValue(
        box, "Level: ",
        first ? shown(level, "dBm", kCoarse) : shown(level - form_.refMeasLevel, "dB", kCoarse));
    form_.lblStdLevel.Caption = shown(stdLevel, "dB", kCoarse);
    addValue(box, "Std Dev Lvl: ", form_.lblStdLevel.Caption);
    const double angle = radians ? phase : phase * kDegreesPerRadian;
    form_.lblMeanPhase.Caption = shown(angle, "", kCoarse);
    addValue(box, "Phase: ", shown(first ? angle : angle - form_.refPhase, "", kCoarse));
    form_.lblStdPhase.Caption = shown(stdPhase, "", radians ? kFine : kCoarse);
    if (first) {
        addValue(box, "Phase Std Dev(rad): ", shown(stdPhase, "", kFine));
    } else {
        addValue(box, "Phase Std Dev: ", shown(stdPhase, "", kCoarse));
    }
}

void PhaseDisplay::convert(double factor, double divisor, const char* format) {
    Label& mean = form_.lblMeanPhase;
    Label& deviation = form_.lblStdPhase;
    for (Label* label : {&mean, &deviation}) {
        const std::string& text = label->Caption;
        if (text.empty()) continue;
        label->Caption = shown(ParseNumberInvariant(text) * factor / divisor, "", format);
    }
    form_.refPhase = form_.refPhase * factor / divisor;
}

void PhaseDisplay::optDegrees_Click() { convert(kHalfTurn, form_.pi, kCoarse); }

void PhaseDisplay::optRadians_Click() { convert(form_.pi, kHalfTurn, kFine); }

}  // namespace zel
