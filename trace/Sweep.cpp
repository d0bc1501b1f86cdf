#include "trace/Sweep.h"

#include <string>

#include "model/ZEL3Variables.h"

namespace zel {

void followMirror(Sweep& sweep, const ZEL3Variables& mirror) {
    if (sweep.settingsKept || sweep.wanted == 0) return;
    const ZEL3Variables read = sweep.settings;
    sweep.settings = mirror;
    sweep.settings.CenterFrequency = read.CenterFrequency;
    sweep.settings.Span = read.Span;
    sweep.settings.ReferenceLevel = read.ReferenceLevel;
    sweep.settings.ReferenceUnit = read.ReferenceUnit;
    sweep.settings.ReferenceRange = read.ReferenceRange;
    sweep.settings.DynamicRangeMode = read.DynamicRangeMode;
    sweep.settings.TraceDetector = read.TraceDetector;
    sweep.settings.SweepTime = read.SweepTime;
    sweep.settings.CableLength = read.CableLength;
}

void keepSettings(Sweep& sweep, const ZEL3Variables& mirror) {
    followMirror(sweep, mirror);
    sweep.settingsKept = true;
}

void placePoints(Sweep& sweep) {
    SweepAxis& axis = sweep.axis;
    const bool zeroSpan = sweep.settings.Span == 0;
    const auto perPoint = static_cast<double>(sweep.perPoint());
    // At zero span the last points lie beyond the sweep time by two steps: as the instrument's
    // own display has it.
    axis.first = zeroSpan ? 0 : axis.start;
    axis.increment = zeroSpan ? sweep.settings.SweepTime / (perPoint * (axis.intervals - 2))
                              : (axis.stop - axis.start) / (perPoint * axis.intervals);
}

std::string incompleteMark(const Sweep& sweep) {
    if (!sweep.incomplete()) return {};
    return "INCOMPLETE " + std::to_string(sweep.came) + "/" + std::to_string(sweep.wanted);
}

std::string incompleteText(const Sweep& sweep) {
    return "incomplete trace: " + std::to_string(sweep.came) + " of " +
           std::to_string(sweep.wanted) + " samples";
}

}  // namespace zel
