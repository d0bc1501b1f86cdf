#pragma once
// Which values of the auto peak detector's pairs belong to one point of the trace.

#include <cmath>
#include <cstddef>
#include <limits>
#include <vector>

namespace zel {

/// The lowest and the highest level of a point, in the unit of the values.
struct PointLevels {
    double low = 0;
    double high = 0;
};

/// The levels of a point out of an array of pairs, as the read cycle and the saved views hold them:
/// value 2i is the lowest level of point i, value 2i + 3 its highest, since the second values stand
/// a pair later than their point. The highest level of the last point is not in the array, so both
/// are the lowest there; value 1 belongs to no point. NaN where neither value came.
inline PointLevels levelsOfPoint(const std::vector<double>& pairs, std::size_t point) {
    const auto at = [&pairs](std::size_t i) {
        return i < pairs.size() ? pairs[i] : std::numeric_limits<double>::quiet_NaN();
    };
    const double one = at(2 * point);
    const double other = at(2 * point + 3);
    // fmin and fmax pass over a value that is missing.
    return {std::fmin(one, other), std::fmax(one, other)};
}

}  // namespace zel
