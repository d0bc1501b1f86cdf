#pragma once
// Numbers along an axis with as many digits as their neighbours need.

#include <string>

namespace zel {

/// "2.41234 GHz" for a resolution of 10 kHz: the value in its prefix, with enough digits to keep
/// two values apart that lie `resolution` from each other. A unit that has no prefixes, such as
/// "dBm", is written as it stands. Empty for what is no number.
std::string axisText(double value, double resolution, const std::string& unit);
/// "-41.23 dBm"; the decimals are fixed.
std::string levelText(double level, const std::string& unit, int decimals = 2);

}  // namespace zel
