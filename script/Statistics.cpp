#include "script/Statistics.h"

#include <cmath>
#include <cstddef>
#include <numeric>
#include <span>
#include <vector>

#include "model/Numeric.h"

namespace zel {
namespace {

constexpr double kLevelScale = 1000;
constexpr double kPhaseScale = 1000000;
constexpr double kDivisor = 299;  // as it is written into results from the start; no N - 1

}  // namespace

void scaleComplexTrace(std::vector<double>& data) {
    data.resize(2 * kTracePoints);
    for (std::size_t i = 0; i < kTracePoints; ++i) {
        data[i] /= kLevelScale;
        data[i + kTracePoints] /= kPhaseScale;
    }
}

double standardDeviation(std::span<const double> samples, double mean) {
    double sum = 0;
    for (const double sample : samples) sum += (sample - mean) * (sample - mean);
    return std::sqrt(sum / kDivisor);
}

TraceStatistics statisticsOf(std::span<const double> data) {
    const auto levels = data.first(kTracePoints);
    const auto phases = data.subspan(kTracePoints, kTracePoints);
    double power = 0;
    for (const double level : levels) power += DbToLinear(level);
    constexpr auto kCount = static_cast<double>(kTracePoints);
    TraceStatistics result;
    result.meanLevel = 10 * Log10Safe(power / kCount);
    result.stdLevel = standardDeviation(levels, result.meanLevel);
    result.meanPhase = std::accumulate(phases.begin(), phases.end(), 0.0) / kCount;
    result.stdPhase = standardDeviation(phases, result.meanPhase);
    return result;
}

}  // namespace zel
