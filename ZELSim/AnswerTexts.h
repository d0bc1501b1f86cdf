#pragma once
// The texts of frequencies, levels and x values in answers, and the bounds of the reference level.

#include <cmath>
#include <string>

#include "ZELSim/Numbers.h"
#include "ZELSim/Settings.h"

namespace zelsim {

/// dBm at the input.
inline constexpr double kLowestReference = -80;
inline constexpr double kHighestReference = 30;

/// Whole hertz.
inline std::string hertzText(double hz) { return numberText(std::round(hz), 0); }

/// A level in the shown unit; the linear units need more places.
inline std::string levelText(const Settings& settings, double shown) {
    return numberText(shown, settings.unit >= static_cast<double>(Unit::Volt) ? 12 : 2);
}

/// An x of the display: Hz, s or m.
inline std::string xText(const Settings& settings, double x) {
    return settings.isZeroSpan() || settings.isDistance() ? numberText(x, 9) : hertzText(x);
}

}  // namespace zelsim
