#pragma once
// Power in a channel, and the bandwidth that holds a share of the power.

#include <optional>

#include "analysis/SpectrumTrace.h"

namespace zel {

/// 10 log10(step / RBW * sum of the powers of the samples with start <= x <= stop), in the trace's
/// unit; the step stands for the RBW where the trace knows none. Nothing for a channel without
/// samples. Error: the edges lie up to half a step off, the filter's noise bandwidth is taken as
/// the RBW, and a peak detector reads noise too high.
std::optional<double> channelPower(const SpectrumTrace& trace, double start, double stop);

struct OccupiedBandwidth {
    double low = 0;   ///< x
    double high = 0;  ///< x
    double width() const { return high - low; }
};

/// The stretch that holds `percent` (above 0, below 100) of the trace's power, half of the rest on
/// each side. With c(i) the power up to sample i less half of sample i's, the edges stand where c
/// passes (100 - percent) / 200 and (100 + percent) / 200 of the sum, linear between samples, at
/// the border where it passes outside. Nothing for an empty trace. Error: below one step an edge,
/// and noise over the whole span widens it.
std::optional<OccupiedBandwidth> occupiedBandwidth(const SpectrumTrace& trace, double percent);

}  // namespace zel
