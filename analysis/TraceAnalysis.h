#pragma once
// What is asked about traces, and what came out for one of them.

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "analysis/ChannelPower.h"
#include "analysis/Hold.h"
#include "analysis/Mask.h"
#include "analysis/Peaks.h"
#include "analysis/SpectrumTrace.h"

namespace zel {

struct Channel {
    double start = 0;  ///< in the trace's x unit
    double stop = 0;
};

/// Only what is asked for is worked out.
struct AnalysisRequest {
    std::size_t peaks = 0;            ///< how many, strongest first
    PeakSearch search;                ///< also picks the peak of the bandwidth
    std::optional<double> bandwidth;  ///< dB down from the strongest peak
    std::vector<Channel> channels;
    std::optional<double> occupied;  ///< percent
    std::optional<Mask> mask;
    std::optional<HoldKind> hold;     ///< one result for all traces together
    std::optional<double> occupancy;  ///< level
};

struct ChannelResult {
    Channel channel;
    std::optional<double> power;
};

/// The findings on one trace, or on all together (`trace` 0). A missing figure has no value.
struct AnalysisResult {
    std::string file;         ///< empty for all traces together and for live sweeps
    std::uint64_t trace = 0;  ///< from 1
    std::string time;         ///< ISO 8601, empty when unknown
    std::string xUnit;
    std::string unit;
    std::vector<Peak> peaks;
    std::optional<Peak> strongest;  ///< the peak of the bandwidth
    PeakWidth width;
    std::vector<ChannelResult> channels;
    std::optional<OccupiedBandwidth> occupied;
    std::optional<MaskVerdict> mask;
    std::vector<double> occupancy;  ///< share of the traces, one a sample
};

/// Works out what is asked about one trace, without hold and occupancy.
AnalysisResult analyseTrace(const SpectrumTrace& trace, const AnalysisRequest& request);

/// Takes traces one after the other and gives a result for each, or one for all at the end.
class AnalysisRun {
  public:
    explicit AnalysisRun(AnalysisRequest request);

    /// The result of this trace, or nothing where one comes for all. Throws std::runtime_error,
    /// with a text for the user, for a trace that cannot be put together with those before.
    std::optional<AnalysisResult> add(const SpectrumTrace& trace, const std::string& file,
                                      std::uint64_t number);
    /// The result for all traces together, when one was asked for and a trace came.
    std::optional<AnalysisResult> finish();

    bool maskFailed() const { return maskFailed_; }
    /// A mask was given and covered no sample of any trace.
    bool maskCoveredNothing() const { return judged_ && !covered_; }

  private:
    AnalysisResult judged(AnalysisResult result);

    AnalysisRequest request_;
    std::optional<Hold> hold_;
    std::optional<Occupancy> occupancy_;
    SpectrumTrace axes_;
    bool maskFailed_ = false;
    bool judged_ = false;
    bool covered_ = false;
};

}  // namespace zel
