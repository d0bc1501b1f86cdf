#include "desktop/graph/DivisionTicker.h"

#include <cmath>

#include "model/Numeric.h"
#include "support/NumberText.h"

namespace zel {
namespace {

/// A tick of a range does not show what lies far below the range's own steps.
double tidy(double value, double step) {
    if (step <= 0) return value;
    const double unit = std::pow(10.0, std::floor(std::log10(step)) - 3);
    return std::nearbyint(value / unit) * unit;
}

}  // namespace

QVector<double> DivisionTicker::createTickVector(double tickStep, const QCPRange& range) {
    QVector<double> ticks;
    for (int i = 0; i <= kDivisions; ++i) ticks << range.lower + i * tickStep;
    ticks.back() = range.upper;
    return ticks;
}

QVector<QString> DivisionTicker::createLabelVector(const QVector<double>& ticks, const QLocale&,
                                                   QChar, int) {
    QVector<QString> labels;
    const double step = ticks.size() > 1 ? ticks[1] - ticks[0] : 0;
    for (int i = 0; i < ticks.size(); ++i) {
        if (i % labelEvery_ != 0) {
            labels << QString();
            continue;
        }
        double value = tidy(ticks[i], step);
        if (std::fabs(value) < step * 1e-6) value = 0;
        const std::string text =
            unit_.empty() ? generalNumber(roundHalfEven(value, 6)) : FormatValue(value, unit_);
        labels << QString::fromStdString(text);
    }
    return labels;
}

}  // namespace zel
