#include "support/TimeText.h"

#include <cmath>
#include <string>

#include "platform/Clock.h"

namespace zel {

std::string timeOfDayText(double date) {
    constexpr int kDay = 86400;
    // The fraction counts time on both sides of zero, to the nearest second.
    const double fraction = std::fabs(date - std::trunc(date));
    return clockText(static_cast<int>(std::lround(fraction * kDay) % kDay));
}

}  // namespace zel
