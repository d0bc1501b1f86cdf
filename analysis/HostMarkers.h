#pragma once
// Markers of the host on a trace: M1 to M8, bound to peaks, with deltas and noise density.

#include <array>
#include <cstddef>
#include <optional>
#include <vector>

#include "analysis/Peaks.h"
#include "analysis/SpectrumTrace.h"

namespace zel {

inline constexpr std::size_t kHostMarkers = 8;

struct HostMarker {
    bool on = false;
    double x = 0;               ///< where the user put it, in the trace's x unit
    std::size_t peak = 0;       ///< follows the n-th strongest peak, from 1; 0: stands at x
    std::size_t reference = 0;  ///< the delta is taken from this marker, from 1; 0: none
};

/// What a marker reads on a trace. A missing figure has no value.
struct MarkerReading {
    bool on = false;
    std::optional<double> x;      ///< of the sample, or of the refined peak
    std::optional<double> level;  ///< there, in the trace's unit
    std::optional<double> deltaX;
    std::optional<double> deltaLevel;  ///< dB
    /// Noise density, in the trace's unit per Hz: level - 10 log10(RBW / 1 Hz); nothing without an
    /// RBW or at zero span. Error: the filter's noise bandwidth is taken as the RBW (about 0.5 dB
    /// for a Gaussian one), and a peak detector reads noise too high by up to 10 dB.
    std::optional<double> density;
};

using HostMarkers = std::array<HostMarker, kHostMarkers>;
using MarkerReadings = std::array<MarkerReading, kHostMarkers>;

/// Reads all markers. One that stands at an x outside of the trace, or follows a peak that is not
/// there, has no level. `peaks` are those of `findPeaks`. Error of a standing marker: half a step.
MarkerReadings readMarkers(const SpectrumTrace& trace, const HostMarkers& markers,
                           const std::vector<Peak>& peaks);

/// The sample nearest to x; nothing outside of the trace by more than half a step.
std::optional<std::size_t> nearestSample(const SpectrumTrace& trace, double x);

/// Adjacent channel power: a channel of `width` about `center`, and `pairs` channels of the same
/// width on each side, `spacing` apart.
struct AdjacentChannels {
    std::optional<double> power;  ///< of the channel, in the trace's unit
    struct Side {
        std::optional<double> lower;  ///< dB relative to the channel
        std::optional<double> upper;
    };
    std::vector<Side> sides;
};
/// Powers by `channelPower`, with its error; a neighbour that the trace does not hold whole is
/// missing.
AdjacentChannels adjacentChannels(const SpectrumTrace& trace, double center, double width,
                                  double spacing, std::size_t pairs);

}  // namespace zel
