#pragma once
// Shows the truth about the picture: how old it is, how many sweeps come, and what sets the pace.

#include <cstdint>
#include <deque>

#include "forms/ControllerForm.h"
#include "platform/Clock.h"
#include "platform/Event.h"

namespace zel {

/// The read cycle reports its moments; a timer keeps the line beside the graph true. In the
/// continuous view a trace that is older than two sweeps is marked on the graph as old.
class PaceMonitor {
  public:
    PaceMonitor(ControllerForm& panel, const Clock& clock);

    void cycleBegins();
    void sweepWaitBegins();
    void sweepWaitEnds();
    void drawn();
    /// Date at which the last wait for a sweep ended, days.
    double sweepDate() const { return sweepDate_; }
    /// Writes the line and the mark again.
    void show();

    /// Traces drawn a second, over the last few; 0 before the second one.
    double sweepsPerSecond() const;
    /// The longest share of a cycle goes into waiting for the sweep, not into the line.
    bool sweepSetsThePace() const { return sweepMicros_ * 2 > cycleMicros_; }

  private:
    bool viewRuns() const { return panel_.AcquisitionRunning && panel_.STOPFlag; }

    ControllerForm& panel_;
    const Clock& clock_;
    std::int64_t cycleStart_ = 0;
    std::int64_t waitStart_ = 0;
    std::int64_t cycleMicros_ = 0;  // of the last whole cycle
    std::int64_t sweepMicros_ = 0;  // of it, waiting for the sweep
    std::int64_t waited_ = 0;
    double sweepDate_ = 0;
    std::deque<std::int64_t> drawnAt_;
    Handlers handlers_;
};

}  // namespace zel
