#pragma once
// Many traces as statistics: lowest, mean and highest level and the occupancy, sample by sample.

#include <cstdint>
#include <string>
#include <vector>

#include "analysis/Hold.h"
#include "analysis/SpectrumTrace.h"

namespace zel {

class TraceStatistics {
  public:
    explicit TraceStatistics(double threshold) : occupancy_(threshold) {}

    /// False, and nothing changes, when the trace does not fit those before.
    bool add(const SpectrumTrace& trace);
    std::uint64_t count() const { return occupancy_.count(); }
    SpectrumTrace minimum() const { return min_.result(); }
    SpectrumTrace mean() const { return mean_.result(); }
    SpectrumTrace maximum() const { return max_.result(); }
    std::vector<double> occupancy() const { return occupancy_.share(); }
    /// "x;minimum;mean;maximum;occupancy" with that header, a row a sample; the mean is of the
    /// levels, the occupancy 0 to 1.
    std::string table() const;

  private:
    Hold min_{HoldKind::Min};
    Hold mean_{HoldKind::Average};
    Hold max_{HoldKind::Max};
    Occupancy occupancy_;
};

/// Verdicts of a mask over time.
struct MaskCount {
    unsigned long long sweeps = 0;
    unsigned long long passed = 0;
    /// "mask: pass 412/412".
    std::string text() const {
        return "pass " + std::to_string(passed) + "/" + std::to_string(sweeps);
    }
};

}  // namespace zel
