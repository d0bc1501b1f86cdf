#pragma once
// The simulated instrument without its wire: state, sweeps in time, traces, modes, datasets.

#include <cstdint>
#include <map>
#include <optional>
#include <string>

#include "ZELSim/Markers.h"
#include "ZELSim/Settings.h"
#include "ZELSim/Signals.h"
#include "ZELSim/Sweep.h"
#include "ZELSim/SweepTimer.h"

namespace zelsim {

struct DeviceSetup {
    std::uint64_t seed = 1;
    /// A sweep takes its sweep time divided by this.
    double speed = 1;
    /// s between the rising edges at the external trigger input; 0: no trigger ever comes.
    double triggerPeriod = 0.5;
};

class Device {
  public:
    explicit Device(const DeviceSetup& setup = {});
    Device(const Device&) = delete;
    Device& operator=(const Device&) = delete;

    /// Lets `seconds` pass. The same setup, calls and durations give the same traces.
    void advance(double seconds);
    /// Seconds since the start.
    double now() const { return now_; }
    /// Seconds from now to the end of the running sweep or the next look for its trigger; nothing
    /// where no sweep is under way or none can end.
    std::optional<double> nextEvent() const;

    const Settings& settings() const { return settings_; }
    /// For a change that has no bearing on the sweep.
    Settings& edit() { return settings_; }
    /// To be called after a change that the sweep depends on: it starts again, holds and averages
    /// are emptied. In single sweep one more sweep is made.
    void restart();

    bool remote() const { return remote_; }
    void setRemote(bool remote) { remote_ = remote; }
    /// Keeps the baud rate and the datasets.
    void preset();
    /// Takes over span, level and unit that belong to the mode.
    void enterMode(Mode mode);
    /// Shown Hz, with the offset. The span shrinks where it would reach beyond the range. False:
    /// out of range, nothing changed.
    bool setCentre(double shownHz);
    /// Hz; the centre moves where the span would reach beyond the range.
    bool setSpan(double hz);
    void setContinuous(bool continuous);

    bool sweeping() const { return timer_.busy(); }
    /// Sweeps finished since the start of the instrument.
    std::uint64_t sweepsFinished() const { return timer_.finishedInAll(); }
    /// Moment at which the newest finished sweep began.
    double sweepStart() const { return timer_.newestStart(); }
    const Sweeper& sweeper() const { return sweeper_; }
    const Scene& scene() const { return scene_; }
    std::uint64_t seed() const { return setup_.seed; }
    Markers& markers() { return markers_; }

    /// The trace on the display.
    const Trace& trace();
    /// The trace in the form of the wire: 1204 bytes of samples and a separator, twice with the
    /// auto peak detector (least values first).
    const std::string& traceBlock();
    /// 2410 bytes: levels in thousandths of a dB, separator, phases in millionths of a radian,
    /// separator.
    std::string complexBlock();

    /// False when no more datasets can be kept.
    bool save(const std::string& name);
    /// False when there is no dataset of that name.
    bool recall(const std::string& name);

  private:
    std::optional<double> triggerAfter(double from, double& lookedUntil) const;
    std::optional<double> videoTriggerAfter(double from, double& lookedUntil) const;
    double powerAtCentre(double seconds) const;
    void fold(double start);

    DeviceSetup setup_;
    double now_ = 0;
    bool remote_ = false;
    Settings settings_;
    Settings base_;  // span, level and unit of the modes without such settings of their own
    Scene scene_;
    Sweeper sweeper_;
    SweepTimer timer_;
    Markers markers_;
    std::map<std::string, Settings> datasets_;

    Trace trace_;
    std::uint64_t taken_ = 0;  // finished sweeps that are in `trace_`
    bool traceValid_ = false;
    std::uint64_t folded_ = 0;
    std::string block_;
    std::string blockKey_;
    bool blockValid_ = false;
};

}  // namespace zelsim
