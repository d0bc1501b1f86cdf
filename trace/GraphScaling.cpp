#include "trace/GraphScaling.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <string>
#include <utility>
#include <vector>

#include "forms/ControllerForm.h"
#include "model/CodeTables.h"
#include "model/LevelRange.h"
#include "model/Numeric.h"
#include "model/ZEL3Variables.h"
#include "platform/Graph.h"
#include "support/NumberText.h"
#include "support/TimeText.h"
#include "trace/Sweep.h"

namespace zel {
namespace {

constexpr double kDivisions = 10;
constexpr int kWaterfallRows = 100;
constexpr int kVectorLast = 601;

struct UnitFormat {
    int unit;
    const char* format;
};

constexpr UnitFormat kUnitFormats[] = {
    {UNITDBM, "k\"dBm\""},
    {UNITDBMV, "k\"dBmV\""},
    {UNITDBUV, "k\"dBuV\""},
    {UNITDBUVM, "k\"dBuV/m\""},
    {UNITDBUAM, "k\"dBuA/m\""},
    {UNITDB, "k\"dB\""},
    {UNITV, "%"},
    {UNITW, "%"},
    {8, "k\"V/m\""},
};

/// The unit in a format: without its first two characters and its last; "%" is one itself.
std::string formatUnit(const std::string& format) {
    return format.size() <= 3 ? format : format.substr(2, format.size() - 3);
}

}  // namespace

std::string GetDimension(const ControllerForm& panel, const ZEL3Variables& mirror) {
    if (panel.InstrumentMode == ControllerForm::DISTTOFAULTMEASURE) return "m";
    return mirror.Span == 0 ? "s" : "Hz";
}

void GraphScaling::setGraphAxes(double xStart, double xStop, double level,
                                const LevelRange& range) {
    setGraphXAxis(xStart, xStop);
    setGraphYAxis(level, range);
    addWaterfallRowLimit();
    waterfall_.stampRow(timeOfDayText(clock_.date()));
    waterfall_.saveGraphView();
}

void GraphScaling::addWaterfallRowLimit() { waterfall_.limitRows(kWaterfallRows); }

void GraphScaling::setGraphXAxis(double xStart, double xStop) {
    panel_.ViewStart = xStart;
    panel_.ViewStop = xStop;
    if (!panel_.GraphZoomed) {
        panel_.CWGraph1.setXRange(xStart, xStop);
        waterfall_.Graph3D.setRange(1, xStart, xStop);
    }
    waterfall_.Graph3D.setFormat(1, mirror_.Span != 0 ? "k\"Hz\"" : "k\"s\"");
}

void GraphScaling::setLevelRange(double minimum, double maximum) {
    panel_.CWGraph1.setYRange(minimum, maximum);
    waterfall_.Graph3D.setRange(3, minimum, maximum);
}

void GraphScaling::setGraphYAxis(double level, const LevelRange& range) {
    Graph3D& graph3D = waterfall_.Graph3D;
    graph3D.setLabelColor(3, graph3D.axis(2).LabelColor);
    const double perDivision = range.perDivision();
    if (!range.isCode()) {
        for (int code = RANGE10DB; code <= RANGE1DB; ++code)
            if (decibelsPerDivision(code) == perDivision) mirror_.ReferenceRange = code;
    }
    const double unit = mirror_.ReferenceUnit;
    if (unit != UNITV && unit != UNITW) level = std::nearbyint(level);
    const double code = mirror_.ReferenceRange;
    const bool logarithmic =
        code == RANGE10DB || code == RANGE5DB || code == RANGE2DB || code == RANGE1DB;
    if (!logarithmic) {
        panel_.CWGraph1.showYLabels(true);
        setLevelRange(0, 100);
    } else if (unit > UNITDB) {
        // The numbers are dBm there and not the unit: the labels are hidden.
        panel_.CWGraph1.showYLabels(false);
        graph3D.setLabelColor(3, graph3D.BackColor);
        if (unit == UNITV) level = VoltsToDbm(level);
        if (unit == UNITW) level = WattsToDbm(level);
        setLevelRange(level - kDivisions * perDivision, level);
    } else {
        panel_.CWGraph1.showYLabels(true);
        setLevelRange(level - kDivisions * perDivision, level);
        panel_.isZELViewLinFile = false;
    }
    SetYAxisFormat();
    if (!range.isCode()) mirror_.ReferenceRange = perDivision;
    const GraphAxis& axis = graph3D.axis(3);
    // The numbers of volts and watts on a logarithmic range are dBm, whatever the format says.
    const bool inDbm = logarithmic && (unit == UNITV || unit == UNITW);
    const std::string unitText = inDbm ? "dBm" : formatUnit(axis.Format);
    // Volts and watts turned to dBm are a trace beside round numbers.
    const auto text = [](double bound) { return generalNumber(roundHalfEven(bound, 9)); };
    waterfall_.lblMin.Caption = text(axis.Minimum) + " " + unitText;
    waterfall_.lblMAX.Caption = text(axis.Maximum) + " " + unitText;
}

void GraphScaling::SetYAxisFormat() {
    for (const UnitFormat& row : kUnitFormats)
        if (row.unit == mirror_.ReferenceUnit) waterfall_.Graph3D.setFormat(3, row.format);
    if (mirror_.ReferenceRange > RANGE1DB) waterfall_.Graph3D.setFormat(3, "%");
}

void GraphScaling::DisplayDataOnGraph(const Sweep& sweep) {
    panel_.CWGraph1.plotY(sweep.shown, sweep.axis.first, sweep.axis.increment);
    panel_.CWGraph1.Incomplete = incompleteMark(sweep);
    if (sweep.autoPeak() || sweep.settings.Span == 0) BuildXYVectors(sweep.axis.increment);
    if (!sweep.whole()) return;
    // The full read cycle sizes the vectors before it knows the new range: a row stands at its
    // own x.
    std::vector<double> xs(sweep.shown.size());
    for (std::size_t i = 0; i < xs.size(); ++i)
        xs[i] = sweep.axis.first + static_cast<double>(i) * sweep.axis.increment;
    waterfall_.Graph3D.plotCurve(panel_.YVector, std::move(xs), sweep.shown, sweep.colours);
}

void GraphScaling::SetAnnotation(double percent) {
    const double perDivision = decibelsPerDivision(mirror_.ReferenceRange);
    const bool logarithmic = mirror_.ReferenceRange < RANGELIN;
    double top = mirror_.ReferenceLevel;
    if (logarithmic && mirror_.ReferenceUnit == UNITV) top = VoltsToDbm(top);
    if (logarithmic && mirror_.ReferenceUnit == UNITW) top = WattsToDbm(top);
    double height = percent / 100 * kDivisions * perDivision;
    if (logarithmic) height += 100 - top;
    mirror_.TriggerLevelValue = -height;
    panel_.CWGraph1.setTrigger({"T", -height, true});
}

void GraphScaling::showAnnotation() {
    panel_.CWGraph1.setTrigger({"T", mirror_.TriggerLevelValue, true});
}

void GraphScaling::hideAnnotation() {
    GraphAnnotation annotation = panel_.CWGraph1.trigger();
    annotation.Visible = false;
    panel_.CWGraph1.setTrigger(annotation);
}

void GraphScaling::SizeXYVectors(int count) {
    const auto size = static_cast<std::size_t>(std::max(count, -1) + 1);
    panel_.XVector.resize(size);
    panel_.YVector.resize(size);
}

void GraphScaling::BuildXYVectors(double step) {
    SizeXYVectors(kVectorLast);
    double x = panel_.ViewStart;
    for (double& value : panel_.XVector) {
        value = x;
        x += step;
    }
    std::fill(panel_.YVector.begin(), panel_.YVector.end(), panel_.YVectorVal);
}

}  // namespace zel
