#include "connection/KeptSettings.h"

#include <string>

#include "forms/ControllerForm.h"
#include "model/CodeTables.h"
#include "model/Numeric.h"
#include "model/ZEL3Variables.h"
#include "support/NumberText.h"

namespace zel {
namespace {

std::string choice(CodeTable table, double code) {
    const CodeRow* row = findCode(table, code);
    if (row == nullptr) return shortestNumber(code);
    return std::string(row->choice.empty() ? row->caption : row->choice);
}

}  // namespace

KeptSettings keepSettingsOf(const ControllerForm& panel, const ZEL3Variables& mirror) {
    const CodeRow* mode = findCode(CodeTable::MeasurementMode, panel.InstrumentMode);
    KeptSettings kept = {
        {"Instrument",
         std::to_string(mirror.InstrumentModel) + " #" + shortestNumber(mirror.InstrumentSerial)},
        {"Mode", mode != nullptr ? std::string(mode->text) : std::to_string(panel.InstrumentMode)},
        {"Center", FormatValue(mirror.CenterFrequency, "Hz")},
    };
    if (panel.InstrumentMode == ControllerForm::POWERSENSOR) return kept;
    const KeptSettings ofTrace = {
        {"Span", FormatValue(mirror.Span, "Hz")},
        {"Ref", FormatValue(mirror.ReferenceLevel, levelUnitText(mirror.ReferenceUnit), "",
                            mirror.ReferenceUnit > UNITDB)},
        {"Range", choice(CodeTable::Range, mirror.ReferenceRange)},
        {"RBW", choice(CodeTable::ResolutionBandwidth, mirror.ResolutionBandwidth)},
        {"VBW", choice(CodeTable::VideoBandwidth, mirror.VideoBandwidth)},
        {"Sweep time", FormatValue(mirror.SweepTime, "s")},
        {"Sweep", mirror.SweepContinuous != 0 ? "continuous" : "single"},
        {"Detector", choice(CodeTable::Detector, mirror.TraceDetector)},
        {"Dynamic range", mirror.DynamicRangeMode != 0 ? "low noise" : "low distortion"},
    };
    kept.insert(kept.end(), ofTrace.begin(), ofTrace.end());
    return kept;
}

std::string differenceOf(const KeptSettings& before, const KeptSettings& now) {
    std::string text;
    for (const auto& [name, value] : now) {
        for (const auto& [oldName, old] : before) {
            if (name != oldName || value == old) continue;
            text += (text.empty() ? "" : "; ") + name + " " + value + " (before: " + old + ")";
        }
    }
    return text;
}

}  // namespace zel
