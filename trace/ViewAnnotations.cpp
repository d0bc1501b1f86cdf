#include "trace/ViewAnnotations.h"

#include <cmath>
#include <cstdint>
#include <string>

#include "forms/ControllerForm.h"
#include "model/CodeTables.h"
#include "model/Numeric.h"
#include "model/UnsureSettings.h"
#include "model/ZEL3Variables.h"
#include "platform/Graph.h"
#include "trace/GraphScaling.h"
#include "trace/Sweep.h"

namespace zel {
namespace {

/// "Auto Peak" of "Auto Peak (Auto)": a caption that queries and files write has more than a list.
std::string withoutBracket(std::string caption) {
    const auto bracket = caption.rfind(" (");
    return bracket == std::string::npos ? caption : caption.substr(0, bracket);
}

std::string choiceText(CodeTable table, double code) {
    const CodeRow* row = findCode(table, code);
    if (row == nullptr) return "";
    // A code that no list offers still has a caption.
    return row->choice.empty() ? withoutBracket(std::string(row->caption))
                               : std::string(row->choice);
}

std::string verticalUnit(const ZEL3Variables& mirror, double range) {
    if (range > RANGE1DB) return "%";
    // On a logarithmic range volts and watts are drawn in dBm.
    if (mirror.ReferenceUnit > UNITDB) return "dBm";
    return levelUnitText(mirror.ReferenceUnit);
}

/// "RBW 300 kHz"; empty where the file says nothing.
std::string fileText(const char* name, const std::string& value, const char* unit) {
    return value.empty() ? "" : std::string(name) + FormatValue(value, unit);
}

/// What only the file knows; the mirror holds the instrument's own state.
void annotateFile(const ShownView& shown, ViewAnnotations& view) {
    view.rbw = fileText("RBW ", shown.rbw, "Hz");
    view.vbw = fileText("VBW ", shown.vbw, "Hz");
    view.sweepTime = fileText("SWT ", shown.sweepTime, "s");
    view.detector = shown.detector.empty() ? "" : "Det " + withoutBracket(shown.detector);
    view.mode = shown.mode;
}

/// A thousandth of a width, as a power of ten; 0 where it has none.
double digitStep(double width) {
    return width > 0 && std::isfinite(width) ? std::pow(10, std::floor(std::log10(width)) - 3) : 0;
}

double roundedTo(double value, double step) {
    return step > 0 ? std::round(value / step) * step : value;
}

void markUnsure(const UnsureSettings& unsure, ViewAnnotations& view) {
    view.refLevelUnsure = unsure.has(AxisSetting::ReferenceLevel);
    view.rangeUnsure = unsure.has(AxisSetting::Range);
    view.detectorUnsure = unsure.has(AxisSetting::Detector);
    view.yUnsure = view.refLevelUnsure || view.rangeUnsure;
    // Lengths rest on the cable alone, times on a span of zero as well.
    const bool hertz = view.xUnit == "Hz";
    view.xUnsure = (hertz && unsure.has(AxisSetting::Frequency)) ||
                   (view.xUnit != "m" && unsure.has(AxisSetting::Span));
}

/// The texts for settings; `unsure` are those that the instrument may have otherwise.
ViewAnnotations annotate(const ControllerForm& panel, const ZEL3Variables& mirror,
                         const UnsureSettings& unsure) {
    ViewAnnotations view;
    const Graph& graph = panel.CWGraph1;
    view.ok = !graph.values().empty();
    const ShownView& shown = panel.Shown;
    view.xUnit = shown.xUnit.empty() ? GetDimension(panel, mirror) : shown.xUnit;
    const double range = shownRangeCode(panel, mirror);
    view.unit = verticalUnit(mirror, range);
    if (!view.ok) return view;
    view.refLevel = "Ref " + FormatValue(mirror.ReferenceLevel, levelUnitText(mirror.ReferenceUnit),
                                         "", mirror.ReferenceUnit > UNITDB);
    view.range = choiceText(CodeTable::Range, range);
    view.rbw = "RBW " + choiceText(CodeTable::ResolutionBandwidth, mirror.ResolutionBandwidth);
    view.vbw = "VBW " + choiceText(CodeTable::VideoBandwidth, mirror.VideoBandwidth);
    view.sweepTime = "SWT " + FormatValue(mirror.SweepTime, "s");
    view.detector = "Det " + choiceText(CodeTable::Detector, mirror.TraceDetector);
    const CodeRow* mode =
        findCode(CodeTable::MeasurementMode,
                 shown.instrumentMode != 0 ? shown.instrumentMode : panel.InstrumentMode);
    if (mode != nullptr) view.mode = std::string(mode->text);
    if (shown.fromFile) {
        annotateFile(shown, view);
    } else {
        markUnsure(unsure, view);
    }
    double left = graph.xAxis().Minimum;
    double right = graph.xAxis().Maximum;
    if (panel.GraphZoomed) {
        // The ends of a view that a wheel or a hand chose are no settings: four digits of its
        // width say where it is.
        const double step = digitStep(right - left);
        left = roundedTo(left, step);
        right = roundedTo(right, step);
    }
    view.left = "Start " + FormatValue(left, view.xUnit);
    view.center = "Center " + FormatValue((left + right) / 2, view.xUnit);
    view.right = "Stop " + FormatValue(right, view.xUnit);
    return view;
}

}  // namespace

double shownRangeCode(const ControllerForm& panel, const ZEL3Variables& mirror) {
    const double range = mirror.ReferenceRange;
    if (!panel.Shown.fromFile || range == RANGELIN) return range;
    for (int code = RANGE10DB; code <= RANGE1DB; ++code)
        if (decibelsPerDivision(code) == range) return code;
    return range;
}

bool ofAnotherMode(const ControllerForm& panel) {
    const ShownView& shown = panel.Shown;
    return panel.isConnected && !shown.fromFile && shown.instrumentMode != 0 &&
           shown.instrumentMode != panel.InstrumentMode;
}

bool levelOfAnotherMode(const ControllerForm& panel, const Sweep& sweep) {
    const std::int16_t asked = sweep.levelMode;
    return panel.isConnected && !panel.Shown.fromFile && asked != 0 && sweep.instrumentMode != 0 &&
           sweep.instrumentMode != asked && panel.InstrumentMode != asked;
}

ViewAnnotations annotateView(const ControllerForm& panel, const ZEL3Variables& mirror) {
    return annotate(panel, mirror, mirror.Unsure);
}

ViewAnnotations annotateSweep(const ControllerForm& panel, const ZEL3Variables& mirror,
                              const Sweep& sweep) {
    const ZEL3Variables& then = sweep.settings;
    const bool keeps = !panel.Shown.fromFile && sweep.wanted != 0 && sweep.settingsKept;
    ViewAnnotations view =
        keeps ? annotate(panel, then, mirror.Unsure) : annotateView(panel, mirror);
    if (levelOfAnotherMode(panel, sweep)) view.refLevelUnsure = view.yUnsure = true;
    if (!keeps || !view.ok) return view;
    // The axes stay those of the trace: they are right for it.
    view.refLevelUnsure |=
        then.ReferenceLevel != mirror.ReferenceLevel || then.ReferenceUnit != mirror.ReferenceUnit;
    view.rangeUnsure |= then.ReferenceRange != mirror.ReferenceRange;
    view.detectorUnsure |= then.TraceDetector != mirror.TraceDetector;
    view.rbwUnsure = then.ResolutionBandwidth != mirror.ResolutionBandwidth;
    view.vbwUnsure = then.VideoBandwidth != mirror.VideoBandwidth;
    view.sweepTimeUnsure = then.SweepTime != mirror.SweepTime;
    return view;
}

}  // namespace zel
