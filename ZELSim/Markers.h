#pragma once
// Marker 1 and its delta marker: where they stand and how peaks are found.

#include <array>
#include <cstddef>

#include "ZELSim/Settings.h"

namespace zelsim {

using Levels = std::array<double, kPoints>;

/// Index of the greatest and of the least level.
std::size_t highestPoint(const Levels& levels);
std::size_t lowestPoint(const Levels& levels);
/// Index of the highest peak below the level at `from`; `from` itself where there is none. A peak
/// is a local maximum that stands out of the valleys beside it by at least `kPeakExcursion` dB.
std::size_t nextPeak(const Levels& levels, std::size_t from);
inline constexpr double kPeakExcursion = 6.0;

/// Positions are kept as points, so that a marker stays at its place of the display when the x
/// axis changes.
class Markers {
  public:
    std::size_t marker() const { return marker_; }
    std::size_t delta() const { return delta_; }
    void placeMarker(std::size_t point) { marker_ = point; }
    void placeDelta(std::size_t point) { delta_ = point; }

  private:
    std::size_t marker_ = kPoints / 2;
    std::size_t delta_ = kPoints / 2;
};

/// The point nearest to x of the display.
std::size_t pointAt(const Settings& settings, double x);
inline double xAt(const Settings& settings, std::size_t point) {
    return settings.xFirst() + settings.xStep() * static_cast<double>(point);
}

}  // namespace zelsim
