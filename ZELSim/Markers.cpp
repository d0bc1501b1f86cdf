#include "ZELSim/Markers.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <iterator>

#include "ZELSim/Settings.h"

namespace zelsim {

std::size_t highestPoint(const Levels& levels) {
    return static_cast<std::size_t>(
        std::distance(levels.begin(), std::max_element(levels.begin(), levels.end())));
}

std::size_t lowestPoint(const Levels& levels) {
    return static_cast<std::size_t>(
        std::distance(levels.begin(), std::min_element(levels.begin(), levels.end())));
}

namespace {

// How far one has to go down before the level rises above that of `point`, to one side.
double prominence(const Levels& levels, std::size_t point, int direction) {
    double valley = levels[point];
    auto at = static_cast<std::ptrdiff_t>(point) + direction;
    while (at >= 0 && at < static_cast<std::ptrdiff_t>(kPoints)) {
        const double level = levels[static_cast<std::size_t>(at)];
        if (level > levels[point]) {
            break;
        }
        valley = std::min(valley, level);
        at += direction;
    }
    return levels[point] - valley;
}

bool isPeak(const Levels& levels, std::size_t point) {
    const bool left = point == 0 || levels[point - 1] <= levels[point];
    const bool right = point + 1 == kPoints || levels[point + 1] <= levels[point];
    return left && right && prominence(levels, point, -1) >= kPeakExcursion &&
           prominence(levels, point, 1) >= kPeakExcursion;
}

}  // namespace

std::size_t nextPeak(const Levels& levels, std::size_t from) {
    std::size_t best = from;
    for (std::size_t i = 0; i < kPoints; ++i) {
        const bool lower = levels[i] < levels[from];
        const bool better = best == from || levels[i] > levels[best];
        if (lower && better && isPeak(levels, i)) {
            best = i;
        }
    }
    return best;
}

std::size_t pointAt(const Settings& settings, double x) {
    const double step = settings.xStep();
    const double point = step > 0 ? std::round((x - settings.xFirst()) / step) : 0.0;
    return static_cast<std::size_t>(std::clamp(point, 0.0, static_cast<double>(kPoints - 1)));
}

}  // namespace zelsim
