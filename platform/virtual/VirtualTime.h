#pragma once
// Time that passes only when somebody waits for it, and the event loop over it.

#include <cstddef>
#include <cstdint>
#include <functional>
#include <map>
#include <utility>

#include "platform/Clock.h"
#include "platform/Events.h"

namespace zel {

/// Days since 1899-12-30 of a date of the Gregorian calendar (month 1 to 12, day 1 to 31) and a
/// time of day, which goes into the fraction.
double dateOf(int year, int month, int day, int hour = 0, int minute = 0, double second = 0);

/// Starts at 2026-01-01 12:00:00 and at 0 microseconds.
class VirtualClock : public Clock {
  public:
    VirtualClock();
    explicit VirtualClock(double startDate) : startDate_(startDate) {}

    std::int64_t micros() const override { return micros_; }
    double date() const override;

    /// Sets the date of this moment, as a user who sets his clock; `micros` goes on unmoved.
    void setDate(double date);
    void advanceMicros(std::int64_t micros);
    void advance(double ms);

  private:
    double startDate_;
    std::int64_t micros_ = 0;
};

/// Tasks run by due time, those of one moment in the order of their scheduling. A pump runs only
/// the tasks that were queued when it began, so a task that schedules itself at 0 ms again and
/// again does not hold it; time goes on by a microsecond each time.
class VirtualEvents : public Events {
  public:
    explicit VirtualEvents(VirtualClock& clock) : clock_(clock) {}

    void pump() override { runDue(); }
    /// Runs what is due and comes back if that was anything; else goes on to the next due time
    /// within `ms` and runs what is due there, or lets `ms` pass.
    void wait(int ms) override;
    /// Lets the time pass and runs nothing; what fell due runs in the next pump or wait.
    void sleep(int ms) override;
    TaskId schedule(double ms, std::function<void()> task) override;
    void cancel(TaskId id) override;

    /// Tasks that have not run yet.
    std::size_t pending() const { return tasks_.size(); }
    /// Lets events run for `ms` milliseconds.
    void runFor(double ms);

  private:
    using Key = std::pair<std::int64_t, TaskId>;  ///< due time in microseconds, order of insertion

    bool runDue();

    VirtualClock& clock_;
    std::map<Key, std::function<void()>> tasks_;
    std::map<TaskId, std::int64_t> due_;
    TaskId lastId_ = 0;
    int running_ = 0;  ///< tasks on the stack
};

}  // namespace zel
