#include "support/TimeText.h"

#include <array>
#include <cmath>
#include <cstdio>

namespace zel {

std::string timeOfDayText(double date) {
    constexpr long kDay = 86400;
    // The fraction counts time on both sides of zero, to the nearest second.
    const double fraction = std::fabs(date - std::trunc(date));
    const long seconds = std::lround(fraction * kDay) % kDay;
    std::array<char, 16> text{};
    std::snprintf(text.data(), text.size(), "%02ld:%02ld:%02ld", seconds / 3600, seconds / 60 % 60,
                  seconds % 60);
    return text.data();
}

}  // namespace zel
