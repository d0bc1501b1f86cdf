#pragma once
// Levels as they are shown and sent: offset, transducers, unit and the samples of the wire.

#include <array>
#include <cstddef>
#include <string>

#include "ZELSim/Settings.h"

namespace zelsim {

/// A level of the trace in the shown unit (dBm, dBmV, V, W ...): offset, transducers, unit.
double shownLevel(const Settings& settings, double dbm, std::size_t point);
/// dBm at the input of a level in the shown unit, the inverse without transducers.
double inputLevel(const Settings& settings, double shown);
/// The reference level in the shown unit.
double shownReference(const Settings& settings);

/// One block of the wire: 301 signed 32-bit integers, least significant byte first, in thousandths
/// of a dB, microvolts or nanowatts.
std::string encodeLevels(const Settings& settings, const std::array<double, kPoints>& levels);
/// One block of phases in millionths of a radian.
std::string encodePhases(const std::array<double, kPoints>& radians);

}  // namespace zelsim
