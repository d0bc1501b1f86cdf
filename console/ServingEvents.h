#pragma once
// The event loop of a front with a hook: somebody else may act whenever the program waits.

#include <functional>
#include <utility>

#include "platform/Events.h"

namespace zel {

class ServingEvents : public Events {
  public:
    explicit ServingEvents(Events& inner) : inner_(inner) {}

    /// Gets the milliseconds of each wait; true when it has done the waiting.
    std::function<bool(int)> whileWaiting;

    /// Runs before each pump, where somebody else may act there as well.
    std::function<void()> whilePumping;

    /// Runs before each wait and pump: what must be served also where time is virtual.
    std::function<void()> always;

    Events& inner() { return inner_; }

    void pump() override {
        if (always) always();
        if (whilePumping) whilePumping();
        inner_.pump();
    }
    void wait(int ms) override {
        if (always) always();
        if (!whileWaiting || !whileWaiting(ms)) inner_.wait(ms);
    }
    void sleep(int ms) override { inner_.sleep(ms); }
    TaskId schedule(double ms, std::function<void()> task) override {
        return inner_.schedule(ms, std::move(task));
    }
    void cancel(TaskId id) override { inner_.cancel(id); }

  private:
    Events& inner_;
};

}  // namespace zel
