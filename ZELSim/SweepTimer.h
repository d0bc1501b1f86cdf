#pragma once
// When sweeps start and end: continuous and single sweep, triggers, the count of finished sweeps.

#include <cstdint>
#include <functional>
#include <optional>
#include <utility>

namespace zelsim {

class SweepTimer {
  public:
    /// The moment, at or after `from`, at which a sweep that waits for its trigger starts. Nothing
    /// where no trigger was seen in the stretch of time that the source looks at, whose end it
    /// writes to `lookedUntil`; with an infinite end no trigger can come.
    using TriggerSource = std::function<std::optional<double>(double from, double& lookedUntil)>;

    explicit SweepTimer(TriggerSource trigger) : trigger_(std::move(trigger)) {}

    /// Drops a running sweep and begins again at `now`; `length` is the real time of a sweep in
    /// seconds. With `free` set no trigger is waited for.
    void start(double now, double length, bool free);
    /// Ends sweeping; the sweeps that are finished stay.
    void halt() { state_ = State::Idle; }
    /// Continuous sweeping goes on by itself after each sweep, single sweeping stops.
    void setContinuous(bool continuous) { continuous_ = continuous; }
    /// Lets time run to `now`.
    void advanceTo(double now);

    bool busy() const { return state_ != State::Idle; }
    /// Sweeps finished since the last `start`, and in all.
    std::uint64_t finished() const { return finished_; }
    std::uint64_t finishedInAll() const { return finishedInAll_; }
    /// Starting time of the newest finished sweep, or of the running one where none is finished.
    double newestStart() const { return finished_ > 0 ? newestStart_ : began_; }
    double length() const { return length_; }
    /// The moment of the next change; nothing when none can come.
    std::optional<double> nextEvent() const;

  private:
    enum class State { Idle, Armed, Running };
    void arm(double from);
    void finish(std::uint64_t sweeps);

    TriggerSource trigger_;
    State state_ = State::Idle;
    bool continuous_ = true;
    bool free_ = true;
    double length_ = 1;
    double began_ = 0;  // of the running sweep, or where an armed one looks from
    double newestStart_ = 0;
    std::uint64_t finished_ = 0;
    std::uint64_t finishedInAll_ = 0;
};

}  // namespace zelsim
