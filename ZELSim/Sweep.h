#pragma once
// The physics of one sweep: from settings, scene and starting time to 301 levels.

#include <array>
#include <cstdint>

#include "ZELSim/Settings.h"
#include "ZELSim/Signals.h"

namespace zelsim {

/// One trace. `low` and `high` differ with the auto peak detector only. Levels in dBm at the
/// input (dB where the mode measures ratios), without the offsets of the display.
struct Trace {
    std::array<double, kPoints> low{};
    std::array<double, kPoints> high{};
};

/// dBm of the noise floor's mean with these settings.
double noiseFloor(const Settings& settings, double hz);

class Sweeper {
  public:
    Sweeper(const Scene& scene, std::uint64_t seed) : scene_(scene), seed_(seed) {}

    /// The sweep that starts at `moment`, in seconds of the instrument's time, seen by `detector`.
    Trace run(const Settings& settings, double moment, Detector detector) const;
    /// The same with the detector that is set.
    Trace run(const Settings& settings, double start) const {
        return run(settings, start, settings.traceDetector());
    }
    /// dBm, mean level at a fixed frequency through the set resolution bandwidth.
    double levelAt(const Settings& settings, double hz, double start) const;
    /// Radians in -pi to pi, the phase of the complex trace, point by point.
    std::array<double, kPoints> phases(const Settings& settings, double start) const;
    /// Hz of the strongest steady signal around `hz`, within `reach`; `hz` itself if there is none.
    double countedFrequency(double hz, double reach, double start) const;

  private:
    Trace runSpectrum(const Settings& settings, double start, Detector detector) const;
    Trace runNetwork(const Settings& settings, double start) const;
    Trace runDistance(const Settings& settings, double start) const;

    const Scene& scene_;
    std::uint64_t seed_;
};

}  // namespace zelsim
