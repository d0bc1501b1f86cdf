#pragma once
// Single results that the instrument works out: powers, bandwidths, limits, the power sensor.

#include <cstdint>

#include "ZELSim/Settings.h"
#include "ZELSim/Signals.h"
#include "ZELSim/Sweep.h"

namespace zelsim {

/// Power in the channel bandwidth around the centre, in the channel power unit.
double channelPower(const Settings& settings, const Sweeper& sweeper, double start);
/// Hz, the bandwidth around the centre that holds 99 % of the power in the sweep.
double occupiedBandwidth(const Settings& settings, const Sweeper& sweeper, double start);
/// dBm, mean power over the measurement time.
double tdmaPower(const Settings& settings, const Sweeper& sweeper, double start);
/// dBm, what the power sensor shows at a moment, and its return loss in dB.
double sensorPower(const Settings& settings, const Scene& scene, std::uint64_t seed, double now);
double sensorReturnLoss(const Settings& settings, std::uint64_t seed, double now);
/// 0 unknown (no limit line is on), 1 failed, 2 passed.
int limitCheck(const Settings& settings, const Trace& trace);
/// dBm, the reference level that suits the strongest level: a multiple of 10 above it.
double fittingReference(double strongest);

}  // namespace zelsim
