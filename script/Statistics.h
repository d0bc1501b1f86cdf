#pragma once
// Level and phase of complex traces: means and deviations of one trace.

#include <cstddef>
#include <span>
#include <vector>

namespace zel {

inline constexpr std::size_t kTracePoints = 301;
/// Degrees of a radian, as the results count with it.
inline constexpr double kDegreesPerRadian = 57.2957795;

struct TraceStatistics {
    double meanLevel = 0;  ///< dBm, the mean of the powers
    double stdLevel = 0;   ///< dB, around that mean
    double meanPhase = 0;  ///< rad
    double stdPhase = 0;   ///< rad
};

/// Scales raw samples in place: 301 levels from thousandths of a dB, 301 phases from millionths of
/// a radian.
void scaleComplexTrace(std::vector<double>& data);
/// Of 602 scaled values.
TraceStatistics statisticsOf(std::span<const double> data);
/// Around the given mean; the sum of the squares is divided by 299.
double standardDeviation(std::span<const double> samples, double mean);

}  // namespace zel
