#pragma once
// A sweep of the instrument as a trace for the analysis.

#include <string>

#include "analysis/SpectrumTrace.h"
#include "trace/Sweep.h"

namespace zel {

/// "2026-11-21T14:05:09" of a date in days since 1899-12-30; empty for 0 and below.
std::string isoTimeOf(double date);

/// The sweep's physical levels, of pairs the highest of each point; V and W become dBm at 50 ohm. x
/// as a saved view holds it: all points over the span or the cable, at zero span i times the sweep
/// time / 300; the RBW is 0 while the instrument chooses it. Throws std::runtime_error, with a text
/// for the user, for an incomplete sweep and for a level that has no value in dB.
SpectrumTrace spectrumOf(const Sweep& sweep);

}  // namespace zel
