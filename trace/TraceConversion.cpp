#include "trace/TraceConversion.h"

#include <cmath>

#include "model/CodeTables.h"
#include "model/Numeric.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr int kDecibelDecimals = 3;
constexpr int kVoltDecimals = 10;
constexpr int kOtherDecimals = 20;
constexpr double kDivisions = 10;

}  // namespace

bool TraceConversion::isLogarithmicUnit() const { return mirror_.ReferenceUnit < UNITV; }

void TraceConversion::SelectRawScale() {
    panel_.RawScale = mirror_.ReferenceUnit == UNITV   ? 1e6
                      : mirror_.ReferenceUnit == UNITW ? 1e9
                                                       : 1e3;
}

void TraceConversion::ConvertTrace() {
    const int decimals = mirror_.ReferenceUnit == UNITV ? kVoltDecimals : kOtherDecimals;
    if (mirror_.TraceDetector == DETAUTOPEAK) {
        CalculateDataAutoPeak(decimals);
    } else {
        CalculateDataNotAutoPeak(decimals);
    }
}

double TraceConversion::ClipToReferenceLevel(double& value) const {
    if (value > mirror_.ReferenceLevel) value = mirror_.ReferenceLevel;
    return value;
}

double TraceConversion::ClipToBottom(double value, bool useRangeCode) const {
    const double range = std::nearbyint(mirror_.ReferenceRange);
    const double perDivision = useRangeCode ? decibelsPerDivision(range) : range;
    double top = mirror_.ReferenceLevel;
    if (mirror_.ReferenceUnit == UNITV) top = VoltsToDbm(top);
    if (mirror_.ReferenceUnit == UNITW) top = WattsToDbm(top);
    const double bottom = top - kDivisions * perDivision;
    // A value that is no number (the logarithm of a negative sample) lies at the bottom as well.
    return value >= bottom ? value : bottom;
}

double TraceConversion::linearDisplayValue(double value, bool clearOtherUnits) const {
    if (mirror_.ReferenceRange > RANGE1DB) return LinearToPercent(value, mirror_.ReferenceLevel);
    if (mirror_.ReferenceUnit == UNITV) return VoltsToDbm(value);
    if (mirror_.ReferenceUnit == UNITW) return WattsToDbm(value);
    return clearOtherUnits ? 0 : value;
}

void TraceConversion::CalculateDataNotAutoPeak(int decimals) {
    std::vector<double>& trace = panel_.TraceData;
    std::vector<double>& raw = panel_.RawTraceData;
    raw.assign(trace.size(), 0);
    for (std::size_t i = 0; i < trace.size(); ++i) {
        const double sample = trace[i] / panel_.RawScale;
        if (isLogarithmicUnit()) {
            raw[i] = trace[i] = roundHalfEven(sample, kDecibelDecimals);
            ClipToReferenceLevel(trace[i]);
            if (mirror_.ReferenceRange >= RANGELIN && mirror_.ReferenceRange <= RANGEVSWR11)
                trace[i] = DbmToPercent(trace[i], mirror_.ReferenceLevel);
        } else {
            // The saved value is clipped too, unlike that of the auto peak detector: both are
            // meant, and so is the zero of a linear unit that is neither volt nor watt.
            raw[i] = roundHalfEven(sample, decimals);
            trace[i] = linearDisplayValue(ClipToReferenceLevel(raw[i]), true);
        }
        trace[i] = ClipToBottom(trace[i], true);
        if (i == 0 && graph3D_.plotCount() == 1) {
            panel_.TraceMinimum = panel_.TraceMaximum = trace[0];
        } else {
            if (panel_.TraceMinimum > trace[i]) panel_.TraceMinimum = trace[i];
            if (panel_.TraceMaximum < trace[i]) panel_.TraceMaximum = trace[i];
        }
    }
    colour(trace);
}

void TraceConversion::CalculateDataAutoPeak(int decimals) {
    std::vector<double>& trace = panel_.PeakTraceData;
    std::vector<double>& raw = panel_.RawTraceData;
    raw.assign(trace.size(), 0);
    for (std::size_t i = 0; i < trace.size(); ++i) {
        const double sample = trace[i] / panel_.RawScale;
        if (isLogarithmicUnit()) {
            raw[i] = trace[i] = roundHalfEven(sample, kDecibelDecimals);
            ClipToReferenceLevel(trace[i]);
            if (mirror_.ReferenceRange > RANGE1DB)
                trace[i] = DbmToPercent(trace[i], mirror_.ReferenceLevel);
        } else {
            raw[i] = trace[i] = roundHalfEven(sample, decimals);
            trace[i] = linearDisplayValue(ClipToReferenceLevel(trace[i]), false);
        }
        trace[i] = ClipToBottom(trace[i], true);
    }
    colour(trace);
}

void TraceConversion::colour(const std::vector<double>& shown) const {
    const double low = graph3D_.axis(3).Minimum;
    const double height = graph3D_.axis(3).Maximum - low;
    std::vector<double>& colours = panel_.TraceColours;
    colours.resize(shown.size());
    for (std::size_t i = 0; i < shown.size(); ++i)
        colours[i] = height == 0 ? 0 : 100 * (shown[i] - low) / height;
    if (colours.empty()) return;
    // The first and the last pin the colour scale.
    colours.front() = 0;
    colours.back() = 100;
}

}  // namespace zel
