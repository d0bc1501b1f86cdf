#include "support/MTStandard.h"

#include <cmath>
#include <cstdint>
#include <string>

#include "platform/Clock.h"
#include "support/RootDebug.h"

namespace zel {

std::string GetISOTimeString(const Clock& clock, RootDebug& log) {
    const CallScope call(log, "MTStandard", "", "GetISOTimeString");
    constexpr double kPartsADay = 86400.0 * 10000;
    constexpr int kParts = 10000;
    const double date = clock.date();
    const double parts = std::floor((date - std::floor(date)) * kPartsADay + 0.5);
    // A fraction that rounds up to the next day stays within this one.
    const auto part = static_cast<std::int64_t>(std::fmin(parts, kPartsADay - 1));
    const std::string fraction = std::to_string(kParts + part % kParts).substr(1);
    return clock.Clock::dateText(std::floor(date)) + " " +
           clockText(static_cast<int>(part / kParts)) + "." + fraction;
}

}  // namespace zel
