#pragma once
// The one event loop: pumping, waiting, fixed delays and tasks that run later.

#include <cstdint>
#include <functional>

namespace zel {

using TaskId = std::uint64_t;

class Events {
  public:
    virtual ~Events() = default;
    /// Lets everything that is pending run, once.
    virtual void pump() = 0;
    /// Lets events run, and where none came waits for the next one, at most `ms` milliseconds.
    /// Wakes at once when a byte arrives on a port or socket, a timer is due or a user acts.
    virtual void wait(int ms) = 0;
    /// A fixed delay of the protocol: no event is served meanwhile, timers included. The end of the
    /// program cuts it short.
    virtual void sleep(int ms) = 0;
    /// Runs the task once, `ms` milliseconds from now, inside a later pump or wait.
    virtual TaskId schedule(double ms, std::function<void()> task) = 0;
    virtual void cancel(TaskId id) = 0;
};

}  // namespace zel
