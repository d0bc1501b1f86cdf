#include "trace/TraceConversion.h"

#include <cmath>
#include <cstddef>
#include <vector>

#include "model/CodeTables.h"
#include "model/LevelRange.h"
#include "model/Numeric.h"
#include "support/NumberText.h"
#include "trace/Sweep.h"
#include "trace/VerticalScale.h"

namespace zel {
namespace {

constexpr int kDecibelDecimals = 3;
constexpr int kVoltDecimals = 10;
constexpr int kOtherDecimals = 20;

bool isLogarithmicUnit(const Sweep& sweep) { return sweep.settings.ReferenceUnit < UNITV; }

double linearDisplayValue(const ZEL3Variables& settings, double value, bool clearOtherUnits) {
    if (settings.ReferenceRange > RANGE1DB) return LinearToPercent(value, settings.ReferenceLevel);
    if (settings.ReferenceUnit == UNITV) return VoltsToDbm(value);
    if (settings.ReferenceUnit == UNITW) return WattsToDbm(value);
    return clearOtherUnits ? 0 : value;
}

/// Calls `body(index, value in the unit)` for every sample that came; the others are no number.
template <class Body>
void convertEach(Sweep& sweep, const Body& body) {
    sweep.physical = sweep.shown = sweep.raw;
    for (std::size_t i = 0; i < sweep.raw.size(); ++i)
        if (!std::isnan(sweep.raw[i])) body(i, sweep.raw[i] / sweep.rawScale);
}

}  // namespace

VerticalScale verticalScale(const Sweep& sweep) {
    return {sweep.settings.ReferenceUnit, sweep.settings.ReferenceLevel,
            LevelRange::ofCode(sweep.settings.ReferenceRange)};
}

void TraceConversion::SelectRawScale(Sweep& sweep) {
    const double unit = sweep.settings.ReferenceUnit;
    sweep.rawScale = unit == UNITV ? 1e6 : unit == UNITW ? 1e9 : 1e3;
}

void TraceConversion::ConvertTrace(Sweep& sweep) {
    const int decimals = sweep.settings.ReferenceUnit == UNITV ? kVoltDecimals : kOtherDecimals;
    if (sweep.autoPeak()) {
        CalculateDataAutoPeak(sweep, decimals);
    } else {
        CalculateDataNotAutoPeak(sweep, decimals);
    }
}

void TraceConversion::extend(std::size_t index, double shown) {
    if (index == 0 && graph3D_.plotCount() == 1) {
        panel_.TraceMinimum = panel_.TraceMaximum = shown;
        return;
    }
    if (panel_.TraceMinimum > shown) panel_.TraceMinimum = shown;
    if (panel_.TraceMaximum < shown) panel_.TraceMaximum = shown;
}

void TraceConversion::CalculateDataNotAutoPeak(Sweep& sweep, int decimals) {
    const ZEL3Variables& settings = sweep.settings;
    const VerticalScale scale = verticalScale(sweep);
    const bool logarithmic = isLogarithmicUnit(sweep);
    convertEach(sweep, [&](std::size_t i, double sample) {
        double& saved = sweep.physical[i];
        double& shown = sweep.shown[i];
        if (logarithmic) {
            saved = shown = roundHalfEven(sample, kDecibelDecimals);
            scale.ClipToReferenceLevel(shown);
            if (settings.ReferenceRange >= RANGELIN && settings.ReferenceRange <= RANGEVSWR11)
                shown = DbmToPercent(shown, settings.ReferenceLevel);
        } else {
            // The saved value is clipped too, unlike that of the auto peak detector: both are
            // meant, and so is the zero of a linear unit that is neither volt nor watt.
            saved = roundHalfEven(sample, decimals);
            shown = linearDisplayValue(settings, scale.ClipToReferenceLevel(saved), true);
        }
        shown = scale.ClipToBottom(shown);
        extend(i, shown);
    });
    sweep.colours = colour(sweep.shown);
}

void TraceConversion::CalculateDataAutoPeak(Sweep& sweep, int decimals) {
    const ZEL3Variables& settings = sweep.settings;
    const VerticalScale scale = verticalScale(sweep);
    const bool logarithmic = isLogarithmicUnit(sweep);
    convertEach(sweep, [&](std::size_t i, double sample) {
        double& shown = sweep.shown[i];
        if (logarithmic) {
            sweep.physical[i] = shown = roundHalfEven(sample, kDecibelDecimals);
            scale.ClipToReferenceLevel(shown);
            if (settings.ReferenceRange > RANGE1DB)
                shown = DbmToPercent(shown, settings.ReferenceLevel);
        } else {
            sweep.physical[i] = shown = roundHalfEven(sample, decimals);
            shown = linearDisplayValue(settings, scale.ClipToReferenceLevel(shown), false);
        }
        shown = scale.ClipToBottom(shown);
    });
    sweep.colours = colour(sweep.shown);
}

std::vector<double> TraceConversion::colour(const std::vector<double>& shown) const {
    const double low = graph3D_.axis(3).Minimum;
    const double height = graph3D_.axis(3).Maximum - low;
    std::vector<double> colours(shown.size());
    if (colours.empty()) return colours;
    // The first and the last pin the colour scale, at 0 and 100.
    for (std::size_t i = 1; i + 1 < shown.size(); ++i)
        colours[i] = height == 0 ? 0 : 100 * (shown[i] - low) / height;
    colours.back() = 100;
    return colours;
}

}  // namespace zel
