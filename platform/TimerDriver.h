#pragma once
// Runs the timers of a form on the event loop.

#include <map>
#include <optional>

#include "platform/Controls.h"
#include "platform/Events.h"

namespace zel {

/// Starts a timer's ticking when it is enabled with an interval above 0, stops it when it is not.
/// A tick that is still running is not entered again.
class TimerDriver {
  public:
    explicit TimerDriver(Events& events) : events_(events) {}
    ~TimerDriver();
    TimerDriver(const TimerDriver&) = delete;
    TimerDriver& operator=(const TimerDriver&) = delete;

    void attach(Timer& timer);

  private:
    struct Entry {
        int interval = 0;  ///< of the running task; 0 when none runs
        TaskId task = 0;
        bool inTick = false;
        bool missed = false;  ///< a tick fell due while one ran
    };
    void follow(Timer& timer);
    void arm(Timer& timer, std::optional<int> ms = {});

    Events& events_;
    std::map<Timer*, Entry> entries_;
};

}  // namespace zel
