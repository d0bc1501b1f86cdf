#include "desktop/graph/DivisionTicker.h"

#include <cmath>
#include <string>

#include "model/Numeric.h"
#include "support/NumberText.h"

namespace zel {
namespace {

constexpr int kDivisions = 10;
constexpr int kFewTicks = 7;  // that all have room for a text
constexpr double kClose = 1e-6;

/// The smallest of 1, 2, 5 and their tenfolds that is not below the value.
double roundStep(double value) {
    const double decade = std::pow(10.0, std::floor(std::log10(value)));
    for (const double step : {1.0, 2.0, 5.0})
        if (value <= step * decade * (1 + kClose)) return step * decade;
    return 10 * decade;
}

bool isWhole(double value) { return std::fabs(value - std::nearbyint(value)) < kClose; }

}  // namespace

double divisionOf(double lower, double upper) {
    const double tenth = (upper - lower) / kDivisions;
    return tenth > 0 && std::isfinite(tenth) ? roundStep(tenth) : 0;
}

double DivisionTicker::getTickStep(const QCPRange& range) {
    return divisionOf(range.lower, range.upper);
}

QVector<double> DivisionTicker::createTickVector(double tickStep, const QCPRange& range) {
    QVector<double> ticks;
    if (!(tickStep > 0)) return ticks;
    const double first = std::ceil(range.lower / tickStep - kClose);
    const double last = std::floor(range.upper / tickStep + kClose);
    if (last - first > 1000) return ticks;
    for (double at = first; at <= last; ++at) ticks << at * tickStep;
    return ticks;
}

QVector<QString> DivisionTicker::createLabelVector(const QVector<double>& ticks, const QLocale&,
                                                   QChar, int) {
    QVector<QString> labels;
    const double step = ticks.size() > 1 ? ticks[1] - ticks[0] : 0;
    const int every = ticks.size() > kFewTicks ? labelEvery_ : 1;
    for (const double tick : ticks) {
        if (every > 1 && step > 0 && !isWhole(std::nearbyint(tick / step) / every)) {
            labels << QString();
            continue;
        }
        const std::string text = unit_.empty() ? generalNumber(tick) : FormatValue(tick, unit_);
        labels << QString::fromStdString(text);
    }
    return labels;
}

}  // namespace zel
