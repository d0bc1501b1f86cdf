#pragma once
// Texts of times of day.

#include <string>

namespace zel {

/// "hh:mm:ss" of a date in days, or of a difference of two dates.
std::string timeOfDayText(double date);

}  // namespace zel
