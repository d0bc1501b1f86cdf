#pragma once
// The computer's clocks.

#include <cstdint>
#include <ctime>
#include <string>

#include "platform/Clock.h"

namespace zel {

class QtClock : public Clock {
  public:
    std::int64_t micros() const override;
    double date() const override;
    /// In the short form of the system's locale, with four digits of the year.
    std::string dateText(double date) const override;
    std::string timeText(double date) const override;

    /// The local date and time of a moment of the system, as `date`.
    static double dateOf(std::time_t seconds, double fraction);
};

}  // namespace zel
