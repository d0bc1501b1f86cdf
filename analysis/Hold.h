#pragma once
// Many traces put together, sample by sample: holds, averages and how often a level is reached.

#include <cstdint>
#include <vector>

#include "analysis/SpectrumTrace.h"

namespace zel {

enum class HoldKind {
    Max,
    Min,
    Average,       ///< mean of the levels, dB
    PowerAverage,  ///< level of the mean power
};

/// Two traces can be put together: same axis and unit.
bool sameAxes(const SpectrumTrace& one, const SpectrumTrace& other);

/// The axes are the same but for the digits that a saved view cuts off.
bool closeAxes(const SpectrumTrace& one, const SpectrumTrace& other);

/// The hold over all traces that were added. Sums are exact to the last bits of a double for any
/// number of traces (Kahan), so that a hold may run for days.
class Hold {
  public:
    explicit Hold(HoldKind kind) : kind_(kind) {}

    /// False, and nothing changes, when the trace does not fit those before.
    bool add(const SpectrumTrace& trace);
    void clear();
    std::uint64_t count() const { return count_; }
    /// The axis of the first trace and the held levels; empty before the first.
    SpectrumTrace result() const;

  private:
    HoldKind kind_;
    std::uint64_t count_ = 0;
    SpectrumTrace first_;
    std::vector<double> sum_;    ///< level or power, by kind
    std::vector<double> carry_;  ///< what the sum has lost
};

/// How often each sample was at or over a level.
class Occupancy {
  public:
    explicit Occupancy(double level) : level_(level) {}

    /// False, and nothing changes, when the trace does not fit those before.
    bool add(const SpectrumTrace& trace);
    std::uint64_t count() const { return count_; }
    /// Share of the traces, 0 to 1, one a sample; empty before the first trace.
    std::vector<double> share() const;

  private:
    double level_;
    std::uint64_t count_ = 0;
    SpectrumTrace first_;
    std::vector<std::uint64_t> reached_;
};

}  // namespace zel
