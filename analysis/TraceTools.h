#pragma once
// All trace tools over the sweeps that come: what is on, and what they found in the last sweep.

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

#include "analysis/Correction.h"
#include "analysis/HostMarkers.h"
#include "analysis/HostTraces.h"
#include "analysis/Mask.h"
#include "analysis/SpectrumTrace.h"
#include "analysis/TraceAnalysis.h"
#include "analysis/TraceStatistics.h"
#include "platform/Event.h"
#include "trace/Sweep.h"

namespace zel {

/// What a sweep may differ in so that held traces end, beside its axes.
struct SweepSource {
    int mode = 0;               ///< of the instrument
    std::optional<double> rbw;  ///< Hz, where it is known apart from the settings: of a file
};

class TraceTools {
  public:
    TraceTools();

    /// Takes a sweep and works everything out again. One that is incomplete or has no value in dB
    /// is left out, and `problem` says why.
    void take(const Sweep& sweep, const SweepSource& source);
    /// Works out again what is asked of the sweep on the graph, after a change of the settings.
    void refresh();

    AnalysisRequest request;  ///< peaks, bandwidth, channels, occupied, mask
    HostMarkers markers;
    /// Power of the channels beside one; nothing: not asked.
    struct Adjacent {
        std::optional<double> center;  ///< nothing: of the strongest peak
        double width = 0;
        double spacing = 0;
        std::size_t pairs = 1;
    };
    std::optional<Adjacent> adjacent;

    HostTraces& traces() { return traces_; }
    const std::vector<Correction>& corrections() const { return corrections_; }
    /// Held traces, counts and statistics begin again, since levels mean something else.
    void setCorrections(std::vector<Correction> corrections);
    void setMask(std::optional<Mask> mask);
    /// Statistics with the occupancy over this level; nothing: off.
    void countStatistics(std::optional<double> threshold);

    /// The sweep with all corrections; nothing before the first.
    const std::optional<SpectrumTrace>& trace() const { return trace_; }
    /// What was asked of the sweep. It is worked out when it is first looked at: of quick sweeps
    /// that nobody looks at, nothing is. The objects stay; their contents are those of the sweep
    /// at the last call.
    const AnalysisResult& result() const { return found().result; }
    /// Of the last sweep. Without a mask, or where nothing could be worked out, it counts as
    /// passed.
    MaskVerdict verdict() const;
    const MarkerReadings& readings() const { return found().readings; }
    const AdjacentChannels& adjacentFound() const { return found().adjacent; }
    const MaskCount& maskCount() const { return maskCount_; }
    const std::optional<TraceStatistics>& statistics() const { return statistics_; }
    /// Why the last sweep could not be worked on; empty when it could.
    const std::string& problem() const { return problem_; }

    /// Something is new to show.
    Event<> Changed;
    /// The sweep on the graph failed the mask.
    Event<> MaskFailed;

  private:
    struct Found {
        AnalysisResult result;
        MarkerReadings readings;
        AdjacentChannels adjacent;
    };
    const Found& found() const;
    Found workOut() const;

    HostTraces traces_;
    std::vector<Correction> corrections_;
    std::optional<double> threshold_;
    std::optional<TraceStatistics> statistics_;
    std::optional<SpectrumTrace> plain_;  ///< without corrections
    std::optional<SpectrumTrace> trace_;
    mutable Found found_;
    mutable bool worked_ = true;  ///< found_ is of the sweep on the graph and of what is asked
    MaskCount maskCount_;
    std::string problem_;
    int mode_ = -1;
};

}  // namespace zel
